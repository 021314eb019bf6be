#pragma once

#include <domain/domain_export.h>

#include <QString>
#include <QStringList>

namespace vexa {

// State of one deserialization: the stored format version and the member path
// being read, so that the first error names where the input broke
// ("Trial.appearanceValues.colorValues[2].spectralValues: expected an array").
class VEXA_DOMAIN_EXPORT ReadContext
{
public:
    explicit ReadContext(int formatVersion);

    int formatVersion() const { return m_formatVersion; }

    void pushMember(const QString &name);
    void pushIndex(int index);
    void pop();
    QString path() const;

    // Records the first error with the current path; always returns false.
    bool fail(const QString &message);
    bool hasError() const { return !m_error.isEmpty(); }
    QString error() const { return m_error; }

private:
    int m_formatVersion;
    QStringList m_segments;
    QString m_error;
};

} // namespace vexa

#pragma once

#include <domain/classcomponent.h>
#include <domain/domain_export.h>

#include <QVector>

namespace vexa {

// The members of a class (and, when made from an object, their values).
class VEXA_DOMAIN_EXPORT ClassInformation
{
public:
    ClassInformation() = default;
    ClassInformation(const QString &className, const QVector<ClassComponent> &components);

    QString className() const { return m_className; }
    int numberOfComponents() const { return m_components.size(); }
    // Fills component and returns true for 0 <= index < numberOfComponents().
    bool didGetComponentWithIndex(int index, ClassComponent &component) const;
    QVector<ClassComponent> components() const { return m_components; }

private:
    QString m_className;
    QVector<ClassComponent> m_components;
};

} // namespace vexa

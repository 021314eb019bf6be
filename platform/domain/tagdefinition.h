#pragma once

#include <domain/namedobject.h>

#include <QStringList>

namespace vexa {

class TagValue;

// A tag that objects can carry: its allowed values and default.
class VEXA_DOMAIN_EXPORT TagDefinition : public NamedObject
{
    VEXA_REFLECTABLE(TagDefinition)
public:
    enum class SelectionType { Free, Single, Multiple };

    QStringList values() const { return m_values; }
    void setValues(const QStringList &values) { m_values = values; }
    QString defaultValue() const { return m_defaultValue; }
    void setDefaultValue(const QString &value) { m_defaultValue = value; }
    SelectionType selectionType() const { return m_selectionType; }
    void setSelectionType(SelectionType type) { m_selectionType = type; }

    // A new tag value of this definition holding the default value.
    std::shared_ptr<TagValue> newOrDefaultValue() const;

private:
    QStringList m_values;
    QString m_defaultValue;
    SelectionType m_selectionType = SelectionType::Free;
};

} // namespace vexa

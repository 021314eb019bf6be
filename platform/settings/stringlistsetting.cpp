#include "stringlistsetting.h"

#include <QCoreApplication>

#include <algorithm>

StringListSetting::StringListSetting(const QString &key, const QStringList &defaultValues,
                                     const QString &labelText, const QString &descriptionText)
    : BaseSetting(key, QVariant(defaultValues), labelText, descriptionText)
{
}

StringListSetting::StringListSetting(const QString &key, const QString &labelText, const QString &descriptionText)
    : StringListSetting(key, QStringList(), labelText, descriptionText)
{
}

void StringListSetting::addPossibleValue(const StringPair &value, bool selected)
{
    const int existing = indexOf(value.value);
    if (existing >= 0)
        m_possibleValues[static_cast<size_t>(existing)] = value;
    else
        m_possibleValues.push_back(value);

    QStringList defaults = defaultValues();
    QStringList current = selectedValues();
    if (selected) {
        if (m_singleSelect) {
            defaults = QStringList{value.value};
            current = QStringList{value.value};
        } else {
            defaults.append(value.value);
            current.append(value.value);
        }
    }
    // While the choices are still being added, values given to the
    // constructor may not be known yet; they are kept as given.
    QVariant normalizedDefault(defaults);
    setStoredDefault(normalize(normalizedDefault) ? normalizedDefault : QVariant(defaults));
    QVariant normalizedCurrent(current);
    storeValue(normalize(normalizedCurrent) ? normalizedCurrent : QVariant(current));
}

void StringListSetting::setPossibleValues(const std::vector<StringPair> &values)
{
    m_possibleValues.clear();
    const QStringList defaults = defaultValues();
    const QStringList current = selectedValues();
    for (const StringPair &value : values)
        addPossibleValue(value, false);
    QStringList keptDefaults;
    for (const QString &value : defaults)
        if (hasPossibleValue(value))
            keptDefaults.append(value);
    setStoredDefault(QVariant(keptDefaults));
    QStringList keptCurrent;
    for (const QString &value : current)
        if (hasPossibleValue(value))
            keptCurrent.append(value);
    setSelectedValues(keptCurrent);
}

bool StringListSetting::hasPossibleValue(const QString &value) const
{
    return indexOf(value) >= 0;
}

QString StringListSetting::displayTextForValue(const QString &value) const
{
    const int index = indexOf(value);
    if (index < 0 || m_possibleValues[static_cast<size_t>(index)].displayText.isEmpty())
        return value;
    return m_possibleValues[static_cast<size_t>(index)].displayText;
}

QString StringListSetting::selectedValue() const
{
    const QStringList values = selectedValues();
    return values.isEmpty() ? QString() : values.first();
}

QStringList StringListSetting::selectedValues() const
{
    return variantValue().toStringList();
}

QStringList StringListSetting::defaultValues() const
{
    return defaultVariantValue().toStringList();
}

std::vector<StringPair> StringListSetting::selectedPossibleValues() const
{
    std::vector<StringPair> result;
    const QStringList values = selectedValues();
    for (const QString &value : values)
        result.emplace_back(value, displayTextForValue(value));
    return result;
}

bool StringListSetting::isSelected(const QString &value) const
{
    return selectedValues().contains(value);
}

bool StringListSetting::setSelectedValue(const QString &value)
{
    return setSelectedValues(QStringList{value});
}

bool StringListSetting::setSelectedValues(const QStringList &values)
{
    return setVariantValue(QVariant(values));
}

bool StringListSetting::didSelectByValue(const QString &value)
{
    if (m_singleSelect)
        return setSelectedValue(value);
    return setValueSelected(value, true);
}

bool StringListSetting::setValueSelected(const QString &value, bool selected)
{
    QStringList values = selectedValues();
    if (selected) {
        if (m_singleSelect)
            values.clear();
        if (!values.contains(value))
            values.append(value);
    } else {
        values.removeAll(value);
    }
    return setSelectedValues(values);
}

QString StringListSetting::valueDisplayText() const
{
    QStringList texts;
    const QStringList values = selectedValues();
    for (const QString &value : values)
        texts.append(displayTextForValue(value));
    return texts.join(QStringLiteral(", "));
}

void StringListSetting::setSingleSelect(bool single)
{
    m_singleSelect = single;
    if (!single)
        return;
    const QStringList defaults = defaultValues();
    if (defaults.size() > 1)
        setStoredDefault(QVariant(QStringList{defaults.first()}));
    const QStringList current = selectedValues();
    if (current.size() > 1)
        storeValue(QVariant(QStringList{current.first()}));
}

QString StringListSetting::maximumSelectionMessage() const
{
    if (!m_maximumSelectionMessage.isEmpty())
        return m_maximumSelectionMessage;
    return QCoreApplication::translate("StringListSetting", "Select at most %1 values for \"%2\".")
        .arg(m_maximumSelectionCount)
        .arg(labelText());
}

void StringListSetting::setMaximumSelectionCount(int count, const QString &message)
{
    m_maximumSelectionCount = std::max(0, count);
    m_maximumSelectionMessage = message;
}

std::shared_ptr<BaseSetting> StringListSetting::clone() const
{
    auto copy = std::make_shared<StringListSetting>(key(), defaultValues(), labelText(), descriptionText());
    copy->m_possibleValues = m_possibleValues;
    copy->m_singleSelect = m_singleSelect;
    copy->m_useComboBox = m_useComboBox;
    copy->m_maximumSelectionCount = m_maximumSelectionCount;
    copy->m_maximumSelectionMessage = m_maximumSelectionMessage;
    copyBaseInto(*copy);
    return copy;
}

bool StringListSetting::normalize(QVariant &value) const
{
    QStringList values;
    switch (value.userType()) {
    case QMetaType::QString:
        values.append(value.toString());
        break;
    case QMetaType::QStringList:
        values = value.toStringList();
        break;
    case QMetaType::QVariantList: {
        const QVariantList list = value.toList();
        for (const QVariant &entry : list) {
            if (entry.userType() != QMetaType::QString)
                return false;
            values.append(entry.toString());
        }
        break;
    }
    default:
        return false;
    }

    if (m_possibleValues.empty()) {
        // A free list keeps the given order.
        value = QVariant(values);
        return true;
    }

    values.removeDuplicates();
    for (const QString &entry : qAsConst(values))
        if (!hasPossibleValue(entry))
            return false;
    if (m_singleSelect && values.size() > 1)
        return false;
    if (m_maximumSelectionCount > 0 && values.size() > m_maximumSelectionCount)
        return false;

    std::sort(values.begin(), values.end(),
              [this](const QString &a, const QString &b) { return indexOf(a) < indexOf(b); });
    value = QVariant(values);
    return true;
}

int StringListSetting::indexOf(const QString &value) const
{
    for (size_t i = 0; i < m_possibleValues.size(); ++i)
        if (m_possibleValues[i].value == value)
            return static_cast<int>(i);
    return -1;
}

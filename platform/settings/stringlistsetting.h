#pragma once

#include <settings/basesetting.h>
#include <settings/stringpair.h>

#include <vector>

// A choice among possible values, single or multiple. The value is the list
// of selected values, kept in the order of the possible values. A setting
// without possible values is a free list of texts (any values are kept, in
// the order given).
//
// An optional maximum limits how many values may be selected at once;
// selections beyond it are refused and maximumSelectionMessage() tells the
// user why.
class VEXA_SETTINGS_EXPORT StringListSetting : public BaseSetting
{
    Q_OBJECT
public:
    StringListSetting(const QString &key, const QStringList &defaultValues, const QString &labelText,
                      const QString &descriptionText = QString());
    StringListSetting(const QString &key, const QString &labelText, const QString &descriptionText = QString());

    // Adds a choice; with selected set it becomes part of the default and the
    // current selection (in single selection mode it replaces them).
    void addPossibleValue(const StringPair &value, bool selected = false);
    void setPossibleValues(const std::vector<StringPair> &values);
    std::vector<StringPair> possibleValues() const { return m_possibleValues; }
    bool hasPossibleValue(const QString &value) const;
    // The shown text of a value; the value itself when it has none.
    QString displayTextForValue(const QString &value) const;

    // The first selected value, empty when nothing is selected.
    QString selectedValue() const;
    QStringList selectedValues() const;
    QStringList defaultValues() const;
    // The selected choices with their shown texts.
    std::vector<StringPair> selectedPossibleValues() const;
    bool isSelected(const QString &value) const;

    // Selects exactly this value. False (and no change) for an unknown value.
    bool setSelectedValue(const QString &value);
    // Selects exactly these values. False (and no change) for unknown values,
    // more than one value in single selection mode, or more than the maximum.
    bool setSelectedValues(const QStringList &values);
    // Selects a value: in single selection mode it replaces the selection,
    // otherwise it is added. False when the value is unknown or the maximum is reached.
    bool didSelectByValue(const QString &value);
    // Adds or removes one value from the selection.
    bool setValueSelected(const QString &value, bool selected);

    // The shown texts of the selected values, joined by ", ".
    QString valueDisplayText() const;

    bool isSingleSelect() const { return m_singleSelect; }
    // Switching to single selection keeps only the first selected value.
    void setSingleSelect(bool single);
    bool useComboBox() const { return m_useComboBox; }
    void setUseComboBox(bool useComboBox) { m_useComboBox = useComboBox; }

    // 0 means no limit.
    int maximumSelectionCount() const { return m_maximumSelectionCount; }
    QString maximumSelectionMessage() const;
    void setMaximumSelectionCount(int count, const QString &message = QString());

    std::shared_ptr<BaseSetting> clone() const override;

protected:
    bool normalize(QVariant &value) const override;

private:
    int indexOf(const QString &value) const;

    std::vector<StringPair> m_possibleValues;
    bool m_singleSelect = false;
    bool m_useComboBox = false;
    int m_maximumSelectionCount = 0;
    QString m_maximumSelectionMessage;
};

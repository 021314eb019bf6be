#pragma once

#include <settings/settings_export.h>

#include <QJsonValue>
#include <QObject>
#include <QString>
#include <QStringList>
#include <QVariant>

#include <memory>

// One persisted setting: a key, a default, a label and a description for the
// settings editor, and the current value. The concrete kinds decide which
// values they accept; a value they reject changes nothing.
//
// Settings are shared (std::shared_ptr) between the groups and sections that
// show them, so they never get a QObject parent.
class VEXA_SETTINGS_EXPORT BaseSetting : public QObject
{
    Q_OBJECT
public:
    BaseSetting(const QString &key, const QVariant &defaultValue, const QString &labelText,
                const QString &descriptionText);
    ~BaseSetting() override;

    QString key() const { return m_key; }
    QString labelText() const { return m_labelText; }
    void setLabelText(const QString &text) { m_labelText = text; }
    QString descriptionText() const { return m_descriptionText; }
    void setDescriptionText(const QString &text) { m_descriptionText = text; }

    // The value as a variant (for list settings: the selected values as a
    // QStringList; for settings lists: the JSON form as a variant).
    virtual QVariant variantValue() const;
    virtual QVariant defaultVariantValue() const;
    // Returns false and changes nothing when the kind does not accept the value.
    virtual bool setVariantValue(const QVariant &value);
    // Makes the current value the default one (used when a group changes
    // its defaults after construction).
    virtual void setDefaultVariantValue(const QVariant &value);

    virtual bool isDefault() const;
    virtual void resetToDefault();

    bool isReadOnly() const { return m_readOnly; }
    void setIsReadOnly(bool readOnly) { m_readOnly = readOnly; }
    bool isVisible() const { return m_visible; }
    void setIsVisible(bool visible) { m_visible = visible; }
    // Expert settings are shown in the editor only when the group is in expert mode.
    bool isExpertSetting() const { return m_expert; }
    void setIsExpertSetting(bool expert) { m_expert = expert; }

    // A deep copy: same key, texts, flags, default and current value.
    virtual std::shared_ptr<BaseSetting> clone() const = 0;
    // Takes over the value of another setting of the same kind and key.
    virtual bool assignValue(const BaseSetting &other);
    // Takes over read-only, visibility and expert flags.
    void copyAttributesFrom(const BaseSetting &other);

    // The persisted form of the value.
    virtual QJsonValue toJson() const;
    // Reads the persisted form. On a value of the wrong kind nothing changes,
    // a description of the fault is appended to errors and false is returned.
    virtual bool fromJson(const QJsonValue &json, QStringList *errors = nullptr);

Q_SIGNALS:
    // Emitted whenever the value really changes.
    void sgValueChanged();

protected:
    // Checks a candidate value and brings it into the stored form; false rejects it.
    virtual bool normalize(QVariant &value) const = 0;
    // Stores an already normalised value and emits when it differs.
    void storeValue(const QVariant &value);
    void setStoredDefault(const QVariant &value) { m_defaultValue = value; }
    // Copies texts, flags and default into a freshly made clone.
    void copyBaseInto(BaseSetting &other) const;

private:
    QString m_key;
    QVariant m_defaultValue;
    QVariant m_value;
    QString m_labelText;
    QString m_descriptionText;
    bool m_readOnly = false;
    bool m_visible = true;
    bool m_expert = false;
};

using BaseSettingPtr = std::shared_ptr<BaseSetting>;

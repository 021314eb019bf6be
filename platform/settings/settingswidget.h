#pragma once

#include <settings/settings_export.h>

#include <QDialog>
#include <QSet>

#include <map>
#include <memory>
#include <vector>

class BaseSetting;
class CommonSettings;
class QDialogButtonBox;
class QFormLayout;
class QLabel;
class QScrollArea;
class SettingsSection;

// A dialog generated from a settings group: sections become group boxes,
// page groups become tabs; check boxes for yes/no settings, spin boxes for
// numbers, line edits for texts, combo boxes or check lists for choices and
// tabs or boxes for lists of sections. Read-only settings are disabled,
// hidden ones (and expert ones outside expert mode) are not shown.
//
// The dialog edits copies; OK writes them back to the group in one batch
// (one settingsChanged()), Cancel changes nothing. While a text does not
// match its setting's regular expression, OK is disabled and a hint says why.
//
// Each editor's object name is the setting's key; editors of settings inside
// a list of sections are named "<list key>/<section name>/<key>".
class VEXA_SETTINGS_EXPORT SettingsWidget : public QDialog
{
    Q_OBJECT
public:
    explicit SettingsWidget(const std::shared_ptr<CommonSettings> &settings, QWidget *parent = nullptr);
    ~SettingsWidget() override;

    std::shared_ptr<CommonSettings> settings() const { return m_settings; }
    // The copy edited for a setting of the group, null for unknown keys.
    std::shared_ptr<BaseSetting> editedSetting(const QString &key) const;
    bool hasInvalidInput() const { return !m_invalidEditors.isEmpty(); }
    // The hint shown under the editors (invalid input, selection limits); empty when none.
    QString hintText() const;

public Q_SLOTS:
    void accept() override;
    // Puts every edited copy back to its default (the group is untouched until OK).
    void restoreDefaults();

private:
    void buildContent();
    QWidget *createSectionsPage(const std::vector<std::shared_ptr<SettingsSection>> &sections);
    void addSettingRow(QFormLayout *form, const std::shared_ptr<BaseSetting> &copy, const QString &objectName);
    QWidget *createEditor(const std::shared_ptr<BaseSetting> &copy, const QString &objectName);
    QWidget *createListEditor(const std::shared_ptr<BaseSetting> &copy, const QString &objectName);
    bool isShown(const BaseSetting &setting) const;
    void setEditorValid(QWidget *editor, bool valid, const QString &message);
    void showHint(const QString &message);
    void updateState();

    std::shared_ptr<CommonSettings> m_settings;
    // Original → the copy edited in this dialog.
    std::vector<std::pair<std::shared_ptr<BaseSetting>, std::shared_ptr<BaseSetting>>> m_copies;
    std::map<QWidget *, QString> m_invalidMessages;
    QSet<QWidget *> m_invalidEditors;
    QString m_infoHint;
    QScrollArea *m_scrollArea = nullptr;
    QLabel *m_hintLabel = nullptr;
    QDialogButtonBox *m_buttons = nullptr;
};

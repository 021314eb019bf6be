#pragma once

#include <vexa/browser/browsermetatypes.h>
#include <vexa/vexa_export.h>

#include <context/corvidmodel.h>

#include <QPointer>
#include <QWidget>

#include <memory>
#include <string>

class QComboBox;
class QLabel;
class QToolButton;

namespace vexa {

class CorvidModel;
class FolderPickerSettings;
class GlobalDirEntry;

// "Current Folder": a combo box of the remembered folders (most recent first) and a
// button that opens the object browser to pick another one. Choosing a folder makes it
// the last chosen one in the settings and emits sgFolderChosen.
class VEXA_EXPORT FolderPickerWidget : public QWidget
{
    Q_OBJECT
public:
    explicit FolderPickerWidget(QWidget *parent = nullptr);
    ~FolderPickerWidget() override;

    void setSettings(std::shared_ptr<FolderPickerSettings> settings);
    std::shared_ptr<FolderPickerSettings> settings() const { return m_settings; }
    // The object stores the browse button opens.
    void setCorvidModel(CorvidModel *corvidModel) { m_corvidModel = corvidModel; }

    QLabel *label() const { return m_label; }
    QComboBox *comboBox() const { return m_comboBox; }
    QToolButton *browseButton() const { return m_browseButton; }
    std::shared_ptr<GlobalDirEntry> currentFolder() const;

    // Remembers a folder as the last chosen one and shows it.
    void rememberFolder(const GlobalDirEntry &folder);
    // Fills the combo box from the settings; with selectLast the last chosen folder is current.
    void initComboBox(bool selectLast);
    void resetComboBox();
    // Opens the object browser on folders; the picked folder is remembered and chosen.
    void launchObjectBrowser(bool modal);

Q_SIGNALS:
    void sgFolderChosen(std::shared_ptr<vexa::GlobalDirEntry> folder);

public Q_SLOTS:
    void currentFolderChanged(int index);
    void onObjectDeleted(std::string objectId);

private:
    std::shared_ptr<FolderPickerSettings> m_settings;
    QPointer<CorvidModel> m_corvidModel;
    QLabel *m_label;
    QComboBox *m_comboBox;
    QToolButton *m_browseButton;
    bool m_filling = false;
};

} // namespace vexa

#pragma once

#include <vexa/vexa_export.h>

#include <QDialog>
#include <QStringList>

#include <memory>
#include <string>
#include <vector>

class QComboBox;
class QDialogButtonBox;

namespace vexa {

class CorvidModel;
class GlobalDirEntry;
class ObjectBrowserWidget;
class SelectedPath;

// The object browser as a dialog that picks objects (or, limited to folders, a folder)
// of one of the given stores. Starts at the selected path when there is one.
class VEXA_EXPORT ObjectBrowserDialog : public QDialog
{
    Q_OBJECT
public:
    // types: the object types offered (empty: all); dispatcherList: the stores to choose
    // from (empty: the CorvidModel's default store).
    ObjectBrowserDialog(CorvidModel *corvidModel, const std::vector<std::string> &types, const QString &title,
                        const QStringList &dispatcherList, std::shared_ptr<SelectedPath> selectedPath,
                        QWidget *parent = nullptr);
    ~ObjectBrowserDialog() override;

    ObjectBrowserWidget *browser() const { return m_browser; }
    QComboBox *storeBox() const { return m_storeBox; }
    // The chosen objects; for a folder pick the selected folder or, without one, the
    // folder shown.
    std::vector<std::shared_ptr<GlobalDirEntry>> selectedEntries() const;
    std::shared_ptr<GlobalDirEntry> selectedEntry() const;

private:
    void showStore(const std::string &dispatcherId, const std::shared_ptr<SelectedPath> &path);
    void updateOkButton();
    bool picksFolders() const;

    CorvidModel *m_corvidModel;
    std::vector<std::string> m_types;
    ObjectBrowserWidget *m_browser = nullptr;
    QComboBox *m_storeBox = nullptr;
    QDialogButtonBox *m_buttons = nullptr;
};

} // namespace vexa

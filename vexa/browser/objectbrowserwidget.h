#pragma once

#include <vexa/vexa_export.h>

#include <QModelIndex>
#include <QSortFilterProxyModel>
#include <QStringList>
#include <QTreeView>
#include <QWidget>

#include <memory>
#include <string>
#include <vector>

class QAction;
class QComboBox;
class QLabel;
class QSplitter;
class QLineEdit;
class QProgressBar;
class QStatusBar;
class QToolButton;

namespace vexa {

class CorvidModel;
class CorvidObjectsClientModel;
class FolderPickerSettings;
class FolderPickerWidget;
class GlobalDirEntry;
class SelectedPath;

// A view of the object browser: drags never remove rows themselves (the store's answer
// moves them), and a drag that comes from another store is offered as a copy.
class VEXA_EXPORT ObjectBrowserView : public QTreeView
{
    Q_OBJECT
public:
    explicit ObjectBrowserView(QWidget *parent = nullptr);

    // The store of this view's rows (a drag from any other store is a copy).
    void setDispatcherId(const std::string &dispatcherId) { m_dispatcherId = dispatcherId; }

protected:
    void startDrag(Qt::DropActions supportedActions) override;
    void dragEnterEvent(QDragEnterEvent *event) override;
    void dragMoveEvent(QDragMoveEvent *event) override;
    void dropEvent(QDropEvent *event) override;

private:
    void preferCopyFromOtherStores(QDropEvent *event) const;
    std::string m_dispatcherId;
};

// The rows of the object browser's detail list: a type filter and a name search (folders
// always pass the type filter), and whole rows that select and take drops as one.
class VEXA_EXPORT ObjectBrowserFilterModel : public QSortFilterProxyModel
{
    Q_OBJECT
public:
    explicit ObjectBrowserFilterModel(QObject *parent = nullptr);

    // Only these object types (and folders); empty: every type.
    void setTypes(const QStringList &types);
    QStringList types() const { return m_types; }
    // Rows whose name contains the text, case-insensitively; empty: every row.
    void setSearchText(const QString &text);
    // The folder whose rows are filtered (its subfolders' rows are not searched).
    void setFolder(const QModelIndex &sourceFolder);

    Qt::ItemFlags flags(const QModelIndex &index) const override;

protected:
    bool filterAcceptsRow(int sourceRow, const QModelIndex &sourceParent) const override;

private:
    QStringList m_types;
    QString m_search;
    QPersistentModelIndex m_folder;
};

// Browses one object store: a folder tree and a detail list (name, type, created) of the
// folder chosen in it, a type filter and a name search, favourites (remembered folders),
// a context menu, the keys F2 (rename), Del (delete, after a question), Ctrl+C / Ctrl+V
// (copy, also into another store's browser), Enter (open), F5 (reload), drag and drop,
// the running tasks in a status bar and failures in a message area.
//
// Opening an object (double-click, Enter) is a signal the host routes: sgObjectActivated.
class VEXA_EXPORT ObjectBrowserWidget : public QWidget
{
    Q_OBJECT
public:
    explicit ObjectBrowserWidget(QWidget *parent = nullptr);
    ~ObjectBrowserWidget() override;

    // Browses the store of dispatcherId (the CorvidModel's default one when empty). With
    // types, sub-folders list only those types (and folders).
    void initialize(CorvidModel *corvidModel, const std::string &dispatcherId = std::string(),
                    const std::vector<std::string> &types = std::vector<std::string>());
    // The remembered folders shown as favourites (optional).
    void setFolderPickerSettings(std::shared_ptr<FolderPickerSettings> settings);
    // A caption above the browser (the store's name).
    void setCaption(const QString &caption);
    // The folder tree beside the detail list (horizontal, the default) or above it (vertical,
    // for a narrow dock).
    void setOrientation(Qt::Orientation orientation);

    CorvidObjectsClientModel *model() const { return m_model; }
    ObjectBrowserView *folderView() const { return m_folderView; }
    ObjectBrowserView *detailView() const { return m_detailView; }
    ObjectBrowserFilterModel *detailModel() const { return m_detailModel; }
    QComboBox *typeFilterBox() const { return m_typeBox; }
    QLineEdit *searchEdit() const { return m_searchEdit; }
    std::string dispatcherId() const;

    // The folder whose contents the detail list shows (source index; invalid: the top).
    QModelIndex currentFolder() const;
    void setCurrentFolder(const QModelIndex &sourceFolder);
    std::shared_ptr<SelectedPath> currentFolderPath() const;
    // Opens the folders of a path one after the other as they load.
    void setCurrentFolderPath(const SelectedPath &path);
    // The rows selected in the detail list (source indexes, column 0).
    QModelIndexList selectedIndexes() const;
    std::vector<std::shared_ptr<GlobalDirEntry>> selectedEntries() const;
    // Selects the row of an object in the detail list.
    bool selectObject(const QString &objectId);

    // The message area's text (empty when hidden).
    QString message() const;
    void showMessage(const QString &message);

    QAction *newFolderAction() const { return m_newFolderAction; }
    QAction *renameAction() const { return m_renameAction; }
    QAction *deleteAction() const { return m_deleteAction; }
    QAction *copyAction() const { return m_copyAction; }
    QAction *pasteAction() const { return m_pasteAction; }
    QAction *openAction() const { return m_openAction; }
    QAction *reloadAction() const { return m_reloadAction; }
    QAction *favouriteAction() const { return m_favouriteAction; }

    // Asks before a delete; true to go on. Tests and hosts may answer otherwise.
    virtual bool confirmDelete(const QString &question);

public Q_SLOTS:
    void newFolder();
    void renameSelected();
    void deleteSelected();
    void copySelected();
    void paste();
    void openSelected();
    void reloadCurrentFolder();
    void addCurrentFolderToFavourites();

Q_SIGNALS:
    // An object was opened (double-click, Enter): the host decides what that means.
    void sgObjectActivated(std::shared_ptr<vexa::GlobalDirEntry> entry);
    void sgSelectionChanged(std::vector<std::shared_ptr<vexa::GlobalDirEntry>> entries);
    void sgCurrentFolderChanged(std::shared_ptr<vexa::SelectedPath> path);
    void sgObjectDeleted(std::string objectId);

private:
    void buildActions();
    void onFolderViewCurrentChanged(const QModelIndex &proxyIndex);
    void onDetailActivated(const QModelIndex &proxyIndex);
    void onFolderLoaded(const QModelIndex &folder);
    void onNewFolderCreated(std::shared_ptr<SelectedPath> path);
    void continuePendingPath();
    void updateStatus();
    void updateProgress();
    void showContextMenu(QWidget *view, const QPoint &position);
    void selectFavourite(const std::shared_ptr<GlobalDirEntry> &folder);
    QModelIndex detailToSource(const QModelIndex &proxyIndex) const;
    QModelIndex sourceToDetail(const QModelIndex &sourceIndex) const;
    QModelIndex folderToSource(const QModelIndex &proxyIndex) const;
    QModelIndex sourceToFolder(const QModelIndex &sourceIndex) const;
    bool detailHasFocus() const;

    CorvidModel *m_corvidModel = nullptr;
    CorvidObjectsClientModel *m_model = nullptr;
    QSortFilterProxyModel *m_folderModel = nullptr;
    ObjectBrowserFilterModel *m_detailModel = nullptr;
    ObjectBrowserView *m_folderView = nullptr;
    ObjectBrowserView *m_detailView = nullptr;
    QSplitter *m_splitter = nullptr;
    QLabel *m_caption = nullptr;
    QComboBox *m_typeBox = nullptr;
    QLineEdit *m_searchEdit = nullptr;
    FolderPickerWidget *m_favourites = nullptr;
    QWidget *m_messageArea = nullptr;
    QLabel *m_messageLabel = nullptr;
    QStatusBar *m_statusBar = nullptr;
    QLabel *m_statusLabel = nullptr;
    QProgressBar *m_progressBar = nullptr;
    QAction *m_newFolderAction = nullptr;
    QAction *m_renameAction = nullptr;
    QAction *m_deleteAction = nullptr;
    QAction *m_copyAction = nullptr;
    QAction *m_pasteAction = nullptr;
    QAction *m_openAction = nullptr;
    QAction *m_reloadAction = nullptr;
    QAction *m_favouriteAction = nullptr;
    QPersistentModelIndex m_currentFolder;
    QStringList m_pendingPath;
    QString m_selectAfterCreate;
};

} // namespace vexa

#pragma once

#include <QDockWidget>
#include <QList>

#include <memory>
#include <string>

class QSplitter;

namespace vexa {

class CorvidModel;
class DirEntryBrowserInterface;
class DirEntryBrowserWidget;
class DirEntryPersistanceManager;
class DirEntryTreeModel;
class FolderPickerSettings;
class GlobalDirEntry;
class ObjectBrowserWidget;
class SelectedPathSettings;

// The "Store" dock: one object browser per open store (dragging between two of them
// copies) and, below them, the objects opened for editing. Opening an object is routed
// here: a QC job goes to the host (sgOpenJob), a tolerance set or standard into the
// edited objects; hosts that edit more can take sgObjectActivated themselves.
class StoreDock : public QDockWidget
{
    Q_OBJECT
public:
    StoreDock(CorvidModel *corvidModel, QWidget *parent = nullptr);
    ~StoreDock() override;

    // Shows a browser for the store of dispatcherId (once per store); returns it.
    ObjectBrowserWidget *addStore(const std::string &dispatcherId, bool closable);
    void removeStore(ObjectBrowserWidget *browser);
    QList<ObjectBrowserWidget *> browsers() const { return m_browsers; }
    ObjectBrowserWidget *browser(const std::string &dispatcherId) const;
    DirEntryBrowserWidget *editedObjects() const { return m_edited; }
    DirEntryTreeModel *editedModel() const { return m_editedModel; }

    // The default routing of an opened object (see the class comment).
    void openEntry(const std::shared_ptr<GlobalDirEntry> &entry);
    // Asks to save modified objects; false when the user wants to stay.
    bool closeEditedObjects();

Q_SIGNALS:
    void sgObjectActivated(std::shared_ptr<vexa::GlobalDirEntry> entry);
    void sgOpenJob(std::shared_ptr<vexa::GlobalDirEntry> entry);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    CorvidModel *m_corvidModel;
    QSplitter *m_splitter;
    QList<ObjectBrowserWidget *> m_browsers;
    DirEntryTreeModel *m_editedModel;
    std::shared_ptr<DirEntryPersistanceManager> m_persistance;
    std::unique_ptr<DirEntryBrowserInterface> m_interface;
    DirEntryBrowserWidget *m_edited;
    std::shared_ptr<FolderPickerSettings> m_favourites;
    std::shared_ptr<SelectedPathSettings> m_selectedPath;
};

} // namespace vexa

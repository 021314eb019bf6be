#pragma once

#include <vexa/browser/direntrytreemodel.h>
#include <vexa/vexa_export.h>

#include <context/corvidmodel.h>

#include <QMessageBox>
#include <QPointer>
#include <QVector>
#include <QWidget>

#include <map>
#include <memory>
#include <string>

class GeneralSettings;
class QLabel;
class QMenu;
class QToolButton;

namespace vexa {

class CorvidModel;
class DirEntryBrowserInterface;
class DirEntryPersistanceManager;
class DirEntryTreeView;
class GlobalDirEntry;
class SelectedPathSettings;

// The folder tree of edited objects with its actions: new, open, reload, save, save all,
// close and close all. Closing a modified object asks whether to save it; saving a new
// object asks for its folder. Failures are shown under the tree and emitted on
// sgErrorOccurred.
class VEXA_EXPORT DirEntryBrowserWidget : public QWidget
{
    Q_OBJECT
public:
    using Node = BaseObjectTreeModel::Node;
    using DirEntryNode = DirEntryTreeModel::DirEntryNode;

    explicit DirEntryBrowserWidget(QWidget *parent = nullptr);
    ~DirEntryBrowserWidget() override;

    // Builds the widget over the model (whose persistence interface should be a
    // DirEntryPersistanceManager) for the host's kind of object.
    void initialize(DirEntryTreeModel *model, DirEntryBrowserInterface *browserInterface);
    // The object store facade and settings the folder pick uses.
    void setCorvidModel(CorvidModel *corvidModel) { m_corvidModel = corvidModel; }
    void setGeneralSettings(std::shared_ptr<GeneralSettings> settings) { m_generalSettings = std::move(settings); }
    void setSelectedPathSettings(std::shared_ptr<SelectedPathSettings> settings)
    {
        m_selectedPathSettings = std::move(settings);
    }

    DirEntryTreeModel *model() const { return m_model; }
    DirEntryTreeView *treeView() const { return m_view; }
    DirEntryPersistanceManager *persistanceManager() const;

    // Adds "&New %1", "&Open %1", "Reload %1", "&Save %1", "Save All %2", "&Close %1" and
    // "Close All %2" (kind, kinds) to menu; with shortcuts they get the usual keys.
    void createCustomMenus(QMenu *menu, QString kind, QString kinds, bool withShortcuts);

    // Asks whether to save one modified object; returns the button pressed.
    virtual QMessageBox::StandardButton saveChangesQuestion(DirEntryNode *node, QMessageBox::StandardButtons buttons,
                                                            QMessageBox::StandardButton defaultButton);
    virtual QMessageBox::StandardButton saveAllChangesQuestion(QMessageBox::StandardButtons buttons,
                                                               QMessageBox::StandardButton defaultButton);
    // Asks for the folder a new object is saved in; null when cancelled.
    virtual std::shared_ptr<GlobalDirEntry> pickFolder();

    Node *currentNode() const;
    QVector<Node *> selectedNodes() const;
    void selectNodes(const QVector<Node *> &nodes);
    void expandNode(Node *node);
    // Opens an object of the store in the tree (or selects it when it is open).
    DirEntryNode *openDirEntry(const std::shared_ptr<GlobalDirEntry> &entry);
    // A new object of the host's kind, to be saved later.
    DirEntryNode *newObject();
    // Closes a node: a modified one only after the save question.
    void closeActivated(Node *node);
    // Closes every node (one question for all modified ones); false when the user cancelled
    // or saves failed, so the caller can keep its window open.
    bool closeAll();
    // Saves the nodes' modified objects: stored ones are updated, new ones stored in
    // their folder (asked for with pickFolder when askForFolder and none is known).
    virtual void saveNodes(QVector<Node *> &nodes, bool askForFolder);
    void saveAll();
    // Waits until no save is running; after timeoutMs asks "Still saving" and waits again
    // on Yes. False when the user gave up (No).
    bool waitForSaves(int timeoutMs = 5000);
    int pendingSaves() const { return int(m_saving.size()); }
    void reloadNodes(const QVector<Node *> &nodes);

    QVector<DirEntryNode *> modifiedObjects(const QVector<Node *> &nodes) const;
    // The node itself or the nearest node above it whose object is of that type.
    DirEntryNode *associatedDirEntyNodeWithType(Node *node, const std::string &type) const;

    // The message line under the tree (empty when hidden).
    QString message() const;

Q_SIGNALS:
    void sgSelectionChanged(QVector<vexa::BaseObjectTreeModel::Node *> nodes);
    void sgErrorOccurred(QString message);
    // A node was double-clicked (or Enter pressed on it): the host opens its editor.
    void sgNodeActivated(vexa::BaseObjectTreeModel::Node *node);

public Q_SLOTS:
    void onSelectionChanged(QVector<vexa::BaseObjectTreeModel::Node *> nodes);
    void showMessage(const QString &message);

private:
    void onRequestFinished(const std::string &commandId, bool succeeded);
    void closeNow(const QVector<Node *> &nodes);
    std::shared_ptr<GlobalDirEntry> folderFor(DirEntryNode *node, bool askForFolder);
    QMessageBox::StandardButton ask(const QString &text, QMessageBox::StandardButtons buttons,
                                    QMessageBox::StandardButton defaultButton);

    DirEntryTreeModel *m_model = nullptr;
    DirEntryBrowserInterface *m_interface = nullptr;
    DirEntryTreeView *m_view = nullptr;
    QLabel *m_label = nullptr;
    QToolButton *m_addButton = nullptr;
    QLabel *m_messageLabel = nullptr;
    QPointer<CorvidModel> m_corvidModel;
    std::shared_ptr<GeneralSettings> m_generalSettings;
    std::shared_ptr<SelectedPathSettings> m_selectedPathSettings;
    // Saves in flight by command id, and the nodes to close once they succeed.
    std::map<std::string, Node *> m_saving;
    QVector<Node *> m_closeAfterSave;
};

} // namespace vexa

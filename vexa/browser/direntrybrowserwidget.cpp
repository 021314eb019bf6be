#include "direntrybrowserwidget.h"

#include "direntrybrowserinterface.h"
#include "direntrypaths_p.h"
#include "direntrypersistancemanager.h"
#include "direntrytreeview.h"
#include "objectbrowserdialog.h"
#include "selectedpath.h"
#include "selectedpathsettings.h"

#include <domain/baseobject.h>
#include <domain/folder.h>
#include <domain/globaldirentry.h>
#include <settings/generalsettings.h>

#include <QElapsedTimer>
#include <QEventLoop>
#include <QGridLayout>
#include <QLabel>
#include <QLayout>
#include <QMenu>
#include <QTimer>
#include <QToolButton>
#include <QVBoxLayout>

namespace vexa {

DirEntryBrowserWidget::DirEntryBrowserWidget(QWidget *parent)
    : QWidget(parent)
{
}

DirEntryBrowserWidget::~DirEntryBrowserWidget() = default;

void DirEntryBrowserWidget::initialize(DirEntryTreeModel *model, DirEntryBrowserInterface *browserInterface)
{
    m_model = model;
    m_interface = browserInterface;
    if (m_model && !m_model->rootNode())
        m_model->initialize();

    auto *frame = new QWidget(this);
    frame->setObjectName(QStringLiteral("dirEntryBrowserWidget"));
    m_label = new QLabel(tr("Edited objects"), frame);
    m_label->setObjectName(QStringLiteral("label"));
    m_addButton = new QToolButton(frame);
    m_addButton->setObjectName(QStringLiteral("addButton"));
    m_addButton->setIcon(QIcon(QStringLiteral(":/Images/Images/L2_Corvid_Icon_AddNew_01.png")));
    m_addButton->setAutoRaise(true);
    if (m_interface)
        m_addButton->setToolTip(tr("New %1").arg(m_interface->objectKind()));
    m_view = new DirEntryTreeView(frame);
    m_view->setObjectName(QStringLiteral("dirEntryTreeView"));
    m_view->setModel(m_model);
    m_messageLabel = new QLabel(frame);
    m_messageLabel->setObjectName(QStringLiteral("messageLabel"));
    m_messageLabel->setWordWrap(true);
    m_messageLabel->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_messageLabel->setStyleSheet(QStringLiteral(
        "QLabel { background: #fdecea; color: #8a1f11; border: 1px solid #e8b4ad; border-radius: 3px; padding: 4px; }"));
    m_messageLabel->hide();

    auto *grid = new QGridLayout(frame);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->addWidget(m_label, 0, 0);
    grid->addWidget(m_addButton, 0, 1);
    grid->addWidget(m_view, 1, 0, 1, 2);
    grid->addWidget(m_messageLabel, 2, 0, 1, 2);
    grid->setColumnStretch(0, 1);
    auto *outer = new QVBoxLayout(this);
    outer->setContentsMargins(0, 0, 0, 0);
    outer->addWidget(frame);

    connect(m_addButton, &QToolButton::clicked, this, [this] { newObject(); });
    connect(m_view, &DirEntryTreeView::sgSelectionChanged, this, &DirEntryBrowserWidget::onSelectionChanged);
    connect(m_view, &DirEntryTreeView::sgCloseActivated, this, &DirEntryBrowserWidget::closeActivated);
    connect(m_view, &DirEntryTreeView::sgNodeActivated, this, &DirEntryBrowserWidget::sgNodeActivated);
    if (m_model)
        connect(m_model, &DirEntryTreeModel::sgErrorOccurred, this, &DirEntryBrowserWidget::showMessage);
    if (DirEntryPersistanceManager *manager = persistanceManager()) {
        connect(manager, &DirEntryPersistanceManager::sgErrorOccurred, this, &DirEntryBrowserWidget::showMessage);
        connect(manager, &DirEntryPersistanceManager::sgRequestFinished, this, &DirEntryBrowserWidget::onRequestFinished);
        if (!m_corvidModel)
            m_corvidModel = manager->corvidModel();
    }
}

DirEntryPersistanceManager *DirEntryBrowserWidget::persistanceManager() const
{
    return m_model ? dynamic_cast<DirEntryPersistanceManager *>(m_model->persistanceInferface().get()) : nullptr;
}

void DirEntryBrowserWidget::showMessage(const QString &message)
{
    if (!m_messageLabel)
        return;
    m_messageLabel->setText(message);
    m_messageLabel->setVisible(!message.isEmpty());
    if (!message.isEmpty())
        Q_EMIT sgErrorOccurred(message);
}

QString DirEntryBrowserWidget::message() const
{
    return m_messageLabel && !m_messageLabel->isHidden() ? m_messageLabel->text() : QString();
}

void DirEntryBrowserWidget::createCustomMenus(QMenu *menu, QString kind, QString kinds, bool withShortcuts)
{
    if (!menu)
        return;
    if (kinds.isEmpty())
        kinds = kind;
    auto add = [&](const QString &text, const QKeySequence &keys, auto slot) {
        QAction *action = menu->addAction(text, this, slot);
        if (withShortcuts)
            action->setShortcut(keys);
        return action;
    };
    add(tr("&New %1").arg(kind), QKeySequence::New, [this] { newObject(); });
    add(tr("&Open %1").arg(kind), QKeySequence::Open, [this] {
        if (!m_interface || !m_corvidModel)
            return;
        const QStringList dispatchers = m_generalSettings ? m_generalSettings->dispatcherList() : QStringList();
        ObjectBrowserDialog dialog(m_corvidModel, {m_interface->objectType()}, tr("Open %1").arg(m_interface->objectKind()),
                                   dispatchers, m_selectedPathSettings ? m_selectedPathSettings->selectedPath() : nullptr,
                                   this);
        if (dialog.exec() == QDialog::Accepted) {
            for (const auto &entry : dialog.selectedEntries())
                openDirEntry(entry);
        }
    });
    add(tr("Reload %1").arg(kind), QKeySequence::Refresh, [this] { reloadNodes(selectedNodes()); });
    menu->addSeparator();
    add(tr("&Save %1").arg(kind), QKeySequence::Save, [this] {
        QVector<Node *> nodes = selectedNodes();
        saveNodes(nodes, true);
    });
    add(tr("Save All %1").arg(kinds), QKeySequence(tr("Ctrl+Shift+S")), [this] { saveAll(); });
    menu->addSeparator();
    add(tr("&Close %1").arg(kind), QKeySequence::Close, [this] {
        for (Node *node : selectedNodes())
            closeActivated(node);
    });
    add(tr("Close All %1").arg(kinds), QKeySequence(tr("Ctrl+Shift+W")), [this] { closeAll(); });
}

QMessageBox::StandardButton DirEntryBrowserWidget::ask(const QString &text, QMessageBox::StandardButtons buttons,
                                                       QMessageBox::StandardButton defaultButton)
{
    QMessageBox box(QMessageBox::Warning, tr("Save Changes"), text, buttons, this,
                    Qt::Dialog | Qt::MSWindowsFixedSizeDialogHint);
    box.setDefaultButton(defaultButton);
    box.layout()->setSizeConstraint(QLayout::SetFixedSize);
    return QMessageBox::StandardButton(box.exec());
}

QMessageBox::StandardButton DirEntryBrowserWidget::saveChangesQuestion(DirEntryNode *node,
                                                                       QMessageBox::StandardButtons buttons,
                                                                       QMessageBox::StandardButton defaultButton)
{
    const QString kind = m_interface ? m_interface->objectKind() : QString();
    const QString name = node ? node->name() : QString();
    return ask(tr("Do you want to save %1 \"%2\"?").arg(kind, name), buttons, defaultButton);
}

QMessageBox::StandardButton DirEntryBrowserWidget::saveAllChangesQuestion(QMessageBox::StandardButtons buttons,
                                                                          QMessageBox::StandardButton defaultButton)
{
    return ask(tr("Do you want to save all changed items?"), buttons, defaultButton);
}

std::shared_ptr<GlobalDirEntry> DirEntryBrowserWidget::pickFolder()
{
    if (!m_corvidModel)
        return nullptr;
    const QStringList dispatchers = m_generalSettings ? m_generalSettings->dispatcherList() : QStringList();
    ObjectBrowserDialog dialog(m_corvidModel, {Folder::typeId().toStdString()}, tr("Pick folder to save"), dispatchers,
                               m_selectedPathSettings ? m_selectedPathSettings->selectedPath() : nullptr, this);
    if (dialog.exec() != QDialog::Accepted)
        return nullptr;
    return dialog.selectedEntry();
}

DirEntryBrowserWidget::Node *DirEntryBrowserWidget::currentNode() const
{
    return m_view ? m_view->currentNode() : nullptr;
}

QVector<DirEntryBrowserWidget::Node *> DirEntryBrowserWidget::selectedNodes() const
{
    return m_view ? m_view->selectedNodes() : QVector<Node *>();
}

void DirEntryBrowserWidget::selectNodes(const QVector<Node *> &nodes)
{
    if (!m_view || !m_model)
        return;
    m_view->selectionModel()->clearSelection();
    for (Node *node : nodes) {
        const QModelIndex index = m_model->index(node);
        if (index.isValid())
            m_view->selectionModel()->select(index, QItemSelectionModel::Select | QItemSelectionModel::Rows);
    }
    if (!nodes.isEmpty())
        m_view->setCurrentIndex(m_model->index(nodes.front()));
}

void DirEntryBrowserWidget::expandNode(Node *node)
{
    if (m_view)
        m_view->expandNode(node);
}

void DirEntryBrowserWidget::onSelectionChanged(QVector<Node *> nodes)
{
    Q_EMIT sgSelectionChanged(nodes);
}

DirEntryBrowserWidget::DirEntryNode *DirEntryBrowserWidget::openDirEntry(const std::shared_ptr<GlobalDirEntry> &entry)
{
    if (!m_model)
        return nullptr;
    DirEntryNode *node = m_model->openDirEntry(entry);
    if (node && m_view)
        m_view->selectNode(node);
    return node;
}

DirEntryBrowserWidget::DirEntryNode *DirEntryBrowserWidget::newObject()
{
    if (!m_model || !m_interface)
        return nullptr;
    const auto object = m_interface->newNamedObject();
    if (!object) {
        showMessage(tr("A new %1 cannot be made here.").arg(m_interface->objectKind()));
        return nullptr;
    }
    DirEntryNode *node = m_model->addNewObject(object, m_interface->defaultFolder());
    if (node && m_view)
        m_view->selectAndEditNode(node);
    return node;
}

void DirEntryBrowserWidget::reloadNodes(const QVector<Node *> &nodes)
{
    for (Node *node : nodes) {
        auto *entryNode = dynamic_cast<DirEntryNode *>(node);
        if (entryNode && entryNode->isStored())
            m_model->reloadNode(entryNode);
    }
}

QVector<DirEntryBrowserWidget::DirEntryNode *> DirEntryBrowserWidget::modifiedObjects(const QVector<Node *> &nodes) const
{
    QVector<DirEntryNode *> modified;
    for (Node *node : nodes) {
        auto *entryNode = dynamic_cast<DirEntryNode *>(node);
        if (entryNode && entryNode->isModified() && !modified.contains(entryNode))
            modified << entryNode;
    }
    return modified;
}

DirEntryBrowserWidget::DirEntryNode *DirEntryBrowserWidget::associatedDirEntyNodeWithType(Node *node,
                                                                                        const std::string &type) const
{
    for (Node *n = node; n; n = n->parent()) {
        auto *entryNode = dynamic_cast<DirEntryNode *>(n);
        if (entryNode && entryNode->objectType() == type)
            return entryNode;
    }
    return nullptr;
}

std::shared_ptr<GlobalDirEntry> DirEntryBrowserWidget::folderFor(DirEntryNode *node, bool askForFolder)
{
    const auto entry = node->globalDirEntry();
    if (entry && !entry->dispatcherID().isEmpty())
        return folderHolding(*entry); // the folder recorded when the object was made
    return askForFolder ? pickFolder() : nullptr;
}

void DirEntryBrowserWidget::saveNodes(QVector<Node *> &nodes, bool askForFolder)
{
    DirEntryPersistanceManager *manager = persistanceManager();
    if (!manager)
        return;
    for (DirEntryNode *node : modifiedObjects(nodes)) {
        const std::shared_ptr<BaseObject> cargo = node->cargo();
        if (!cargo || node->isSaving())
            continue;
        // The store works on a copy: edits made while it saves stay in the node.
        const std::shared_ptr<BaseObject> snapshot = cargo->deepCopy();
        QPointer<DirEntryTreeModel> model = m_model;
        try {
            if (node->isStored()) {
                manager->updateObject(node->dispatcherId(), snapshot, [model, node, cargo](std::shared_ptr<BaseObject> saved) {
                    if (!model || !model->containsNode(node))
                        return;
                    cargo->setVersion(saved->version());
                    cargo->setIsStored(true);
                    if (const auto entry = node->globalDirEntry())
                        entry->setHeader(saved->header());
                    model->redrawNode(node);
                });
            } else {
                const auto folder = folderFor(node, askForFolder);
                if (!folder)
                    continue; // the user cancelled the folder pick: the object stays unsaved
                manager->storeObject(snapshot, folder, [model, node, cargo](std::shared_ptr<GlobalDirEntry> entry) {
                    if (!model || !model->containsNode(node))
                        return;
                    cargo->setId(entry->entryObjectId());
                    cargo->setVersion(entry->version());
                    cargo->setIsStored(true);
                    node->setGlobalDirEntry(entry);
                    model->redrawNode(node);
                });
            }
        } catch (const std::exception &e) {
            showMessage(QString::fromStdString(e.what()));
            continue;
        }
        m_saving[manager->lastCommandId()] = node;
        node->setIsSaving(true);
        m_model->setNodeModified(node, false);
    }
}

void DirEntryBrowserWidget::saveAll()
{
    if (!m_view)
        return;
    QVector<Node *> nodes = m_view->allNodes();
    saveNodes(nodes, true);
}

void DirEntryBrowserWidget::onRequestFinished(const std::string &commandId, bool succeeded)
{
    const auto it = m_saving.find(commandId);
    if (it == m_saving.end())
        return;
    Node *node = it->second;
    m_saving.erase(it);
    if (!m_model->containsNode(node))
        return;
    auto *entryNode = dynamic_cast<DirEntryNode *>(node);
    if (entryNode)
        entryNode->setIsSaving(false);
    if (!succeeded) {
        // Nothing is lost: the object stays modified and open.
        m_model->setNodeModified(node, true);
        m_closeAfterSave.removeAll(node);
        return;
    }
    m_model->redrawNode(node);
    if (m_closeAfterSave.contains(node) && !node->isModified()) {
        m_closeAfterSave.removeAll(node);
        closeNow({node});
    }
}

void DirEntryBrowserWidget::closeNow(const QVector<Node *> &nodes)
{
    if (m_model)
        m_model->removeNodes(nodes);
}

void DirEntryBrowserWidget::closeActivated(Node *node)
{
    if (!node || !m_model || !m_model->containsNode(node))
        return;
    auto *entryNode = dynamic_cast<DirEntryNode *>(node);
    if (entryNode && entryNode->isSaving()) {
        m_closeAfterSave << node;
        return;
    }
    if (!entryNode || !entryNode->isModified()) {
        closeNow({node});
        return;
    }
    switch (saveChangesQuestion(entryNode, QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel,
                                QMessageBox::Save)) {
    case QMessageBox::Save: {
        QVector<Node *> nodes{node};
        saveNodes(nodes, true);
        if (entryNode->isSaving())
            m_closeAfterSave << node;
        break;
    }
    case QMessageBox::Discard:
        closeNow({node});
        break;
    default:
        break;
    }
}

bool DirEntryBrowserWidget::closeAll()
{
    if (!m_view)
        return true;
    QVector<Node *> nodes;
    for (DirEntryNode *node : m_model->dirEntryNodes())
        nodes << node;
    const QVector<DirEntryNode *> modified = modifiedObjects(nodes);
    if (!modified.isEmpty()) {
        switch (saveAllChangesQuestion(QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel,
                                       QMessageBox::Save)) {
        case QMessageBox::Save:
            saveNodes(nodes, true);
            if (!waitForSaves())
                return false;
            for (DirEntryNode *node : modified) {
                if (m_model->containsNode(node) && node->isModified())
                    return false; // a save failed or was cancelled: keep everything open
            }
            break;
        case QMessageBox::Discard:
            break;
        default:
            return false;
        }
    } else if (!waitForSaves()) {
        return false;
    }
    closeNow(nodes);
    return true;
}

bool DirEntryBrowserWidget::waitForSaves(int timeoutMs)
{
    while (!m_saving.empty()) {
        QElapsedTimer clock;
        clock.start();
        while (!m_saving.empty() && clock.elapsed() < timeoutMs) {
            QEventLoop loop;
            QTimer::singleShot(20, &loop, &QEventLoop::quit);
            loop.exec(QEventLoop::ExcludeUserInputEvents);
        }
        if (m_saving.empty())
            break;
        const auto answer = QMessageBox::question(
            this, tr("Still saving"), tr("This takes longer than expected. Do you want to give it a bit more time?"),
            QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
        if (answer != QMessageBox::Yes)
            return false;
    }
    return true;
}

} // namespace vexa

#include "objectbrowserwidget.h"

#include "corvidobjectsclientmodel.h"
#include "folderpickersettings.h"
#include "folderpickerwidget.h"
#include "selectedpath.h"

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <context/progressmodel.h>
#include <domain/folder.h>
#include <domain/globaldirentry.h>
#include <store/errorinfo.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QDrag>
#include <QDragMoveEvent>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMessageBox>
#include <QMimeData>
#include <QProgressBar>
#include <QSplitter>
#include <QStatusBar>
#include <QToolButton>
#include <QVBoxLayout>

namespace vexa {

namespace {

// The folder tree: folders only, names only.
class FolderOnlyModel : public QSortFilterProxyModel
{
public:
    using QSortFilterProxyModel::QSortFilterProxyModel;

protected:
    bool filterAcceptsRow(int sourceRow, const QModelIndex &sourceParent) const override
    {
        const QModelIndex index = sourceModel()->index(sourceRow, 0, sourceParent);
        return index.data(CorvidObjectsClientModel::IsFolderRole).toBool();
    }
    bool filterAcceptsColumn(int sourceColumn, const QModelIndex &) const override { return sourceColumn == 0; }
};

std::string standardized(const std::string &id)
{
    return CommandDispatcher::standardizedDispatcherId(id);
}

} // namespace

// ---- ObjectBrowserView -------------------------------------------------------------------

ObjectBrowserView::ObjectBrowserView(QWidget *parent)
    : QTreeView(parent)
{
    setDragEnabled(true);
    setAcceptDrops(true);
    setDropIndicatorShown(true);
    setDragDropMode(QAbstractItemView::DragDrop);
    setDefaultDropAction(Qt::MoveAction);
    setUniformRowHeights(true);
    setEditTriggers(QAbstractItemView::EditKeyPressed);
    setContextMenuPolicy(Qt::CustomContextMenu);
}

void ObjectBrowserView::startDrag(Qt::DropActions supportedActions)
{
    QModelIndexList indexes;
    for (const QModelIndex &index : selectionModel()->selectedIndexes()) {
        if (index.column() == 0 && (model()->flags(index) & Qt::ItemIsDragEnabled))
            indexes << index;
    }
    if (indexes.isEmpty())
        return;
    QMimeData *data = model()->mimeData(indexes);
    if (!data)
        return;
    auto *drag = new QDrag(this);
    drag->setMimeData(data);
    const QIcon icon = indexes.front().data(Qt::DecorationRole).value<QIcon>();
    if (!icon.isNull())
        drag->setPixmap(icon.pixmap(24, 24));
    // The rows move when the store has moved the objects: nothing is removed here.
    drag->exec(supportedActions, defaultDropAction());
}

void ObjectBrowserView::preferCopyFromOtherStores(QDropEvent *event) const
{
    const auto cargo = CorvidObjectsClientModel::cargoFromMimeData(event->mimeData());
    if (cargo.empty() || m_dispatcherId.empty())
        return;
    const std::string from = cargo.front().entry()->dispatcherID().toStdString();
    if (!from.empty() && standardized(from) != standardized(m_dispatcherId)
        && (event->possibleActions() & Qt::CopyAction))
        event->setDropAction(Qt::CopyAction);
}

void ObjectBrowserView::dragEnterEvent(QDragEnterEvent *event)
{
    QTreeView::dragEnterEvent(event);
    if (event->isAccepted())
        preferCopyFromOtherStores(event);
}

void ObjectBrowserView::dragMoveEvent(QDragMoveEvent *event)
{
    QTreeView::dragMoveEvent(event);
    if (event->isAccepted())
        preferCopyFromOtherStores(event);
}

void ObjectBrowserView::dropEvent(QDropEvent *event)
{
    preferCopyFromOtherStores(event);
    QTreeView::dropEvent(event);
}

// ---- ObjectBrowserFilterModel ------------------------------------------------------------

ObjectBrowserFilterModel::ObjectBrowserFilterModel(QObject *parent)
    : QSortFilterProxyModel(parent)
{
    setSortCaseSensitivity(Qt::CaseInsensitive);
    setSortLocaleAware(true);
}

void ObjectBrowserFilterModel::setTypes(const QStringList &types)
{
    m_types = types;
    invalidateFilter();
}

void ObjectBrowserFilterModel::setSearchText(const QString &text)
{
    m_search = text.trimmed();
    invalidateFilter();
}

void ObjectBrowserFilterModel::setFolder(const QModelIndex &sourceFolder)
{
    m_folder = sourceFolder;
    if (!m_types.isEmpty() || !m_search.isEmpty())
        invalidateFilter();
}

bool ObjectBrowserFilterModel::filterAcceptsRow(int sourceRow, const QModelIndex &sourceParent) const
{
    if ((m_types.isEmpty() && m_search.isEmpty()) || sourceParent != QModelIndex(m_folder))
        return true;
    const QModelIndex index = sourceModel()->index(sourceRow, 0, sourceParent);
    if (!m_search.isEmpty() && !index.data(Qt::DisplayRole).toString().contains(m_search, Qt::CaseInsensitive))
        return false;
    if (m_types.isEmpty() || index.data(CorvidObjectsClientModel::IsFolderRole).toBool())
        return true;
    return m_types.contains(index.data(CorvidObjectsClientModel::ObjectTypeRole).toString());
}

Qt::ItemFlags ObjectBrowserFilterModel::flags(const QModelIndex &index) const
{
    if (!index.isValid())
        return QSortFilterProxyModel::flags(index);
    // A row selects, drags and takes drops as one; only folders take drops.
    Qt::ItemFlags result = QSortFilterProxyModel::flags(index.siblingAtColumn(0));
    if (index.column() > 0)
        result &= ~Qt::ItemIsEditable;
    if (!index.data(CorvidObjectsClientModel::IsFolderRole).toBool())
        result &= ~Qt::ItemIsDropEnabled;
    return result;
}

// ---- ObjectBrowserWidget -----------------------------------------------------------------

ObjectBrowserWidget::ObjectBrowserWidget(QWidget *parent)
    : QWidget(parent)
{
}

ObjectBrowserWidget::~ObjectBrowserWidget() = default;

void ObjectBrowserWidget::initialize(CorvidModel *corvidModel, const std::string &dispatcherId,
                                     const std::vector<std::string> &types)
{
    m_corvidModel = corvidModel;
    m_model = new CorvidObjectsClientModel(corvidModel, dispatcherId, this);
    m_model->setColumns({CorvidObjectsClientModel::NameColumn, CorvidObjectsClientModel::TypeColumn,
                         CorvidObjectsClientModel::CreatedColumn});
    if (!types.empty()) {
        std::vector<std::string> filter = types;
        if (std::find(filter.begin(), filter.end(), Folder::typeId().toStdString()) == filter.end())
            filter.push_back(Folder::typeId().toStdString());
        m_model->setTypeFilter(filter);
    }

    m_caption = new QLabel(this);
    m_caption->setObjectName(QStringLiteral("captionLabel"));
    QFont bold = m_caption->font();
    bold.setBold(true);
    m_caption->setFont(bold);
    m_caption->hide();

    m_typeBox = new QComboBox(this);
    m_typeBox->setObjectName(QStringLiteral("typeFilterBox"));
    m_typeBox->addItem(tr("All types"), QString());
    for (const char *type : {"QCJob", "Standard", "Trial", "ToleranceSet", "QCJobTemplate", "Formula", "Colorant",
                             "Recipe"})
        m_typeBox->addItem(CorvidObjectsClientModel::typeDisplayName(QString::fromLatin1(type)), QString::fromLatin1(type));
    m_searchEdit = new QLineEdit(this);
    m_searchEdit->setObjectName(QStringLiteral("searchEdit"));
    m_searchEdit->setPlaceholderText(tr("Search by name"));
    m_searchEdit->setClearButtonEnabled(true);

    m_folderModel = new FolderOnlyModel(this);
    m_folderModel->setSourceModel(m_model);
    m_detailModel = new ObjectBrowserFilterModel(this);
    m_detailModel->setSourceModel(m_model);

    m_folderView = new ObjectBrowserView(this);
    m_folderView->setObjectName(QStringLiteral("folderView"));
    m_folderView->setModel(m_folderModel);
    m_folderView->setHeaderHidden(true);
    m_folderView->setSelectionMode(QAbstractItemView::SingleSelection);
    m_folderView->setDispatcherId(m_model->defaultDispatcherId());

    m_detailView = new ObjectBrowserView(this);
    m_detailView->setObjectName(QStringLiteral("detailView"));
    m_detailView->setModel(m_detailModel);
    m_detailView->setRootIsDecorated(false);
    m_detailView->setItemsExpandable(false);
    m_detailView->setExpandsOnDoubleClick(false);
    m_detailView->setSelectionMode(QAbstractItemView::ExtendedSelection);
    m_detailView->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_detailView->setAllColumnsShowFocus(true);
    m_detailView->header()->setSortIndicator(-1, Qt::AscendingOrder);
    m_detailView->setSortingEnabled(true);
    m_detailView->header()->setStretchLastSection(true);
    m_detailView->setColumnWidth(0, 220);
    m_detailView->setColumnWidth(1, 110);
    m_detailView->setDispatcherId(m_model->defaultDispatcherId());

    m_splitter = new QSplitter(Qt::Horizontal, this);
    auto *splitter = m_splitter;
    splitter->addWidget(m_folderView);
    splitter->addWidget(m_detailView);
    splitter->setStretchFactor(0, 2);
    splitter->setStretchFactor(1, 5);

    m_messageArea = new QWidget(this);
    m_messageArea->setObjectName(QStringLiteral("messageArea"));
    m_messageArea->setStyleSheet(QStringLiteral(
        "#messageArea { background: #fdecea; border: 1px solid #e8b4ad; border-radius: 3px; }"
        " QLabel { color: #8a1f11; }"));
    m_messageLabel = new QLabel(m_messageArea);
    m_messageLabel->setObjectName(QStringLiteral("messageLabel"));
    m_messageLabel->setWordWrap(true);
    m_messageLabel->setTextInteractionFlags(Qt::TextSelectableByMouse);
    auto *dismiss = new QToolButton(m_messageArea);
    dismiss->setText(QStringLiteral("×"));
    dismiss->setAutoRaise(true);
    dismiss->setToolTip(tr("Dismiss"));
    auto *messageLayout = new QHBoxLayout(m_messageArea);
    messageLayout->setContentsMargins(6, 2, 2, 2);
    messageLayout->addWidget(m_messageLabel, 1);
    messageLayout->addWidget(dismiss, 0, Qt::AlignTop);
    m_messageArea->hide();
    connect(dismiss, &QToolButton::clicked, m_messageArea, &QWidget::hide);

    m_statusBar = new QStatusBar(this);
    m_statusBar->setSizeGripEnabled(false);
    m_statusLabel = new QLabel(m_statusBar);
    m_progressBar = new QProgressBar(m_statusBar);
    m_progressBar->setObjectName(QStringLiteral("progressBar"));
    m_progressBar->setRange(0, 100);
    m_progressBar->setMaximumWidth(180);
    m_progressBar->setTextVisible(true);
    m_progressBar->hide();
    m_statusBar->addWidget(m_statusLabel, 1);
    m_statusBar->addPermanentWidget(m_progressBar);

    m_favourites = new FolderPickerWidget(this);
    m_favourites->hide();

    auto *filterRow = new QHBoxLayout;
    filterRow->addWidget(m_typeBox);
    filterRow->addWidget(m_searchEdit, 1);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(2, 2, 2, 2);
    layout->setSpacing(3);
    layout->addWidget(m_caption);
    layout->addWidget(m_favourites);
    layout->addLayout(filterRow);
    layout->addWidget(splitter, 1);
    layout->addWidget(m_messageArea);
    layout->addWidget(m_statusBar);

    buildActions();

    connect(m_folderView->selectionModel(), &QItemSelectionModel::currentChanged, this,
            [this](const QModelIndex &current) { onFolderViewCurrentChanged(current); });
    connect(m_detailView, &QAbstractItemView::activated, this, &ObjectBrowserWidget::onDetailActivated);
    connect(m_folderView, &QAbstractItemView::activated, this, [this] { m_detailView->setFocus(); });
    connect(m_detailView->selectionModel(), &QItemSelectionModel::selectionChanged, this, [this] {
        Q_EMIT sgSelectionChanged(selectedEntries());
        updateStatus();
    });
    connect(m_folderView, &QWidget::customContextMenuRequested, this,
            [this](const QPoint &position) { showContextMenu(m_folderView, position); });
    connect(m_detailView, &QWidget::customContextMenuRequested, this,
            [this](const QPoint &position) { showContextMenu(m_detailView, position); });
    connect(m_typeBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, [this] {
        const QString type = m_typeBox->currentData().toString();
        m_detailModel->setTypes(type.isEmpty() ? QStringList() : QStringList{type});
        updateStatus();
    });
    connect(m_searchEdit, &QLineEdit::textChanged, this, [this](const QString &text) {
        m_detailModel->setSearchText(text);
        updateStatus();
    });
    connect(m_model, &CorvidObjectsClientModel::sgGeneralError, this, &ObjectBrowserWidget::showMessage);
    connect(m_model, &CorvidObjectsClientModel::sgObjectDeletionError, this,
            [this](QWidget *, std::string, std::shared_ptr<ErrorInfo> error) {
                showMessage(tr("Error occured during %1: %2 (%3)")
                                .arg(QStringLiteral("DeleteObject"), error ? error->message() : QString())
                                .arg(error ? int(error->errorCode()) : 0));
            });
    connect(m_model, &CorvidObjectsClientModel::sgObjectDeleted, this,
            [this](QWidget *, std::string, std::string deletedId) { Q_EMIT sgObjectDeleted(deletedId); });
    connect(m_model, &CorvidObjectsClientModel::sgFolderLoaded, this, &ObjectBrowserWidget::onFolderLoaded);
    connect(m_model, &CorvidObjectsClientModel::sgNewFolderCreated, this, &ObjectBrowserWidget::onNewFolderCreated);
    connect(m_model, &QAbstractItemModel::rowsInserted, this, &ObjectBrowserWidget::updateStatus);
    connect(m_model, &QAbstractItemModel::rowsRemoved, this, &ObjectBrowserWidget::updateStatus);
    connect(m_favourites, &FolderPickerWidget::sgFolderChosen, this, &ObjectBrowserWidget::selectFavourite);
    if (m_corvidModel)
        connect(m_corvidModel->progressModel(), &ProgressModel::sgProgressChanged, this,
                &ObjectBrowserWidget::updateProgress);

    setCurrentFolder(QModelIndex());
}

void ObjectBrowserWidget::buildActions()
{
    auto make = [this](const QString &text, const QKeySequence &keys, void (ObjectBrowserWidget::*slot)()) {
        auto *action = new QAction(text, this);
        if (!keys.isEmpty())
            action->setShortcut(keys);
        // Only while a view itself has the focus: an open editor keeps its own keys.
        action->setShortcutContext(Qt::WidgetShortcut);
        connect(action, &QAction::triggered, this, slot);
        m_folderView->addAction(action);
        m_detailView->addAction(action);
        return action;
    };
    m_newFolderAction = make(tr("New folder"), QKeySequence(tr("Ctrl+Shift+N")), &ObjectBrowserWidget::newFolder);
    m_renameAction = make(tr("Rename"), QKeySequence(Qt::Key_F2), &ObjectBrowserWidget::renameSelected);
    m_deleteAction = make(tr("Delete…"), QKeySequence::Delete, &ObjectBrowserWidget::deleteSelected);
    m_copyAction = make(tr("Copy"), QKeySequence::Copy, &ObjectBrowserWidget::copySelected);
    m_pasteAction = make(tr("Paste"), QKeySequence::Paste, &ObjectBrowserWidget::paste);
    // Enter opens through the views' activated().
    m_openAction = make(tr("Open"), QKeySequence(), &ObjectBrowserWidget::openSelected);
    m_reloadAction = make(tr("Reload"), QKeySequence::Refresh, &ObjectBrowserWidget::reloadCurrentFolder);
    m_favouriteAction = make(tr("Add folder to favourites"), QKeySequence(), &ObjectBrowserWidget::addCurrentFolderToFavourites);
}

void ObjectBrowserWidget::setFolderPickerSettings(std::shared_ptr<FolderPickerSettings> settings)
{
    if (!m_favourites)
        return;
    m_favourites->setSettings(std::move(settings));
    m_favourites->setCorvidModel(m_corvidModel);
    m_favourites->setVisible(m_favourites->settings() != nullptr);
    connect(this, &ObjectBrowserWidget::sgObjectDeleted, m_favourites, &FolderPickerWidget::onObjectDeleted,
            Qt::UniqueConnection);
}

void ObjectBrowserWidget::setOrientation(Qt::Orientation orientation)
{
    if (m_splitter)
        m_splitter->setOrientation(orientation);
}

void ObjectBrowserWidget::setCaption(const QString &caption)
{
    if (!m_caption)
        return;
    m_caption->setText(caption);
    m_caption->setVisible(!caption.isEmpty());
}

std::string ObjectBrowserWidget::dispatcherId() const
{
    return m_model ? m_model->defaultDispatcherId() : std::string();
}

// ---- index mapping -----------------------------------------------------------------------

QModelIndex ObjectBrowserWidget::detailToSource(const QModelIndex &proxyIndex) const
{
    return m_detailModel->mapToSource(proxyIndex);
}

QModelIndex ObjectBrowserWidget::sourceToDetail(const QModelIndex &sourceIndex) const
{
    return m_detailModel->mapFromSource(sourceIndex);
}

QModelIndex ObjectBrowserWidget::folderToSource(const QModelIndex &proxyIndex) const
{
    return m_folderModel->mapToSource(proxyIndex);
}

QModelIndex ObjectBrowserWidget::sourceToFolder(const QModelIndex &sourceIndex) const
{
    return m_folderModel->mapFromSource(sourceIndex.siblingAtColumn(0));
}

bool ObjectBrowserWidget::detailHasFocus() const
{
    return !m_folderView->hasFocus();
}

// ---- folders -----------------------------------------------------------------------------

QModelIndex ObjectBrowserWidget::currentFolder() const
{
    return m_currentFolder;
}

void ObjectBrowserWidget::setCurrentFolder(const QModelIndex &sourceFolder)
{
    const QModelIndex folder = sourceFolder.siblingAtColumn(0);
    m_currentFolder = folder;
    m_detailModel->setFolder(folder);
    m_detailView->setRootIndex(sourceToDetail(folder));
    if (m_model->canFetchMore(folder))
        m_model->fetchMore(folder);
    const QModelIndex inTree = sourceToFolder(folder);
    if (inTree.isValid() && m_folderView->currentIndex() != inTree) {
        const QSignalBlocker blocker(m_folderView->selectionModel());
        m_folderView->setCurrentIndex(inTree);
        m_folderView->scrollTo(inTree);
    }
    if (inTree.isValid())
        m_folderView->expand(inTree);
    updateStatus();
    Q_EMIT sgCurrentFolderChanged(currentFolderPath());
}

std::shared_ptr<SelectedPath> ObjectBrowserWidget::currentFolderPath() const
{
    return m_model ? m_model->selectedPath(m_currentFolder) : nullptr;
}

void ObjectBrowserWidget::onFolderViewCurrentChanged(const QModelIndex &proxyIndex)
{
    setCurrentFolder(folderToSource(proxyIndex));
}

void ObjectBrowserWidget::setCurrentFolderPath(const SelectedPath &path)
{
    m_pendingPath = path.path();
    setCurrentFolder(QModelIndex());
    continuePendingPath();
}

void ObjectBrowserWidget::continuePendingPath()
{
    if (m_pendingPath.isEmpty())
        return;
    QModelIndex folder = m_currentFolder;
    while (!m_pendingPath.isEmpty()) {
        if (m_model->canFetchMore(folder)) {
            m_model->fetchMore(folder);
            return; // onFolderLoaded goes on
        }
        QModelIndex next;
        const int rows = m_model->rowCount(folder);
        for (int row = 0; row < rows && !next.isValid(); ++row) {
            const QModelIndex child = m_model->index(row, 0, folder);
            if (child.data(CorvidObjectsClientModel::ObjectIdRole).toString() == m_pendingPath.front())
                next = child;
        }
        if (!next.isValid()) {
            if (rows > 0)
                m_pendingPath.clear(); // the folder is gone: stay where the path ends
            else
                return; // still loading
            break;
        }
        m_pendingPath.removeFirst();
        folder = next;
        setCurrentFolder(folder);
    }
}

void ObjectBrowserWidget::onFolderLoaded(const QModelIndex &folder)
{
    if (folder == QModelIndex(m_currentFolder)) {
        // The folder view's proxy learns the root's new rows only when asked.
        m_detailView->setRootIndex(sourceToDetail(m_currentFolder));
        updateStatus();
    }
    continuePendingPath();
    if (!m_selectAfterCreate.isEmpty() && selectObject(m_selectAfterCreate)) {
        m_selectAfterCreate.clear();
        m_detailView->edit(m_detailView->currentIndex());
    }
}

void ObjectBrowserWidget::onNewFolderCreated(std::shared_ptr<SelectedPath> path)
{
    if (!path || path->path().isEmpty())
        return;
    const QString id = path->path().back();
    if (selectObject(id)) {
        m_detailView->setFocus();
        m_detailView->edit(m_detailView->currentIndex());
    } else {
        m_selectAfterCreate = id;
    }
}

void ObjectBrowserWidget::selectFavourite(const std::shared_ptr<GlobalDirEntry> &folder)
{
    if (!folder)
        return;
    if (!folder->dispatcherID().isEmpty() && standardized(folder->dispatcherID().toStdString()) != standardized(dispatcherId())) {
        showMessage(tr("The folder \"%1\" belongs to another store (%2).").arg(folder->header().name(), folder->dispatcherID()));
        return;
    }
    QStringList path = folder->path();
    if (!folder->entryObjectId().isEmpty())
        path << folder->entryObjectId();
    setCurrentFolderPath(SelectedPath(folder->dispatcherID(), path));
}

// ---- selection ---------------------------------------------------------------------------

QModelIndexList ObjectBrowserWidget::selectedIndexes() const
{
    QModelIndexList indexes;
    for (const QModelIndex &index : m_detailView->selectionModel()->selectedRows())
        indexes << detailToSource(index);
    return indexes;
}

std::vector<std::shared_ptr<GlobalDirEntry>> ObjectBrowserWidget::selectedEntries() const
{
    std::vector<std::shared_ptr<GlobalDirEntry>> entries;
    for (const QModelIndex &index : selectedIndexes()) {
        if (auto entry = m_model->globalDirEntry(index))
            entries.push_back(entry);
    }
    return entries;
}

bool ObjectBrowserWidget::selectObject(const QString &objectId)
{
    const QModelIndex source = m_model->indexOfObject(objectId);
    const QModelIndex proxy = sourceToDetail(source);
    if (!proxy.isValid() || proxy.parent() != m_detailView->rootIndex())
        return false;
    m_detailView->setCurrentIndex(proxy);
    m_detailView->selectionModel()->select(proxy, QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    m_detailView->scrollTo(proxy);
    return true;
}

// ---- messages and status -----------------------------------------------------------------

QString ObjectBrowserWidget::message() const
{
    return m_messageArea && !m_messageArea->isHidden() ? m_messageLabel->text() : QString();
}

void ObjectBrowserWidget::showMessage(const QString &message)
{
    m_messageLabel->setText(message);
    m_messageArea->setVisible(!message.isEmpty());
}

void ObjectBrowserWidget::updateStatus()
{
    if (!m_statusLabel)
        return;
    const int shown = m_detailModel->rowCount(m_detailView->rootIndex());
    const int selected = m_detailView->selectionModel() ? m_detailView->selectionModel()->selectedRows().size() : 0;
    QString text = tr("%n object(s)", nullptr, shown);
    if (selected > 0)
        text += tr(", %n selected", nullptr, selected);
    m_statusLabel->setText(text);
}

void ObjectBrowserWidget::updateProgress()
{
    const auto tasks = m_corvidModel ? m_corvidModel->progressModel()->progressListeners()
                                     : std::vector<std::shared_ptr<SingleProgress>>();
    if (tasks.empty()) {
        m_progressBar->hide();
        return;
    }
    const auto &task = tasks.back();
    m_progressBar->setFormat(task->progressTitle() + QStringLiteral(" %p%"));
    m_progressBar->setValue(int(task->value() * 100.0 + 0.5));
    m_progressBar->show();
}

// ---- actions -----------------------------------------------------------------------------

bool ObjectBrowserWidget::confirmDelete(const QString &question)
{
    return QMessageBox::question(this, tr("Delete"), question, QMessageBox::Yes | QMessageBox::No, QMessageBox::No)
        == QMessageBox::Yes;
}

void ObjectBrowserWidget::newFolder()
{
    try {
        m_model->createFolder(m_currentFolder);
    } catch (const std::exception &e) {
        showMessage(QString::fromStdString(e.what()));
    }
}

void ObjectBrowserWidget::renameSelected()
{
    if (m_folderView->hasFocus()) {
        if (m_folderView->currentIndex().isValid())
            m_folderView->edit(m_folderView->currentIndex());
        return;
    }
    const QModelIndex current = m_detailView->currentIndex();
    if (current.isValid())
        m_detailView->edit(current.siblingAtColumn(0));
}

void ObjectBrowserWidget::deleteSelected()
{
    QModelIndexList indexes;
    if (m_folderView->hasFocus()) {
        if (m_currentFolder.isValid())
            indexes << QModelIndex(m_currentFolder);
    } else {
        indexes = selectedIndexes();
    }
    if (indexes.isEmpty())
        return;
    const QString question = indexes.size() == 1
        ? tr("Delete \"%1\" from the store?").arg(indexes.front().data(Qt::DisplayRole).toString())
        : tr("Delete these %n objects from the store?", nullptr, indexes.size());
    if (!confirmDelete(question))
        return;
    try {
        m_model->deleteObjects(indexes, this);
    } catch (const std::exception &e) {
        showMessage(QString::fromStdString(e.what()));
    }
}

void ObjectBrowserWidget::copySelected()
{
    QModelIndexList indexes = selectedIndexes();
    if (indexes.isEmpty() && m_folderView->hasFocus() && m_currentFolder.isValid())
        indexes << QModelIndex(m_currentFolder);
    if (indexes.isEmpty())
        return;
    if (QMimeData *data = m_model->mimeData(indexes))
        QApplication::clipboard()->setMimeData(data);
}

void ObjectBrowserWidget::paste()
{
    const QMimeData *data = QApplication::clipboard()->mimeData();
    if (!data || CorvidObjectsClientModel::cargoFromMimeData(data).empty())
        return;
    m_model->dropMimeData(data, Qt::CopyAction, -1, 0, m_currentFolder);
}

void ObjectBrowserWidget::openSelected()
{
    if (m_folderView->hasFocus()) {
        setCurrentFolder(m_currentFolder);
        m_detailView->setFocus();
        return;
    }
    const QModelIndexList indexes = selectedIndexes();
    for (const QModelIndex &index : indexes) {
        if (indexes.size() == 1 && index.data(CorvidObjectsClientModel::IsFolderRole).toBool()) {
            setCurrentFolder(index);
            return;
        }
        if (!index.data(CorvidObjectsClientModel::IsFolderRole).toBool())
            Q_EMIT sgObjectActivated(m_model->globalDirEntry(index));
    }
}

void ObjectBrowserWidget::onDetailActivated(const QModelIndex &proxyIndex)
{
    const QModelIndex source = detailToSource(proxyIndex).siblingAtColumn(0);
    if (!source.isValid())
        return;
    if (source.data(CorvidObjectsClientModel::IsFolderRole).toBool())
        setCurrentFolder(source);
    else
        Q_EMIT sgObjectActivated(m_model->globalDirEntry(source));
}

void ObjectBrowserWidget::reloadCurrentFolder()
{
    m_model->reload(m_currentFolder);
}

void ObjectBrowserWidget::addCurrentFolderToFavourites()
{
    if (!m_favourites || !m_favourites->settings())
        return;
    QModelIndex folder = m_currentFolder;
    const QModelIndexList selected = selectedIndexes();
    if (selected.size() == 1 && selected.front().data(CorvidObjectsClientModel::IsFolderRole).toBool())
        folder = selected.front();
    std::shared_ptr<GlobalDirEntry> entry = m_model->globalDirEntry(folder);
    if (!entry) {
        // The top of the store.
        entry = std::make_shared<GlobalDirEntry>();
        entry->setDispatcherID(QString::fromStdString(dispatcherId()));
        entry->setEntryObjectType(Folder::typeId());
    }
    m_favourites->rememberFolder(*entry);
}

void ObjectBrowserWidget::showContextMenu(QWidget *view, const QPoint &position)
{
    QMenu menu(this);
    if (view == m_folderView) {
        const QModelIndex proxy = m_folderView->indexAt(position);
        if (proxy.isValid())
            m_folderView->setCurrentIndex(proxy);
        m_folderView->setFocus();
    } else {
        m_detailView->setFocus();
    }
    const bool hasSelection = view == m_folderView ? m_currentFolder.isValid() : !selectedIndexes().isEmpty();
    m_openAction->setEnabled(hasSelection);
    menu.addAction(m_openAction);
    menu.addSeparator();
    menu.addAction(m_newFolderAction);
    m_renameAction->setEnabled(hasSelection);
    menu.addAction(m_renameAction);
    m_deleteAction->setEnabled(hasSelection);
    menu.addAction(m_deleteAction);
    menu.addSeparator();
    m_copyAction->setEnabled(hasSelection);
    menu.addAction(m_copyAction);
    menu.addAction(m_pasteAction);
    menu.addSeparator();
    menu.addAction(m_reloadAction);
    if (m_favourites && m_favourites->settings())
        menu.addAction(m_favouriteAction);
    menu.exec(static_cast<QAbstractItemView *>(view)->viewport()->mapToGlobal(position));
    for (QAction *action : menu.actions())
        action->setEnabled(true);
}

} // namespace vexa

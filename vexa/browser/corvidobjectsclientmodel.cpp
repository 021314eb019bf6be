#include "corvidobjectsclientmodel.h"

#include "dispatcherconnection_p.h"
#include "selectedpath.h"

#include <vexa/widgets/uihelper.h>

#include <context/addobject.h>
#include <context/addobjectresponse.h>
#include <context/commanddispatcher.h>
#include <context/copyobject.h>
#include <context/copyobjectresponse.h>
#include <context/corvidmodel.h>
#include <context/deleteobject.h>
#include <context/fullobjectloader.h>
#include <context/getcorvidobject.h>
#include <context/getcorvidobjectresponse.h>
#include <context/getdirentries.h>
#include <context/getdirentriesresponse.h>
#include <context/moveobject.h>
#include <context/moveobjectresponse.h>
#include <context/progress.h>
#include <context/progresslistener.h>
#include <context/progresslistenerrange.h>
#include <context/progressmodel.h>
#include <context/updateobject.h>
#include <context/updateobjectresponse.h>
#include <domain/baseobject.h>
#include <domain/direntry.h>
#include <domain/domainmetatypes.h>
#include <domain/folder.h>
#include <domain/globaldirentry.h>
#include <store/errorinfo.h>
#include <utilities/logger.h>
#include <utilities/timehelper.h>

#include <QApplication>
#include <QDataStream>
#include <QFont>
#include <QFontMetrics>
#include <QHash>
#include <QLocale>
#include <QMessageBox>
#include <QMimeData>
#include <QSet>

#include <atomic>
#include <stdexcept>

namespace vexa {

namespace {

// The copies between stores, numbered process-wide.
std::atomic<size_t> s_remoteCopyCounter{0};

QString folderType()
{
    return Folder::typeId();
}

} // namespace

// ---- CargoItem ---------------------------------------------------------------------------

CorvidObjectsClientModel::CargoItem::CargoItem(int row, int column, std::shared_ptr<GlobalDirEntry> entry)
    : m_row(row)
    , m_column(column)
    , m_entry(std::move(entry))
{
}

bool CorvidObjectsClientModel::CargoItem::isFolder() const
{
    return m_entry && m_entry->entryObjectType() == folderType();
}

// ---- construction ------------------------------------------------------------------------

CorvidObjectsClientModel::CorvidObjectsClientModel(CorvidModel *corvidModel, const std::string &defaultDispatcherId,
                                                   QObject *parent)
    : QAbstractItemModel(parent)
    , m_corvidModel(corvidModel)
    , m_defaultDispatcherId(defaultDispatcherId)
    , m_rootFolder(std::string(), nullptr, std::make_shared<GlobalDirEntry>())
    , m_loader(new FullObjectLoader(this))
{
    registerDomainMetaTypes();
    qRegisterMetaType<std::string>("std::string");
    qRegisterMetaType<std::shared_ptr<vexa::SelectedPath>>("std::shared_ptr<vexa::SelectedPath>");
    qRegisterMetaType<std::shared_ptr<vexa::ErrorInfo>>("std::shared_ptr<vexa::ErrorInfo>");
    setDefaultDispatcherId(defaultDispatcherId);
    connect(m_loader, &FullObjectLoader::sgObjectsLoaded, this, &CorvidObjectsClientModel::onRemoteObjectsLoaded);
    connect(m_loader, &FullObjectLoader::sgObjectsLoadError, this,
            &CorvidObjectsClientModel::onRemoteObjectsLoadError);
}

CorvidObjectsClientModel::~CorvidObjectsClientModel() = default;

void CorvidObjectsClientModel::setCorvidModel(CorvidModel *corvidModel)
{
    beginResetModel();
    m_corvidModel = corvidModel;
    m_rootFolder.removeAllChilren();
    m_rootFolder.setIsDirty(true);
    endResetModel();
}

std::string CorvidObjectsClientModel::defaultDispatcherId() const
{
    if (!m_defaultDispatcherId.empty() || !m_corvidModel)
        return m_defaultDispatcherId;
    return m_corvidModel->defaultDispatcherId();
}

void CorvidObjectsClientModel::setDefaultDispatcherId(const std::string &dispatcherId)
{
    m_defaultDispatcherId = CommandDispatcher::standardizedDispatcherId(dispatcherId);
    if (const auto root = std::dynamic_pointer_cast<GlobalDirEntry>(m_rootFolder.dirEntry()))
        root->setDispatcherID(QString::fromStdString(m_defaultDispatcherId));
}

void CorvidObjectsClientModel::setTypeFilter(const std::vector<std::string> &types)
{
    m_typeFilter = types;
}

void CorvidObjectsClientModel::setColumns(const std::vector<int> &columns)
{
    beginResetModel();
    m_columns = columns;
    endResetModel();
}

int CorvidObjectsClientModel::columnIdentifier(int column) const
{
    if (m_columns.empty())
        return column == 0 ? NameColumn : -1;
    return column >= 0 && column < int(m_columns.size()) ? m_columns[size_t(column)] : -1;
}

QString CorvidObjectsClientModel::columnTitle(int identifier) const
{
    switch (identifier) {
    case NameColumn:
        return tr("Name");
    case TypeColumn:
        return tr("Type");
    case CreatedColumn:
        return tr("Created");
    case VersionColumn:
        return tr("Version");
    default:
        return QString();
    }
}

QString CorvidObjectsClientModel::typeDisplayName(const QString &typeId)
{
    static const QHash<QString, const char *> names{
        {QStringLiteral("Folder"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Folder")},
        {QStringLiteral("QCJob"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "QC job")},
        {QStringLiteral("QCJobTemplate"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "QC job template")},
        {QStringLiteral("Standard"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Standard")},
        {QStringLiteral("Trial"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Trial")},
        {QStringLiteral("ToleranceSet"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Tolerance set")},
        {QStringLiteral("Colorant"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Colorant")},
        {QStringLiteral("Formula"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Formula")},
        {QStringLiteral("Recipe"), QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Recipe")},
        {QStringLiteral("ReflectanceSpectrum"),
         QT_TRANSLATE_NOOP("vexa::CorvidObjectsClientModel", "Reflectance spectrum")},
    };
    const auto it = names.constFind(typeId);
    return it == names.constEnd() ? typeId : tr(it.value());
}

// ---- lookups -----------------------------------------------------------------------------

ObjectBrowserTreeItem *CorvidObjectsClientModel::item(const QModelIndex &index) const
{
    if (!index.isValid())
        return const_cast<ObjectBrowserFolder *>(&m_rootFolder);
    return static_cast<ObjectBrowserTreeItem *>(index.internalPointer());
}

QModelIndex CorvidObjectsClientModel::index(const ObjectBrowserTreeItem *item, int column) const
{
    if (!item || item == &m_rootFolder || !item->parent())
        return QModelIndex();
    return createIndex(item->row(), column, const_cast<ObjectBrowserTreeItem *>(item));
}

ObjectBrowserFolder *CorvidObjectsClientModel::parentFolder(const QModelIndex &index) const
{
    ObjectBrowserTreeItem *found = item(index);
    if (found && !found->isFolder())
        found = item(index.parent());
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(found);
    if (!folder)
        throw std::runtime_error("Cannot find parent folder");
    return folder;
}

std::shared_ptr<GlobalDirEntry> CorvidObjectsClientModel::globalDirEntry(const QModelIndex &index) const
{
    ObjectBrowserTreeItem *row = index.isValid() ? item(index) : nullptr;
    if (!row || !row->dirEntry())
        return nullptr;
    auto entry = std::make_shared<GlobalDirEntry>(*row->dirEntry());
    const QString dispatcherId = QString::fromStdString(defaultDispatcherId());
    entry->setDispatcherID(dispatcherId);
    entry->setStandardizedDispatcherID(dispatcherId);
    QStringList ids;
    QStringList names;
    if (row->parent())
        row->parent()->path(&ids, &names);
    entry->setPath(ids);
    entry->setStringPath(names);
    return entry;
}

std::shared_ptr<SelectedPath> CorvidObjectsClientModel::selectedPath(const QModelIndex &index) const
{
    QStringList ids;
    QStringList names;
    if (auto *folder = dynamic_cast<ObjectBrowserFolder *>(item(index)))
        folder->path(&ids, &names);
    return std::make_shared<SelectedPath>(QString::fromStdString(defaultDispatcherId()), ids, names);
}

QModelIndex CorvidObjectsClientModel::indexOfObject(const QString &objectId) const
{
    if (objectId.isEmpty())
        return QModelIndex();
    auto *root = const_cast<ObjectBrowserFolder *>(&m_rootFolder);
    return index(root->itemWithID(objectId.toStdString()));
}

CommandDispatcher &CorvidObjectsClientModel::dispatcher(const std::string &dispatcherId) const
{
    return connectedDispatcher(m_corvidModel, dispatcherId, defaultDispatcherId());
}

// ---- item model --------------------------------------------------------------------------

QModelIndex CorvidObjectsClientModel::index(int row, int column, const QModelIndex &parent) const
{
    if (!hasIndex(row, column, parent))
        return QModelIndex();
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(item(parent));
    return folder ? createIndex(row, column, folder->objectBrowserTreeItemAtPosition(row)) : QModelIndex();
}

QModelIndex CorvidObjectsClientModel::parent(const QModelIndex &index) const
{
    if (!index.isValid())
        return QModelIndex();
    ObjectBrowserFolder *folder = item(index)->parent();
    if (!folder || folder == &m_rootFolder)
        return QModelIndex();
    return createIndex(folder->row(), 0, folder);
}

int CorvidObjectsClientModel::rowCount(const QModelIndex &parent) const
{
    if (parent.column() > 0)
        return 0;
    const auto *folder = dynamic_cast<const ObjectBrowserFolder *>(item(parent));
    return folder ? folder->numberOfItems() : 0;
}

int CorvidObjectsClientModel::columnCount(const QModelIndex &) const
{
    return m_columns.empty() ? 1 : int(m_columns.size());
}

bool CorvidObjectsClientModel::hasChildren(const QModelIndex &parent) const
{
    if (parent.column() > 0)
        return false;
    const ObjectBrowserTreeItem *row = item(parent);
    return row && row->isFolder();
}

bool CorvidObjectsClientModel::canFetchMore(const QModelIndex &parent) const
{
    const ObjectBrowserTreeItem *row = item(parent);
    return row && row->isFolder() && row->isDirty();
}

void CorvidObjectsClientModel::fetchMore(const QModelIndex &parent)
{
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(item(parent));
    if (!folder || !folder->isDirty())
        return;
    folder->setIsDirty(false);
    // A folder marked for reloading keeps its rows until the new listing replaces them.
    if (folder->numberOfItems() > 0)
        m_replace.insert(folder->objectId().toStdString());
    loadFolder(folder->objectId().toStdString());
}

bool CorvidObjectsClientModel::isLoading(const QModelIndex &folder) const
{
    const ObjectBrowserTreeItem *row = item(folder);
    return row && row->isFolder() && m_loading.count(row->objectId().toStdString()) > 0;
}

void CorvidObjectsClientModel::reload(const QModelIndex &folderIndex)
{
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(item(folderIndex));
    if (!folder)
        return;
    folder->setIsDirty(true);
    fetchMore(index(folder));
}

Qt::ItemFlags CorvidObjectsClientModel::flags(const QModelIndex &index) const
{
    const Qt::ItemFlags base = QAbstractItemModel::flags(index);
    if (!index.isValid())
        return base | Qt::ItemIsDropEnabled | Qt::ItemIsEnabled;
    if (index.column() == 0)
        return base | Qt::ItemIsSelectable | Qt::ItemIsEditable | Qt::ItemIsDragEnabled | Qt::ItemIsDropEnabled
            | Qt::ItemIsEnabled;
    return (base & ~Qt::ItemIsSelectable) | Qt::ItemIsEnabled;
}

QVariant CorvidObjectsClientModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return QVariant();
    const ObjectBrowserTreeItem *row = item(index);
    switch (role) {
    case GlobalDirEntryRole:
        return QVariant::fromValue(globalDirEntry(index));
    case ObjectTypeRole:
        return row->objectType();
    case ObjectIdRole:
        return row->objectId();
    case IsFolderRole:
        return row->isFolder();
    default:
        break;
    }
    switch (columnIdentifier(index.column())) {
    case NameColumn:
        if (role == Qt::DisplayRole || role == Qt::EditRole)
            return row->name();
        if (role == Qt::DecorationRole)
            return row->icon();
        if (role == Qt::ToolTipRole) {
            QStringList names;
            if (row->parent())
                row->parent()->path(nullptr, &names);
            names << row->name();
            return SelectedPath::separator() + names.join(SelectedPath::separator());
        }
        break;
    case TypeColumn:
        if (role == Qt::DisplayRole)
            return typeDisplayName(row->objectType());
        break;
    case CreatedColumn:
        if (role == Qt::DisplayRole && row->dirEntry()) {
            const QDateTime created = TimeHelper::convert(row->dirEntry()->header().creationTimestamp());
            return created.isValid() ? QLocale().toString(created.toLocalTime(), QLocale::ShortFormat) : QString();
        }
        break;
    case VersionColumn:
        if (role == Qt::DisplayRole && row->dirEntry())
            return row->dirEntry()->version();
        break;
    default:
        break;
    }
    return QVariant();
}

QVariant CorvidObjectsClientModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal)
        return QAbstractItemModel::headerData(section, orientation, role);
    const QString title = columnTitle(columnIdentifier(section));
    if (role == Qt::DisplayRole)
        return title;
    if (role == Qt::SizeHintRole) {
        QFont font;
        font.setWeight(75);
        font.setPixelSize(14);
        const QFontMetrics metrics(font);
        QSize size(metrics.horizontalAdvance(title) + 10, metrics.height() + 8);
        size.setWidth(qMax(100, size.width()));
        return size;
    }
    return QAbstractItemModel::headerData(section, orientation, role);
}

// The drag data carries each row's name and, in column 0, its entry with store and path.
QMap<int, QVariant> CorvidObjectsClientModel::itemData(const QModelIndex &index) const
{
    QMap<int, QVariant> roles;
    if (!index.isValid())
        return roles;
    roles.insert(Qt::DisplayRole, data(index, Qt::DisplayRole));
    if (index.column() == 0)
        roles.insert(GlobalDirEntryRole, data(index, GlobalDirEntryRole));
    return roles;
}

QMimeData *CorvidObjectsClientModel::mimeData(const QModelIndexList &indexes) const
{
    return QAbstractItemModel::mimeData(indexes);
}

Qt::DropActions CorvidObjectsClientModel::supportedDropActions() const
{
    return Qt::CopyAction | Qt::MoveAction;
}

Qt::DropActions CorvidObjectsClientModel::supportedDragActions() const
{
    return Qt::CopyAction | Qt::MoveAction;
}

bool CorvidObjectsClientModel::insertRows(int row, int count, const QModelIndex &parent)
{
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(item(parent));
    if (!folder || count < 1)
        return true;
    beginInsertRows(parent, row, row + count - 1);
    for (int i = 0; i < count; ++i) {
        auto entry = std::make_shared<DirEntry>();
        entry->setHeader(Header());
        folder->insert(row + i, new ObjectBrowserTreeItem(std::string(), folder, entry));
    }
    endInsertRows();
    return true;
}

bool CorvidObjectsClientModel::removeRows(int row, int count, const QModelIndex &parent)
{
    if (count < 1)
        return true;
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(item(parent));
    if (!folder)
        return false;
    bool ok = true;
    for (int i = row + count - 1; i >= row; --i) {
        auto *child = dynamic_cast<ObjectBrowserFolder *>(folder->objectBrowserTreeItemAtPosition(i));
        if (child && child->numberOfItems() > 0)
            ok = removeRows(0, child->numberOfItems(), index(child)) && ok;
        if (i < 0 || i >= folder->numberOfItems()) {
            ok = false;
            continue;
        }
        beginRemoveRows(parent, i, i);
        ok = folder->didDeleteChildAt(static_cast<unsigned long>(i)) && ok;
        endRemoveRows();
    }
    return ok;
}

// ---- loading -----------------------------------------------------------------------------

void CorvidObjectsClientModel::loadFolder(const std::string &folderId)
{
    if (!m_corvidModel)
        return;
    try {
        auto command = std::make_shared<GetDirEntries>();
        if (!folderId.empty()) {
            command->setParentFolderId(QString::fromStdString(folderId));
            if (!m_typeFilter.empty()) {
                QStringList types;
                for (const std::string &type : m_typeFilter)
                    types << QString::fromStdString(type);
                command->setTypes(types);
            }
        } else {
            // The top level lists folders only.
            command->setType(folderType());
        }
        command->generateId();
        dispatcher().execute(
            command, this,
            [this, folderId](std::shared_ptr<Response> response) {
                m_loading.erase(folderId);
                dirEntriesLoaded(std::move(response));
            },
            [this, folderId](std::shared_ptr<ErrorInfo> error) {
                m_loading.erase(folderId);
                reportCommandError(QStringLiteral("GetDirEntries"), error);
            });
        m_loading.insert(folderId);
    } catch (const std::exception &e) {
        const QString message = QString::fromStdString(e.what());
        Logger::instance().debug(LogCategory::General,
                                 QStringLiteral("CorvidObjectsClientModel::loadFolder: ") + message);
        Q_EMIT sgGeneralError(message);
    }
}

void CorvidObjectsClientModel::dirEntriesLoaded(std::shared_ptr<Response> response)
{
    const auto listing = std::dynamic_pointer_cast<GetDirEntriesResponse>(response);
    const auto request = listing ? std::dynamic_pointer_cast<GetDirEntries>(listing->command()) : nullptr;
    if (!listing || !request) {
        Logger::instance().debug(LogCategory::General,
                                 QStringLiteral("CorvidObjectsClientModel::dirEntriesLoaded fail ")
                                     + QString::fromStdString(response ? response->commandId() : std::string()));
        return;
    }
    auto *folder = dynamic_cast<ObjectBrowserFolder *>(m_rootFolder.itemWithID(request->parentFolderId().toStdString()));
    if (!folder)
        return; // the folder went away meanwhile
    if (m_replace.erase(request->parentFolderId().toStdString()) > 0 && folder->numberOfItems() > 0)
        removeRows(0, folder->numberOfItems(), index(folder));
    insertEntries(folder, listing->dirEntries());
    Q_EMIT sgFolderLoaded(index(folder));
}

ObjectBrowserTreeItem *CorvidObjectsClientModel::newItem(ObjectBrowserFolder *folder,
                                                         const std::shared_ptr<DirEntry> &entry) const
{
    const std::string name = entry->header().name().toStdString();
    if (entry->entryObjectType() == folderType())
        return new ObjectBrowserFolder(name, folder, entry);
    return new ObjectBrowserTreeItem(name, folder, entry);
}

void CorvidObjectsClientModel::insertEntries(ObjectBrowserFolder *folder,
                                             const std::vector<std::shared_ptr<DirEntry>> &entries)
{
    const int n = folder->numberOfItems();
    int k = 0;
    for (const auto &entry : entries)
        k += entry ? 1 : 0;
    if (k == 0)
        return;
    beginInsertRows(index(folder), n, n + k - 1);
    for (const auto &entry : entries) {
        if (entry)
            folder->append(newItem(folder, entry));
    }
    endInsertRows();
}

// ---- answers -----------------------------------------------------------------------------

void CorvidObjectsClientModel::reportCommandError(const QString &command, const std::shared_ptr<ErrorInfo> &error)
{
    const QString message = error ? error->message() : tr("unknown error");
    const int code = error ? int(error->errorCode()) : 0;
    Logger::instance().debug(LogCategory::General,
                             QStringLiteral("CorvidObjectsClientModel: %1: %2").arg(command, message));
    Q_EMIT sgGeneralError(tr("Error occured during %1: %2 (%3)").arg(command, message).arg(code));
}

void CorvidObjectsClientModel::onError(std::shared_ptr<ErrorInfo> error)
{
    reportCommandError(tr("the request"), error);
}

void CorvidObjectsClientModel::onProgress(std::shared_ptr<Progress> progress)
{
    if (progress && m_corvidModel)
        m_corvidModel->progressModel()->setProgress(progress->commandId(), progress->progress());
}

void CorvidObjectsClientModel::endTask(const std::string &taskId)
{
    if (m_corvidModel)
        m_corvidModel->progressModel()->endProgress(taskId);
}

void CorvidObjectsClientModel::onFolderUpdated(std::shared_ptr<Response> response)
{
    dirEntriesLoaded(std::move(response));
}

// ---- new folder --------------------------------------------------------------------------

void CorvidObjectsClientModel::createFolder(const QModelIndex &parent)
{
    ObjectBrowserFolder *target = parentFolder(parent);
    auto folder = std::make_shared<Folder>();
    folder->setName(tr("Untitled folder"));
    auto command = std::make_shared<AddObject>();
    command->setObject(folder);
    command->setParentFolderId(target->objectId());
    command->generateId();
    dispatcher(target->dispatcherId())
        .execute(
            command, this, [this](std::shared_ptr<Response> response) { onFolderCreated(std::move(response)); },
            [this](std::shared_ptr<ErrorInfo> error) { reportCommandError(QStringLiteral("AddObject"), error); });
}

void CorvidObjectsClientModel::onFolderCreated(std::shared_ptr<Response> response)
{
    const auto added = std::dynamic_pointer_cast<AddObjectResponse>(response);
    const auto request = added ? std::dynamic_pointer_cast<AddObject>(added->command()) : nullptr;
    if (!added || !request || added->dirEntries().empty())
        return;
    auto *parent = dynamic_cast<ObjectBrowserFolder *>(m_rootFolder.itemWithID(request->parentFolderId().toStdString()));
    if (!parent)
        return;
    // A folder never listed lists the new one when it is opened.
    if (!parent->isDirty())
        insertEntries(parent, added->dirEntries());
    QStringList ids;
    QStringList names;
    parent->path(&ids, &names);
    const std::shared_ptr<DirEntry> entry = added->dirEntries().front();
    ids << entry->entryObjectId();
    names << entry->header().name();
    Q_EMIT sgNewFolderCreated(
        std::make_shared<SelectedPath>(QString::fromStdString(defaultDispatcherId()), ids, names));
}

// ---- rename ------------------------------------------------------------------------------

bool CorvidObjectsClientModel::checkName(const QString &name)
{
    if (name.isEmpty()) {
        Q_EMIT sgGeneralError(tr("A name cannot be empty."));
        return false;
    }
    if (name.size() > MaximumNameLength) {
        Q_EMIT sgGeneralError(tr("A name can have at most %1 characters; this one has %2.")
                                  .arg(MaximumNameLength)
                                  .arg(name.size()));
        return false;
    }
    return true;
}

bool CorvidObjectsClientModel::renameObject(const QModelIndex &index, const QString &name)
{
    ObjectBrowserTreeItem *row = index.isValid() ? item(index) : nullptr;
    if (!row || !row->dirEntry())
        return false;
    const QString newName = name.trimmed();
    if (!checkName(newName))
        return false;
    if (newName == row->name())
        return true;
    try {
        // The stored object is read afresh, renamed and written back: the rename never
        // carries stale contents.
        auto load = std::make_shared<GetCorvidObject>();
        load->setId(row->objectId());
        load->setType(row->objectType());
        load->generateId();
        dispatcher().execute(
            load, this,
            [this, newName](std::shared_ptr<Response> response) {
                const auto loaded = std::dynamic_pointer_cast<GetCorvidObjectResponse>(response);
                const std::shared_ptr<BaseObject> object = loaded ? loaded->object() : nullptr;
                if (!object) {
                    Q_EMIT sgGeneralError(tr("Error occured during %1: %2")
                                              .arg(QStringLiteral("GetCorvidObject"), tr("(nullptr loaded)")));
                    return;
                }
                object->header().setName(newName);
                auto update = std::make_shared<UpdateObject>();
                update->setObject(object);
                update->generateId();
                try {
                    dispatcher().execute(
                        update, this,
                        [this](std::shared_ptr<Response> answer) { onItemDataUpdated(std::move(answer)); },
                        [this](std::shared_ptr<ErrorInfo> error) {
                            reportCommandError(QStringLiteral("UpdateObject"), error);
                        });
                } catch (const std::exception &e) {
                    Q_EMIT sgGeneralError(QString::fromStdString(e.what()));
                }
            },
            [this](std::shared_ptr<ErrorInfo> error) { reportCommandError(QStringLiteral("GetCorvidObject"), error); });
    } catch (const std::exception &e) {
        Q_EMIT sgGeneralError(QString::fromStdString(e.what()));
        return false;
    }
    return true;
}

bool CorvidObjectsClientModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (!index.isValid() || role != Qt::EditRole || columnIdentifier(index.column()) != NameColumn)
        return false;
    return renameObject(index, value.toString());
}

void CorvidObjectsClientModel::onItemDataUpdated(std::shared_ptr<Response> response)
{
    const auto updated = std::dynamic_pointer_cast<UpdateObjectResponse>(response);
    const auto request = updated ? std::dynamic_pointer_cast<UpdateObject>(updated->command()) : nullptr;
    std::shared_ptr<BaseObject> object = updated ? updated->updatedObject() : nullptr;
    if (!object && request)
        object = request->object();
    if (!object)
        return;
    ObjectBrowserTreeItem *row = m_rootFolder.itemWithID(object->id().toStdString());
    if (!row || row == &m_rootFolder || !row->dirEntry())
        return;
    row->dirEntry()->setHeader(object->header());
    row->dirEntry()->setVersion(object->version());
    row->setObject(object);
    Q_EMIT dataChanged(index(row, 0), index(row, columnCount() - 1));
}

// ---- delete ------------------------------------------------------------------------------

std::string CorvidObjectsClientModel::deleteObjects(const QModelIndexList &indexes, QWidget *sourceWidget)
{
    QStringList ids;
    for (const QModelIndex &index : indexes) {
        const ObjectBrowserTreeItem *row = index.isValid() ? item(index) : nullptr;
        if (row && row->dirEntry() && !row->objectId().isEmpty() && !ids.contains(row->objectId()))
            ids << row->objectId();
    }
    if (ids.isEmpty())
        return std::string();
    CommandDispatcher &target = dispatcher();
    auto command = std::make_shared<DeleteObject>();
    const std::string commandId = command->generateId();
    command->setIds(ids);
    if (m_corvidModel)
        m_corvidModel->progressModel()->startProgress(tr("Deleting"), 0.0, commandId);
    m_deleteSources[commandId] = sourceWidget;
    target.execute(
        command, this, [this](std::shared_ptr<Response> response) { objectDeleted(std::move(response)); },
        [this, commandId](std::shared_ptr<ErrorInfo> error) {
            m_errorCommandId = commandId;
            onDeletionError(std::move(error));
        },
        [this](std::shared_ptr<Progress> progress) { onProgress(std::move(progress)); });
    return commandId;
}

void CorvidObjectsClientModel::objectDeleted(std::shared_ptr<Response> response)
{
    if (!response)
        return;
    const std::string commandId = response->commandId();
    endTask(commandId);
    QPointer<QWidget> source;
    const auto it = m_deleteSources.find(commandId);
    if (it != m_deleteSources.end()) {
        source = it->second;
        m_deleteSources.erase(it);
    }
    const auto request = std::dynamic_pointer_cast<DeleteObject>(response->command());
    if (!request)
        return;
    for (const QString &id : request->ids()) {
        ObjectBrowserTreeItem *row = m_rootFolder.itemWithID(id.toStdString());
        if (row && row != &m_rootFolder && row->parent())
            removeRow(row->row(), index(row->parent()));
        Q_EMIT sgObjectDeleted(source, commandId, id.toStdString());
    }
}

void CorvidObjectsClientModel::onDeletionError(std::shared_ptr<ErrorInfo> error)
{
    const std::string commandId = m_errorCommandId;
    m_errorCommandId.clear();
    endTask(commandId);
    QPointer<QWidget> source;
    const auto it = m_deleteSources.find(commandId);
    if (it != m_deleteSources.end()) {
        source = it->second;
        m_deleteSources.erase(it);
    }
    if (error)
        Logger::instance().debug(LogCategory::General,
                                 QStringLiteral("CorvidObjectsClientModel::onDeletionError: ") + error->message());
    Q_EMIT sgObjectDeletionError(source, commandId, error);
}

// ---- move and copy within the store ------------------------------------------------------

bool CorvidObjectsClientModel::moveRows(const QModelIndex &sourceParent, int sourceRow, int count,
                                        const QModelIndex &destinationParent, int)
{
    try {
        const auto *source = dynamic_cast<ObjectBrowserFolder *>(item(sourceParent));
        ObjectBrowserFolder *target = parentFolder(destinationParent);
        if (!source)
            return false;
        for (int i = 0; i < count; ++i) {
            const ObjectBrowserTreeItem *row = source->objectBrowserTreeItemAtPosition(sourceRow + i);
            if (row && row->dirEntry())
                sendMove(row->objectId(), target->objectId());
        }
    } catch (const std::exception &e) {
        Q_EMIT sgGeneralError(QString::fromStdString(e.what()));
        return false;
    }
    return true;
}

namespace {

// A MoveObject or CopyObject of one object into a folder.
template<class Request>
std::shared_ptr<Request> intoFolder(const QString &objectId, const QString &targetFolderId)
{
    auto command = std::make_shared<Request>();
    command->setId(objectId);
    command->setTargetFolderId(targetFolderId);
    command->generateId();
    return command;
}

} // namespace

void CorvidObjectsClientModel::sendMove(const QString &objectId, const QString &targetFolderId)
{
    dispatcher().execute(
        intoFolder<MoveObject>(objectId, targetFolderId), this,
        [this](std::shared_ptr<Response> response) { onObjectMoved(std::move(response)); },
        [this](std::shared_ptr<ErrorInfo> error) { reportCommandError(QStringLiteral("MoveObject"), error); });
}

void CorvidObjectsClientModel::sendCopy(const QString &objectId, const QString &targetFolderId)
{
    dispatcher().execute(
        intoFolder<CopyObject>(objectId, targetFolderId), this,
        [this](std::shared_ptr<Response> response) { onObjectCopied(std::move(response)); },
        [this](std::shared_ptr<ErrorInfo> error) { reportCommandError(QStringLiteral("CopyObject"), error); });
}

void CorvidObjectsClientModel::onObjectMoved(std::shared_ptr<Response> response)
{
    const auto request = response ? std::dynamic_pointer_cast<MoveObject>(response->command()) : nullptr;
    if (!request)
        return;
    ObjectBrowserTreeItem *moved = m_rootFolder.itemWithID(request->id().toStdString());
    if (moved == &m_rootFolder)
        moved = nullptr;
    auto *target = dynamic_cast<ObjectBrowserFolder *>(m_rootFolder.itemWithID(request->targetFolderId().toStdString()));
    const bool targetListed = target && !target->isDirty();
    if (moved && moved->parent() == target)
        return;
    if (moved && targetListed) {
        ObjectBrowserFolder *from = moved->parent();
        const int row = moved->row();
        const int destination = target->numberOfItems();
        if (beginMoveRows(index(from), row, row, index(target), destination)) {
            from->takeChildAt(static_cast<unsigned long>(row));
            target->append(moved);
            endMoveRows();
        }
    } else if (moved) {
        // The target was never listed: it shows the object when it is opened.
        removeRow(moved->row(), index(moved->parent()));
        moved = nullptr;
    } else if (targetListed) {
        if (const auto answer = std::dynamic_pointer_cast<MoveObjectResponse>(response)) {
            if (answer->dirEntry())
                insertEntries(target, {answer->dirEntry()});
        }
    }
    if (moved && moved->dirEntry())
        moved->dirEntry()->setParentFolderId(request->targetFolderId());
}

void CorvidObjectsClientModel::onObjectCopied(std::shared_ptr<Response> response)
{
    const auto copied = std::dynamic_pointer_cast<CopyObjectResponse>(response);
    const auto request = copied ? std::dynamic_pointer_cast<CopyObject>(copied->command()) : nullptr;
    if (!request || !copied->dirEntry())
        return;
    auto *target = dynamic_cast<ObjectBrowserFolder *>(m_rootFolder.itemWithID(request->targetFolderId().toStdString()));
    if (target && !target->isDirty())
        insertEntries(target, {copied->dirEntry()});
}

// ---- drop --------------------------------------------------------------------------------

std::vector<CorvidObjectsClientModel::CargoItem> CorvidObjectsClientModel::cargoFromMimeData(const QMimeData *data)
{
    std::vector<CargoItem> cargo;
    QSet<QString> seen;
    int position = 0;
    for (const QMap<int, QVariant> &roles : UIHelper::itemDataFromMimeData(data)) {
        const auto entry = roles.value(GlobalDirEntryRole).value<std::shared_ptr<GlobalDirEntry>>();
        ++position;
        if (!entry || entry->entryObjectId().isEmpty() || seen.contains(entry->entryObjectId()))
            continue;
        seen.insert(entry->entryObjectId());
        cargo.emplace_back(position - 1, 0, entry);
    }
    return cargo;
}

bool CorvidObjectsClientModel::dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                                            const QModelIndex &parent)
{
    if (!data || column > 1)
        return false;
    if (!data->hasFormat(mimeTypes().first()))
        return false;
    const int rows = rowCount(parent);
    if (row < 0 || row > rows)
        row = rows;
    const std::vector<CargoItem> cargo = cargoFromMimeData(data);
    if (cargo.empty())
        return false;
    if (!parent.isValid()) {
        // The empty area stands for the top level, which holds folders only.
        for (const CargoItem &entry : cargo) {
            if (!entry.isFolder())
                return false;
        }
    }
    ObjectBrowserTreeItem *targetItem = item(parent);
    if (!targetItem || !targetItem->isFolder()) {
        Q_EMIT sgGeneralError(tr("Objects can only be dropped into a folder."));
        return false;
    }
    auto *target = static_cast<ObjectBrowserFolder *>(targetItem);

    const std::string own = defaultDispatcherId();
    const std::string from = cargo.front().entry()->dispatcherID().toStdString();
    const bool sameStore = from.empty() || from == own
        || CommandDispatcher::standardizedDispatcherId(own) == CommandDispatcher::standardizedDispatcherId(from);
    try {
        if (sameStore) {
            for (const CargoItem &entry : cargo) {
                const QString objectId = entry.entry()->entryObjectId();
                if (action == Qt::MoveAction) {
                    if (entry.entry()->parentFolderId() == target->objectId()
                        || (target->isRoot() && entry.entry()->path().isEmpty()))
                        continue; // already there
                    const ObjectBrowserTreeItem *source = m_rootFolder.itemWithID(objectId.toStdString());
                    if (source && source != &m_rootFolder && source->parent())
                        moveRow(index(source->parent()), source->row(), parent, row);
                    else
                        sendMove(objectId, target->objectId());
                } else {
                    sendCopy(objectId, target->objectId());
                }
            }
            return true;
        }
        if (action == Qt::MoveAction) {
            Q_EMIT sgGeneralError(tr("Moving objects from a different database is not allowed"));
            return false;
        }
        for (const CargoItem &entry : cargo) {
            if (entry.isFolder()) {
                Q_EMIT sgGeneralError(
                    tr("Folders cannot be copied to another database; copy the objects in them instead."));
                return false;
            }
        }
        startRemoteCopy(cargo, target);
    } catch (const std::exception &e) {
        Q_EMIT sgGeneralError(QString::fromStdString(e.what()));
        return false;
    }
    return true;
}

// ---- copy from another store -------------------------------------------------------------

void CorvidObjectsClientModel::startRemoteCopy(const std::vector<CargoItem> &cargo, ObjectBrowserFolder *target)
{
    const std::string sourceId = cargo.front().entry()->dispatcherID().toStdString();
    CommandDispatcher &source = dispatcher(sourceId);
    dispatcher(); // the target store must answer too

    const size_t collectId = ++s_remoteCopyCounter;
    const std::string key = "CopyFromRemote" + std::to_string(collectId);
    auto context = std::make_shared<CopyContext>();
    context->targetFolderId = target->objectId().toStdString();
    context->cargo = cargo;
    for (const CargoItem &item : cargo) {
        auto entry = std::make_shared<DirEntry>();
        entry->setEntryObjectId(item.entry()->entryObjectId());
        entry->setEntryObjectType(item.entry()->entryObjectType());
        context->entries.push_back(entry);
    }
    context->progressTaskId = key;
    ProgressModel *progressModel = m_corvidModel->progressModel();
    progressModel->startProgress(tr("Copy"), 0.0, key);
    context->progress = std::make_shared<ProgressListener>(progressModel, key);
    m_copies[collectId] = context;
    m_loader->collect(collectId, &source, context->entries,
                      std::make_shared<ProgressListenerRange>(context->progress, 0.02, 0.6));
}

void CorvidObjectsClientModel::onRemoteObjectsLoaded(size_t collectId, std::vector<std::shared_ptr<BaseObject>> objects)
{
    const auto it = m_copies.find(collectId);
    if (it == m_copies.end())
        return;
    const std::shared_ptr<CopyContext> context = it->second;
    m_copies.erase(it);
    if (objects.size() != context->entries.size()) {
        QMessageBox box(QMessageBox::Information, tr("Copy items"), tr("Referenced objects found.\nContinue copying?"),
                        QMessageBox::Ok | QMessageBox::Cancel, QApplication::activeWindow());
        box.setDefaultButton(QMessageBox::Ok);
        if (box.exec() == QMessageBox::Cancel) {
            endTask(context->progressTaskId);
            return;
        }
    }
    try {
        auto command = std::make_shared<AddObject>();
        command->setObjects(objects);
        command->setParentFolderId(QString::fromStdString(context->targetFolderId));
        command->generateId();
        const auto listener = context->progress;
        const std::string key = context->progressTaskId;
        dispatcher().execute(
            command, this,
            [this, key](std::shared_ptr<Response> response) { onRemoteObjectsAdded(key, std::move(response)); },
            [this, key](std::shared_ptr<ErrorInfo> error) {
                endTask(key);
                reportCommandError(QStringLiteral("AddObject"), error);
            },
            [listener](std::shared_ptr<Progress> progress) {
                listener->setProgress(0.6 + 0.4 * progress->progress());
            });
    } catch (const std::exception &e) {
        endTask(context->progressTaskId);
        Q_EMIT sgGeneralError(QString::fromStdString(e.what()));
    }
}

void CorvidObjectsClientModel::onRemoteObjectsAdded(const std::string &collectKey, std::shared_ptr<Response> response)
{
    endTask(collectKey);
    const auto added = std::dynamic_pointer_cast<AddObjectResponse>(response);
    const auto request = added ? std::dynamic_pointer_cast<AddObject>(added->command()) : nullptr;
    if (!request)
        return;
    auto *target = dynamic_cast<ObjectBrowserFolder *>(m_rootFolder.itemWithID(request->parentFolderId().toStdString()));
    if (target && !target->isDirty())
        insertEntries(target, added->dirEntries());
}

void CorvidObjectsClientModel::onRemoteObjectsLoadError(size_t collectId, std::shared_ptr<ErrorInfo> error)
{
    std::shared_ptr<CopyContext> context;
    const auto it = m_copies.find(collectId);
    if (it != m_copies.end()) {
        context = it->second;
        m_copies.erase(it);
    }
    if (context)
        endTask(context->progressTaskId);
    const QString message = error ? error->message() : tr("unknown error");
    Logger::instance().error(LogCategory::General, message);
    Q_EMIT sgGeneralError(message);
}

} // namespace vexa

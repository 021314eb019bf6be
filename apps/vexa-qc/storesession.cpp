#include "storesession.h"

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <context/fullobjectloader.h>
#include <context/getdirentries.h>
#include <context/getdirentriesresponse.h>
#include <context/progresslistener.h>
#include <context/progressmodel.h>
#include <context/qtcommand.h>
#include <context/serverid.h>
#include <domain/direntry.h>
#include <domain/folder.h>
#include <domain/formula.h>
#include <domain/globaldirentry.h>
#include <domain/qcjob.h>
#include <domain/recipetrial.h>
#include <domain/toleranceset.h>
#include <sampledata/sampledata.h>
#include <store/errorinfo.h>
#include <store/objectstore.h>
#include <tolerances/tolerancefactory.h>
#include <utilities/logger.h>

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QPointer>
#include <QStandardPaths>

namespace vexa {

StoreSession::StoreSession(QObject *parent)
    : QObject(parent)
    , m_corvidModel(new CorvidModel(this))
{
    qRegisterMetaType<vexa::LoadedJob>();
    qRegisterMetaType<std::vector<std::shared_ptr<vexa::DirEntry>>>();
    qRegisterMetaType<std::vector<std::shared_ptr<vexa::BaseObject>>>();
}

StoreSession::~StoreSession() = default;

QString StoreSession::defaultStorePath()
{
    QString folder = QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation);
    if (folder.isEmpty())
        folder = QDir::homePath() + QStringLiteral("/.local/share");
    return QDir(folder).filePath(QStringLiteral("vexa/vexa-sample.vexastore"));
}

CommandDispatcher *StoreSession::dispatcher() const
{
    return m_dispatcherId.empty() ? nullptr : m_corvidModel->commandDispatcher(m_dispatcherId);
}

void StoreSession::open(const QString &storePath)
{
    m_storePath = QFileInfo(storePath).absoluteFilePath();
    QDir().mkpath(QFileInfo(m_storePath).absolutePath());
    CommandDispatcher *d = m_corvidModel->createCommandDispatcher(ServerId(m_storePath.toStdString(), 0));
    m_dispatcherId = d->dispatcherId();
    m_corvidModel->setDefaultDispatcherId(m_dispatcherId);

    auto onState = [this](CommandDispatcher::ConnectionState state) {
        if (state == CommandDispatcher::ConnectionState::Connected)
            ensureContents();
        else if (state == CommandDispatcher::ConnectionState::Failed)
            Q_EMIT sgError(tr("The object store %1 cannot be opened: %2")
                               .arg(m_storePath, dispatcher()->connectionError().message()));
    };
    connect(d, &CommandDispatcher::sgConnectionStateChanged, this, onState, Qt::UniqueConnection);
    if (d->isConnected())
        ensureContents();
    else
        d->connectToServer();
}

// A store without objects gets the sample data, written on the dispatcher's worker
// behind any command already queued; the answer comes back on the GUI thread.
void StoreSession::ensureContents()
{
    CommandDispatcher *d = dispatcher();
    Q_EMIT sgBusy(tr("Opening"), true);
    QPointer<StoreSession> self(this);
    d->runWithStore([self, d](ObjectStore *store) {
        QString problem;
        if (!store) {
            problem = QStringLiteral("no connection");
        } else {
            ErrorInfo error;
            const int count = store->count(&error);
            if (count == 0 && !SampleData::populate(*store, &error))
                problem = error.message() + QLatin1Char(' ') + error.internalMessage();
            else if (count < 0)
                problem = error.message();
        }
        d->runOnOwnerThread(
            [self, problem] {
                if (!self)
                    return;
                Q_EMIT self->sgBusy(tr("Opening"), false);
                if (problem.isEmpty())
                    Q_EMIT self->sgOpened();
                else
                    Q_EMIT self->sgError(tr("The sample data could not be written: %1").arg(problem));
            });
    });
}

void StoreSession::reportError(const QString &operation, const std::shared_ptr<ErrorInfo> &error)
{
    const QString text = error ? QStringLiteral("%1 (%2)").arg(error->message()).arg(int(error->errorCode()))
                               : tr("unknown error");
    Logger::instance().error(LogCategory::General, QStringLiteral("StoreSession: %1: %2").arg(operation, text));
    Q_EMIT sgError(tr("Error occured during %1: %2").arg(operation, text));
}

void StoreSession::findFolder(const QString &name, std::function<void(const QString &)> found)
{
    CommandDispatcher *d = dispatcher();
    if (!d) {
        Q_EMIT sgError(tr("No object store is open."));
        return;
    }
    auto root = std::make_shared<GetDirEntries>();
    root->setType(Folder::typeId());
    d->execute(
        root, this,
        [name, found](std::shared_ptr<Response> response) {
            auto listing = std::dynamic_pointer_cast<GetDirEntriesResponse>(response);
            QString folder;
            for (const auto &entry : listing ? listing->dirEntries() : std::vector<std::shared_ptr<DirEntry>>{}) {
                if (entry->header().name() == name)
                    folder = entry->entryObjectId();
            }
            found(folder);
        },
        [this](std::shared_ptr<ErrorInfo> error) { reportError(QStringLiteral("GetDirEntries"), error); });
}

void StoreSession::listJobs()
{
    findFolder(QStringLiteral("QC Jobs"), [this](const QString &jobsFolder) {
        if (jobsFolder.isEmpty()) {
            Q_EMIT sgJobsListed({});
            return;
        }
        auto jobs = std::make_shared<GetDirEntries>();
        jobs->setParentFolderId(jobsFolder);
        jobs->setType(QCJob::typeId());
        dispatcher()->execute(
            jobs, this,
            [this](std::shared_ptr<Response> answer) {
                auto list = std::dynamic_pointer_cast<GetDirEntriesResponse>(answer);
                Q_EMIT sgJobsListed(list ? list->dirEntries() : std::vector<std::shared_ptr<DirEntry>>{});
            },
            [this](std::shared_ptr<ErrorInfo> error) { reportError(QStringLiteral("GetDirEntries"), error); });
    });
}

void StoreSession::loadFormulas()
{
    findFolder(QStringLiteral("Formulas"), [this](const QString &folder) {
        if (folder.isEmpty()) {
            Q_EMIT sgFormulasLoaded({});
            return;
        }
        auto list = std::make_shared<GetDirEntries>();
        list->setParentFolderId(folder);
        list->setTypes({Formula::typeId(), RecipeTrial::typeId()});
        dispatcher()->execute(
            list, this,
            [this](std::shared_ptr<Response> answer) {
                auto listing = std::dynamic_pointer_cast<GetDirEntriesResponse>(answer);
                const auto entries = listing ? listing->dirEntries() : std::vector<std::shared_ptr<DirEntry>>{};
                if (entries.empty()) {
                    Q_EMIT sgFormulasLoaded({});
                    return;
                }
                Q_EMIT sgBusy(tr("Loading formulas"), true);
                FullObjectLoader::collect(
                    dispatcher(), entries, nullptr, this,
                    [this](std::vector<std::shared_ptr<BaseObject>> objects) {
                        Q_EMIT sgBusy(tr("Loading formulas"), false);
                        Q_EMIT sgFormulasLoaded(objects);
                    },
                    [this](std::shared_ptr<ErrorInfo> error) {
                        Q_EMIT sgBusy(tr("Loading formulas"), false);
                        reportError(QStringLiteral("GetCorvidObjects"), error);
                    });
            },
            [this](std::shared_ptr<ErrorInfo> error) { reportError(QStringLiteral("GetDirEntries"), error); });
    });
}

void StoreSession::loadJob(const std::shared_ptr<DirEntry> &entry)
{
    // A job picked in another store's browser is read from that store.
    const auto global = std::dynamic_pointer_cast<GlobalDirEntry>(entry);
    CommandDispatcher *d = global && !global->dispatcherID().isEmpty()
        ? m_corvidModel->commandDispatcher(global->dispatcherID().toStdString())
        : dispatcher();
    if (!d || !entry) {
        Q_EMIT sgError(tr("No object store is open."));
        return;
    }
    ProgressModel *progress = m_corvidModel->progressModel();
    const std::string taskId = (QStringLiteral("load-") + entry->entryObjectId()).toStdString();
    progress->startProgress(tr("Loading"), 0.02, taskId);
    Q_EMIT sgBusy(tr("Loading %1").arg(entry->header().name()), true);
    auto listener = std::make_shared<ProgressListener>(progress, taskId);
    FullObjectLoader::collect(
        d, {entry}, listener, this,
        [this, progress, taskId, entry](std::vector<std::shared_ptr<BaseObject>> objects) {
            progress->endProgress(taskId);
            Q_EMIT sgBusy(tr("Loading %1").arg(entry->header().name()), false);
            LoadedJob loaded;
            loaded.objects = objects;
            if (!objects.empty())
                loaded.job = std::dynamic_pointer_cast<QCJob>(objects.front());
            if (!loaded.job) {
                Q_EMIT sgError(tr("%1 is not a QC job.").arg(entry->header().name()));
                return;
            }
            // Sets as stored may carry values that follow from others (box limits the wrong way
            // round, CIE94 factors of another application): fill them in as the editor would.
            for (const auto &object : objects) {
                if (auto set = std::dynamic_pointer_cast<ToleranceSet>(object))
                    ToleranceFactory::toleranceFactory()->recomputeToleranceSet(*set);
            }
            Q_EMIT sgJobLoaded(loaded);
        },
        [this, progress, taskId, entry](std::shared_ptr<ErrorInfo> error) {
            progress->endProgress(taskId);
            Q_EMIT sgBusy(tr("Loading %1").arg(entry->header().name()), false);
            reportError(QStringLiteral("GetCorvidObject"), error);
        });
}

} // namespace vexa

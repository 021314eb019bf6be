#include <context/fullobjectloader.h>

#include <context/commanddispatcher.h>
#include <context/getcorvidobjects.h>
#include <context/getcorvidobjectsresponse.h>
#include <context/progress.h>
#include <context/progresslistener.h>

#include <domain/baseobject.h>
#include <domain/direntry.h>

#include <QCoreApplication>

#include <set>

namespace vexa {

FullObjectLoader::FullObjectLoader(QObject *parent)
    : QObject(parent)
{
    static const bool registered = [] {
        qRegisterMetaType<size_t>("size_t");
        qRegisterMetaType<std::vector<std::shared_ptr<vexa::BaseObject>>>(
            "std::vector<std::shared_ptr<vexa::BaseObject>>");
        qRegisterMetaType<std::shared_ptr<vexa::ErrorInfo>>("std::shared_ptr<vexa::ErrorInfo>");
        return true;
    }();
    Q_UNUSED(registered)
}

FullObjectLoader::~FullObjectLoader() = default;

void FullObjectLoader::collect(size_t collectId, CommandDispatcher *dispatcher,
                               const std::vector<std::shared_ptr<DirEntry>> &entries,
                               std::shared_ptr<ProgressListener> listener)
{
    collect(
        dispatcher, entries, std::move(listener), this,
        [this, collectId](std::vector<std::shared_ptr<BaseObject>> objects) {
            Q_EMIT sgObjectsLoaded(collectId, objects);
        },
        [this, collectId](std::shared_ptr<ErrorInfo> error) { Q_EMIT sgObjectsLoadError(collectId, error); });
}

void FullObjectLoader::collect(CommandDispatcher *dispatcher, const std::vector<std::shared_ptr<DirEntry>> &entries,
                               std::shared_ptr<ProgressListener> listener, QObject *context,
                               LoadedCallback onLoaded, ErrorCallback onError)
{
    if (!dispatcher) {
        auto error = ErrorInfo::create(
            QCoreApplication::translate("vexa::FullObjectLoader", "No connection to the object server."),
            CorvidErrorCode::NotConnected, QStringLiteral("FullObjectLoader::collect without dispatcher"));
        QMetaObject::invokeMethod(
            context, [onError, error] { onError(error); }, Qt::QueuedConnection);
        return;
    }
    auto command = std::make_shared<GetCorvidObjects>();
    QStringList ids;
    for (const auto &entry : entries) {
        if (entry)
            ids << entry->entryObjectId();
    }
    command->setIds(ids);
    command->setLoadAllDetails(true);
    command->generateId();
    if (listener)
        listener->setProgress(0.0);
    dispatcher->execute(
        command, context,
        [listener, onLoaded](std::shared_ptr<Response> response) {
            if (listener)
                listener->setProgress(1.0);
            const auto loaded = std::dynamic_pointer_cast<GetCorvidObjectsResponse>(response);
            onLoaded(withReferences(loaded ? loaded->objects() : std::vector<std::shared_ptr<BaseObject>>()));
        },
        [onError](std::shared_ptr<ErrorInfo> error) { onError(error); },
        [listener](std::shared_ptr<Progress> progress) {
            if (listener)
                listener->setProgress(progress->progress());
        });
}

std::vector<std::shared_ptr<BaseObject>> FullObjectLoader::withReferences(
    const std::vector<std::shared_ptr<BaseObject>> &objects)
{
    std::vector<std::shared_ptr<BaseObject>> result;
    std::set<QString> ids;
    for (const auto &object : objects) {
        if (object && ids.insert(object->id()).second)
            result.push_back(object);
    }
    // Breadth first over the references; unresolved stubs are left out.
    for (size_t i = 0; i < result.size(); ++i) {
        for (const auto &reference : result[i]->referencedObjects()) {
            if (reference && !reference->isStub() && ids.insert(reference->id()).second)
                result.push_back(reference);
        }
    }
    return result;
}

} // namespace vexa

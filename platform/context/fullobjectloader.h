#pragma once

#include <context/context_export.h>

#include <store/errorinfo.h>

#include <QMetaType>
#include <QObject>

#include <functional>
#include <memory>
#include <vector>

namespace vexa {

class BaseObject;
class CommandDispatcher;
class DirEntry;
class ProgressListener;

// Loads the full objects behind directory entries together with every object
// they refer to (the unloaded stubs replaced by the stored objects). The answer
// lists the objects of the entries first, in the entries' order, then each
// referenced object once. Answers arrive on the GUI thread.
class VEXA_CONTEXT_EXPORT FullObjectLoader : public QObject
{
    Q_OBJECT
public:
    using LoadedCallback = std::function<void(std::vector<std::shared_ptr<BaseObject>>)>;
    using ErrorCallback = std::function<void(std::shared_ptr<ErrorInfo>)>;

    explicit FullObjectLoader(QObject *parent = nullptr);
    ~FullObjectLoader() override;

    // Answers through sgObjectsLoaded / sgObjectsLoadError under collectId.
    void collect(size_t collectId, CommandDispatcher *dispatcher,
                 const std::vector<std::shared_ptr<DirEntry>> &entries,
                 std::shared_ptr<ProgressListener> listener = nullptr);
    // Answers through the callbacks, called while context lives.
    static void collect(CommandDispatcher *dispatcher, const std::vector<std::shared_ptr<DirEntry>> &entries,
                        std::shared_ptr<ProgressListener> listener, QObject *context, LoadedCallback onLoaded,
                        ErrorCallback onError);

    // The objects followed by every object they refer to, each once.
    static std::vector<std::shared_ptr<BaseObject>> withReferences(
        const std::vector<std::shared_ptr<BaseObject>> &objects);

Q_SIGNALS:
    void sgObjectsLoaded(size_t collectId, std::vector<std::shared_ptr<vexa::BaseObject>> objects);
    void sgObjectsLoadError(size_t collectId, std::shared_ptr<vexa::ErrorInfo> error);
};

} // namespace vexa

Q_DECLARE_METATYPE(std::vector<std::shared_ptr<vexa::BaseObject>>)

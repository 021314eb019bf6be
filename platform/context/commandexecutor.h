#pragma once

#include <context/context_export.h>

#include <store/errorinfo.h>

#include <functional>
#include <memory>

namespace vexa {

class Command;
class ObjectStore;
class Response;

// Carries out one command against an object store and builds its answer.
// Runs on the dispatcher's worker thread; every command is one store
// transaction (several for commands that load referenced objects, all reads).
class VEXA_CONTEXT_EXPORT CommandExecutor
{
public:
    using ProgressFunction = std::function<void(double)>;

    explicit CommandExecutor(ObjectStore &store);

    // The answer, or null with *error filled.
    std::shared_ptr<Response> execute(const std::shared_ptr<Command> &command, const ProgressFunction &progress,
                                      ErrorInfo *error);

private:
    ObjectStore &m_store;
};

} // namespace vexa

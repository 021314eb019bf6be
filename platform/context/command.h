#pragma once

#include <context/commandcontext.h>
#include <context/context_export.h>

#include <QString>

#include <string>

namespace vexa {

// A request to an object server. Fill it through its setters, give it an id
// (generateId) and send it on a CommandDispatcher. Once sent, the command
// belongs to the dispatcher's worker until its answer arrives: do not change
// it (or the objects it carries) meanwhile.
class VEXA_CONTEXT_EXPORT Command
{
public:
    Command();
    virtual ~Command();

    // The command's class name, e.g. "GetDirEntries".
    virtual QString typeName() const = 0;

    const std::string &commandId() const { return m_commandId; }
    void setCommandId(const std::string &id) { m_commandId = id; }
    // Gives the command a fresh, process-wide unique id and returns it.
    std::string generateId();
    static std::string newCommandId();

    const CommandContext &commandContext() const { return m_context; }
    void setCommandContext(const CommandContext &context) { m_context = context; }

    // Load objects with all their details (referenced objects included).
    bool loadAllDetails() const { return m_loadAllDetails; }
    void setLoadAllDetails(bool on) { m_loadAllDetails = on; }

private:
    std::string m_commandId;
    CommandContext m_context;
    bool m_loadAllDetails = false;
};

} // namespace vexa

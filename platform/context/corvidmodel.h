#pragma once

#include <context/context_export.h>
#include <context/serverid.h>

#include <QObject>

#include <map>
#include <string>

namespace vexa {

class CommandDispatcher;
class ProgressModel;

// The host's facade to the object servers: one command dispatcher per server
// (keyed by its standardized dispatcher id) and the progress model. Lives on
// the GUI thread.
class VEXA_CONTEXT_EXPORT CorvidModel : public QObject
{
    Q_OBJECT
public:
    explicit CorvidModel(QObject *parent = nullptr);
    ~CorvidModel() override;

    // The dispatcher of an id (standardized first); an empty id means the default
    // one. An id not seen before is taken as the ServerId of a local store and
    // gets a dispatcher that is asked to connect. Null only for an empty id
    // without a default.
    CommandDispatcher *commandDispatcher(const std::string &id = std::string());
    // Creates (or returns the existing) dispatcher for a server and asks it to connect.
    CommandDispatcher *createCommandDispatcher(const ServerId &serverId);
    bool hasCommandDispatcher(const std::string &id) const;

    std::string defaultDispatcherId() const { return m_defaultId; }
    void setDefaultDispatcherId(const std::string &id);

    ProgressModel *progressModel() const { return m_progressModel; }

private:
    std::map<std::string, CommandDispatcher *> m_dispatchers; // Children.
    std::string m_defaultId;
    ProgressModel *m_progressModel; // Child.
};

} // namespace vexa

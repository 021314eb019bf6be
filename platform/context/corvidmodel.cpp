#include <context/corvidmodel.h>

#include <context/commanddispatcher.h>
#include <context/progressmodel.h>

namespace vexa {

CorvidModel::CorvidModel(QObject *parent)
    : QObject(parent)
    , m_progressModel(new ProgressModel(this))
{
}

CorvidModel::~CorvidModel() = default;

CommandDispatcher *CorvidModel::commandDispatcher(const std::string &id)
{
    const std::string key = CommandDispatcher::standardizedDispatcherId(id.empty() ? m_defaultId : id);
    if (key.empty())
        return nullptr;
    const auto it = m_dispatchers.find(key);
    if (it != m_dispatchers.end())
        return it->second;
    const int colon = int(key.rfind(':'));
    const bool network = key.find('/') == std::string::npos && colon > 1;
    return createCommandDispatcher(network ? ServerId(key.substr(0, colon), std::stoi(key.substr(colon + 1)))
                                           : ServerId(key, 0));
}

CommandDispatcher *CorvidModel::createCommandDispatcher(const ServerId &serverId)
{
    const std::string key = serverId.toString();
    if (key.empty())
        return nullptr;
    CommandDispatcher *&dispatcher = m_dispatchers[key];
    if (!dispatcher)
        dispatcher = new CommandDispatcher(serverId, this);
    dispatcher->connectToServer();
    return dispatcher;
}

bool CorvidModel::hasCommandDispatcher(const std::string &id) const
{
    return m_dispatchers.count(CommandDispatcher::standardizedDispatcherId(id)) > 0;
}

void CorvidModel::setDefaultDispatcherId(const std::string &id)
{
    m_defaultId = CommandDispatcher::standardizedDispatcherId(id);
}

} // namespace vexa

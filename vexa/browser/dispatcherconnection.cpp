#include "dispatcherconnection_p.h"

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>

#include <QThread>

#include <stdexcept>

namespace vexa {

CommandDispatcher &connectedDispatcher(CorvidModel *model, const std::string &id, const std::string &defaultId)
{
    if (!model)
        throw std::logic_error("No Corvid model set");
    const std::string dispatcherId = id.empty() ? defaultId : id;
    CommandDispatcher *dispatcher = model->commandDispatcher(dispatcherId);
    constexpr int looks = 11;
    for (int look = 0; look < looks; ++look) {
        if (dispatcher && dispatcher->isConnected())
            return *dispatcher;
        if (dispatcher)
            dispatcher->connectToServer();
        QThread::msleep(100);
    }
    throw std::logic_error("No connection to server available! \n(" + dispatcherId + ")");
}

} // namespace vexa

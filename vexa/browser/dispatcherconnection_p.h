#pragma once

#include <string>

namespace vexa {

class CommandDispatcher;
class CorvidModel;

// The dispatcher of a store, connected. An empty id means defaultId. Without a model:
// std::logic_error "No Corvid model set". While the dispatcher is not connected it is
// asked to connect and looked at again 100 ms later; after 11 looks std::logic_error
// "No connection to server available! \n(<id>)". The wait blocks the calling thread.
CommandDispatcher &connectedDispatcher(CorvidModel *model, const std::string &id, const std::string &defaultId);

} // namespace vexa

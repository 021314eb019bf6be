#include <context/errorresponse.h>

namespace vexa {

ErrorResponse::ErrorResponse(std::shared_ptr<Command> command, const QString &errorMessage)
    : Response(std::move(command))
    , m_errorMessage(errorMessage)
{
}

ErrorResponse::~ErrorResponse() = default;

} // namespace vexa

#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

namespace vexa {

// An answer that only carries an error text (servers that do not send ErrorInfo).
class VEXA_CONTEXT_EXPORT ErrorResponse : public Response
{
public:
    explicit ErrorResponse(std::shared_ptr<Command> command = nullptr, const QString &errorMessage = QString());
    ~ErrorResponse() override;

    QString errorMessage() const { return m_errorMessage; }
    void setErrorMessage(const QString &message) { m_errorMessage = message; }

private:
    QString m_errorMessage;
};

} // namespace vexa

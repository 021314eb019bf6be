#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>

namespace vexa {

class BaseObject;

// The loaded object.
class VEXA_CONTEXT_EXPORT GetCorvidObjectResponse : public Response
{
public:
    using Response::Response;
    ~GetCorvidObjectResponse() override;

    std::shared_ptr<BaseObject> object() const { return m_object; }
    void setObject(const std::shared_ptr<BaseObject> &object) { m_object = object; }

private:
    std::shared_ptr<BaseObject> m_object;
};

} // namespace vexa

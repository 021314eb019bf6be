#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>

namespace vexa {

class BaseObject;

// The object as stored, with its new version.
class VEXA_CONTEXT_EXPORT UpdateObjectResponse : public Response
{
public:
    using Response::Response;
    ~UpdateObjectResponse() override;

    std::shared_ptr<BaseObject> updatedObject() const { return m_updatedObject; }
    void setUpdatedObject(const std::shared_ptr<BaseObject> &updatedObject) { m_updatedObject = updatedObject; }

private:
    std::shared_ptr<BaseObject> m_updatedObject;
};

} // namespace vexa

#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>
#include <vector>

namespace vexa {

class BaseObject;

// The loaded objects, in the order asked for.
class VEXA_CONTEXT_EXPORT GetCorvidObjectsResponse : public Response
{
public:
    using Response::Response;
    ~GetCorvidObjectsResponse() override;

    std::vector<std::shared_ptr<BaseObject>> objects() const { return m_objects; }
    void setObjects(const std::vector<std::shared_ptr<BaseObject>> &objects) { m_objects = objects; }

private:
    std::vector<std::shared_ptr<BaseObject>> m_objects;
};

} // namespace vexa

#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>
#include <vector>

namespace vexa {

class DirEntry;

// The directory entries of the stored objects, in the command's order.
class VEXA_CONTEXT_EXPORT AddObjectResponse : public Response
{
public:
    using Response::Response;
    ~AddObjectResponse() override;

    std::vector<std::shared_ptr<DirEntry>> dirEntries() const { return m_dirEntries; }
    void setDirEntries(const std::vector<std::shared_ptr<DirEntry>> &dirEntries) { m_dirEntries = dirEntries; }

private:
    std::vector<std::shared_ptr<DirEntry>> m_dirEntries;
};

} // namespace vexa

#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>
#include <vector>

namespace vexa {

class DirEntry;

// The entries of the folder, in the store's order.
class VEXA_CONTEXT_EXPORT GetDirEntriesResponse : public Response
{
public:
    using Response::Response;
    ~GetDirEntriesResponse() override;

    std::vector<std::shared_ptr<DirEntry>> dirEntries() const { return m_dirEntries; }
    void setDirEntries(const std::vector<std::shared_ptr<DirEntry>> &dirEntries) { m_dirEntries = dirEntries; }

private:
    std::vector<std::shared_ptr<DirEntry>> m_dirEntries;
};

} // namespace vexa

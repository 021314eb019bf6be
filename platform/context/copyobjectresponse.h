#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>

namespace vexa {

class DirEntry;

// The directory entry of the copy.
class VEXA_CONTEXT_EXPORT CopyObjectResponse : public Response
{
public:
    using Response::Response;
    ~CopyObjectResponse() override;

    std::shared_ptr<DirEntry> dirEntry() const { return m_dirEntry; }
    void setDirEntry(const std::shared_ptr<DirEntry> &dirEntry) { m_dirEntry = dirEntry; }

private:
    std::shared_ptr<DirEntry> m_dirEntry;
};

} // namespace vexa

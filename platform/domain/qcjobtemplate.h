#pragma once

#include <domain/namedobject.h>

namespace vexa {

class ToleranceSet;

// The template a QC job is made from: the tolerance sets that apply when the
// standard brings none (references).
class VEXA_DOMAIN_EXPORT QCJobTemplate : public NamedObject
{
    VEXA_REFLECTABLE(QCJobTemplate)
public:
    const std::vector<std::shared_ptr<ToleranceSet>> &toleranceSets() const { return m_toleranceSets; }
    void setToleranceSets(const std::vector<std::shared_ptr<ToleranceSet>> &sets);

private:
    std::vector<std::shared_ptr<ToleranceSet>> m_toleranceSets;
};

} // namespace vexa

#include "toleranceruleregistry.h"

#include <algorithm>

namespace vexa {

ToleranceRuleRegistry &ToleranceRuleRegistry::instance()
{
    static ToleranceRuleRegistry registry;
    return registry;
}

void ToleranceRuleRegistry::registerRule(const QString &toleranceType, std::shared_ptr<const ToleranceRule> rule)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    if (rule)
        m_rules.insert(toleranceType, std::move(rule));
    else
        m_rules.remove(toleranceType);
}

void ToleranceRuleRegistry::unregisterRule(const QString &toleranceType)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_rules.remove(toleranceType);
}

std::shared_ptr<const ToleranceRule> ToleranceRuleRegistry::rule(const QString &toleranceType) const
{
    std::lock_guard<std::mutex> lock(m_mutex);
    return m_rules.value(toleranceType);
}

QStringList ToleranceRuleRegistry::toleranceTypes() const
{
    std::lock_guard<std::mutex> lock(m_mutex);
    QStringList types = m_rules.keys();
    std::sort(types.begin(), types.end());
    return types;
}

} // namespace vexa

#pragma once

#include <domain/domain_export.h>
#include <domain/tolerancerule.h>

#include <QHash>
#include <mutex>
#include <QStringList>

#include <memory>

namespace vexa {

// The judging rules by tolerance type ("CIELab(+/-)" ...). Thread-safe.
class VEXA_DOMAIN_EXPORT ToleranceRuleRegistry
{
public:
    static ToleranceRuleRegistry &instance();

    // Registers (or replaces) the rule of a type; a null rule removes it.
    void registerRule(const QString &toleranceType, std::shared_ptr<const ToleranceRule> rule);
    void unregisterRule(const QString &toleranceType);
    std::shared_ptr<const ToleranceRule> rule(const QString &toleranceType) const;
    QStringList toleranceTypes() const;

private:
    ToleranceRuleRegistry() = default;
    Q_DISABLE_COPY(ToleranceRuleRegistry)

    mutable std::mutex m_mutex;
    QHash<QString, std::shared_ptr<const ToleranceRule>> m_rules;
};

} // namespace vexa

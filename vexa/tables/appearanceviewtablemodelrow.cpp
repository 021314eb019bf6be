#include <vexa/tables/appearanceviewtablemodelrow.h>

#include <domain/appearancevalues.h>
#include <domain/labchvalue.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/trial.h>

namespace vexa {

AppearanceViewTableModelRow::AppearanceViewTableModelRow(Data data)
    : m_data(std::move(data))
{
}

std::shared_ptr<Trial> AppearanceViewTableModelRow::trial() const
{
    return std::dynamic_pointer_cast<Trial>(m_data.object);
}

std::shared_ptr<Standard> AppearanceViewTableModelRow::standard() const
{
    return std::dynamic_pointer_cast<Standard>(m_data.object);
}

const ToleranceJudgement &AppearanceViewTableModelRow::judgement(const Tolerance &tolerance) const
{
    auto it = m_judgements.find(&tolerance);
    if (it != m_judgements.end())
        return it->second;
    ToleranceJudgement judgement;
    if (m_data.appearanceValues && m_data.standardAppearanceValues)
        judgement = tolerance.judge(*m_data.appearanceValues, *m_data.standardAppearanceValues,
                                    m_data.colorimetricCondition);
    return m_judgements.emplace(&tolerance, std::move(judgement)).first->second;
}

} // namespace vexa

#include "appearanceviewbase.h"

#include "appearancesignalmapper.h"
#include "appearanceviewdatamodel.h"
#include "trialselectionmodel.h"

namespace vexa {

AppearanceViewBase::AppearanceViewBase()
    : m_mapper(std::make_unique<AppearanceSignalMapper>(*this))
{
}

// The mapper goes first, so no model signal reaches a view that is being destroyed.
AppearanceViewBase::~AppearanceViewBase()
{
    m_mapper.reset();
}

void AppearanceViewBase::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                   const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    m_mapper->setDataModel(dataModel);
    m_mapper->setSelectionModel(selectionModel);
    m_dataModel = dataModel;
    m_selectionModel = selectionModel;
}

} // namespace vexa

#include "appearancesignalmapper.h"

#include "appearanceviewbase.h"
#include "appearanceviewdatamodel.h"
#include "trialselectionmodel.h"

namespace vexa {

AppearanceSignalMapper::AppearanceSignalMapper(AppearanceViewBase &view)
    : m_view(view)
{
}

AppearanceSignalMapper::~AppearanceSignalMapper() = default;

void AppearanceSignalMapper::setDataModel(const std::shared_ptr<AppearanceViewDataModel> &model)
{
    if (m_dataModel)
        m_dataModel->disconnect(this);
    m_dataModel = model;
    if (!model)
        return;
    using M = AppearanceViewDataModel;
    connect(model.get(), &M::sgQCJobChanged, this, &AppearanceSignalMapper::refreshQCJob);
    connect(model.get(), &M::sgJobTemplateChanged, this, &AppearanceSignalMapper::refreshQCJobTemplate);
    connect(model.get(), &M::sgStandardChanged, this, &AppearanceSignalMapper::refreshStandard);
    connect(model.get(), &M::sgToleranceSetChanged, this, &AppearanceSignalMapper::refreshTolerance);
    connect(model.get(), &M::sgTrialsChanged, this, &AppearanceSignalMapper::refreshTrials);
    connect(model.get(), &M::sgColorimetricConditionChanged, this,
            &AppearanceSignalMapper::refreshColorimetricCondition);
}

void AppearanceSignalMapper::setSelectionModel(const std::shared_ptr<TrialSelectionModel> &model)
{
    if (m_selectionModel)
        m_selectionModel->disconnect(this);
    m_selectionModel = model;
    if (!model)
        return;
    using S = TrialSelectionModel;
    connect(model.get(), &S::sgActiveTrialsChanged, this, &AppearanceSignalMapper::refreshActiveTrials);
    connect(model.get(), &S::sgTrialSelectionChanged, this, &AppearanceSignalMapper::onTrialSelected);
    connect(model.get(), &S::sgStandardGeometryChanged, this, &AppearanceSignalMapper::onStandardGeometrySelected);
    connect(model.get(), &S::sgColorGeometryFilterChanged, this, &AppearanceSignalMapper::onActiveGeometriesChanged);
    connect(model.get(), &S::sgColorGeometrySelectionChanged, this, &AppearanceSignalMapper::onGeometrySelected);
    connect(model.get(), &S::sgTextureGeometryFilterChanged, this,
            &AppearanceSignalMapper::onActiveGeometriesChanged);
    connect(model.get(), &S::sgTextureGeometrySelectionChanged, this, &AppearanceSignalMapper::onGeometrySelected);
}

void AppearanceSignalMapper::refreshQCJob() { m_view.refreshQCJob(); }
void AppearanceSignalMapper::refreshQCJobTemplate() { m_view.refreshQCJobTemplate(); }
void AppearanceSignalMapper::refreshStandard() { m_view.refreshStandard(); }
void AppearanceSignalMapper::refreshTolerance() { m_view.refreshTolerance(); }
void AppearanceSignalMapper::refreshActiveTrials() { m_view.refreshActiveTrials(); }
void AppearanceSignalMapper::refreshTrials() { m_view.refreshTrials(); }
void AppearanceSignalMapper::refreshColorimetricCondition() { m_view.refreshColorimetricCondition(); }
void AppearanceSignalMapper::onTrialSelected() { m_view.onTrialSelected(); }
void AppearanceSignalMapper::onActiveGeometriesChanged() { m_view.onActiveGeometriesChanged(); }
void AppearanceSignalMapper::onGeometrySelected() { m_view.onGeometrySelected(); }
void AppearanceSignalMapper::onStandardGeometrySelected() { m_view.onStandardGeometrySelected(); }

} // namespace vexa

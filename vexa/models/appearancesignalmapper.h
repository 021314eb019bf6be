#pragma once

#include <vexa/vexa_export.h>

#include <QObject>

#include <memory>

namespace vexa {

class AppearanceViewBase;
class AppearanceViewDataModel;
class TrialSelectionModel;

// Receives every model signal of one view and forwards it to the view's hook of the
// same name. Owned by the view, so no signal can reach a destroyed view.
class VEXA_EXPORT AppearanceSignalMapper : public QObject
{
    Q_OBJECT
public:
    explicit AppearanceSignalMapper(AppearanceViewBase &view);
    ~AppearanceSignalMapper() override;

    void setDataModel(const std::shared_ptr<AppearanceViewDataModel> &model);
    void setSelectionModel(const std::shared_ptr<TrialSelectionModel> &model);

public Q_SLOTS:
    void refreshQCJob();
    void refreshQCJobTemplate();
    void refreshStandard();
    void refreshTolerance();
    void refreshActiveTrials();
    void refreshTrials();
    void refreshColorimetricCondition();
    void onTrialSelected();
    void onActiveGeometriesChanged();
    void onGeometrySelected();
    void onStandardGeometrySelected();

private:
    AppearanceViewBase &m_view;
    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::shared_ptr<TrialSelectionModel> m_selectionModel;
};

} // namespace vexa

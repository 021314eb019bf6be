#pragma once

#include <vexa/vexa_export.h>

#include <memory>

namespace vexa {

class AppearanceSignalMapper;
class AppearanceViewDataModel;
class TrialSelectionModel;

// The base of every comparison view. A view derives from its Qt widget class and from
// this class, receives the page's two shared models through setModels() and overrides
// the hooks that concern it; each model signal reaches exactly one hook.
class VEXA_EXPORT AppearanceViewBase
{
public:
    AppearanceViewBase();
    virtual ~AppearanceViewBase();
    AppearanceViewBase(const AppearanceViewBase &) = delete;
    AppearanceViewBase &operator=(const AppearanceViewBase &) = delete;

    // Disconnects the previous models completely, connects the new ones (either may be
    // null) and stores them. Calls no hook: an override calls the base, then refreshes.
    virtual void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                           const std::shared_ptr<TrialSelectionModel> &selectionModel);
    // Reload the persisted view settings and redraw.
    virtual void settingsChanged() = 0;

    std::shared_ptr<AppearanceViewDataModel> appearanceViewDataModel() const { return m_dataModel; }
    std::shared_ptr<TrialSelectionModel> trialSelectionModel() const { return m_selectionModel; }

protected:
    virtual void refreshStandard() {}
    virtual void refreshQCJob() {}
    virtual void refreshQCJobTemplate() {}
    virtual void refreshTolerance() {}
    virtual void refreshActiveTrials() {}
    virtual void refreshTrials() {}
    virtual void refreshColorimetricCondition() {}
    virtual void onTrialSelected() {}
    virtual void onActiveGeometriesChanged() {}
    virtual void onGeometrySelected() {}
    virtual void onStandardGeometrySelected() {}

private:
    friend class AppearanceSignalMapper;

    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::shared_ptr<TrialSelectionModel> m_selectionModel;
    std::unique_ptr<AppearanceSignalMapper> m_mapper; // Owned: dies with the view.
};

} // namespace vexa

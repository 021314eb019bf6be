#pragma once

#include <vexa/vexa_export.h>

#include <domain/geometry.h>

#include <QObject>

#include <map>
#include <memory>
#include <set>
#include <vector>

namespace vexa {

class AppearanceValues;
class TagDefinition;
class TagValue;
class Trial;

// What the views of one comparison page agree on: the selected trial, the active
// (ticked) trials, the selected and filtered colour and texture geometries, the
// standard's geometry and the tag by which active trials are grouped. Trials are
// compared by identity, never by content. A setter that changes nothing emits nothing.
class VEXA_EXPORT TrialSelectionModel : public QObject
{
    Q_OBJECT
    Q_PROPERTY(vexa::Geometry selectedStandardGeometry READ selectedStandardGeometry WRITE
                   setSelectedStandardGeometry NOTIFY sgStandardGeometryChanged)
public:
    TrialSelectionModel();
    TrialSelectionModel(const TrialSelectionModel &other);
    ~TrialSelectionModel() override;

    const std::shared_ptr<Trial> &selectedTrial() const { return m_selectedTrial; }
    const std::vector<std::shared_ptr<Trial>> &activeTrials() const { return m_activeTrials; }
    bool isActive(const std::shared_ptr<Trial> &trial) const;
    const std::shared_ptr<TagDefinition> &groupProperty() const { return m_groupProperty; }
    const std::set<Geometry> &colorGeometryFilter() const { return m_colorGeometryFilter; }
    const std::set<Geometry> &textureGeometryFilter() const { return m_textureGeometryFilter; }
    const Geometry &selectedColorGeometry() const { return m_selectedColorGeometry; }
    const Geometry &selectedTextureGeometry() const { return m_selectedTextureGeometry; }
    Geometry selectedStandardGeometry() const { return m_selectedStandardGeometry; }

    // Active trials keyed by their value of the group property, in active order.
    std::multimap<std::shared_ptr<TagValue>, std::shared_ptr<Trial>> activeTrialsByGroup() const;

    void setSelectedTrial(const std::shared_ptr<Trial> &trial);
    // After an effective change the selection moves to the head of the list.
    void setActiveTrials(const std::vector<std::shared_ptr<Trial>> &trials, bool force = false);
    void toggleActiveTrial(const std::shared_ptr<Trial> &trial);
    void clearTrials();
    void clear();
    void setGroupProperty(const std::shared_ptr<TagDefinition> &tagDefinition);
    void setSelectedColorGeometry(const Geometry &geometry);
    void setSelectedTextureGeometry(const Geometry &geometry);
    void setSelectedStandardGeometry(const Geometry &geometry);
    void setColorGeometryFilter(const std::set<Geometry> &filter);
    void setTextureGeometryFilter(const std::set<Geometry> &filter);

    // A synthetic measurement: spectra averaged position by position, texture values of the
    // median trial. Null for no trials.
    std::shared_ptr<AppearanceValues> averagedTrialMeasurements(
        const std::vector<std::shared_ptr<Trial>> &trials) const;
    std::shared_ptr<AppearanceValues> averagedActiveTrialMeasurements() const;
    // A copy of the values of the trial nearest (CIEDE2000 under D65/10, averaged over the
    // geometries) to the mean colour of all trials. Null when there is none.
    std::shared_ptr<AppearanceValues> getMedianAppearanceValue(
        const std::vector<std::shared_ptr<Trial>> &trials) const;
    std::shared_ptr<AppearanceValues> getActiveTrialsMedianAppearanceValue() const;

Q_SIGNALS:
    void sgTrialSelectionChanged();
    void sgActiveTrialsChanged();
    void sgColorGeometrySelectionChanged();
    void sgColorGeometryFilterChanged();
    void sgTextureGeometrySelectionChanged();
    void sgTextureGeometryFilterChanged();
    void sgStandardGeometryChanged(const vexa::Geometry &geometry);

private:
    std::vector<std::shared_ptr<Trial>> m_activeTrials;
    std::shared_ptr<Trial> m_selectedTrial;
    std::shared_ptr<TagDefinition> m_groupProperty;
    std::set<Geometry> m_colorGeometryFilter;
    Geometry m_selectedColorGeometry;
    std::set<Geometry> m_textureGeometryFilter;
    Geometry m_selectedTextureGeometry;
    Geometry m_selectedStandardGeometry;
};

} // namespace vexa

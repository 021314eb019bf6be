#pragma once

#include <vexa/vexa_export.h>

#include <QObject>
#include <QPointer>
#include <QStringList>

#include <memory>
#include <vector>

class QComboBox;
class QWidget;

namespace vexa {

class AppearanceViewDataModel;
class ToleranceSet;

// Chooses among the tolerance sets in force on a comparison page (the standard's, else
// the job template's, else the defaults) and makes the choice the data model's current
// tolerance set. It reads the data model afresh on every call and announces when the
// list or the choice may have changed. A combo box made by createComboBox() stays in
// step with it both ways.
class VEXA_EXPORT ToleranceSelector : public QObject
{
    Q_OBJECT
public:
    explicit ToleranceSelector(QObject *parent = nullptr);
    ~ToleranceSelector() override;

    void setDataModel(const std::shared_ptr<AppearanceViewDataModel> &dataModel);
    std::shared_ptr<AppearanceViewDataModel> dataModel() const { return m_dataModel; }

    // The sets in force, in order; empty without a data model.
    std::vector<std::shared_ptr<ToleranceSet>> toleranceSets() const;
    QStringList toleranceSetNames() const;
    // The position of the current set among toleranceSets(); -1 when there is none.
    int currentIndex() const;
    std::shared_ptr<ToleranceSet> currentToleranceSet() const;

    // Makes the set at index current. False (and no change) for an index out of range.
    bool setCurrentIndex(int index);
    // Makes a set in force current; false for a set that is not in force.
    bool setCurrentToleranceSet(const std::shared_ptr<ToleranceSet> &set);

    // A combo box listing the sets by name, owned by parent and kept in step.
    QComboBox *createComboBox(QWidget *parent);

Q_SIGNALS:
    // The sets in force or the current one may have changed.
    void sgToleranceSetsChanged();

private:
    void onDataModelChanged();
    void fillComboBox(QComboBox *comboBox) const;

    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::vector<QMetaObject::Connection> m_connections;
    std::vector<QPointer<QComboBox>> m_comboBoxes;
};

} // namespace vexa

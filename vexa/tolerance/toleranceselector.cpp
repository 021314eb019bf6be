#include <vexa/tolerance/toleranceselector.h>

#include <vexa/models/appearanceviewdatamodel.h>

#include <domain/toleranceset.h>

#include <QComboBox>
#include <QSignalBlocker>

#include <algorithm>

namespace vexa {

ToleranceSelector::ToleranceSelector(QObject *parent)
    : QObject(parent)
{
}

ToleranceSelector::~ToleranceSelector()
{
    for (const auto &connection : m_connections)
        QObject::disconnect(connection);
}

void ToleranceSelector::setDataModel(const std::shared_ptr<AppearanceViewDataModel> &dataModel)
{
    if (dataModel == m_dataModel)
        return;
    for (const auto &connection : m_connections)
        QObject::disconnect(connection);
    m_connections.clear();
    m_dataModel = dataModel;
    if (m_dataModel) {
        auto *model = m_dataModel.get();
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgToleranceSetChanged, this,
                                        &ToleranceSelector::onDataModelChanged));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgStandardChanged, this,
                                        &ToleranceSelector::onDataModelChanged));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgJobTemplateChanged, this,
                                        &ToleranceSelector::onDataModelChanged));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgQCJobChanged, this,
                                        &ToleranceSelector::onDataModelChanged));
    }
    onDataModelChanged();
}

std::vector<std::shared_ptr<ToleranceSet>> ToleranceSelector::toleranceSets() const
{
    return m_dataModel ? m_dataModel->toleranceSets() : std::vector<std::shared_ptr<ToleranceSet>>();
}

QStringList ToleranceSelector::toleranceSetNames() const
{
    QStringList names;
    for (const auto &set : toleranceSets())
        names << (set ? set->name() : QString());
    return names;
}

int ToleranceSelector::currentIndex() const
{
    if (!m_dataModel)
        return -1;
    const auto current = m_dataModel->currentToleranceSet();
    if (!current)
        return -1;
    const auto sets = toleranceSets();
    const auto it = std::find(sets.begin(), sets.end(), current);
    return it == sets.end() ? -1 : int(it - sets.begin());
}

std::shared_ptr<ToleranceSet> ToleranceSelector::currentToleranceSet() const
{
    return m_dataModel ? m_dataModel->currentToleranceSet() : nullptr;
}

bool ToleranceSelector::setCurrentIndex(int index)
{
    const auto sets = toleranceSets();
    if (!m_dataModel || index < 0 || index >= int(sets.size()))
        return false;
    m_dataModel->setCurrentToleranceSet(sets[size_t(index)]);
    return true;
}

bool ToleranceSelector::setCurrentToleranceSet(const std::shared_ptr<ToleranceSet> &set)
{
    const auto sets = toleranceSets();
    const auto it = std::find(sets.begin(), sets.end(), set);
    if (!set || it == sets.end())
        return false;
    return setCurrentIndex(int(it - sets.begin()));
}

QComboBox *ToleranceSelector::createComboBox(QWidget *parent)
{
    auto *comboBox = new QComboBox(parent);
    comboBox->setObjectName(QStringLiteral("toleranceSetCombo"));
    comboBox->setToolTip(tr("Tolerance set"));
    fillComboBox(comboBox);
    connect(comboBox, QOverload<int>::of(&QComboBox::activated), this,
            [this](int index) { setCurrentIndex(index); });
    m_comboBoxes.emplace_back(comboBox);
    return comboBox;
}

void ToleranceSelector::fillComboBox(QComboBox *comboBox) const
{
    const QSignalBlocker blocker(comboBox);
    comboBox->clear();
    comboBox->addItems(toleranceSetNames());
    comboBox->setCurrentIndex(currentIndex());
    comboBox->setEnabled(comboBox->count() > 1);
}

void ToleranceSelector::onDataModelChanged()
{
    m_comboBoxes.erase(std::remove_if(m_comboBoxes.begin(), m_comboBoxes.end(),
                                      [](const QPointer<QComboBox> &box) { return box.isNull(); }),
                       m_comboBoxes.end());
    for (const auto &comboBox : m_comboBoxes)
        fillComboBox(comboBox);
    Q_EMIT sgToleranceSetsChanged();
}

} // namespace vexa

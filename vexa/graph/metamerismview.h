#pragma once

#include <vexa/vexa_export.h>
#include <vexa/models/appearanceviewbase.h>

#include <domain/colorimetriccondition.h>

#include <QStringList>
#include <QVector>
#include <QWidget>

class QLabel;
class QTableWidget;

namespace vexa {

// How far the selected trial's match with the standard holds under other light: per
// geometry (those of the colour geometry filter, or every geometry where both have a
// spectrum) the colour difference under the page's colorimetric condition and under each
// test illuminant (A and F11 by default, same observer), and the metamerism index under
// each test illuminant (see ColorIndicesCalculator::MetamerismIndex), which leaves out the
// part of the difference the pair already has under the page's condition. The row of the
// selected geometry is bold. The column titles name the illuminants, the title the
// observer they share.
class VEXA_EXPORT MetamerismView : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    explicit MetamerismView(QWidget *parent = nullptr);
    ~MetamerismView() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;
    void settingsChanged() override;

    // A formula name of ColorDifferenceCalculator ("CIE2000" by default); an unknown name
    // is refused (false).
    bool setDeltaEFormula(const QString &formula);
    QString deltaEFormula() const { return m_formula; }
    void setTestIlluminants(const QStringList &illuminants);
    QStringList testIlluminants() const { return m_testIlluminants; }

    // The conditions of the columns: the page's, then each test illuminant that differs
    // from the page's under the page's observer.
    QVector<ColorimetricCondition> conditions() const;

    QLabel *titleLabel() const { return m_title; }
    QTableWidget *table() const { return m_table; }
    // The number in a cell (NaN for an empty one or out of range).
    double valueAt(int row, int column) const;

public Q_SLOTS:
    void refreshAll();

protected:
    void refreshStandard() override { refreshAll(); }
    void refreshQCJob() override { refreshAll(); }
    void refreshTrials() override { refreshAll(); }
    void refreshColorimetricCondition() override { refreshAll(); }
    void onTrialSelected() override { refreshAll(); }
    void onActiveGeometriesChanged() override { refreshAll(); }
    void onGeometrySelected() override { refreshAll(); }
    void changeEvent(QEvent *event) override;

private:
    QString m_formula = QStringLiteral("CIE2000");
    QStringList m_testIlluminants{QStringLiteral("A"), QStringLiteral("F11")};
    QLabel *m_title;       // Child.
    QTableWidget *m_table; // Child.
};

} // namespace vexa

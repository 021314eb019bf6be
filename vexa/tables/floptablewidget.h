#pragma once

#include <vexa/vexa_export.h>
#include <vexa/models/appearanceviewbase.h>

#include <QModelIndex>
#include <QWidget>

#include <memory>

class GeneralSettings;
class QCheckBox;
class QTableView;

namespace vexa {

class FlopTableModel;

// Shows a FlopTableModel beside the other views of a comparison page. The flop values are
// shown with decimals() decimals (2 by default), the flop difference on its verdict colour
// in black or white, whichever reads better. The row of the selected trial is selected;
// a click on a trial's row selects that trial on the page. "Selected trial only" sets the
// model's selected-trial flag.
class VEXA_EXPORT FlopTableWidget : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    explicit FlopTableWidget(std::shared_ptr<GeneralSettings> generalSettings, QWidget *parent = nullptr);
    ~FlopTableWidget() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;
    void settingsChanged() override;

    void setDecimals(int decimals);
    int decimals() const { return m_decimals; }

    FlopTableModel *tableModel() const { return m_model; }
    QTableView *tableView() const { return m_view; }
    QCheckBox *selectedTrialOnlyBox() const { return m_selectedOnlyBox; }

public Q_SLOTS:
    void onRowClicked(const QModelIndex &index);

protected:
    void onTrialSelected() override;

private:
    void selectTrialRow();

    FlopTableModel *m_model;     // Child.
    QTableView *m_view;          // Child.
    QCheckBox *m_selectedOnlyBox; // Child.
    int m_decimals = 2;
    bool m_inRowClick = false;
};

} // namespace vexa

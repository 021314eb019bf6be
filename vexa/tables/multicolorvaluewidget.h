#pragma once

#include <vexa/vexa_export.h>
#include <vexa/models/appearanceviewbase.h>

#include <QList>
#include <QModelIndex>
#include <QString>
#include <QWidget>

#include <memory>
#include <string>

class GeneralSettings;
class QAction;
class QClipboard;
class QMenu;
class QSortFilterProxyModel;
class QTableView;

namespace vexa {

class TableViewExportModel;

class MultiColorValueTableModel;

// Shows a MultiColorValueTableModel in a table view. The row selection follows the
// page's TrialSelectionModel both ways: a click on a trial's row selects that trial and
// geometry, a click on a standard's row selects the standard geometry only, and a trial
// or geometry selected elsewhere selects its row. A click on a header sorts by that
// column (the standard's rows stay on top). Ctrl+C copies the selected rows; the context
// menu exports the table to CSV or Excel and prints a snapshot. Exports and the printed
// table show what the view shows: its rows in their sorted order, without hidden columns.
class VEXA_EXPORT MultiColorValueWidget : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    explicit MultiColorValueWidget(QWidget *parent = nullptr);
    ~MultiColorValueWidget() override;

    // name titles the Excel exports and keys the remembered export folders.
    void initialize(std::shared_ptr<MultiColorValueTableModel> model, std::shared_ptr<GeneralSettings> settings,
                    QString name);

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;
    // showStandard lists the standard's rows on top of the table.
    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel, bool showStandard);

    std::shared_ptr<MultiColorValueTableModel> tableModel() const { return m_model; }
    // The table as the view shows it (sorted rows, shown columns), for exports and printing.
    std::shared_ptr<TableViewExportModel> exportModel() const;
    QString tableToCSVString() const;
    void clearSelections();
    void refreshAll();
    void settingsChanged() override;

    QTableView *tableView() const { return m_view; }
    QSortFilterProxyModel *proxyModel() const { return m_proxy; }
    QMenu *contextMenu() const { return m_contextMenu; }
    QString name() const { return m_name; }
    // The selected cells as indexes of the table model (not of the sorting proxy).
    QList<QModelIndex> selectedSourceIndexes() const;
    // The text Ctrl+C puts on the clipboard: per selected row every cell's text and a
    // blank, then a line break.
    QString selectedRowsText() const;

Q_SIGNALS:
    void spectralGeometryRowClicked(int rowIndex, std::string geometry);
    void spectralGeometryRowsSelected(int numSelected);

public Q_SLOTS:
    void onExportToCSV();
    void onExportToExcel();
    void onConfigureView();
    void print();
    // Prints the whole table (not only what is scrolled into view) as a document, through the
    // print dialog. False when nothing was printed.
    bool printTable();
    void onRowClicked(const QModelIndex &index);
    void onHeaderClicked(int section);
    void onContextMenuRequested(const QPoint &pos);

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void changeEvent(QEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

    void onTrialSelected() override;
    void onGeometrySelected() override;
    void onStandardGeometrySelected() override;

private:
    void retranslate();
    void createContextMenu();
    void copySelectedRows();
    void selectTrialRow();
    void selectStandardRow();
    void selectSourceRow(int sourceRow);
    void restoreSelection();
    // Text columns (name, geometry, date, instrument) take the width of their contents; the
    // number columns share the rest.
    void fitColumns();
    void onViewSelectionChanged();
    void showError(const QString &title, const QString &text);

    QTableView *m_view;
    QSortFilterProxyModel *m_proxy;
    std::shared_ptr<MultiColorValueTableModel> m_model;
    std::shared_ptr<GeneralSettings> m_generalSettings;
    QString m_name;
    QClipboard *m_clipboard;
    QMenu *m_contextMenu = nullptr;
    QAction *m_exportCsvAction = nullptr;
    QAction *m_exportExcelAction = nullptr;
    QAction *m_printAction = nullptr;
    bool m_standardSelected = false;
    bool m_inRowClick = false;
    int m_sortColumn = -1;
    Qt::SortOrder m_sortOrder = Qt::AscendingOrder;
};

} // namespace vexa

#include <vexa/tables/multicolorvaluewidget.h>

#include <vexa/export/dialogrunner.h>
#include <vexa/export/jobdetailviewexcelexporter.h>
#include <vexa/export/tablecsvexporter.h>
#include <vexa/export/tableprinter.h>
#include <vexa/export/tableviewexportmodel.h>
#include <vexa/export/widgetprinter.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/tables/colortableconfiguredialog.h>
#include <vexa/tables/columndefinition.h>
#include <vexa/tables/drawborderdelegate.h>
#include <vexa/tables/multicolorvaluetablemodel.h>

#include <domain/standard.h>
#include <domain/trial.h>
#include <settings/generalsettings.h>
#include <settings/stringlistsetting.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QEvent>
#include <QHeaderView>
#include <QItemSelectionModel>
#include <QKeyEvent>
#include <QMenu>
#include <QMessageBox>
#include <QRegularExpression>
#include <QSortFilterProxyModel>
#include <QTableView>
#include <QVBoxLayout>

#include <algorithm>

namespace vexa {

namespace {

// Sorts by the cells' raw values and keeps the standard's rows on top in both orders.
class StandardFirstSortProxy : public QSortFilterProxyModel
{
public:
    using QSortFilterProxyModel::QSortFilterProxyModel;

protected:
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override
    {
        const bool leftStandard = left.data(MultiColorValueTableModel::StandardRowRole).toBool();
        const bool rightStandard = right.data(MultiColorValueTableModel::StandardRowRole).toBool();
        if (leftStandard != rightStandard)
            return sortOrder() == Qt::AscendingOrder ? leftStandard : rightStandard;
        if (leftStandard) // Standard rows keep their order.
            return sortOrder() == Qt::AscendingOrder ? left.row() < right.row() : left.row() > right.row();
        return QSortFilterProxyModel::lessThan(left, right);
    }
};

bool isCopyKey(const QKeyEvent *event)
{
    return event->key() == Qt::Key_C && event->modifiers() == Qt::ControlModifier;
}

} // namespace

MultiColorValueWidget::MultiColorValueWidget(QWidget *parent)
    : QWidget(parent)
    , m_view(new QTableView(this))
    , m_proxy(new StandardFirstSortProxy(this))
    , m_clipboard(QApplication::clipboard())
{
    setObjectName(QStringLiteral("MultiColorValueWidget"));
    m_view->setObjectName(QStringLiteral("colorTableView"));
    m_proxy->setSortRole(MultiColorValueTableModel::ExportValueRole);
    m_proxy->setSortLocaleAware(true);
    m_view->setModel(m_proxy);
    m_view->setSelectionMode(QAbstractItemView::ExtendedSelection);
    m_view->setContextMenuPolicy(Qt::CustomContextMenu);
    m_view->setShowGrid(false);
    m_view->setWordWrap(false);
    // Long tolerance set names wrap in the header; long trial names keep their end
    // (the part that tells trials apart) when the columns are narrow.
    m_view->horizontalHeader()->setDefaultAlignment(Qt::Alignment(int(Qt::AlignCenter) | int(Qt::TextWordWrap)));
    m_view->setTextElideMode(Qt::ElideMiddle);
    m_view->installEventFilter(this);
    m_view->viewport()->installEventFilter(this);
    connect(m_view->selectionModel(), &QItemSelectionModel::selectionChanged, this,
            &MultiColorValueWidget::onViewSelectionChanged);
    connect(m_proxy, &QAbstractItemModel::modelReset, this, &MultiColorValueWidget::restoreSelection);
    connect(m_proxy, &QAbstractItemModel::modelReset, this, &MultiColorValueWidget::fitColumns);
    connect(m_proxy, &QAbstractItemModel::columnsInserted, this, &MultiColorValueWidget::fitColumns);
    connect(m_proxy, &QAbstractItemModel::columnsRemoved, this, &MultiColorValueWidget::fitColumns);
    connect(m_proxy, &QAbstractItemModel::headerDataChanged, this, &MultiColorValueWidget::fitColumns);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_view);
    retranslate();
}

MultiColorValueWidget::~MultiColorValueWidget() = default;

void MultiColorValueWidget::initialize(std::shared_ptr<MultiColorValueTableModel> model,
                                       std::shared_ptr<GeneralSettings> settings, QString name)
{
    m_model = std::move(model);
    m_generalSettings = std::move(settings);
    m_name = std::move(name);
    m_proxy->setSourceModel(m_model.get());

    m_view->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_view->setItemDelegate(new DrawBorderDelegate(m_view, this));
    m_view->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    fitColumns();
    m_view->verticalHeader()->setDefaultSectionSize(25);
    m_view->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);

    // Connected once, however often the widget is initialised.
    connect(m_view, SIGNAL(clicked(QModelIndex)), this, SLOT(onRowClicked(QModelIndex)), Qt::UniqueConnection);
    connect(m_view->horizontalHeader(), SIGNAL(sectionClicked(int)), this, SLOT(onHeaderClicked(int)),
            Qt::UniqueConnection);
    connect(m_view, SIGNAL(customContextMenuRequested(QPoint)), this, SLOT(onContextMenuRequested(QPoint)),
            Qt::UniqueConnection);
    createContextMenu();
    restoreSelection();
}

void MultiColorValueWidget::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                      const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    setModels(dataModel, selectionModel, m_model ? m_model->showStandard() : true);
}

void MultiColorValueWidget::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                      const std::shared_ptr<TrialSelectionModel> &selectionModel, bool showStandard)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    if (m_model) {
        m_model->setShowStandard(showStandard);
        m_model->setModels(dataModel, selectionModel);
    }
}

std::shared_ptr<TableViewExportModel> MultiColorValueWidget::exportModel() const
{
    return std::make_shared<TableViewExportModel>(m_view);
}

QString MultiColorValueWidget::tableToCSVString() const
{
    if (!m_model)
        return QString();
    return TableCSVExporter(m_generalSettings, m_name).exportToString(exportModel().get());
}

void MultiColorValueWidget::clearSelections()
{
    m_view->clearSelection();
}

void MultiColorValueWidget::fitColumns()
{
    if (!m_model)
        return;
    QHeaderView *header = m_view->horizontalHeader();
    const int columns = m_proxy->columnCount();
    // Number columns stretch over what the text columns leave. When the table is too narrow for
    // every text and header, the verdict and number columns keep their headers' widths (a tolerance
    // set's name is never cut to "itomoti") and the date and instrument give way first; only what
    // still does not fit scrolls sideways.
    enum class Kind { Primary, Secondary, Number };
    QVector<Kind> kinds(columns, Kind::Number);
    int primary = 0;
    int secondaryNeed = 0;
    int secondaryCount = 0;
    int numbers = 0;
    const auto *view = static_cast<const QAbstractItemView *>(m_view);
    for (int c = 0; c < columns; ++c) {
        const auto column = m_model->columnAt(c);
        if (column && (column->alignment() & Qt::AlignLeft)) {
            const bool secondary = dynamic_cast<const ColumnDefinitionDateTime *>(column.get())
                || dynamic_cast<const ColumnDefinitionInstrumentInfo *>(column.get());
            kinds[c] = secondary ? Kind::Secondary : Kind::Primary;
        }
        if (header->isSectionHidden(c))
            continue;
        const int contents = std::max(view->sizeHintForColumn(c), header->sectionSizeHint(c));
        switch (kinds[c]) {
        case Kind::Primary: primary += contents; break;
        case Kind::Secondary: secondaryNeed += contents; ++secondaryCount; break;
        case Kind::Number: numbers += header->sectionSizeHint(c); break;
        }
    }
    const int available = m_view->viewport()->width();
    const bool fits = primary + secondaryNeed + numbers <= available;
    // Narrow, a number column needs only its header's longest word: the header wraps the rest.
    auto narrowWidth = [this, header](int c) {
        const QFontMetrics metrics(m_proxy->headerData(c, Qt::Horizontal, Qt::FontRole).value<QFont>());
        int widest = 0;
        for (const QString &word : m_proxy->headerData(c, Qt::Horizontal).toString().split(QRegularExpression(QStringLiteral("\\s+")), Qt::SkipEmptyParts))
            widest = std::max(widest, metrics.horizontalAdvance(word));
        return std::min(header->sectionSizeHint(c), widest + 12);
    };
    if (!fits) {
        numbers = 0;
        for (int c = 0; c < columns; ++c) {
            if (kinds[c] == Kind::Number && !header->isSectionHidden(c))
                numbers += narrowWidth(c);
        }
    }
    const int secondaryWidth =
        secondaryCount > 0 ? std::max(60, (available - primary - numbers) / secondaryCount) : 0;
    for (int c = 0; c < columns; ++c) {
        if (kinds[c] == Kind::Primary || (fits && kinds[c] == Kind::Secondary)) {
            header->setSectionResizeMode(c, QHeaderView::ResizeToContents);
        } else if (fits) {
            header->setSectionResizeMode(c, QHeaderView::Stretch);
        } else {
            header->setSectionResizeMode(c, QHeaderView::Interactive);
            header->resizeSection(c, kinds[c] == Kind::Secondary ? secondaryWidth : narrowWidth(c));
        }
    }
}

void MultiColorValueWidget::refreshAll()
{
    if (m_model)
        m_model->refresh();
}

void MultiColorValueWidget::settingsChanged()
{
    refreshAll();
}

QList<QModelIndex> MultiColorValueWidget::selectedSourceIndexes() const
{
    QList<QModelIndex> indexes;
    for (const QModelIndex &index : m_view->selectionModel()->selectedIndexes())
        indexes << m_proxy->mapToSource(index);
    return indexes;
}

QString MultiColorValueWidget::selectedRowsText() const
{
    QString text;
    const int columns = m_proxy->columnCount();
    for (const QModelIndex &rowIndex : m_view->selectionModel()->selectedRows()) {
        for (int c = 0; c < columns; ++c) {
            text += m_proxy->index(rowIndex.row(), c).data(Qt::DisplayRole).toString();
            text += QLatin1Char(' ');
        }
        text += QLatin1Char('\n');
    }
    return text;
}

void MultiColorValueWidget::copySelectedRows()
{
    if (!m_clipboard)
        return;
    m_clipboard->clear();
    m_clipboard->setText(selectedRowsText());
}

void MultiColorValueWidget::keyPressEvent(QKeyEvent *event)
{
    if (isCopyKey(event)) {
        copySelectedRows();
        event->accept();
        return;
    }
    QWidget::keyPressEvent(event);
}

bool MultiColorValueWidget::eventFilter(QObject *watched, QEvent *event)
{
    // The view copies only its current cell on Ctrl+C; the table copies whole rows.
    if (watched == m_view && event->type() == QEvent::KeyPress && isCopyKey(static_cast<QKeyEvent *>(event))) {
        keyPressEvent(static_cast<QKeyEvent *>(event));
        return true;
    }
    if (watched == m_view->viewport() && event->type() == QEvent::Resize)
        fitColumns();
    return QWidget::eventFilter(watched, event);
}

void MultiColorValueWidget::changeEvent(QEvent *event)
{
    if (event->type() == QEvent::LanguageChange)
        retranslate();
    QWidget::changeEvent(event);
}

void MultiColorValueWidget::retranslate()
{
    setWindowTitle(QCoreApplication::translate("Form", "MultiColorValueWidget"));
    if (m_exportCsvAction) {
        m_exportCsvAction->setText(tr("Export table to CSV"));
        m_exportExcelAction->setText(tr("Export table to Excel"));
        m_printAction->setText(tr("Print Snapshot"));
    }
}

void MultiColorValueWidget::createContextMenu()
{
    if (m_contextMenu)
        return;
    m_contextMenu = new QMenu(this);
    m_contextMenu->setObjectName(QStringLiteral("colorTableContextMenu"));
    m_exportCsvAction = new QAction(this);
    m_exportCsvAction->setObjectName(QStringLiteral("exportCsvAction"));
    m_exportExcelAction = new QAction(this);
    m_exportExcelAction->setObjectName(QStringLiteral("exportExcelAction"));
    m_printAction = new QAction(this);
    m_printAction->setObjectName(QStringLiteral("printAction"));
    connect(m_exportCsvAction, &QAction::triggered, this, &MultiColorValueWidget::onExportToCSV);
    connect(m_exportExcelAction, &QAction::triggered, this, &MultiColorValueWidget::onExportToExcel);
    connect(m_printAction, &QAction::triggered, this, &MultiColorValueWidget::print);
    retranslate();
}

void MultiColorValueWidget::onContextMenuRequested(const QPoint &pos)
{
    createContextMenu();
    m_contextMenu->clear();
    m_contextMenu->addAction(m_exportCsvAction);
    m_contextMenu->addAction(m_exportExcelAction);
    m_contextMenu->addAction(m_printAction);
    m_contextMenu->popup(m_view->viewport()->mapToGlobal(pos));
}

void MultiColorValueWidget::showError(const QString &title, const QString &text)
{
    // Not modal-blocking: the message stays until the user closes it.
    auto *box = new QMessageBox(QMessageBox::Warning, title, text, QMessageBox::Ok, this);
    box->setObjectName(QStringLiteral("exportErrorBox"));
    box->setAttribute(Qt::WA_DeleteOnClose);
    box->open();
}

void MultiColorValueWidget::onExportToCSV()
{
    if (!m_model)
        return;
    TableCSVExporter exporter(m_generalSettings, m_name);
    if (!exporter.exportToFile(exporter.exportToString(exportModel().get()), this) && !exporter.errorString().isEmpty())
        showError(tr("Export table to CSV"), exporter.errorString());
}

void MultiColorValueWidget::onExportToExcel()
{
    if (!m_model)
        return;
    JobDetailViewExcelExporter exporter(m_generalSettings, m_name, this);
    if (!exporter.promptForFilename())
        return;
    exporter.setModels(appearanceViewDataModel(), trialSelectionModel());
    const auto shown = exportModel();
    exporter.setColorDataTableModel(shown);
    if (!exporter.exportToFile(shown->mapSelection(m_view->selectionModel()->selectedIndexes())))
        showError(tr("Export table to Excel"), exporter.errorString());
}

void MultiColorValueWidget::onConfigureView()
{
    if (!m_model || !m_model->colorCompareSettings())
        return;
    const auto settings = m_model->colorCompareSettings();
    ColorTableConfigureDialog dialog(this);
    const EColorSpace current = settings->enabledTableColorSpace();
    dialog.setColorSpace(current);
    const EColorSpace offered = dialog.colorSpace();
    if (DialogRunner::exec(dialog) != QDialog::Accepted)
        return;
    const EColorSpace chosen = dialog.colorSpace();
    if (chosen == offered && chosen == current)
        return;
    if (chosen == offered && current != EColorSpace::CIELab && current != EColorSpace::CIELCh)
        return; // Nothing chosen: keep a layout the dialog does not offer (L*a*b*C*h, none).
    auto setting = settings->tableColorSpaceCoordinatesSetting();
    if (!setting)
        setting = settings->createTableColorSpaceCoordinatesSetting();
    setting->setSelectedValue(colorSpaceName(chosen));
}

void MultiColorValueWidget::print()
{
    WidgetPrinter::printWidget(this);
}

bool MultiColorValueWidget::printTable()
{
    if (!m_model)
        return false;
    const auto shown = exportModel();
    auto printed = std::make_shared<QSortFilterProxyModel>();
    printed->setSourceModel(shown.get());
    TablePrinter printer(printed);
    const auto dataModel = appearanceViewDataModel();
    const QString standard = dataModel && dataModel->standard() ? dataModel->standard()->name() : QString();
    const QString condition = dataModel ? dataModel->colorimetricCondition().toString() : QString();
    printer.setTitle(m_name.toStdString(), standard.toStdString(), condition.toStdString());
    return printer.print(this);
}

void MultiColorValueWidget::onRowClicked(const QModelIndex &index)
{
    if (!m_model || !index.isValid())
        return;
    const QModelIndex source = m_proxy->mapToSource(index);
    const auto row = m_model->rowAt(source.row());
    const auto selection = trialSelectionModel();
    if (!row)
        return;
    if (selection) {
        m_inRowClick = true;
        if (row->isStandard()) {
            m_standardSelected = true;
            selection->setSelectedStandardGeometry(row->geometry());
        } else {
            m_standardSelected = false;
            selection->setSelectedTrial(row->trial());
            selection->setSelectedColorGeometry(row->geometry());
        }
        m_inRowClick = false;
    }
    Q_EMIT spectralGeometryRowClicked(source.row(), row->geometry().toString().toStdString());
}

void MultiColorValueWidget::onHeaderClicked(int section)
{
    if (section < 0 || section >= m_proxy->columnCount())
        return;
    m_sortOrder = (section == m_sortColumn && m_sortOrder == Qt::AscendingOrder) ? Qt::DescendingOrder
                                                                                  : Qt::AscendingOrder;
    m_sortColumn = section;
    m_proxy->sort(section, m_sortOrder);
    m_view->horizontalHeader()->setSortIndicatorShown(true);
    m_view->horizontalHeader()->setSortIndicator(section, m_sortOrder);
}

void MultiColorValueWidget::onTrialSelected()
{
    // A click on a row has selected it in the view already (and may have extended a
    // multi-row selection, which must stay).
    if (m_inRowClick)
        return;
    m_standardSelected = false;
    selectTrialRow();
}

void MultiColorValueWidget::onGeometrySelected()
{
    if (m_inRowClick)
        return;
    m_standardSelected = false;
    selectTrialRow();
}

void MultiColorValueWidget::onStandardGeometrySelected()
{
    m_standardSelected = true;
    if (m_inRowClick)
        return;
    selectStandardRow();
}

void MultiColorValueWidget::selectSourceRow(int sourceRow)
{
    if (!m_model || sourceRow < 0) {
        m_view->clearSelection();
        return;
    }
    const QModelIndex proxyIndex = m_proxy->mapFromSource(m_model->index(sourceRow, 0));
    if (!proxyIndex.isValid()) {
        m_view->clearSelection();
        return;
    }
    m_view->selectRow(proxyIndex.row());
}

void MultiColorValueWidget::selectTrialRow()
{
    const auto selection = trialSelectionModel();
    if (!m_model || !selection)
        return;
    selectSourceRow(m_model->rowOf(selection->selectedTrial(), selection->selectedColorGeometry()));
}

void MultiColorValueWidget::selectStandardRow()
{
    m_view->clearSelection();
    const auto selection = trialSelectionModel();
    const auto dataModel = appearanceViewDataModel();
    if (!m_model || !selection || !dataModel || !dataModel->standard())
        return;
    const int row = m_model->standardRowOf(selection->selectedStandardGeometry());
    if (row >= 0)
        selectSourceRow(row);
}

void MultiColorValueWidget::restoreSelection()
{
    if (!trialSelectionModel())
        return;
    if (m_standardSelected)
        selectStandardRow();
    else
        selectTrialRow();
}

void MultiColorValueWidget::onViewSelectionChanged()
{
    Q_EMIT spectralGeometryRowsSelected(m_view->selectionModel()->selectedRows().size());
}

} // namespace vexa

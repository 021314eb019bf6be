#include <vexa/tables/floptablewidget.h>

#include <vexa/models/trialselectionmodel.h>
#include <vexa/tables/drawborderdelegate.h>
#include <vexa/tables/floptablemodel.h>
#include <vexa/widgets/verdictcolors.h>

#include <domain/trial.h>

#include <QCheckBox>
#include <QFontMetrics>
#include <QHeaderView>
#include <QLocale>
#include <QTableView>
#include <QVBoxLayout>

#include <algorithm>

namespace vexa {

namespace {

// Numbers with a fixed count of decimals; text on a verdict colour in black or white,
// whichever has the higher contrast.
class FlopValueDelegate : public DrawBorderDelegate
{
public:
    FlopValueDelegate(QTableView *view, const int &decimals, QObject *parent)
        : DrawBorderDelegate(view, parent)
        , m_decimals(decimals)
    {
    }

    QString displayText(const QVariant &value, const QLocale &locale) const override
    {
        if (value.userType() == QMetaType::Double)
            return locale.toString(value.toDouble(), 'f', m_decimals);
        return DrawBorderDelegate::displayText(value, locale);
    }

protected:
    void initStyleOption(QStyleOptionViewItem *option, const QModelIndex &index) const override
    {
        DrawBorderDelegate::initStyleOption(option, index);
        const QColor background = VerdictColors::colorOfBackground(index.data(Qt::BackgroundRole));
        if (!background.isValid())
            return;
        const QColor text = VerdictColors::readableTextColor(background);
        option->palette.setColor(QPalette::Text, text);
        option->palette.setColor(QPalette::HighlightedText, text);
    }

private:
    const int &m_decimals; // The widget's.
};

} // namespace

FlopTableWidget::FlopTableWidget(std::shared_ptr<GeneralSettings> generalSettings, QWidget *parent)
    : QWidget(parent)
    , m_model(new FlopTableModel(std::move(generalSettings), this))
    , m_view(new QTableView(this))
    , m_selectedOnlyBox(new QCheckBox(tr("Selected trial only"), this))
{
    setObjectName(QStringLiteral("FlopTableWidget"));
    m_view->setObjectName(QStringLiteral("flopTableView"));
    m_selectedOnlyBox->setObjectName(QStringLiteral("selectedTrialOnlyBox"));
    m_view->setModel(m_model);
    m_view->setItemDelegate(new FlopValueDelegate(m_view, m_decimals, this));
    m_view->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_view->setSelectionMode(QAbstractItemView::SingleSelection);
    m_view->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_view->setShowGrid(false);
    m_view->setWordWrap(false);
    m_view->setTextElideMode(Qt::ElideMiddle);
    m_view->verticalHeader()->hide();
    m_view->verticalHeader()->setDefaultSectionSize(25);
    m_view->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    // The names take what the numbers leave. The number columns are as wide as a number or a
    // line of their wrapped header ("ΔFlop-" / "index"): sizing them to their contents would
    // compute every row's flop index.
    QHeaderView *header = m_view->horizontalHeader();
    header->setDefaultAlignment(Qt::Alignment(int(Qt::AlignCenter) | int(Qt::TextWordWrap)));
    header->setSectionResizeMode(QHeaderView::Interactive);
    header->setSectionResizeMode(FlopTableModel::NameColumn, QHeaderView::Stretch);
    const QFontMetrics metrics = header->fontMetrics();
    for (int column : {int(FlopTableModel::FlopDifferenceColumn), int(FlopTableModel::FlopColumn)}) {
        int width = metrics.horizontalAdvance(QStringLiteral("-00.00"));
        for (const QString &part : m_model->headerData(column, Qt::Horizontal).toString().split(QLatin1Char('-')))
            width = std::max(width, metrics.horizontalAdvance(part + QLatin1Char('-')));
        header->resizeSection(column, width + 16);
    }
    header->setMinimumHeight(2 * metrics.lineSpacing() + 10);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_view, 1);
    layout->addWidget(m_selectedOnlyBox);

    connect(m_view, &QTableView::clicked, this, &FlopTableWidget::onRowClicked);
    connect(m_selectedOnlyBox, &QCheckBox::toggled, m_model, &FlopTableModel::setSelectedTrialOnly);
    connect(m_model, &QAbstractItemModel::modelReset, this, &FlopTableWidget::selectTrialRow);
    connect(m_model, &QAbstractItemModel::rowsInserted, this, &FlopTableWidget::selectTrialRow);
}

FlopTableWidget::~FlopTableWidget() = default;

void FlopTableWidget::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    m_model->setModels(dataModel, selectionModel);
}

void FlopTableWidget::settingsChanged()
{
    m_model->refresh();
}

void FlopTableWidget::setDecimals(int decimals)
{
    m_decimals = std::clamp(decimals, 0, 10);
    m_view->viewport()->update();
}

void FlopTableWidget::onRowClicked(const QModelIndex &index)
{
    const auto selection = trialSelectionModel();
    const auto trial = index.isValid() ? m_model->trialAt(index.row()) : nullptr;
    if (!selection || !trial)
        return;
    m_inRowClick = true;
    selection->setSelectedTrial(trial);
    m_inRowClick = false;
}

void FlopTableWidget::onTrialSelected()
{
    if (!m_inRowClick)
        selectTrialRow();
}

void FlopTableWidget::selectTrialRow()
{
    const auto selection = trialSelectionModel();
    const int row = selection ? m_model->rowOf(selection->selectedTrial()) : -1;
    if (row < 0) {
        m_view->clearSelection();
        return;
    }
    m_view->selectRow(row);
}

} // namespace vexa

#include "spectralpage.h"

#include <vexa/graph/metamerismview.h>
#include <vexa/graph/spectralplotwidget.h>
#include <vexa/graph/spectralvaluetablemodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QFontMetrics>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QSplitter>
#include <QTableView>
#include <QVBoxLayout>

#include <algorithm>

namespace vexa {


SpectralPage::SpectralPage(QWidget *parent)
    : QWidget(parent)
    , m_scopeBox(new QComboBox(this))
    , m_plot(new SpectralPlotWidget(this))
    , m_tableModel(new SpectralValueTableModel(this))
    , m_table(new QTableView(this))
    , m_metamerism(new MetamerismView(this))
    , m_copyTable(new QAction(tr("Copy table"), this))
{
    m_scopeBox->setObjectName(QStringLiteral("spectralScope"));
    m_scopeBox->addItem(tr("Standard and active trials at the selected geometry"), int(SpectralScope::SelectedGeometry));
    m_scopeBox->addItem(tr("Selected trial and standard at every geometry"), int(SpectralScope::AllGeometries));
    auto *top = new QHBoxLayout;
    top->addWidget(new QLabel(tr("Show:"), this));
    top->addWidget(m_scopeBox);
    top->addStretch(1);

    m_plot->setObjectName(QStringLiteral("spectralPlot"));
    m_table->setObjectName(QStringLiteral("spectralTable"));
    m_table->setModel(m_tableModel);
    m_table->verticalHeader()->hide();
    m_table->horizontalHeader()->setDefaultSectionSize(84);
    m_table->setSelectionBehavior(QAbstractItemView::SelectItems);
    m_table->setContextMenuPolicy(Qt::ActionsContextMenu);
    m_copyTable->setShortcut(QKeySequence::Copy);
    m_copyTable->setShortcutContext(Qt::WidgetShortcut);
    m_table->addAction(m_copyTable);
    m_metamerism->setObjectName(QStringLiteral("metamerism"));

    auto *tableBox = new QGroupBox(tr("Spectral values"), this);
    auto *tableLayout = new QVBoxLayout(tableBox);
    tableLayout->addWidget(m_table);
    auto *metamerismBox = new QGroupBox(tr("Metamerism"), this);
    auto *metamerismLayout = new QVBoxLayout(metamerismBox);
    metamerismLayout->addWidget(m_metamerism);

    auto *bottom = new QSplitter(Qt::Horizontal, this);
    bottom->addWidget(tableBox);
    bottom->addWidget(metamerismBox);
    bottom->setStretchFactor(0, 3);
    bottom->setStretchFactor(1, 2);
    bottom->setSizes({600, 540});
    auto *splitter = new QSplitter(Qt::Vertical, this);
    splitter->addWidget(m_plot);
    splitter->addWidget(bottom);
    splitter->setStretchFactor(0, 3);
    splitter->setStretchFactor(1, 2);
    splitter->setSizes({480, 360});

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(4, 4, 4, 4);
    layout->addLayout(top);
    layout->addWidget(splitter, 1);

    connect(m_scopeBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &SpectralPage::onScopeChosen);
    connect(m_table, &QTableView::clicked, this, &SpectralPage::onCellClicked);
    connect(m_copyTable, &QAction::triggered, this, &SpectralPage::copyTable);
    connect(m_tableModel, &QAbstractItemModel::modelReset, this, &SpectralPage::fitColumns);
}

SpectralPage::~SpectralPage() = default;

void SpectralPage::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                             const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    m_selectionModel = selectionModel;
    m_plot->setModels(dataModel, selectionModel);
    m_tableModel->setModels(dataModel, selectionModel);
    m_metamerism->setModels(dataModel, selectionModel);
}

void SpectralPage::setDeltaEFormula(const QString &formula)
{
    m_metamerism->setDeltaEFormula(formula);
}

void SpectralPage::settingsChanged()
{
    m_plot->settingsChanged();
    m_tableModel->settingsChanged();
    m_metamerism->settingsChanged();
}

void SpectralPage::onScopeChosen()
{
    const auto scope = SpectralScope(m_scopeBox->currentData().toInt());
    m_plot->setScope(scope);
    m_tableModel->setScope(scope);
}

void SpectralPage::onCellClicked(const QModelIndex &index)
{
    const SpectralEntry *entry = m_tableModel->entryAt(index.column());
    if (entry && entry->trial && m_selectionModel)
        m_selectionModel->setSelectedTrial(entry->trial);
}

QString SpectralPage::tableText() const
{
    QString text;
    const int columns = m_tableModel->columnCount();
    for (int c = 0; c < columns; ++c)
        text += m_tableModel->headerData(c, Qt::Horizontal).toString() + (c + 1 < columns ? QStringLiteral("\t") : QString());
    text += QLatin1Char('\n');
    for (int r = 0; r < m_tableModel->rowCount(); ++r) {
        for (int c = 0; c < columns; ++c) {
            text += m_tableModel->data(m_tableModel->index(r, c)).toString();
            if (c + 1 < columns)
                text += QLatin1Char('\t');
        }
        text += QLatin1Char('\n');
    }
    return text;
}

void SpectralPage::copyTable()
{
    QApplication::clipboard()->setText(tableText());
}

// Each column as wide as its title (bold, as the selected trial's is) or a difference
// with four decimals. Measured from the texts only: with a thousand trials the table has
// two thousand columns, too many to measure cell by cell.
void SpectralPage::fitColumns()
{
    QFont bold = m_table->horizontalHeader()->font();
    bold.setBold(true);
    const QFontMetrics header(bold);
    const int number = QFontMetrics(m_table->font()).horizontalAdvance(QStringLiteral("-0.00000"));
    for (int c = 0; c < m_tableModel->columnCount(); ++c) {
        const QString title = m_tableModel->headerData(c, Qt::Horizontal).toString();
        m_table->setColumnWidth(c, std::max(header.horizontalAdvance(title), number) + 16);
    }
}

} // namespace vexa

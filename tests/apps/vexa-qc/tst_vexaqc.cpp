#include "comparisonpage.h"
#include "mainwindow.h"
#include "recipepage.h"
#include "spectralpage.h"

#include <vexa/formula/formulatablemodel.h>
#include <vexa/formula/formulawidget.h>
#include <vexa/graph/metamerismview.h>
#include <vexa/graph/spectralplotwidget.h>
#include <vexa/graph/spectralvaluetablemodel.h>
#include <vexa/graph/spectralview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/jobdetailviewsettings.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/plots/colorplotwidget.h>
#include <vexa/plots/plotwidget.h>
#include <vexa/plots/trialgraphicsitem.h>
#include <vexa/tables/appearanceviewtablemodelrow.h>
#include <vexa/tables/floptablemodel.h>
#include <vexa/tables/floptablewidget.h>
#include <vexa/tables/multicolorvaluetablemodel.h>
#include <vexa/tables/multicolorvaluewidget.h>

#include <domain/colorant.h>
#include <domain/domainmetatypes.h>
#include <domain/formula.h>
#include <domain/recipetrial.h>
#include <domain/qcjob.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/tolerancevalue.h>
#include <domain/trial.h>
#include <settings/generalsettings.h>
#include <settings/settingsmanager.h>
#include <tolerances/tolerancefactory.h>

#include <common/testprerequisites.h>

#include <QComboBox>
#include <QJsonArray>
#include <QLabel>
#include <QJsonDocument>
#include <QJsonObject>
#include <QListWidget>
#include <QProcess>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QTabWidget>
#include <QTableView>
#include <QTableWidget>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

// The workstation end to end: the sample store created on first use, a job shown on
// one page whose views follow one selection model, and the batch mode's workbook.
class tst_VexaQc : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void pageShowsTheFirstJob();
    void tableAndPlotFollowTheTrialList();
    void tableAndPlotFollowTheGeometryFilter();
    void spectralPageFollowsTheSelection();
    void flopTableFollowsTheSelection();
    void recipePageShowsTheStoresFormulas();
    void anotherJobReplacesThePage();
    void toleranceSetThatCannotJudgeSaysWhy();
    void batchJudgeWritesTheWorkbook();
    void batchJudgeRejectsBadRequests_data();
    void batchJudgeRejectsBadRequests();

private:
    // The table rows selected in the view, as model rows.
    std::vector<std::shared_ptr<AppearanceViewTableModelRow>> selectedRows() const;

    QTemporaryDir m_dir;
    QString m_store;
    std::unique_ptr<MainWindow> m_window;
};

void tst_VexaQc::initTestCase()
{
    QVERIFY(m_dir.isValid());
    registerDomainMetaTypes();
    ToleranceFactory::toleranceFactory();
    SettingsManager::instance().setStorageLocation(m_dir.filePath("settings"));
    m_store = m_dir.filePath("store/sample.vexastore");
    auto viewSettings = std::make_shared<JobDetailViewSettings>();
    SettingsManager::instance().registerClientSettings(viewSettings);
    m_window = std::make_unique<MainWindow>(SettingsManager::instance().getGeneralSettings(), viewSettings);
    m_window->setMessageSink([](const QString &, const QString &text) { QFAIL(qPrintable(text)); });
    m_window->resize(1400, 900);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
}

std::vector<std::shared_ptr<AppearanceViewTableModelRow>> tst_VexaQc::selectedRows() const
{
    MultiColorValueWidget *table = m_window->page()->tableWidget();
    std::vector<std::shared_ptr<AppearanceViewTableModelRow>> rows;
    for (const QModelIndex &index : table->tableView()->selectionModel()->selectedRows())
        rows.push_back(table->tableModel()->rowAt(table->proxyModel()->mapToSource(index).row()));
    return rows;
}

void tst_VexaQc::pageShowsTheFirstJob()
{
    QSignalSpy shown(m_window.get(), &MainWindow::sgJobShown);
    m_window->openStore(m_store);
    QVERIFY(shown.wait(30000));
    QVERIFY(QFile::exists(m_store)); // created with the sample data on first use
    QCOMPARE(m_window->jobBox()->count(), 3);

    ComparisonPage *page = m_window->page();
    const auto data = page->dataModel();
    QVERIFY(data->qcJob());
    QVERIFY(data->standard());
    QCOMPARE(int(data->trials().size()), page->trialList()->count());
    QVERIFY(data->currentToleranceSet());
    // Every trial is active and the first one is selected.
    QCOMPARE(page->selectionModel()->activeTrials().size(), data->trials().size());
    QCOMPARE(page->selectionModel()->selectedTrial(), data->trials().front());
    // The table lists the standard and the trials at six geometries, with verdicts.
    const auto model = page->tableWidget()->tableModel();
    QCOMPARE(model->rowCount(), 6 * (1 + int(data->trials().size())));
}

void tst_VexaQc::tableAndPlotFollowTheTrialList()
{
    ComparisonPage *page = m_window->page();
    const auto trials = page->dataModel()->trials();
    page->trialList()->setCurrentRow(4);
    QCOMPARE(page->selectionModel()->selectedTrial(), trials[4]);

    // The table selects the trial's row at the selected geometry.
    const auto rows = selectedRows();
    QCOMPARE(rows.size(), size_t(1));
    QCOMPARE(rows.front()->trial(), trials[4]);
    QCOMPARE(rows.front()->geometry(), page->selectionModel()->selectedColorGeometry());

    // The a*b* plot marks that trial as selected.
    TrialGraphicsItem *item = page->plotWidget()->abPlot()->trialItem(trials[4]);
    QVERIFY(item);
    QTRY_VERIFY(item->isSelected());
    QVERIFY(!page->plotWidget()->abPlot()->trialItem(trials[0])->isSelected());

    // Un-ticking a trial removes it from the active trials and from the table.
    const int before = page->tableWidget()->tableModel()->rowCount();
    page->trialList()->item(7)->setCheckState(Qt::Unchecked);
    QVERIFY(!page->selectionModel()->isActive(trials[7]));
    QCOMPARE(page->tableWidget()->tableModel()->rowCount(), before - 6);
}

// The flop table beside the colour table lists the standard and every trial, judges the
// flop with the automotive ΔE set's flop tolerance while the page shows the CIELab set, and
// selects the row of the trial selected in the list.
void tst_VexaQc::flopTableFollowsTheSelection()
{
    ComparisonPage *page = m_window->page();
    FlopTableWidget *flop = page->flopWidget();
    QVERIFY(flop);
    const auto trials = page->dataModel()->trials();
    QCOMPARE(flop->tableModel()->rowCount(), 1 + int(trials.size()));
    QVERIFY(flop->tableModel()->flopTolerance());
    QVERIFY(flop->tableModel()->index(1, FlopTableModel::FlopDifferenceColumn).data(Qt::BackgroundRole).isValid());
    page->trialList()->setCurrentRow(6);
    const QModelIndexList selected = flop->tableView()->selectionModel()->selectedRows();
    QCOMPARE(selected.size(), 1);
    QCOMPARE(selected.first().row(), 7);
    QCOMPARE(flop->tableModel()->trialAt(7), trials[6]);
}

// The "Recipe" page lists the three recipes (first trial and correction) and the three
// formulas of the sample store, with their colorants loaded: amounts in any unit.
void tst_VexaQc::recipePageShowsTheStoresFormulas()
{
    RecipePage *recipes = m_window->recipePage();
    QTRY_COMPARE(recipes->recipeList()->count(), 6);
    QCOMPARE(recipes->recipeList()->item(0)->text(), QStringLiteral("Silver Metallic Recipe"));
    QCOMPARE(recipes->recipeList()->item(3)->text(), QStringLiteral("Silver Metallic"));
    QCOMPARE(recipes->recipes().front().size(), size_t(2));
    QVERIFY(m_window->showPage("recipe"));
    QVERIFY(!m_window->showPage("nonsense"));

    FormulaWidget *widget = recipes->formulaWidget();
    FormulaTableModel *model = widget->tableModel();
    QCOMPARE(model->recipeTrial()->name(), QStringLiteral("Silver Metallic Correction 1"));
    QCOMPARE(model->rowCount(), 4);
    widget->setUnit(FormulaUnits::FluidOunce);
    const int amount = model->columnOfKind(FormulaTableModel::ColumnKind::Amount);
    QCOMPARE(model->headerData(amount, Qt::Horizontal).toString(), QStringLiteral("Amount (fl oz)"));
    QCOMPARE(model->colorantAt(0)->name(), QStringLiteral("Clear Binder"));
    // 61 g of Clear Binder (1.02 g/ml) in fluid ounces.
    QVERIFY(std::fabs(model->valueAt(0, FormulaTableModel::ColumnKind::Amount) - 61.0 / 1.02 / 29.5735) < 1e-9);
    QVERIFY(model->problems().isEmpty());

    recipes->recipeList()->setCurrentRow(5);
    QCOMPARE(model->formula()->name(), QStringLiteral("Red Solid"));
    widget->setUnit(FormulaUnits::Gram);
    QVERIFY(m_window->showPage("comparison"));
}

void tst_VexaQc::tableAndPlotFollowTheGeometryFilter()
{
    ComparisonPage *page = m_window->page();
    QListWidget *geometries = page->geometryList();
    const QList<QListWidgetItem *> found = geometries->findItems("45as15", Qt::MatchExactly);
    QCOMPARE(found.size(), 1);
    found.front()->setCheckState(Qt::Checked);

    const Geometry g15("45as15");
    QCOMPARE(page->selectionModel()->selectedColorGeometry(), g15);
    const auto model = page->tableWidget()->tableModel();
    const int active = int(page->selectionModel()->activeTrials().size());
    QCOMPARE(model->rowCount(), 1 + active);
    for (int r = 0; r < model->rowCount(); ++r)
        QCOMPARE(model->rowAt(r)->geometry(), g15);
    // The plot follows the selected geometry ("Dynamic").
    QTRY_COMPARE(page->plotWidget()->abPlot()->shownGeometry(), g15);

    found.front()->setCheckState(Qt::Unchecked);
    QCOMPARE(model->rowCount(), 6 * (1 + active));
}

void tst_VexaQc::spectralPageFollowsTheSelection()
{
    ComparisonPage *page = m_window->page();
    QVERIFY(m_window->showPage("recipe"));
    // "spectra" brings the comparison page with its Spectra tab; "comparison" its colour views.
    QVERIFY(m_window->showPage("spectra"));
    QCOMPARE(m_window->pages()->currentWidget(), page);
    QCOMPARE(page->viewTabs()->currentWidget(), page->spectralPage());
    QVERIFY(!page->showViews("nonsense"));
    SpectralPage *spectral = page->spectralPage();
    const auto trials = page->dataModel()->trials();
    const QString name = trials[2]->name();

    page->trialList()->setCurrentRow(2);
    // The plot draws the selected trial last, after the standard.
    const auto &series = spectral->plot()->view()->data();
    QVERIFY(series.size() >= 2);
    QCOMPARE(QString::fromStdString(series.back()->name()), name);
    QCOMPARE(QString::fromStdString(series[series.size() - 2]->name()), page->dataModel()->standard()->name());
    // The table highlights its columns; the metamerism readout compares it at six geometries.
    const int column = spectral->tableModel()->columnOf(trials[2]);
    QVERIFY(column > 0);
    QCOMPARE(spectral->tableModel()->entryAt(column)->role, SpectralEntry::Role::SelectedTrial);
    QCOMPARE(spectral->tableModel()->rowCount(), 31);
    QVERIFY(spectral->metamerism()->titleLabel()->text().contains(name));
    QCOMPARE(spectral->metamerism()->table()->rowCount(), 6);

    // A click on another trial's column selects that trial everywhere.
    const int other = spectral->tableModel()->columnOf(trials[5]);
    QVERIFY(other > 0);
    QMetaObject::invokeMethod(spectral->tableView(), "clicked", Q_ARG(QModelIndex, spectral->tableModel()->index(3, other)));
    QCOMPARE(page->selectionModel()->selectedTrial(), trials[5]);
    QCOMPARE(page->trialList()->currentRow(), 5);

    // Every geometry of the selected trial.
    spectral->scopeBox()->setCurrentIndex(1);
    QCOMPARE(spectral->plot()->view()->data().size(), size_t(6));
    QCOMPARE(spectral->tableModel()->columnCount(), 1 + 6 * 3);
    QVERIFY(spectral->tableText().startsWith(QStringLiteral("nm\t")));
    spectral->scopeBox()->setCurrentIndex(0);
    QVERIFY(m_window->showPage("comparison"));
    QCOMPARE(page->viewTabs()->currentIndex(), 0);
}

void tst_VexaQc::toleranceSetThatCannotJudgeSaysWhy()
{
    ComparisonPage *page = m_window->page();
    const auto data = page->dataModel();
    const auto set = data->currentToleranceSet();
    QVERIFY(set);
    QVERIFY(page->toleranceWarning()->isHidden());
    const auto tolerance = set->tolerances().front();
    const auto limit = tolerance->toleranceValues().front();
    const double oldLimit = limit->valueAsDouble();
    const ColorimetricCondition condition = data->colorimetricCondition();
    auto refresh = [&] {
        data->setColorimetricCondition(ColorimetricCondition("A", "10"));
        data->setColorimetricCondition(condition);
    };
    limit->setValue(-1.0);
    refresh();
    QVERIFY(page->toleranceWarning()->isVisibleTo(page));
    QVERIFY2(page->toleranceWarning()->text().contains(tolerance->describe()), qPrintable(page->toleranceWarning()->text()));
    // The set's column shows no verdict colour at that tolerance's geometry: nothing is judged with it.
    const auto model = page->tableWidget()->tableModel();
    int column = -1;
    for (int c = 0; c < model->columnCount(); ++c) {
        if (model->headerData(c, Qt::Horizontal).toString() == set->name())
            column = c;
    }
    QVERIFY(column >= 0);
    int rows = 0;
    for (int r = 0; r < model->rowCount(); ++r) {
        if (model->rowAt(r)->geometry() != tolerance->geometryValue() || model->rowAt(r)->isStandard())
            continue;
        ++rows;
        QVERIFY(!model->index(r, column).data(Qt::BackgroundRole).isValid());
    }
    QVERIFY(rows > 1);
    limit->setValue(oldLimit);
    refresh();
    QVERIFY(page->toleranceWarning()->isHidden());
}

void tst_VexaQc::anotherJobReplacesThePage()
{
    QSignalSpy shown(m_window.get(), &MainWindow::sgJobShown);
    const int index = m_window->jobBox()->findText("Release Red Solid");
    QVERIFY(index >= 0);
    m_window->jobBox()->setCurrentIndex(index);
    QMetaObject::invokeMethod(m_window->jobBox(), "activated", Q_ARG(int, index));
    QVERIFY(shown.wait(30000));
    QCOMPARE(m_window->page()->dataModel()->qcJob()->name(), QStringLiteral("Release Red Solid"));
    QCOMPARE(m_window->page()->selectionModel()->selectedTrial()->name(), QStringLiteral("Red Solid T01"));
}

void tst_VexaQc::batchJudgeWritesTheWorkbook()
{
    const QString book = m_dir.filePath("silver.xlsx");
    QProcess qc;
    qc.start(VEXA_QC_PATH, {"--store", m_store, "--judge", "Release Silver Metallic", "--xlsx", book});
    QVERIFY(qc.waitForFinished(120000));
    const QString output = QString::fromUtf8(qc.readAllStandardOutput());
    // Some sample trials fail: the exit status says so.
    QCOMPARE(qc.exitCode(), 1);
    QVERIFY2(output.contains("30 trials"), qPrintable(output));

    // Read the workbook back with an independent reader.
    const char *script = R"(
import json, sys, openpyxl
wb = openpyxl.load_workbook(sys.argv[1])
v = wb["Verdicts"]
rows = [[c.value for c in r] for r in v.iter_rows(min_row=4)]
fills = {}
for r in v.iter_rows(min_row=4):
    cell = r[5]
    fills.setdefault(cell.value, set()).add(cell.fill.fgColor.rgb)
s = wb["Summary"]
summary = [[c.value for c in r] for r in s.iter_rows(min_row=2)]
print(json.dumps({"sheets": wb.sheetnames, "title": v["A1"].value, "header": [c.value for c in v[3]],
                  "rows": len(rows), "verdicts": sorted(set(r[5] for r in rows)),
                  "fills": {k: sorted(x) for k, x in fills.items()},
                  "numberFormat": v["E4"].number_format, "firstValue": v["E4"].value,
                  "summary": summary}))
)";
    REQUIRE_PYTHON_MODULES(QStringList{"openpyxl"});
    QProcess python;
    python.start(testprerequisites::python(), {"-c", script, book});
    QVERIFY(python.waitForFinished(60000));
    QVERIFY2(python.exitCode() == 0, python.readAllStandardError().constData());
    const QJsonObject json = QJsonDocument::fromJson(python.readAllStandardOutput()).object();
    QCOMPARE(json["sheets"].toArray().toVariantList(), (QVariantList{"Verdicts", "Summary"}));
    QVERIFY(json["title"].toString().startsWith("Release Silver Metallic"));
    QCOMPARE(json["header"].toArray().toVariantList(),
             (QVariantList{"Trial", "Measured", "Geometry", "Tolerance", "dE", "Verdict"}));
    QCOMPARE(json["rows"].toInt(), 30 * 6);
    QCOMPARE(json["verdicts"].toArray().toVariantList(), (QVariantList{"FAIL", "PASS", "WARNING"}));
    QCOMPARE(json["fills"].toObject()["PASS"].toArray().toVariantList(), QVariantList{"FF00914D"});
    QCOMPARE(json["fills"].toObject()["FAIL"].toArray().toVariantList(), QVariantList{"FFFF3D35"});
    QCOMPARE(json["numberFormat"].toString(), QStringLiteral("0.00"));
    QVERIFY(json["firstValue"].toDouble() > 0);
    int fails = 0;
    for (const QJsonValue &row : json["summary"].toArray())
        fails += row.toArray().at(1).toString() == "FAIL";
    QVERIFY(fails > 0);
    QVERIFY(output.contains(QStringLiteral("%1 fail").arg(fails)));
}

void tst_VexaQc::batchJudgeRejectsBadRequests_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QString>("message");
    QTest::newRow("unknown job") << QStringList{"--judge", "No Such Job", "--xlsx", "out.xlsx"}
                                 << "There is no QC job named \"No Such Job\"";
    QTest::newRow("no workbook") << QStringList{"--judge", "Release Red Solid"} << "--judge needs --xlsx FILE";
    QTest::newRow("bad condition") << QStringList{"--judge", "Release Red Solid", "--xlsx", "out.xlsx",
                                                  "--condition", "D66/10"}
                                   << "Unknown colorimetric condition";
    QTest::newRow("unwritable workbook") << QStringList{"--judge", "Release Red Solid", "--xlsx",
                                                        "/proc/vexa/out.xlsx"}
                                         << "could not be written";
}

void tst_VexaQc::batchJudgeRejectsBadRequests()
{
    QFETCH(QStringList, arguments);
    QFETCH(QString, message);
    QProcess qc;
    qc.setWorkingDirectory(m_dir.path());
    qc.start(VEXA_QC_PATH, QStringList{"--store", m_store} + arguments);
    QVERIFY(qc.waitForFinished(120000));
    QCOMPARE(qc.exitCode(), 2);
    const QString error = QString::fromUtf8(qc.readAllStandardError());
    QVERIFY2(error.contains(message), qPrintable(error));
}

QTEST_MAIN(tst_VexaQc)
#include "tst_vexaqc.moc"

// The flop table widget: it follows the page's selection both ways, formats the flop
// values, writes readable text on the verdict colours, and (with VEXA_SCREENSHOT_DIR set)
// leaves a picture of the sample data's silver metallic for the documentation.

#include "samplestore.h"
#include "tablefixtures.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/tables/columndefinition.h>
#include <vexa/tables/floptablemodel.h>
#include <vexa/tables/floptablewidget.h>
#include <vexa/widgets/verdictcolors.h>

#include <settings/generalsettings.h>
#include <tolerances/tolerancefactory.h>

#include <QCheckBox>
#include <QDir>
#include <QHeaderView>
#include <QStyledItemDelegate>
#include <QTableView>
#include <QtTest>

using namespace vexa;

class TestFlopTableWidget : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        ToleranceFactory::toleranceFactory();
        QLocale::setDefault(QLocale::c());
    }

    void shouldFollowTheSelectionBothWays()
    {
        auto page = tablefixtures::Page::make();
        FlopTableWidget widget(std::make_shared<GeneralSettings>());
        widget.setModels(page.data, page.selection);
        widget.resize(420, 200);
        widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&widget));
        QTableView *view = widget.tableView();

        page.selection->setSelectedTrial(page.trials[1]);
        QCOMPARE(view->selectionModel()->selectedRows().size(), 1);
        QCOMPARE(view->selectionModel()->selectedRows().first().row(), 2);

        QTest::mouseClick(view->viewport(), Qt::LeftButton, {}, view->visualRect(view->model()->index(3, 0)).center());
        QCOMPARE(page.selection->selectedTrial(), page.trials[2]);
        QCOMPARE(view->selectionModel()->selectedRows().first().row(), 3);
        // The standard's row selects no trial.
        QTest::mouseClick(view->viewport(), Qt::LeftButton, {}, view->visualRect(view->model()->index(0, 0)).center());
        QCOMPARE(page.selection->selectedTrial(), page.trials[2]);

        // The selection survives a rebuild; without a selected trial nothing is selected.
        page.data->setTrials({page.trials[2], page.trials[0]});
        QCOMPARE(view->selectionModel()->selectedRows().first().row(), 1);
        page.selection->setSelectedTrial(nullptr);
        QVERIFY(view->selectionModel()->selectedRows().isEmpty());
    }

    void shouldShowTheSelectedTrialAloneWhenTicked()
    {
        auto page = tablefixtures::Page::make();
        FlopTableWidget widget(std::make_shared<GeneralSettings>());
        widget.setModels(page.data, page.selection);
        page.selection->setSelectedTrial(page.trials[2]);
        widget.selectedTrialOnlyBox()->setChecked(true);
        QVERIFY(widget.tableModel()->selectedTrialOnly());
        QCOMPARE(widget.tableModel()->rowCount(), 2);
        QCOMPARE(widget.tableView()->selectionModel()->selectedRows().first().row(), 1);
        widget.selectedTrialOnlyBox()->setChecked(false);
        QCOMPARE(widget.tableModel()->rowCount(), 4);
    }

    void shouldFormatTheFlopValues()
    {
        FlopTableWidget widget(std::make_shared<GeneralSettings>());
        auto *delegate = qobject_cast<QStyledItemDelegate *>(widget.tableView()->itemDelegate());
        QVERIFY(delegate);
        QCOMPARE(delegate->displayText(12.3456, QLocale::c()), QStringLiteral("12.35"));
        QCOMPARE(delegate->displayText(-0.004, QLocale::c()), QStringLiteral("-0.00"));
        widget.setDecimals(3);
        QCOMPARE(delegate->displayText(12.3456, QLocale::c()), QStringLiteral("12.346"));
        QCOMPARE(delegate->displayText(QStringLiteral("T1"), QLocale::c()), QStringLiteral("T1"));
    }

    void shouldPaintTheSilverMetallic()
    {
        samplestore::SampleStore store;
        QVERIFY2(store.error.isEmpty(), qPrintable(store.error));
        const auto standard = store.standard("Silver Metallic");
        const auto trials = store.trialsOf(standard);
        auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition("D65", "10"));
        auto selection = std::make_shared<TrialSelectionModel>();
        data->setStandard(standard);
        data->setTrials(std::vector<std::shared_ptr<Trial>>(trials.begin(), trials.begin() + 12));
        data->setCurrentToleranceSet(data->toleranceSets().front());

        FlopTableWidget widget(std::make_shared<GeneralSettings>());
        widget.setModels(data, selection);
        widget.resize(460, 13 * 25 + 60);
        widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&widget));
        selection->setSelectedTrial(trials[3]);
        QTableView *view = widget.tableView();
        widget.resize(widget.width(), view->horizontalHeader()->height() + 13 * 25 + 2 * view->frameWidth()
                                          + widget.selectedTrialOnlyBox()->sizeHint().height() + 8);
        QCoreApplication::processEvents();

        const QImage image = widget.grab().toImage();
        QVERIFY(!image.isNull());
        // The verdict colours are painted: find the fail colour somewhere in the Δ column.
        QSet<QRgb> colours;
        const QRect column = view->visualRect(view->model()->index(1, 1)).united(
            view->visualRect(view->model()->index(12, 1)));
        const QPoint offset = view->viewport()->mapTo(&widget, QPoint(0, 0));
        for (int y = column.top(); y <= column.bottom(); y += 3)
            colours.insert(image.pixel(offset.x() + column.left() + 4, offset.y() + y) & 0xffffff);
        QVERIFY(colours.contains(QColor("#00914d").rgb() & 0xffffff));

        // The numbers on the verdict colours are written in black (readable on all three),
        // the others in the view's text colour.
        int verdictCells = 0;
        for (int r = 1; r < view->model()->rowCount(); ++r) {
            const QModelIndex index = view->model()->index(r, 1);
            const QColor background = VerdictColors::colorOfBackground(index.data(Qt::BackgroundRole));
            if (!background.isValid() || r == 4) // row 4 is selected: framed
                continue;
            ++verdictCells;
            const QRect cell = view->visualRect(index).adjusted(3, 3, -3, -3).translated(offset);
            int dark = 0, light = 0;
            for (int y = cell.top(); y <= cell.bottom(); ++y) {
                for (int x = cell.left(); x <= cell.right(); ++x) {
                    const double luminance = VerdictColors::relativeLuminance(image.pixelColor(x, y));
                    dark += luminance < 0.05 ? 1 : 0;
                    light += luminance > 0.8 ? 1 : 0;
                }
            }
            QVERIFY2(dark > 10 && light == 0, qPrintable(QStringLiteral("row %1: %2 dark, %3 light").arg(r).arg(dark).arg(light)));
        }
        QVERIFY(verdictCells >= 10);
        const QString target = qEnvironmentVariable("VEXA_SCREENSHOT_DIR");
        if (!target.isEmpty())
            QVERIFY(image.save(QDir(target).filePath("flop-table.png")));
    }
};

QTEST_MAIN(TestFlopTableWidget)
#include "tst_floptablewidget.moc"

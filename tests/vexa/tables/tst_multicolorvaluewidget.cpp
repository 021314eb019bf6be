// The colour table widget: selection in step with the TrialSelectionModel both ways,
// sorting with the selection mapped through the proxy, Ctrl+C, the context menu, exports,
// the configure-view dialog and printing - all without showing a modal dialog.

#include "export/dialogfixtures.h"
#include "tablefixtures.h"

#include <vexa/models/colorcomparesettings.h>
#include <vexa/tables/colortableconfiguredialog.h>
#include <vexa/tables/drawborderdelegate.h>
#include <vexa/tables/multicolorvaluetablemodel.h>
#include <vexa/tables/multicolorvaluewidget.h>
#include <vexa/export/tablecsvexporter.h>
#include <vexa/export/tableviewexportmodel.h>
#include <vexa/widgets/verdictcolors.h>

#include <domain/trial.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QHeaderView>
#include <QMenu>
#include <QMessageBox>
#include <QPrintDialog>
#include <QRegularExpression>
#include <QScrollBar>
#include <QPrinter>
#include <QSettings>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QTableView>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;
using tablefixtures::Page;

Q_DECLARE_METATYPE(std::string)

namespace {

struct Fixture
{
    Page page = Page::make();
    std::shared_ptr<ColorCompareSettings> settings = tablefixtures::colorSettings();
    std::shared_ptr<GeneralSettings> general = std::make_shared<GeneralSettings>();
    std::shared_ptr<MultiColorValueTableModel> model =
        std::make_shared<MultiColorValueTableModel>(settings, general);
    MultiColorValueWidget widget;

    Fixture()
    {
        widget.initialize(model, general, "Colour Table");
        widget.setModels(page.data, page.selection, true);
        widget.resize(900, 420);
    }

    QTableView *view() const { return widget.tableView(); }
    QSortFilterProxyModel *proxy() const { return widget.proxyModel(); }

    // The view row showing the model row.
    int viewRow(int modelRow) const { return proxy()->mapFromSource(model->index(modelRow, 0)).row(); }
    void click(int modelRow)
    {
        const QModelIndex index = proxy()->index(viewRow(modelRow), 1);
        const QRect rect = view()->visualRect(index);
        QTest::mouseClick(view()->viewport(), Qt::LeftButton, Qt::NoModifier, rect.center());
    }
    // Model rows of the selected view rows, in view order.
    QList<int> selectedModelRows() const
    {
        QList<int> rows;
        for (const QModelIndex &index : view()->selectionModel()->selectedRows())
            rows << proxy()->mapToSource(index).row();
        std::sort(rows.begin(), rows.end());
        return rows;
    }
};

} // namespace

class TestMultiColorValueWidget : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_settingsDir;

private Q_SLOTS:
    void initTestCase()
    {
        qRegisterMetaType<std::string>();
        ToleranceFactory::toleranceFactory();
        QCoreApplication::setOrganizationName("VexaTests");
        QCoreApplication::setApplicationName("tst_multicolorvaluewidget");
        QSettings::setDefaultFormat(QSettings::IniFormat);
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, m_settingsDir.path());
    }

    void shouldSetUpTheView()
    {
        Fixture f;
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        QCOMPARE(f.view()->selectionBehavior(), QAbstractItemView::SelectRows);
        QVERIFY(qobject_cast<DrawBorderDelegate *>(f.view()->itemDelegate()));
        // Text columns fit their contents; the number columns share the rest of the width.
        QCOMPARE(f.view()->horizontalHeader()->sectionResizeMode(0), QHeaderView::ResizeToContents);
        QCOMPARE(f.view()->horizontalHeader()->sectionResizeMode(2), QHeaderView::ResizeToContents);
        QCOMPARE(f.view()->horizontalHeader()->sectionResizeMode(3), QHeaderView::Stretch);
        QCOMPARE(f.view()->horizontalHeader()->sectionResizeMode(6), QHeaderView::Stretch);
        QCOMPARE(f.view()->verticalHeader()->defaultSectionSize(), 25);
        QCOMPARE(f.widget.windowTitle(), QStringLiteral("MultiColorValueWidget"));
        QCOMPARE(f.proxy()->rowCount(), 12);
        QCOMPARE(f.widget.tableModel(), f.model);
    }

    void clickOnATrialRowShouldSelectTrialAndGeometry()
    {
        Fixture f;
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        QSignalSpy trialSpy(f.page.selection.get(), &TrialSelectionModel::sgTrialSelectionChanged);
        QSignalSpy rowClicked(&f.widget, &MultiColorValueWidget::spectralGeometryRowClicked);
        f.click(7); // T2 at 45as45
        QCOMPARE(f.page.selection->selectedTrial(), f.page.trials[1]);
        QCOMPARE(f.page.selection->selectedColorGeometry(), Geometry("45as45"));
        QCOMPARE(trialSpy.count(), 1);
        QCOMPARE(f.selectedModelRows(), QList<int>{7});
        QCOMPARE(rowClicked.count(), 1);
        QCOMPARE(rowClicked.first().at(0).toInt(), 7);
        QCOMPARE(rowClicked.first().at(1).value<std::string>(), std::string("45as45"));
    }

    void clickOnTheStandardShouldChangeOnlyTheStandardGeometry()
    {
        Fixture f;
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        f.page.selection->setSelectedTrial(f.page.trials[0]);
        f.page.selection->setSelectedColorGeometry(Geometry("45as15"));
        QSignalSpy trialSpy(f.page.selection.get(), &TrialSelectionModel::sgTrialSelectionChanged);
        QSignalSpy geometrySpy(f.page.selection.get(), &TrialSelectionModel::sgColorGeometrySelectionChanged);
        QSignalSpy standardSpy(f.page.selection.get(), &TrialSelectionModel::sgStandardGeometryChanged);

        f.click(2); // the standard at 45as110
        QCOMPARE(standardSpy.count(), 1);
        QCOMPARE(f.page.selection->selectedStandardGeometry(), Geometry("45as110"));
        QCOMPARE(trialSpy.count(), 0);
        QCOMPARE(geometrySpy.count(), 0);
        QCOMPARE(f.page.selection->selectedTrial(), f.page.trials[0]);
        QCOMPARE(f.page.selection->selectedColorGeometry(), Geometry("45as15"));
        QCOMPARE(f.selectedModelRows(), QList<int>{2});
    }

    void selectionModelShouldSelectTheRow_data()
    {
        QTest::addColumn<int>("trial");
        QTest::addColumn<QString>("geometry");
        QTest::addColumn<int>("expectedRow");
        QTest::newRow("T1 at 45as15") << 0 << "45as15" << 3;
        QTest::newRow("T3 at 45as110") << 2 << "45as110" << 11;
        QTest::newRow("geometry not listed") << 1 << "15as15" << -1;
    }

    void selectionModelShouldSelectTheRow()
    {
        QFETCH(int, trial);
        QFETCH(QString, geometry);
        QFETCH(int, expectedRow);
        Fixture f;
        f.page.selection->setSelectedColorGeometry(Geometry(geometry));
        f.page.selection->setSelectedTrial(f.page.trials[size_t(trial)]);
        QCOMPARE(f.selectedModelRows(), expectedRow < 0 ? QList<int>() : QList<int>{expectedRow});
    }

    void standardGeometryShouldSelectTheStandardRow()
    {
        Fixture f;
        f.page.selection->setSelectedTrial(f.page.trials[0]);
        f.page.selection->setSelectedColorGeometry(Geometry("45as45"));
        QCOMPARE(f.selectedModelRows(), QList<int>{4});
        f.page.selection->setSelectedStandardGeometry(Geometry("45as110"));
        QCOMPARE(f.selectedModelRows(), QList<int>{2});
        // Without a standard the selection is only cleared.
        f.page.data->setStandard(nullptr);
        f.page.selection->setSelectedStandardGeometry(Geometry("45as15"));
        QVERIFY(f.selectedModelRows().isEmpty());
    }

    void selectionShouldSurviveARefresh()
    {
        Fixture f;
        f.page.selection->setSelectedTrial(f.page.trials[1]);
        f.page.selection->setSelectedColorGeometry(Geometry("45as110"));
        QCOMPARE(f.selectedModelRows(), QList<int>{8});
        f.page.data->setStandard(nullptr); // rows move up by three
        QCOMPARE(f.selectedModelRows(), QList<int>{5});
        QCOMPARE(f.model->rowAt(5)->trial(), f.page.trials[1]);
    }

    void sortingShouldKeepTheSelectionMappingRight()
    {
        Fixture f;
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        const int lColumn = 3;
        f.widget.onHeaderClicked(lColumn);
        QCOMPARE(f.proxy()->sortColumn(), lColumn);
        QCOMPARE(f.proxy()->sortOrder(), Qt::AscendingOrder);
        // The standard stays on top, the trials are ordered by L*.
        for (int r = 0; r < 3; ++r)
            QVERIFY(f.proxy()->index(r, 0).data(MultiColorValueTableModel::StandardRowRole).toBool());
        for (int r = 4; r < f.proxy()->rowCount(); ++r)
            QVERIFY(f.proxy()->index(r - 1, lColumn).data(Qt::UserRole + 20).toDouble()
                    <= f.proxy()->index(r, lColumn).data(Qt::UserRole + 20).toDouble());

        f.click(10); // T3 at 45as45, wherever it is now shown
        QCOMPARE(f.page.selection->selectedTrial(), f.page.trials[2]);
        QCOMPARE(f.page.selection->selectedColorGeometry(), Geometry("45as45"));

        f.widget.onHeaderClicked(lColumn);
        QCOMPARE(f.proxy()->sortOrder(), Qt::DescendingOrder);
        QVERIFY(f.proxy()->index(0, 0).data(MultiColorValueTableModel::StandardRowRole).toBool());
        f.page.selection->setSelectedTrial(f.page.trials[0]);
        QCOMPARE(f.selectedModelRows(), QList<int>{4}); // T1 at 45as45
        QCOMPARE(f.widget.selectedSourceIndexes().first().model(), f.model.get());
    }

    void ctrlCShouldCopyTheSelectedRows()
    {
        Fixture f;
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        QApplication::clipboard()->setText("stale");
        QTest::keyClick(f.view(), Qt::Key_C, Qt::ControlModifier);
        QCOMPARE(QApplication::clipboard()->text(), QString());

        f.view()->selectRow(f.viewRow(3));
        QTest::keyClick(f.view(), Qt::Key_C, Qt::ControlModifier);
        const QString text = QApplication::clipboard()->text();
        QStringList cells;
        for (int c = 0; c < f.model->columnCount(); ++c)
            cells << f.model->index(3, c).data().toString() + ' ';
        QCOMPARE(text, cells.join(QString()) + '\n');
        QVERIFY(text.startsWith("T1 45as15 "));

        // Other keys and modifiers copy nothing.
        QApplication::clipboard()->setText("kept");
        QTest::keyClick(f.view(), Qt::Key_C, Qt::ControlModifier | Qt::ShiftModifier);
        QTest::keyClick(&f.widget, Qt::Key_X, Qt::ControlModifier);
        QCOMPARE(QApplication::clipboard()->text(), QStringLiteral("kept"));
    }

    void ctrlCShouldCopyRowsInSelectionOrder()
    {
        Fixture f;
        auto *selection = f.view()->selectionModel();
        selection->select(f.proxy()->index(f.viewRow(9), 0),
                          QItemSelectionModel::Select | QItemSelectionModel::Rows);
        selection->select(f.proxy()->index(f.viewRow(0), 0),
                          QItemSelectionModel::Select | QItemSelectionModel::Rows);
        const QStringList lines = f.widget.selectedRowsText().split('\n', Qt::SkipEmptyParts);
        QCOMPARE(lines.size(), 2);
        QVERIFY(lines[0].startsWith("T3 45as15 "));
        QVERIFY(lines[1].startsWith("STD 45as15 "));
        QVERIFY(lines[0].endsWith(' '));
    }

    void contextMenuShouldOfferThreeActions()
    {
        Fixture f;
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        f.widget.onContextMenuRequested(QPoint(10, 10));
        f.widget.onContextMenuRequested(QPoint(12, 12)); // cleared, not duplicated
        QMenu *menu = f.widget.contextMenu();
        QVERIFY(menu);
        QStringList texts;
        for (QAction *action : menu->actions())
            texts << action->text();
        QCOMPARE(texts, (QStringList{"Export table to CSV", "Export table to Excel", "Print Snapshot"}));
        menu->hide();
    }

    void csvExportShouldWriteTheTable()
    {
        Fixture f;
        QTemporaryDir dir;
        const QString path = dir.filePath("colour.csv");
        {
            ChooseFile chooser(path);
            f.widget.onExportToCSV();
            QCOMPARE(chooser.shown, 1);
        }
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(QString::fromUtf8(file.readAll()), f.widget.tableToCSVString());
        const QStringList lines = f.widget.tableToCSVString().split('\n');
        QCOMPARE(lines.first(), QStringLiteral("Name;Geometry;Date/Time;L (D65/10);a (D65/10);b (D65/10);dE Set;"));
        QCOMPARE(lines.size(), 1 + 12 + 1); // header, rows, nothing after the last line feed
        QVERIFY(lines[1].startsWith("STD;45as15;;"));
        QVERIFY(lines[1].endsWith(";;")); // no verdict on the standard
        QVERIFY2(lines[4].startsWith("T1;45as15;") && lines[4].endsWith(" PASS;"), qPrintable(lines[4]));
        QVERIFY2(lines[7].endsWith(" WARNING;"), qPrintable(lines[7])); // T2 at 45as15
        QVERIFY2(lines[10].endsWith(" FAIL;"), qPrintable(lines[10])); // T3 at 45as15
        QVERIFY(QSettings().contains("UI/Colour Table/CSVExportPath"));
    }

    void decliningTheExcelPromptShouldExportNothing()
    {
        Fixture f;
        QTemporaryDir dir;
        QSettings().setValue("UI/Colour Table/ExcelExportPath", dir.path());
        QSignalSpy resets(f.model.get(), &QAbstractItemModel::modelReset);
        {
            ChooseFile chooser(QString{});
            f.widget.onExportToExcel();
            QCOMPARE(chooser.shown, 1);
        }
        QVERIFY(QDir(dir.path()).entryList(QDir::Files).isEmpty());
        QCOMPARE(QSettings().value("UI/Colour Table/ExcelExportPath").toString(), dir.path());
        QCOMPARE(resets.count(), 0);
        QVERIFY(!f.widget.findChild<QMessageBox *>("exportErrorBox"));
    }

    void excelExportShouldWriteTheSelectedRows()
    {
        REQUIRE_PYTHON_MODULES(testprerequisites::workbookReaderModules());
        Fixture f;
        QTemporaryDir dir;
        const QString path = dir.filePath("colour.xlsx");
        f.widget.onHeaderClicked(0); // sorted by name: view rows differ from model rows
        f.widget.onHeaderClicked(0);
        auto *selection = f.view()->selectionModel();
        selection->select(f.proxy()->index(f.viewRow(4), 0), QItemSelectionModel::Select | QItemSelectionModel::Rows);
        selection->select(f.proxy()->index(f.viewRow(9), 0), QItemSelectionModel::Select | QItemSelectionModel::Rows);
        {
            ChooseFile chooser(path);
            f.widget.onExportToExcel();
        }
        const QJsonObject cells = readWorkbook(path).value("Color Data").toObject().value("cells").toObject();
        QCOMPARE(cells.value("A1").toObject().value("v").toString(), QStringLiteral("Colour Table"));
        const int header = 5;
        QCOMPARE(cells.value(QStringLiteral("A%1").arg(header)).toObject().value("v").toString(),
                 QStringLiteral("Name"));
        // Model rows 4 and 9 on the lines of the rows the (sorted) view shows them in.
        const int line4 = header + 1 + f.viewRow(4);
        const int line9 = header + 1 + f.viewRow(9);
        QVERIFY(line4 != header + 1 + 4 || line9 != header + 1 + 9);
        QCOMPARE(cells.value(QStringLiteral("A%1").arg(line4)).toObject().value("v").toString(), QStringLiteral("T1"));
        QCOMPARE(cells.value(QStringLiteral("B%1").arg(line4)).toObject().value("v").toString(),
                 QStringLiteral("45as45"));
        QCOMPARE(cells.value(QStringLiteral("A%1").arg(line9)).toObject().value("v").toString(), QStringLiteral("T3"));
        QVERIFY(!cells.contains(QStringLiteral("A%1").arg(header + 1)));
        const QJsonObject verdict = cells.value(QStringLiteral("G%1").arg(line9)).toObject();
        QCOMPARE(verdict.value("fill").toString(),
                 f.model->index(9, 6).data(Qt::BackgroundRole).value<QColor>().name().mid(1).toUpper());
        QCOMPARE(cells.value(QStringLiteral("D%1").arg(line4)).toObject().value("fmt").toString(),
                 QStringLiteral("0.00"));
    }

    void failedExcelExportShouldSaySo()
    {
        Fixture f;
        {
            ChooseFile chooser(QStringLiteral("/nonexistent-folder/colour.xlsx"));
            f.widget.onExportToExcel();
        }
        auto *box = f.widget.findChild<QMessageBox *>("exportErrorBox");
        QVERIFY(box);
        QVERIFY(box->text().contains("nonexistent-folder"));
        box->close();
    }

    void configureViewShouldSwitchToLCh()
    {
        Fixture f;
        QStringList offered;
        RunDialogs choose([&offered](QDialog &dialog) {
            auto *configure = qobject_cast<ColorTableConfigureDialog *>(&dialog);
            if (!configure)
                return int(QDialog::Rejected);
            auto *combo = configure->findChild<QComboBox *>("colorSpaceCombo");
            for (int i = 0; i < combo->count(); ++i)
                offered << combo->itemText(i);
            combo->setCurrentIndex(1);
            return int(QDialog::Accepted);
        });
        f.widget.onConfigureView();
        QCOMPARE(offered, (QStringList{"L*a*b", "L*C*h"}));
        QCOMPARE(f.settings->enabledTableColorSpace(), EColorSpace::CIELCh);
        QCOMPARE(f.model->headerData(4, Qt::Horizontal).toString(), QStringLiteral("C\n(D65/10)"));
    }

    void cancelledConfigureViewShouldChangeNothing()
    {
        Fixture f;
        f.settings->tableColorSpaceCoordinatesSetting()->setSelectedValue("CIELabCh");
        RunDialogs cancel([](QDialog &dialog) {
            if (auto *combo = dialog.findChild<QComboBox *>("colorSpaceCombo"))
                combo->setCurrentIndex(1);
            return int(QDialog::Rejected);
        });
        f.widget.onConfigureView();
        QCOMPARE(f.settings->enabledTableColorSpace(), EColorSpace::CIELabCh);
    }

    void printShouldAskAndStopOnCancel()
    {
        Fixture f;
        QString title;
        RunDialogs cancel([&title](QDialog &dialog) {
            title = dialog.windowTitle();
            return int(QDialog::Rejected);
        });
        f.widget.print();
        QCOMPARE(title, QStringLiteral("Print Visual"));
    }

    void shouldCountSelectedRows()
    {
        Fixture f;
        QSignalSpy selected(&f.widget, &MultiColorValueWidget::spectralGeometryRowsSelected);
        f.view()->selectRow(f.viewRow(5));
        QVERIFY(!selected.isEmpty());
        QCOMPARE(selected.last().at(0).toInt(), 1);
        f.widget.clearSelections();
        QCOMPARE(selected.last().at(0).toInt(), 0);
    }

    // What the user sees is what is exported and printed: the view's sort order, without the
    // columns the view hides.
    void exportsAndPrintFollowTheView()
    {
        REQUIRE_PYTHON_MODULES(testprerequisites::workbookReaderModules());
        Fixture f;
        f.widget.onHeaderClicked(0);
        f.widget.onHeaderClicked(0); // by name, descending: T3 first (the standard stays on top)
        f.view()->setColumnHidden(1, true); // no Geometry column
        QString expected = QStringLiteral("Name;Date/Time;L (D65/10);a (D65/10);b (D65/10);dE Set;\n");
        const auto *proxy = f.proxy();
        for (int r = 0; r < proxy->rowCount(); ++r) {
            for (int c : {0, 2, 3, 4, 5, 6}) {
                const QModelIndex index = proxy->index(r, c);
                const QString verdict = TableCSVExporter::verdictOfBackground(index.data(Qt::BackgroundRole));
                const QString text = index.data().toString();
                expected += (verdict.isEmpty() ? text : text + " " + verdict) + ";";
            }
            expected += "\n";
        }
        const QString csv = f.widget.tableToCSVString();
        QCOMPARE(csv, expected);
        QVERIFY(csv.indexOf("\nT3;") < csv.indexOf("\nT1;"));
        QVERIFY(!csv.contains("45as"));

        QTemporaryDir dir;
        const QString path = dir.filePath("shown.csv");
        {
            ChooseFile chooser(path);
            f.widget.onExportToCSV();
        }
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(QString::fromUtf8(file.readAll().mid(3)), expected);

        const QString book = dir.filePath("shown.xlsx");
        {
            ChooseFile chooser(book);
            f.widget.onExportToExcel();
        }
        const QJsonObject cells = readWorkbook(book).value("Color Data").toObject().value("cells").toObject();
        const int header = 5;
        QCOMPARE(cells.value(QStringLiteral("B%1").arg(header)).toObject().value("v").toString(),
                 QStringLiteral("Date/Time"));
        QCOMPARE(cells.value(QStringLiteral("A%1").arg(header + 1 + 3)).toObject().value("v").toString(),
                 QStringLiteral("T3"));

        // The printed table: the same rows in the same order, every row, through the print dialog.
        const QString pdf = dir.filePath("shown.pdf");
        PrintToPdf print(pdf);
        QVERIFY(f.widget.printTable());
        QVERIFY(QFileInfo(pdf).size() > 500);
        auto shown = f.widget.exportModel();
        QCOMPARE(shown->columnCount(), 6);
        QCOMPARE(shown->rowCount(), proxy->rowCount());
        QCOMPARE(shown->index(3, 0).data().toString(), QStringLiteral("T3"));
    }

    // Black or white text, whichever reads better (WCAG 4.5:1 for normal text) on every verdict.
    void verdictTextsAreReadable()
    {
        Fixture f;
        int verdicts = 0;
        for (int r = 0; r < f.model->rowCount(); ++r) {
            const QModelIndex index = f.model->index(r, 6);
            const QVariant background = index.data(Qt::BackgroundRole);
            if (!background.isValid())
                continue;
            ++verdicts;
            const QColor text = index.data(Qt::ForegroundRole).value<QColor>();
            const double ratio = VerdictColors::contrastRatio(text, background.value<QColor>());
            QVERIFY2(ratio >= 4.5, qPrintable(QStringLiteral("%1 on %2: %3:1")
                                                  .arg(text.name(), background.value<QColor>().name())
                                                  .arg(ratio, 0, 'f', 2)));
        }
        QCOMPARE(verdicts, 9);
        for (const QColor &verdict : {VerdictColors::passColor(), VerdictColors::warningColor(), VerdictColors::failColor()})
            QVERIFY(VerdictColors::contrastRatio(VerdictColors::readableTextColor(verdict), verdict) >= 4.5);
    }

    // Long trial names and dates are shown whole at the table's usual size, not elided.
    void textColumnsShowWholeTexts()
    {
        Fixture f;
        f.page.trials[1]->setName(QStringLiteral("Production batch 2024-11 line 3 after recoat"));
        f.page.data->setTrials(f.page.trials);
        f.widget.resize(900, 420);
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        const QHeaderView *header = f.view()->horizontalHeader();
        for (int c : {0, 2}) {
            int widest = 0;
            for (int r = 0; r < f.proxy()->rowCount(); ++r)
                widest = std::max(widest, f.proxy()->index(r, c).data(Qt::SizeHintRole).toSize().width());
            QVERIFY2(header->sectionSize(c) >= widest,
                     qPrintable(QStringLiteral("column %1: %2 px for %3 px of text").arg(c).arg(header->sectionSize(c)).arg(widest)));
        }
        // The number columns still share the rest.
        QVERIFY(header->sectionSize(3) > 40);
    }

    // Too narrow for every header: the number columns keep room for their headers' longest word
    // (the header wraps the rest) and the table scrolls sideways rather than cutting a tolerance
    // set's name; wide again, they stretch.
    void numberColumnsKeepTheirHeadersWhenNarrow()
    {
        Fixture f;
        f.page.toleranceSet->setName(QStringLiteral("Automotive CIEDE2000 supplier B"));
        f.page.data->setStandard(f.page.standard); // same standard: nothing changes
        f.widget.settingsChanged();
        f.widget.resize(420, 300);
        f.widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&f.widget));
        QHeaderView *header = f.view()->horizontalHeader();
        for (int c = 3; c < f.proxy()->columnCount(); ++c) {
            const QFontMetrics metrics(f.proxy()->headerData(c, Qt::Horizontal, Qt::FontRole).value<QFont>());
            int widest = 0;
            for (const QString &word : f.proxy()->headerData(c, Qt::Horizontal).toString().split(QRegularExpression("\\s+")))
                widest = std::max(widest, metrics.horizontalAdvance(word));
            QVERIFY2(header->sectionSize(c) >= widest,
                     qPrintable(QStringLiteral("column %1: %2 < %3").arg(c).arg(header->sectionSize(c)).arg(widest)));
        }
        QVERIFY(f.view()->horizontalScrollBar()->maximum() > 0);
        f.widget.resize(1600, 300);
        QTRY_COMPARE(header->sectionResizeMode(3), QHeaderView::Stretch);
        QCOMPARE(f.view()->horizontalScrollBar()->maximum(), 0);
    }

    void uninitializedWidgetShouldNotCrash()
    {
        MultiColorValueWidget widget;
        widget.onExportToCSV();
        widget.onExportToExcel();
        widget.onConfigureView();
        widget.onRowClicked(QModelIndex());
        widget.onHeaderClicked(3);
        widget.refreshAll();
        QCOMPARE(widget.tableToCSVString(), QString());
        widget.setModels(nullptr, nullptr, false);
        QVERIFY(widget.selectedRowsText().isEmpty());
    }
};

QTEST_MAIN(TestMultiColorValueWidget)
#include "tst_multicolorvaluewidget.moc"

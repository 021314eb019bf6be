// Excel export: workbooks written through XlsxDocument and read back by openpyxl.
// Values, number formats, verdict fills, stacked tables, selections that keep row
// positions, the job detail workbook and save failures.

#include "export/dialogfixtures.h"
#include "fixturetablemodel.h"

#include <vexa/export/jobdetailviewexcelexporter.h>
#include <vexa/export/tableexcelexporter.h>
#include <vexa/export/xlsxdocument.h>
#include <vexa/models/appearanceviewdatamodel.h>

#include <domain/standard.h>
#include <settings/generalsettings.h>

#include <QBrush>
#include <QDateTime>
#include <QJsonArray>
#include <QSettings>
#include <QTemporaryDir>
#include <QtTest>

#include <cmath>
#include <unistd.h>

using namespace vexa;

namespace {

using Cell = FixtureTableModel::Cell;

Cell text(const QString &display)
{
    return Cell{display, QVariant(), QVariant(), QVariant()};
}

Cell number(double value, const QString &format = QString(), const QVariant &background = QVariant())
{
    return Cell{QString::number(value, 'f', 2), background, value, format.isEmpty() ? QVariant() : format};
}

// Rows "Rn" with the number n in the second column.
std::shared_ptr<FixtureTableModel> numberedTable(int rows)
{
    QVector<QVector<Cell>> cells;
    for (int r = 0; r < rows; ++r)
        cells << QVector<Cell>{text(QStringLiteral("R%1").arg(r)), number(r, "0.0")};
    return std::make_shared<FixtureTableModel>(QStringList{"Name", "Value"}, cells);
}

QJsonObject cellsOf(const QJsonObject &workbook, const QString &sheet)
{
    return workbook.value(sheet).toObject().value("cells").toObject();
}

QJsonObject cell(const QJsonObject &cells, const QString &ref)
{
    return cells.value(ref).toObject();
}

} // namespace

class TestTableExcelExporter : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QTemporaryDir m_settingsDir;

    QJsonObject saveAndRead(XlsxDocument &document, const QString &name)
    {
        const QString path = m_dir.filePath(name);
        if (!document.saveAs(path)) {
            qWarning() << document.errorString();
            return QJsonObject();
        }
        QString error;
        const QJsonObject workbook = readWorkbook(path, &error);
        if (workbook.isEmpty())
            qWarning() << "openpyxl could not read" << path << error;
        return workbook;
    }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_dir.isValid());
        QCoreApplication::setOrganizationName("VexaTests");
        QCoreApplication::setApplicationName("tst_tableexcelexporter");
        QSettings::setDefaultFormat(QSettings::IniFormat);
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, m_settingsDir.path());
        REQUIRE_PYTHON_MODULES(testprerequisites::workbookReaderModules());
    }

    void shouldWriteValuesFormatsAndVerdictFills()
    {
        const QDateTime stamp(QDate(2024, 3, 5), QTime(14, 7, 9), Qt::LocalTime);
        auto model = std::make_shared<FixtureTableModel>(
            QStringList{"Name", "L\n(D65/10)", "dE Set", "Date/Time", "Note"},
            QVector<QVector<Cell>>{
                {text("T1"), number(50.1234, "0.00"), number(0.5, "0.00", QColor("#00914d")),
                 Cell{"2024-03-05", QVariant(), stamp, QVariant()}, text("ok")},
                {text("T2"), number(51.5), number(1.7, "0.000", QColor("#FF3D35")),
                 Cell{"", QVariant(), QVariant(), QVariant()}, Cell{"12", QVariant(), QVariant(12), QVariant()}},
                {text("T3"), Cell{"n/a", QVariant(), QVariant(), QVariant()},
                 number(0.9, "0.00", QBrush(QColor("#f2e000"))), text(""), Cell{"x", QColor("#123456"), "x", {}}},
            });
        XlsxDocument document;
        TableExcelExporter exporter(document);
        exporter.setTableModel(model);
        int row = 1;
        QVERIFY(exporter.exportToSelectedSheet(row, {}));
        QCOMPARE(row, 5);

        const QJsonObject workbook = saveAndRead(document, "values.xlsx");
        QCOMPARE(workbook.value("sheets").toArray(), QJsonArray{"Sheet1"});
        const QJsonObject cells = cellsOf(workbook, "Sheet1");

        QCOMPARE(cell(cells, "B1").value("v").toString(), QStringLiteral("L (D65/10)"));
        QCOMPARE(cell(cells, "C1").value("v").toString(), QStringLiteral("dE Set"));
        QCOMPARE(cell(cells, "A2").value("v").toString(), QStringLiteral("T1"));
        QCOMPARE(cell(cells, "A2").value("t").toString(), QStringLiteral("s"));

        QCOMPARE(cell(cells, "B2").value("v").toDouble(), 50.1234);
        QCOMPARE(cell(cells, "B2").value("t").toString(), QStringLiteral("n"));
        QCOMPARE(cell(cells, "B2").value("fmt").toString(), QStringLiteral("0.00"));
        QVERIFY(cell(cells, "B2").value("fill").isNull());
        QCOMPARE(cell(cells, "B3").value("fmt").toString(), QStringLiteral("##.####")); // none given

        QCOMPARE(cell(cells, "C2").value("fill").toString(), QStringLiteral("00914D"));
        QCOMPARE(cell(cells, "C3").value("fill").toString(), QStringLiteral("FF3D35"));
        QCOMPARE(cell(cells, "C3").value("fmt").toString(), QStringLiteral("0.000"));
        QCOMPARE(cell(cells, "C4").value("fill").toString(), QStringLiteral("F2E000"));
        QCOMPARE(cell(cells, "C4").value("v").toDouble(), 0.9);

        QVERIFY(cell(cells, "D2").value("date").toBool());
        QCOMPARE(cell(cells, "D2").value("v").toString(), QStringLiteral("2024-03-05T14:07:09"));

        // No export value: the display text is written as text.
        QCOMPARE(cell(cells, "B4").value("v").toString(), QStringLiteral("n/a"));
        // An integer export value is no floating-point number: written as its text.
        QCOMPARE(cell(cells, "E3").value("v").toString(), QStringLiteral("12"));
        // Other backgrounds are no verdicts and are not filled.
        QVERIFY(cell(cells, "E4").value("fill").isNull());
        QVERIFY(!cells.contains("D3"));
    }

    void shouldKeepRowPositionsOfASelection()
    {
        auto model = numberedTable(6);
        XlsxDocument document;
        TableExcelExporter exporter(document);
        exporter.setTableModel(model);
        int row = 1;
        QVERIFY(exporter.exportToSelectedSheet(row, {model->index(2, 1), model->index(5, 0), model->index(5, 1)}));
        QCOMPARE(row, 8); // header plus all six model rows

        const QJsonObject cells = cellsOf(saveAndRead(document, "selection.xlsx"), "Sheet1");
        QCOMPARE(cell(cells, "A1").value("v").toString(), QStringLiteral("Name"));
        QCOMPARE(cell(cells, "A4").value("v").toString(), QStringLiteral("R2"));
        QCOMPARE(cell(cells, "B4").value("v").toDouble(), 2.0);
        QCOMPARE(cell(cells, "A7").value("v").toString(), QStringLiteral("R5"));
        for (const char *empty : {"A2", "A3", "A5", "A6", "B2", "B6"})
            QVERIFY2(!cells.contains(empty), qPrintable(empty));
        QCOMPARE(cells.size(), 2 + 2 + 2);
    }

    void shouldIgnoreIndexesOfOtherModels()
    {
        auto model = numberedTable(3);
        auto other = numberedTable(3);
        XlsxDocument document;
        TableExcelExporter exporter(document);
        exporter.setTableModel(model);
        int row = 1;
        QVERIFY(exporter.exportToSelectedSheet(row, {other->index(1, 0)}));
        // A selection that covers none of the rows writes the header only.
        QCOMPARE(document.lastRow(), 1);
        QCOMPARE(row, 5);
    }

    void shouldStackTablesOnOneSheet()
    {
        XlsxDocument document;
        TableExcelExporter exporter(document);
        exporter.setTableModel(numberedTable(2));
        int row = 0; // below 1 becomes 1
        QVERIFY(exporter.exportToSelectedSheet(row, {}));
        QCOMPARE(row, 4);
        exporter.setTableModel(std::shared_ptr<QAbstractTableModel>(
            FixtureTableModel::fromTexts({"Other"}, {{"o1"}})));
        QVERIFY(exporter.exportToSelectedSheet(row, {}));
        QCOMPARE(row, 6);

        const QJsonObject cells = cellsOf(saveAndRead(document, "stacked.xlsx"), "Sheet1");
        QCOMPARE(cell(cells, "A1").value("v").toString(), QStringLiteral("Name"));
        QCOMPARE(cell(cells, "A3").value("v").toString(), QStringLiteral("R1"));
        QCOMPARE(cell(cells, "A4").value("v").toString(), QStringLiteral("Other"));
        QCOMPARE(cell(cells, "A5").value("v").toString(), QStringLiteral("o1"));
    }

    void shouldWriteNothingWithoutAModel()
    {
        XlsxDocument document;
        TableExcelExporter exporter(document);
        int row = 3;
        QVERIFY(!exporter.exportToSelectedSheet(row, {}));
        QCOMPARE(row, 3);
        QVERIFY(document.sheetNames().isEmpty());
    }

    void documentShouldKeepSheetsWidthsHeightsAndImages()
    {
        XlsxDocument document;
        QVERIFY(document.addSheet("Data"));
        QVERIFY(!document.addSheet("data"));          // names are unique regardless of case
        QVERIFY(!document.addSheet("a/b"));           // Excel refuses these characters
        QVERIFY(!document.addSheet(QString(32, 'x'))); // and names past 31 characters
        QVERIFY(document.addSheet());
        QCOMPARE(document.sheetNames(), (QStringList{"Data", "Sheet2"}));
        QVERIFY(document.selectSheet("Data"));
        QVERIFY(document.write(1, 1, 3.5));
        QVERIFY(document.write(1, 2, true));
        QVERIFY(document.write(1, 3, QDate(2024, 1, 2)));
        XlsxFormat bold;
        bold.setFontBold(true);
        QVERIFY(document.write(2, 1, "bold", bold));
        QVERIFY(!document.write(0, 1, "outside"));
        QVERIFY(!document.write(1, XlsxDocument::MaxColumns + 1, "outside"));
        QVERIFY(document.write(3, 1, std::nan(""))); // NaN: a blank cell, not a broken file
        QVERIFY(document.setColumnWidth(1, 2, 20));
        QVERIFY(document.setRowHeight(2, 30));
        QImage image(40, 20, QImage::Format_ARGB32);
        image.fill(Qt::blue);
        QVERIFY(document.insertImage(4, 2, image));
        QVERIFY(!document.insertImage(4, 2, QImage()));
        QCOMPARE(document.read(1, 1).toDouble(), 3.5);
        QVERIFY(document.cellFormat(2, 1).fontBold());
        QVERIFY(document.selectSheet("Sheet2"));
        QVERIFY(document.write(1, 1, "second"));

        const QJsonObject workbook = saveAndRead(document, "document.xlsx");
        QCOMPARE(workbook.value("sheets").toArray(), (QJsonArray{"Data", "Sheet2"}));
        const QJsonObject data = workbook.value("Data").toObject();
        const QJsonObject cells = data.value("cells").toObject();
        QCOMPARE(cell(cells, "A1").value("v").toDouble(), 3.5);
        QCOMPARE(cell(cells, "B1").value("v").toBool(), true);
        QCOMPARE(cell(cells, "C1").value("v").toString(), QStringLiteral("2024-01-02T00:00:00"));
        QVERIFY(cell(cells, "A2").value("bold").toBool());
        QVERIFY(!cells.contains("A3") || cell(cells, "A3").value("v").isNull());
        QVERIFY(qAbs(data.value("widths").toObject().value("A").toDouble() - 20.0) < 1.0);
        QCOMPARE(data.value("heights").toObject().value("2").toDouble(), 30.0);
        QCOMPARE(data.value("images").toArray(), (QJsonArray{QJsonArray{4, 2}}));
        QCOMPARE(cellsOf(workbook, "Sheet2").value("A1").toObject().value("v").toString(), QStringLiteral("second"));
    }

    void shouldReportASaveThatFails_data()
    {
        QTest::addColumn<QString>("path");
        QTest::newRow("missing folder") << m_dir.filePath("no/such/folder/x.xlsx");
        QTest::newRow("no name") << QString();
        QTest::newRow("a folder in the way") << m_dir.path();
    }

    void shouldReportASaveThatFails()
    {
        QFETCH(QString, path);
        XlsxDocument document;
        document.write(1, 1, "data");
        QVERIFY(!document.saveAs(path));
        QVERIFY(!document.errorString().isEmpty());
        // The document is kept and can still be saved elsewhere.
        QVERIFY(document.saveAs(m_dir.filePath("retry.xlsx")));
        QVERIFY(document.errorString().isEmpty());
    }

    void shouldLeaveAnExistingFileIntactWhenTheFolderIsReadOnly()
    {
        if (geteuid() == 0)
            QSKIP("root writes into read-only folders");
        QTemporaryDir dir;
        const QString path = dir.filePath("kept.xlsx");
        XlsxDocument first;
        first.write(1, 1, "first");
        QVERIFY(first.saveAs(path));
        QFile::setPermissions(dir.path(), QFileDevice::ReadOwner | QFileDevice::ExeOwner);
        XlsxDocument second;
        second.write(1, 1, "second");
        QVERIFY(!second.saveAs(path));
        QFile::setPermissions(dir.path(), QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
        QCOMPARE(cell(cellsOf(readWorkbook(path), "Sheet1"), "A1").value("v").toString(), QStringLiteral("first"));
    }

    void jobDetailExportShouldPutTheTableUnderATitle()
    {
        auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition("D65", "10"));
        auto standard = std::make_shared<Standard>();
        standard->setName("Silver STD");
        data->setStandard(standard);
        auto model = numberedTable(4);

        QSettings().remove("UI/Job Detail/ExcelExportPath");
        JobDetailViewExcelExporter exporter(std::make_shared<GeneralSettings>(), "Job Detail");
        const QString path = m_dir.filePath("job.xlsx");
        {
            ChooseFile chooser(path);
            QVERIFY(exporter.promptForFilename());
            QCOMPARE(chooser.shownFilter, QStringLiteral("Excel Workbook (*.xlsx)"));
        }
        QCOMPARE(exporter.fileName(), path);
        QCOMPARE(QSettings().value("UI/Job Detail/ExcelExportPath").toString(), QDir(m_dir.path()).absolutePath());
        exporter.setModels(data);
        exporter.setColorDataTableModel(model);
        QVERIFY2(exporter.exportToFile({model->index(1, 0), model->index(3, 1)}), qPrintable(exporter.errorString()));

        const QJsonObject workbook = readWorkbook(path);
        QCOMPARE(workbook.value("sheets").toArray(), QJsonArray{"Color Data"});
        const QJsonObject cells = cellsOf(workbook, "Color Data");
        QCOMPARE(cell(cells, "A1").value("v").toString(), QStringLiteral("Job Detail"));
        QVERIFY(cell(cells, "A1").value("bold").toBool());
        QCOMPARE(cell(cells, "B2").value("v").toString(), QStringLiteral("Silver STD"));
        QCOMPARE(cell(cells, "B3").value("v").toString(), QStringLiteral("D65/10"));
        const int header = JobDetailViewExcelExporter::TableFirstRow;
        QCOMPARE(cell(cells, QStringLiteral("A%1").arg(header)).value("v").toString(), QStringLiteral("Name"));
        QVERIFY(!cells.contains(QStringLiteral("A%1").arg(header + 1)));
        QCOMPARE(cell(cells, QStringLiteral("A%1").arg(header + 2)).value("v").toString(), QStringLiteral("R1"));
        QVERIFY(!cells.contains(QStringLiteral("A%1").arg(header + 3)));
        QCOMPARE(cell(cells, QStringLiteral("B%1").arg(header + 4)).value("v").toDouble(), 3.0);
    }

    void jobDetailExportShouldSayWhyItFailed()
    {
        JobDetailViewExcelExporter exporter(std::make_shared<GeneralSettings>(), "Failing");
        {
            ChooseFile chooser(QString{});
            QVERIFY(!exporter.promptForFilename());
        }
        QVERIFY(exporter.fileName().isEmpty());
        QVERIFY(!exporter.exportToFile());
        QVERIFY(!exporter.errorString().isEmpty());

        exporter.setFileName(m_dir.filePath("no-table.xlsx"));
        QVERIFY(!exporter.exportToFile());
        QVERIFY(!exporter.errorString().isEmpty());
        QVERIFY(!QFile::exists(m_dir.filePath("no-table.xlsx")));

        exporter.setColorDataTableModel(numberedTable(1));
        exporter.setFileName(m_dir.filePath("missing/folder.xlsx"));
        QVERIFY(!exporter.exportToFile());
        QVERIFY(exporter.errorString().contains("folder"));
    }
};

QTEST_MAIN(TestTableExcelExporter)
#include "tst_tableexcelexporter.moc"

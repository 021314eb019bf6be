// Delimited-text export: the exact text of a table, verdict words, the save prompt
// with its remembered folder, and write errors.

#include "export/dialogfixtures.h"
#include "fixturetablemodel.h"

#include <vexa/export/dialogrunner.h>
#include <vexa/export/savefileprompt.h>
#include <vexa/export/tablecsvexporter.h>

#include <settings/generalsettings.h>

#include <QBrush>
#include <QJsonArray>
#include <QJsonDocument>
#include <QLocale>
#include <QProcess>
#include <QFileDialog>
#include <QSettings>
#include <QTemporaryDir>
#include <QtTest>

#include <memory>

using namespace vexa;

namespace {

// "text@#rrggbb" gives a cell with that background colour, "text@brush:#rrggbb" a brush,
// "text@plain:xyz" a background given as plain text.
std::shared_ptr<QAbstractTableModel> tableOf(const QStringList &headers, const QVector<QStringList> &rows)
{
    QVector<QVector<FixtureTableModel::Cell>> cells;
    for (const QStringList &line : rows) {
        QVector<FixtureTableModel::Cell> row;
        for (const QString &description : line) {
            FixtureTableModel::Cell cell;
            const int at = description.lastIndexOf('@');
            cell.display = at < 0 ? description : description.left(at);
            const QString background = at < 0 ? QString() : description.mid(at + 1);
            if (background.startsWith("brush:"))
                cell.background = QBrush(QColor(background.mid(6)));
            else if (background.startsWith("plain:"))
                cell.background = background.mid(6);
            else if (!background.isEmpty())
                cell.background = QColor(background);
            row << cell;
        }
        cells << row;
    }
    return std::make_shared<FixtureTableModel>(headers, cells);
}


QByteArray readAll(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class TestTableCSVExporter : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_settingsDir;

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_settingsDir.isValid());
        QCoreApplication::setOrganizationName("VexaTests");
        QCoreApplication::setApplicationName("tst_tablecsvexporter");
        QSettings::setDefaultFormat(QSettings::IniFormat);
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, m_settingsDir.path());
        // Numbers and delimiters as in the C locale unless a test says otherwise.
        QLocale::setDefault(QLocale::c());
    }

    void cleanup() { QLocale::setDefault(QLocale::c()); }

    void shouldWriteTheTableExactly_data()
    {
        QTest::addColumn<QString>("delimiter");
        QTest::addColumn<QStringList>("headers");
        QTest::addColumn<QVector<QStringList>>("rows");
        QTest::addColumn<QString>("expected");

        QTest::newRow("two columns, semicolon")
            << ";" << QStringList{"L*", "a*"} << QVector<QStringList>{{"50.12", "-1.30"}}
            << "L*;a*;\n50.12;-1.30;\n";
        QTest::newRow("fail verdict after the text")
            << ";" << QStringList{"Name", "dE"} << QVector<QStringList>{{"T1", "1.23@#ff3d35"}}
            << "Name;dE;\nT1;1.23 FAIL;\n";
        QTest::newRow("all three verdicts, colours in any case")
            << "," << QStringList{"A", "B", "C"}
            << QVector<QStringList>{{"0.10@#00914d", "0.90@#F2E000", "2.00@#FF3D35"}}
            << "A,B,C,\n0.10 PASS,0.90 WARNING,2.00 FAIL,\n";
        QTest::newRow("brush and text backgrounds")
            << ";" << QStringList{"A", "B", "C"}
            << QVector<QStringList>{{"1@brush:#00914d", "2@plain:#ff3d35", "3@#123456"}}
            << "A;B;C;\n1 PASS;2 FAIL;3;\n";
        QTest::newRow("line feeds in headers become blanks")
            << ";" << QStringList{"L\n(D65/10)", "two\nline\nfeeds"} << QVector<QStringList>{{"1", "2"}}
            << "L (D65/10);two line feeds;\n1;2;\n";
        QTest::newRow("delimiters and quotes pass unchanged")
            << ";" << QStringList{"Name"} << QVector<QStringList>{{"a;b \"c\""}} << "Name;\na;b \"c\";\n";
        QTest::newRow("tab delimiter, empty cells keep their delimiter")
            << "\t" << QStringList{"A", "B"} << QVector<QStringList>{{"", ""}, {"x", ""}}
            << "A\tB\t\n\t\t\nx\t\t\n";
        QTest::newRow("no rows: the header line alone")
            << "|" << QStringList{"A"} << QVector<QStringList>() << "A|\n";
        QTest::newRow("no columns: one empty line per row")
            << ";" << QStringList() << QVector<QStringList>{{}, {}} << "\n\n\n";
    }

    void shouldWriteTheTableExactly()
    {
        QFETCH(QString, delimiter);
        QFETCH(QStringList, headers);
        QFETCH(QVector<QStringList>, rows);
        QFETCH(QString, expected);

        auto settings = std::make_shared<GeneralSettings>();
        QVERIFY(settings->setExportDelimiter(delimiter));
        TableCSVExporter exporter(settings, "Test");
        QCOMPARE(exporter.exportDelimiter(), delimiter);
        QCOMPARE(exporter.exportToString(tableOf(headers, rows)), expected);
    }

    void shouldExportNothingForANullModel()
    {
        TableCSVExporter exporter(std::make_shared<GeneralSettings>(), "Test");
        QCOMPARE(exporter.exportToString(std::shared_ptr<QAbstractTableModel>()), QString());
        ChooseFile chooser(QString{});
        QVERIFY(!exporter.exportToFile(std::shared_ptr<QAbstractTableModel>(), nullptr));
        QCOMPARE(chooser.shown, 0); // nothing to write, nothing asked
        QVERIFY(exporter.errorString().isEmpty());
    }

    void shouldFallBackToSemicolonWithoutSettings()
    {
        TableCSVExporter exporter(nullptr, "Test");
        QCOMPARE(exporter.exportDelimiter(), QStringLiteral(";"));
    }

    void shouldWriteTheChosenFileAndRememberItsFolder()
    {
        QTemporaryDir dir;
        const QString file = dir.filePath("table.csv");
        QSettings().remove("UI/Colour/CSVExportPath");
        TableCSVExporter exporter(std::make_shared<GeneralSettings>(), "Colour");
        // Nothing remembered yet: the prompt starts at the first desktop location (the file
        // dialog itself falls back to the home folder when that does not exist).
        const QStringList desktops = QStandardPaths::standardLocations(QStandardPaths::DesktopLocation);
        QCOMPARE(SaveFilePrompt::startFolder("UI/Colour/CSVExportPath"), desktops.value(0, QDir::homePath()));
        {
            ChooseFile chooser(file);
            QVERIFY(exporter.exportToFile(tableOf({"L*", "a*"}, {{"1.00", "2.00@#00914d"}}), nullptr));
            QCOMPARE(chooser.shown, 1);
            QCOMPARE(chooser.shownFilter, QStringLiteral("CSV files (*.csv)"));
            if (QDir(desktops.value(0)).exists())
                QCOMPARE(chooser.shownFolder, QDir(desktops.first()).absolutePath());
        }
        QCOMPARE(readAll(file), QByteArray("\xef\xbb\xbfL*;a*;\n1.00;2.00 PASS;\n"));
        QCOMPARE(QSettings().value("UI/Colour/CSVExportPath").toString(), QDir(dir.path()).absolutePath());

        // The next prompt opens in the remembered folder.
        ChooseFile again(QString{});
        QVERIFY(!exporter.exportToFile(QStringLiteral("x;\n"), nullptr));
        QCOMPARE(again.shownFolder, QDir(dir.path()).absolutePath());
        QVERIFY(exporter.errorString().isEmpty()); // a cancel is no error
    }

    void shouldWriteNothingWhenCancelled()
    {
        QTemporaryDir dir;
        QSettings().setValue("UI/Cancel/CSVExportPath", dir.path());
        TableCSVExporter exporter(std::make_shared<GeneralSettings>(), "Cancel");
        ChooseFile chooser(QString{});
        QVERIFY(!exporter.exportToFile(tableOf({"A"}, {{"1"}}), nullptr));
        QCOMPARE(chooser.shown, 1);
        QVERIFY(QDir(dir.path()).entryList(QDir::Files).isEmpty());
        QCOMPARE(QSettings().value("UI/Cancel/CSVExportPath").toString(), dir.path());
    }

    void shouldSkipThePromptForEmptyText()
    {
        TableCSVExporter exporter(std::make_shared<GeneralSettings>(), "Empty");
        ChooseFile chooser("/tmp/never.csv");
        QVERIFY(!exporter.exportToFile(QString(), nullptr));
        QCOMPARE(chooser.shown, 0);
    }

    void shouldReportAFileThatCannotBeWritten()
    {
        QTemporaryDir dir;
        const QString path = dir.filePath("missing-folder/table.csv");
        TableCSVExporter exporter(std::make_shared<GeneralSettings>(), "Broken");
        QVERIFY(!exporter.writeToFile("A;\n", path));
        QVERIFY(exporter.errorString().contains("table.csv"));
        QVERIFY(!QFile::exists(path));
    }

    void shouldKeepNonAsciiText()
    {
        QTemporaryDir dir;
        const QString path = dir.filePath("utf8.csv");
        TableCSVExporter exporter(std::make_shared<GeneralSettings>(), "Utf8");
        QVERIFY(exporter.writeToFile(QString::fromUtf8("h°;ΔE*ab;\n"), path));
        // UTF-8 with a byte order mark: spreadsheets on Windows read accents right only with it.
        QCOMPARE(readAll(path), QByteArray("\xef\xbb\xbf" "h\xc2\xb0;\xce\x94" "E*ab;\n"));
    }

    void shouldNameTheVerdicts_data()
    {
        QTest::addColumn<QVariant>("background");
        QTest::addColumn<QString>("verdict");
        QTest::newRow("pass") << QVariant(QColor("#00914d")) << "PASS";
        QTest::newRow("warning") << QVariant(QColor("#F2E000")) << "WARNING";
        QTest::newRow("fail text") << QVariant(QString("#ff3d35")) << "FAIL";
        QTest::newRow("upper-case text") << QVariant(QString("#FF3D35")) << "FAIL";
        QTest::newRow("warning text, mixed case") << QVariant(QString(" #f2E000")) << "WARNING";
        QTest::newRow("brush") << QVariant(QBrush(QColor("#00914D"))) << "PASS";
        QTest::newRow("empty brush") << QVariant(QBrush()) << "";
        QTest::newRow("translucent verdict colour") << QVariant(QColor(0xff, 0x3d, 0x35, 128)) << "FAIL";
        QTest::newRow("other colour") << QVariant(QColor(Qt::red)) << "";
        QTest::newRow("none") << QVariant() << "";
        QTest::newRow("invalid colour") << QVariant(QColor()) << "";
    }

    void shouldNameTheVerdicts()
    {
        QFETCH(QVariant, background);
        QFETCH(QString, verdict);
        QCOMPARE(TableCSVExporter::verdictOfBackground(background), verdict);
    }

    void delimiterThatIsTheDecimalSeparatorGivesWay_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<QString>("delimiter");
        QTest::addColumn<QString>("written");
        QTest::newRow("German, comma") << "de_DE" << "," << ";";
        QTest::newRow("German, semicolon") << "de_DE" << ";" << ";";
        QTest::newRow("English, comma") << "en_US" << "," << ",";
        QTest::newRow("French, comma") << "fr_FR" << "," << ";";
    }

    void delimiterThatIsTheDecimalSeparatorGivesWay()
    {
        QFETCH(QString, locale);
        QFETCH(QString, delimiter);
        QFETCH(QString, written);
        QLocale::setDefault(QLocale(locale));
        auto settings = std::make_shared<GeneralSettings>();
        QVERIFY(settings->setExportDelimiter(delimiter));
        TableCSVExporter exporter(settings, "Locale");
        QCOMPARE(exporter.exportDelimiter(), delimiter);
        QCOMPARE(exporter.effectiveDelimiter(), written);
        const QString number = QLocale().toString(1.23, 'f', 2);
        QCOMPARE(exporter.exportToString(tableOf({"dE"}, {{number}})), QStringLiteral("dE%1\n%2%1\n").arg(written, number));
    }

    // An independent reader: Python's csv module reads the file as a German spreadsheet user's
    // file, names with accents and decimal commas intact.
    void germanFileReadsBackInPython()
    {
        QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany));
        auto settings = std::make_shared<GeneralSettings>();
        QVERIFY(settings->setExportDelimiter(","));
        TableCSVExporter exporter(settings, "German");
        const QString name = QString::fromUtf8("Bl\xc3\xa4ulich Gr\xc3\xbcn \xc3\xa9t\xc3\xa9");
        const auto model = tableOf({"Name", "L*", "dE"},
                                   {{name, QLocale().toString(52.25, 'f', 2), QLocale().toString(1.5, 'f', 2) + "@#FF3D35"}});
        QTemporaryDir dir;
        const QString path = dir.filePath("german.csv");
        QVERIFY(exporter.writeToFile(exporter.exportToString(model), path));
        QVERIFY(readAll(path).startsWith("\xef\xbb\xbf"));

        REQUIRE_PYTHON_MODULES(QStringList{"csv"});
        const char *script = R"(
import csv, json, sys
with open(sys.argv[1], newline="", encoding="utf-8-sig") as f:
    print(json.dumps(list(csv.reader(f, delimiter=";")), ensure_ascii=False))
)";
        QProcess python;
        python.start(testprerequisites::python(), {"-c", script, path});
        QVERIFY(python.waitForFinished(30000));
        QVERIFY2(python.exitCode() == 0, python.readAllStandardError().constData());
        const QJsonArray rows = QJsonDocument::fromJson(python.readAllStandardOutput()).array();
        QCOMPARE(rows.size(), 2);
        // Every line ends with the delimiter: one empty field after the last.
        QCOMPARE(rows.at(0).toArray().toVariantList(), (QVariantList{"Name", "L*", "dE", ""}));
        QCOMPARE(rows.at(1).toArray().toVariantList(), (QVariantList{name, "52,25", "1,50 FAIL", ""}));
    }
};

QTEST_MAIN(TestTableCSVExporter)
#include "tst_tablecsvexporter.moc"

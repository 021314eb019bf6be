// Printing: the HTML of a printed table, the scale of a printed widget, PDF output and
// cancelled dialogs.

#include "export/dialogfixtures.h"
#include "fixturetablemodel.h"

#include <vexa/export/tableprinter.h>
#include <vexa/export/widgetprinter.h>

#include <QPrintDialog>
#include <QPrintPreviewDialog>
#include <QPrinter>
#include <QSortFilterProxyModel>
#include <QTemporaryDir>
#include <QTextDocument>
#include <QtTest>

using namespace vexa;

namespace {

std::shared_ptr<QSortFilterProxyModel> proxyOf(const QStringList &headers, const QVector<QStringList> &rows)
{
    auto proxy = std::make_shared<QSortFilterProxyModel>();
    auto *source = FixtureTableModel::fromTexts(headers, rows);
    source->setParent(proxy.get());
    proxy->setSourceModel(source);
    return proxy;
}

const QString kOpen = QStringLiteral("<html><body><table border=\"0\" cellspacing=\"1\" cellpadding=\"4\">");
const QString kClose = QStringLiteral("</table></body></html>");

bool isPdf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) && file.read(5) == "%PDF-";
}

} // namespace

class TestPrinting : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

private Q_SLOTS:
    void shouldBuildTheTableHtml_data()
    {
        QTest::addColumn<QStringList>("titles");
        QTest::addColumn<QString>("total");
        QTest::addColumn<QString>("expected");

        const QString body = QStringLiteral("<tr><th>Name</th><th>Geo</th><th>dE</th></tr>"
                                            "<tr><td align=\"left\">T1</td><td align=\"left\">45as15</td>"
                                            "<td align=\"right\">1.25</td></tr>");
        QTest::newRow("no titles: an empty row instead of a caption")
            << QStringList{"", "", ""} << "" << kOpen + "<tr></tr>" + body + kClose;
        QTest::newRow("titles that are set, in order")
            << QStringList{"Job", "", "Standard"} << ""
            << kOpen + "<caption style=\"font-weight:bold\">Job</caption>"
                   "<caption style=\"font-weight:bold\">Standard</caption>" + body + kClose;
        QTest::newRow("total line")
            << QStringList{"", "", ""} << "3 trials"
            << kOpen + "<tr></tr>" + body + "<tr><th>Total:</th><td align=\"left\">3 trials</td></tr>" + kClose;
    }

    void shouldBuildTheTableHtml()
    {
        QFETCH(QStringList, titles);
        QFETCH(QString, total);
        QFETCH(QString, expected);
        TablePrinter printer(proxyOf({"Name", "Geo", "dE"}, {{"T1", "45as15", "1.25"}}));
        printer.setTitle(titles[0].toStdString(), titles[1].toStdString(), titles[2].toStdString());
        printer.setTotal(total.toStdString());
        QCOMPARE(printer.html(), expected);
    }

    void shouldAlignNumbersRightFromTheThirdColumn_data()
    {
        QTest::addColumn<int>("column");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("align");
        QTest::newRow("number in column 0") << 0 << "12.5" << "left";
        QTest::newRow("number in column 1") << 1 << "12.5" << "left";
        QTest::newRow("number in column 3") << 3 << "12.5" << "right";
        QTest::newRow("negative number in column 2") << 2 << "-0.75" << "right";
        QTest::newRow("text in column 3") << 3 << "n/a" << "left";
        QTest::newRow("empty in column 3") << 3 << "" << "left";
        QTest::newRow("verdict text in column 3") << 3 << "1.2 FAIL" << "left";
    }

    void shouldAlignNumbersRightFromTheThirdColumn()
    {
        QFETCH(int, column);
        QFETCH(QString, text);
        QFETCH(QString, align);
        QStringList row{"a", "b", "c", "d"};
        row[column] = text;
        TablePrinter printer(proxyOf({"A", "B", "C", "D"}, {row}));
        QVERIFY(printer.html().contains(QStringLiteral("<td align=\"%1\">%2</td>").arg(align, text)));
    }

    void shouldFollowTheProxyOrderAndFilter()
    {
        auto proxy = proxyOf({"Name", "Geo", "dE"}, {{"B", "x", "2"}, {"A", "y", "1"}, {"C", "z", "3"}});
        TablePrinter printer(proxy);
        proxy->sort(0);
        proxy->setFilterFixedString("C");
        proxy->setFilterKeyColumn(0);
        QString html = printer.html();
        QVERIFY(html.contains(">C<"));
        QVERIFY(!html.contains(">A<"));
        proxy->setFilterFixedString(QString());
        html = printer.html();
        QVERIFY(html.indexOf(">A<") < html.indexOf(">B<"));
        QVERIFY(html.indexOf(">B<") < html.indexOf(">C<"));
    }

    // A trial named with HTML's own characters prints as it is named, and breaks nothing after it.
    void shouldPrintTextsAsTheyAre()
    {
        const QString name = QStringLiteral("<b>A & B");
        TablePrinter printer(proxyOf({"Name", "Geo", "dE <1>"}, {{name, "45as15", "1.25"}, {"T2", "45as45", "2.50"}}));
        printer.setTitle("Job \"<i>\"", "", "");
        printer.setTotal("2 & more");
        const QString html = printer.html();
        QVERIFY2(html.contains("<td align=\"left\">&lt;b&gt;A &amp; B</td>"), qPrintable(html));
        QVERIFY(html.contains("<th>dE &lt;1&gt;</th>"));
        QVERIFY(html.contains("Job &quot;&lt;i&gt;&quot;"));
        QVERIFY(html.contains("2 &amp; more"));
        QVERIFY(!html.contains("<b>"));

        // The page as the printer gets it, compared as text: every cell in its own place.
        printer.buildDocument();
        const QStringList lines = printer.document()->toPlainText().split('\n');
        QVERIFY2(lines.contains(name), qPrintable(lines.join('|')));
        QVERIFY(lines.contains("T2"));
        QVERIFY(lines.contains("dE <1>"));
        QVERIFY(lines.contains("Job \"<i>\""));
        QVERIFY(lines.contains("2 & more"));
        QVERIFY(lines.indexOf(name) < lines.indexOf("T2"));
    }

    void shouldPrintNothingWhenTheDialogIsCancelled()
    {
        TablePrinter printer(proxyOf({"A"}, {{"1"}}));
        int shown = 0;
        RunDialogs cancel([&shown](QDialog &dialog) {
            shown += qobject_cast<QPrintDialog *>(&dialog) != nullptr;
            return int(QDialog::Rejected);
        });
        QVERIFY(!printer.print());
        QCOMPARE(shown, 1);
        QVERIFY(printer.document()->isEmpty());
    }

    void shouldPrintToTheChosenPrinter()
    {
        const QString pdf = m_dir.filePath("table-dialog.pdf");
        TablePrinter printer(proxyOf({"Name", "Geo", "dE"}, {{"T1", "45as15", "1.25"}}));
        printer.setTitle("Colour table", "", "");
        PrintToPdf accept(pdf);
        QVERIFY(printer.print());
        QVERIFY(isPdf(pdf));
        QVERIFY(printer.document()->toPlainText().contains("Colour table"));
    }

    void previewShouldPaintThroughPrintDocument()
    {
        const QString pdf = m_dir.filePath("table-preview.pdf");
        TablePrinter printer(proxyOf({"A"}, {{"previewed"}}));
        RunDialogs preview([&pdf](QDialog &dialog) {
            auto *previewDialog = qobject_cast<QPrintPreviewDialog *>(&dialog);
            if (!previewDialog)
                return int(QDialog::Rejected);
            QPrinter target(QPrinter::HighResolution);
            target.setOutputFormat(QPrinter::PdfFormat);
            target.setOutputFileName(pdf);
            Q_EMIT previewDialog->paintRequested(&target);
            return int(QDialog::Accepted);
        });
        printer.printPreview();
        QVERIFY(isPdf(pdf));
        QVERIFY(printer.document()->toPlainText().contains("previewed"));
    }

    void shouldPrintATableToPdf()
    {
        TablePrinter printer(proxyOf({"A"}, {{"1"}}));
        QVERIFY(printer.printToPdf(m_dir.filePath("table.pdf")));
        QVERIFY(isPdf(m_dir.filePath("table.pdf")));
        QVERIFY(!printer.printToPdf(m_dir.filePath("missing/table.pdf")));
        QVERIFY(!printer.printToPdf(QString()));
    }

    void shouldPrintWithoutAModel()
    {
        TablePrinter printer(nullptr);
        QCOMPARE(printer.html(), kOpen + "<tr></tr>" + kClose);
    }

    void shouldScaleAWidgetToFitThePage_data()
    {
        QTest::addColumn<QSizeF>("page");
        QTest::addColumn<QSize>("widget");
        QTest::addColumn<double>("factor");
        QTest::newRow("twice as wide as tall: the width decides") << QSizeF(4000, 6000) << QSize(800, 400) << 5.0;
        QTest::newRow("tall: the height decides") << QSizeF(4000, 6000) << QSize(100, 600) << 10.0;
        QTest::newRow("same aspect") << QSizeF(1000, 2000) << QSize(100, 200) << 10.0;
        QTest::newRow("empty widget") << QSizeF(1000, 2000) << QSize(0, 200) << 0.0;
    }

    void shouldScaleAWidgetToFitThePage()
    {
        QFETCH(QSizeF, page);
        QFETCH(QSize, widget);
        QFETCH(double, factor);
        const double scale = WidgetPrinter::scaleFactor(QRectF(QPointF(0, 0), page), widget);
        QCOMPARE(scale, factor);
        if (scale > 0) {
            QVERIFY(widget.width() * scale <= page.width() + 1e-9);
            QVERIFY(widget.height() * scale <= page.height() + 1e-9);
        }
    }

    void shouldAskWithPrintVisualAndStopOnCancel()
    {
        QWidget parent;
        QWidget widget(&parent);
        widget.resize(200, 100);
        QString title;
        QWidget *dialogParent = nullptr;
        QPrinter::PrintRange range = QPrinter::Selection;
        int resolution = 0;
        RunDialogs cancel([&](QDialog &dialog) {
            auto *printDialog = qobject_cast<QPrintDialog *>(&dialog);
            title = dialog.windowTitle();
            dialogParent = dialog.parentWidget();
            if (printDialog) {
                range = printDialog->printer()->printRange();
                resolution = printDialog->printer()->resolution();
            }
            return int(QDialog::Rejected);
        });
        QVERIFY(!WidgetPrinter::printWidget(&widget));
        QCOMPARE(title, QStringLiteral("Print Visual"));
        QCOMPARE(dialogParent, &parent);
        QCOMPARE(range, QPrinter::AllPages);
        QCOMPARE(resolution, 600);
        QVERIFY(!WidgetPrinter::printWidget(nullptr));
    }

    void shouldPrintAWidgetToPdf()
    {
        QWidget widget;
        widget.resize(300, 150);
        const QString pdf = m_dir.filePath("widget.pdf");
        QVERIFY(WidgetPrinter::printWidgetToPdf(&widget, pdf));
        QVERIFY(isPdf(pdf));
        QVERIFY(!WidgetPrinter::printWidgetToPdf(nullptr, pdf));
        QVERIFY(!WidgetPrinter::printWidgetToPdf(&widget, m_dir.filePath("missing/widget.pdf")));
    }
};

QTEST_MAIN(TestPrinting)
#include "tst_printing.moc"

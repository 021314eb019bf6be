// The colour table at scale: 2,000 trials at the six 45° geometries against one standard
// with a dE*ab tolerance set. Measures the model reset, one pass over the cells a CSV
// export reads, the CSV and XLSX exports, and beside them the raw writing of the same
// cells (QTextStream into a string; libxlsxwriter called directly).
//
// Run: build-tables/bench/vexa/bench_tables (offscreen by default).

#include "tables/tablefixtures.h"

#include <vexa/export/tablecsvexporter.h>
#include <vexa/export/tableexcelexporter.h>
#include <vexa/export/xlsxdocument.h>
#include <vexa/tables/multicolorvaluetablemodel.h>

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QColor>
#include <QDir>
#include <QTemporaryDir>
#include <QTextStream>

#include <xlsxwriter.h>


#include <memory>
#include <vector>

using namespace vexa;

namespace {

constexpr int kTrials = 2000;

struct Table
{
    tablefixtures::Page page;
    std::shared_ptr<MultiColorValueTableModel> model;
    QTemporaryDir dir;

    Table()
    {
        QStringList geometries;
        for (const Geometry &g : Geometry::geometries(GeometrySet::MultiAngle))
            geometries << g.toString();
        page.standard = fixtures::standard(QStringLiteral("STD"), 0.20, geometries);
        page.toleranceSet = tablefixtures::deltaESet(QStringLiteral("dE Set"), geometries);
        page.standard->setToleranceSets({page.toleranceSet});
        for (int i = 0; i < kTrials; ++i)
            page.trials.push_back(fixtures::trial(QStringLiteral("T%1").arg(i), 0.19 + 0.02 * (i % 100) / 100.0,
                                                  geometries, 540 + i % 20));
        page.data->setStandard(page.standard);
        page.data->setTrials(page.trials);
        model = std::make_shared<MultiColorValueTableModel>(tablefixtures::colorSettings(),
                                                            std::make_shared<GeneralSettings>());
        model->setModels(page.data, page.selection);
    }
};

Table &table()
{
    static Table instance;
    return instance;
}

// The cells as the exports see them, read once, for the raw writers.
struct RawCell
{
    QString text;      // display text with the verdict word (CSV)
    QVariant value;    // export value (XLSX)
    QString format;    // number format
    QColor fill;       // verdict colour
};

struct RawTable
{
    QStringList headers;
    std::vector<std::vector<RawCell>> rows;
};

const RawTable &rawTable()
{
    static RawTable raw = [] {
        RawTable t;
        auto &model = *table().model;
        for (int c = 0; c < model.columnCount(); ++c)
            t.headers << model.headerData(c, Qt::Horizontal).toString().replace('\n', ' ');
        for (int r = 0; r < model.rowCount(); ++r) {
            std::vector<RawCell> row;
            for (int c = 0; c < model.columnCount(); ++c) {
                const QModelIndex index = model.index(r, c);
                RawCell cell;
                const QVariant background = index.data(Qt::BackgroundRole);
                const QString verdict = TableCSVExporter::verdictOfBackground(background);
                cell.text = verdict.isEmpty() ? index.data().toString()
                                              : index.data().toString() + ' ' + verdict;
                cell.value = index.data(Qt::UserRole + 20);
                if (!cell.value.isValid())
                    cell.value = index.data().toString();
                cell.format = index.data(Qt::UserRole + 21).toString();
                if (!verdict.isEmpty())
                    cell.fill = background.value<QColor>();
                row.push_back(cell);
            }
            t.rows.push_back(std::move(row));
        }
        return t;
    }();
    return raw;
}

void BM_ModelReset(benchmark::State &state)
{
    auto &model = *table().model;
    for (auto _ : state)
        model.refresh();
    state.counters["rows"] = model.rowCount();
    state.counters["columns"] = model.columnCount();
}

void BM_DataPass(benchmark::State &state)
{
    auto &model = *table().model;
    model.refresh();
    for (auto _ : state) {
        qint64 characters = 0;
        for (int r = 0; r < model.rowCount(); ++r) {
            for (int c = 0; c < model.columnCount(); ++c) {
                const QModelIndex index = model.index(r, c);
                characters += index.data(Qt::DisplayRole).toString().size();
                benchmark::DoNotOptimize(index.data(Qt::BackgroundRole));
            }
        }
        benchmark::DoNotOptimize(characters);
    }
    state.counters["cells"] = double(model.rowCount()) * model.columnCount();
}

void BM_CsvExport(benchmark::State &state)
{
    auto model = table().model;
    TableCSVExporter exporter(std::make_shared<GeneralSettings>(), QStringLiteral("Bench"));
    qint64 bytes = 0;
    for (auto _ : state) {
        const QString text = exporter.exportToString(model);
        bytes = text.toUtf8().size();
        benchmark::DoNotOptimize(bytes);
    }
    state.counters["bytes"] = double(bytes);
}

void BM_CsvRawQTextStream(benchmark::State &state)
{
    const RawTable &raw = rawTable();
    for (auto _ : state) {
        QString text;
        QTextStream stream(&text);
        for (const QString &header : raw.headers)
            stream << header << ';';
        stream << '\n';
        for (const auto &row : raw.rows) {
            for (const RawCell &cell : row)
                stream << cell.text << ';';
            stream << '\n';
        }
        stream.flush();
        benchmark::DoNotOptimize(text);
    }
}

void BM_XlsxExport(benchmark::State &state)
{
    auto model = table().model;
    const QString path = table().dir.filePath(QStringLiteral("export.xlsx"));
    for (auto _ : state) {
        XlsxDocument document;
        TableExcelExporter exporter(document);
        exporter.setTableModel(model);
        int row = 1;
        exporter.exportToSelectedSheet(row, {});
        if (!document.saveAs(path))
            state.SkipWithError(document.errorString().toUtf8().constData());
    }
    state.counters["bytes"] = double(QFileInfo(path).size());
}

void BM_XlsxRawLibxlsxwriter(benchmark::State &state)
{
    const auto newWorkbook = &workbook_new;
    const auto addWorksheet = &workbook_add_worksheet;
    const auto addFormat = &workbook_add_format;
    const auto setNumFormat = &format_set_num_format;
    const auto setPattern = &format_set_pattern;
    const auto setBgColor = &format_set_bg_color;
    const auto writeNumber = &worksheet_write_number;
    const auto writeString = &worksheet_write_string;
    const auto closeWorkbook = &workbook_close;
    const RawTable &raw = rawTable();
    const QByteArray path = QFile::encodeName(table().dir.filePath(QStringLiteral("raw.xlsx")));
    for (auto _ : state) {
        lxw_workbook *workbook = newWorkbook(path.constData());
        lxw_worksheet *sheet = addWorksheet(workbook, nullptr);
        QHash<QString, lxw_format *> formats;
        const auto formatFor = [&](const RawCell &cell) -> lxw_format * {
            const QString key = cell.format + (cell.fill.isValid() ? cell.fill.name() : QString());
            auto it = formats.find(key);
            if (it != formats.end())
                return it.value();
            lxw_format *format = addFormat(workbook);
            setNumFormat(format, cell.format.toUtf8().constData());
            if (cell.fill.isValid()) {
                setPattern(format, LXW_PATTERN_SOLID);
                setBgColor(format, lxw_color_t(cell.fill.rgb() & 0xffffff));
            }
            return formats.insert(key, format).value();
        };
        for (int c = 0; c < raw.headers.size(); ++c)
            writeString(sheet, 0, lxw_col_t(c), raw.headers[c].toUtf8().constData(), nullptr);
        for (size_t r = 0; r < raw.rows.size(); ++r) {
            const auto &row = raw.rows[r];
            for (size_t c = 0; c < row.size(); ++c) {
                const RawCell &cell = row[c];
                if (cell.value.userType() == QMetaType::Double)
                    writeNumber(sheet, lxw_row_t(r + 1), lxw_col_t(c), cell.value.toDouble(), formatFor(cell));
                else if (!cell.value.toString().isEmpty())
                    writeString(sheet, lxw_row_t(r + 1), lxw_col_t(c), cell.value.toString().toUtf8().constData(),
                                nullptr);
            }
        }
        if (closeWorkbook(workbook) != LXW_NO_ERROR)
            state.SkipWithError("workbook_close failed");
    }
}

} // namespace

BENCHMARK(BM_ModelReset)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_DataPass)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_CsvExport)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_CsvRawQTextStream)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_XlsxExport)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(BM_XlsxRawLibxlsxwriter)->Unit(benchmark::kMillisecond)->Iterations(3);

int main(int argc, char **argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    ToleranceFactory::toleranceFactory();
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}

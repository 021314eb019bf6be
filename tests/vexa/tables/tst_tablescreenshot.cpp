// The colour table on the sample data set, grabbed offscreen: the picture in the
// documentation comes from here (set VEXA_SCREENSHOT_DIR to keep it).

#include "tablefixtures.h"

#include <vexa/models/colorcomparesettings.h>
#include <vexa/tables/multicolorvaluetablemodel.h>
#include <vexa/tables/multicolorvaluewidget.h>

#include <domain/standard.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <sampledata/sampledata.h>
#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>
#include <store/storerecord.h>

#include <QBuffer>
#include <QHeaderView>
#include <QMap>
#include <QTableView>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

class TestTableScreenshot : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { ToleranceFactory::toleranceFactory(); }

    void shouldShowTheSilverMetallicJob()
    {
        QTemporaryDir dir;
        SqliteObjectStore store(dir.filePath("sample.db"));
        ErrorInfo error;
        QVERIFY(store.open(&error));
        QVERIFY2(SampleData::populate(store, &error), qPrintable(error.toString()));

        QMap<QString, std::shared_ptr<ToleranceSet>> toleranceSets;
        std::shared_ptr<Standard> standard;
        std::vector<std::shared_ptr<Trial>> trials;
        store.visitAll(
            [&](const StoreRecord &record) {
                if (record.type != "Standard" && record.type != "Trial" && record.type != "ToleranceSet")
                    return true;
                ErrorInfo decodeError;
                const auto object = ObjectCodec::fromRecord(record, &decodeError);
                if (auto set = std::dynamic_pointer_cast<ToleranceSet>(object))
                    toleranceSets.insert(set->id(), set);
                else if (auto s = std::dynamic_pointer_cast<Standard>(object); s && s->name() == "Silver Metallic")
                    standard = s;
                else if (auto t = std::dynamic_pointer_cast<Trial>(object))
                    trials.push_back(t);
                return true;
            },
            &error);
        QVERIFY(standard);
        // Stored references carry ids: give the standard its loaded tolerance sets.
        std::vector<std::shared_ptr<ToleranceSet>> sets;
        for (const auto &reference : standard->toleranceSets())
            if (toleranceSets.contains(reference->id()))
                sets.push_back(toleranceSets.value(reference->id()));
        QCOMPARE(sets.size(), size_t(2));
        standard->setToleranceSets(sets);
        // Two trials of each verdict (at 45as15 under the first set), in stored order.
        std::vector<std::shared_ptr<Trial>> shown;
        QMap<int, int> perStatus;
        const auto tolerance = sets.front()->toleranceWithGeometry(Geometry("45as15"));
        for (const auto &trial : trials) {
            if (!trial->standard() || trial->standard()->id() != standard->id())
                continue;
            const int status = tolerance->status(*trial->appearanceValues(), *standard->appearanceValues(),
                                                 ColorimetricCondition("D65", "10"));
            if (perStatus[status]++ < 2 && shown.size() < 6)
                shown.push_back(trial);
        }
        for (const auto &trial : trials) {
            if (shown.size() < 6 && trial->standard() && trial->standard()->id() == standard->id()
                && std::find(shown.begin(), shown.end(), trial) == shown.end())
                shown.push_back(trial);
        }
        QCOMPARE(shown.size(), size_t(6));

        auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition("D65", "10"));
        auto selection = std::make_shared<TrialSelectionModel>();
        data->setStandard(standard);
        data->setTrials(trials);
        selection->setActiveTrials(shown);
        selection->setColorGeometryFilter({Geometry("45as15"), Geometry("45as45"), Geometry("45as110")});

        auto settings = tablefixtures::colorSettings("CIELab", "None", {"Tolerances", "dE2000"});
        auto general = std::make_shared<GeneralSettings>();
        auto model = std::make_shared<MultiColorValueTableModel>(settings, general);
        model->setGeneralColumns({MultiColorValueTableModel::GeneralColumn::Name,
                                  MultiColorValueTableModel::GeneralColumn::Geometry});
        MultiColorValueWidget widget;
        widget.initialize(model, general, "Release Silver Metallic");
        widget.setModels(data, selection, true);
        widget.resize(1040, 3 * 25 + 18 * 25 + 56);
        widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&widget));
        selection->setSelectedColorGeometry(Geometry("45as45"));
        selection->setSelectedTrial(shown[1]);
        QCOMPARE(model->rowCount(), 21);
        // Exactly as tall as the rows.
        QTableView *view = widget.tableView();
        widget.resize(widget.width(), view->horizontalHeader()->height() + 21 * 25 + 2 * view->frameWidth());
        QCoreApplication::processEvents();
        QCOMPARE(model->columnCount(), 2 + 3 + 1 + 2);

        // Every verdict colour shows at least once.
        QSet<QString> verdicts;
        for (int r = 0; r < model->rowCount(); ++r)
            for (int c = 6; c < 8; ++c)
                if (model->index(r, c).data(Qt::BackgroundRole).isValid())
                    verdicts.insert(model->index(r, c).data(Qt::BackgroundRole).value<QColor>().name());
        QVERIFY2(verdicts.size() == 3, qPrintable(QStringList(verdicts.values()).join(',')));

        // An 8-bit palette of the 256 most used colours keeps the picture small and the
        // verdict colours exact; only shades of anti-aliased text are rounded.
        const QImage grabbed = widget.grab().toImage().convertToFormat(QImage::Format_RGB32);
        QHash<QRgb, int> counts;
        for (int y = 0; y < grabbed.height(); ++y)
            for (int x = 0; x < grabbed.width(); ++x)
                ++counts[grabbed.pixel(x, y)];
        QVector<QPair<int, QRgb>> byCount;
        for (auto it = counts.cbegin(); it != counts.cend(); ++it)
            byCount.append({it.value(), it.key()});
        std::sort(byCount.begin(), byCount.end(), [](const auto &a, const auto &b) { return a.first > b.first; });
        QVector<QRgb> palette;
        for (int i = 0; i < byCount.size() && i < 256; ++i)
            palette << byCount[i].second;
        const QImage image = grabbed.convertToFormat(QImage::Format_Indexed8, palette, Qt::ThresholdDither);
        QVERIFY(!image.isNull());
        QByteArray png;
        QBuffer buffer(&png);
        buffer.open(QIODevice::WriteOnly);
        QVERIFY(image.save(&buffer, "PNG", 9));
        const QString target = qEnvironmentVariable("VEXA_SCREENSHOT_DIR");
        if (!target.isEmpty()) {
            QFile file(QDir(target).filePath("table-colour-values.png"));
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write(png);
        }
        QVERIFY2(png.size() < 100 * 1024, qPrintable(QString::number(png.size())));
    }
};

QTEST_MAIN(TestTableScreenshot)
#include "tst_tablescreenshot.moc"

#include <vexa/widgets/qttablemodelhelper.h>
#include <vexa/widgets/uihelper.h>

#include <colorimetry/colorconverter.h>

#include <domain/appearancevalues.h>
#include <domain/domainmetatypes.h>
#include <domain/folder.h>
#include <domain/labvalue.h>
#include <domain/reflectancespectrum.h>
#include <domain/rgbvalue.h>
#include <domain/trial.h>
#include <domain/xyzvalue.h>

#include <QLocale>
#include <QMimeData>
#include <QStandardItemModel>
#include <QtTest>

#include <cstdlib>

using namespace vexa;

namespace {

std::shared_ptr<LabValue> labAt(const char *geometry, double l, double a, double b)
{
    auto lab = std::make_shared<LabValue>(l, a, b);
    lab->setGeometry(Geometry(geometry));
    return lab;
}

std::shared_ptr<Trial> trialNamed(const QString &name, const Timestamp &stamp)
{
    auto trial = std::make_shared<Trial>();
    trial->setName(name);
    trial->setTimeStamp(stamp);
    return trial;
}

} // namespace

class TestUIHelper : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanup();

    void toColorIsOpaque();
    void changeSaturation_data();
    void changeSaturation();
    void rgbIcon();
    void rgbIconOfNothing();
    void displayColorPicks45as45_data();
    void displayColorPicks45as45();
    void displayColorOfSpectrumIsNeutralForGrey();
    void displayColorFailures();
    void trialDisplayString_data();
    void trialDisplayString();
    void sortOrder();
    void objectsFromDragData();
    void objectsFromForeignData();
    void displayDataFormater_data();
    void displayDataFormater();
    void displayDataFormaterWithoutModel();
    void doubleDataFormater_data();
    void doubleDataFormater();

private:
    QLocale m_previousLocale;
};

void TestUIHelper::initTestCase()
{
    registerDomainMetaTypes();
    m_previousLocale = QLocale();
}

void TestUIHelper::cleanup()
{
    QLocale::setDefault(m_previousLocale);
}

void TestUIHelper::toColorIsOpaque()
{
    const QColor color = UIHelper::toColor(RGBValue(12, 200, 255));
    QCOMPARE(color, QColor(12, 200, 255));
    QCOMPARE(color.alpha(), 255);
}

void TestUIHelper::changeSaturation_data()
{
    QTest::addColumn<QColor>("color");
    QTest::addColumn<double>("factor");
    QTest::addColumn<int>("saturation");

    QTest::newRow("clamped above") << QColor::fromHsv(120, 100, 200) << 3.0 << 255;
    QTest::newRow("truncated") << QColor::fromHsv(120, 101, 200) << 0.5 << 50;
    QTest::newRow("unchanged") << QColor::fromHsv(10, 77, 90) << 1.0 << 77;
    QTest::newRow("negative factor") << QColor::fromHsv(10, 77, 90) << -2.0 << 0;
    QTest::newRow("translucent input") << QColor::fromHsv(300, 40, 128, 10) << 2.0 << 80;
}

void TestUIHelper::changeSaturation()
{
    QFETCH(QColor, color);
    QFETCH(double, factor);
    QFETCH(int, saturation);

    const QColor original = color;
    const QColor copy = UIHelper::createColorWithChangedSaturation(color, factor);
    QCOMPARE(color, original);
    UIHelper::changeSaturation(color, factor);
    QCOMPARE(color, copy);
    QCOMPARE(color.hsvSaturation(), saturation);
    QCOMPARE(color.hsvHue(), original.hsvHue());
    QCOMPARE(color.value(), original.value());
    QCOMPARE(color.alpha(), 255);
}

void TestUIHelper::rgbIcon()
{
    const RGBValue red(255, 0, 0);
    const QIcon icon = UIHelper::createRGBIcon(red, QSize(20, 12));
    QVERIFY(!icon.isNull());
    const QImage image = icon.pixmap(QSize(20, 12)).toImage().convertToFormat(QImage::Format_ARGB32);
    QCOMPARE(image.size(), QSize(20, 12));
    // Filled with the colour inside, transparent in the rounded-off corners.
    QCOMPARE(QColor::fromRgba(image.pixel(10, 6)), QColor(255, 0, 0));
    QCOMPARE(qAlpha(image.pixel(0, 0)), 0);
    QCOMPARE(qAlpha(image.pixel(19, 11)), 0);
    // The outline differs from the fill.
    QVERIFY(QColor::fromRgba(image.pixel(10, 0)) != QColor(255, 0, 0));

    const QIcon shared = UIHelper::createRGBIcon(std::make_shared<RGBValue>(red), QSize(20, 12));
    QCOMPARE(shared.pixmap(QSize(20, 12)).toImage().convertToFormat(QImage::Format_ARGB32), image);
    QVERIFY(!icon.pixmap(QSize(20, 12), QIcon::Selected).isNull());
}

void TestUIHelper::rgbIconOfNothing()
{
    QVERIFY(UIHelper::createRGBIcon(std::shared_ptr<RGBValue>(), QSize(16, 16)).isNull());
    QVERIFY(UIHelper::createRGBIcon(RGBValue(1, 2, 3), QSize(0, 16)).isNull());
    QVERIFY(UIHelper::createRGBIcon(RGBValue(1, 2, 3), QSize()).isNull());
}

void TestUIHelper::displayColorPicks45as45_data()
{
    QTest::addColumn<QStringList>("geometries");
    QTest::addColumn<int>("expectedIndex");

    QTest::newRow("45as45 second") << QStringList{"45as15", "45as45"} << 1;
    QTest::newRow("45as45 first") << QStringList{"45as45", "45as110"} << 0;
    QTest::newRow("only 45as15") << QStringList{"45as15"} << 0;
    QTest::newRow("no 45as45") << QStringList{"45as110", "45as15"} << 0;
}

void TestUIHelper::displayColorPicks45as45()
{
    QFETCH(QStringList, geometries);
    QFETCH(int, expectedIndex);

    auto values = std::make_shared<AppearanceValues>();
    std::vector<std::shared_ptr<LabValue>> labs;
    for (int i = 0; i < geometries.size(); ++i) {
        // Clearly different colours per geometry.
        labs.push_back(labAt(geometries.at(i).toLatin1().constData(), 30.0 + 30.0 * i, i == 0 ? 60.0 : -40.0,
                             i == 0 ? 40.0 : -30.0));
        values->addColorValues(labs.back());
    }

    RGBValue rgb;
    QVERIFY(UIHelper::didGetColorValueForDisplay(rgb, values));
    QCOMPARE(rgb, ColorConverter::toRGB(*labs.at(static_cast<size_t>(expectedIndex))));
}

void TestUIHelper::displayColorOfSpectrumIsNeutralForGrey()
{
    auto spectrum = std::make_shared<ReflectanceSpectrum>();
    spectrum->setStartWavelength(400);
    spectrum->setWavelengthInterval(10);
    spectrum->setSpectralValues(QVector<double>(31, 0.2));
    spectrum->setGeometry(Geometry("45as45"));

    RGBValue rgb(1, 2, 3);
    QVERIFY(UIHelper::didGetColorValueForDisplay(rgb, std::static_pointer_cast<ColorValues>(spectrum)));
    QVERIFY2(std::abs(int(rgb.R()) - int(rgb.G())) <= 2 && std::abs(int(rgb.G()) - int(rgb.B())) <= 2,
             qPrintable(QStringLiteral("%1 %2 %3").arg(rgb.R()).arg(rgb.G()).arg(rgb.B())));
    QVERIFY(rgb.R() > 80 && rgb.R() < 170);
}

void TestUIHelper::displayColorFailures()
{
    RGBValue rgb(7, 8, 9);
    QVERIFY(!UIHelper::didGetColorValueForDisplay(rgb, std::shared_ptr<AppearanceValues>()));
    QVERIFY(!UIHelper::didGetColorValueForDisplay(rgb, std::make_shared<AppearanceValues>()));
    QVERIFY(!UIHelper::didGetColorValueForDisplay(rgb, std::shared_ptr<ColorValues>()));
    // Other kinds of colour values have no display colour.
    QVERIFY(!UIHelper::didGetColorValueForDisplay(rgb, std::static_pointer_cast<ColorValues>(std::make_shared<XYZValue>())));
    // An empty L*a*b* value is not shown as black.
    QVERIFY(!UIHelper::didGetColorValueForDisplay(rgb, std::static_pointer_cast<ColorValues>(std::make_shared<LabValue>())));
    // An empty spectrum cannot be converted.
    QVERIFY(!UIHelper::didGetColorValueForDisplay(
        rgb, std::static_pointer_cast<ColorValues>(std::make_shared<ReflectanceSpectrum>())));
    QCOMPARE(rgb, RGBValue(7, 8, 9));
}

void TestUIHelper::trialDisplayString_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("format");
    QTest::addColumn<QString>("expected");

    QTest::newRow("day and month") << "T1" << "<Name> <Day>.<Month>." << "T1 5.3.";
    QTest::newRow("empty format") << "T1" << "" << "T1";
    QTest::newRow("time without zeros") << "T1" << "<Hour>:<Minute>:<Second>" << "7:4:9";
    QTest::newRow("year and repeats") << "T1" << "<Name>/<Year>/<Name>" << "T1/2024/T1";
    QTest::newRow("unknown placeholder kept") << "T1" << "<Name>-<Color>" << "T1-<Color>";
    QTest::newRow("no placeholder") << "T1" << "fixed" << "fixed";
    // What a placeholder puts in is the trial's own text, never read as a placeholder again.
    QTest::newRow("placeholder in the name") << "Batch <Year>" << "<Name> <Day>" << "Batch <Year> 5";
    QTest::newRow("every placeholder in the name") << "<Name><Day><Second>" << "<Name>" << "<Name><Day><Second>";
    QTest::newRow("half a placeholder") << "T1" << "<Na<Name>me>" << "<NaT1me>";
}

void TestUIHelper::trialDisplayString()
{
    QFETCH(QString, name);
    QFETCH(QString, format);
    QFETCH(QString, expected);

    const auto trial = trialNamed(name, Timestamp(2024, 3, 5, 7, 4, 9));
    QCOMPARE(UIHelper::trialDisplayString(trial, format), expected);
    QCOMPARE(UIHelper::trialDisplayString(std::shared_ptr<Trial>(), format), QString());
}

void TestUIHelper::sortOrder()
{
    QCOMPARE(UIHelper::objectSortOrder(QStringLiteral("NeverSet")), 0);
    UIHelper::setObjectSortOrder(QStringLiteral("Folder"), -5);
    UIHelper::setObjectSortOrder(QStringLiteral("Trial"), 3);
    QCOMPARE(UIHelper::objectSortOrder(QStringLiteral("Folder")), -5);
    UIHelper::setObjectSortOrder(QStringLiteral("Folder"), 2);
    QCOMPARE(UIHelper::objectSortOrder(QStringLiteral("Folder")), 2);
    QCOMPARE(UIHelper::objectSortOrder(QStringLiteral("Trial")), 3);
}

void TestUIHelper::objectsFromDragData()
{
    auto trial = trialNamed(QStringLiteral("Dragged"), Timestamp(2024, 1, 2));
    trial->setId(QStringLiteral("trial-1"));
    auto folder = std::make_shared<Folder>();
    folder->setId(QStringLiteral("folder-1"));
    folder->setName(QStringLiteral("Folder"));

    QStandardItemModel model(2, 2);
    model.setData(model.index(0, 0), QVariant::fromValue(std::shared_ptr<BaseObject>(folder)), Qt::UserRole);
    model.setData(model.index(0, 1), QStringLiteral("no object here"), Qt::DisplayRole);
    model.setData(model.index(1, 0), QStringLiteral("text under the user role"), Qt::UserRole);
    model.setData(model.index(1, 1), QVariant::fromValue(std::shared_ptr<BaseObject>(trial)), Qt::UserRole);

    std::unique_ptr<QMimeData> data(
        model.mimeData({model.index(0, 0), model.index(0, 1), model.index(1, 0), model.index(1, 1)}));
    QVERIFY(data);
    QVERIFY(data->hasFormat(QStringLiteral("application/x-qabstractitemmodeldatalist")));

    const auto objects = UIHelper::baseObjectsFromMimeData(data.get());
    QCOMPARE(int(objects.size()), 2);
    QCOMPARE(objects.at(0)->typeName(), Folder::typeId());
    QCOMPARE(objects.at(0)->id(), QStringLiteral("folder-1"));
    QCOMPARE(objects.at(1)->typeName(), Trial::typeId());
    const auto decoded = std::dynamic_pointer_cast<Trial>(objects.at(1));
    QVERIFY(decoded);
    QCOMPARE(decoded->name(), QStringLiteral("Dragged"));
}

void TestUIHelper::objectsFromForeignData()
{
    QVERIFY(UIHelper::baseObjectsFromMimeData(nullptr).empty());
    QMimeData text;
    text.setText(QStringLiteral("plain"));
    QVERIFY(UIHelper::baseObjectsFromMimeData(&text).empty());
    QMimeData truncated;
    truncated.setData(QStringLiteral("application/x-qabstractitemmodeldatalist"), QByteArray("\x00\x00\x00", 3));
    QVERIFY(UIHelper::baseObjectsFromMimeData(&truncated).empty());
}

void TestUIHelper::displayDataFormater_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::addColumn<int>("decimals");
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("expected");

    QTest::newRow("double") << QVariant(1.23456) << 2 << "C" << "1.23";
    QTest::newRow("double rounds") << QVariant(2.5) << 0 << "C" << "3";
    QTest::newRow("locale decimal comma") << QVariant(-0.5) << 3 << "de_DE" << "-0,500";
    QTest::newRow("integer unchanged") << QVariant(42) << 2 << "C" << "42";
    QTest::newRow("text") << QVariant(QStringLiteral("PASS")) << 2 << "C" << "PASS";
    QTest::newRow("empty cell") << QVariant() << 2 << "C" << "";
}

void TestUIHelper::displayDataFormater()
{
    QFETCH(QVariant, value);
    QFETCH(int, decimals);
    QFETCH(QString, locale);
    QFETCH(QString, expected);

    QLocale::setDefault(QLocale(locale));
    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), value, QtTableModelHelper::ExportValueRole);
    model.setData(model.index(0, 0), QStringLiteral("display text"), Qt::DisplayRole);

    const QVariant formatted = QtTableModelHelper::displayDataFormater(&model, model.index(0, 0), decimals);
    QCOMPARE(formatted.userType(), int(QMetaType::QString));
    QCOMPARE(formatted.toString(), expected);
}

void TestUIHelper::displayDataFormaterWithoutModel()
{
    QStandardItemModel model(1, 1);
    const QVariant none = QtTableModelHelper::displayDataFormater(nullptr, model.index(0, 0), 2);
    QCOMPARE(none.userType(), int(QMetaType::QString));
    QVERIFY(none.toString().isEmpty());
    QVERIFY(QtTableModelHelper::displayDataFormater(&model, QModelIndex(), 2).toString().isEmpty());
}

void TestUIHelper::doubleDataFormater_data()
{
    QTest::addColumn<int>("decimals");
    QTest::addColumn<QString>("expected");

    QTest::newRow("none") << 0 << "0.";
    QTest::newRow("two") << 2 << "0.00";
    QTest::newRow("five") << 5 << "0.00000";
    QTest::newRow("negative") << -1 << "0.";
}

void TestUIHelper::doubleDataFormater()
{
    QFETCH(int, decimals);
    QFETCH(QString, expected);
    QCOMPARE(QtTableModelHelper::doubleDataFormater(decimals), expected);
}

QTEST_MAIN(TestUIHelper)
#include "tst_uihelper.moc"

#include <vexa/widgets/imagerepository.h>

#include <domain/folder.h>
#include <domain/trial.h>
#include <domain/user.h>

#include <QImage>
#include <QtTest>

#include <cstdlib>

using namespace vexa;

namespace {

QImage imageOf(const QIcon &icon, const QSize &size)
{
    return icon.pixmap(size).toImage().convertToFormat(QImage::Format_ARGB32);
}

QImage inverted(QImage image)
{
    image = image.convertToFormat(QImage::Format_ARGB32);
    image.invertPixels(QImage::InvertRgb);
    return image;
}

// Equal as displayed: premultiplied, so that colours under full transparency do not count,
// and with one step of rounding allowed per channel.
bool looksTheSame(const QImage &actual, const QImage &expected)
{
    if (actual.size() != expected.size())
        return false;
    const QImage a = actual.convertToFormat(QImage::Format_ARGB32_Premultiplied);
    const QImage b = expected.convertToFormat(QImage::Format_ARGB32_Premultiplied);
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            if (std::abs(qRed(p) - qRed(q)) > 1 || std::abs(qGreen(p) - qGreen(q)) > 1
                || std::abs(qBlue(p) - qBlue(q)) > 1 || std::abs(qAlpha(p) - qAlpha(q)) > 1)
                return false;
        }
    }
    return true;
}

} // namespace

class TestImageRepository : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void registrationOrder();
    void typeIcons_data();
    void typeIcons();
    void unknownTypeHasNoIcon_data();
    void unknownTypeHasNoIcon();
    void iconForObject();
    void inversedIconOfMissingFile();
    void appIcons();
};

void TestImageRepository::registrationOrder()
{
    const QStringList expected{"Assortment", "Colorant", "Domain", "Folder", "Formula", "Letdown",
                               "Recipe", "ReflectanceSpectrum", "Standard", "Substrate", "ToleranceSet", "User",
                               "DatabaseConfiguration", "QCJobTemplate", "ColorStandardsLibrary", "Property",
                               "PropertyLibrary", "TagDefinition", "Tag", "MeasurementConfiguration", "QCJob",
                               "QAJob", "QAFilter", "Trial"};
    QStringList registered;
    QStringList inverted;
    for (const auto &entry : ImageRepository::instance().registeredTypeIcons()) {
        registered.append(entry.typeId);
        if (entry.inverted)
            inverted.append(entry.typeId);
    }
    QCOMPARE(registered, expected);
    QCOMPARE(inverted, (QStringList{"Assortment", "Colorant", "Domain", "Letdown", "User"}));
}

void TestImageRepository::typeIcons_data()
{
    QTest::addColumn<QString>("typeId");
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("invertedForLight");
    for (const auto &entry : ImageRepository::instance().registeredTypeIcons())
        QTest::newRow(qPrintable(entry.typeId)) << entry.typeId << entry.imagePath << entry.inverted;
}

void TestImageRepository::typeIcons()
{
    QFETCH(QString, typeId);
    QFETCH(QString, path);
    QFETCH(bool, invertedForLight);

    const QImage original(path);
    QVERIFY2(!original.isNull(), qPrintable(path));
    const QSize size = original.size();
    const QIcon light = ImageRepository::instance().iconForType(typeId, ImageRepository::Light);
    const QIcon dark = ImageRepository::instance().iconForType(typeId, ImageRepository::Dark);
    QVERIFY(!light.isNull());
    QVERIFY(!dark.isNull());

    const QImage plain = original.convertToFormat(QImage::Format_ARGB32);
    const QImage negative = inverted(original);
    QVERIFY2(!looksTheSame(plain, negative), "the image must show a difference when inverted");
    QVERIFY(looksTheSame(imageOf(light, size), invertedForLight ? negative : plain));
    QVERIFY(looksTheSame(imageOf(dark, size), invertedForLight ? plain : negative));
}

void TestImageRepository::unknownTypeHasNoIcon_data()
{
    QTest::addColumn<QString>("typeId");
    QTest::newRow("unknown") << "Spaceship";
    QTest::newRow("empty") << "";
    QTest::newRow("case differs") << "trial";
}

void TestImageRepository::unknownTypeHasNoIcon()
{
    QFETCH(QString, typeId);
    QVERIFY(ImageRepository::instance().iconForType(typeId, ImageRepository::Light).isNull());
    QVERIFY(ImageRepository::instance().iconForType(typeId, ImageRepository::Dark).isNull());
}

void TestImageRepository::iconForObject()
{
    ImageRepository &repository = ImageRepository::instance();
    const auto trial = std::make_shared<Trial>();
    const QSize size(16, 16);
    QCOMPARE(imageOf(repository.iconForObject(trial, ImageRepository::Dark), size),
             imageOf(repository.iconForType(Trial::typeId(), ImageRepository::Dark), size));
    QCOMPARE(imageOf(repository.iconForObject(*std::make_shared<User>(), ImageRepository::Light), size),
             imageOf(repository.iconForType(User::typeId(), ImageRepository::Light), size));
    QVERIFY(repository.iconForObject(std::shared_ptr<BaseObject>(), ImageRepository::Light).isNull());
}

void TestImageRepository::inversedIconOfMissingFile()
{
    QVERIFY(ImageRepository::inversedIcon(QStringLiteral(":/Images/DoesNotExist.png")).isNull());
    QVERIFY(ImageRepository::inversedIcon(QString()).isNull());
}

void TestImageRepository::appIcons()
{
    ImageRepository &repository = ImageRepository::instance();
    auto iconOf = [](Qt::GlobalColor color) {
        QPixmap pixmap(8, 8);
        pixmap.fill(color);
        return QIcon(pixmap);
    };
    repository.registerAppIcon(QStringLiteral("QC"), iconOf(Qt::red), iconOf(Qt::green), iconOf(Qt::blue),
                               iconOf(Qt::yellow));

    const QList<QPair<ImageRepository::Status, QColor>> expected{
        {ImageRepository::Status::Enable, Qt::red},
        {ImageRepository::Status::Active, Qt::green},
        {ImageRepository::Status::Disabled, Qt::blue},
        {ImageRepository::Status::Rollover, Qt::yellow},
    };
    for (const auto &entry : expected) {
        const QImage image = imageOf(repository.iconForApp(QStringLiteral("QC"), entry.first), QSize(8, 8));
        QCOMPARE(QColor(image.pixel(4, 4)), entry.second);
    }
    QCOMPARE(ImageRepository::statusKey(ImageRepository::Status::Rollover), QStringLiteral("Rollover"));
    QVERIFY(repository.iconForApp(QStringLiteral("Unknown"), ImageRepository::Status::Enable).isNull());

    // Registering again replaces the icons.
    repository.registerAppIcon(QStringLiteral("QC"), iconOf(Qt::black), QIcon(), QIcon(), QIcon());
    QCOMPARE(QColor(imageOf(repository.iconForApp(QStringLiteral("QC"), ImageRepository::Status::Enable), QSize(8, 8))
                        .pixel(4, 4)),
             QColor(Qt::black));
    QVERIFY(repository.iconForApp(QStringLiteral("QC"), ImageRepository::Status::Active).isNull());
}

QTEST_MAIN(TestImageRepository)
#include "tst_imagerepository.moc"

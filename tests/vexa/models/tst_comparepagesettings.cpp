#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/jobdetailviewsettings.h>
#include <vexa/models/jobviewsettings.h>
#include <vexa/models/singletrialviewsettings.h>
#include <vexa/models/texturecomparesettings.h>
#include <vexa/plots/colorplotsettings.h>

#include <settings/boolsetting.h>
#include <settings/settingslistsetting.h>
#include <settings/settingsmanager.h>
#include <settings/settingswidget.h>
#include <settings/stringlistsetting.h>
#include <settings/stringsetting.h>

#include <QComboBox>
#include <QSignalSpy>
#include <QTabWidget>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

namespace {

QStringList keysOf(const std::shared_ptr<SettingsSection> &section)
{
    QStringList keys;
    if (section)
        for (const auto &setting : section->settings())
            keys.append(setting->key());
    return keys;
}

} // namespace

class TestComparePageSettings : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void jobDetailSections_data();
    void jobDetailSections();
    void jobDetailSharesSettingsWithEmbeddedGroups();
    void boxPlotVisibility();
    void textureSettingDeclarations_data();
    void textureSettingDeclarations();
    void textureDefaults();
    void textureSelections();
    void textureMetricNames_data();
    void textureMetricNames();
    void jobViewTexts();
    void jobViewPersists();
    void singleTrialSections();
    void settingsEditorShowsThePage();
};

void TestComparePageSettings::jobDetailSections_data()
{
    QTest::addColumn<QString>("section");
    QTest::addColumn<QString>("title");
    QTest::addColumn<QStringList>("keys");

    QTest::newRow("Color") << "Color" << "Color Data"
                           << QStringList{"TableColorSpaceCoordinates", "TableDEMetrics", "TrendPlotMetrics",
                                          "BoxPlotMetrics"};
    QTest::newRow("Standard Color") << "Standard Color" << "Standard Color Data"
                                    << QStringList{"TableStandardColorSpaceCoordinates"};
    QTest::newRow("Lab-Plot") << "Lab-Plot" << "Lab-Plot" << QStringList{"Lab-Plot"};
    QTest::newRow("Texture") << "Texture" << "Texture Data"
                             << QStringList{"ShowStandardValues", "TableTextureMetrics", "TrendPlotTextureMetrics"};
}

void TestComparePageSettings::jobDetailSections()
{
    QFETCH(QString, section);
    QFETCH(QString, title);
    QFETCH(QStringList, keys);

    JobDetailViewSettings page;
    QCOMPARE(page.ownerName(), QStringLiteral("JobDetailView"));
    QCOMPARE(page.displayName(), QStringLiteral("Job Detail View"));
    QCOMPARE(int(page.sections().size()), 4);
    const auto found = page.section(section);
    QVERIFY(found);
    QCOMPARE(found->displayName(), title);
    QCOMPARE(keysOf(found), keys);

    // Building again adds nothing.
    page.createSettings();
    QCOMPARE(keysOf(page.section(section)), keys);
}

void TestComparePageSettings::jobDetailSharesSettingsWithEmbeddedGroups()
{
    JobDetailViewSettings page;
    const auto color = page.colorCompareSettings();
    const auto texture = page.textureCompareSettings();
    QVERIFY(color && texture);
    QCOMPARE(color->ownerName(), QStringLiteral("Color"));
    QCOMPARE(texture->ownerName(), QStringLiteral("Texture"));

    const auto tableMetrics = page.setting<StringListSetting>(QStringLiteral("TableDEMetrics"));
    QCOMPARE(tableMetrics, color->tableDEMetricsSetting());
    QVERIFY(tableMetrics->setSelectedValues({"dE2000"}));
    QVERIFY(!color->tableTolerancesEnabled());

    const auto list = page.setting<SettingsListSetting>(QStringLiteral("Lab-Plot"));
    QVERIFY(list);
    QVERIFY(list->useTabWidget());
    QCOMPARE(list->sectionCount(), 9);
    QVERIFY(std::dynamic_pointer_cast<ColorPlotSettings>(list->templateSectionSettings()));

    const auto standardValues = page.setting<BoolSetting>(QStringLiteral("ShowStandardValues"));
    QSignalSpy spy(&page, &CommonSettings::settingsChanged);
    standardValues->setValue(false);
    QCOMPARE(spy.count(), 1);
    QVERIFY(!texture->showStandardValues());
    // The job detail page does not offer the texture image switch.
    QVERIFY(!page.setting(QStringLiteral("TextureImages")));
}

void TestComparePageSettings::boxPlotVisibility()
{
    JobDetailViewSettings page;
    const auto boxPlot = page.colorCompareSettings()->boxPlotMetricsSetting();
    QVERIFY(boxPlot->isVisible());
    page.setBoxPlotSettingsVisible(false);
    QVERIFY(!boxPlot->isVisible());
    QVERIFY(!page.isBoxPlotSettingsVisible());
    page.setBoxPlotSettingsVisible(true);
    QVERIFY(boxPlot->isVisible());
}

void TestComparePageSettings::textureSettingDeclarations_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("label");
    QTest::addColumn<QString>("description");

    QTest::newRow("standard values") << "ShowStandardValues" << "Show standard values"
                                     << "Select if you want to display the standard values";
    QTest::newRow("images") << "TextureImages" << "Texture Images"
                            << "Select if you want to load texture images from database with recalled trials";
    QTest::newRow("table") << "TableTextureMetrics" << "Displayed texture metrics" << "Displayed Texture Metrics";
    QTest::newRow("trend") << "TrendPlotTextureMetrics" << "Select trend plot texture metrics"
                           << "Trend Plot Texture Metrics";
}

void TestComparePageSettings::textureSettingDeclarations()
{
    QFETCH(QString, key);
    QFETCH(QString, label);
    QFETCH(QString, description);

    TextureCompareSettings settings(QStringLiteral("Texture"), QStringLiteral("Texture Data"));
    settings.createSettings();
    const auto setting = settings.setting(key);
    QVERIFY(setting);
    QCOMPARE(setting->labelText(), label);
    QCOMPARE(setting->descriptionText(), description);
    if (const auto list = std::dynamic_pointer_cast<StringListSetting>(setting)) {
        QVERIFY(list->useComboBox());
        QVERIFY(!list->isSingleSelect());
        QStringList offered;
        for (const StringPair &pair : list->possibleValues())
            offered.append(pair.value);
        QCOMPARE(offered, QStringList{"Tolerances"} + TextureCompareSettings::availableTextureMetrics());
        QCOMPARE(list->selectedValues(), QStringList{"Tolerances"});
    } else {
        const auto flag = std::dynamic_pointer_cast<BoolSetting>(setting);
        QVERIFY(flag);
        QVERIFY(flag->value());
    }
}

void TestComparePageSettings::textureDefaults()
{
    TextureCompareSettings settings(QStringLiteral("Texture"), QString());
    // Nothing created yet: negative answers, no crash.
    QVERIFY(!settings.showStandardValues());
    QVERIFY(!settings.tableTolerancesEnabled());
    QVERIFY(settings.enabledTableTextureMetrics().isEmpty());

    settings.createSettings();
    QVERIFY(settings.showStandardValues());
    QVERIFY(settings.showTextureImages());
    QVERIFY(settings.tableTolerancesEnabled());
    QVERIFY(settings.trendTolerancesEnabled());
    QVERIFY(settings.enabledTableTextureMetrics().isEmpty());
    QVERIFY(settings.enabledTrendPlotTextureMetricsDisplayNames().isEmpty());
}

void TestComparePageSettings::textureSelections()
{
    TextureCompareSettings settings(QStringLiteral("Texture"), QString());
    settings.createSettings();
    QVERIFY(settings.tableTextureMetricsSetting()->setSelectedValues({"SparkleGrade", "Tolerances"}));
    QCOMPARE(settings.enabledTableTextureMetrics(), QStringList{"SparkleGrade"});
    QCOMPARE(settings.enabledTableTextureMetricsDisplayNames(), QStringList{"Sparkle Grade"});
    QVERIFY(settings.tableTolerancesEnabled());
    QVERIFY(settings.trendPlotTextureMetricsSetting()->setSelectedValues({"Coarseness", "SparkleColorVariation"}));
    QVERIFY(!settings.trendTolerancesEnabled());
    QVERIFY(settings.tableTolerancesEnabled());
    QCOMPARE(settings.enabledTrendPlotTextureMetricsDisplayNames(),
             (QStringList{"Coarseness", "Sparkle Color Variation"}));
}

void TestComparePageSettings::textureMetricNames_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("displayName");

    QTest::newRow("first") << 0 << "Coarseness";
    QTest::newRow("last") << 2 << "Sparkle Color Variation";
    QTest::newRow("past the end") << 3 << "";
    QTest::newRow("negative") << -1 << "";
}

void TestComparePageSettings::textureMetricNames()
{
    QFETCH(int, index);
    QFETCH(QString, displayName);

    QCOMPARE(TextureCompareSettings::availableTextureMetrics(),
             (QStringList{"Coarseness", "SparkleGrade", "SparkleColorVariation"}));
    QCOMPARE(TextureCompareSettings::textureMetricDisplayName(index), displayName);
}

void TestComparePageSettings::jobViewTexts()
{
    JobViewSettings page;
    QCOMPARE(page.ownerName(), QStringLiteral("JobView"));
    QCOMPARE(page.displayName(), QStringLiteral("Job View"));
    const auto section = page.section(QStringLiteral("AutoName"));
    QCOMPARE(keysOf(section), (QStringList{"DisplayTrialNameFormat", "TrialAutoNameFormat"}));

    const auto display = page.trialDisplayNameFormatSetting();
    QCOMPARE(display->labelText(), QStringLiteral("Name Format"));
    QCOMPARE(display->descriptionText(),
             QStringLiteral("Construct trial names to display in list views (example: [<Name>/<Year><Month><Day]> or "
                            "[<Name>-<property name>])"));
    QCOMPARE(display->displayHint(), QStringLiteral("MinimumWidth=250;"));
    QCOMPARE(display->displayHintValue(QStringLiteral("MinimumWidth")), QStringLiteral("250"));
    QCOMPARE(page.trialDisplayNameFormat(), QStringLiteral("<Name>"));

    const auto autoName = page.trialAutoNameFormatSetting();
    QCOMPARE(autoName->labelText(), QStringLiteral("AutoName Format"));
    QCOMPARE(autoName->descriptionText(), QStringLiteral("Use this prefix for trial names measured without a template."));
    QCOMPARE(page.trialAutoNameFormat(), QStringLiteral("Trial"));
}

void TestComparePageSettings::jobViewPersists()
{
    QTemporaryDir dir;
    QVERIFY(dir.isValid());
    {
        SettingsManager manager(dir.path());
        auto page = std::make_shared<JobViewSettings>();
        QVERIFY(manager.registerClientSettings(page));
        QVERIFY(page->trialDisplayNameFormatSetting()->setValue(QStringLiteral("<Name> <Day>.<Month>.")));
        QVERIFY(manager.saveClientSettings());
    }
    SettingsManager manager(dir.path());
    auto page = std::make_shared<JobViewSettings>();
    QVERIFY(manager.registerClientSettings(page));
    QCOMPARE(page->trialDisplayNameFormat(), QStringLiteral("<Name> <Day>.<Month>."));
    QCOMPARE(page->trialAutoNameFormat(), QStringLiteral("Trial"));
}

void TestComparePageSettings::singleTrialSections()
{
    SingleTrialViewSettings page;
    QCOMPARE(page.ownerName(), QStringLiteral("SingleTrialView"));
    QVERIFY(page.colorCompareSettings());
    QVERIFY(page.textureCompareSettings());
    QCOMPARE(page.colorCompareSettings()->enabledTableColorSpace(), EColorSpace::CIELab);
    QVERIFY(page.colorCompareSettings()->tableTolerancesEnabled());
    QVERIFY(page.textureCompareSettings()->showTextureImages());
    QCOMPARE(page.setting(QStringLiteral("TableDEMetrics")), page.colorCompareSettings()->tableDEMetricsSetting());
    // The single-trial page has no plots.
    QCOMPARE(page.colorCompareSettings()->colorPlotCount(), 0);
    QVERIFY(!page.setting(QStringLiteral("TrendPlotMetrics")));
}

void TestComparePageSettings::settingsEditorShowsThePage()
{
    auto page = std::make_shared<JobDetailViewSettings>();
    SettingsWidget editor(page);
    editor.resize(720, 900);
    editor.show();
    QVERIFY(QTest::qWaitForWindowExposed(&editor));

    for (int i = 1; i <= 9; ++i) {
        const QString prefix = QStringLiteral("Lab-Plot/Lab-Plot %1/").arg(i);
        auto *geometry = editor.findChild<QComboBox *>(prefix + QStringLiteral("Geometry"));
        QVERIFY2(geometry, qPrintable(prefix));
        QCOMPARE(geometry->itemText(0), QStringLiteral("Dynamic"));
    }
    QVERIFY(editor.findChild<QWidget *>(QStringLiteral("TableDEMetrics")));
    QVERIFY(editor.findChild<QWidget *>(QStringLiteral("ShowStandardValues")));

    // VEXA_GRAB_DIR asks for snapshots of the editor, for looking at the layout.
    const QString grabDir = qEnvironmentVariable("VEXA_GRAB_DIR");
    if (!grabDir.isEmpty()) {
        QVERIFY(editor.grab().save(grabDir + QStringLiteral("/jobdetail-settings.png")));
        if (auto *tabs = editor.findChild<QTabWidget *>()) {
            tabs->setCurrentIndex(5);
            QVERIFY(tabs->grab().save(grabDir + QStringLiteral("/jobdetail-labplot.png")));
        }
    }
}

QTEST_MAIN(TestComparePageSettings)
#include "tst_comparepagesettings.moc"

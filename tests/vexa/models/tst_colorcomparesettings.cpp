#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/colorspace.h>
#include <vexa/models/jobdetailviewsettings.h>
#include <vexa/plots/colorplotsettings.h>

#include <colorimetry/colordifferencecalculator.h>

#include <domain/labvalue.h>

#include <settings/boolsetting.h>
#include <settings/settingslistsetting.h>
#include <settings/settingsmanager.h>
#include <settings/stringlistsetting.h>

#include <QJsonArray>
#include <QJsonObject>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

#include <cmath>

using namespace vexa;

Q_DECLARE_METATYPE(vexa::EColorSpaceDelta)

namespace {

std::shared_ptr<ColorCompareSettings> freshSettings()
{
    auto settings = std::make_shared<ColorCompareSettings>(QStringLiteral("Color"), QStringLiteral("Color Data"));
    settings->createSettings();
    return settings;
}

QStringList values(const std::vector<StringPair> &pairs)
{
    QStringList list;
    for (const StringPair &pair : pairs)
        list.append(pair.value);
    return list;
}

QStringList columnNames(const std::vector<EColorSpaceCoordinate> &coordinates)
{
    QStringList names;
    for (EColorSpaceCoordinate coordinate : coordinates)
        names.append(colorSpaceCoordinateName(coordinate));
    return names;
}

} // namespace

class TestColorCompareSettings : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void settingDeclarations_data();
    void settingDeclarations();
    void freshGroupShowsDefaults();
    void colorPlotDefaults_data();
    void colorPlotDefaults();
    void coordinatesOfSelection_data();
    void coordinatesOfSelection();
    void tableAndTrendTolerancesAreIndependent();
    void plotMetricsAreLimitedToFour_data();
    void plotMetricsAreLimitedToFour();
    void missingSettingsReadAsNothingSelected();
    void colorPlotSettingsLayout();
    void colorPlotAlwaysEnabled();
    void colorPlotGeometryChoice_data();
    void colorPlotGeometryChoice();
    void cloneKeepsTypeAndValues();
    void reloadedUnknownPlotSectionKeepsType();
    void changesPersistThroughManager();
    void pageGroupNotifiesPlotChanges();
    void toleranceGroups();
    void coordinateNames_data();
    void coordinateNames();
    void deltaNamesRoundTrip();
    void deltaValues_data();
    void deltaValues();
    void deltaOfInvalidValueIsNaN();
};

void TestColorCompareSettings::settingDeclarations_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("label");
    QTest::addColumn<QString>("description");
    QTest::addColumn<bool>("singleSelect");
    QTest::addColumn<QStringList>("firstValues");
    QTest::addColumn<QStringList>("defaults");

    QTest::newRow("table coordinates")
        << "TableColorSpaceCoordinates" << "Displayed Color Coordinates" << "Displayed Color Coordinates" << true
        << QStringList{"CIELab", "CIELCh", "CIELabCh", "None"} << QStringList{"CIELab"};
    QTest::newRow("standard coordinates")
        << "TableStandardColorSpaceCoordinates" << "Display Standard Coordinates as columns in table"
        << "Display as columns" << true << QStringList{"CIELab", "CIELCh", "CIELabCh", "None"}
        << QStringList{"None"};
    QTest::newRow("table metrics") << "TableDEMetrics" << "Displayed DE metrics" << "Displayed DE Metrics" << false
                                   << QStringList{"Tolerances", "dECIELab"} << QStringList{"Tolerances"};
    QTest::newRow("trend metrics") << "TrendPlotMetrics" << "Select max 4 of trend plot metrics"
                                   << "Trend Plot Metrics" << false << QStringList{"Tolerances", "dECIELab"}
                                   << QStringList{"Tolerances"};
    QTest::newRow("box plot metrics") << "BoxPlotMetrics" << "Select max 4 of box plot metrics" << "Box Plot Metrics"
                                      << false << QStringList{"dECIELab"} << QStringList{"dE2000"};
}

void TestColorCompareSettings::settingDeclarations()
{
    QFETCH(QString, key);
    QFETCH(QString, label);
    QFETCH(QString, description);
    QFETCH(bool, singleSelect);
    QFETCH(QStringList, firstValues);
    QFETCH(QStringList, defaults);

    const auto settings = freshSettings();
    const auto setting = settings->setting<StringListSetting>(key);
    QVERIFY(setting);
    QCOMPARE(setting->labelText(), label);
    QCOMPARE(setting->descriptionText(), description);
    QCOMPARE(setting->isSingleSelect(), singleSelect);
    QVERIFY(setting->useComboBox());
    QCOMPARE(values(setting->possibleValues()).mid(0, firstValues.size()), firstValues);
    QCOMPARE(setting->defaultValues(), defaults);
    QCOMPARE(setting->selectedValues(), defaults);
    if (!singleSelect) {
        // Every metric is offered, and "dE2000" among them.
        QVERIFY(setting->hasPossibleValue(QStringLiteral("dE2000")));
        QVERIFY(setting->hasPossibleValue(QStringLiteral("dECIELab")));
        const int offset = setting->hasPossibleValue(QStringLiteral("Tolerances")) ? 1 : 0;
        QCOMPARE(setting->possibleValues().size(), availableColorSpaceDeltas().size() + offset);
    }
}

void TestColorCompareSettings::freshGroupShowsDefaults()
{
    const auto settings = freshSettings();
    QCOMPARE(settings->enabledTableColorSpace(), EColorSpace::CIELab);
    QCOMPARE(columnNames(settings->enabledTableColorSpaceCoordinates()), (QStringList{"L*", "a*", "b*"}));
    QCOMPARE(settings->enabledTableStandardColorSpace(), EColorSpace::None);
    QVERIFY(settings->enabledTableStandardColorSpaceCoordinates().empty());
    QVERIFY(settings->tableTolerancesEnabled());
    QVERIFY(settings->enabledTableDEMetrics().empty());
    QVERIFY(settings->trendTolerancesEnabled());
    QVERIFY(settings->enabledTrendPlotMetrics().isEmpty());
    QCOMPARE(settings->enabledBoxPlotMetrics(), QStringList{"dE2000"});
    QCOMPARE(settings->colorPlotCount(), 9);

    const auto standard = settings->tableStandardColorSpaceCoordinatesSetting();
    QCOMPARE(standard->displayTextForValue(QStringLiteral("None")), QStringLiteral("None (Show as top rows)"));
    QCOMPARE(settings->tableColorSpaceCoordinatesSetting()->displayTextForValue(QStringLiteral("None")),
             QStringLiteral("None"));
}

void TestColorCompareSettings::colorPlotDefaults_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("geometry");
    const QStringList expected{"45as15", "45as25", "45as45", "45as75", "45as110",
                               "Dynamic", "Dynamic", "Dynamic", "Dynamic"};
    for (int i = 0; i < expected.size(); ++i)
        QTest::addRow("Lab-Plot %d", i + 1) << i << expected.at(i);
}

void TestColorCompareSettings::colorPlotDefaults()
{
    QFETCH(int, index);
    QFETCH(QString, geometry);

    const auto settings = freshSettings();
    const auto plot = settings->colorPlotSettings(index);
    QVERIFY(plot);
    QCOMPARE(plot->sectionName(), QStringLiteral("Lab-Plot %1").arg(index + 1));
    QCOMPARE(plot->geometry(), geometry);
    QCOMPARE(plot->isDynamicGeometry(), geometry == QLatin1String("Dynamic"));
    QVERIFY(plot->isLabPlotEnabled());
    QVERIFY(!plot->showHueCircle());
    QVERIFY(plot->showTintedBackground());
    // The section's geometry is also its default, so "restore defaults" keeps it.
    plot->setGeometry(QStringLiteral("15as80"));
    plot->resetToDefaults();
    QCOMPARE(plot->geometry(), geometry);
}

void TestColorCompareSettings::coordinatesOfSelection_data()
{
    QTest::addColumn<QString>("selected");
    QTest::addColumn<QStringList>("trialColumns");
    QTest::addColumn<QStringList>("standardColumns");

    QTest::newRow("CIELab") << "CIELab" << QStringList{"L*", "a*", "b*"} << QStringList{"Std_L*", "Std_a*", "Std_b*"};
    QTest::newRow("CIELCh") << "CIELCh" << QStringList{"L*", "C*", "h°"} << QStringList{"Std_L*", "Std_C*", "Std_h°"};
    QTest::newRow("CIELabCh") << "CIELabCh" << QStringList{"L*", "a*", "b*", "C*", "h°"}
                              << QStringList{"Std_L*", "Std_a*", "Std_b*", "Std_C*", "Std_h°"};
    QTest::newRow("None") << "None" << QStringList{} << QStringList{};
}

void TestColorCompareSettings::coordinatesOfSelection()
{
    QFETCH(QString, selected);
    QFETCH(QStringList, trialColumns);
    QFETCH(QStringList, standardColumns);

    const auto settings = freshSettings();
    QVERIFY(settings->tableColorSpaceCoordinatesSetting()->setSelectedValue(selected));
    QVERIFY(settings->tableStandardColorSpaceCoordinatesSetting()->setSelectedValue(selected));

    QCOMPARE(columnNames(settings->enabledTableColorSpaceCoordinates()), trialColumns);
    QStringList standardNames;
    for (EColorSpaceCoordinate coordinate : settings->enabledTableStandardColorSpaceCoordinates())
        standardNames.append(standardColorSpaceCoordinateName(coordinate));
    QCOMPARE(standardNames, standardColumns);
}

void TestColorCompareSettings::tableAndTrendTolerancesAreIndependent()
{
    const auto settings = freshSettings();
    const auto table = settings->tableDEMetricsSetting();
    const auto trend = settings->trendPlotMetricsSetting();

    QVERIFY(table->setSelectedValues({"dE2000", "dL"}));
    QVERIFY(!settings->tableTolerancesEnabled());
    QVERIFY(settings->trendTolerancesEnabled());
    // Offered order, not the order of selection.
    QCOMPARE(values(settings->enabledTableDEMetrics()), (QStringList{"dL", "dE2000"}));
    QCOMPARE(settings->enabledTableDEMetrics().front().displayText, colorSpaceDeltaDisplayName(EColorSpaceDelta::dL));
    QCOMPARE(settings->enabledTableDEMetricDeltas(), (std::vector<EColorSpaceDelta>{EColorSpaceDelta::dL,
                                                                                    EColorSpaceDelta::dE2000}));

    QVERIFY(trend->setSelectedValues({"dE94"}));
    QVERIFY(!settings->trendTolerancesEnabled());
    QVERIFY(table->setSelectedValues({"Tolerances"}));
    QVERIFY(settings->tableTolerancesEnabled());
    QVERIFY(!settings->trendTolerancesEnabled());
    QCOMPARE(settings->enabledTrendPlotMetrics(), QStringList{"dE94"});
}

void TestColorCompareSettings::plotMetricsAreLimitedToFour_data()
{
    QTest::addColumn<QString>("key");
    QTest::newRow("trend") << "TrendPlotMetrics";
    QTest::newRow("box plot") << "BoxPlotMetrics";
}

void TestColorCompareSettings::plotMetricsAreLimitedToFour()
{
    QFETCH(QString, key);

    const auto settings = freshSettings();
    const auto setting = settings->setting<StringListSetting>(key);
    QVERIFY(setting);
    QCOMPARE(setting->maximumSelectionCount(), 4);
    QCOMPARE(setting->maximumSelectionMessage(), QStringLiteral("At most 4 metrics can be selected."));

    const QStringList four{"dECIELab", "dL", "da", "dE2000"};
    QVERIFY(setting->setSelectedValues(four));
    QVERIFY(!setting->setSelectedValues(four + QStringList{"dE94"}));
    QVERIFY(!setting->didSelectByValue(QStringLiteral("dE94")));
    QCOMPARE(setting->selectedValues(), four);

    // The table has no limit.
    QVERIFY(settings->tableDEMetricsSetting()->setSelectedValues(four + QStringList{"dE94", "dE99"}));
}

void TestColorCompareSettings::missingSettingsReadAsNothingSelected()
{
    ColorCompareSettings empty(QStringLiteral("Empty"), QString());
    QVERIFY(empty.enabledTableColorSpaceCoordinates().empty());
    QVERIFY(empty.enabledTableDEMetrics().empty());
    QVERIFY(empty.enabledBoxPlotMetrics().isEmpty());
    QVERIFY(!empty.tableTolerancesEnabled());
    QVERIFY(!empty.trendTolerancesEnabled());
    QVERIFY(!empty.colorPlotSettings(0));
    QCOMPARE(empty.colorPlotCount(), 0);

    const auto settings = freshSettings();
    QVERIFY(!settings->colorPlotSettings(-1));
    QVERIFY(!settings->colorPlotSettings(9));
}

void TestColorCompareSettings::colorPlotSettingsLayout()
{
    ColorPlotSettings plot(false, QStringLiteral("Plot"), QStringLiteral("Plot title"), std::string());
    QCOMPARE(plot.sectionName(), QStringLiteral("Plot"));
    QCOMPARE(plot.displayName(), QStringLiteral("Plot title"));

    QStringList keys;
    for (const auto &setting : plot.settings())
        keys.append(setting->key());
    QCOMPARE(keys, (QStringList{"Enabled", "Geometry", "showHueCircle", "showTintedBackground"}));

    QVERIFY(!plot.isLabPlotEnabled());
    QCOMPARE(plot.geometry(), QStringLiteral("Dynamic"));
    QCOMPARE(plot.enabledSetting()->labelText(), QStringLiteral("Select if you want dynamic Lab plot geometry data"));
    QCOMPARE(plot.geometrySetting()->labelText(), QStringLiteral("Select fixed geometry"));
    QCOMPARE(plot.showHueCircleSetting()->labelText(), QStringLiteral("Show Hue circle"));
    QCOMPARE(plot.showHueCircleSetting()->descriptionText(),
             QStringLiteral("Select if you want show the Hue circle and Chroma line"));
    QCOMPARE(plot.showTintedBackgroundSetting()->labelText(), QStringLiteral("tinted background"));
    QCOMPARE(plot.showTintedBackgroundSetting()->descriptionText(),
             QStringLiteral("Select if you want to tint the plots's background with the standard's directional Lab "
                            "colors"));

    const auto geometry = plot.geometrySetting();
    QVERIFY(geometry->isSingleSelect());
    QVERIFY(geometry->useComboBox());
    QCOMPARE(geometry->possibleValues().front().value, QStringLiteral("Dynamic"));
    for (const char *text : {"45as15", "45as25", "45as45", "45as75", "45as110", "15as-45"})
        QVERIFY2(geometry->hasPossibleValue(QString::fromLatin1(text)), text);
}

void TestColorCompareSettings::colorPlotAlwaysEnabled()
{
    ColorPlotSettings plot(false, QStringLiteral("Plot"), QString());
    plot.setLabPlotAlwaysEnabled(true);
    QVERIFY(plot.isLabPlotEnabled());
    QVERIFY(plot.enabledSetting()->isReadOnly());
    plot.setLabPlotEnabled(false);
    QVERIFY(plot.isLabPlotEnabled());

    plot.setLabPlotAlwaysEnabled(false);
    QVERIFY(!plot.enabledSetting()->isReadOnly());
    plot.setLabPlotEnabled(false);
    QVERIFY(!plot.isLabPlotEnabled());
}

void TestColorCompareSettings::colorPlotGeometryChoice_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("accepted");
    QTest::addColumn<QString>("stored");

    QTest::newRow("fixed") << "45as110" << true << "45as110";
    QTest::newRow("N spelling") << "45asN15" << true << "45as-15";
    QTest::newRow("dynamic") << "Dynamic" << true << "Dynamic";
    QTest::newRow("not offered") << "d8" << false << "45as25";
    QTest::newRow("garbage") << "sideways" << false << "45as25";
    QTest::newRow("empty") << "" << false << "45as25";
}

void TestColorCompareSettings::colorPlotGeometryChoice()
{
    QFETCH(QString, text);
    QFETCH(bool, accepted);
    QFETCH(QString, stored);

    ColorPlotSettings plot(true, QStringLiteral("Plot"), QString(), "45as25");
    QCOMPARE(plot.setGeometry(text), accepted);
    QCOMPARE(plot.geometry(), stored);
}

void TestColorCompareSettings::cloneKeepsTypeAndValues()
{
    ColorPlotSettings plot(true, QStringLiteral("Plot"), QString(), "45as45");
    plot.setLabPlotAlwaysEnabled(true);
    plot.setShowHueCircle(true);
    plot.setGeometry(QStringLiteral("15as15"));

    const auto copy = std::dynamic_pointer_cast<ColorPlotSettings>(plot.clone(QStringLiteral("Copy"), QStringLiteral("Copy title")));
    QVERIFY(copy);
    QCOMPARE(copy->sectionName(), QStringLiteral("Copy"));
    QCOMPARE(copy->displayName(), QStringLiteral("Copy title"));
    QCOMPARE(copy->geometry(), QStringLiteral("15as15"));
    QCOMPARE(copy->defaultGeometry(), QStringLiteral("45as45"));
    QVERIFY(copy->showHueCircle());
    QVERIFY(copy->isLabPlotAlwaysEnabled());
    // Independent settings.
    copy->setShowHueCircle(false);
    QVERIFY(plot.showHueCircle());
}

void TestColorCompareSettings::reloadedUnknownPlotSectionKeepsType()
{
    const auto settings = freshSettings();
    const auto list = settings->colorPlotGeometrySettings();
    QJsonArray stored = list->toJson().toArray();
    stored.append(QJsonObject{{"name", "Lab-Plot 10"},
                              {"displayName", "Lab-Plot 10"},
                              {"values", QJsonObject{{"Geometry", QJsonArray{"15as45"}}}}});
    QVERIFY(list->fromJson(stored));
    QCOMPARE(settings->colorPlotCount(), 10);
    const auto added = settings->colorPlotSettings(9);
    QVERIFY(added);
    QCOMPARE(added->geometry(), QStringLiteral("15as45"));
}

void TestColorCompareSettings::changesPersistThroughManager()
{
    QTemporaryDir dir;
    QVERIFY(dir.isValid());
    {
        SettingsManager manager(dir.path());
        auto page = std::make_shared<JobDetailViewSettings>();
        QVERIFY(manager.registerClientSettings(page));
        const auto color = page->colorCompareSettings();
        QVERIFY(color->tableColorSpaceCoordinatesSetting()->setSelectedValue(QStringLiteral("CIELCh")));
        QVERIFY(color->tableDEMetricsSetting()->setSelectedValues({"dE2000", "dH"}));
        QVERIFY(color->colorPlotSettings(6)->setGeometry(QStringLiteral("15as80")));
        color->colorPlotSettings(0)->setLabPlotEnabled(false);
        QVERIFY(manager.saveClientSettings({page}, page->version()));
    }
    SettingsManager reloaded(dir.path());
    auto page = std::make_shared<JobDetailViewSettings>();
    const auto plotBefore = page->colorCompareSettings()->colorPlotSettings(6);
    QVERIFY(reloaded.registerClientSettings(page));
    const auto color = page->colorCompareSettings();
    QCOMPARE(color->enabledTableColorSpace(), EColorSpace::CIELCh);
    QVERIFY(!color->tableTolerancesEnabled());
    QCOMPARE(values(color->enabledTableDEMetrics()), (QStringList{"dH", "dE2000"}));
    QCOMPARE(color->colorPlotCount(), 9);
    // Sections are updated in place: a plot keeps its settings object.
    QCOMPARE(color->colorPlotSettings(6), plotBefore);
    QCOMPARE(color->colorPlotSettings(6)->geometry(), QStringLiteral("15as80"));
    QVERIFY(!color->colorPlotSettings(0)->isLabPlotEnabled());
    QCOMPARE(color->colorPlotSettings(7)->geometry(), QStringLiteral("Dynamic"));
}

void TestColorCompareSettings::pageGroupNotifiesPlotChanges()
{
    JobDetailViewSettings page;
    QSignalSpy pageSpy(&page, &CommonSettings::settingsChanged);
    QSignalSpy colorSpy(page.colorCompareSettings().get(), &CommonSettings::settingsChanged);
    const auto plot = page.colorCompareSettings()->colorPlotSettings(8);
    QVERIFY(plot->setGeometry(QStringLiteral("45as45")));
    QCOMPARE(pageSpy.count(), 1);
    QCOMPARE(colorSpy.count(), 1);
    // Choosing what is already chosen changes nothing.
    QVERIFY(plot->setGeometry(QStringLiteral("45as45")));
    QCOMPARE(pageSpy.count(), 1);
}

void TestColorCompareSettings::toleranceGroups()
{
    const auto settings = freshSettings();
    for (const char *group : {"CIEL", "DIN 6175-2", "Audi"})
        QVERIFY2(settings->allowToleranceGroup(QString::fromLatin1(group)), group);
    QVERIFY(!settings->allowToleranceGroup(QString()));
    settings->setAllowedToleranceGroup({QStringLiteral("Audi")});
    QVERIFY(settings->allowToleranceGroup(QStringLiteral("Audi")));
    QVERIFY(!settings->allowToleranceGroup(QStringLiteral("CIEL")));
    settings->setAllowedToleranceGroup({});
    QVERIFY(!settings->allowToleranceGroup(QStringLiteral("Audi")));
}

void TestColorCompareSettings::coordinateNames_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("isTrial");
    QTest::addColumn<bool>("isStandard");

    QTest::newRow("L*") << "L*" << true << false;
    QTest::newRow("h°") << "h°" << true << false;
    QTest::newRow("Std_C*") << "Std_C*" << false << true;
    QTest::newRow("Std_h°") << "Std_h°" << false << true;
    QTest::newRow("lower case") << "l*" << false << false;
    QTest::newRow("prefix only") << "Std_" << false << false;
    QTest::newRow("empty") << "" << false << false;
}

void TestColorCompareSettings::coordinateNames()
{
    QFETCH(QString, name);
    QFETCH(bool, isTrial);
    QFETCH(bool, isStandard);

    EColorSpaceCoordinate coordinate = EColorSpaceCoordinate::L;
    QCOMPARE(didGetColorSpaceCoordinateForName(name, coordinate), isTrial);
    if (isTrial)
        QCOMPARE(colorSpaceCoordinateName(coordinate), name);
    QCOMPARE(didGetStandardColorSpaceCoordinateForName(name, coordinate), isStandard);
    if (isStandard)
        QCOMPARE(standardColorSpaceCoordinateName(coordinate), name);
}

void TestColorCompareSettings::deltaNamesRoundTrip()
{
    QSet<QString> names;
    for (EColorSpaceDelta delta : availableColorSpaceDeltas()) {
        const QString name = colorSpaceDeltaName(delta);
        EColorSpaceDelta parsed = EColorSpaceDelta::dL;
        QVERIFY2(didGetColorSpaceDeltaForName(name, parsed), qPrintable(name));
        QCOMPARE(parsed, delta);
        QVERIFY(!colorSpaceDeltaDisplayName(delta).isEmpty());
        QVERIFY2(ColorDifferenceCalculator::isKnownFormula(colorSpaceDeltaFormula(delta)), qPrintable(name));
        names.insert(name);
    }
    QCOMPARE(names.size(), int(availableColorSpaceDeltas().size()));
    EColorSpaceDelta parsed = EColorSpaceDelta::dL;
    QVERIFY(!didGetColorSpaceDeltaForName(QStringLiteral("Tolerances"), parsed));
    QVERIFY(!didGetColorSpaceDeltaForName(QStringLiteral("de2000"), parsed));
}

void TestColorCompareSettings::deltaValues_data()
{
    QTest::addColumn<EColorSpaceDelta>("delta");
    QTest::addColumn<double>("expected");

    const LabValue standard(50.0, 10.0, 20.0);
    const LabValue trial(52.0, 7.0, 24.0);
    QTest::newRow("dL") << EColorSpaceDelta::dL << 2.0;
    QTest::newRow("da") << EColorSpaceDelta::da << -3.0;
    QTest::newRow("db") << EColorSpaceDelta::db << 4.0;
    QTest::newRow("dC") << EColorSpaceDelta::dC << std::hypot(7.0, 24.0) - std::hypot(10.0, 20.0);
    QTest::newRow("dECIELab") << EColorSpaceDelta::dECIELab << std::sqrt(4.0 + 9.0 + 16.0);
    QTest::newRow("dE2000") << EColorSpaceDelta::dE2000
                            << ColorDifferenceCalculator::Default_DE("CIE2000", standard, trial);
    QTest::newRow("dECMC") << EColorSpaceDelta::dECMC << ColorDifferenceCalculator::Default_DE("CMC", standard, trial);
    QTest::newRow("dE99o") << EColorSpaceDelta::dE99o
                           << ColorDifferenceCalculator::Default_DE("DIN99o", standard, trial);
}

void TestColorCompareSettings::deltaValues()
{
    QFETCH(EColorSpaceDelta, delta);
    QFETCH(double, expected);

    const LabValue standard(50.0, 10.0, 20.0);
    const LabValue trial(52.0, 7.0, 24.0);
    const double value = colorSpaceDeltaValue(delta, standard, trial);
    QVERIFY(std::isfinite(value));
    QVERIFY2(std::abs(value - expected) < 1e-9, qPrintable(QString::number(value)));
}

void TestColorCompareSettings::deltaOfInvalidValueIsNaN()
{
    const LabValue valid(50.0, 0.0, 0.0);
    for (EColorSpaceDelta delta : availableColorSpaceDeltas()) {
        QVERIFY(std::isnan(colorSpaceDeltaValue(delta, LabValue(), valid)));
        QVERIFY(std::isnan(colorSpaceDeltaValue(delta, valid, LabValue())));
    }
    QVERIFY(std::isnan(colorSpaceCoordinateValue(EColorSpaceCoordinate::h, LabValue())));
}

QTEST_MAIN(TestColorCompareSettings)
#include "tst_colorcomparesettings.moc"

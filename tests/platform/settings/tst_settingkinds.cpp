#include <settings/boolsetting.h>
#include <settings/commonsettings.h>
#include <settings/doublesetting.h>
#include <settings/intsetting.h>
#include <settings/recentlist.h>
#include <settings/settingslistsetting.h>
#include <settings/settingssection.h>
#include <settings/stringlistsetting.h>
#include <settings/stringsetting.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QSignalSpy>
#include <QtTest>

#include <cmath>
#include <limits>

namespace {
// A section subclass with a typed accessor, like the colour plot settings.
class PlotSection : public SettingsSection
{
public:
    explicit PlotSection(const QString &name, const QString &title = QString())
        : SettingsSection(name, title)
    {
        addSetting(std::make_shared<BoolSetting>(QStringLiteral("Enabled"), true, QStringLiteral("Enabled")));
        auto geometry = std::make_shared<StringListSetting>(QStringLiteral("Geometry"), QStringLiteral("Geometry"));
        geometry->setSingleSelect(true);
        geometry->addPossibleValue(StringPair(QStringLiteral("Dynamic")), true);
        geometry->addPossibleValue(StringPair(QStringLiteral("45as15")));
        geometry->addPossibleValue(StringPair(QStringLiteral("45as45")));
        addSetting(geometry);
    }
    QString geometry() const { return setting<StringListSetting>(QStringLiteral("Geometry"))->selectedValue(); }
    std::shared_ptr<SettingsSection> clone(const QString &name, const QString &title) const override
    {
        auto copy = std::make_shared<PlotSection>(name, title);
        copy->copyValuesFrom(*this);
        return copy;
    }
};

std::shared_ptr<StringListSetting> metricsSetting(int maximum)
{
    auto setting = std::make_shared<StringListSetting>(QStringLiteral("TrendPlotMetrics"),
                                                       QStringLiteral("Select max 4 of trend plot metrics"));
    setting->setUseComboBox(true);
    for (const char *metric : {"Tolerances", "dE2000", "dECIELab", "dL", "da", "db"})
        setting->addPossibleValue(StringPair(QString::fromLatin1(metric)), QLatin1String(metric) == "Tolerances");
    setting->setMaximumSelectionCount(maximum);
    return setting;
}
} // namespace

class tst_SettingKinds : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void acceptsOrRejectsValues_data();
    void acceptsOrRejectsValues();
    void setterThatChangesNothingEmitsNothing();
    void rangeChangeClampsValue();
    void cloneIsIndependent();
    void stringListSingleSelect();
    void stringListMultiSelectAndMaximum();
    void stringListKeepsChoiceOrder();
    void settingsListFromTemplate();
    void settingsListJsonKeepsSectionObjects();
    void settingsListRejectsMalformedJson_data();
    void settingsListRejectsMalformedJson();
    void groupJsonIgnoresUnknownAndKeepsMissing();
    void groupSignalsOncePerBatch();
    void recentList();
};

void tst_SettingKinds::acceptsOrRejectsValues_data()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<QVariant>("candidate");
    QTest::addColumn<bool>("accepted");

    QTest::newRow("bool-true") << "bool" << QVariant(true) << true;
    QTest::newRow("bool-text-yes") << "bool" << QVariant(QStringLiteral("yes")) << false;
    QTest::newRow("bool-number") << "bool" << QVariant(1) << false;
    QTest::newRow("int-in-range") << "int" << QVariant(7) << true;
    QTest::newRow("int-json-double-integral") << "int" << QVariant(8.0) << true;
    QTest::newRow("int-fraction") << "int" << QVariant(7.5) << false;
    QTest::newRow("int-above-range") << "int" << QVariant(11) << false;
    QTest::newRow("int-text") << "int" << QVariant(QStringLiteral("5")) << false;
    QTest::newRow("double-in-range") << "double" << QVariant(0.25) << true;
    QTest::newRow("double-nan") << "double" << QVariant(std::nan("")) << false;
    QTest::newRow("double-infinity") << "double" << QVariant(std::numeric_limits<double>::infinity()) << false;
    QTest::newRow("double-below-range") << "double" << QVariant(-0.5) << false;
    QTest::newRow("string-matching") << "string" << QVariant(QStringLiteral("ab12")) << true;
    QTest::newRow("string-not-matching") << "string" << QVariant(QStringLiteral("ab-12")) << false;
    QTest::newRow("string-partial-match-is-not-enough") << "string" << QVariant(QStringLiteral("ab12 ")) << false;
    QTest::newRow("string-default-always-ok") << "string" << QVariant(QString()) << true;
    QTest::newRow("string-number") << "string" << QVariant(12) << false;
    QTest::newRow("list-known") << "list" << QVariant(QStringList{QStringLiteral("dE2000")}) << true;
    QTest::newRow("list-unknown") << "list" << QVariant(QStringList{QStringLiteral("dX")}) << false;
    QTest::newRow("list-non-string-entry") << "list" << QVariant(QVariantList{QVariant(3)}) << false;
}

void tst_SettingKinds::acceptsOrRejectsValues()
{
    QFETCH(QString, kind);
    QFETCH(QVariant, candidate);
    QFETCH(bool, accepted);

    std::shared_ptr<BaseSetting> setting;
    if (kind == "bool") {
        setting = std::make_shared<BoolSetting>("k", false, "label");
    } else if (kind == "int") {
        auto intSetting = std::make_shared<IntSetting>("k", 3, "label");
        intSetting->setRange(0, 10);
        setting = intSetting;
    } else if (kind == "double") {
        auto doubleSetting = std::make_shared<DoubleSetting>("k", 0.5, "label");
        doubleSetting->setRange(0.0, 1.0);
        setting = doubleSetting;
    } else if (kind == "string") {
        auto stringSetting = std::make_shared<StringSetting>("k", QString(), "label");
        stringSetting->setRegularExpression(QRegularExpression("[a-z]+[0-9]*"));
        stringSetting->setValue("abc");
        setting = stringSetting;
    } else {
        setting = metricsSetting(0);
    }

    const QVariant before = setting->variantValue();
    QSignalSpy spy(setting.get(), &BaseSetting::sgValueChanged);
    QCOMPARE(setting->setVariantValue(candidate), accepted);
    if (!accepted) {
        QCOMPARE(setting->variantValue(), before);
        QCOMPARE(spy.count(), 0);
        // The same fault read from a settings file is reported, not swallowed.
        QStringList errors;
        QVERIFY(!setting->fromJson(QJsonValue::fromVariant(candidate), &errors) || candidate.isNull());
        QCOMPARE(setting->variantValue(), before);
    } else {
        QCOMPARE(spy.count(), setting->variantValue() == before ? 0 : 1);
    }
}

void tst_SettingKinds::setterThatChangesNothingEmitsNothing()
{
    BoolSetting flag("flag", true, "Flag");
    QSignalSpy flagSpy(&flag, &BaseSetting::sgValueChanged);
    flag.setValue(true);
    QCOMPARE(flagSpy.count(), 0);
    flag.setValue(false);
    flag.setValue(false);
    QCOMPARE(flagSpy.count(), 1);
    flag.resetToDefault();
    QCOMPARE(flagSpy.count(), 2);
    QVERIFY(flag.isDefault());

    auto metrics = metricsSetting(0);
    QSignalSpy listSpy(metrics.get(), &BaseSetting::sgValueChanged);
    QVERIFY(metrics->setSelectedValues({"Tolerances"}));
    QVERIFY(metrics->didSelectByValue("Tolerances"));
    QCOMPARE(listSpy.count(), 0);
}

void tst_SettingKinds::rangeChangeClampsValue()
{
    IntSetting port("port", 80, "Port");
    QVERIFY(port.setValue(70000)); // no range yet
    port.setRange(1, 65535);
    QCOMPARE(port.value(), 65535);
    QCOMPARE(port.defaultValue(), 80);
    port.setRange(1, 1024);
    QCOMPARE(port.value(), 1024);
    QVERIFY(!port.setValue(0));

    DoubleSetting weight("w", 5.0, "Weight");
    weight.setRange(0.0, 2.0);
    QCOMPARE(weight.value(), 2.0);
    QCOMPARE(weight.defaultValue(), 2.0);
}

void tst_SettingKinds::cloneIsIndependent()
{
    StringSetting name("DisplayTrialNameFormat", "<Name>", "Name Format", "desc", StringSetting::DisplayType::Plain,
                       "MinimumWidth=250;");
    name.setRegularExpression(QRegularExpression("<.*"));
    name.setIsReadOnly(true);
    const auto copy = std::dynamic_pointer_cast<StringSetting>(name.clone());
    QVERIFY(copy);
    QVERIFY(copy->isReadOnly());
    QCOMPARE(copy->displayHintValue("MinimumWidth"), QStringLiteral("250"));
    QVERIFY(!copy->setValue("no bracket"));
    QVERIFY(copy->setValue("<Year>"));
    QCOMPARE(name.value(), QStringLiteral("<Name>"));
    QVERIFY(name.assignValue(*copy));
    QCOMPARE(name.value(), QStringLiteral("<Year>"));
}

void tst_SettingKinds::stringListSingleSelect()
{
    StringListSetting coordinates("TableStandardColorSpaceCoordinates", "Display Standard Coordinates");
    coordinates.setSingleSelect(true);
    coordinates.setUseComboBox(true);
    coordinates.addPossibleValue(StringPair("CIELab"), false);
    coordinates.addPossibleValue(StringPair("CIELCh"), false);
    coordinates.addPossibleValue(StringPair("None", "None (Show as top rows)"), true);
    QCOMPARE(coordinates.selectedValue(), QStringLiteral("None"));
    QCOMPARE(coordinates.valueDisplayText(), QStringLiteral("None (Show as top rows)"));

    QVERIFY(coordinates.didSelectByValue("CIELCh"));
    QCOMPARE(coordinates.selectedValues(), QStringList{"CIELCh"});
    QVERIFY(!coordinates.didSelectByValue("XYZ"));
    QVERIFY(!coordinates.setSelectedValues({"CIELab", "CIELCh"}));
    QCOMPARE(coordinates.selectedValue(), QStringLiteral("CIELCh"));
    coordinates.resetToDefault();
    QCOMPARE(coordinates.selectedValue(), QStringLiteral("None"));
}

void tst_SettingKinds::stringListMultiSelectAndMaximum()
{
    auto metrics = metricsSetting(4);
    QVERIFY(metrics->didSelectByValue("dE2000"));
    QVERIFY(metrics->didSelectByValue("dL"));
    QVERIFY(metrics->didSelectByValue("da"));
    QCOMPARE(metrics->selectedValues().size(), 4);
    QSignalSpy spy(metrics.get(), &BaseSetting::sgValueChanged);
    QVERIFY(!metrics->didSelectByValue("db"));
    QVERIFY(!metrics->setSelectedValues({"dE2000", "dECIELab", "dL", "da", "db"}));
    QCOMPARE(spy.count(), 0);
    QCOMPARE(metrics->selectedValues().size(), 4);
    QVERIFY(metrics->maximumSelectionMessage().contains("4"));
    QVERIFY(metrics->setValueSelected("Tolerances", false));
    QVERIFY(metrics->didSelectByValue("db"));
    QCOMPARE(metrics->valueDisplayText(), QStringLiteral("dE2000, dL, da, db"));
}

void tst_SettingKinds::stringListKeepsChoiceOrder()
{
    auto metrics = metricsSetting(0);
    QVERIFY(metrics->setSelectedValues({"db", "dE2000", "db", "Tolerances"}));
    QCOMPARE(metrics->selectedValues(), (QStringList{"Tolerances", "dE2000", "db"}));

    // A setting without choices is a free list in the given order.
    StringListSetting servers("DispatcherList", "Servers");
    QVERIFY(servers.setSelectedValues({"b:1", "a:2"}));
    QCOMPARE(servers.selectedValues(), (QStringList{"b:1", "a:2"}));
}

void tst_SettingKinds::settingsListFromTemplate()
{
    SettingsListSetting plots("Lab-Plot", "Lab-Plot", "Lab-Plot");
    QVERIFY(!plots.addSection("Lab-Plot 1")); // no template yet
    plots.setTemplateSectionSettings(std::make_shared<PlotSection>("Template"));
    plots.setUseTabWidget(true);

    QSignalSpy spy(&plots, &BaseSetting::sgValueChanged);
    for (int i = 1; i <= 3; ++i)
        QVERIFY(plots.addSection(QStringLiteral("Lab-Plot %1").arg(i)));
    QCOMPARE(spy.count(), 3);
    QVERIFY(!plots.addSection("Lab-Plot 2")); // names are unique
    QCOMPARE(plots.sectionCount(), 3);

    auto second = std::dynamic_pointer_cast<PlotSection>(plots.section(1));
    QVERIFY2(second, "sections made from the template keep the template's type");
    QVERIFY(plots.updateSectionSetting("Lab-Plot 2", "Geometry", QStringList{"45as45"}));
    QCOMPARE(second->geometry(), QStringLiteral("45as45"));
    QCOMPARE(std::static_pointer_cast<PlotSection>(plots.section(0))->geometry(), QStringLiteral("Dynamic"));
    QCOMPARE(spy.count(), 4);
    QVERIFY(!plots.updateSectionSetting("Lab-Plot 2", "Geometry", QStringList{"110"}));
    QVERIFY(!plots.updateSectionSetting("Lab-Plot 9", "Geometry", QStringList{"45as45"}));

    QVERIFY(plots.removeSection("Lab-Plot 1"));
    QVERIFY(!plots.removeSection("Lab-Plot 1"));
    QVERIFY(!plots.removeSection(5));
    QCOMPARE(plots.settingsList().front()->sectionName(), QStringLiteral("Lab-Plot 2"));
    QCOMPARE(spy.count(), 5);

    const auto copy = std::static_pointer_cast<SettingsListSetting>(plots.clone());
    QVERIFY(copy->useTabWidget());
    QCOMPARE(copy->sectionCount(), 2);
    QVERIFY(copy->section(0) != plots.section(0));
    copy->updateSectionSetting("Lab-Plot 3", "Enabled", false);
    QVERIFY(plots.assignValue(*copy));
    QCOMPARE(plots.section("Lab-Plot 3")->setting<BoolSetting>("Enabled")->value(), false);

    plots.resetToDefault();
    QVERIFY(plots.isDefault());
    QCOMPARE(plots.sectionCount(), 2);
}

void tst_SettingKinds::settingsListJsonKeepsSectionObjects()
{
    SettingsListSetting entries("Dir Entries", "Folders");
    entries.setTemplateSectionSettings(std::make_shared<PlotSection>("TemplateDirEntry"));
    const auto kept = entries.addSection("DirEntry_0");
    entries.addSection("DirEntry_1");

    const QJsonArray stored = QJsonDocument::fromJson(R"([
        {"name": "DirEntry_2", "displayName": "", "values": {"Geometry": ["45as15"]}},
        {"name": "DirEntry_0", "values": {"Enabled": false, "Unknown": 3}}
    ])").array();
    QSignalSpy spy(&entries, &BaseSetting::sgValueChanged);
    QVERIFY(entries.fromJson(stored));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(entries.sectionCount(), 2);
    QCOMPARE(entries.section(0)->sectionName(), QStringLiteral("DirEntry_2"));
    QCOMPARE(entries.section(1), kept);
    QCOMPARE(kept->setting<BoolSetting>("Enabled")->value(), false);
    QVERIFY(!entries.section("DirEntry_1"));
    QCOMPARE(std::static_pointer_cast<PlotSection>(entries.section(0))->geometry(), QStringLiteral("45as15"));

    // Round trip.
    SettingsListSetting other("Dir Entries", "Folders");
    other.setTemplateSectionSettings(std::make_shared<PlotSection>("TemplateDirEntry"));
    QVERIFY(other.fromJson(entries.toJson()));
    QCOMPARE(other.toJson(), entries.toJson());
}

void tst_SettingKinds::settingsListRejectsMalformedJson_data()
{
    QTest::addColumn<QByteArray>("json");
    QTest::newRow("not-an-array") << QByteArray(R"({"a": 1})");
    QTest::newRow("entry-without-name") << QByteArray(R"([{"values": {}}])");
    QTest::newRow("entry-not-object") << QByteArray(R"([3])");
    QTest::newRow("duplicate-names") << QByteArray(R"([{"name": "A"}, {"name": "A"}])");
}

void tst_SettingKinds::settingsListRejectsMalformedJson()
{
    QFETCH(QByteArray, json);
    SettingsListSetting list("L", "L");
    list.setTemplateSectionSettings(std::make_shared<PlotSection>("T"));
    list.addSection("Keep");
    const QJsonDocument document = QJsonDocument::fromJson(json);
    const QJsonValue value = document.isArray() ? QJsonValue(document.array()) : QJsonValue(document.object());
    QStringList errors;
    QVERIFY(!list.fromJson(value, &errors));
    QVERIFY(!errors.isEmpty());
    QCOMPARE(list.sectionCount(), 1);
    QCOMPARE(list.section(0)->sectionName(), QStringLiteral("Keep"));
}

void tst_SettingKinds::groupJsonIgnoresUnknownAndKeepsMissing()
{
    CommonSettings group("FolderPicker", "Folder Picker");
    auto index = std::make_shared<IntSetting>("lastSelectedIndex", -1, "Last");
    index->setIsVisible(false);
    QVERIFY(group.addSetting(index, "Main", "Folder Picker"));
    QVERIFY(group.addSetting(std::make_shared<StringSetting>("name", "n", "Name"), "Folder Picker"));
    QVERIFY(!group.addSetting(std::make_shared<StringSetting>("name", "x", "Name"), "Folder Picker"));
    QCOMPARE(group.section("Folder Picker")->groupName(), QStringLiteral("Main"));
    QCOMPARE(group.setting<IntSetting>("lastSelectedIndex"), index);

    QStringList errors;
    const QJsonObject stored =
        QJsonDocument::fromJson(R"({"Folder Picker": {"lastSelectedIndex": 2, "gone": true}, "Old": {"x": 1}})")
            .object();
    QVERIFY(group.fromJson(stored, &errors));
    QVERIFY(errors.isEmpty());
    QCOMPARE(index->value(), 2);
    QCOMPARE(group.setting<StringSetting>("name")->value(), QStringLiteral("n"));

    QVERIFY(!group.fromJson(QJsonDocument::fromJson(R"({"Folder Picker": {"lastSelectedIndex": "two"}})").object(),
                            &errors));
    QCOMPARE(index->value(), 2);
    QCOMPARE(errors.size(), 1);
    QVERIFY(errors.first().contains("lastSelectedIndex"));
}

void tst_SettingKinds::groupSignalsOncePerBatch()
{
    CommonSettings group("JobView", "Job View");
    auto a = std::make_shared<BoolSetting>("a", false, "A");
    auto b = std::make_shared<BoolSetting>("b", false, "B");
    group.addSetting(a, "AutoName");
    group.addSetting(b, "AutoName");
    QSignalSpy spy(&group, &CommonSettings::settingsChanged);
    a->setValue(true);
    QCOMPARE(spy.count(), 1);

    CommonSettings source("JobView");
    source.addSetting(std::make_shared<BoolSetting>("a", false, "A"), "AutoName");
    source.addSetting(std::make_shared<BoolSetting>("b", true, "B"), "AutoName");
    group.setSettings(source);
    QCOMPARE(spy.count(), 2);
    QCOMPARE(a->value(), false);
    QCOMPARE(b->value(), true);
    group.setSettings(source); // nothing differs
    QCOMPARE(spy.count(), 2);
}

void tst_SettingKinds::recentList()
{
    RecentList list(3);
    for (const char *value : {"a", "b", "c", "b", "", "d"})
        list.setCurrent(QString::fromLatin1(value));
    QCOMPARE(list.values(), (QStringList{"d", "b", "c"}));
    QCOMPARE(list.current(), QStringLiteral("d"));

    const RecentList tricky({"x;y", "q\"uote", "x;y"}, 5);
    QCOMPARE(tricky.values(), (QStringList{"x;y", "q\"uote"}));
    QCOMPARE(RecentList::fromString(tricky.toString(), 5), tricky);
    QVERIFY(RecentList::fromString("not json").isEmpty());
    QVERIFY(RecentList::fromString("[1, 2]").isEmpty());
    list.setMaximumLength(1);
    QCOMPARE(list.values(), QStringList{"d"});
}

QTEST_GUILESS_MAIN(tst_SettingKinds)
#include "tst_settingkinds.moc"

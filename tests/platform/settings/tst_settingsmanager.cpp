#include <settings/boolsetting.h>
#include <settings/generalsettings.h>
#include <settings/localsettings.h>
#include <settings/settingsmanager.h>
#include <settings/stringlistsetting.h>

#include <utilities/logger.h>

#include <QFile>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

namespace {
class RecordingSink : public LogInterface
{
public:
    void log(LogLevel level, LogCategory category, const QString &message) override
    {
        if (level == LogLevel::Error && category == LogCategory::Settings)
            errors << message;
    }
    QStringList errors;
};

class PageSettings : public CommonSettings
{
public:
    PageSettings()
        : CommonSettings("JobView", "Job View")
    {
    }
    void createSettings() override
    {
        addSetting(std::make_shared<BoolSetting>("ShowStandardValues", true, "Show standard values"), "AutoName");
    }
    bool showStandardValues() const { return setting<BoolSetting>("ShowStandardValues")->value(); }
    void setShowStandardValues(bool show) { setting<BoolSetting>("ShowStandardValues")->setValue(show); }
};

void writeFile(const QString &path, const QByteArray &bytes)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(bytes);
}
} // namespace

class tst_SettingsManager : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void init();
    void cleanup();
    void defaults();
    void persistsAcrossRestart();
    void keepsGroupsThatAreNotRegistered();
    void saveSelectedGroupsWithVersion();
    void faultyFileFallsBackToDefaults_data();
    void faultyFileFallsBackToDefaults();
    void registrationRules();
    void environmentChoosesLocation();

private:
    std::unique_ptr<QTemporaryDir> m_dir;
    RecordingSink m_sink;
};

void tst_SettingsManager::init()
{
    m_dir = std::make_unique<QTemporaryDir>();
    QVERIFY(m_dir->isValid());
    m_sink.errors.clear();
    Logger::instance().registerLogger(&m_sink);
}

void tst_SettingsManager::cleanup()
{
    Logger::instance().unregisterLogger(&m_sink);
}

void tst_SettingsManager::defaults()
{
    SettingsManager manager(m_dir->path());
    const auto general = manager.getGeneralSettings();
    QCOMPARE(general->colorimetricCondition(), QStringLiteral("D65/10"));
    QCOMPARE(general->deltaE_Formula(), QStringLiteral("CIE2000"));
    QCOMPARE(general->exportDelimiter(), QStringLiteral(";"));
    QCOMPARE(GeneralSettings::availableColorimetricConditions().size(), 20);
    QVERIFY(general->exportColorDataEnabled());
    QVERIFY(!general->exportTextureImagesEnabled());
    QVERIFY(!general->setColorimetricCondition("D65/5"));
    QVERIFY(!general->setDeltaE_Formula("CIE76"));
    QCOMPARE(manager.getLocalSettings()->corvidServerPortNumber(), int(LocalSettings::DefaultPortNumber));
    QVERIFY(!manager.getLocalSettings()->setCorvidServerPortNumber(0));
    QVERIFY(!manager.getLocalSettings()->setCorvidServerIP_Address("no spaces allowed"));
    QVERIFY(!QFile::exists(manager.settingsFilePath())); // nothing is written without a save
    QVERIFY(m_sink.errors.isEmpty());
}

void tst_SettingsManager::persistsAcrossRestart()
{
    {
        SettingsManager manager(m_dir->path());
        auto general = manager.getGeneralSettings();
        general->setColorimetricCondition("F11/2");
        general->setDeltaE_Formula("DIN99o");
        general->setDispatcherList({"server:8765", "other:1"});
        general->setExportDelimiter("\t");
        general->setExportTextureImagesEnabled(true);
        general->setExportBoxPlotsEnabled(false);
        auto local = manager.getLocalSettings();
        QVERIFY(local->setCorvidServerIP_Address("192.168.10.4"));
        QVERIFY(local->setCorvidServerPortNumber(9000));
        local->setLastUserName("jane");
        auto page = std::make_shared<PageSettings>();
        QVERIFY(manager.registerClientSettings(page));
        page->setShowStandardValues(false);
        QVERIFY(manager.saveClientSettings());
    }
    SettingsManager manager(m_dir->path());
    QSignalSpy loaded(&manager, &SettingsManager::sgLoadClientSettingsSuccess);
    auto page = std::make_shared<PageSettings>();
    QSignalSpy changed(page.get(), &CommonSettings::settingsChanged);
    QVERIFY(manager.registerClientSettings(page));
    QCOMPARE(page->showStandardValues(), false);
    const auto general = manager.getGeneralSettings();
    QCOMPARE(general->colorimetricCondition(), QStringLiteral("F11/2"));
    QCOMPARE(general->deltaE_Formula(), QStringLiteral("DIN99o"));
    QCOMPARE(general->dispatcherList(), (QStringList{"server:8765", "other:1"}));
    QCOMPARE(general->exportDelimiter(), QStringLiteral("\t"));
    QVERIFY(general->exportTextureImagesEnabled());
    QVERIFY(!general->exportBoxPlotsEnabled());
    QCOMPARE(manager.getLocalSettings()->corvidServerIP_Address(), QStringLiteral("192.168.10.4"));
    QCOMPARE(manager.getLocalSettings()->corvidServerPortNumber(), 9000);
    QCOMPARE(manager.getLocalSettings()->lastUserName(), QStringLiteral("jane"));

    // An explicit reload reapplies the file and reports success once.
    page->setShowStandardValues(true);
    changed.clear();
    QVERIFY(manager.loadClientSettings());
    QCOMPARE(loaded.count(), 1);
    QCOMPARE(page->showStandardValues(), false);
    QCOMPARE(changed.count(), 1);
    QVERIFY(m_sink.errors.isEmpty());
}

void tst_SettingsManager::keepsGroupsThatAreNotRegistered()
{
    {
        SettingsManager manager(m_dir->path());
        auto page = std::make_shared<PageSettings>();
        manager.registerClientSettings(page);
        page->setShowStandardValues(false);
        manager.saveClientSettings();
    }
    {
        // This run never registers the page but saves the rest.
        SettingsManager manager(m_dir->path());
        manager.getGeneralSettings()->setDeltaE_Formula("CMC");
        QVERIFY(manager.saveClientSettings());
    }
    SettingsManager manager(m_dir->path());
    auto page = std::make_shared<PageSettings>();
    manager.registerClientSettings(page);
    QCOMPARE(page->showStandardValues(), false);
    QCOMPARE(manager.getGeneralSettings()->deltaE_Formula(), QStringLiteral("CMC"));
}

void tst_SettingsManager::saveSelectedGroupsWithVersion()
{
    SettingsManager manager(m_dir->path());
    auto page = std::make_shared<PageSettings>();
    manager.registerClientSettings(page);
    page->setShowStandardValues(false);
    manager.getGeneralSettings()->setDeltaE_Formula("CMC");
    QVERIFY(manager.saveClientSettings({page}, 3));

    QFile file(manager.settingsFilePath());
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QJsonObject groups = QJsonDocument::fromJson(file.readAll()).object().value("groups").toObject();
    QCOMPARE(groups.value("JobView").toObject().value("version").toInt(), 3);
    QVERIFY(!groups.contains(GeneralSettings::OwnerName));
}

void tst_SettingsManager::faultyFileFallsBackToDefaults_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QString>("reason");
    QTest::newRow("garbage") << QByteArray("\x01\x02 this is not json \xff") << "";
    QTest::newRow("truncated") << QByteArray(R"({"format": 1, "groups": {"GeneralSettings": {"version": 1, "sett)")
                               << "";
    QTest::newRow("empty-file") << QByteArray() << "empty";
    QTest::newRow("top-level-array") << QByteArray("[1, 2]") << "not an object";
    QTest::newRow("groups-not-object") << QByteArray(R"({"groups": 5})") << "groups";
    QTest::newRow("wrong-value-types")
        << QByteArray(R"({"groups": {"GeneralSettings": {"version": 1, "settings": {"Colorimetry":
               {"ColorimetricCondition": 42, "DeltaE_Formula": ["CMC"]}, "Export": {"ExportBoxPlots": "yes"}}},
               "JobView": {"version": 1, "settings": {"AutoName": {"ShowStandardValues": false}}}}})")
        << "ExportBoxPlots";
    QTest::newRow("group-not-object") << QByteArray(R"({"groups": {"JobView": [true]}})") << "JobView";
}

void tst_SettingsManager::faultyFileFallsBackToDefaults()
{
    QFETCH(QByteArray, content);
    QFETCH(QString, reason);
    const QString path = m_dir->filePath("settings.json");
    writeFile(path, content);

    SettingsManager manager(m_dir->path());
    QSignalSpy failed(&manager, &SettingsManager::sgLoadClientSettingsFailed);
    auto page = std::make_shared<PageSettings>();
    QVERIFY(manager.registerClientSettings(page));
    const auto general = manager.getGeneralSettings();
    QCOMPARE(general->colorimetricCondition(), QStringLiteral("D65/10"));
    QVERIFY(general->exportBoxPlotsEnabled());
    if (QByteArray(QTest::currentDataTag()) == "wrong-value-types") {
        // Good values next to bad ones are still read.
        QCOMPARE(general->deltaE_Formula(), QStringLiteral("CMC"));
        QCOMPARE(page->showStandardValues(), false);
    } else {
        QCOMPARE(general->deltaE_Formula(), QStringLiteral("CIE2000"));
        QCOMPARE(page->showStandardValues(), true);
    }

    // Logged once, naming the file; the original is untouched and copied aside.
    QCOMPARE(m_sink.errors.size(), 1);
    QVERIFY2(m_sink.errors.first().contains(path), qPrintable(m_sink.errors.first()));
    QVERIFY2(m_sink.errors.first().contains(reason), qPrintable(m_sink.errors.first()));
    const QString backup = path + ".corrupt";
    QCOMPARE(manager.lastBackupFilePath(), backup);
    QFile backupFile(backup);
    QVERIFY(backupFile.open(QIODevice::ReadOnly));
    QCOMPARE(backupFile.readAll(), content);
    QFile original(path);
    QVERIFY(original.open(QIODevice::ReadOnly));
    QCOMPARE(original.readAll(), content);
    original.close();

    // A reload reports the fault; a second backup does not replace the first.
    QVERIFY(!manager.loadClientSettings());
    QCOMPARE(failed.count(), 1);
    QVERIFY(QFile::exists(backup));
    QVERIFY(manager.lastBackupFilePath() != backup);

    // An explicit save repairs the file.
    QVERIFY(manager.saveClientSettings());
    SettingsManager again(m_dir->path());
    QSignalSpy loaded(&again, &SettingsManager::sgLoadClientSettingsSuccess);
    QVERIFY(again.loadClientSettings());
    QCOMPARE(loaded.count(), 1);
}

void tst_SettingsManager::registrationRules()
{
    SettingsManager manager(m_dir->path());
    auto page = std::make_shared<PageSettings>();
    QVERIFY(!manager.registerClientSettings(nullptr));
    QVERIFY(manager.registerClientSettings(page));
    QVERIFY(page->setting("ShowStandardValues")); // createSettings() was called
    QVERIFY(manager.registerClientSettings(page)); // again: harmless
    QVERIFY(!manager.registerClientSettings(std::make_shared<PageSettings>()));
    QCOMPARE(manager.clientSettings("JobView"), page);
    QCOMPARE(manager.registeredSettings().size(), size_t(3));
    QVERIFY(manager.unregisterClientSettings("JobView"));
    QVERIFY(!manager.unregisterClientSettings("JobView"));
    QVERIFY(!manager.clientSettings("JobView"));
}

void tst_SettingsManager::environmentChoosesLocation()
{
    qputenv("VEXA_SETTINGS_DIR", m_dir->path().toUtf8());
    SettingsManager manager;
    QCOMPARE(manager.settingsFilePath(), m_dir->filePath("settings.json"));
    manager.setStorageLocation(m_dir->filePath("sub/dir"));
    QVERIFY(manager.saveClientSettings());
    QVERIFY(QFile::exists(m_dir->filePath("sub/dir/settings.json")));
    qunsetenv("VEXA_SETTINGS_DIR");
}

QTEST_GUILESS_MAIN(tst_SettingsManager)
#include "tst_settingsmanager.moc"

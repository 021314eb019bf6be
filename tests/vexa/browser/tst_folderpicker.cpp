#include <vexa/browser/direntrysettings.h>
#include <vexa/browser/folderpickersettings.h>
#include <vexa/browser/folderpickerwidget.h>
#include <vexa/browser/selectedpath.h>
#include <vexa/browser/selectedpathsettings.h>

#include <domain/globaldirentry.h>
#include <settings/intsetting.h>
#include <settings/settingslistsetting.h>
#include <settings/settingsmanager.h>

#include <QComboBox>
#include <QLabel>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

namespace {

GlobalDirEntry folder(const QString &id, const QString &name, const QStringList &path, const QStringList &names)
{
    GlobalDirEntry entry;
    entry.setEntryObjectId(id);
    entry.setEntryObjectType(QStringLiteral("Folder"));
    entry.header().setName(name);
    entry.header().setCreationTimestamp(Timestamp(2024, 3, 5, 7, 8, 9));
    entry.setPath(path);
    entry.setStringPath(names);
    entry.setDispatcherID(QStringLiteral("/data/lab.vexastore"));
    entry.setVersion(3);
    entry.setIsStored(true);
    return entry;
}

} // namespace

// The remembered folders and the last selected path, persisted by the settings library.
class tst_FolderPicker : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void dirEntrySettingsHoldAnEntry();
    void rememberedFoldersPersist();
    void forgettingRewritesTheSections();
    void pickerShowsTheFolders();
    void selectedPathPersists_data();
    void selectedPathPersists();
};

void tst_FolderPicker::dirEntrySettingsHoldAnEntry()
{
    DirEntrySettings section(QStringLiteral("DirEntry_0"));
    QStringList keys;
    QStringList shown;
    for (const auto &setting : section.settings()) {
        keys << setting->key();
        if (setting->isVisible())
            shown << setting->key();
    }
    QCOMPARE(keys, (QStringList{"currentIndex", "dispatcherID", "SelectedPath", "SelectedPathAsString", "header_name",
                                "header_version", "header_creationTimestamp", "header_creatorId", "header_uuid",
                                "header_variant", "header_isStored", "dirEntry_objectType", "dirEntry_objectId",
                                "dirEntry_version", "dirEntry_uuid", "dirEntry_variant", "dirEntry_isStored"}));
    QCOMPARE(shown, (QStringList{"dispatcherID", "SelectedPath", "SelectedPathAsString"}));
    QVERIFY(!section.globalDirEntry());

    const GlobalDirEntry entry = folder("f2", "Silver Trials", {"f1"}, {"Standards"});
    section.setGlobalDirEntry(entry);
    const auto read = section.globalDirEntry();
    QVERIFY(read);
    QString difference;
    QCOMPARE(read->entryObjectId(), QStringLiteral("f2"));
    QCOMPARE(read->path(), QStringList{"f1"});
    QCOMPARE(read->stringPath(), QStringList{"Standards"});
    QCOMPARE(read->header().creationTimestamp(), entry.header().creationTimestamp());
    QCOMPARE(read->version(), 3);
    QVERIFY(read->isStored());
    QCOMPARE(section.displayText(), QStringLiteral("/Standards/Silver Trials"));
    // A copy keeps its kind (the settings list makes its sections by cloning).
    QVERIFY(std::dynamic_pointer_cast<DirEntrySettings>(section.clone(QStringLiteral("x"))));
}

void tst_FolderPicker::rememberedFoldersPersist()
{
    QTemporaryDir dir;
    {
        SettingsManager manager(dir.path());
        auto settings = std::make_shared<FolderPickerSettings>();
        QVERIFY(manager.registerClientSettings(settings));
        settings->chooseDirEntry(folder("a", "A", {}, {}));
        settings->chooseDirEntry(folder("b", "B", {"a"}, {"A"}));
        settings->chooseDirEntry(folder("a", "A", {}, {})); // known: moves to the front
        QCOMPARE(settings->dirEntries().size(), size_t(2));
        QCOMPARE(settings->lastSelectedIndex(), 0);
        QVERIFY(settings->chooseIndex(1));
        QVERIFY(!settings->chooseIndex(5));
        auto list = settings->setting<SettingsListSetting>(QStringLiteral("Dir Entries"));
        QCOMPARE(list->section(0)->sectionName(), QStringLiteral("DirEntry_0"));
        QCOMPARE(list->section(1)->sectionName(), QStringLiteral("DirEntry_1"));
        QVERIFY(!settings->setting(QStringLiteral("lastSelectedIndex"))->isVisible());
        QCOMPARE(settings->section(QStringLiteral("Folder Picker"))->groupName(), QStringLiteral("Main"));
        QVERIFY(manager.saveClientSettings());
    }
    SettingsManager manager(dir.path());
    auto settings = std::make_shared<FolderPickerSettings>();
    QVERIFY(manager.registerClientSettings(settings));
    const auto entries = settings->dirEntries();
    QCOMPARE(entries.size(), size_t(2));
    QCOMPARE(entries[0]->entryObjectId(), QStringLiteral("a"));
    QCOMPARE(entries[1]->entryObjectId(), QStringLiteral("b"));
    QCOMPARE(entries[1]->stringPath(), QStringList{"A"});
    QCOMPARE(settings->lastSelectedIndex(), 1);
    QCOMPARE(settings->lastSelectedDirEntry()->entryObjectId(), QStringLiteral("b"));
}

void tst_FolderPicker::forgettingRewritesTheSections()
{
    FolderPickerSettings settings;
    for (int i = 0; i < FolderPickerSettings::MaximumEntries + 3; ++i)
        settings.chooseDirEntry(folder(QString::number(i), QStringLiteral("F%1").arg(i), {}, {}));
    QCOMPARE(int(settings.dirEntries().size()), FolderPickerSettings::MaximumEntries);
    QVERIFY(settings.forgetObject(QStringLiteral("13")));
    QVERIFY(!settings.forgetObject(QStringLiteral("0"))); // fell off the end long ago
    auto list = settings.setting<SettingsListSetting>(QStringLiteral("Dir Entries"));
    for (int i = 0; i < list->sectionCount(); ++i) {
        QCOMPARE(list->section(i)->sectionName(), QStringLiteral("DirEntry_%1").arg(i));
        QCOMPARE(std::dynamic_pointer_cast<DirEntrySettings>(list->section(i))->currentIndex(), i);
    }
    QCOMPARE(settings.dirEntries().front()->entryObjectId(), QStringLiteral("14"));
}

void tst_FolderPicker::pickerShowsTheFolders()
{
    auto settings = std::make_shared<FolderPickerSettings>();
    settings->chooseDirEntry(folder("b", "B", {"a"}, {"A"}));
    settings->chooseDirEntry(folder("c", "C", {}, {}));
    FolderPickerWidget picker;
    picker.setSettings(settings);
    QCOMPARE(picker.findChild<QLabel *>("folderPickerLabel")->text(), QStringLiteral("Current Folder"));
    QCOMPARE(picker.comboBox()->count(), 2);
    QCOMPARE(picker.comboBox()->itemText(0), QStringLiteral("/C"));
    QCOMPARE(picker.comboBox()->itemText(1), QStringLiteral("/A/B"));
    QSignalSpy chosen(&picker, &FolderPickerWidget::sgFolderChosen);
    picker.comboBox()->setCurrentIndex(1);
    QCOMPARE(chosen.count(), 1);
    QCOMPARE(chosen.front().front().value<std::shared_ptr<GlobalDirEntry>>()->entryObjectId(), QStringLiteral("b"));
    QCOMPARE(settings->lastSelectedIndex(), 1);
    picker.onObjectDeleted("b");
    QCOMPARE(picker.comboBox()->count(), 1);
}

void tst_FolderPicker::selectedPathPersists_data()
{
    QTest::addColumn<QStringList>("path");
    QTest::newRow("top") << QStringList{};
    QTest::newRow("two folders") << QStringList{"f1", "f2"};
}

void tst_FolderPicker::selectedPathPersists()
{
    QFETCH(QStringList, path);
    QTemporaryDir dir;
    {
        SettingsManager manager(dir.path());
        auto settings = std::make_shared<SelectedPathSettings>();
        QVERIFY(manager.registerClientSettings(settings));
        settings->setSelectedPath(SelectedPath(QStringLiteral("/data/lab.vexastore"), path));
        QVERIFY(manager.saveClientSettings());
    }
    SettingsManager manager(dir.path());
    auto settings = std::make_shared<SelectedPathSettings>();
    QVERIFY(manager.registerClientSettings(settings));
    QCOMPARE(settings->selectedPath()->path(), path);
    QCOMPARE(settings->selectedPath()->dispatcherId(), QStringLiteral("/data/lab.vexastore"));
    QCOMPARE(settings->section(QStringLiteral("Object Browser"))->groupName(), QStringLiteral("Main"));
    QVERIFY(settings->setting(QStringLiteral("SelectedPath"))->isVisible());
    QVERIFY(settings->setting(QStringLiteral("DispatcherId"))->isVisible());
}

QTEST_MAIN(tst_FolderPicker)
#include "tst_folderpicker.moc"

// Renders the object browser and the tree of edited objects over a small lab store, as the
// documentation shows them (set VEXA_SCREENSHOT_DIR to keep the pictures), and checks that
// what a person would look for is on them.

#include "browserfixtures.h"

#include <vexa/browser/corvidobjectsclientmodel.h>
#include <vexa/browser/direntrybrowserinterface.h>
#include <vexa/browser/direntrybrowserwidget.h>
#include <vexa/browser/direntrypersistancemanager.h>
#include <vexa/browser/direntrytreemodel.h>
#include <vexa/browser/folderpickersettings.h>
#include <vexa/browser/objectbrowserwidget.h>
#include <vexa/browser/selectedpath.h>

#include <domain/domainmetatypes.h>
#include <domain/globaldirentry.h>

#include <QBuffer>
#include <QDir>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;
using namespace browserfixtures;

class tst_BrowserScreenshot : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void browserAndEditedObjects();

private:
    static void keep(const QImage &image, const QString &name);
};

void tst_BrowserScreenshot::keep(const QImage &image, const QString &name)
{
    const QString target = qEnvironmentVariable("VEXA_SCREENSHOT_DIR");
    if (!target.isEmpty())
        QVERIFY(image.save(QDir(target).filePath(name)));
}

void tst_BrowserScreenshot::browserAndEditedObjects()
{
    registerDomainMetaTypes();
    QTemporaryDir dir;
    LabStore lab = makeLabStore(dir.filePath("lab.vexastore"));
    CorvidModel corvid;
    const std::string id = browserfixtures::connect(corvid, lab.path)->dispatcherId();
    corvid.setDefaultDispatcherId(id);

    ObjectBrowserWidget browser;
    browser.initialize(&corvid, id);
    auto favourites = std::make_shared<FolderPickerSettings>();
    browser.setFolderPickerSettings(favourites);
    browser.setCaption(QStringLiteral("lab.vexastore"));
    browser.resize(640, 360);
    browser.show();
    QVERIFY(QTest::qWaitForWindowExposed(&browser));
    browser.setCurrentFolderPath(SelectedPath(QString::fromStdString(id), {lab.ids["Standards"]}));
    QTRY_COMPARE(browser.detailModel()->rowCount(browser.detailView()->rootIndex()), 2);
    browser.addCurrentFolderToFavourites();
    QVERIFY(browser.selectObject(lab.ids["Silver"]));
    browser.folderView()->expandAll();
    QTest::qWait(200);
    browser.showMessage(QStringLiteral("Error occured during DeleteObject: The folder \"Archive\" is not empty. (2007)"));
    const QImage browserImage = browser.grab().toImage();
    QCOMPARE(browserImage.size(), browser.size() * browser.devicePixelRatioF());
    keep(browserImage, QStringLiteral("object-browser.png"));

    auto manager = std::make_shared<DirEntryPersistanceManager>(corvid);
    DirEntryTreeModel model;
    model.setPersistanceInferface(manager);
    model.initialize();
    DirEntryBrowserInterface kind(QStringLiteral("Tolerance set"), "ToleranceSet");
    DirEntryBrowserWidget edited;
    edited.initialize(&model, &kind);
    edited.resize(320, 200);
    edited.show();
    QVERIFY(QTest::qWaitForWindowExposed(&edited));
    for (const QString &name : {QStringLiteral("Silver tolerances"), QStringLiteral("Blue tolerances")}) {
        auto entry = std::make_shared<GlobalDirEntry>();
        entry->setEntryObjectId(lab.ids[name]);
        entry->setEntryObjectType(QStringLiteral("ToleranceSet"));
        entry->header().setName(name);
        entry->setDispatcherID(QString::fromStdString(id));
        entry->setPath({lab.ids["Tolerance Sets"]});
        entry->setStringPath({QStringLiteral("Tolerance Sets")});
        auto *node = edited.openDirEntry(entry);
        QTRY_VERIFY(node->isLoaded());
    }
    QVERIFY(model.setData(model.index(0, 0), QStringLiteral("Silver tolerances 2024"), Qt::EditRole));
    QCOMPARE(model.index(0, 0).data().toString(), QStringLiteral("Silver tolerances 2024 *"));
    edited.newObject();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    QTest::qWait(100);
    keep(edited.grab().toImage(), QStringLiteral("edited-objects.png"));
}

QTEST_MAIN(tst_BrowserScreenshot)
#include "tst_browserscreenshot.moc"

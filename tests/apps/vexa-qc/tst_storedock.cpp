#include "comparisonpage.h"
#include "mainwindow.h"
#include "storedock.h"

#include <vexa/browser/corvidobjectsclientmodel.h>
#include <vexa/browser/direntrybrowserwidget.h>
#include <vexa/browser/direntrytreemodel.h>
#include <vexa/browser/objectbrowserwidget.h>
#include <vexa/browser/selectedpath.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/jobdetailviewsettings.h>

#include <domain/domainmetatypes.h>
#include <domain/qcjob.h>
#include <settings/settingsmanager.h>
#include <store/sqliteobjectstore.h>
#include <tolerances/tolerancefactory.h>

#include <QComboBox>
#include <QDragEnterEvent>
#include <QLineEdit>
#include <QMimeData>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

namespace {

QModelIndex row(const QAbstractItemModel *model, const QString &name, const QModelIndex &parent)
{
    for (int r = 0; r < model->rowCount(parent); ++r) {
        const QModelIndex index = model->index(r, 0, parent);
        if (index.data().toString() == name)
            return index;
    }
    return QModelIndex();
}

// Sends a drag that enters, moves over and drops at a point of a view.
void dropAt(QAbstractItemView *view, const QPoint &point, QMimeData *data, Qt::DropAction action)
{
    QDragEnterEvent enter(point, action, data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(view->viewport(), &enter);
    QDragMoveEvent move(point, action, data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(view->viewport(), &move);
    QDropEvent drop(point, action, data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(view->viewport(), &drop);
}

} // namespace

// The workstation's Store dock used as a person would: open a job by double-click,
// rename a folder with F2, drag a tolerance set into another folder; the store file
// holds the result after the program is gone.
class tst_StoreDock : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void openJobByDoubleClick();
    void renameFolderWithF2();
    void dragToleranceSetIntoAnotherFolder();
    void openToleranceSetForEditing();
    void storeFileShowsTheResultAfterRestart();

private:
    void doubleClick(QAbstractItemView *view, const QModelIndex &index);
    QModelIndex detailRow(const QString &name);
    void showFolder(const QString &name);

    QTemporaryDir m_dir;
    QString m_store;
    std::unique_ptr<MainWindow> m_window;
    ObjectBrowserWidget *m_browser = nullptr;
    QString m_movedSet;
};

void tst_StoreDock::initTestCase()
{
    QVERIFY(m_dir.isValid());
    registerDomainMetaTypes();
    ToleranceFactory::toleranceFactory();
    SettingsManager::instance().setStorageLocation(m_dir.filePath("settings"));
    m_store = m_dir.filePath("store/sample.vexastore");
    auto viewSettings = std::make_shared<JobDetailViewSettings>();
    SettingsManager::instance().registerClientSettings(viewSettings);
    m_window = std::make_unique<MainWindow>(SettingsManager::instance().getGeneralSettings(), viewSettings);
    m_window->setMessageSink([](const QString &, const QString &text) { QFAIL(qPrintable(text)); });
    m_window->resize(1500, 900);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
    QSignalSpy shown(m_window.get(), &MainWindow::sgJobShown);
    m_window->openStore(m_store);
    QVERIFY(shown.wait(60000));
    QTRY_COMPARE(m_window->storeDock()->browsers().size(), 1);
    m_browser = m_window->storeDock()->browsers().front();
    QTRY_COMPARE(m_browser->detailModel()->rowCount(m_browser->detailView()->rootIndex()), 5);
}

void tst_StoreDock::doubleClick(QAbstractItemView *view, const QModelIndex &index)
{
    view->scrollTo(index);
    const QPoint point = view->visualRect(index).center();
    QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::NoModifier, point);
    QTest::mouseDClick(view->viewport(), Qt::LeftButton, Qt::NoModifier, point);
}

QModelIndex tst_StoreDock::detailRow(const QString &name)
{
    return row(m_browser->detailModel(), name, m_browser->detailView()->rootIndex());
}

void tst_StoreDock::showFolder(const QString &name)
{
    m_browser->setCurrentFolder(QModelIndex());
    QTRY_VERIFY(detailRow(name).isValid());
    doubleClick(m_browser->detailView(), detailRow(name));
    QTRY_COMPARE(m_browser->currentFolderPath()->pathToString(), QStringLiteral("/") + name);
    QTRY_VERIFY(m_browser->detailModel()->rowCount(m_browser->detailView()->rootIndex()) > 0);
}

void tst_StoreDock::openJobByDoubleClick()
{
    showFolder(QStringLiteral("QC Jobs"));
    const QString current = m_window->page()->dataModel()->qcJob()->name();
    QModelIndex other;
    for (int r = 0; r < m_browser->detailModel()->rowCount(m_browser->detailView()->rootIndex()); ++r) {
        const QModelIndex index = m_browser->detailModel()->index(r, 0, m_browser->detailView()->rootIndex());
        if (index.data(CorvidObjectsClientModel::ObjectTypeRole).toString() == QCJob::typeId()
            && index.data().toString() != current)
            other = index;
    }
    QVERIFY(other.isValid());
    const QString wanted = other.data().toString();
    QSignalSpy shown(m_window.get(), &MainWindow::sgJobShown);
    doubleClick(m_browser->detailView(), other);
    QVERIFY(shown.wait(30000));
    QCOMPARE(m_window->page()->dataModel()->qcJob()->name(), wanted);
    QCOMPARE(m_window->jobBox()->currentText(), wanted);
}

void tst_StoreDock::renameFolderWithF2()
{
    m_browser->setCurrentFolder(QModelIndex());
    QTRY_VERIFY(detailRow("Colorants").isValid());
    QAbstractItemView *view = m_browser->detailView();
    view->setFocus();
    QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::NoModifier, view->visualRect(detailRow("Colorants")).center());
    QTest::keyClick(view, Qt::Key_F2);
    auto *editor = view->findChild<QLineEdit *>();
    QVERIFY(editor);
    editor->selectAll();
    QTest::keyClicks(editor, QStringLiteral("Colorants 2024"));
    QTest::keyClick(editor, Qt::Key_Return);
    QTRY_VERIFY(detailRow("Colorants 2024").isValid());
    QVERIFY(m_browser->message().isEmpty());
}

void tst_StoreDock::dragToleranceSetIntoAnotherFolder()
{
    showFolder(QStringLiteral("Tolerance Sets"));
    const QModelIndex set = m_browser->detailModel()->index(0, 0, m_browser->detailView()->rootIndex());
    m_movedSet = set.data().toString();
    const int before = m_browser->detailModel()->rowCount(m_browser->detailView()->rootIndex());
    std::unique_ptr<QMimeData> data(m_browser->detailModel()->mimeData({set}));
    // Onto "Formulas" in the folder tree.
    QAbstractItemView *tree = m_browser->folderView();
    const QModelIndex formulas = row(tree->model(), QStringLiteral("Formulas"), QModelIndex());
    QVERIFY(formulas.isValid());
    dropAt(tree, tree->visualRect(formulas).center(), data.get(), Qt::MoveAction);
    QTRY_COMPARE(m_browser->detailModel()->rowCount(m_browser->detailView()->rootIndex()), before - 1);
    showFolder(QStringLiteral("Formulas"));
    QTRY_VERIFY(detailRow(m_movedSet).isValid());
    QVERIFY(m_browser->message().isEmpty());
}

void tst_StoreDock::openToleranceSetForEditing()
{
    showFolder(QStringLiteral("Formulas"));
    QTRY_VERIFY(detailRow(m_movedSet).isValid());
    doubleClick(m_browser->detailView(), detailRow(m_movedSet));
    DirEntryTreeModel *edited = m_window->storeDock()->editedModel();
    QTRY_COMPARE(edited->rowCount(), 1);
    QTRY_VERIFY(edited->dirEntryNodes().front()->isLoaded());
    QCOMPARE(edited->index(0, 0).data().toString(), m_movedSet);
}

void tst_StoreDock::storeFileShowsTheResultAfterRestart()
{
    m_browser = nullptr;
    m_window.reset(); // closes the store
    SqliteObjectStore store(m_store, SqliteObjectStore::OpenMode::MustExist);
    QVERIFY(store.open());
    std::vector<StoreRecord> top;
    QVERIFY(store.listEntries(QString(), {}, &top, nullptr));
    QString formulasId;
    QStringList names;
    for (const StoreRecord &record : top) {
        names << record.name;
        if (record.name == QLatin1String("Formulas"))
            formulasId = record.id;
    }
    QVERIFY2(names.contains(QStringLiteral("Colorants 2024")), qPrintable(names.join(", ")));
    QVERIFY(!names.contains(QStringLiteral("Colorants")));
    std::vector<StoreRecord> formulas;
    QVERIFY(store.listEntries(formulasId, {QStringLiteral("ToleranceSet")}, &formulas, nullptr));
    QCOMPARE(formulas.size(), size_t(1));
    QCOMPARE(formulas.front().name, m_movedSet);
}

QTEST_MAIN(tst_StoreDock)
#include "tst_storedock.moc"

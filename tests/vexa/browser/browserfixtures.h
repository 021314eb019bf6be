#pragma once

// Real store files and real dispatchers for the browser tests: a store filled through
// the store itself, a CorvidModel that opens it, waits on the GUI thread, and an
// answerer for the message boxes the browser asks.

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <context/serverid.h>
#include <domain/folder.h>
#include <domain/standard.h>
#include <domain/toleranceset.h>
#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>

#include <QAbstractButton>
#include <QAbstractItemModelTester>
#include <QIdentityProxyModel>
#include <QPushButton>
#include <QApplication>
#include <QMessageBox>
#include <QPointer>
#include <QTimer>
#include <QtTest>

#include <map>
#include <memory>

namespace browserfixtures {

// The invalid index of the browser's models answers more flags than the model tester
// allows (the empty area of a view is enabled, or stands for the root node), so the
// tester looks at them through this proxy, which shows the invalid index's drop flag alone.
class EmptyAreaDropFlagOnly : public QIdentityProxyModel
{
public:
    using QIdentityProxyModel::QIdentityProxyModel;
    Qt::ItemFlags flags(const QModelIndex &index) const override
    {
        const Qt::ItemFlags flags = QIdentityProxyModel::flags(index);
        return index.isValid() ? flags : flags & Qt::ItemIsDropEnabled;
    }
};

// A model tester looking through EmptyAreaDropFlagOnly.
struct ModelTester
{
    explicit ModelTester(QAbstractItemModel *model)
    {
        proxy.setSourceModel(model);
        tester = std::make_unique<QAbstractItemModelTester>(&proxy, QAbstractItemModelTester::FailureReportingMode::QtTest);
    }
    EmptyAreaDropFlagOnly proxy;
    std::unique_ptr<QAbstractItemModelTester> tester;
};

// Adds objects to a folder of a store file (the root for an empty id); returns their ids.
inline QStringList add(vexa::ObjectStore &store, const std::vector<std::shared_ptr<vexa::BaseObject>> &objects,
                       const QString &parent = QString())
{
    std::vector<vexa::StoreRecord> records(objects.size());
    vexa::ErrorInfo error;
    for (size_t i = 0; i < objects.size(); ++i) {
        if (!vexa::ObjectCodec::toRecord(*objects[i], &records[i], &error))
            qFatal("toRecord: %s", qPrintable(error.toString()));
    }
    if (!store.add(&records, parent, &error))
        qFatal("add: %s", qPrintable(error.toString()));
    QStringList ids;
    for (size_t i = 0; i < records.size(); ++i) {
        objects[i]->setId(records[i].id);
        objects[i]->setVersion(records[i].version);
        objects[i]->setIsStored(true);
        ids << records[i].id;
    }
    return ids;
}

template<class T>
std::shared_ptr<T> named(const QString &name)
{
    auto object = std::make_shared<T>();
    object->setName(name);
    return object;
}

// A small lab store:
//   Standards/ (Silver, Blue; Silver refers to "Silver tolerances")
//   Tolerance Sets/ (Silver tolerances, Blue tolerances)
//   Archive/ (Old/ with one tolerance set "Archived")
//   Empty/
struct LabStore
{
    QString path;
    std::map<QString, QString> ids; // by name
};

inline LabStore makeLabStore(const QString &path)
{
    LabStore lab;
    lab.path = path;
    vexa::SqliteObjectStore store(path);
    vexa::ErrorInfo error;
    if (!store.open(&error))
        qFatal("open: %s", qPrintable(error.toString()));
    const QStringList folders = add(store, {named<vexa::Folder>("Standards"), named<vexa::Folder>("Tolerance Sets"),
                                            named<vexa::Folder>("Archive"), named<vexa::Folder>("Empty")});
    lab.ids["Standards"] = folders[0];
    lab.ids["Tolerance Sets"] = folders[1];
    lab.ids["Archive"] = folders[2];
    lab.ids["Empty"] = folders[3];
    auto silverSet = named<vexa::ToleranceSet>("Silver tolerances");
    auto blueSet = named<vexa::ToleranceSet>("Blue tolerances");
    const QStringList sets = add(store, {silverSet, blueSet}, folders[1]);
    lab.ids["Silver tolerances"] = sets[0];
    lab.ids["Blue tolerances"] = sets[1];
    auto silver = named<vexa::Standard>("Silver");
    silver->setToleranceSets({silverSet});
    const QStringList standards = add(store, {silver, named<vexa::Standard>("Blue")}, folders[0]);
    lab.ids["Silver"] = standards[0];
    lab.ids["Blue"] = standards[1];
    const QStringList old = add(store, {named<vexa::Folder>("Old")}, folders[2]);
    lab.ids["Old"] = old[0];
    lab.ids["Archived"] = add(store, {named<vexa::ToleranceSet>("Archived")}, old[0])[0];
    store.close();
    return lab;
}

// The dispatcher of a store file, connected (waits on the GUI thread's event loop).
inline vexa::CommandDispatcher *connect(vexa::CorvidModel &model, const QString &path)
{
    vexa::CommandDispatcher *dispatcher = model.createCommandDispatcher(vexa::ServerId(path.toStdString(), 0));
    if (!QTest::qWaitFor([&] { return dispatcher->isConnected(); }, 10000))
        qFatal("store %s did not connect", qPrintable(path));
    return dispatcher;
}

// What a message box showed before it was answered.
struct SeenBox
{
    bool seen = false;
    QString title;
    QString text;
    QMessageBox::Icon icon = QMessageBox::NoIcon;
    Qt::WindowFlags flags;
    QMessageBox::StandardButton defaultButton = QMessageBox::NoButton;
    QMessageBox::StandardButtons buttons;
    QPointer<QTimer> answerer; // Gone once it answered; delete it to stop waiting.
    ~SeenBox() { delete answerer.data(); }
};

// Presses button in the next modal message box that opens within 30 s.
inline std::shared_ptr<SeenBox> answerNextMessageBox(QMessageBox::StandardButton button)
{
    auto seen = std::make_shared<SeenBox>();
    auto *timer = new QTimer(qApp);
    timer->setInterval(5);
    QTimer::singleShot(30000, timer, [timer] { timer->deleteLater(); });
    seen->answerer = timer;
    SeenBox *record = seen.get(); // The record outlives the timer (its destructor deletes it).
    QObject::connect(timer, &QTimer::timeout, timer, [timer, record, button] {
        SeenBox *seen = record;
        auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
        if (!box)
            return;
        seen->seen = true;
        seen->title = box->windowTitle();
        seen->text = box->text();
        seen->icon = box->icon();
        seen->flags = box->windowFlags();
        seen->buttons = box->standardButtons();
        seen->defaultButton = box->defaultButton() ? box->standardButton(box->defaultButton()) : QMessageBox::NoButton;
        timer->stop();
        timer->deleteLater();
        if (QAbstractButton *pressed = box->button(button))
            pressed->click();
        else
            box->reject();
    });
    timer->start();
    return seen;
}

} // namespace browserfixtures

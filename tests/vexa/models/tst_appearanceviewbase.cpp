#include <vexa/models/appearanceviewbase.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <QWidget>
#include <QtTest>

using namespace vexa;

namespace {

// A view that logs which hook each model signal reached.
class LoggingView : public QWidget, public AppearanceViewBase
{
public:
    void settingsChanged() override { hooks << "settingsChanged"; }
    QStringList hooks;

protected:
    void refreshStandard() override { hooks << "refreshStandard"; }
    void refreshQCJob() override { hooks << "refreshQCJob"; }
    void refreshQCJobTemplate() override { hooks << "refreshQCJobTemplate"; }
    void refreshTolerance() override { hooks << "refreshTolerance"; }
    void refreshActiveTrials() override { hooks << "refreshActiveTrials"; }
    void refreshTrials() override { hooks << "refreshTrials"; }
    void refreshColorimetricCondition() override { hooks << "refreshColorimetricCondition"; }
    void onTrialSelected() override { hooks << "onTrialSelected"; }
    void onActiveGeometriesChanged() override { hooks << "onActiveGeometriesChanged"; }
    void onGeometrySelected() override { hooks << "onGeometrySelected"; }
    void onStandardGeometrySelected() override { hooks << "onStandardGeometrySelected"; }
};

} // namespace

class tst_AppearanceViewBase : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void eachSignalReachesItsHook_data();
    void eachSignalReachesItsHook();
    void setModelsCallsNoHook();
    void replacingModelsDisconnectsTheOldOnes();
    void nullDataModelReceivesNothing();
    void destroyedViewReceivesNothing();
};

void tst_AppearanceViewBase::eachSignalReachesItsHook_data()
{
    QTest::addColumn<QString>("signal");
    QTest::addColumn<QString>("hook");
    QTest::newRow("job") << "sgQCJobChanged()" << "refreshQCJob";
    QTest::newRow("template") << "sgJobTemplateChanged()" << "refreshQCJobTemplate";
    QTest::newRow("standard") << "sgStandardChanged()" << "refreshStandard";
    QTest::newRow("tolerance") << "sgToleranceSetChanged()" << "refreshTolerance";
    QTest::newRow("trials") << "sgTrialsChanged()" << "refreshTrials";
    QTest::newRow("condition") << "sgColorimetricConditionChanged()" << "refreshColorimetricCondition";
    QTest::newRow("active") << "sgActiveTrialsChanged()" << "refreshActiveTrials";
    QTest::newRow("selection") << "sgTrialSelectionChanged()" << "onTrialSelected";
    QTest::newRow("standard geometry") << "sgStandardGeometryChanged(vexa::Geometry)" << "onStandardGeometrySelected";
    QTest::newRow("colour filter") << "sgColorGeometryFilterChanged()" << "onActiveGeometriesChanged";
    QTest::newRow("colour geometry") << "sgColorGeometrySelectionChanged()" << "onGeometrySelected";
    QTest::newRow("texture filter") << "sgTextureGeometryFilterChanged()" << "onActiveGeometriesChanged";
    QTest::newRow("texture geometry") << "sgTextureGeometrySelectionChanged()" << "onGeometrySelected";
}

void tst_AppearanceViewBase::eachSignalReachesItsHook()
{
    QFETCH(QString, signal);
    QFETCH(QString, hook);
    auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition());
    auto selection = std::make_shared<TrialSelectionModel>();
    LoggingView view;
    view.setModels(data, selection);

    // Emit the signal through the meta-object, so that each row tests one connection alone.
    QObject *sender = data->metaObject()->indexOfSignal(qPrintable(signal)) >= 0 ? static_cast<QObject *>(data.get())
                                                                                  : selection.get();
    const int index = sender->metaObject()->indexOfSignal(qPrintable(signal));
    QVERIFY2(index >= 0, qPrintable(signal));
    const QMetaMethod method = sender->metaObject()->method(index);
    const Geometry g("45as15");
    const bool invoked = method.parameterCount() == 0
        ? method.invoke(sender, Qt::DirectConnection)
        : method.invoke(sender, Qt::DirectConnection, Q_ARG(vexa::Geometry, g));
    QVERIFY(invoked);
    QCOMPARE(view.hooks, QStringList{hook});
}

void tst_AppearanceViewBase::setModelsCallsNoHook()
{
    LoggingView view;
    view.setModels(std::make_shared<AppearanceViewDataModel>(ColorimetricCondition()),
                   std::make_shared<TrialSelectionModel>());
    QVERIFY(view.hooks.isEmpty());
    QVERIFY(view.appearanceViewDataModel());
    QVERIFY(view.trialSelectionModel());
}

void tst_AppearanceViewBase::replacingModelsDisconnectsTheOldOnes()
{
    auto oldData = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition());
    auto oldSelection = std::make_shared<TrialSelectionModel>();
    auto newData = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition());
    auto newSelection = std::make_shared<TrialSelectionModel>();
    LoggingView view;
    view.setModels(oldData, oldSelection);
    view.setModels(newData, newSelection);
    // Setting the same models again must not double the connections.
    view.setModels(newData, newSelection);

    oldData->clearTrials();
    oldSelection->setSelectedColorGeometry(Geometry("45as15"));
    QVERIFY(view.hooks.isEmpty());

    newData->clearTrials();
    newSelection->setSelectedColorGeometry(Geometry("45as15"));
    QCOMPARE(view.hooks, (QStringList{"refreshTrials", "onGeometrySelected"}));
}

void tst_AppearanceViewBase::nullDataModelReceivesNothing()
{
    auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition());
    LoggingView view;
    view.setModels(data, nullptr);
    view.setModels(nullptr, nullptr);
    data->clearTrials();
    QVERIFY(view.hooks.isEmpty());
    view.setModels(data, nullptr);
    data->clearTrials();
    QCOMPARE(view.hooks, QStringList{"refreshTrials"});
}

void tst_AppearanceViewBase::destroyedViewReceivesNothing()
{
    auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition());
    {
        LoggingView view;
        view.setModels(data, nullptr);
    }
    // The models outlive their views; a signal after the view died must reach nobody.
    data->clearTrials();
    QCOMPARE(data.use_count(), 1L);
}

QTEST_MAIN(tst_AppearanceViewBase)
#include "tst_appearanceviewbase.moc"

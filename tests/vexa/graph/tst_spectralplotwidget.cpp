#include "graphfixtures.h"

#include <vexa/graph/graphdatagroup.h>
#include <vexa/graph/spectralgraphdata.h>
#include <vexa/graph/spectralplotwidget.h>
#include <vexa/graph/spectralview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <QLabel>
#include <QtTest>

using namespace vexa;

// The curve area of the spectral page: which curves it draws for the page's selection,
// in which colours and order, and what it says about missing spectra.
class tst_SpectralPlotWidget : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void withoutModels();
    void selectedGeometry();
    void followsTheSelection();
    void missingSpectraAreNamed();
    void allGeometries();
    void paints();

private:
    graphfixtures::Page m_page;
};

namespace {

std::shared_ptr<GraphDataGroup> group(const SpectralView *view, size_t i)
{
    return i < view->data().size() ? std::dynamic_pointer_cast<GraphDataGroup>(view->data()[i]) : nullptr;
}

QStringList names(const SpectralView *view)
{
    QStringList result;
    for (const auto &d : view->data())
        result << QString::fromStdString(d->name());
    return result;
}

} // namespace

void tst_SpectralPlotWidget::init()
{
    m_page.reset({fixtures::trial(QStringLiteral("T1"), 0.22), fixtures::trial(QStringLiteral("T2"), 0.18),
                  fixtures::trial(QStringLiteral("T3"), 0.25, {QStringLiteral("45as15"), QStringLiteral("45as45")})});
}

void tst_SpectralPlotWidget::withoutModels()
{
    SpectralPlotWidget widget;
    QVERIFY(widget.view()->data().empty());
    QVERIFY(!widget.view()->info().empty());
    widget.setModels(m_page.data, nullptr);
    QVERIFY(widget.view()->data().empty());
}

void tst_SpectralPlotWidget::selectedGeometry()
{
    SpectralPlotWidget widget;
    widget.setModels(m_page.data, m_page.selection);
    const SpectralView *view = widget.view();
    // The active trials first (pale, drawn under), then the standard and the selected trial.
    QCOMPARE(names(view), QStringList({"Active trials (3)", "STD", "T1"}));
    QCOMPARE(group(view, 0)->subData().size(), size_t(3));
    QVERIFY(group(view, 0)->subData()[0]->color().alpha() < 255);
    QVERIFY(view->isSeriesCached(0));
    QCOMPARE(view->curveWidth(0), 1.0);
    QVERIFY(view->curveWidth(1) > 1.0 && view->curveWidth(2) > 1.0);
    const auto standard = std::dynamic_pointer_cast<SpectralGraphData>(group(view, 1)->subData().front());
    const auto selected = std::dynamic_pointer_cast<SpectralGraphData>(group(view, 2)->subData().front());
    QVERIFY(standard && selected);
    QCOMPARE(standard->colorIndex(), 0);
    QCOMPARE(selected->colorIndex(), 1);
    QCOMPARE(group(view, 1)->color(), standard->color());
    QCOMPARE(selected->spectrum(), m_page.trials[0]->appearanceValues()->reflectanceAt(Geometry("45as45")));
    QCOMPARE(widget.titleLabel()->text(), QStringLiteral("T1 against STD at 45as45, with 2 other active trials"));
    QVERIFY(view->info().empty());

    // The copied text names each curve by measurement and geometry, once.
    const QString text = view->copyText();
    QVERIFY(text.startsWith(QStringLiteral("nm\tT1 45as45\tT2 45as45\tT3 45as45\tSTD 45as45\n")));
}

void tst_SpectralPlotWidget::followsTheSelection()
{
    SpectralPlotWidget widget;
    widget.resize(600, 400);
    widget.setModels(m_page.data, m_page.selection);
    widget.grab();
    const auto layer = widget.view()->data().front();
    QCOMPARE(widget.view()->cachedSeriesRenderCount(), 1);
    m_page.selection->setSelectedTrial(m_page.trials[1]);
    QCOMPARE(names(widget.view()), QStringList({"Active trials (3)", "STD", "T2"}));
    // Selecting another trial keeps the layer of active trials, drawn once.
    QCOMPARE(widget.view()->data().front(), layer);
    widget.grab();
    QCOMPARE(widget.view()->cachedSeriesRenderCount(), 1);
    m_page.selection->setSelectedColorGeometry(Geometry("45as15"));
    QVERIFY(widget.view()->data().front() != layer);
    widget.grab();
    QCOMPARE(widget.view()->cachedSeriesRenderCount(), 2);
    const auto selected = std::dynamic_pointer_cast<SpectralGraphData>(group(widget.view(), 2)->subData().front());
    QCOMPARE(selected->spectrum(), m_page.trials[1]->appearanceValues()->reflectanceAt(Geometry("45as15")));
    // Only the selected trial active: no group of others.
    m_page.selection->setActiveTrials({m_page.trials[1]});
    QCOMPARE(names(widget.view()), QStringList({"STD", "T2"}));
    // No standard: the trial alone.
    m_page.data->setStandard(nullptr);
    QCOMPARE(names(widget.view()), QStringList({"T2"}));
}

void tst_SpectralPlotWidget::missingSpectraAreNamed()
{
    SpectralPlotWidget widget;
    widget.setModels(m_page.data, m_page.selection);
    m_page.selection->setSelectedColorGeometry(Geometry("45as110"));
    QCOMPARE(QString::fromStdString(widget.view()->info()), QStringLiteral("No spectrum at 45as110: T3"));
    QCOMPARE(group(widget.view(), 0)->subData().size(), size_t(2)); // T1 and T2
}

void tst_SpectralPlotWidget::allGeometries()
{
    SpectralPlotWidget widget;
    widget.setModels(m_page.data, m_page.selection);
    widget.setScope(SpectralScope::AllGeometries);
    const SpectralView *view = widget.view();
    QCOMPARE(names(view), QStringList({"45as15", "45as45", "45as110"}));
    for (size_t i = 0; i < 3; ++i) {
        const auto g = group(view, i);
        QCOMPARE(g->color(), SpectralPlotWidget::geometryColor(int(i)));
        QCOMPARE(g->subData().size(), size_t(2));
        QCOMPARE(g->subData()[0]->name(), "STD " + g->name());
        QVERIFY(g->subData()[0]->color().alpha() < 255); // the standard pale
        QCOMPARE(g->subData()[1]->name(), "T1 " + g->name());
        QCOMPARE(g->subData()[1]->color(), g->color());
    }
    QVERIFY(widget.titleLabel()->text().contains(QStringLiteral("T1")));

    m_page.selection->setSelectedTrial(m_page.trials[2]); // has no 45as110
    QCOMPARE(group(view, 2)->subData().size(), size_t(1));
    QCOMPARE(QString::fromStdString(view->info()), QStringLiteral("No spectrum: T3 45as110"));

    m_page.selection->setColorGeometryFilter({Geometry("45as15")});
    QCOMPARE(names(view), QStringList({"45as15"}));
}

void tst_SpectralPlotWidget::paints()
{
    SpectralPlotWidget widget;
    widget.resize(700, 420);
    widget.setModels(m_page.data, m_page.selection);
    const QImage image = widget.grab().toImage();
    QCOMPARE(image.size(), QSize(700, 420));
    widget.setScope(SpectralScope::AllGeometries);
    QCOMPARE(widget.grab().toImage().size(), QSize(700, 420));
}

QTEST_MAIN(tst_SpectralPlotWidget)
#include "tst_spectralplotwidget.moc"

#include "graphfixtures.h"

#include <vexa/graph/spectralvaluetablemodel.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <QAbstractItemModelTester>
#include <QFont>
#include <QSignalSpy>
#include <QtTest>

#include <cmath>

using namespace vexa;

// The spectral value table: wavelength rows, one reflectance column per measurement and
// a difference column per trial, following the page's selection.
class tst_SpectralValueTableModel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void emptyWithoutModels();
    void columnsAtTheSelectedGeometry();
    void valuesAndDifferences_data();
    void valuesAndDifferences();
    void selectingAShownTrialMovesTheHighlight();
    void selectingAnotherGeometryRebuilds();
    void allGeometriesOfTheSelectedTrial();
    void mixedGridsAndMissingSpectra();
    void exportRoles();

private:
    graphfixtures::Page m_page;
};

namespace {

QString header(const QAbstractItemModel &model, int column)
{
    return model.headerData(column, Qt::Horizontal).toString();
}

QStringList headers(const QAbstractItemModel &model)
{
    QStringList result;
    for (int c = 0; c < model.columnCount(); ++c)
        result << header(model, c);
    return result;
}

int rowOf(const SpectralValueTableModel &model, double nm)
{
    for (int r = 0; r < model.rowCount(); ++r)
        if (model.wavelengthAt(r) == nm)
            return r;
    return -1;
}

double cell(const SpectralValueTableModel &model, int row, int column)
{
    const QVariant v = model.data(model.index(row, column), SpectralValueTableModel::ExportValueRole);
    return v.isValid() ? v.toDouble() : std::nan("");
}

double expected(const std::shared_ptr<AppearanceValues> &values, const char *geometry, double nm)
{
    const auto spectrum = values->reflectanceAt(Geometry(geometry));
    return spectrum->spectralValues()[int((nm - spectrum->startWavelength()) / spectrum->wavelengthInterval())];
}

} // namespace

void tst_SpectralValueTableModel::init()
{
    m_page.reset({fixtures::trial(QStringLiteral("T1"), 0.22),
                  fixtures::trial(QStringLiteral("T2"), 0.18, fixtures::threeAngles(), 560),
                  fixtures::trial(QStringLiteral("T3"), 0.25)});
    m_page.selection->setActiveTrials({m_page.trials[0], m_page.trials[1]});
}

void tst_SpectralValueTableModel::emptyWithoutModels()
{
    SpectralValueTableModel model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.columnCount(), 0);
    model.setModels(nullptr, m_page.selection);
    QCOMPARE(model.columnCount(), 0);
    QVERIFY(!model.entryAt(0));
    QVERIFY(std::isnan(model.wavelengthAt(0)));
}

void tst_SpectralValueTableModel::columnsAtTheSelectedGeometry()
{
    SpectralValueTableModel model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.setModels(m_page.data, m_page.selection);
    QCOMPARE(headers(model), QStringList({"nm", "STD", "T1", "ΔR T1", "T2", "ΔR T2"}));
    QCOMPARE(model.rowCount(), 31);
    QCOMPARE(model.wavelengthAt(0), 400.0);
    QCOMPARE(model.wavelengthAt(30), 700.0);
    QCOMPARE(model.columnKind(0), SpectralValueTableModel::ColumnKind::Wavelength);
    QCOMPARE(model.columnKind(2), SpectralValueTableModel::ColumnKind::Reflectance);
    QCOMPARE(model.columnKind(3), SpectralValueTableModel::ColumnKind::Difference);
    QCOMPARE(model.columnOf(m_page.trials[1]), 4);
    QCOMPARE(model.columnOf(m_page.trials[2]), -1);
    QCOMPARE(model.entryAt(3)->trial, m_page.trials[0]);
    QCOMPARE(model.entryAt(1)->role, SpectralEntry::Role::Standard);

    // A selected trial that is not active is shown last.
    m_page.selection->setSelectedTrial(m_page.trials[2]);
    QCOMPARE(headers(model), QStringList({"nm", "STD", "T1", "ΔR T1", "T2", "ΔR T2", "T3", "ΔR T3"}));
    // Toggling the active trials rebuilds; without a standard there are no differences.
    m_page.selection->toggleActiveTrial(m_page.trials[0]);
    m_page.data->setStandard(nullptr);
    QCOMPARE(headers(model), QStringList({"nm", "T2", "T3"}));
}

void tst_SpectralValueTableModel::valuesAndDifferences_data()
{
    QTest::addColumn<QString>("geometry");
    QTest::addColumn<double>("nm");
    QTest::newRow("45as45 400") << "45as45" << 400.0;
    QTest::newRow("45as45 550") << "45as45" << 550.0;
    QTest::newRow("45as15 700") << "45as15" << 700.0;
    QTest::newRow("45as110 560") << "45as110" << 560.0;
}

void tst_SpectralValueTableModel::valuesAndDifferences()
{
    QFETCH(QString, geometry);
    QFETCH(double, nm);
    m_page.selection->setSelectedColorGeometry(Geometry(geometry));
    SpectralValueTableModel model;
    model.setModels(m_page.data, m_page.selection);
    const int row = rowOf(model, nm);
    QVERIFY(row >= 0);
    const QByteArray g = geometry.toLatin1();
    const double standard = expected(m_page.standard->appearanceValues(), g.constData(), nm);
    const double t2 = expected(m_page.trials[1]->appearanceValues(), g.constData(), nm);
    QCOMPARE(cell(model, row, 0), nm);
    QCOMPARE(cell(model, row, 1), standard);
    QCOMPARE(cell(model, row, 4), t2);
    QCOMPARE(cell(model, row, 5), t2 - standard);
    // Shown with four decimals, the wavelength with none.
    QCOMPARE(model.data(model.index(row, 5)).toString(), QLocale().toString(t2 - standard, 'f', 4));
    QCOMPARE(model.data(model.index(row, 0)).toString(), QLocale().toString(nm, 'f', 0));
    model.setDecimals(2);
    QCOMPARE(model.data(model.index(row, 4)).toString(), QLocale().toString(t2, 'f', 2));
}

void tst_SpectralValueTableModel::selectingAShownTrialMovesTheHighlight()
{
    SpectralValueTableModel model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.setModels(m_page.data, m_page.selection);
    QCOMPARE(m_page.selection->selectedTrial(), m_page.trials[0]);
    auto bold = [&](int column) { return model.data(model.index(3, column), Qt::FontRole).value<QFont>().bold(); };
    QVERIFY(bold(2) && bold(3));
    QVERIFY(!bold(4) && !bold(1));

    QSignalSpy resets(&model, &QAbstractItemModel::modelReset);
    QSignalSpy changes(&model, &QAbstractItemModel::dataChanged);
    QSignalSpy headerChanges(&model, &QAbstractItemModel::headerDataChanged);
    m_page.selection->setSelectedTrial(m_page.trials[1]);
    QCOMPARE(resets.count(), 0);
    QCOMPARE(changes.count(), 1);
    QCOMPARE(headerChanges.count(), 1);
    QVERIFY(!bold(2) && !bold(3));
    QVERIFY(bold(4) && bold(5));
    QVERIFY(model.data(model.index(0, 4), Qt::BackgroundRole).isValid());
    QVERIFY(!model.data(model.index(0, 2), Qt::BackgroundRole).isValid());
    QVERIFY(model.headerData(4, Qt::Horizontal, Qt::FontRole).value<QFont>().bold());
}

void tst_SpectralValueTableModel::selectingAnotherGeometryRebuilds()
{
    SpectralValueTableModel model;
    model.setModels(m_page.data, m_page.selection);
    const int row = rowOf(model, 550);
    const double at45 = cell(model, row, 1);
    QSignalSpy resets(&model, &QAbstractItemModel::modelReset);
    m_page.selection->setSelectedColorGeometry(Geometry("45as15"));
    QCOMPARE(resets.count(), 1);
    QCOMPARE(cell(model, row, 1), expected(m_page.standard->appearanceValues(), "45as15", 550));
    QVERIFY(cell(model, row, 1) > at45); // brighter near the specular
    QCOMPARE(model.entryAt(1)->geometry, Geometry("45as15"));
}

void tst_SpectralValueTableModel::allGeometriesOfTheSelectedTrial()
{
    SpectralValueTableModel model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.setModels(m_page.data, m_page.selection);
    model.setScope(SpectralScope::AllGeometries);
    QCOMPARE(headers(model), QStringList({"nm", "STD 45as15", "T1 45as15", "ΔR T1 45as15", "STD 45as45", "T1 45as45",
                                          "ΔR T1 45as45", "STD 45as110", "T1 45as110", "ΔR T1 45as110"}));
    // The colour geometry filter narrows the geometries.
    m_page.selection->setColorGeometryFilter({Geometry("45as110")});
    QCOMPARE(headers(model), QStringList({"nm", "STD 45as110", "T1 45as110", "ΔR T1 45as110"}));
    // Another selected trial: the table follows (no highlight in this scope).
    m_page.selection->setSelectedTrial(m_page.trials[1]);
    QCOMPARE(header(model, 2), QStringLiteral("T2 45as110"));
    QVERIFY(!model.data(model.index(0, 2), Qt::FontRole).value<QFont>().bold());
    // No trial selected: the standard alone.
    m_page.selection->setActiveTrials({});
    QCOMPARE(headers(model), QStringList({"nm", "STD 45as110"}));
}

void tst_SpectralValueTableModel::mixedGridsAndMissingSpectra()
{
    // The standard at 400-700 by 20 nm, T1 at 410-650 by 10 nm with a NaN; T2 has no spectrum here.
    QVector<double> standardValues;
    for (int nm = 400; nm <= 700; nm += 20)
        standardValues << nm / 1000.0;
    auto standardSpectrum = std::make_shared<ReflectanceSpectrum>(standardValues, 400, 20);
    standardSpectrum->setGeometry(Geometry("45as45"));
    m_page.standard->appearanceValues()->setColorValues({standardSpectrum});
    QVector<double> trialValues;
    for (int nm = 410; nm <= 650; nm += 10)
        trialValues << nm / 1000.0 + 0.01;
    trialValues[2] = std::nan(""); // 430 nm
    auto trialSpectrum = std::make_shared<ReflectanceSpectrum>(trialValues, 410, 10);
    trialSpectrum->setGeometry(Geometry("45as45"));
    m_page.trials[0]->appearanceValues()->setColorValues({trialSpectrum});
    m_page.trials[1]->appearanceValues()->setColorValues({});

    SpectralValueTableModel model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.setModels(m_page.data, m_page.selection);
    QCOMPARE(headers(model), QStringList({"nm", "STD", "T1", "ΔR T1", "T2", "ΔR T2"}));
    // The union of both grids: the trial's 25 wavelengths and the standard's 400, 660, 680, 700.
    QCOMPARE(model.rowCount(), 29);
    QCOMPARE(model.wavelengthAt(1), 410.0);
    const int at420 = rowOf(model, 420);
    const int at410 = rowOf(model, 410);
    const int at430 = rowOf(model, 430);
    const int at700 = rowOf(model, 700);
    QVERIFY(std::fabs(cell(model, at420, 3) - 0.01) < 1e-12); // both present
    QVERIFY(std::isnan(cell(model, at410, 1)));               // the standard misses 410
    QVERIFY(std::isnan(cell(model, at410, 3)));
    QVERIFY(std::isnan(cell(model, at430, 2)));               // the NaN value
    QVERIFY(std::isnan(cell(model, at700, 2)));               // beyond the trial's grid
    QCOMPARE(cell(model, at700, 1), 0.7);
    for (int r = 0; r < model.rowCount(); ++r) {
        QVERIFY(std::isnan(cell(model, r, 4))); // T2 has nothing here
        QCOMPARE(model.data(model.index(r, 4)).toString(), QString());
    }
}

void tst_SpectralValueTableModel::exportRoles()
{
    SpectralValueTableModel model;
    model.setModels(m_page.data, m_page.selection);
    QCOMPARE(model.data(model.index(0, 0), SpectralValueTableModel::ExportNumberFormatRole).toString(), QStringLiteral("0."));
    QCOMPARE(model.data(model.index(0, 2), SpectralValueTableModel::ExportNumberFormatRole).toString(),
             QStringLiteral("0.0000"));
    QCOMPARE(model.headerData(0, Qt::Horizontal, Qt::ToolTipRole).toString(), QStringLiteral("Wavelength in nanometres"));
    QVERIFY(model.headerData(3, Qt::Horizontal, Qt::ToolTipRole).toString().contains(QStringLiteral("T1")));
    QVERIFY(!model.data(model.index(0, 99)).isValid());
}

QTEST_MAIN(tst_SpectralValueTableModel)
#include "tst_spectralvaluetablemodel.moc"

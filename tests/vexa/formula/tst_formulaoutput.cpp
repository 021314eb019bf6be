// Formula units: text forms, classification, conversions against the factors in both
// directions and round trips, and whole-formula conversions.

#include "formulafixtures.h"

#include <vexa/formula/formulaoutput.h>

#include <domain/colorant.h>
#include <domain/formula.h>
#include <domain/ingredient.h>

#include <QtTest>

#include <cmath>
#include <limits>
#include <stdexcept>

using namespace vexa;

Q_DECLARE_METATYPE(vexa::FormulaUnits)

namespace {

bool closeRelative(double actual, double expected, double tolerance = 1e-12)
{
    return std::fabs(actual - expected) <= tolerance * std::max(1.0, std::fabs(expected));
}

} // namespace

class TestFormulaOutput : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanupTestCase() { FormulaOutput::destroy(); }

    void shouldDescribeEveryUnit_data()
    {
        QTest::addColumn<FormulaUnits>("unit");
        QTest::addColumn<int>("value");
        QTest::addColumn<QString>("key");
        QTest::addColumn<QString>("display");
        QTest::addColumn<double>("factor");
        QTest::addColumn<QString>("kind"); // percent, weight, volume
        QTest::addColumn<bool>("si");
        QTest::addColumn<bool>("us");

        using U = FormulaUnits;
        QTest::newRow("%Weight") << U::PercentWeight << 0 << "PercentWeight" << "%Weight" << 1.0 << "percent" << true << true;
        QTest::newRow("%Volume") << U::PercentVolume << 1 << "PercentVolume" << "%Volume" << 1.0 << "percent" << true << true;
        QTest::newRow("g") << U::Gram << 2 << "Gram" << "g" << 0.001 << "weight" << true << false;
        QTest::newRow("kg") << U::Kilogram << 3 << "Kilogram" << "kg" << 1.0 << "weight" << true << false;
        QTest::newRow("ml") << U::Milliliter << 4 << "Milliliter" << "ml" << 0.001 << "volume" << true << false;
        QTest::newRow("l") << U::Liter << 5 << "Liter" << "l" << 1.0 << "volume" << true << false;
        QTest::newRow("oz") << U::Ounce << 6 << "Ounce" << "oz" << 0.0283495 << "weight" << false << true;
        QTest::newRow("lb") << U::Pound << 7 << "Pound" << "lb" << 0.453592 << "weight" << false << true;
        QTest::newRow("fl oz") << U::FluidOunce << 8 << "FluidOunce" << "fl oz" << 0.0295735 << "volume" << false << true;
        QTest::newRow("shot") << U::Shot << 9 << "Shot" << "shot" << 0.0443602943 << "volume" << false << true;
        QTest::newRow("pt") << U::Pint << 10 << "Pint" << "pt" << 0.473176 << "volume" << false << true;
        QTest::newRow("qt") << U::Quart << 11 << "Quart" << "qt" << 0.946353 << "volume" << false << true;
        QTest::newRow("gal") << U::Gallon << 12 << "Gallon" << "gal" << 3.78541 << "volume" << false << true;
        QTest::newRow("imp gal") << U::ImperialGallon << 13 << "ImperialGallon" << "imp gal" << 4.54609 << "volume"
                                 << false << true;
    }

    void shouldDescribeEveryUnit()
    {
        QFETCH(FormulaUnits, unit);
        QFETCH(int, value);
        QFETCH(QString, key);
        QFETCH(QString, display);
        QFETCH(double, factor);
        QFETCH(QString, kind);
        QFETCH(bool, si);
        QFETCH(bool, us);
        const FormulaOutput &output = FormulaOutput::instance();

        QCOMPARE(int(unit), value);
        QCOMPARE(output.unitToString(unit), key);
        QCOMPARE(output.unitFromString(key), unit);
        QCOMPARE(output.unitToDisplayString(unit), display);
        QCOMPARE(output.unitFromDisplayString(display), unit);
        QCOMPARE(QString::fromLatin1(output.unitEnumerator().valueToKey(value)), key);
        QCOMPARE(output.factor(unit), factor);
        QCOMPARE(output.isSIUnit(unit), si);
        QCOMPARE(output.isUSUnit(unit), us);
        QCOMPARE(output.isWeightUnit(unit), kind == "weight");
        QCOMPARE(output.isVolumeUnit(unit), kind == "volume");
        QCOMPARE(output.isPercentUnit(unit), kind == "percent");
        FormulaUnits parsed = FormulaUnits::Pint;
        QVERIFY(output.didGetUnit(key, parsed));
        QCOMPARE(parsed, unit);
        parsed = FormulaUnits::Pint;
        QVERIFY(output.didGetUnit(display, parsed));
        QCOMPARE(parsed, unit);
    }

    void shouldRefuseUnknownUnitTexts_data()
    {
        QTest::addColumn<QString>("text");
        QTest::newRow("wrong case") << "gram";
        QTest::newRow("display string is not a key") << "g";
        QTest::newRow("scoped key") << "FormulaUnits::Gram";
        QTest::newRow("empty") << "";
        QTest::newRow("number") << "2";
    }

    void shouldRefuseUnknownUnitTexts()
    {
        QFETCH(QString, text);
        try {
            FormulaOutput::instance().unitFromString(text);
            QFAIL("no error");
        } catch (const std::logic_error &error) {
            QCOMPARE(QString::fromLatin1(error.what()), QStringLiteral("Unsupported Formula Unit"));
        }
        QVERIFY_EXCEPTION_THROWN(FormulaOutput::instance().unitFromDisplayString(text + "x"), std::logic_error);
        FormulaUnits unit = FormulaUnits::Pint;
        QCOMPARE(FormulaOutput::instance().didGetUnit(text + "x", unit), false);
        QCOMPARE(unit, FormulaUnits::Pint);
    }

    void shouldReadTheFirstEdgeCasesOfTheUnits()
    {
        const FormulaOutput &output = FormulaOutput::instance();
        QCOMPARE(int(output.unitFromString("Gram")), 2);
        QCOMPARE(output.toLiters(2.0, FormulaUnits::Kilogram, 0.8), 2.5);
        QCOMPARE(output.toKilograms(1.0, FormulaUnits::Gallon, 1.0), 3.78541);
    }

    // Every unit against its factor, in both directions, for weights and volumes and across
    // them through the density; then to → from round trips.
    void shouldConvertByTheFactors_data()
    {
        QTest::addColumn<FormulaUnits>("unit");
        QTest::addColumn<double>("density");
        for (FormulaUnits unit : FormulaOutput::allUnits()) {
            for (double density : {0.8, 1.0, 1.45}) {
                const QString name = FormulaOutput::instance().unitToString(unit);
                QTest::addRow("%s at %.2f", qPrintable(name), density) << unit << density;
            }
        }
    }

    void shouldConvertByTheFactors()
    {
        QFETCH(FormulaUnits, unit);
        QFETCH(double, density);
        const FormulaOutput &output = FormulaOutput::instance();
        const double f = output.factor(unit);
        const bool volume = output.isVolumeUnit(unit) || unit == FormulaUnits::PercentVolume;
        for (double value : {0.0, 1.0, 12.5, 1234.5678, -3.25}) {
            const double kilograms = volume ? value * f * density : value * f;
            const double liters = volume ? value * f : value * f / density;
            QVERIFY2(closeRelative(output.toKilograms(value, unit, density), kilograms), "toKilograms");
            QVERIFY2(closeRelative(output.toLiters(value, unit, density), liters), "toLiters");
            QVERIFY2(closeRelative(output.fromKilograms(kilograms, unit, density), value), "fromKilograms");
            QVERIFY2(closeRelative(output.fromLiters(liters, unit, density), value), "fromLiters");
            QVERIFY2(closeRelative(output.fromKilograms(output.toKilograms(value, unit, density), unit, density), value),
                     "kilogram round trip");
            QVERIFY2(closeRelative(output.fromLiters(output.toLiters(value, unit, density), unit, density), value),
                     "liter round trip");
        }
    }

    void shouldKeepTheBaseUnitsUnchanged()
    {
        const FormulaOutput &output = FormulaOutput::instance();
        for (double value : {0.3, 7.0, 1e6}) {
            QCOMPARE(output.toKilograms(value, FormulaUnits::PercentWeight, 0.9), value);
            QCOMPARE(output.toKilograms(value, FormulaUnits::Kilogram, 0.9), value);
            QCOMPARE(output.toLiters(value, FormulaUnits::PercentVolume, 0.9), value);
            QCOMPARE(output.toLiters(value, FormulaUnits::Liter, 0.9), value);
        }
    }

    // Across weight and volume a density is needed; without one the answer is NaN, never a number.
    void shouldNotConvertAcrossKindsWithoutADensity_data()
    {
        QTest::addColumn<double>("density");
        QTest::newRow("zero") << 0.0;
        QTest::newRow("negative") << -1.2;
        QTest::newRow("NaN") << std::numeric_limits<double>::quiet_NaN();
        QTest::newRow("infinite") << std::numeric_limits<double>::infinity();
    }

    void shouldNotConvertAcrossKindsWithoutADensity()
    {
        QFETCH(double, density);
        const FormulaOutput &output = FormulaOutput::instance();
        QVERIFY(std::isnan(output.toKilograms(5.0, FormulaUnits::Milliliter, density)));
        QVERIFY(std::isnan(output.fromKilograms(5.0, FormulaUnits::Gallon, density)));
        QVERIFY(std::isnan(output.toLiters(5.0, FormulaUnits::Gram, density)));
        QVERIFY(std::isnan(output.fromLiters(5.0, FormulaUnits::Pound, density)));
        // Within a kind the density is not used.
        QCOMPARE(output.toKilograms(5.0, FormulaUnits::Gram, density), 0.005);
        QCOMPARE(output.toLiters(5.0, FormulaUnits::Milliliter, density), 0.005);
    }

    void shouldGroupTheDisplayStrings()
    {
        const FormulaOutput &output = FormulaOutput::instance();
        const auto all = output.unitDisplayStrings();
        QCOMPARE(all.size(), 2);
        QCOMPARE(all[0].first, QStringLiteral("Weight"));
        QCOMPARE(all[0].second, (QStringList{"%Weight", "g", "kg", "oz", "lb"}));
        QCOMPARE(all[1].first, QStringLiteral("Volume"));
        QCOMPARE(all[1].second, (QStringList{"%Volume", "ml", "l", "fl oz", "shot", "pt", "qt", "gal", "imp gal"}));

        const auto si = output.unitDisplayStrings(FormulaOutput::UnitSystem::SI);
        QCOMPARE(si[0].second, (QStringList{"%Weight", "g", "kg"}));
        QCOMPARE(si[1].second, (QStringList{"%Volume", "ml", "l"}));
        const auto us = output.unitDisplayStrings(FormulaOutput::UnitSystem::US);
        QCOMPARE(us[0].second, (QStringList{"%Weight", "oz", "lb"}));
        QCOMPARE(us[1].second, (QStringList{"%Volume", "fl oz", "shot", "pt", "qt", "gal", "imp gal"}));
        QCOMPARE(output.unitSystemName(FormulaOutput::UnitSystem::SI), QStringLiteral("SI"));
        QCOMPARE(output.unitSystemName(FormulaOutput::UnitSystem::US), QStringLiteral("US"));
    }

    void shouldSumTheConcentrations()
    {
        const FormulaOutput &output = FormulaOutput::instance();
        QCOMPARE(output.totalQuantity(std::make_shared<Formula>()), 0.0);
        QCOMPARE(output.totalQuantity(std::shared_ptr<Formula>()), 0.0);
        QCOMPARE(output.totalQuantity(formulafixtures::silver()), 100.0);
    }

    void shouldConvertAWholeFormula()
    {
        const FormulaOutput &output = FormulaOutput::instance();
        const auto formula = formulafixtures::silver(); // grams
        const auto inMl = output.convertToUnit(formula, FormulaUnits::Milliliter);
        QVERIFY(inMl && inMl != formula);
        QCOMPARE(inMl->totalQuantityUnit(), QStringLiteral("Milliliter"));
        double total = 0.0;
        for (size_t i = 0; i < formula->ingredients().size(); ++i) {
            const auto &ingredient = formula->ingredients()[i];
            const double ml = ingredient->concentration() / ingredient->colorant()->density();
            QVERIFY(closeRelative(inMl->ingredients()[i]->concentration(), ml));
            QCOMPARE(inMl->ingredients()[i]->colorant(), ingredient->colorant());
            total += ml;
        }
        QVERIFY(closeRelative(inMl->totalQuantity(), total));
        // The original is untouched.
        QCOMPARE(formula->ingredients()[0]->concentration(), 62.0);

        const auto percentVolume = output.convertToPercentVolume(formula);
        QVERIFY(closeRelative(output.totalQuantity(percentVolume), 100.0));
        QVERIFY(closeRelative(percentVolume->ingredients()[0]->concentration(), 62.0 / 1.02 / total * 100.0));
        const auto percentWeight = output.convertToPercentWeight(inMl);
        for (size_t i = 0; i < formula->ingredients().size(); ++i)
            QVERIFY(closeRelative(percentWeight->ingredients()[i]->concentration(),
                                  formula->ingredients()[i]->concentration(), 1e-9));
        const auto back = output.convertToUnit(inMl, FormulaUnits::Gram);
        for (size_t i = 0; i < formula->ingredients().size(); ++i)
            QVERIFY(closeRelative(back->ingredients()[i]->concentration(), formula->ingredients()[i]->concentration(),
                                  1e-12));
    }

    void shouldSayWhyAFormulaCannotBeConverted()
    {
        const FormulaOutput &output = FormulaOutput::instance();
        auto formula = formulafixtures::silver();
        formula->ingredients()[2]->colorant()->setDensity(0.0);
        try {
            output.convertToUnit(formula, FormulaUnits::Liter);
            QFAIL("no error");
        } catch (const std::invalid_argument &error) {
            QVERIFY2(QString::fromUtf8(error.what()).contains("Coarse Aluminium"), error.what());
        }
        // Within weights no density is needed.
        QVERIFY(output.convertToUnit(formula, FormulaUnits::Pound));

        formula->setTotalQuantityUnit(QStringLiteral("bucket"));
        QVERIFY_EXCEPTION_THROWN(output.convertToUnit(formula, FormulaUnits::Gram), std::logic_error);
        QCOMPARE(output.convertToUnit(nullptr, FormulaUnits::Gram), nullptr);
    }
};

QTEST_MAIN(TestFormulaOutput)
#include "tst_formulaoutput.moc"

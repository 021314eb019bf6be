// The formula table model: columns per kind, shares and amounts in every unit, running
// totals, the correction columns, restrictions, roles, headers and bad formulas.

#include "formulafixtures.h"

#include <vexa/formula/formulasortmodel.h>
#include <vexa/formula/formulatablemodel.h>
#include <vexa/formula/recipewidgetsettings.h>

#include <QAbstractItemModelTester>
#include <QApplication>
#include <QFontMetrics>
#include <QIcon>
#include <QLocale>
#include <QSignalSpy>
#include <QtTest>

#include <cmath>

using namespace vexa;
using Kind = FormulaTableModel::ColumnKind;

Q_DECLARE_METATYPE(vexa::FormulaUnits)

namespace {

// The shown text of a cell by kind.
QString text(const FormulaTableModel &model, int row, Kind kind)
{
    return model.index(row, model.columnOfKind(kind)).data().toString();
}

QStringList column(const QAbstractItemModel &model, int column)
{
    QStringList texts;
    for (int r = 0; r < model.rowCount(); ++r)
        texts << model.index(r, column).data().toString();
    return texts;
}

std::unique_ptr<FormulaTableModel> makeModel(const std::shared_ptr<RecipeTrial> &trial, FormulaUnits unit = FormulaUnits::Gram)
{
    auto model = std::make_unique<FormulaTableModel>(std::make_shared<RecipeWidgetSettings>());
    model->setUnit(unit);
    model->setRecipeTrial(trial);
    return model;
}

} // namespace

class TestFormulaTableModel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QLocale::setDefault(QLocale::c());
        qRegisterMetaType<Qt::Orientation>();
    }

    void shouldPassTheModelTester()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.correction);
        QAbstractItemModelTester tester(model.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
        model->setUnit(FormulaUnits::FluidOunce);
        model->setCanSize(32.0);
        model->setColumnKinds({Kind::Icon, Kind::Colorant, Kind::AddAmount});
        model->setLoading(1, 30.0);
        model->setRecipeTrial(recipe.first);
        model->setRecipeTrial(nullptr);
        QCOMPARE(model->rowCount(), 0);
    }

    void shouldShowEveryKindInOrderByDefault()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        QCOMPARE(model->columnCount(), 12);
        QStringList headers;
        for (int c = 0; c < model->columnCount(); ++c)
            headers << model->headerData(c, Qt::Horizontal).toString();
        QCOMPARE(headers, (QStringList{"", "Colorant", "Formula (%)", "Amount (g)", "Accumulated (g)", "Previous %",
                                        "Corrected %", "Difference %", "Previous", "Corrected", "Add", "Restrictions"}));
    }

    void shouldNameTheUnitInTheAmountHeaders_data()
    {
        QTest::addColumn<FormulaUnits>("unit");
        QTest::addColumn<QString>("amount");
        QTest::addColumn<QString>("accumulated");
        QTest::newRow("kg") << FormulaUnits::Kilogram << "Amount (kg)" << "Accumulated (kg)";
        QTest::newRow("fl oz") << FormulaUnits::FluidOunce << "Amount (fl oz)" << "Accumulated (fl oz)";
        QTest::newRow("%Weight") << FormulaUnits::PercentWeight << "Amount (%Weight)" << "Accumulated (%Weight)";
    }

    void shouldNameTheUnitInTheAmountHeaders()
    {
        QFETCH(FormulaUnits, unit);
        QFETCH(QString, amount);
        QFETCH(QString, accumulated);
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        QSignalSpy headers(model.get(), &QAbstractItemModel::headerDataChanged);
        model->setUnit(unit);
        QCOMPARE(headers.count(), 1);
        QCOMPARE(model->headerData(model->columnOfKind(Kind::Amount), Qt::Horizontal).toString(), amount);
        QCOMPARE(model->headerData(model->columnOfKind(Kind::Accumulated), Qt::Horizontal).toString(), accumulated);
    }

    // The silver formula (62 g clear 1.02, 24 g fine 1.45, 12.5 g coarse 1.50, 1.5 g black 1.10)
    // in several units, as formulated (no can size) and in a can.
    void shouldComputeAmounts_data()
    {
        QTest::addColumn<FormulaUnits>("unit");
        QTest::addColumn<double>("canSize");
        QTest::addColumn<QList<double>>("amounts");
        const double ml[] = {62.0 / 1.02, 24.0 / 1.45, 12.5 / 1.50, 1.5 / 1.10};
        const double mlTotal = ml[0] + ml[1] + ml[2] + ml[3];
        QTest::newRow("g as formulated") << FormulaUnits::Gram << 0.0 << QList<double>{62.0, 24.0, 12.5, 1.5};
        QTest::newRow("kg") << FormulaUnits::Kilogram << 0.0 << QList<double>{0.062, 0.024, 0.0125, 0.0015};
        QTest::newRow("oz") << FormulaUnits::Ounce << 0.0
                            << QList<double>{0.062 / 0.0283495, 0.024 / 0.0283495, 0.0125 / 0.0283495, 0.0015 / 0.0283495};
        QTest::newRow("ml through the densities") << FormulaUnits::Milliliter << 0.0
                                                  << QList<double>{ml[0], ml[1], ml[2], ml[3]};
        QTest::newRow("%Weight") << FormulaUnits::PercentWeight << 0.0 << QList<double>{62.0, 24.0, 12.5, 1.5};
        QTest::newRow("%Volume") << FormulaUnits::PercentVolume << 500.0
                                 << QList<double>{ml[0] / mlTotal * 100, ml[1] / mlTotal * 100, ml[2] / mlTotal * 100,
                                                  ml[3] / mlTotal * 100};
        QTest::newRow("250 g can") << FormulaUnits::Gram << 250.0 << QList<double>{155.0, 60.0, 31.25, 3.75};
        QTest::newRow("1 l can") << FormulaUnits::Liter << 1.0
                                 << QList<double>{ml[0] / mlTotal, ml[1] / mlTotal, ml[2] / mlTotal, ml[3] / mlTotal};
    }

    void shouldComputeAmounts()
    {
        QFETCH(FormulaUnits, unit);
        QFETCH(double, canSize);
        QFETCH(QList<double>, amounts);
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first, unit);
        model->setCanSize(canSize);
        double accumulated = 0.0;
        for (int row = 0; row < amounts.size(); ++row) {
            accumulated += amounts[row];
            QVERIFY2(std::fabs(model->valueAt(row, Kind::Amount) - amounts[row]) < 1e-9 * std::max(1.0, amounts[row]),
                     qPrintable(QString::number(model->valueAt(row, Kind::Amount), 'g', 17)));
            QVERIFY(std::fabs(model->valueAt(row, Kind::Accumulated) - accumulated) < 1e-9 * std::max(1.0, accumulated));
            const QModelIndex amountIndex = model->index(row, model->columnOfKind(Kind::Amount));
            QCOMPARE(amountIndex.data(Qt::UserRole).toDouble(), model->valueAt(row, Kind::Amount));
            QCOMPARE(amountIndex.data().toString(), QLocale().toString(amounts[row], 'f', 2));
            QCOMPARE(amountIndex.data(Qt::ToolTipRole), amountIndex.data());
        }
        QVERIFY(std::fabs(model->totalAmount() - accumulated) < 1e-9 * std::max(1.0, accumulated));
        // Shares do not depend on the unit.
        QCOMPARE(column(*model, model->columnOfKind(Kind::FormulaPercent)),
                 (QStringList{"62.00", "24.00", "12.50", "1.50"}));
    }

    void shouldFollowTheDecimalSettings()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        model->setCanSize(333.0);
        QSignalSpy changed(model.get(), &QAbstractItemModel::dataChanged);
        model->settings()->setColorantPercentageDecimalPoints(1);
        QVERIFY(changed.count() >= 1);
        model->settings()->setColorantAmountDecimalPoints(4);
        QCOMPARE(text(*model, 2, Kind::FormulaPercent), QStringLiteral("12.5"));
        QCOMPARE(text(*model, 0, Kind::FormulaPercent), QStringLiteral("62.0"));
        QCOMPARE(text(*model, 2, Kind::Amount), QStringLiteral("41.6250"));
        QCOMPARE(text(*model, 2, Kind::Accumulated), QStringLiteral("328.0050"));
    }

    void shouldEmitTheTotalWhenItChanges()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        QSignalSpy total(model.get(), &FormulaTableModel::totalQuantityChanged);
        model->setUnit(FormulaUnits::Kilogram);
        QCOMPARE(total.count(), 1);
        QVERIFY(std::fabs(total.last().at(0).toDouble() - 0.1) < 1e-12);
        model->setUnit(FormulaUnits::Kilogram, 2.5);
        QCOMPARE(total.count(), 2);
        QCOMPARE(total.last().at(0).toDouble(), 2.5);
        model->setCanSize(2.5); // unchanged
        QCOMPARE(total.count(), 2);
        model->setRecipeTrial(recipe.correction);
        QCOMPARE(total.count(), 3);
    }

    // The correction against the first trial, as formulated (grams): the smallest batch that
    // keeps every previous amount is 125 g (coarse: 12.5 g at 10 %).
    void shouldComputeTheCorrection()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.correction);
        QCOMPARE(column(*model, model->columnOfKind(Kind::PreviousPercent)),
                 (QStringList{"62.00", "24.00", "12.50", "1.50"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::CorrectedPercent)),
                 (QStringList{"60.00", "28.00", "10.00", "2.00"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::DifferencePercent)),
                 (QStringList{"-2.00", "4.00", "-2.50", "0.50"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::PreviousAmount)),
                 (QStringList{"62.00", "24.00", "12.50", "1.50"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::AddAmount)), (QStringList{"13.00", "11.00", "0.00", "1.00"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::CorrectedAmount)),
                 (QStringList{"75.00", "35.00", "12.50", "2.50"}));
        // Corrected is previous plus add, everywhere.
        for (int row = 0; row < model->rowCount(); ++row)
            QCOMPARE(model->valueAt(row, Kind::CorrectedAmount),
                     model->valueAt(row, Kind::PreviousAmount) + model->valueAt(row, Kind::AddAmount));
    }

    void shouldCorrectInTheSameCan()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.correction);
        model->setCanSize(500.0); // both batches were mixed in a 500 g can
        QCOMPARE(column(*model, model->columnOfKind(Kind::PreviousAmount)),
                 (QStringList{"310.00", "120.00", "62.50", "7.50"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::AddAmount)),
                 (QStringList{"65.00", "55.00", "0.00", "5.00"}));
    }

    void shouldCountAColorantMissingInThePreviousTrialAsZero()
    {
        formulafixtures::Colorants c;
        const auto first = formulafixtures::recipeTrial(
            "First", formulafixtures::formula("First", {{c.clear, 70.0}, {c.fine, 30.0}}));
        const auto second = formulafixtures::recipeTrial(
            "Second", formulafixtures::formula("Second", {{c.clear, 70.0}, {c.fine, 25.0}, {c.black, 5.0}}), first);
        auto model = makeModel(second);
        QCOMPARE(text(*model, 2, Kind::PreviousPercent), QStringLiteral("0.00"));
        QCOMPARE(text(*model, 2, Kind::PreviousAmount), QStringLiteral("0.00"));
        QCOMPARE(text(*model, 2, Kind::DifferencePercent), QStringLiteral("5.00"));
        // k = max(70 / 0.7, 30 / 0.25) = 120: 84 clear, 30 fine, 6 black.
        QCOMPARE(column(*model, model->columnOfKind(Kind::AddAmount)), (QStringList{"14.00", "0.00", "6.00"}));
    }

    void shouldAddTheWholeFormulaWithoutAPreviousTrial()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        QCOMPARE(column(*model, model->columnOfKind(Kind::PreviousAmount)), (QStringList{"0.00", "0.00", "0.00", "0.00"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::AddAmount)), (QStringList{"62.00", "24.00", "12.50", "1.50"}));
    }

    void shouldShowRawPreviousConcentrationsWhenThePreviousTotalIsZero()
    {
        formulafixtures::Colorants c;
        // A total of 0 (a correction entered as +5/−5): no division, the concentrations as they are.
        const auto first = formulafixtures::recipeTrial(
            "First", formulafixtures::formula("First", {{c.clear, 5.0}, {c.fine, -5.0}}));
        const auto second = formulafixtures::recipeTrial(
            "Second", formulafixtures::formula("Second", {{c.clear, 80.0}, {c.fine, 20.0}}), first);
        auto model = makeModel(second);
        QCOMPARE(column(*model, model->columnOfKind(Kind::PreviousPercent)), (QStringList{"5.00", "-5.00"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::DifferencePercent)), (QStringList{"75.00", "25.00"}));
        QCOMPARE(column(*model, model->columnOfKind(Kind::FormulaPercent)), (QStringList{"80.00", "20.00"}));
    }

    void shouldSummariseRestrictions_data()
    {
        QTest::addColumn<double>("loading");
        QTest::addColumn<double>("constant");
        QTest::addColumn<double>("ratio");
        QTest::addColumn<bool>("partner");
        QTest::addColumn<QString>("summary");
        QTest::newRow("none") << 0.0 << 0.0 << 0.0 << false << "";
        QTest::newRow("loading only") << 12.5 << 0.0 << 0.0 << false << "L: 12.500 ";
        QTest::newRow("constant only") << 0.0 << 4.0 << 0.0 << false << "C: 4.000 ";
        QTest::newRow("ratio with partner") << 0.0 << 0.0 << 0.5 << true << "R: 0.500 A: Fine Aluminium";
        QTest::newRow("ratio without partner") << 0.0 << 0.0 << 0.125 << false << "R: 0.125";
        QTest::newRow("all three") << 60.0 << 1.25 << 2.0 << true << "L: 60.000 C: 1.250 R: 2.000 A: Fine Aluminium";
        QTest::newRow("negative values are no restriction") << -1.0 << -2.0 << -3.0 << true << "";
    }

    void shouldSummariseRestrictions()
    {
        QFETCH(double, loading);
        QFETCH(double, constant);
        QFETCH(double, ratio);
        QFETCH(bool, partner);
        QFETCH(QString, summary);
        formulafixtures::Colorants c;
        auto model = makeModel(formulafixtures::recipeTrial("T", formulafixtures::silver(c)));
        model->setLoading(2, loading);
        model->setConstantAmount(2, constant);
        model->setRatio(2, ratio, partner ? c.fine : nullptr);
        QCOMPARE(model->restrictionSummary(2), summary);
        QCOMPARE(text(*model, 2, Kind::Restrictions), summary);
        QCOMPARE(model->index(2, model->columnOfKind(Kind::Restrictions)).data(Qt::UserRole).toString(), summary);
    }

    void shouldReadRestrictionsFromTheRecipeTrial()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        QCOMPARE(column(*model, model->columnOfKind(Kind::Restrictions)),
                 (QStringList{"L: 62.000 ", "", "R: 0.500 A: Fine Aluminium", ""}));
        model->setRecipeTrial(recipe.correction);
        QCOMPARE(column(*model, model->columnOfKind(Kind::Restrictions)), (QStringList{"", "", "", "C: 2.000 "}));
    }

    void shouldWriteEditedRestrictionsBackIntoTheRecipeTrial()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        const int column = model->columnOfKind(Kind::Restrictions);
        QSignalSpy changed(model.get(), &QAbstractItemModel::dataChanged);
        QSignalSpy edited(model.get(), &FormulaTableModel::restrictionsChanged);

        QVERIFY(model->flags(model->index(1, column)) & Qt::ItemIsEditable);
        QVERIFY(!(model->flags(model->index(1, 1)) & Qt::ItemIsEditable));
        QVERIFY(model->setData(model->index(1, column), 30.0, FormulaTableModel::LoadingRole));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.last().at(0).toModelIndex(), model->index(1, column));
        QCOMPARE(edited.count(), 1);
        QVERIFY(!model->setData(model->index(1, column), 30.0, FormulaTableModel::LoadingRole)); // unchanged
        QVERIFY(!model->setData(model->index(1, 2), 30.0, FormulaTableModel::LoadingRole)); // not the restrictions column
        QVERIFY(!model->setData(model->index(1, column), "many", FormulaTableModel::LoadingRole));
        // The ratio of coarse to fine becomes coarse to black, then is cleared.
        QVERIFY(model->setData(model->index(2, column), recipe.colorants.black->id(), FormulaTableModel::RatioPartnerRole));
        QVERIFY(!model->setData(model->index(2, column), "no such colorant", FormulaTableModel::RatioPartnerRole));
        QCOMPARE(model->index(2, column).data().toString(), QStringLiteral("R: 0.500 A: Carbon Black"));
        QVERIFY(model->setData(model->index(0, column), 0.0, FormulaTableModel::LoadingRole));
        QVERIFY(model->setData(model->index(3, column), 1.5, FormulaTableModel::ConstantRole));

        // The recipe trial holds what the table shows; a new model reads the same.
        auto reread = makeModel(recipe.first);
        QCOMPARE(::column(*reread, column), ::column(*model, column));
        QCOMPARE(::column(*reread, column),
                 (QStringList{"", "L: 30.000 ", "R: 0.500 A: Carbon Black", "C: 1.500 "}));
        QCOMPARE(recipe.first->formulationSettings()->colorantRestrictions().size(), size_t(3));

        QVERIFY(model->setData(model->index(2, column), 0.0, FormulaTableModel::RatioRole));
        QCOMPARE(model->ratioPartner(2), nullptr); // a partner belongs to a ratio
        QVERIFY(!model->setData(model->index(2, column), recipe.colorants.fine->id(), FormulaTableModel::RatioPartnerRole));
    }

    void shouldOfferTheRolesOfTheTable()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        const QModelIndex name = model->index(0, model->columnOfKind(Kind::Colorant));
        QCOMPARE(name.data().toString(), QStringLiteral("Clear Binder"));
        QCOMPARE(name.data(Qt::ToolTipRole).toString(), QStringLiteral("Clear Binder"));
        const QIcon swatch = name.data(Qt::DecorationRole).value<QIcon>();
        QVERIFY(!swatch.isNull());
        QCOMPARE(swatch.pixmap(16, 16).toImage().pixelColor(8, 8), QColor(240, 240, 240));
        QVERIFY(!model->index(0, model->columnOfKind(Kind::Amount)).data(Qt::DecorationRole).isValid());
        // Column 0 is the icon column: no text, the colorant type for sorting.
        QCOMPARE(model->index(0, 0).data(), QVariant());
        QCOMPARE(model->index(0, 0).data(Qt::UserRole).toString(), QStringLiteral("Clear"));
        QCOMPARE(model->index(1, 0).data(Qt::UserRole).toString(), QStringLiteral("Metallic"));
        QCOMPARE(model->index(0, model->columnOfKind(Kind::FormulaPercent)).data(Qt::UserRole).toDouble(), 62.0);
        QCOMPARE(model->index(0, model->columnOfKind(Kind::Amount)).data(Qt::TextAlignmentRole).toInt(),
                 int(Qt::AlignRight | Qt::AlignVCenter));
    }

    void shouldSizeAndDecorateTheHeader()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        QFont font = QApplication::font();
        font.setWeight(75);
        font.setPixelSize(14);
        const QFontMetrics metrics(font);
        for (int c = 0; c < model->columnCount(); ++c) {
            const QString header = model->headerData(c, Qt::Horizontal).toString();
            QCOMPARE(model->headerData(c, Qt::Horizontal, Qt::SizeHintRole).toSize(),
                     QSize(metrics.horizontalAdvance(header) + 10, metrics.height() + 8));
        }
        QVERIFY(!model->headerData(0, Qt::Horizontal, Qt::DecorationRole).value<QIcon>().isNull());
        QVERIFY(!model->headerData(1, Qt::Horizontal, Qt::DecorationRole).isValid());
    }

    void shouldLayOutTheColumnsAsTold()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.correction);
        QSignalSpy reset(model.get(), &QAbstractItemModel::modelReset);
        model->setColumnKinds({Kind::Icon, Kind::Colorant, Kind::AddAmount, Kind::Restrictions});
        QCOMPARE(reset.count(), 1);
        QCOMPARE(model->columnCount(), 4);
        QCOMPARE(model->columnOfKind(Kind::AddAmount), 2);
        QCOMPARE(model->columnOfKind(Kind::Amount), -1);
        QCOMPARE(model->index(0, 2).data().toString(), QStringLiteral("13.00"));
        QCOMPARE(model->headerData(2, Qt::Horizontal).toString(), QStringLiteral("Add"));
    }

    // Bad formulas give empty cells and a reason, never "nan" or "inf".
    void shouldShowEmptyCellsForWhatCannotBeComputed_data()
    {
        QTest::addColumn<QString>("fault");
        QTest::addColumn<QStringList>("emptyKinds"); // kinds whose cells are all empty
        QTest::addColumn<QString>("problem");
        QTest::newRow("zero density in ml") << "density 0" << QStringList{"Amount"} << "Coarse Aluminium";
        QTest::newRow("negative density in ml") << "density -1" << QStringList{"Amount"} << "Coarse Aluminium";
        QTest::newRow("total 0") << "total 0" << QStringList{"FormulaPercent", "Amount", "CorrectedPercent"} << "total of 0";
        QTest::newRow("unknown unit") << "unit bucket" << QStringList{"Amount", "Accumulated", "AddAmount"} << "bucket";
    }

    void shouldShowEmptyCellsForWhatCannotBeComputed()
    {
        QFETCH(QString, fault);
        QFETCH(QStringList, emptyKinds);
        QFETCH(QString, problem);
        formulafixtures::Colorants c;
        auto formula = formulafixtures::silver(c);
        FormulaUnits unit = FormulaUnits::Gram;
        if (fault.startsWith("density")) {
            c.coarse->setDensity(fault.endsWith("-1") ? -1.0 : 0.0);
            unit = FormulaUnits::Milliliter;
        } else if (fault == "total 0") {
            for (const auto &ingredient : formula->ingredients())
                ingredient->setConcentration(0.0);
            unit = FormulaUnits::PercentWeight;
        } else {
            formula->setTotalQuantityUnit("bucket");
        }
        auto model = makeModel(formulafixtures::recipeTrial("T", formula), unit);
        QCOMPARE(model->rowCount(), 4);
        const QMetaEnum kinds = QMetaEnum::fromType<Kind>();
        for (const QString &kindName : emptyKinds) {
            const int column = model->columnOfKind(Kind(kinds.keyToValue(qPrintable(kindName))));
            const QStringList texts = ::column(*model, column);
            if (fault.startsWith("density")) {
                // Only the colorant without a density is empty; the running total stops there.
                QCOMPARE(texts.at(2), QString());
                QVERIFY(!texts.at(1).isEmpty());
                const QStringList accumulated = ::column(*model, model->columnOfKind(Kind::Accumulated));
                QCOMPARE(accumulated.mid(1), (QStringList{"77.34", "", ""}));
            } else {
                QCOMPARE(texts, (QStringList{"", "", "", ""}));
            }
            QVERIFY(!model->index(2, column).data(Qt::UserRole).isValid());
        }
        for (int r = 0; r < model->rowCount(); ++r) {
            for (int col = 0; col < model->columnCount(); ++col) {
                const QString shown = model->index(r, col).data().toString().toLower();
                QVERIFY2(!shown.contains("nan") && !shown.contains("inf"), qPrintable(shown));
            }
        }
        QVERIFY2(model->problems().join(' ').contains(problem), qPrintable(model->problems().join(' ')));
    }

    void shouldNameRowsWithoutAUsableColorant()
    {
        formulafixtures::Colorants c;
        c.black->setName(QString());
        auto formula = formulafixtures::silver(c);
        auto ingredients = formula->ingredients();
        ingredients.push_back(std::make_shared<Ingredient>()); // a new row, no colorant yet
        formula->setIngredients(ingredients);
        auto model = makeModel(formulafixtures::recipeTrial("T", formula));
        QCOMPARE(text(*model, 3, Kind::Colorant), QStringLiteral("(no name)"));
        QCOMPARE(text(*model, 4, Kind::Colorant), QStringLiteral("Select Colorant..."));
        QVERIFY(!model->index(4, model->columnOfKind(Kind::Colorant)).data(Qt::DecorationRole).isValid());
        QVERIFY(!(model->flags(model->index(4, model->columnOfKind(Kind::Restrictions))) & Qt::ItemIsEditable));
        QVERIFY(!model->setLoading(4, 5.0));
        QCOMPARE(model->index(4, 0).data(Qt::UserRole).toString(), QString());
    }

    // Clear colorants stay at the end whichever way a column is sorted.
    void shouldSortClearColorantsLast_data()
    {
        QTest::addColumn<int>("kind");
        QTest::addColumn<int>("order");
        QTest::addColumn<QStringList>("expected");
        // Recipe: Clear Binder, Fine Aluminium, Coarse Aluminium, Carbon Black, Second Clear.
        QTest::newRow("type ascending") << int(Kind::Icon) << int(Qt::AscendingOrder)
                                        << QStringList{"Fine Aluminium", "Coarse Aluminium", "Carbon Black", "Clear Binder", "Thinner"};
        QTest::newRow("type descending") << int(Kind::Icon) << int(Qt::DescendingOrder)
                                         << QStringList{"Carbon Black", "Fine Aluminium", "Coarse Aluminium", "Clear Binder", "Thinner"};
        QTest::newRow("name ascending") << int(Kind::Colorant) << int(Qt::AscendingOrder)
                                        << QStringList{"Carbon Black", "Coarse Aluminium", "Fine Aluminium", "Clear Binder", "Thinner"};
        QTest::newRow("name descending") << int(Kind::Colorant) << int(Qt::DescendingOrder)
                                         << QStringList{"Fine Aluminium", "Coarse Aluminium", "Carbon Black", "Clear Binder", "Thinner"};
        QTest::newRow("share ascending") << int(Kind::FormulaPercent) << int(Qt::AscendingOrder)
                                         << QStringList{"Carbon Black", "Coarse Aluminium", "Fine Aluminium", "Clear Binder", "Thinner"};
        QTest::newRow("share descending") << int(Kind::FormulaPercent) << int(Qt::DescendingOrder)
                                          << QStringList{"Fine Aluminium", "Coarse Aluminium", "Carbon Black", "Clear Binder", "Thinner"};
    }

    void shouldSortClearColorantsLast()
    {
        QFETCH(int, kind);
        QFETCH(int, order);
        QFETCH(QStringList, expected);
        formulafixtures::Colorants c;
        const auto thinner = formulafixtures::colorant("Thinner", ColorantType::Clear, 0.87);
        auto formula = formulafixtures::formula(
            "F", {{c.clear, 50.0}, {c.fine, 24.0}, {c.coarse, 12.5}, {c.black, 1.5}, {thinner, 12.0}});
        auto model = makeModel(formulafixtures::recipeTrial("T", formula));
        FormulaSortModel proxy;
        QAbstractItemModelTester tester(&proxy, QAbstractItemModelTester::FailureReportingMode::QtTest);
        proxy.setSourceModel(model.get());
        proxy.sort(model->columnOfKind(Kind(kind)), Qt::SortOrder(order));
        QCOMPARE(column(proxy, model->columnOfKind(Kind::Colorant)), expected);
    }

    // The running totals are the scale readings in the order shown.
    void shouldAccumulateInTheOrderShown()
    {
        formulafixtures::Recipe recipe;
        auto model = makeModel(recipe.first);
        FormulaSortModel proxy;
        proxy.setSourceModel(model.get());
        const int accumulated = model->columnOfKind(Kind::Accumulated);
        proxy.sort(0, Qt::AscendingOrder); // fine, coarse, black, clear
        QCOMPARE(column(proxy, accumulated), (QStringList{"24.00", "36.50", "38.00", "100.00"}));
        QCOMPARE(proxy.index(1, accumulated).data(Qt::UserRole).toDouble(), 36.5);
        proxy.sort(-1); // the formula's order
        QCOMPARE(column(proxy, accumulated), (QStringList{"62.00", "86.00", "98.50", "100.00"}));
    }
};

QTEST_MAIN(TestFormulaTableModel)
#include "tst_formulatablemodel.moc"

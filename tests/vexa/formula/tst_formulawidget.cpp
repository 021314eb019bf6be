// The formula widget and its table view: recipe trials in order, view modes, the unit
// chooser and can size, the restriction editor, copying, and the persisted settings.

#include "formulafixtures.h"
#include "samplestore.h"

#include <vexa/formula/formulasortmodel.h>
#include <vexa/formula/formulatable.h>
#include <vexa/formula/formulatablemodel.h>
#include <vexa/formula/formulawidget.h>
#include <vexa/formula/recipewidgetsettings.h>

#include <settings/settingsmanager.h>

#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QDir>
#include <QDoubleSpinBox>
#include <QGroupBox>
#include <QLabel>
#include <QListWidget>
#include <QLocale>
#include <QSignalSpy>
#include <QStandardItemModel>
#include <QTemporaryDir>
#include <QtTest>

#include <cmath>

using namespace vexa;
using Kind = FormulaTableModel::ColumnKind;

namespace {

QStringList headers(const QAbstractItemModel &model)
{
    QStringList list;
    for (int c = 0; c < model.columnCount(); ++c)
        list << model.headerData(c, Qt::Horizontal).toString();
    return list;
}

QStringList comboTexts(const QComboBox &box)
{
    QStringList texts;
    for (int i = 0; i < box.count(); ++i)
        texts << box.itemText(i).trimmed();
    return texts;
}

} // namespace

class TestFormulaWidget : public QObject
{
    Q_OBJECT

private:
    formulafixtures::Recipe m_recipe;
    std::shared_ptr<RecipeWidgetSettings> m_settings;
    std::unique_ptr<FormulaWidget> m_widget;

private Q_SLOTS:
    void initTestCase() { QLocale::setDefault(QLocale::c()); }

    void init()
    {
        m_recipe = formulafixtures::Recipe();
        m_settings = std::make_shared<RecipeWidgetSettings>();
        m_widget = std::make_unique<FormulaWidget>(m_settings);
        m_widget->setRecipeTrials({m_recipe.first, m_recipe.correction});
        m_widget->resize(900, 500);
    }

    void cleanup() { m_widget.reset(); }

    void shouldListTheRecipeTrialsInOrderAndShowTheLast()
    {
        QCOMPARE(m_widget->recipeTrialList()->count(), 2);
        QCOMPARE(m_widget->recipeTrialList()->item(0)->text(), QStringLiteral("1. Silver Recipe"));
        QCOMPARE(m_widget->recipeTrialList()->item(1)->text(), QStringLiteral("2. Silver Correction 1"));
        QCOMPARE(m_widget->currentRecipeTrial(), 1);
        QCOMPARE(m_widget->tableModel()->recipeTrial(), m_recipe.correction);
        m_widget->recipeTrialList()->setCurrentRow(0);
        QCOMPARE(m_widget->tableModel()->recipeTrial(), m_recipe.first);
        m_widget->setRecipeTrials({});
        QCOMPARE(m_widget->tableModel()->rowCount(), 0);
        QCOMPARE(m_widget->totalLabel()->text(), QString());
    }

    void shouldShowAFormulaOnItsOwn()
    {
        m_widget->setFormula(formulafixtures::silver());
        QCOMPARE(m_widget->recipeTrialList()->count(), 1);
        QCOMPARE(m_widget->tableModel()->rowCount(), 4);
        QCOMPARE(m_widget->tableModel()->formula()->name(), QStringLiteral("Silver Metallic"));
    }

    void shouldLayOutTheColumnsOfEachViewMode()
    {
        QCOMPARE(headers(*m_widget->sortModel()),
                 (QStringList{"", "Colorant", "Formula (%)", "Amount (g)", "Accumulated (g)", "Restrictions"}));
        m_widget->viewModeBox()->setCurrentIndex(1);
        QCOMPARE(m_widget->viewMode(), FormulaWidget::ViewMode::Correction);
        QCOMPARE(headers(*m_widget->sortModel()),
                 (QStringList{"", "Colorant", "Previous %", "Corrected %", "Difference %", "Previous", "Add", "Corrected",
                              "Restrictions"}));
    }

    // Clear Binder is sorted to the end from the start.
    void shouldStartWithClearColorantsLast()
    {
        const int name = m_widget->tableModel()->columnOfKind(Kind::Colorant);
        QCOMPARE(m_widget->sortModel()->index(3, name).data().toString(), QStringLiteral("Clear Binder"));
        QCOMPARE(m_widget->sortModel()->index(3, m_widget->tableModel()->columnOfKind(Kind::Accumulated)).data().toString(),
                 QStringLiteral("100.00"));
    }

    void shouldGroupTheUnitChooser()
    {
        m_widget->setUnitSystem(FormulaOutput::UnitSystem::SI);
        QComboBox *units = m_widget->unitBox();
        QCOMPARE(comboTexts(*units), (QStringList{"Weight", "%Weight", "g", "kg", "Volume", "%Volume", "ml", "l"}));
        auto *model = qobject_cast<QStandardItemModel *>(units->model());
        QVERIFY(model);
        QCOMPARE(model->item(0)->flags(), Qt::NoItemFlags); // headings cannot be chosen
        QCOMPARE(model->item(4)->flags(), Qt::NoItemFlags);
        QVERIFY(model->item(2)->flags() & Qt::ItemIsSelectable);
        QCOMPARE(comboTexts(*m_widget->systemBox()), (QStringList{"SI", "US"}));

        m_widget->systemBox()->setCurrentIndex(1); // US: grams become ounces
        QCOMPARE(m_widget->unit(), FormulaUnits::Ounce);
        QCOMPARE(comboTexts(*units),
                 (QStringList{"Weight", "%Weight", "oz", "lb", "Volume", "%Volume", "fl oz", "shot", "pt", "qt", "gal",
                              "imp gal"}));
        QCOMPARE(m_widget->tableModel()->headerData(m_widget->tableModel()->columnOfKind(Kind::Amount), Qt::Horizontal)
                     .toString(),
                 QStringLiteral("Amount (oz)"));
        QCOMPARE(m_settings->formulaUnit(), FormulaUnits::Ounce);
    }

    void shouldSwitchToTheSystemOfAChosenUnit()
    {
        m_widget->setUnit(FormulaUnits::FluidOunce);
        QCOMPARE(m_widget->unitSystem(), FormulaOutput::UnitSystem::US);
        QCOMPARE(m_widget->unitBox()->currentText().trimmed(), QStringLiteral("fl oz"));
        QCOMPARE(m_widget->tableModel()->headerData(m_widget->tableModel()->columnOfKind(Kind::Accumulated),
                                                    Qt::Horizontal)
                     .toString(),
                 QStringLiteral("Accumulated (fl oz)"));
        // A percent unit belongs to both systems: switching keeps it.
        m_widget->setUnit(FormulaUnits::PercentVolume);
        m_widget->setUnitSystem(FormulaOutput::UnitSystem::SI);
        QCOMPARE(m_widget->unit(), FormulaUnits::PercentVolume);
        QVERIFY(!m_widget->canSizeBox()->isEnabled());
    }

    // The can stays the same can when the unit changes.
    void shouldConvertTheCanSizeWithTheUnit()
    {
        m_widget->setUnit(FormulaUnits::Gram);
        m_widget->canSizeBox()->setValue(250.0);
        QCOMPARE(m_widget->canSize(), 250.0);
        QCOMPARE(m_widget->canSizeBox()->suffix(), QStringLiteral(" g"));
        m_widget->setUnit(FormulaUnits::Kilogram);
        QVERIFY(std::fabs(m_widget->canSize() - 0.25) < 1e-12);
        QCOMPARE(m_widget->canSizeBox()->suffix(), QStringLiteral(" kg"));
        // In ml through the formula's own weight-to-volume ratio: 100 g are 75.6 ml of this correction.
        const double ml = 60.0 / 1.02 + 28.0 / 1.45 + 10.0 / 1.50 + 2.0 / 1.10;
        m_widget->setUnit(FormulaUnits::Milliliter);
        QVERIFY(std::fabs(m_widget->canSize() - 2.5 * ml) < 1e-9);
        QVERIFY(std::fabs(m_widget->tableModel()->totalAmount() - 2.5 * ml) < 1e-9);
        QCOMPARE(m_widget->totalLabel()->text(),
                 QStringLiteral("Total: %1 ml").arg(QLocale().toString(2.5 * ml, 'f', 2)));
    }

    void shouldEditTheRestrictionsOfTheChosenColorant()
    {
        m_widget->recipeTrialList()->setCurrentRow(0);
        FormulaTableModel *model = m_widget->tableModel();
        QSignalSpy edited(m_widget.get(), &FormulaWidget::restrictionsChanged);
        // Choose Coarse Aluminium (source row 2) in the sorted view.
        const int name = model->columnOfKind(Kind::Colorant);
        int viewRow = -1;
        for (int r = 0; r < m_widget->sortModel()->rowCount(); ++r)
            if (m_widget->sortModel()->index(r, name).data().toString() == "Coarse Aluminium")
                viewRow = r;
        QVERIFY(viewRow >= 0);
        m_widget->table()->setCurrentIndex(m_widget->sortModel()->index(viewRow, name));
        QCOMPARE(m_widget->restrictionBox()->title(), QStringLiteral("Restrictions of Coarse Aluminium"));
        auto *ratio = m_widget->findChild<QDoubleSpinBox *>("ratioBox");
        auto *loading = m_widget->findChild<QDoubleSpinBox *>("loadingBox");
        auto *partner = m_widget->findChild<QComboBox *>("partnerBox");
        QVERIFY(ratio && loading && partner);
        QCOMPARE(ratio->value(), 0.5);
        QCOMPARE(partner->currentText(), QStringLiteral("Fine Aluminium"));
        QCOMPARE(loading->value(), 0.0);
        QCOMPARE(edited.count(), 0); // showing a row edits nothing

        loading->setValue(12.5);
        QCOMPARE(model->loading(2), 12.5);
        QCOMPARE(model->restrictionSummary(2), QStringLiteral("L: 12.500 R: 0.500 A: Fine Aluminium"));
        QCOMPARE(edited.count(), 1);
        QCOMPARE(m_recipe.first->formulationSettings()->colorantRestrictions().size(), size_t(3));
        ratio->setValue(0.0);
        QCOMPARE(model->ratio(2), 0.0);
        QVERIFY(!partner->isEnabled());
    }

    void shouldSayWhyAmountsAreMissing()
    {
        m_recipe.colorants.fine->setDensity(qQNaN());
        m_widget->setUnit(FormulaUnits::Liter);
        QVERIFY(!m_widget->problemLabel()->isHidden());
        QVERIFY(m_widget->problemLabel()->text().contains("Fine Aluminium"));
        QCOMPARE(m_widget->totalLabel()->text(), QStringLiteral("Total: cannot be computed"));
        m_widget->setUnit(FormulaUnits::Gram);
        QVERIFY(m_widget->problemLabel()->isHidden());
    }

    void shouldCopyEveryCellOnCtrlC()
    {
        m_widget->show();
        QApplication::clipboard()->setText("stale");
        QTest::keyClick(m_widget->table(), Qt::Key_C, Qt::ControlModifier);
        const QStringList lines = QApplication::clipboard()->text().split('\n');
        QCOMPARE(lines.size(), 5); // four rows and the empty rest after the last line feed
        QCOMPARE(lines.at(0), QStringLiteral("\tFine Aluminium\t28.00\t28.00\t28.00\t"));
        QCOMPARE(lines.at(3), QStringLiteral("\tClear Binder\t60.00\t60.00\t100.00\t"));
        QCOMPARE(lines.at(4), QString());
        QCOMPARE(QApplication::clipboard()->text(), m_widget->table()->clipboardText());
        // Other keys reach the view.
        m_widget->table()->setCurrentIndex(m_widget->sortModel()->index(0, 1));
        QTest::keyClick(m_widget->table(), Qt::Key_Down);
        QCOMPARE(m_widget->table()->currentIndex().row(), 1);
    }

    // The sample data's silver metallic correction in a 500 g can; with VEXA_SCREENSHOT_DIR
    // set the picture is kept for the documentation.
    void shouldShowTheSampleCorrection()
    {
        samplestore::SampleStore store;
        QVERIFY2(store.error.isEmpty(), qPrintable(store.error));
        std::shared_ptr<RecipeTrial> correction;
        for (const auto &trial : store.all<RecipeTrial>())
            if (trial->name() == "Silver Metallic Correction 1")
                correction = trial;
        QVERIFY(correction && correction->previousRecipeTrial());
        QCOMPARE(correction->previousRecipeTrial()->name(), QStringLiteral("Silver Metallic Recipe"));

        FormulaWidget widget(std::make_shared<RecipeWidgetSettings>());
        widget.setRecipeTrials({correction->previousRecipeTrial(), correction});
        widget.setUnit(FormulaUnits::Gram);
        widget.setCanSize(500.0);
        widget.setViewMode(FormulaWidget::ViewMode::Correction);
        widget.resize(1320, 340);
        widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&widget));
        FormulaTableModel *model = widget.tableModel();
        // 500 g of 61 / 25.5 / 12.5 / 1 after 500 g of 62 / 24 / 12.5 / 1.5: the carbon black
        // bounds the batch (7.5 g at 1 %), so 750 g in all.
        const int name = model->columnOfKind(Kind::Colorant);
        for (int r = 0; r < model->rowCount(); ++r) {
            if (model->index(r, name).data().toString() == "Carbon Black") {
                QCOMPARE(model->index(r, model->columnOfKind(Kind::AddAmount)).data().toString(), QStringLiteral("0.00"));
                QCOMPARE(model->index(r, model->columnOfKind(Kind::CorrectedAmount)).data().toString(),
                         QStringLiteral("7.50"));
            }
            if (model->index(r, name).data().toString() == "Fine Aluminium")
                QCOMPARE(model->index(r, model->columnOfKind(Kind::AddAmount)).data().toString(), QStringLiteral("71.25"));
        }
        const QString target = qEnvironmentVariable("VEXA_SCREENSHOT_DIR");
        if (!target.isEmpty())
            QVERIFY(widget.grab().save(QDir(target).filePath("formula-correction.png")));
    }

    void shouldPersistTheSettings()
    {
        QTemporaryDir dir;
        {
            SettingsManager manager(dir.path());
            auto settings = std::make_shared<RecipeWidgetSettings>();
            QVERIFY(manager.registerClientSettings(settings));
            QCOMPARE(settings->colorantPercentageDecimalPoints(), 2);
            QCOMPARE(settings->colorantAmountDecimalPoints(), 2);
            QVERIFY(settings->setColorantPercentageDecimalPoints(3));
            QVERIFY(settings->setColorantAmountDecimalPoints(1));
            QVERIFY(!settings->setColorantAmountDecimalPoints(7));
            QVERIFY(!settings->setColorantAmountDecimalPoints(-1));
            settings->setFormulaUnit(FormulaUnits::Quart);
            QVERIFY(manager.saveClientSettings());
        }
        SettingsManager manager(dir.path());
        auto settings = std::make_shared<RecipeWidgetSettings>();
        QVERIFY(manager.registerClientSettings(settings));
        QCOMPARE(settings->colorantPercentageDecimalPoints(), 3);
        QCOMPARE(settings->colorantAmountDecimalPoints(), 1);
        QCOMPARE(settings->formulaUnit(), FormulaUnits::Quart);
        QVERIFY(settings->setting(RecipeWidgetSettings::percentageDecimalsKey()));
        QVERIFY(settings->setting(RecipeWidgetSettings::amountDecimalsKey()));
        // A widget starts in the remembered unit.
        FormulaWidget widget(settings);
        QCOMPARE(widget.unit(), FormulaUnits::Quart);
        QCOMPARE(widget.unitSystem(), FormulaOutput::UnitSystem::US);
    }
};

QTEST_MAIN(TestFormulaWidget)
#include "tst_formulawidget.moc"

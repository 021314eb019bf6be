#include <settings/boolsetting.h>
#include <settings/commonsettings.h>
#include <settings/doublesetting.h>
#include <settings/generalsettings.h>
#include <settings/intsetting.h>
#include <settings/localsettings.h>
#include <settings/settingslistsetting.h>
#include <settings/settingswidget.h>
#include <settings/stringlistsetting.h>
#include <settings/stringsetting.h>

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QDoubleSpinBox>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QSignalSpy>
#include <QSpinBox>
#include <QStandardItemModel>
#include <QTabWidget>
#include <QtTest>

namespace {
std::shared_ptr<CommonSettings> makeGroup()
{
    auto group = std::make_shared<CommonSettings>("JobDetailView", "Job Detail View");
    group->addSetting(std::make_shared<BoolSetting>("ShowStandardValues", true, "Show standard values"), "Color");
    auto count = std::make_shared<IntSetting>("Count", 5, "Count");
    count->setRange(1, 9);
    group->addSetting(count, "Color");
    auto weight = std::make_shared<DoubleSetting>("Weight", 1.5, "Weight");
    weight->setPrecision(3);
    weight->setRange(0.0, 10.0);
    group->addSetting(weight, "Color");

    auto coordinates = std::make_shared<StringListSetting>("TableColorSpaceCoordinates", "Displayed Color Coordinates");
    coordinates->setSingleSelect(true);
    for (const char *value : {"CIELab", "CIELCh", "CIELabCh", "None"})
        coordinates->addPossibleValue(StringPair(value), QLatin1String(value) == "CIELab");
    group->addSetting(coordinates, "Color");

    auto metrics = std::make_shared<StringListSetting>("TrendPlotMetrics", "Select max 4 of trend plot metrics");
    metrics->setUseComboBox(true);
    for (const char *value : {"Tolerances", "dE2000", "dECIELab", "dL", "da", "db"})
        metrics->addPossibleValue(StringPair(value), QLatin1String(value) == "Tolerances");
    metrics->setMaximumSelectionCount(4, "Select max 4 of trend plot metrics");
    group->addSetting(metrics, "Color");

    auto boxMetrics = std::make_shared<StringListSetting>("BoxPlotMetrics", "Box plot metrics");
    for (const char *value : {"dE2000", "dECIELab", "dL"})
        boxMetrics->addPossibleValue(StringPair(value), QLatin1String(value) == "dE2000");
    boxMetrics->setMaximumSelectionCount(2);
    group->addSetting(boxMetrics, "Color");

    auto format = std::make_shared<StringSetting>("DisplayTrialNameFormat", "<Name>", "Name Format", "",
                                                  StringSetting::DisplayType::Plain, "MinimumWidth=250;");
    format->setRegularExpression(QRegularExpression("[^;]*"));
    group->addSetting(format, "AutoName");
    auto fixed = std::make_shared<StringSetting>("Fixed", "fixed", "Fixed");
    fixed->setIsReadOnly(true);
    group->addSetting(fixed, "AutoName");
    auto hidden = std::make_shared<IntSetting>("lastSelectedIndex", 0, "Hidden");
    hidden->setIsVisible(false);
    group->addSetting(hidden, "AutoName");
    auto expert = std::make_shared<BoolSetting>("Expert", false, "Expert");
    expert->setIsExpertSetting(true);
    group->addSetting(expert, "AutoName");

    auto plots = std::make_shared<SettingsListSetting>("Lab-Plot", "Lab-Plot", "Lab-Plot");
    auto plotTemplate = std::make_shared<SettingsSection>("Template");
    plotTemplate->addSetting(std::make_shared<BoolSetting>("showHueCircle", false, "Show Hue circle"));
    plots->setTemplateSectionSettings(plotTemplate);
    plots->setUseTabWidget(true);
    plots->addSection("Lab-Plot 1");
    plots->addSection("Lab-Plot 2");
    group->addSetting(plots, "Lab-Plot");
    return group;
}

template<class T>
T *editor(const SettingsWidget &widget, const QString &name)
{
    T *found = widget.findChild<T *>(name);
    if (!found)
        qWarning() << "no editor" << name;
    return found;
}

void toggleComboItem(QComboBox *combo, int row)
{
    auto *model = qobject_cast<QStandardItemModel *>(combo->model());
    QVERIFY(model);
    QStandardItem *item = model->item(row);
    item->setCheckState(item->checkState() == Qt::Checked ? Qt::Unchecked : Qt::Checked);
}
} // namespace

class tst_SettingsWidget : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void writesBackOnlyOnOk_data();
    void writesBackOnlyOnOk();
    void readOnlyHiddenAndExpert();
    void invalidTextBlocksOk();
    void maximumSelectionIsEnforced();
    void listSettingAsTabs();
    void restoreDefaultsTouchesOnlyCopies();
    void rendersGeneralSettings();
};

void tst_SettingsWidget::writesBackOnlyOnOk_data()
{
    QTest::addColumn<bool>("accept");
    QTest::newRow("cancel") << false;
    QTest::newRow("ok") << true;
}

void tst_SettingsWidget::writesBackOnlyOnOk()
{
    QFETCH(bool, accept);
    const auto group = makeGroup();
    const QJsonObject before = group->toJson();
    QSignalSpy changed(group.get(), &CommonSettings::settingsChanged);

    SettingsWidget widget(group);
    editor<QCheckBox>(widget, "ShowStandardValues")->setChecked(false);
    editor<QSpinBox>(widget, "Count")->setValue(7);
    editor<QDoubleSpinBox>(widget, "Weight")->setValue(2.125);
    auto *coordinates = editor<QComboBox>(widget, "TableColorSpaceCoordinates");
    coordinates->setCurrentIndex(coordinates->findData("None"));
    toggleComboItem(editor<QComboBox>(widget, "TrendPlotMetrics"), 1);
    editor<QListWidget>(widget, "BoxPlotMetrics")->item(2)->setCheckState(Qt::Checked);
    editor<QLineEdit>(widget, "DisplayTrialNameFormat")->setText("<Name>-<Year>");
    editor<QCheckBox>(widget, "Lab-Plot/Lab-Plot 2/showHueCircle")->setChecked(true);
    QCOMPARE(group->toJson(), before); // only the copies changed so far

    if (!accept) {
        widget.reject();
        QCOMPARE(group->toJson(), before);
        QCOMPARE(changed.count(), 0);
        return;
    }
    widget.accept();
    QCOMPARE(widget.result(), int(QDialog::Accepted));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(group->setting<BoolSetting>("ShowStandardValues")->value(), false);
    QCOMPARE(group->setting<IntSetting>("Count")->value(), 7);
    QCOMPARE(group->setting<DoubleSetting>("Weight")->value(), 2.125);
    QCOMPARE(group->setting<StringListSetting>("TableColorSpaceCoordinates")->selectedValue(), QStringLiteral("None"));
    QCOMPARE(group->setting<StringListSetting>("TrendPlotMetrics")->selectedValues(),
             (QStringList{"Tolerances", "dE2000"}));
    QCOMPARE(group->setting<StringListSetting>("BoxPlotMetrics")->selectedValues(), (QStringList{"dE2000", "dL"}));
    QCOMPARE(group->setting<StringSetting>("DisplayTrialNameFormat")->value(), QStringLiteral("<Name>-<Year>"));
    const auto plots = group->setting<SettingsListSetting>("Lab-Plot");
    QCOMPARE(plots->section("Lab-Plot 2")->setting<BoolSetting>("showHueCircle")->value(), true);
    QCOMPARE(plots->section("Lab-Plot 1")->setting<BoolSetting>("showHueCircle")->value(), false);
}

void tst_SettingsWidget::readOnlyHiddenAndExpert()
{
    const auto group = makeGroup();
    {
        SettingsWidget widget(group);
        auto *fixed = editor<QLineEdit>(widget, "Fixed");
        QVERIFY(fixed);
        QVERIFY(!fixed->isEnabled());
        QVERIFY(!widget.findChild<QWidget *>("lastSelectedIndex"));
        QVERIFY(!widget.findChild<QWidget *>("Expert"));
        // The read-only value is not written back even if its editor were changed.
        fixed->setText("changed");
        widget.accept();
        QCOMPARE(group->setting<StringSetting>("Fixed")->value(), QStringLiteral("fixed"));
    }
    group->setExpertMode(true);
    SettingsWidget widget(group);
    QVERIFY(widget.findChild<QCheckBox *>("Expert"));
}

void tst_SettingsWidget::invalidTextBlocksOk()
{
    const auto group = makeGroup();
    SettingsWidget widget(group);
    auto *ok = widget.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    auto *format = editor<QLineEdit>(widget, "DisplayTrialNameFormat");
    QCOMPARE(format->minimumWidth(), 250);

    format->setText("<Name>;bad");
    QVERIFY(widget.hasInvalidInput());
    QVERIFY(!ok->isEnabled());
    QVERIFY(widget.hintText().contains("<Name>;bad"));
    widget.accept(); // refused while the text is invalid
    QCOMPARE(widget.result(), int(QDialog::Rejected));

    format->setText("<Name>");
    QVERIFY(ok->isEnabled());
    QVERIFY(widget.hintText().isEmpty());
}

void tst_SettingsWidget::maximumSelectionIsEnforced()
{
    const auto group = makeGroup();
    SettingsWidget widget(group);
    auto *combo = editor<QComboBox>(widget, "TrendPlotMetrics");
    for (int row = 1; row <= 4; ++row)
        toggleComboItem(combo, row); // the fifth selection is refused
    const auto edited = std::static_pointer_cast<StringListSetting>(widget.editedSetting("TrendPlotMetrics"));
    QCOMPARE(edited->selectedValues(), (QStringList{"Tolerances", "dE2000", "dECIELab", "dL"}));
    auto *model = qobject_cast<QStandardItemModel *>(combo->model());
    QCOMPARE(model->item(4)->checkState(), Qt::Unchecked);
    QCOMPARE(widget.hintText(), QStringLiteral("Select max 4 of trend plot metrics"));

    auto *list = editor<QListWidget>(widget, "BoxPlotMetrics");
    list->item(1)->setCheckState(Qt::Checked);
    list->item(2)->setCheckState(Qt::Checked);
    QCOMPARE(list->item(2)->checkState(), Qt::Unchecked);
    QVERIFY(widget.hintText().contains("2"));

    // Unchecking is always possible and clears the hint.
    toggleComboItem(combo, 0);
    QCOMPARE(edited->selectedValues(), (QStringList{"dE2000", "dECIELab", "dL"}));
    QVERIFY(widget.hintText().isEmpty());
}

void tst_SettingsWidget::listSettingAsTabs()
{
    const auto group = makeGroup();
    SettingsWidget widget(group);
    auto *tabs = editor<QTabWidget>(widget, "Lab-Plot");
    QVERIFY(tabs);
    QCOMPARE(tabs->count(), 2);
    QCOMPARE(tabs->tabText(1), QStringLiteral("Lab-Plot 2"));
}

void tst_SettingsWidget::restoreDefaultsTouchesOnlyCopies()
{
    const auto group = makeGroup();
    group->setting<IntSetting>("Count")->setValue(8);
    SettingsWidget widget(group);
    QCOMPARE(editor<QSpinBox>(widget, "Count")->value(), 8);
    widget.restoreDefaults();
    QCOMPARE(editor<QSpinBox>(widget, "Count")->value(), 5);
    QCOMPARE(group->setting<IntSetting>("Count")->value(), 8);
    widget.reject();
    QCOMPARE(group->setting<IntSetting>("Count")->value(), 8);
}

void tst_SettingsWidget::rendersGeneralSettings()
{
    const auto general = std::make_shared<GeneralSettings>();
    SettingsWidget widget(general);
    widget.resize(widget.sizeHint().expandedTo(QSize(460, 0)));
    widget.show();
    QVERIFY(QTest::qWaitForWindowExposed(&widget));
    auto *condition = editor<QComboBox>(widget, "ColorimetricCondition");
    QCOMPARE(condition->currentText(), QStringLiteral("D65/10"));
    QVERIFY(!widget.findChild<QWidget *>("DispatcherList"));
    QVERIFY(widget.grab().save(QDir::temp().filePath("settingswidget.png")));

    const auto local = std::make_shared<LocalSettings>();
    SettingsWidget localWidget(local);
    localWidget.show();
    QVERIFY(QTest::qWaitForWindowExposed(&localWidget));
    QVERIFY(localWidget.grab().save(QDir::temp().filePath("settingswidget-local.png")));

    SettingsWidget groupWidget(makeGroup());
    groupWidget.show();
    QVERIFY(QTest::qWaitForWindowExposed(&groupWidget));
    QVERIFY(groupWidget.grab().save(QDir::temp().filePath("settingswidget-group.png")));
}

QTEST_MAIN(tst_SettingsWidget)
#include "tst_settingswidget.moc"

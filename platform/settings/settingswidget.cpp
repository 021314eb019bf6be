#include "settingswidget.h"

#include "boolsetting.h"
#include "checkablecombobox_p.h"
#include "commonsettings.h"
#include "doublesetting.h"
#include "intsetting.h"
#include "settingslistsetting.h"
#include "settingssection.h"
#include "stringlistsetting.h"
#include "stringsetting.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QDoubleSpinBox>
#include <QFileDialog>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QSpinBox>
#include <QStyle>
#include <QTabWidget>
#include <QToolButton>
#include <QVBoxLayout>

namespace {
const char *const InvalidStyle = "border: 1px solid #d32f2f;";

void applyDisplayHint(QWidget *editor, const StringSetting &setting)
{
    bool ok = false;
    const int minimumWidth = setting.displayHintValue(QStringLiteral("MinimumWidth")).toInt(&ok);
    if (ok && minimumWidth > 0)
        editor->setMinimumWidth(minimumWidth);
    const int maximumWidth = setting.displayHintValue(QStringLiteral("MaximumWidth")).toInt(&ok);
    if (ok && maximumWidth > 0)
        editor->setMaximumWidth(maximumWidth);
    const int minimumHeight = setting.displayHintValue(QStringLiteral("MinimumHeight")).toInt(&ok);
    if (ok && minimumHeight > 0)
        editor->setMinimumHeight(minimumHeight);
}
} // namespace

SettingsWidget::SettingsWidget(const std::shared_ptr<CommonSettings> &settings, QWidget *parent)
    : QDialog(parent)
    , m_settings(settings)
{
    setObjectName(QStringLiteral("SettingsWidget"));
    setWindowTitle(settings ? settings->displayName() : tr("Settings"));

    if (m_settings) {
        // One copy per setting, even when a setting is shown in several sections.
        for (const auto &original : m_settings->settings()) {
            const bool known = std::any_of(m_copies.begin(), m_copies.end(),
                                           [&](const auto &entry) { return entry.first == original; });
            if (!known)
                m_copies.emplace_back(original, original->clone());
        }
    }

    auto *layout = new QVBoxLayout(this);
    m_scrollArea = new QScrollArea(this);
    m_scrollArea->setWidgetResizable(true);
    m_scrollArea->setFrameShape(QFrame::NoFrame);
    layout->addWidget(m_scrollArea, 1);

    m_hintLabel = new QLabel(this);
    m_hintLabel->setObjectName(QStringLiteral("hintLabel"));
    m_hintLabel->setWordWrap(true);
    m_hintLabel->setStyleSheet(QStringLiteral("color: #b71c1c;"));
    m_hintLabel->hide();
    layout->addWidget(m_hintLabel);

    m_buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel
                                         | QDialogButtonBox::RestoreDefaults,
                                     this);
    m_buttons->setObjectName(QStringLiteral("buttonBox"));
    connect(m_buttons, &QDialogButtonBox::accepted, this, &SettingsWidget::accept);
    connect(m_buttons, &QDialogButtonBox::rejected, this, &SettingsWidget::reject);
    connect(m_buttons->button(QDialogButtonBox::RestoreDefaults), &QPushButton::clicked, this,
            &SettingsWidget::restoreDefaults);
    layout->addWidget(m_buttons);

    buildContent();
}

SettingsWidget::~SettingsWidget() = default;

std::shared_ptr<BaseSetting> SettingsWidget::editedSetting(const QString &key) const
{
    for (const auto &entry : m_copies)
        if (entry.first->key() == key)
            return entry.second;
    return nullptr;
}

QString SettingsWidget::hintText() const
{
    return m_hintLabel->isHidden() ? QString() : m_hintLabel->text();
}

void SettingsWidget::accept()
{
    if (hasInvalidInput())
        return;
    if (m_settings) {
        m_settings->beginUpdate();
        for (const auto &entry : m_copies)
            if (!entry.first->isReadOnly())
                entry.first->assignValue(*entry.second);
        m_settings->endUpdate();
    }
    QDialog::accept();
}

void SettingsWidget::restoreDefaults()
{
    for (const auto &entry : m_copies)
        if (!entry.second->isReadOnly())
            entry.second->resetToDefault();
    buildContent();
}

void SettingsWidget::buildContent()
{
    m_invalidEditors.clear();
    m_invalidMessages.clear();
    m_infoHint.clear();

    auto *content = new QWidget;
    auto *layout = new QVBoxLayout(content);
    if (m_settings) {
        // Sections gathered by their page group, in order of first appearance.
        std::vector<std::pair<QString, std::vector<std::shared_ptr<SettingsSection>>>> pages;
        for (const auto &section : m_settings->sections()) {
            const auto sectionSettings = section->settings();
            const bool anyShown = std::any_of(sectionSettings.begin(), sectionSettings.end(),
                                              [this](const auto &setting) { return isShown(*setting); });
            if (!anyShown)
                continue;
            auto page = std::find_if(pages.begin(), pages.end(),
                                     [&](const auto &entry) { return entry.first == section->groupName(); });
            if (page == pages.end())
                pages.emplace_back(section->groupName(), std::vector<std::shared_ptr<SettingsSection>>{section});
            else
                page->second.push_back(section);
        }
        if (pages.size() > 1) {
            auto *tabs = new QTabWidget(content);
            tabs->setObjectName(QStringLiteral("pages"));
            for (const auto &page : pages)
                tabs->addTab(createSectionsPage(page.second),
                             page.first.isEmpty() ? m_settings->displayName() : page.first);
            layout->addWidget(tabs);
        } else if (pages.size() == 1) {
            layout->addWidget(createSectionsPage(pages.front().second));
        } else {
            layout->addWidget(new QLabel(tr("There are no settings to edit."), content));
        }
    }
    layout->addStretch(1);
    delete m_scrollArea->takeWidget();
    m_scrollArea->setWidget(content);
    // Show everything without scrolling as long as it fits a usual screen.
    const QSize wanted = content->sizeHint();
    m_scrollArea->setMinimumSize(qMin(wanted.width() + m_scrollArea->verticalScrollBar()->sizeHint().width(), 900),
                                 qMin(wanted.height(), 640));
    updateState();
}

QWidget *SettingsWidget::createSectionsPage(const std::vector<std::shared_ptr<SettingsSection>> &sections)
{
    auto *page = new QWidget;
    auto *layout = new QVBoxLayout(page);
    layout->setContentsMargins(0, 0, 0, 0);
    std::vector<QFormLayout *> forms;
    for (const auto &section : sections) {
        auto *box = new QGroupBox(section->displayName(), page);
        box->setObjectName(section->sectionName());
        auto *form = new QFormLayout(box);
        form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
        for (const auto &original : section->settings()) {
            if (!isShown(*original))
                continue;
            const auto copy = std::find_if(m_copies.begin(), m_copies.end(),
                                           [&](const auto &entry) { return entry.first == original; });
            if (copy != m_copies.end())
                addSettingRow(form, copy->second, original->key());
        }
        layout->addWidget(box);
        forms.push_back(form);
    }
    layout->addStretch(1);

    // Line up the label columns of all boxes on the page.
    int labelWidth = 0;
    std::vector<QWidget *> labels;
    for (QFormLayout *form : forms) {
        for (int row = 0; row < form->rowCount(); ++row) {
            QLayoutItem *item = form->itemAt(row, QFormLayout::LabelRole);
            if (item && item->widget() && form->itemAt(row, QFormLayout::FieldRole)) {
                labels.push_back(item->widget());
                labelWidth = qMax(labelWidth, item->widget()->sizeHint().width());
            }
        }
    }
    for (QWidget *label : labels)
        label->setMinimumWidth(labelWidth);
    return page;
}

void SettingsWidget::addSettingRow(QFormLayout *form, const std::shared_ptr<BaseSetting> &copy,
                                   const QString &objectName)
{
    QWidget *editor = createEditor(copy, objectName);
    if (!editor)
        return;
    editor->setToolTip(copy->descriptionText());
    editor->setEnabled(!copy->isReadOnly());
    if (qobject_cast<QCheckBox *>(editor)) {
        form->addRow(QString(), editor);
        return;
    }
    const auto *box = qobject_cast<QGroupBox *>(form->parentWidget());
    if (qobject_cast<SettingsListSetting *>(copy.get())
        && (copy->labelText().isEmpty() || (box && box->title() == copy->labelText()))) {
        // The box title already says what the list is.
        form->addRow(editor);
        return;
    }
    auto *label = new QLabel(copy->labelText());
    label->setToolTip(copy->descriptionText());
    label->setEnabled(!copy->isReadOnly());
    label->setBuddy(editor);
    if (qobject_cast<SettingsListSetting *>(copy.get())) {
        // Tabs need the whole width.
        form->addRow(label);
        form->addRow(editor);
        return;
    }
    form->addRow(label, editor);
}

QWidget *SettingsWidget::createEditor(const std::shared_ptr<BaseSetting> &copy, const QString &objectName)
{
    QWidget *editor = nullptr;
    if (auto boolSetting = std::dynamic_pointer_cast<BoolSetting>(copy)) {
        auto *box = new QCheckBox(boolSetting->labelText());
        box->setChecked(boolSetting->value());
        connect(box, &QCheckBox::toggled, this, [boolSetting](bool checked) { boolSetting->setValue(checked); });
        editor = box;
    } else if (auto intSetting = std::dynamic_pointer_cast<IntSetting>(copy)) {
        auto *spin = new QSpinBox;
        spin->setRange(intSetting->minimum(), intSetting->maximum());
        spin->setValue(intSetting->value());
        spin->setMaximumWidth(160);
        connect(spin, qOverload<int>(&QSpinBox::valueChanged), this,
                [intSetting](int value) { intSetting->setValue(value); });
        editor = spin;
    } else if (auto doubleSetting = std::dynamic_pointer_cast<DoubleSetting>(copy)) {
        auto *spin = new QDoubleSpinBox;
        spin->setDecimals(doubleSetting->precision());
        spin->setRange(doubleSetting->minimum(), doubleSetting->maximum());
        spin->setSingleStep(doubleSetting->singleStep());
        spin->setValue(doubleSetting->value());
        spin->setMaximumWidth(160);
        connect(spin, qOverload<double>(&QDoubleSpinBox::valueChanged), this,
                [doubleSetting](double value) { doubleSetting->setValue(value); });
        editor = spin;
    } else if (auto stringSetting = std::dynamic_pointer_cast<StringSetting>(copy)) {
        auto check = [this, stringSetting](QWidget *field, const QString &text) {
            const bool valid = stringSetting->setValue(text);
            setEditorValid(field, valid,
                           valid ? QString()
                                 : tr("\"%1\" is not a valid value for \"%2\".").arg(text, stringSetting->labelText()));
        };
        if (stringSetting->displayType() == StringSetting::DisplayType::MultiLine) {
            auto *text = new QPlainTextEdit(stringSetting->value());
            text->setObjectName(objectName);
            text->setMaximumHeight(90);
            connect(text, &QPlainTextEdit::textChanged, this, [check, text]() { check(text, text->toPlainText()); });
            editor = text;
        } else {
            auto *line = new QLineEdit(stringSetting->value());
            line->setObjectName(objectName);
            line->setPlaceholderText(stringSetting->displayHintValue(QStringLiteral("Placeholder")));
            if (stringSetting->displayType() == StringSetting::DisplayType::Password)
                line->setEchoMode(QLineEdit::Password);
            connect(line, &QLineEdit::textChanged, this, [check, line](const QString &text) { check(line, text); });
            editor = line;
            const auto type = stringSetting->displayType();
            if (type == StringSetting::DisplayType::DirectoryPath || type == StringSetting::DisplayType::FilePath) {
                auto *row = new QWidget;
                auto *rowLayout = new QHBoxLayout(row);
                rowLayout->setContentsMargins(0, 0, 0, 0);
                rowLayout->addWidget(line, 1);
                auto *browse = new QToolButton(row);
                browse->setObjectName(objectName + QStringLiteral("_browse"));
                browse->setText(QStringLiteral("…"));
                rowLayout->addWidget(browse);
                connect(browse, &QToolButton::clicked, this, [this, line, type, stringSetting]() {
                    const QString chosen = type == StringSetting::DisplayType::DirectoryPath
                        ? QFileDialog::getExistingDirectory(this, stringSetting->labelText(), line->text())
                        : QFileDialog::getOpenFileName(this, stringSetting->labelText(), line->text());
                    if (!chosen.isEmpty())
                        line->setText(chosen);
                });
                applyDisplayHint(line, *stringSetting);
                row->setObjectName(objectName + QStringLiteral("_row"));
                return row;
            }
        }
        applyDisplayHint(editor, *stringSetting);
        return editor;
    } else if (auto listSetting = std::dynamic_pointer_cast<StringListSetting>(copy)) {
        const auto choices = listSetting->possibleValues();
        if (choices.empty()) {
            // A free list: one value per line.
            auto *text = new QPlainTextEdit(listSetting->selectedValues().join(QLatin1Char('\n')));
            text->setMaximumHeight(90);
            connect(text, &QPlainTextEdit::textChanged, this, [listSetting, text]() {
                listSetting->setSelectedValues(text->toPlainText().split(QLatin1Char('\n'), Qt::SkipEmptyParts));
            });
            editor = text;
        } else if (listSetting->isSingleSelect()) {
            auto *combo = new QComboBox;
            for (const StringPair &choice : choices)
                combo->addItem(choice.displayText.isEmpty() ? choice.value : choice.displayText, choice.value);
            combo->setCurrentIndex(combo->findData(listSetting->selectedValue()));
            connect(combo, qOverload<int>(&QComboBox::currentIndexChanged), this, [listSetting, combo](int index) {
                if (index >= 0)
                    listSetting->setSelectedValue(combo->itemData(index).toString());
            });
            editor = combo;
        } else if (listSetting->useComboBox()) {
            auto *combo = new CheckableComboBox;
            for (const StringPair &choice : choices)
                combo->addCheckableItem(choice.displayText.isEmpty() ? choice.value : choice.displayText, choice.value,
                                        listSetting->isSelected(choice.value));
            auto summary = [listSetting]() {
                const QString text = listSetting->valueDisplayText();
                return text.isEmpty() ? tr("(none)") : text;
            };
            combo->setSummaryText(summary());
            connect(combo, &CheckableComboBox::sgItemCheckToggled, this,
                    [this, listSetting, combo, summary](int index, bool checked) {
                        if (listSetting->setSelectedValues(combo->checkedValues())) {
                            showHint(QString());
                        } else {
                            combo->setItemChecked(index, !checked);
                            if (listSetting->maximumSelectionCount() > 0)
                                showHint(listSetting->maximumSelectionMessage());
                        }
                        combo->setSummaryText(summary());
                    });
            editor = combo;
        } else {
            auto *list = new QListWidget;
            for (const StringPair &choice : choices) {
                auto *item = new QListWidgetItem(choice.displayText.isEmpty() ? choice.value : choice.displayText, list);
                item->setData(Qt::UserRole, choice.value);
                item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsUserCheckable);
                item->setCheckState(listSetting->isSelected(choice.value) ? Qt::Checked : Qt::Unchecked);
            }
            list->setMaximumHeight(qMin(160, 8 + list->sizeHintForRow(0) * list->count()));
            connect(list, &QListWidget::itemChanged, this, [this, listSetting, list](QListWidgetItem *item) {
                QStringList values;
                for (int row = 0; row < list->count(); ++row)
                    if (list->item(row)->checkState() == Qt::Checked)
                        values.append(list->item(row)->data(Qt::UserRole).toString());
                if (listSetting->setSelectedValues(values)) {
                    showHint(QString());
                } else {
                    const QSignalBlocker blocker(list);
                    item->setCheckState(item->checkState() == Qt::Checked ? Qt::Unchecked : Qt::Checked);
                    if (listSetting->maximumSelectionCount() > 0)
                        showHint(listSetting->maximumSelectionMessage());
                }
            });
            editor = list;
        }
    } else if (std::dynamic_pointer_cast<SettingsListSetting>(copy)) {
        editor = createListEditor(copy, objectName);
    }
    if (editor)
        editor->setObjectName(objectName);
    return editor;
}

QWidget *SettingsWidget::createListEditor(const std::shared_ptr<BaseSetting> &copy, const QString &objectName)
{
    const auto listSetting = std::static_pointer_cast<SettingsListSetting>(copy);
    auto buildForm = [this, &objectName](QWidget *parent, const std::shared_ptr<SettingsSection> &section) {
        auto *form = new QFormLayout(parent);
        form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
        for (const auto &setting : section->settings())
            if (isShown(*setting))
                addSettingRow(form, setting,
                              QStringLiteral("%1/%2/%3").arg(objectName, section->sectionName(), setting->key()));
    };
    if (listSetting->useTabWidget()) {
        auto *tabs = new QTabWidget;
        tabs->setUsesScrollButtons(true);
        for (const auto &section : listSetting->settingsList()) {
            auto *page = new QWidget(tabs);
            page->setObjectName(QStringLiteral("%1/%2").arg(objectName, section->sectionName()));
            buildForm(page, section);
            tabs->addTab(page, section->displayName());
        }
        return tabs;
    }
    auto *container = new QWidget;
    auto *layout = new QVBoxLayout(container);
    layout->setContentsMargins(0, 0, 0, 0);
    for (const auto &section : listSetting->settingsList()) {
        auto *box = new QGroupBox(section->displayName(), container);
        box->setObjectName(QStringLiteral("%1/%2").arg(objectName, section->sectionName()));
        buildForm(box, section);
        layout->addWidget(box);
    }
    return container;
}

bool SettingsWidget::isShown(const BaseSetting &setting) const
{
    return setting.isVisible() && (!setting.isExpertSetting() || (m_settings && m_settings->isExpertMode()));
}

void SettingsWidget::setEditorValid(QWidget *editor, bool valid, const QString &message)
{
    if (valid) {
        m_invalidEditors.remove(editor);
        m_invalidMessages.erase(editor);
        editor->setStyleSheet(QString());
    } else {
        m_invalidEditors.insert(editor);
        m_invalidMessages[editor] = message;
        editor->setStyleSheet(QString::fromLatin1(InvalidStyle));
    }
    updateState();
}

void SettingsWidget::showHint(const QString &message)
{
    m_infoHint = message;
    updateState();
}

void SettingsWidget::updateState()
{
    QStringList messages;
    for (const auto &entry : m_invalidMessages)
        messages.append(entry.second);
    if (!m_infoHint.isEmpty())
        messages.append(m_infoHint);
    m_hintLabel->setText(messages.join(QLatin1Char('\n')));
    m_hintLabel->setVisible(!messages.isEmpty());
    m_buttons->button(QDialogButtonBox::Ok)->setEnabled(m_invalidEditors.isEmpty());
}

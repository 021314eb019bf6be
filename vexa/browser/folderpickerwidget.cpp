#include "folderpickerwidget.h"

#include "direntrysettings.h"
#include "folderpickersettings.h"
#include "objectbrowserdialog.h"
#include "objectbrowserwidget.h"
#include "selectedpath.h"

#include <domain/domainmetatypes.h>
#include <domain/folder.h>
#include <domain/globaldirentry.h>

#include <QComboBox>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>

namespace vexa {

FolderPickerWidget::FolderPickerWidget(QWidget *parent)
    : QWidget(parent)
    , m_label(new QLabel(tr("Current Folder"), this))
    , m_comboBox(new QComboBox(this))
    , m_browseButton(new QToolButton(this))
{
    qRegisterMetaType<std::string>("std::string");
    registerDomainMetaTypes();
    m_label->setObjectName(QStringLiteral("folderPickerLabel"));
    m_comboBox->setObjectName(QStringLiteral("folderPickerComboBox"));
    m_comboBox->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    // Short enough for a narrow dock; a wider picker shows longer paths.
    m_comboBox->setMinimumContentsLength(8);
    m_browseButton->setObjectName(QStringLiteral("folderPickerBrowseButton"));
    m_browseButton->setText(QStringLiteral("…"));
    m_browseButton->setToolTip(tr("Pick another folder"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_label);
    layout->addWidget(m_comboBox, 1);
    layout->addWidget(m_browseButton);
    connect(m_comboBox, SIGNAL(currentIndexChanged(int)), this, SLOT(currentFolderChanged(int)));
    connect(m_browseButton, &QToolButton::clicked, this, [this] { launchObjectBrowser(true); });
}

FolderPickerWidget::~FolderPickerWidget() = default;

void FolderPickerWidget::setSettings(std::shared_ptr<FolderPickerSettings> settings)
{
    if (m_settings)
        disconnect(m_settings.get(), nullptr, this, nullptr);
    m_settings = std::move(settings);
    if (m_settings)
        connect(m_settings.get(), &FolderPickerSettings::sgDirEntriesChanged, this, &FolderPickerWidget::resetComboBox);
    initComboBox(true);
}

std::shared_ptr<GlobalDirEntry> FolderPickerWidget::currentFolder() const
{
    if (!m_settings)
        return nullptr;
    const auto entries = m_settings->dirEntries();
    const int index = m_comboBox->currentIndex();
    return index >= 0 && index < int(entries.size()) ? entries[size_t(index)] : nullptr;
}

void FolderPickerWidget::initComboBox(bool selectLast)
{
    m_filling = true;
    m_comboBox->clear();
    if (m_settings) {
        for (const auto &section : m_settings->dirEntrySettings()) {
            const auto entry = section->globalDirEntry();
            m_comboBox->addItem(section->displayText());
            const QString store = entry ? QFileInfo(entry->dispatcherID()).fileName() : QString();
            m_comboBox->setItemData(m_comboBox->count() - 1, entry ? entry->dispatcherID() : QString(), Qt::ToolTipRole);
            Q_UNUSED(store)
        }
        if (selectLast)
            m_comboBox->setCurrentIndex(m_settings->lastSelectedIndex());
    }
    m_filling = false;
}

void FolderPickerWidget::resetComboBox()
{
    initComboBox(true);
}

void FolderPickerWidget::currentFolderChanged(int index)
{
    if (m_filling || !m_settings || index < 0)
        return;
    if (index != m_settings->lastSelectedIndex())
        m_settings->chooseIndex(index);
    Q_EMIT sgFolderChosen(m_settings->lastSelectedDirEntry());
}

void FolderPickerWidget::rememberFolder(const GlobalDirEntry &folder)
{
    if (!m_settings)
        return;
    m_settings->chooseDirEntry(folder);
    initComboBox(true);
}

void FolderPickerWidget::launchObjectBrowser(bool modal)
{
    if (!m_corvidModel)
        return;
    const auto current = currentFolder();
    std::shared_ptr<SelectedPath> start;
    if (current) {
        QStringList path = current->path();
        if (!current->entryObjectId().isEmpty())
            path << current->entryObjectId();
        start = std::make_shared<SelectedPath>(current->dispatcherID(), path);
    }
    ObjectBrowserDialog dialog(m_corvidModel, {Folder::typeId().toStdString()}, tr("Pick folder"), QStringList(), start,
                               this);
    dialog.setModal(modal);
    connect(dialog.browser(), SIGNAL(sgObjectDeleted(std::string)), this, SLOT(onObjectDeleted(std::string)));
    if (dialog.exec() != QDialog::Accepted)
        return;
    if (const auto folder = dialog.selectedEntry()) {
        rememberFolder(*folder);
        Q_EMIT sgFolderChosen(m_settings ? m_settings->lastSelectedDirEntry() : folder);
    }
}

void FolderPickerWidget::onObjectDeleted(std::string objectId)
{
    if (m_settings && m_settings->forgetObject(QString::fromStdString(objectId)))
        initComboBox(true);
}

} // namespace vexa

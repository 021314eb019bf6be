#include "objectbrowserdialog.h"

#include "corvidobjectsclientmodel.h"
#include "objectbrowserwidget.h"
#include "selectedpath.h"

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <domain/folder.h>
#include <domain/globaldirentry.h>

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFileInfo>
#include <QPushButton>
#include <QVBoxLayout>

namespace vexa {

ObjectBrowserDialog::ObjectBrowserDialog(CorvidModel *corvidModel, const std::vector<std::string> &types,
                                         const QString &title, const QStringList &dispatcherList,
                                         std::shared_ptr<SelectedPath> selectedPath, QWidget *parent)
    : QDialog(parent)
    , m_corvidModel(corvidModel)
    , m_types(types)
{
    setWindowTitle(title);
    resize(720, 460);
    m_storeBox = new QComboBox(this);
    m_storeBox->setObjectName(QStringLiteral("storeBox"));
    QStringList stores = dispatcherList;
    const QString defaultStore = corvidModel ? QString::fromStdString(corvidModel->defaultDispatcherId()) : QString();
    if (stores.isEmpty() && !defaultStore.isEmpty())
        stores << defaultStore;
    for (const QString &store : stores)
        m_storeBox->addItem(QFileInfo(store).fileName().isEmpty() ? store : QFileInfo(store).fileName(), store);
    m_storeBox->setVisible(stores.size() > 1);
    m_buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    auto *layout = new QVBoxLayout(this);
    layout->addWidget(m_storeBox);
    layout->addStretch();
    layout->addWidget(m_buttons);
    connect(m_buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(m_buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(m_storeBox, QOverload<int>::of(&QComboBox::activated), this,
            [this] { showStore(m_storeBox->currentData().toString().toStdString(), nullptr); });

    std::string start = selectedPath && !selectedPath->dispatcherId().isEmpty()
        ? selectedPath->dispatcherId().toStdString()
        : (stores.isEmpty() ? std::string() : stores.front().toStdString());
    const int at = m_storeBox->findData(QString::fromStdString(start));
    if (at >= 0)
        m_storeBox->setCurrentIndex(at);
    else if (!stores.isEmpty() && selectedPath && !selectedPath->dispatcherId().isEmpty()) {
        // A remembered store that is not offered any more: start at the first offered one.
        start = stores.front().toStdString();
        selectedPath.reset();
    }
    showStore(start, selectedPath);
}

ObjectBrowserDialog::~ObjectBrowserDialog() = default;

bool ObjectBrowserDialog::picksFolders() const
{
    return m_types.size() == 1 && m_types.front() == Folder::typeId().toStdString();
}

void ObjectBrowserDialog::showStore(const std::string &dispatcherId, const std::shared_ptr<SelectedPath> &path)
{
    auto *layout = static_cast<QVBoxLayout *>(this->layout());
    if (m_browser) {
        layout->removeWidget(m_browser);
        m_browser->deleteLater();
    }
    m_browser = new ObjectBrowserWidget(this);
    m_browser->setObjectName(QStringLiteral("objectBrowserWidget"));
    m_browser->initialize(m_corvidModel, dispatcherId, m_types);
    if (!m_types.empty() && !picksFolders()) {
        const int index = m_browser->typeFilterBox()->findData(QString::fromStdString(m_types.front()));
        if (index >= 0)
            m_browser->typeFilterBox()->setCurrentIndex(index);
    }
    delete layout->takeAt(1); // the placeholder stretch or the previous browser's item
    layout->insertWidget(1, m_browser, 1);
    connect(m_browser, &ObjectBrowserWidget::sgSelectionChanged, this, &ObjectBrowserDialog::updateOkButton);
    connect(m_browser, &ObjectBrowserWidget::sgCurrentFolderChanged, this, &ObjectBrowserDialog::updateOkButton);
    connect(m_browser, &ObjectBrowserWidget::sgObjectActivated, this, [this] {
        if (!picksFolders())
            accept();
    });
    if (path && !path->isRoot())
        m_browser->setCurrentFolderPath(*path);
    updateOkButton();
}

std::vector<std::shared_ptr<GlobalDirEntry>> ObjectBrowserDialog::selectedEntries() const
{
    std::vector<std::shared_ptr<GlobalDirEntry>> chosen;
    if (!m_browser)
        return chosen;
    for (const auto &entry : m_browser->selectedEntries()) {
        const bool folder = entry->entryObjectType() == Folder::typeId();
        if (folder == picksFolders())
            chosen.push_back(entry);
    }
    if (chosen.empty() && picksFolders()) {
        auto folder = m_browser->model()->globalDirEntry(m_browser->currentFolder());
        if (!folder) {
            // The top of the store.
            folder = std::make_shared<GlobalDirEntry>();
            folder->setEntryObjectType(Folder::typeId());
            folder->setDispatcherID(QString::fromStdString(m_browser->dispatcherId()));
            folder->setStandardizedDispatcherID(folder->dispatcherID());
        }
        chosen.push_back(folder);
    }
    return chosen;
}

std::shared_ptr<GlobalDirEntry> ObjectBrowserDialog::selectedEntry() const
{
    const auto chosen = selectedEntries();
    return chosen.empty() ? nullptr : chosen.front();
}

void ObjectBrowserDialog::updateOkButton()
{
    m_buttons->button(QDialogButtonBox::Ok)->setEnabled(!selectedEntries().empty());
}

} // namespace vexa

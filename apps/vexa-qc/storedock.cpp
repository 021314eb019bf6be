#include "storedock.h"

#include <vexa/browser/corvidobjectsclientmodel.h>
#include <vexa/browser/direntrybrowserinterface.h>
#include <vexa/browser/direntrybrowserwidget.h>
#include <vexa/browser/direntrypersistancemanager.h>
#include <vexa/browser/direntrytreemodel.h>
#include <vexa/browser/folderpickersettings.h>
#include <vexa/browser/objectbrowserwidget.h>
#include <vexa/browser/selectedpath.h>
#include <vexa/browser/selectedpathsettings.h>

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <domain/globaldirentry.h>
#include <domain/qcjob.h>
#include <domain/standard.h>
#include <domain/toleranceset.h>
#include <settings/settingsmanager.h>

#include <QCloseEvent>
#include <QFileInfo>
#include <QSplitter>
#include <QToolButton>
#include <QVBoxLayout>

#include <numeric>

namespace vexa {

StoreDock::StoreDock(CorvidModel *corvidModel, QWidget *parent)
    : QDockWidget(tr("Store"), parent)
    , m_corvidModel(corvidModel)
    , m_splitter(new QSplitter(Qt::Vertical, this))
    , m_editedModel(new DirEntryTreeModel(this))
    , m_persistance(std::make_shared<DirEntryPersistanceManager>(*corvidModel))
    , m_interface(std::make_unique<DirEntryBrowserInterface>(tr("Tolerance set"), ToleranceSet::typeId().toStdString()))
    , m_edited(new DirEntryBrowserWidget(this))
    , m_favourites(std::make_shared<FolderPickerSettings>())
    , m_selectedPath(std::make_shared<SelectedPathSettings>())
{
    setObjectName(QStringLiteral("storeDock"));
    SettingsManager::instance().registerClientSettings(m_favourites);
    SettingsManager::instance().registerClientSettings(m_selectedPath);
    m_editedModel->setPersistanceInferface(m_persistance);
    m_editedModel->initialize();
    m_edited->setObjectName(QStringLiteral("editedObjects"));
    m_edited->setCorvidModel(corvidModel);
    m_edited->setGeneralSettings(SettingsManager::instance().getGeneralSettings());
    m_edited->setSelectedPathSettings(m_selectedPath);
    m_edited->initialize(m_editedModel, m_interface.get());
    m_splitter->addWidget(m_edited);
    m_splitter->setChildrenCollapsible(false);
    setWidget(m_splitter);
    if (parent)
        parent->installEventFilter(this);
}

StoreDock::~StoreDock()
{
    SettingsManager::instance().unregisterClientSettings(m_favourites->ownerName());
    SettingsManager::instance().unregisterClientSettings(m_selectedPath->ownerName());
}

ObjectBrowserWidget *StoreDock::browser(const std::string &dispatcherId) const
{
    const std::string wanted = CommandDispatcher::standardizedDispatcherId(dispatcherId);
    for (ObjectBrowserWidget *browser : m_browsers) {
        if (CommandDispatcher::standardizedDispatcherId(browser->dispatcherId()) == wanted)
            return browser;
    }
    return nullptr;
}

ObjectBrowserWidget *StoreDock::addStore(const std::string &dispatcherId, bool closable)
{
    if (ObjectBrowserWidget *known = browser(dispatcherId))
        return known;
    auto *browser = new ObjectBrowserWidget(this);
    browser->setObjectName(QStringLiteral("objectBrowser%1").arg(m_browsers.size()));
    browser->initialize(m_corvidModel, dispatcherId);
    browser->setFolderPickerSettings(m_favourites);
    browser->setCaption(QFileInfo(QString::fromStdString(dispatcherId)).fileName());
    // A dock is narrow: the folders above their contents leaves the comparison page its width.
    browser->setOrientation(Qt::Vertical);
    browser->setToolTip(QString::fromStdString(dispatcherId));
    if (closable) {
        auto *close = new QToolButton(browser);
        close->setObjectName(QStringLiteral("closeStoreButton"));
        close->setText(QStringLiteral("×"));
        close->setAutoRaise(true);
        close->setToolTip(tr("Close this store"));
        close->move(browser->width() - 24, 0);
        close->raise();
        connect(close, &QToolButton::clicked, this, [this, browser] { removeStore(browser); });
        browser->installEventFilter(this);
    }
    connect(browser, &ObjectBrowserWidget::sgObjectActivated, this, &StoreDock::sgObjectActivated);
    connect(browser, &ObjectBrowserWidget::sgCurrentFolderChanged, this, [this](std::shared_ptr<SelectedPath> path) {
        if (path)
            m_selectedPath->setSelectedPath(*path);
    });
    m_splitter->insertWidget(m_browsers.size(), browser);
    m_browsers << browser;
    const QList<int> sizes = m_splitter->sizes();
    if (sizes.size() > 1) {
        // The browsers share the height; the edited objects keep a fifth.
        const int total = std::accumulate(sizes.begin(), sizes.end(), 0);
        QList<int> shares;
        for (int i = 0; i < m_browsers.size(); ++i)
            shares << total * 4 / 5 / m_browsers.size();
        shares << total / 5;
        m_splitter->setSizes(shares);
    }
    return browser;
}

void StoreDock::removeStore(ObjectBrowserWidget *browser)
{
    if (!m_browsers.removeOne(browser))
        return;
    browser->hide();
    browser->deleteLater();
}

void StoreDock::openEntry(const std::shared_ptr<GlobalDirEntry> &entry)
{
    if (!entry)
        return;
    const QString type = entry->entryObjectType();
    if (type == QCJob::typeId()) {
        Q_EMIT sgOpenJob(entry);
        return;
    }
    if (type == ToleranceSet::typeId() || type == Standard::typeId()) {
        m_edited->openDirEntry(entry);
        return;
    }
    m_edited->showMessage(tr("%1 objects cannot be opened here.").arg(CorvidObjectsClientModel::typeDisplayName(type)));
}

bool StoreDock::closeEditedObjects()
{
    return m_edited->closeAll();
}

bool StoreDock::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parent() && event->type() == QEvent::Close) {
        // Modified objects are saved (or discarded) before the window goes.
        if (!closeEditedObjects()) {
            event->ignore();
            return true;
        }
    }
    if (event->type() == QEvent::Resize) {
        if (auto *browser = qobject_cast<ObjectBrowserWidget *>(watched)) {
            if (auto *close = browser->findChild<QToolButton *>(QStringLiteral("closeStoreButton"), Qt::FindDirectChildrenOnly))
                close->move(browser->width() - close->width() - 2, 0);
        }
    }
    return QDockWidget::eventFilter(watched, event);
}

} // namespace vexa

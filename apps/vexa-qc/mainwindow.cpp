#include "mainwindow.h"

#include "comparisonpage.h"
#include "demojob.h"
#include "recipepage.h"
#include "storedock.h"

#include <vexa/export/widgetprinter.h>
#include <vexa/formula/recipewidgetsettings.h>
#include <vexa/models/jobdetailviewsettings.h>
#include <vexa/tables/multicolorvaluewidget.h>
#include <vexa/browser/direntrybrowserwidget.h>

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <domain/direntry.h>
#include <domain/globaldirentry.h>
#include <settings/generalsettings.h>
#include <settings/settingsmanager.h>
#include <settings/settingswidget.h>
#include <utilities/logger.h>

#include <QApplication>
#include <QComboBox>
#include <QFileDialog>
#include <QGuiApplication>
#include <QScreen>
#include <QTimer>
#include <QFileInfo>
#include <QLabel>
#include <QMenuBar>
#include <QMessageBox>
#include <QProgressBar>
#include <QStatusBar>
#include <QTabWidget>
#include <QToolBar>

#include <algorithm>

namespace vexa {

MainWindow::MainWindow(std::shared_ptr<GeneralSettings> generalSettings,
                       std::shared_ptr<JobDetailViewSettings> viewSettings,
                       std::shared_ptr<RecipeWidgetSettings> recipeSettings, QWidget *parent)
    : QMainWindow(parent)
    , m_generalSettings(std::move(generalSettings))
    , m_viewSettings(std::move(viewSettings))
    , m_session(new StoreSession(this))
    , m_pages(new QTabWidget(this))
    , m_page(new ComparisonPage(m_generalSettings, m_viewSettings, m_pages))
    , m_recipePage(new RecipePage(recipeSettings ? std::move(recipeSettings) : std::make_shared<RecipeWidgetSettings>(),
                                  m_pages))
    , m_jobBox(new QComboBox(this))
    , m_statusLabel(new QLabel(this))
    , m_progress(new QProgressBar(this))
    , m_storeDock(new StoreDock(m_session->corvidModel(), this))
{
    setWindowTitle(tr("Vexa QC — colour comparison"));
    m_pages->setObjectName(QStringLiteral("pages"));
    m_pages->setDocumentMode(true);
    m_pages->addTab(m_page, tr("Comparison"));
    m_pages->addTab(m_recipePage, tr("Recipe"));
    setCentralWidget(m_pages);

    auto *toolbar = addToolBar(tr("Job"));
    toolbar->setObjectName(QStringLiteral("jobToolbar"));
    toolbar->setMovable(false);
    toolbar->addWidget(new QLabel(tr("  QC job: "), this));
    m_jobBox->setObjectName(QStringLiteral("jobBox"));
    m_jobBox->setMinimumWidth(260);
    toolbar->addWidget(m_jobBox);

    m_progress->setMaximumWidth(160);
    m_progress->setRange(0, 0);
    m_progress->hide();
    statusBar()->addWidget(m_statusLabel, 1);
    statusBar()->addPermanentWidget(m_progress);

    buildStoreDock();
    buildMenus();

    connect(m_session, &StoreSession::sgOpened, m_session, &StoreSession::listJobs);
    connect(m_session, &StoreSession::sgOpened, m_session, &StoreSession::loadFormulas);
    connect(m_session, &StoreSession::sgFormulasLoaded, this, &MainWindow::onFormulasLoaded);
    connect(m_recipePage, &RecipePage::sgFormulasShown, this, &MainWindow::sgFormulasShown);
    connect(m_session, &StoreSession::sgJobsListed, this, &MainWindow::onJobsListed);
    connect(m_session, &StoreSession::sgJobLoaded, this, &MainWindow::onJobLoaded);
    connect(m_session, &StoreSession::sgError, this, &MainWindow::showError);
    connect(m_session, &StoreSession::sgBusy, this, &MainWindow::setBusy);
    connect(m_jobBox, QOverload<int>::of(&QComboBox::activated), this, &MainWindow::onJobChosen);
    // Most of the screen: the page shows a table, a flop table and two plots side by side.
    const QScreen *screen = QGuiApplication::primaryScreen();
    const QSize available = screen ? screen->availableGeometry().size() : QSize(1400, 900);
    resize(std::max(1400, available.width() * 9 / 10), std::max(900, available.height() * 9 / 10));
}

MainWindow::~MainWindow() = default;

void MainWindow::buildMenus()
{
    QMenu *file = menuBar()->addMenu(tr("&File"));
    file->addAction(tr("Open store…"), this, &MainWindow::chooseStore);
    file->addSeparator();
    file->addAction(tr("Export table to CSV…"), this, &MainWindow::exportCsv);
    file->addAction(tr("Export table to Excel…"), this, &MainWindow::exportExcel);
    file->addSeparator();
    file->addAction(tr("Print table…"), this, &MainWindow::printTable);
    file->addAction(tr("Print page to PDF…"), this, &MainWindow::printPlotsToPdf);
    file->addSeparator();
    file->addAction(tr("Quit"), qApp, &QApplication::quit, QKeySequence::Quit);

    QMenu *objects = menuBar()->addMenu(tr("&Objects"));
    m_storeDock->editedObjects()->createCustomMenus(objects, tr("Object"), tr("Objects"), true);

    QMenu *view = menuBar()->addMenu(tr("&View"));
    view->addAction(tr("View settings…"), this, &MainWindow::openSettings);
    view->addAction(m_storeDock->toggleViewAction());
}

void MainWindow::openStore(const QString &storePath, const QString &jobName)
{
    m_wantedJob = jobName;
    m_statusLabel->setText(tr("Store: %1").arg(storePath));
    m_session->open(storePath);
}

void MainWindow::onJobsListed(const std::vector<std::shared_ptr<DirEntry>> &entries)
{
    m_jobs = entries;
    m_jobBox->clear();
    int wanted = entries.empty() ? -1 : 0;
    for (int i = 0; i < int(entries.size()); ++i) {
        m_jobBox->addItem(entries[i]->header().name());
        if (!m_wantedJob.isEmpty() && entries[i]->header().name() == m_wantedJob)
            wanted = i;
    }
    if (wanted < 0) {
        showError(tr("The store holds no QC job."));
        return;
    }
    if (!m_wantedJob.isEmpty() && entries[wanted]->header().name() != m_wantedJob)
        showError(tr("There is no QC job named \"%1\".").arg(m_wantedJob));
    m_jobBox->setCurrentIndex(wanted);
    onJobChosen(wanted);
}

void MainWindow::onJobChosen(int index)
{
    if (index < 0 || index >= int(m_jobs.size()))
        return;
    m_session->loadJob(m_jobs[size_t(index)]);
}

void MainWindow::onJobLoaded(const LoadedJob &loaded)
{
    LoadedJob job = loaded;
    if (m_trialCount > 0)
        enlargeJob(job, m_trialCount);
    m_page->showJob(job);
    m_statusLabel->setText(tr("%1 — %2 objects from %3")
                               .arg(m_jobBox->currentText())
                               .arg(job.objects.size())
                               .arg(m_session->storePath()));
    Q_EMIT sgJobShown();
}

void MainWindow::onFormulasLoaded(const std::vector<std::shared_ptr<BaseObject>> &objects)
{
    m_recipePage->showFormulas(objects);
}

bool MainWindow::showPage(const QString &name)
{
    if (name == QLatin1String("recipe")) {
        m_pages->setCurrentWidget(m_recipePage);
        return true;
    }
    // "comparison" shows its colour views; the names of its view tabs show that tab.
    if (!m_page->showViews(name == QLatin1String("comparison") ? QStringLiteral("colour") : name))
        return false;
    m_pages->setCurrentWidget(m_page);
    return true;
}

void MainWindow::showError(const QString &message)
{
    Logger::instance().error(LogCategory::General, QStringLiteral("MainWindow: ") + message);
    if (m_messageSink)
        m_messageSink(tr("Vexa QC"), message);
    else
        QMessageBox::warning(this, tr("Vexa QC"), message);
}

void MainWindow::setBusy(const QString &task, bool busy)
{
    m_progress->setVisible(busy);
    if (busy)
        m_statusLabel->setText(task + QStringLiteral("…"));
}

// The view settings open in a dialog generated from the settings group; OK writes them
// back, persists them and every view re-reads them.
void MainWindow::openSettings()
{
    SettingsWidget dialog(m_viewSettings, this);
    dialog.setWindowTitle(tr("View settings"));
    if (dialog.exec() != QDialog::Accepted)
        return;
    SettingsManager::instance().saveClientSettings();
    m_page->settingsChanged();
}

void MainWindow::exportCsv()
{
    m_page->tableWidget()->onExportToCSV();
}

void MainWindow::exportExcel()
{
    setBusy(tr("Exporting"), true);
    m_page->tableWidget()->onExportToExcel();
    setBusy(tr("Exporting"), false);
    m_statusLabel->setText(tr("Ready"));
}

// The whole table as the view shows it (sorted, shown columns), not only the rows in view.
void MainWindow::printTable()
{
    m_page->tableWidget()->printTable();
}

void MainWindow::printPlotsToPdf()
{
    const QString file = QFileDialog::getSaveFileName(this, tr("Print page to PDF"), QString(),
                                                      tr("PDF files (*.pdf)"));
    if (file.isEmpty())
        return;
    if (!WidgetPrinter::printWidgetToPdf(m_page, file))
        showError(tr("%1 could not be written.").arg(file));
}

// The workstation's own store is browsed from the start; File ▸ Open store… adds another
// one beside it (objects dragged between the two are copied).
void MainWindow::chooseStore()
{
    const QString file = QFileDialog::getOpenFileName(this, tr("Open object store"), QString(),
                                                      tr("Object stores (*.vexastore);;All files (*)"));
    if (file.isEmpty())
        return;
    CommandDispatcher *dispatcher = m_session->corvidModel()->createCommandDispatcher(
        ServerId(QFileInfo(file).absoluteFilePath().toStdString(), 0));
    m_storeDock->addStore(dispatcher->dispatcherId(), true);
    m_storeDock->show();
}

void MainWindow::buildStoreDock()
{
    addDockWidget(Qt::LeftDockWidgetArea, m_storeDock);
    // Narrow by default: the comparison page is the daily work. Sized again once laid out,
    // since a dock's size before the first layout does not hold.
    resizeDocks({m_storeDock}, {270}, Qt::Horizontal);
    QTimer::singleShot(0, this, [this] { resizeDocks({m_storeDock}, {270}, Qt::Horizontal); });
    connect(m_storeDock, &StoreDock::sgObjectActivated, m_storeDock, &StoreDock::openEntry);
    connect(m_storeDock, &StoreDock::sgOpenJob, this, [this](std::shared_ptr<GlobalDirEntry> entry) {
        const int known = m_jobBox->findText(entry->header().name());
        if (known >= 0)
            m_jobBox->setCurrentIndex(known);
        m_session->loadJob(entry);
    });
    connect(m_storeDock->editedObjects(), &DirEntryBrowserWidget::sgErrorOccurred, this,
            [this](const QString &message) { m_statusLabel->setText(message); });
    connect(m_session, &StoreSession::sgOpened, this,
            [this] { m_storeDock->addStore(m_session->dispatcher()->dispatcherId(), false); });
}

} // namespace vexa

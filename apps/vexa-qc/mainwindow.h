#pragma once

#include "storesession.h"

#include <QMainWindow>

#include <functional>
#include <memory>

class QComboBox;
class QLabel;
class QProgressBar;
class QTabWidget;
class GeneralSettings;

namespace vexa {

class BaseObject;
class ComparisonPage;
class StoreDock;
class JobDetailViewSettings;
class RecipePage;
class RecipeWidgetSettings;

// The comparison workstation: a job chooser, the comparison page and the "Recipe" page
// (the store's formulas) as tabs, menus for the view settings, export and printing, and a
// status bar that shows long work.
class MainWindow : public QMainWindow
{
    Q_OBJECT
public:
    // Without recipe settings the recipe page keeps its settings for this session only.
    MainWindow(std::shared_ptr<GeneralSettings> generalSettings,
               std::shared_ptr<JobDetailViewSettings> viewSettings,
               std::shared_ptr<RecipeWidgetSettings> recipeSettings = nullptr, QWidget *parent = nullptr);
    ~MainWindow() override;

    // Opens the store and, once it is listed, the job of that name (or the first one).
    void openStore(const QString &storePath, const QString &jobName = QString());
    ComparisonPage *page() const { return m_page; }
    RecipePage *recipePage() const { return m_recipePage; }
    QTabWidget *pages() const { return m_pages; }
    // Shows the page of that name: "comparison" (its colour views), "spectra" (its spectral
    // views) or "recipe"; false for another name.
    bool showPage(const QString &name);
    StoreSession *session() const { return m_session; }
    QComboBox *jobBox() const { return m_jobBox; }
    StoreDock *storeDock() const { return m_storeDock; }

    // Message boxes go through here so that headless runs can log them instead.
    // Shows every job grown to this many trials (0: as stored); see enlargeJob().
    void setTrialCount(int trials) { m_trialCount = trials; }

    using MessageSink = std::function<void(const QString &title, const QString &text)>;
    void setMessageSink(MessageSink sink) { m_messageSink = std::move(sink); }

Q_SIGNALS:
    // A job is shown and its views are filled.
    void sgJobShown();
    // The recipe page lists the store's formulas.
    void sgFormulasShown();

private:
    void buildMenus();
    void onJobsListed(const std::vector<std::shared_ptr<DirEntry>> &entries);
    void onJobChosen(int index);
    void onJobLoaded(const LoadedJob &job);
    void onFormulasLoaded(const std::vector<std::shared_ptr<BaseObject>> &objects);
    void showError(const QString &message);
    void setBusy(const QString &task, bool busy);
    void openSettings();
    void exportCsv();
    void exportExcel();
    void printTable();
    void printPlotsToPdf();
    void chooseStore();
    void buildStoreDock();

    std::shared_ptr<GeneralSettings> m_generalSettings;
    std::shared_ptr<JobDetailViewSettings> m_viewSettings;
    StoreSession *m_session;        // Child.
    QTabWidget *m_pages;            // Child.
    ComparisonPage *m_page;         // Child of the tabs.
    RecipePage *m_recipePage;       // Child of the tabs.
    QComboBox *m_jobBox;            // Child.
    QLabel *m_statusLabel;          // Child.
    QProgressBar *m_progress;       // Child.
    StoreDock *m_storeDock;         // Child.
    std::vector<std::shared_ptr<DirEntry>> m_jobs;
    QString m_wantedJob;
    MessageSink m_messageSink;
    int m_trialCount = 0;
};

} // namespace vexa

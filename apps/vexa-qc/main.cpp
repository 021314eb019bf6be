// vexa-qc: the colour-QC comparison workstation over an object store.
#include "batchjudge.h"
#include "comparisonpage.h"
#include "mainwindow.h"
#include "storesession.h"

#include <vexa/formula/recipewidgetsettings.h>
#include <vexa/models/jobdetailviewsettings.h>

#include <domain/domainmetatypes.h>
#include <settings/generalsettings.h>
#include <settings/settingsmanager.h>
#include <tolerances/tolerancefactory.h>
#include <utilities/applicationinfo.h>
#include <utilities/logger.h>

#include <QApplication>
#include <QCommandLineParser>
#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>
#include <QPointer>
#include <QScreen>
#include <QTextStream>
#include <QTimer>

#include <cstdio>
#include <memory>

using namespace vexa;

namespace {

// Reports the time from start-up to the first painted page with a job on it.
class FirstPaintWatcher : public QObject
{
public:
    FirstPaintWatcher(QElapsedTimer &clock, QObject *parent)
        : QObject(parent)
        , m_clock(clock)
    {
    }
    bool armed = false;
    qint64 elapsed = -1;

protected:
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (armed && elapsed < 0 && event->type() == QEvent::Paint) {
            elapsed = m_clock.elapsed();
            Logger::instance().debug(LogCategory::General,
                                     QStringLiteral("vexa-qc: first page painted %1 ms after start").arg(elapsed));
            std::fprintf(stderr, "vexa-qc: first page painted %lld ms after start\n", static_cast<long long>(elapsed));
        }
        return QObject::eventFilter(watched, event);
    }

private:
    QElapsedTimer &m_clock;
};

} // namespace

int main(int argc, char **argv)
{
    QElapsedTimer clock;
    clock.start();
    QApplication app(argc, argv);
    QApplication::setApplicationName(QStringLiteral("vexa"));
    QApplication::setOrganizationName(QStringLiteral("vexa"));
    QApplication::setApplicationVersion(ApplicationInfo::instance().version());
    registerDomainMetaTypes();

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Colour-QC comparison workstation"));
    parser.addHelpOption();
    parser.addVersionOption();
    QCommandLineOption storeOption(QStringLiteral("store"),
                                   QStringLiteral("The object store file (default: the sample store in the user's data folder, created on first use)."),
                                   QStringLiteral("FILE"));
    QCommandLineOption jobOption(QStringLiteral("job"), QStringLiteral("The QC job to open first."), QStringLiteral("NAME"));
    QCommandLineOption screenshotOption(QStringLiteral("screenshot"),
                                        QStringLiteral("Render the window with the job to FILE (PNG) and exit."),
                                        QStringLiteral("FILE"));
    QCommandLineOption pageOption(QStringLiteral("page"),
                                  QStringLiteral("The page to show: comparison (default; its colour views), "
                                                 "spectra (the comparison's spectral views) or recipe."),
                                  QStringLiteral("PAGE"), QStringLiteral("comparison"));
    QCommandLineOption judgeOption(QStringLiteral("judge"),
                                   QStringLiteral("Batch mode: judge every trial of the job and exit (0 no trial fails, 1 some fail, 2 error)."),
                                   QStringLiteral("JOB"));
    QCommandLineOption xlsxOption(QStringLiteral("xlsx"), QStringLiteral("Batch mode: the workbook to write."),
                                  QStringLiteral("FILE"));
    QCommandLineOption conditionOption(QStringLiteral("condition"),
                                       QStringLiteral("Batch mode: the colorimetric condition (default D65/10)."),
                                       QStringLiteral("CONDITION"), QStringLiteral("D65/10"));
    QCommandLineOption trialsOption(QStringLiteral("trials"),
                                    QStringLiteral("Show the job grown to N trials (its own, repeated with small "
                                                   "changes; in memory only), for demonstrations and measurements."),
                                    QStringLiteral("N"));
    parser.addOptions({storeOption, jobOption, pageOption, screenshotOption, judgeOption, xlsxOption, conditionOption,
                       trialsOption});
    parser.process(app);

    const QString storePath = parser.isSet(storeOption) ? parser.value(storeOption) : StoreSession::defaultStorePath();
    QTextStream out(stdout);
    QTextStream err(stderr);

    if (parser.isSet(judgeOption)) {
        if (!parser.isSet(xlsxOption)) {
            err << "--judge needs --xlsx FILE\n";
            return 2;
        }
        return runBatchJudge(storePath, parser.value(judgeOption), parser.value(conditionOption),
                             parser.value(xlsxOption), out, err);
    }

    ToleranceFactory::toleranceFactory();
    auto viewSettings = std::make_shared<JobDetailViewSettings>();
    SettingsManager::instance().registerClientSettings(viewSettings);
    auto recipeSettings = std::make_shared<RecipeWidgetSettings>();
    SettingsManager::instance().registerClientSettings(recipeSettings);
    auto generalSettings = SettingsManager::instance().getGeneralSettings();

    MainWindow window(generalSettings, viewSettings, recipeSettings);
    window.setTrialCount(parser.value(trialsOption).toInt());
    if (!window.showPage(parser.value(pageOption))) {
        err << "--page must be comparison, spectra or recipe\n";
        return 2;
    }
    auto *watcher = new FirstPaintWatcher(clock, &app);
    window.page()->installEventFilter(watcher);
    QObject::connect(&window, &MainWindow::sgJobShown, watcher, [watcher] { watcher->armed = true; });

    const bool screenshot = parser.isSet(screenshotOption);
    int exitCode = 0;
    if (screenshot) {
        const QString file = QFileInfo(parser.value(screenshotOption)).absoluteFilePath();
        window.setMessageSink([&exitCode](const QString &, const QString &text) {
            std::fprintf(stderr, "vexa-qc: %s\n", qPrintable(text));
            exitCode = 2;
        });
        // A full-HD desktop, the size a QC workstation's page is laid out for.
        window.resize(1920, 1080);
        // The page is ready when its data is shown: the job, or the formulas.
        auto done = std::make_shared<bool>(false);
        const auto grab = [&window, file, done] {
            if (*done)
                return;
            *done = true;
            // Give the plots' worker threads time to hand back their tolerance regions.
            QTimer::singleShot(2500, &window, [&window, file] {
                const QImage image = window.grab().toImage();
                const bool saved = !image.isNull() && image.save(file);
                std::fprintf(stderr, saved ? "vexa-qc: screenshot written to %s\n" : "vexa-qc: cannot write %s\n",
                             qPrintable(file));
                QApplication::exit(saved ? 0 : 2);
            });
        };
        if (parser.value(pageOption) == QLatin1String("recipe"))
            QObject::connect(&window, &MainWindow::sgFormulasShown, &window, grab);
        else
            QObject::connect(&window, &MainWindow::sgJobShown, &window, grab);
        // A store that never answers must not keep a headless run alive.
        QTimer::singleShot(90000, &app, [] {
            std::fprintf(stderr, "vexa-qc: no job was shown within 90 s\n");
            QApplication::exit(2);
        });
    }
    window.show();
    window.openStore(storePath, parser.value(jobOption));
    const int code = app.exec();
    SettingsManager::instance().saveClientSettings();
    return exitCode ? exitCode : code;
}

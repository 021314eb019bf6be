#include "batchjudge.h"

#include "jobjudge.h"
#include "storesession.h"

#include <vexa/export/xlsxdocument.h>
#include <vexa/widgets/verdictcolors.h>

#include <domain/direntry.h>
#include <domain/qcjob.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <tolerances/tolerancefactory.h>
#include <utilities/timehelper.h>

#include <QEventLoop>
#include <QTextStream>
#include <QTimer>

#include <cmath>

namespace vexa {

namespace {

QColor verdictColour(int status)
{
    return VerdictColors::colorOfStatus(status);
}

// Loads the job through the same store session the workstation uses, waiting in a local loop.
LoadedJob loadJob(const QString &storePath, const QString &jobName, QString *problem)
{
    StoreSession session;
    QEventLoop loop;
    LoadedJob result;
    QObject::connect(&session, &StoreSession::sgOpened, &session, &StoreSession::listJobs);
    QObject::connect(&session, &StoreSession::sgJobsListed, &loop,
                     [&](const std::vector<std::shared_ptr<DirEntry>> &entries) {
                         for (const auto &entry : entries) {
                             if (entry->header().name() == jobName) {
                                 session.loadJob(entry);
                                 return;
                             }
                         }
                         QStringList names;
                         for (const auto &entry : entries)
                             names << entry->header().name();
                         *problem = QStringLiteral("There is no QC job named \"%1\" (jobs: %2).")
                                        .arg(jobName, names.join(QStringLiteral(", ")));
                         loop.quit();
                     });
    QObject::connect(&session, &StoreSession::sgJobLoaded, &loop, [&](const LoadedJob &job) {
        result = job;
        loop.quit();
    });
    QObject::connect(&session, &StoreSession::sgError, &loop, [&](const QString &message) {
        *problem = message;
        loop.quit();
    });
    // A store that does not answer must not hang a production line.
    QTimer::singleShot(60000, &loop, [&] {
        *problem = QStringLiteral("The object store did not answer within 60 s.");
        loop.quit();
    });
    session.open(storePath);
    loop.exec();
    return result;
}

} // namespace

int runBatchJudge(const QString &storePath, const QString &jobName, const QString &conditionText,
                  const QString &workbookPath, QTextStream &out, QTextStream &err)
{
    bool conditionOk = false;
    const ColorimetricCondition condition = ColorimetricCondition::fromString(conditionText, &conditionOk);
    if (!conditionOk) {
        err << "Unknown colorimetric condition \"" << conditionText << "\"\n";
        return 2;
    }
    QString problem;
    const LoadedJob loaded = loadJob(storePath, jobName, &problem);
    if (!loaded.job) {
        err << (problem.isEmpty() ? QStringLiteral("The job could not be loaded.") : problem) << "\n";
        return 2;
    }
    JobJudge judge(loaded.job, condition);
    if (!judge.toleranceSet()) {
        err << "The job \"" << jobName << "\" has no tolerance set to judge against.\n";
        return 2;
    }
    // A tolerance that cannot judge (a negative limit, a check threshold above pass) gives no
    // verdict: the job cannot be judged, and the line must hear why.
    const QStringList toleranceErrors = ToleranceFactory::toleranceFactory()->validationErrors(*judge.toleranceSet());
    if (!toleranceErrors.isEmpty()) {
        err << "The tolerance set \"" << judge.toleranceSet()->name() << "\" cannot judge:\n";
        for (const QString &error : toleranceErrors)
            err << "  " << error << "\n";
        return 2;
    }
    const auto verdicts = judge.judge();

    XlsxDocument book;
    book.addSheet(QStringLiteral("Verdicts"));
    XlsxFormat title;
    title.setFontBold(true);
    title.setFontSize(14);
    XlsxFormat bold;
    bold.setFontBold(true);
    const auto standard = loaded.job->standard();
    book.write(1, 1, QStringLiteral("%1 — %2 — %3 — %4")
                         .arg(loaded.job->name(), standard ? standard->name() : QString(),
                              judge.toleranceSet()->name(), condition.toString()),
               title);
    const QStringList header{"Trial", "Measured", "Geometry", "Tolerance", "dE", "Verdict"};
    for (int c = 0; c < header.size(); ++c)
        book.write(3, c + 1, header[c], bold);
    int row = 4;
    int pass = 0, warning = 0, fail = 0, none = 0;
    for (const TrialVerdict &v : verdicts) {
        for (const GeometryVerdict &g : v.geometries) {
            XlsxFormat fill;
            if (verdictColour(g.status).isValid())
                fill.setPatternBackgroundColor(verdictColour(g.status));
            XlsxFormat number;
            number.setNumberFormat(QStringLiteral("0.00"));
            book.write(row, 1, v.trial ? v.trial->name() : QString());
            const QDateTime measured = v.trial ? TimeHelper::convert(v.trial->timeStamp()) : QDateTime();
            if (measured.isValid())
                book.write(row, 2, measured);
            book.write(row, 3, g.geometry.toString());
            book.write(row, 4, g.toleranceType);
            if (std::isfinite(g.figure))
                book.write(row, 5, g.figure, number);
            book.write(row, 6, JobJudge::statusText(g.status), fill);
            ++row;
        }
        switch (v.worst) {
        case 1: ++pass; break;
        case 2: ++warning; break;
        case 3: ++fail; break;
        default: ++none; break;
        }
    }
    book.setColumnWidth(1, 1, 24);
    book.setColumnWidth(2, 2, 18);
    book.setColumnWidth(3, 6, 12);

    book.addSheet(QStringLiteral("Summary"));
    for (int c = 0; c < 2; ++c)
        book.write(1, c + 1, QStringList{"Trial", "Verdict"}[c], bold);
    row = 2;
    for (const TrialVerdict &v : verdicts) {
        XlsxFormat fill;
        if (verdictColour(v.worst).isValid())
            fill.setPatternBackgroundColor(verdictColour(v.worst));
        book.write(row, 1, v.trial ? v.trial->name() : QString());
        book.write(row, 2, JobJudge::statusText(v.worst), fill);
        ++row;
    }
    book.setColumnWidth(1, 1, 24);
    if (!book.saveAs(workbookPath)) {
        err << "The workbook " << workbookPath << " could not be written: " << book.errorString() << "\n";
        return 2;
    }
    out << loaded.job->name() << ": " << verdicts.size() << " trials, " << pass << " pass, " << warning
        << " warning, " << fail << " fail" << (none ? QStringLiteral(", %1 without verdict").arg(none) : QString())
        << " -> " << workbookPath << "\n";
    return fail > 0 ? 1 : 0;
}

} // namespace vexa

#pragma once

#include <QString>

class QTextStream;

namespace vexa {

// Production-line use: judges every trial of a job of the store against its tolerances
// and writes the verdicts to a workbook, reading the store the workstation uses.
// Exit status: 0 when no trial fails (warnings allowed), 1 when some trial fails,
// 2 when the job cannot be judged or the workbook cannot be written.
int runBatchJudge(const QString &storePath, const QString &jobName, const QString &condition,
                  const QString &workbookPath, QTextStream &out, QTextStream &err);

} // namespace vexa

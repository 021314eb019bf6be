#pragma once

#include <QString>
#include <QStringList>
#include <QVector>
#include <QtNumeric>

namespace vexa {

// The verdict of a tolerance on one trial.
struct ToleranceJudgement
{
    enum Status { NoVerdict = 0, Pass = 1, Warning = 2, Fail = 3 };

    // 0 no verdict (no rule, missing values), 1 pass, 2 warning, 3 fail.
    int status = NoVerdict;
    // The largest difference relative to its limit (1.0 = at the limit); NaN without verdict.
    double normalizedDifference = qQNaN();
    // The colour differences the rule computed, named by differenceNames.
    QVector<double> colorDifferences;
    QStringList differenceNames;
    // Why the tolerance gave no verdict although it was asked to judge: a limit or threshold
    // that cannot be used (a negative colour-difference limit, a check threshold above the pass
    // threshold). Empty when the tolerance could judge or simply lacked values.
    QString error;
};

} // namespace vexa

#pragma once

#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>

#include <QString>
#include <QVector>

#include <memory>
#include <vector>

namespace vexa {

class QCJob;
class Standard;
class ToleranceSet;
class Trial;

// The verdict of one trial at one geometry against one tolerance.
struct GeometryVerdict
{
    Geometry geometry;
    QString toleranceType;
    int status = 0; // 0 none, 1 pass, 2 warning, 3 fail
    double figure = 0; // the first colour difference, the one tables show
};

struct TrialVerdict
{
    std::shared_ptr<Trial> trial;
    QVector<GeometryVerdict> geometries;
    int worst = 0;
};

// Judges every trial of a job against the tolerance set in force (the standard's
// first set, else the job template's, else none) at every geometry of the set.
class JobJudge
{
public:
    JobJudge(std::shared_ptr<QCJob> job, const ColorimetricCondition &condition);

    std::shared_ptr<ToleranceSet> toleranceSet() const { return m_set; }
    std::vector<TrialVerdict> judge() const;
    // The same against another set (null: the set in force).
    std::vector<TrialVerdict> judge(const std::shared_ptr<ToleranceSet> &set) const;

    static QString statusText(int status);

private:
    std::shared_ptr<QCJob> m_job;
    std::shared_ptr<ToleranceSet> m_set;
    ColorimetricCondition m_condition;
};

} // namespace vexa

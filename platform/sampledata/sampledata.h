#pragma once

#include <sampledata/sampledata_export.h>

#include <store/errorinfo.h>

namespace vexa {

class ObjectStore;

// The sample data set written into a new store: folders "Standards", "QC Jobs",
// "Tolerance Sets", "Colorants" and "Formulas"; three effect-colour standards
// (silver metallic, blue metallic, red solid) measured at six multi-angle
// geometries with texture values at 15as15, 30 trials each scattered to pass,
// warn and fail; QC jobs and a job template; tolerance sets of several types;
// colorants, formulas and recipe trials with colorant restrictions.
// The generator is deterministic: the same bytes on every run and platform.
class VEXA_SAMPLEDATA_EXPORT SampleData
{
public:
    static constexpr int TrialsPerStandard = 30;

    // Writes the set into an empty store (one transaction per folder's content).
    static bool populate(ObjectStore &store, ErrorInfo *error = nullptr);
};

} // namespace vexa

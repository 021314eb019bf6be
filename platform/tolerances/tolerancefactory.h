#pragma once

#include <tolerances/tolerances_export.h>

#include <domain/geometry.h>

#include <QObject>
#include <QStringList>
#include <QVector>

#include <memory>

namespace vexa {

class Tolerance;
class ToleranceSet;

/// Knows the tolerance types: their limits, parameters, groups and geometries. The process-wide
/// factory (toleranceFactory()) registers one judging rule per type with the domain's
/// ToleranceRuleRegistry when it is created, so that Tolerance::judge works for every type.
///
/// Types (group): "CIELab(+/-)", "CIELCh(+/-)", "CIELab dE*ab", "CIE94", "CMC(l:c)", "CIEDE2000",
/// "DIN99", "DIN99o", "Flop Index(+/-)" (CIEL); "DIN 6175-2" (DIN 6175-2); "Audi2000" (Audi).
class VEXA_TOLERANCES_EXPORT ToleranceFactory : public QObject
{
    Q_OBJECT

public:
    /// The process-wide factory; created (and the rules registered) on first use. Thread-safe.
    static ToleranceFactory *toleranceFactory();

    QStringList allToleranceTypes() const;
    QStringList allToleranceGroups() const;
    /// The group of a type; empty for an unknown type.
    QString toleranceGroup(const QString &toleranceType) const;
    bool isKnownType(const QString &toleranceType) const;

    /// A set named `name` with one tolerance of the type for each of `geometries` (all supported
    /// geometries when empty; one sample-wide tolerance for "Flop Index(+/-)"). Null for an unknown type.
    std::shared_ptr<ToleranceSet> createToleranceSet(const QString &toleranceType, const QString &name,
                                                     const QVector<Geometry> &geometries = {}) const;
    /// Rewrites the values that follow from others, in place (see the slot of the same name).
    void recomputeToleranceSet(ToleranceSet &toleranceSet) const;
    /// Why tolerances of the set cannot judge (one line each, naming type and geometry), and an
    /// empty set; empty when every tolerance can judge.
    QStringList validationErrors(const ToleranceSet &toleranceSet) const;

public Q_SLOTS:
    /// A new tolerance of the type with its default limits and parameters, at `geometry` (empty
    /// geometry when none is given). Null, with a log line, for an unknown type or a geometry the type
    /// does not support.
    virtual std::shared_ptr<vexa::Tolerance> createTolerance(const QString &toleranceType,
                                                             const vexa::Geometry &geometry = vexa::Geometry()) const;
    /// The geometries a type supports; empty for the sample-wide flop index and unknown types.
    virtual QVector<vexa::Geometry> supportedGeometries(const QString &toleranceType) const;
    /// Fills in what depends on edited values, in place: the tolerances see the set's own
    /// parameters; box limit pairs typed the wrong way round are put the right way round; CIE94's
    /// kL, K1 and K2 follow the "Application" in force (the set-wide one rules over a tolerance's
    /// own: "Graphic arts" 1, 0.045, 0.015; "Textiles" 2, 0.048, 0.014). Returns the same set.
    virtual std::shared_ptr<vexa::ToleranceSet> recomputeToleranceSet(std::shared_ptr<vexa::ToleranceSet> toleranceSet) const;

protected:
    ToleranceFactory();
};

} // namespace vexa

#pragma once

#include <colorimetry/cievalues.h>
#include <colorimetry/colorimetry_export.h>

namespace vexa {

/// The colour-difference formulas on plain L*a*b* triples. Every difference is trial minus standard;
/// asymmetric formulas (CIE94, CMC) take their weights from the standard. Pure, thread-safe.
class VEXA_COLORIMETRY_EXPORT ColorDifferenceFormulas
{
public:
    /// A total difference and its three signed parts, so that dE = sqrt(p1² + p2² + p3²)
    /// (CIEDE2000 adds its rotation term R_T·p2·p3).
    struct Result
    {
        double dE = 0.0;
        double lightness = 0.0;
        double chroma = 0.0;
        double hue = 0.0;
    };

    enum class ChromaReference { Standard, GeometricMean };

    /// ΔE*ab with its parts ΔL*, ΔC*ab, ΔH*ab (signed).
    static Result cie76(const CieLab &standard, const CieLab &trial);
    /// CIE94 (CIE 116-1995). Parts ΔL*/(kL SL), ΔC*/(kC SC), ΔH*/(kH SH). Graphic arts: K1 0.045,
    /// K2 0.015; textiles: kL 2, K1 0.048, K2 0.014.
    static Result cie94(const CieLab &standard, const CieLab &trial, double kL, double kC, double kH,
                        double k1 = 0.045, double k2 = 0.015,
                        ChromaReference reference = ChromaReference::Standard);
    /// CMC(l:c) (Clarke, McDonald, Rigg 1984). Parts ΔL*/(l SL), ΔC*/(c SC), ΔH*/SH.
    static Result cmc(const CieLab &standard, const CieLab &trial, double l, double c);
    /// CIEDE2000 (CIE 142-2001, with the notes of Sharma, Wu, Dalal 2005). Parts ΔL'/(kL SL),
    /// ΔC'/(kC SC), ΔH'/(kH SH).
    static Result ciede2000(const CieLab &standard, const CieLab &trial, double kL, double kC, double kH);
    /// DIN99 (DIN 6176) with parts ΔL99, ΔC99, ΔH99 (signed).
    static Result din99(const CieLab &standard, const CieLab &trial, double kE, double kCH);
    /// DIN99o with parts ΔL99o, ΔC99o, ΔH99o (signed).
    static Result din99o(const CieLab &standard, const CieLab &trial, double kE, double kCH);

    /// The DIN99 and DIN99o coordinates (L99, a99, b99) of a CIELAB colour.
    static CieLab toDin99(const CieLab &lab, double kE, double kCH);
    static CieLab toDin99o(const CieLab &lab, double kE, double kCH);
};

} // namespace vexa

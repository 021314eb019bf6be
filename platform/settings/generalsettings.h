#pragma once

#include <settings/commonsettings.h>
#include <settings/stringpair.h>

class BoolSetting;
class StringListSetting;

// The application-wide settings: colorimetric condition and colour-difference
// formula used when a job names none, the known object servers and the
// switches of the job export.
//
// Defaults: "D65/10", "CIE2000", delimiter ";", every export section on
// except the single-trial spectral data and the texture images (both large
// and rarely wanted).
class VEXA_SETTINGS_EXPORT GeneralSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr const char *OwnerName = "GeneralSettings";

    GeneralSettings();
    ~GeneralSettings() override;

    // "A/2", "A/10", … "F12/10": the illuminants A C D50 D55 D65 D75 F2 F7 F11 F12 under both observers.
    static QStringList availableColorimetricConditions();
    // "CIELab", "CIE94", "CMC", "CIE2000", "DIN99", "DIN99o".
    static QStringList availableDeltaE_Formulas();
    // The delimiters offered for delimited-text export and their names.
    static std::vector<StringPair> availableExportDelimiters();

    // The short text form, such as "D65/10".
    QString colorimetricCondition() const;
    bool setColorimetricCondition(const QString &condition);
    QString deltaE_Formula() const;
    bool setDeltaE_Formula(const QString &formula);

    // The object servers the user has connected to, most recent first.
    QStringList dispatcherList() const;
    void setDispatcherList(const QStringList &dispatchers);

    QString exportDelimiter() const;
    bool setExportDelimiter(const QString &delimiter);

    bool exportBoxPlotsEnabled() const;
    void setExportBoxPlotsEnabled(bool enabled);
    bool exportColorDataEnabled() const;
    void setExportColorDataEnabled(bool enabled);
    bool exportJobSchematicEnabled() const;
    void setExportJobSchematicEnabled(bool enabled);
    bool exportLabChartEnabled() const;
    void setExportLabChartEnabled(bool enabled);
    bool exportPropertyDataEnabled() const;
    void setExportPropertyDataEnabled(bool enabled);
    bool exportSingleTrialSpectralEnabled() const;
    void setExportSingleTrialSpectralEnabled(bool enabled);
    bool exportSpectralDataEnabled() const;
    void setExportSpectralDataEnabled(bool enabled);
    bool exportTextureDataEnabled() const;
    void setExportTextureDataEnabled(bool enabled);
    bool exportTextureImagesEnabled() const;
    void setExportTextureImagesEnabled(bool enabled);
    bool exportTrendChartEnabled() const;
    void setExportTrendChartEnabled(bool enabled);

private:
    std::shared_ptr<BoolSetting> exportSwitch(const char *key) const;
    bool exportSwitchValue(const char *key) const;
    void setExportSwitchValue(const char *key, bool enabled);

    std::shared_ptr<StringListSetting> m_colorimetricCondition;
    std::shared_ptr<StringListSetting> m_deltaEFormula;
    std::shared_ptr<StringListSetting> m_dispatcherList;
    std::shared_ptr<StringListSetting> m_exportDelimiter;
};

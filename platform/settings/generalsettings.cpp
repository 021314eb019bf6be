#include "generalsettings.h"

#include "boolsetting.h"
#include "stringlistsetting.h"

namespace {
const char *const ColorimetricConditionKey = "ColorimetricCondition";
const char *const DeltaEFormulaKey = "DeltaE_Formula";
const char *const DispatcherListKey = "DispatcherList";
const char *const ExportDelimiterKey = "ExportDelimiter";
const char *const ExportBoxPlotsKey = "ExportBoxPlots";
const char *const ExportColorDataKey = "ExportColorData";
const char *const ExportJobSchematicKey = "ExportJobSchematic";
const char *const ExportLabChartKey = "ExportLabChart";
const char *const ExportPropertyDataKey = "ExportPropertyData";
const char *const ExportSingleTrialSpectralKey = "ExportSingleTrialSpectral";
const char *const ExportSpectralDataKey = "ExportSpectralData";
const char *const ExportTextureDataKey = "ExportTextureData";
const char *const ExportTextureImagesKey = "ExportTextureImages";
const char *const ExportTrendChartKey = "ExportTrendChart";
} // namespace

GeneralSettings::GeneralSettings()
    : CommonSettings(QString::fromLatin1(OwnerName), tr("General Settings"))
{
    const QString colorimetry = QStringLiteral("Colorimetry");
    addSection(colorimetry, tr("Colorimetry"));

    m_colorimetricCondition = std::make_shared<StringListSetting>(
        ColorimetricConditionKey, tr("Colorimetric condition"),
        tr("Illuminant and observer used when a job names no colorimetric condition"));
    m_colorimetricCondition->setSingleSelect(true);
    m_colorimetricCondition->setUseComboBox(true);
    const QStringList conditions = availableColorimetricConditions();
    for (const QString &condition : conditions)
        m_colorimetricCondition->addPossibleValue(StringPair(condition), condition == QLatin1String("D65/10"));
    addSetting(m_colorimetricCondition, colorimetry);

    m_deltaEFormula = std::make_shared<StringListSetting>(DeltaEFormulaKey, tr("Colour difference formula"),
                                                          tr("Formula used for dE when a tolerance names none"));
    m_deltaEFormula->setSingleSelect(true);
    m_deltaEFormula->setUseComboBox(true);
    const QStringList formulas = availableDeltaE_Formulas();
    for (const QString &formula : formulas)
        m_deltaEFormula->addPossibleValue(StringPair(formula), formula == QLatin1String("CIE2000"));
    addSetting(m_deltaEFormula, colorimetry);

    // Maintained by the server connection dialog, not edited by hand.
    m_dispatcherList = std::make_shared<StringListSetting>(DispatcherListKey, tr("Servers"),
                                                           tr("Object servers connected to before"));
    m_dispatcherList->setIsVisible(false);
    addSetting(m_dispatcherList, QStringLiteral("Connection"));

    const QString exportSection = QStringLiteral("Export");
    addSection(exportSection, tr("Export"));
    m_exportDelimiter = std::make_shared<StringListSetting>(ExportDelimiterKey, tr("Delimiter"),
                                                            tr("Column delimiter of delimited-text export"));
    m_exportDelimiter->setSingleSelect(true);
    m_exportDelimiter->setUseComboBox(true);
    const auto delimiters = availableExportDelimiters();
    for (const StringPair &delimiter : delimiters)
        m_exportDelimiter->addPossibleValue(delimiter, delimiter.value == QLatin1String(";"));
    addSetting(m_exportDelimiter, exportSection);

    struct Switch
    {
        const char *key;
        bool enabled;
        QString label;
    };
    const Switch switches[] = {
        {ExportColorDataKey, true, tr("Colour data")},
        {ExportSpectralDataKey, true, tr("Spectral data")},
        {ExportSingleTrialSpectralKey, false, tr("Single trial spectral data")},
        {ExportTextureDataKey, true, tr("Texture data")},
        {ExportTextureImagesKey, false, tr("Texture images")},
        {ExportPropertyDataKey, true, tr("Property data")},
        {ExportLabChartKey, true, tr("Lab chart")},
        {ExportTrendChartKey, true, tr("Trend chart")},
        {ExportBoxPlotsKey, true, tr("Box plots")},
        {ExportJobSchematicKey, true, tr("Job schematic")},
    };
    for (const Switch &entry : switches)
        addSetting(std::make_shared<BoolSetting>(entry.key, entry.enabled, entry.label,
                                                 tr("Include this section in the job export")),
                   exportSection);
}

GeneralSettings::~GeneralSettings() = default;

QStringList GeneralSettings::availableColorimetricConditions()
{
    static const char *const illuminants[] = {"A", "C", "D50", "D55", "D65", "D75", "F2", "F7", "F11", "F12"};
    QStringList conditions;
    for (const char *illuminant : illuminants)
        for (const char *observer : {"2", "10"})
            conditions.append(QStringLiteral("%1/%2").arg(QLatin1String(illuminant), QLatin1String(observer)));
    return conditions;
}

QStringList GeneralSettings::availableDeltaE_Formulas()
{
    return {QStringLiteral("CIELab"), QStringLiteral("CIE94"),  QStringLiteral("CMC"),
            QStringLiteral("CIE2000"), QStringLiteral("DIN99"), QStringLiteral("DIN99o")};
}

std::vector<StringPair> GeneralSettings::availableExportDelimiters()
{
    return {StringPair(QStringLiteral(";"), tr("Semicolon ( ; )")),
            StringPair(QStringLiteral(","), tr("Comma ( , )")),
            StringPair(QStringLiteral("\t"), tr("Tab")),
            StringPair(QStringLiteral("|"), tr("Vertical bar ( | )")),
            StringPair(QStringLiteral(" "), tr("Space"))};
}

QString GeneralSettings::colorimetricCondition() const
{
    return m_colorimetricCondition->selectedValue();
}

bool GeneralSettings::setColorimetricCondition(const QString &condition)
{
    return m_colorimetricCondition->setSelectedValue(condition);
}

QString GeneralSettings::deltaE_Formula() const
{
    return m_deltaEFormula->selectedValue();
}

bool GeneralSettings::setDeltaE_Formula(const QString &formula)
{
    return m_deltaEFormula->setSelectedValue(formula);
}

QStringList GeneralSettings::dispatcherList() const
{
    return m_dispatcherList->selectedValues();
}

void GeneralSettings::setDispatcherList(const QStringList &dispatchers)
{
    m_dispatcherList->setSelectedValues(dispatchers);
}

QString GeneralSettings::exportDelimiter() const
{
    return m_exportDelimiter->selectedValue();
}

bool GeneralSettings::setExportDelimiter(const QString &delimiter)
{
    return m_exportDelimiter->setSelectedValue(delimiter);
}

std::shared_ptr<BoolSetting> GeneralSettings::exportSwitch(const char *key) const
{
    return setting<BoolSetting>(QString::fromLatin1(key));
}

bool GeneralSettings::exportSwitchValue(const char *key) const
{
    const auto setting = exportSwitch(key);
    return setting && setting->value();
}

void GeneralSettings::setExportSwitchValue(const char *key, bool enabled)
{
    if (const auto setting = exportSwitch(key))
        setting->setValue(enabled);
}

#define VEXA_EXPORT_SWITCH(Name, Key)                                                                   \
    bool GeneralSettings::export##Name##Enabled() const { return exportSwitchValue(Key); }              \
    void GeneralSettings::setExport##Name##Enabled(bool enabled) { setExportSwitchValue(Key, enabled); }

VEXA_EXPORT_SWITCH(BoxPlots, ExportBoxPlotsKey)
VEXA_EXPORT_SWITCH(ColorData, ExportColorDataKey)
VEXA_EXPORT_SWITCH(JobSchematic, ExportJobSchematicKey)
VEXA_EXPORT_SWITCH(LabChart, ExportLabChartKey)
VEXA_EXPORT_SWITCH(PropertyData, ExportPropertyDataKey)
VEXA_EXPORT_SWITCH(SingleTrialSpectral, ExportSingleTrialSpectralKey)
VEXA_EXPORT_SWITCH(SpectralData, ExportSpectralDataKey)
VEXA_EXPORT_SWITCH(TextureData, ExportTextureDataKey)
VEXA_EXPORT_SWITCH(TextureImages, ExportTextureImagesKey)
VEXA_EXPORT_SWITCH(TrendChart, ExportTrendChartKey)

#undef VEXA_EXPORT_SWITCH

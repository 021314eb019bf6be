#include "colorplotsettings.h"

#include <domain/geometry.h>

#include <settings/boolsetting.h>
#include <settings/stringlistsetting.h>

namespace vexa {

namespace {

const QString kEnabledKey = QStringLiteral("Enabled");
const QString kGeometryKey = QStringLiteral("Geometry");
const QString kShowHueCircleKey = QStringLiteral("showHueCircle");
const QString kShowTintedBackgroundKey = QStringLiteral("showTintedBackground");

} // namespace

QString ColorPlotSettings::dynamicGeometry()
{
    return QStringLiteral("Dynamic");
}

ColorPlotSettings::ColorPlotSettings(bool enabled, const QString &sectionName, const QString &sectionTitle,
                                     const std::string &defaultGeometry)
    : SettingsSection(sectionName, sectionTitle)
    , m_enabledByDefault(enabled)
{
    const QString enabledText = tr("Select if you want dynamic Lab plot geometry data");
    m_enabled = std::make_shared<BoolSetting>(kEnabledKey, enabled, enabledText, enabledText);

    const QString geometryText = tr("Select fixed geometry");
    m_geometry = std::make_shared<StringListSetting>(kGeometryKey, geometryText, geometryText);
    m_geometry->setSingleSelect(true);
    m_geometry->setUseComboBox(true);
    m_geometry->addPossibleValue(StringPair(dynamicGeometry(), tr("Dynamic")), true);
    const QVector<Geometry> geometries = Geometry::geometries(GeometrySet::Color);
    for (const Geometry &geometry : geometries)
        m_geometry->addPossibleValue(StringPair(geometry.toString(), geometry.toString()));
    // The default may be given in any accepted spelling ("45asN15"); store the canonical text.
    const QString requested = QString::fromStdString(defaultGeometry).trimmed();
    const Geometry parsed = Geometry::toGeometry(requested, static_cast<bool *>(nullptr));
    if (parsed.isValid() && m_geometry->hasPossibleValue(parsed.toString()))
        m_geometry->addPossibleValue(StringPair(parsed.toString(), parsed.toString()), true);

    m_showHueCircle = std::make_shared<BoolSetting>(kShowHueCircleKey, false, tr("Show Hue circle"),
                                                    tr("Select if you want show the Hue circle and Chroma line"));
    m_showTintedBackground = std::make_shared<BoolSetting>(
        kShowTintedBackgroundKey, true, tr("tinted background"),
        tr("Select if you want to tint the plots's background with the standard's directional Lab colors"));

    addSetting(m_enabled);
    addSetting(m_geometry);
    addSetting(m_showHueCircle);
    addSetting(m_showTintedBackground);
}

ColorPlotSettings::~ColorPlotSettings() = default;

bool ColorPlotSettings::isLabPlotEnabled() const
{
    return m_enabled->value();
}

void ColorPlotSettings::setLabPlotEnabled(bool enabled)
{
    if (m_enabled->isReadOnly() && !enabled)
        return;
    m_enabled->setValue(enabled);
}

void ColorPlotSettings::setLabPlotAlwaysEnabled(bool alwaysEnabled)
{
    if (alwaysEnabled)
        m_enabled->setValue(true);
    m_enabled->setIsReadOnly(alwaysEnabled);
}

bool ColorPlotSettings::isLabPlotAlwaysEnabled() const
{
    return m_enabled->isReadOnly();
}

QString ColorPlotSettings::geometry() const
{
    const QString value = m_geometry->selectedValue();
    return value.isEmpty() ? dynamicGeometry() : value;
}

bool ColorPlotSettings::isDynamicGeometry() const
{
    return geometry() == dynamicGeometry();
}

bool ColorPlotSettings::setGeometry(const QString &geometry)
{
    if (geometry == dynamicGeometry())
        return m_geometry->setSelectedValue(geometry);
    const Geometry parsed = Geometry::toGeometry(geometry.trimmed(), static_cast<bool *>(nullptr));
    if (!parsed.isValid())
        return false;
    return m_geometry->setSelectedValue(parsed.toString());
}

QString ColorPlotSettings::defaultGeometry() const
{
    const QStringList defaults = m_geometry->defaultValues();
    return defaults.isEmpty() ? dynamicGeometry() : defaults.first();
}

bool ColorPlotSettings::showHueCircle() const
{
    return m_showHueCircle->value();
}

void ColorPlotSettings::setShowHueCircle(bool show)
{
    m_showHueCircle->setValue(show);
}

bool ColorPlotSettings::showTintedBackground() const
{
    return m_showTintedBackground->value();
}

void ColorPlotSettings::setShowTintedBackground(bool show)
{
    m_showTintedBackground->setValue(show);
}

std::shared_ptr<SettingsSection> ColorPlotSettings::clone(const QString &sectionName,
                                                          const QString &displayName) const
{
    auto copy = std::make_shared<ColorPlotSettings>(m_enabledByDefault, sectionName, displayName,
                                                    defaultGeometry().toStdString());
    copy->setGroupName(groupName());
    for (const auto &setting : settings()) {
        if (const auto target = copy->setting(setting->key())) {
            target->copyAttributesFrom(*setting);
            target->assignValue(*setting);
        }
    }
    return copy;
}

} // namespace vexa

#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

// Asks for the texture image of a texture measurement, encoded in a format ("png") at a width.
class VEXA_CONTEXT_EXPORT GetAppearanceImage : public Command
{
public:
    GetAppearanceImage();
    ~GetAppearanceImage() override;

    static QString typeId() { return QStringLiteral("GetAppearanceImage"); }
    QString typeName() const override;
    QString textureValuesId() const { return m_textureValuesId; }
    void setTextureValuesId(const QString &textureValuesId) { m_textureValuesId = textureValuesId; }
    QString format() const { return m_format; }
    void setFormat(const QString &format) { m_format = format; }
    int imageWidth() const { return m_imageWidth; }
    void setImageWidth(int imageWidth) { m_imageWidth = imageWidth; }

private:
    QString m_textureValuesId;
    QString m_format;
    int m_imageWidth = 0;
};

} // namespace vexa

#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QByteArray>
#include <QString>

#include <memory>

namespace vexa {

// The encoded image and the texture measurement it belongs to.
class VEXA_CONTEXT_EXPORT GetAppearanceImageResponse : public Response
{
public:
    using Response::Response;
    ~GetAppearanceImageResponse() override;

    QByteArray textureImage() const { return m_textureImage; }
    void setTextureImage(const QByteArray &textureImage) { m_textureImage = textureImage; }
    QString format() const { return m_format; }
    void setFormat(const QString &format) { m_format = format; }
    QString textureValuesId() const { return m_textureValuesId; }
    void setTextureValuesId(const QString &textureValuesId) { m_textureValuesId = textureValuesId; }

private:
    QByteArray m_textureImage;
    QString m_format;
    QString m_textureValuesId;
};

} // namespace vexa

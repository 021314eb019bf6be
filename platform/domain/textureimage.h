#pragma once

#include <domain/reflectable.h>

#include <QByteArray>

namespace vexa {

// An encoded texture image: the bytes and their format ("png", "jpg" ...).
class VEXA_DOMAIN_EXPORT TextureImage : public Reflectable
{
    VEXA_REFLECTABLE(TextureImage)
public:
    QByteArray data() const { return m_data; }
    void setData(const QByteArray &data) { m_data = data; }
    QString format() const { return m_format; }
    void setFormat(const QString &format) { m_format = format; }
    int width() const { return m_width; }
    void setWidth(int width) { m_width = width; }
    int height() const { return m_height; }
    void setHeight(int height) { m_height = height; }

private:
    QByteArray m_data;
    QString m_format;
    int m_width = 0;
    int m_height = 0;
};

} // namespace vexa

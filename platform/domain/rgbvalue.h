#pragma once

#include <domain/reflectable.h>

namespace vexa {

// A display colour, 8 bits a channel (sRGB).
class VEXA_DOMAIN_EXPORT RGBValue : public Reflectable
{
    VEXA_REFLECTABLE(RGBValue)
public:
    RGBValue() = default;
    RGBValue(unsigned char r, unsigned char g, unsigned char b) : m_r(r), m_g(g), m_b(b) {}

    unsigned char R() const { return m_r; }
    unsigned char G() const { return m_g; }
    unsigned char B() const { return m_b; }
    void setR(unsigned char r) { m_r = r; }
    void setG(unsigned char g) { m_g = g; }
    void setB(unsigned char b) { m_b = b; }

    bool operator==(const RGBValue &o) const { return m_r == o.m_r && m_g == o.m_g && m_b == o.m_b; }
    bool operator!=(const RGBValue &o) const { return !(*this == o); }

private:
    unsigned char m_r = 0;
    unsigned char m_g = 0;
    unsigned char m_b = 0;
};

} // namespace vexa

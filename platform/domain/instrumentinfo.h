#pragma once

#include <domain/reflectable.h>

namespace vexa {

// The instrument that took a measurement.
class VEXA_DOMAIN_EXPORT InstrumentInfo : public Reflectable
{
    VEXA_REFLECTABLE(InstrumentInfo)
public:
    QString serialNumber() const { return m_serialNumber; }
    void setSerialNumber(const QString &serialNumber) { m_serialNumber = serialNumber; }
    QString type() const { return m_type; }
    void setType(const QString &type) { m_type = type; }

private:
    QString m_serialNumber;
    QString m_type;
};

} // namespace vexa

#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

class BaseObject;

// Replaces a stored object. Its version must be the stored one (optimistic locking).
class VEXA_CONTEXT_EXPORT UpdateObject : public Command
{
public:
    UpdateObject();
    ~UpdateObject() override;

    static QString typeId() { return QStringLiteral("UpdateObject"); }
    QString typeName() const override;
    std::shared_ptr<BaseObject> object() const { return m_object; }
    void setObject(const std::shared_ptr<BaseObject> &object) { m_object = object; }

private:
    std::shared_ptr<BaseObject> m_object;
};

} // namespace vexa

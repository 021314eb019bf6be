#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

// Loads one object. Depth 0 leaves referenced objects as unloaded stubs (only their id set);
// depth n loads references n levels deep, -1 all of them. setLoadAllDetails(true) means -1.
class VEXA_CONTEXT_EXPORT GetCorvidObject : public Command
{
public:
    GetCorvidObject();
    ~GetCorvidObject() override;

    static QString typeId() { return QStringLiteral("GetCorvidObject"); }
    QString typeName() const override;
    QString id() const { return m_id; }
    void setId(const QString &id) { m_id = id; }
    QString type() const { return m_type; }
    void setType(const QString &type) { m_type = type; }
    int depth() const { return m_depth; }
    void setDepth(int depth) { m_depth = depth; }

private:
    QString m_id;
    QString m_type;
    int m_depth = 0;
};

} // namespace vexa

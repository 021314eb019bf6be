#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

// Asks the server for its name.
class VEXA_CONTEXT_EXPORT ServerInfo : public Command
{
public:
    ServerInfo();
    ~ServerInfo() override;

    static QString typeId() { return QStringLiteral("ServerInfo"); }
    QString typeName() const override;

};

} // namespace vexa

#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

// Lists the databases the server offers.
class VEXA_CONTEXT_EXPORT GetDatabases : public Command
{
public:
    GetDatabases();
    ~GetDatabases() override;

    static QString typeId() { return QStringLiteral("GetDatabases"); }
    QString typeName() const override;

};

} // namespace vexa

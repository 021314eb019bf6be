#include "localsettings.h"

#include "intsetting.h"
#include "stringsetting.h"

LocalSettings::LocalSettings()
    : CommonSettings(QString::fromLatin1(OwnerName), tr("Local Settings"))
{
    const QString server = QStringLiteral("Server");
    addSection(server, tr("Object Server"));
    m_serverAddress = std::make_shared<StringSetting>(QStringLiteral("CorvidServerIP_Address"),
                                                      QStringLiteral("localhost"), tr("Server address"),
                                                      tr("Host name or IP address of the object server"));
    m_serverAddress->setRegularExpression(QRegularExpression(QStringLiteral("[A-Za-z0-9][A-Za-z0-9.:\\-]*")));
    addSetting(m_serverAddress, server);

    m_serverPort = std::make_shared<IntSetting>(QStringLiteral("CorvidServerPortNumber"), DefaultPortNumber,
                                                tr("Server port"), tr("Port number of the object server"));
    m_serverPort->setRange(1, 65535);
    addSetting(m_serverPort, server);

    m_lastDatabase = std::make_shared<StringSetting>(QStringLiteral("LastDatabaseUsed"), QString(),
                                                     tr("Last database"), tr("Database used in the last session"));
    m_lastDatabase->setIsReadOnly(true);
    addSetting(m_lastDatabase, server);

    m_lastUserName = std::make_shared<StringSetting>(QStringLiteral("LastUserName"), QString(), tr("Last user"),
                                                     tr("User name of the last login"));
    m_lastUserName->setIsReadOnly(true);
    addSetting(m_lastUserName, server);
}

LocalSettings::~LocalSettings() = default;

QString LocalSettings::corvidServerIP_Address() const
{
    return m_serverAddress->value();
}

bool LocalSettings::setCorvidServerIP_Address(const QString &address)
{
    return !address.isEmpty() && m_serverAddress->setValue(address);
}

int LocalSettings::corvidServerPortNumber() const
{
    return m_serverPort->value();
}

bool LocalSettings::setCorvidServerPortNumber(int port)
{
    return m_serverPort->setValue(port);
}

QString LocalSettings::lastDatabaseUsed() const
{
    return m_lastDatabase->value();
}

void LocalSettings::setLastDatabaseUsed(const QString &database)
{
    m_lastDatabase->setValue(database);
}

QString LocalSettings::lastUserName() const
{
    return m_lastUserName->value();
}

void LocalSettings::setLastUserName(const QString &userName)
{
    m_lastUserName->setValue(userName);
}

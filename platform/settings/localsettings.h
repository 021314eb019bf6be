#pragma once

#include <settings/commonsettings.h>

class IntSetting;
class StringSetting;

// Settings of this workstation: the object server last connected to and
// the database and user last used.
class VEXA_SETTINGS_EXPORT LocalSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr const char *OwnerName = "LocalSettings";
    static constexpr int DefaultPortNumber = 8765;

    LocalSettings();
    ~LocalSettings() override;

    QString corvidServerIP_Address() const;
    // A host name or an IPv4/IPv6 address; false (and no change) otherwise.
    bool setCorvidServerIP_Address(const QString &address);
    int corvidServerPortNumber() const;
    // 1 to 65535; false (and no change) otherwise.
    bool setCorvidServerPortNumber(int port);
    QString lastDatabaseUsed() const;
    void setLastDatabaseUsed(const QString &database);
    QString lastUserName() const;
    void setLastUserName(const QString &userName);

private:
    std::shared_ptr<StringSetting> m_serverAddress;
    std::shared_ptr<IntSetting> m_serverPort;
    std::shared_ptr<StringSetting> m_lastDatabase;
    std::shared_ptr<StringSetting> m_lastUserName;
};

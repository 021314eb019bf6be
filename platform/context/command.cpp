#include <context/command.h>

#include <QAtomicInteger>
#include <QUuid>

namespace vexa {

Command::Command() = default;
Command::~Command() = default;

std::string Command::generateId()
{
    m_commandId = newCommandId();
    return m_commandId;
}

std::string Command::newCommandId()
{
    static QAtomicInteger<quint64> counter;
    static const std::string session = QUuid::createUuid().toString(QUuid::Id128).left(8).toStdString();
    return session + "-" + std::to_string(counter.fetchAndAddRelaxed(1) + 1);
}

} // namespace vexa

#include "readcontext.h"

namespace vexa {

ReadContext::ReadContext(int formatVersion)
    : m_formatVersion(formatVersion)
{
}

void ReadContext::pushMember(const QString &name)
{
    m_segments.append(m_segments.isEmpty() ? name : QLatin1Char('.') + name);
}

void ReadContext::pushIndex(int index)
{
    m_segments.append(QStringLiteral("[%1]").arg(index));
}

void ReadContext::pop()
{
    if (!m_segments.isEmpty())
        m_segments.removeLast();
}

QString ReadContext::path() const
{
    return m_segments.join(QString());
}

bool ReadContext::fail(const QString &message)
{
    if (m_error.isEmpty()) {
        const QString where = path();
        m_error = where.isEmpty() ? message : where + QStringLiteral(": ") + message;
    }
    return false;
}

} // namespace vexa

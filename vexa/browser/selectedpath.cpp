#include "selectedpath.h"

namespace vexa {

SelectedPath::SelectedPath(const QString &dispatcherId, const QStringList &path, const QStringList &stringPath)
    : m_dispatcherId(dispatcherId)
    , m_path(path)
    , m_stringPath(stringPath)
{
}

QString SelectedPath::pathToString() const
{
    const QStringList &parts = m_stringPath.size() == m_path.size() ? m_stringPath : m_path;
    return separator() + parts.join(separator());
}

QString SelectedPath::idString() const
{
    return m_path.join(separator());
}

QStringList SelectedPath::fromIdString(const QString &text)
{
    return text.split(separator(), Qt::SkipEmptyParts);
}

bool SelectedPath::operator==(const SelectedPath &other) const
{
    return m_dispatcherId == other.m_dispatcherId && m_path == other.m_path;
}

} // namespace vexa

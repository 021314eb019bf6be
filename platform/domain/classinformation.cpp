#include "classinformation.h"

namespace vexa {

ClassInformation::ClassInformation(const QString &className, const QVector<ClassComponent> &components)
    : m_className(className), m_components(components)
{
}

bool ClassInformation::didGetComponentWithIndex(int index, ClassComponent &component) const
{
    if (index < 0 || index >= m_components.size())
        return false;
    component = m_components.at(index);
    return true;
}

} // namespace vexa

#include "direntrybrowserinterface.h"

#include <domain/baseobject.h>
#include <domain/classregistration.h>
#include <domain/globaldirentry.h>

namespace vexa {

DirEntryBrowserInterface::DirEntryBrowserInterface(const QString &kind, const std::string &objectType)
    : m_kind(kind)
    , m_objectType(objectType)
{
}

DirEntryBrowserInterface::~DirEntryBrowserInterface() = default;

QString DirEntryBrowserInterface::defaultNamedObjectName()
{
    return tr("%1 %2").arg(m_kind).arg(++m_created);
}

std::shared_ptr<BaseObject> DirEntryBrowserInterface::newNamedObject()
{
    auto object = ClassRegistration::instance().serializableFactory().createObject(QString::fromStdString(m_objectType));
    if (object)
        object->header().setName(defaultNamedObjectName());
    return object;
}

} // namespace vexa

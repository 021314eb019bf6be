#include "memberdescriptor.h"

namespace vexa {

QString memberKindName(MemberKind kind)
{
    switch (kind) {
    case MemberKind::Bool: return QStringLiteral("bool");
    case MemberKind::Int: return QStringLiteral("int");
    case MemberKind::Double: return QStringLiteral("double");
    case MemberKind::String: return QStringLiteral("QString");
    case MemberKind::StringList: return QStringLiteral("QStringList");
    case MemberKind::DoubleVector: return QStringLiteral("QVector<double>");
    case MemberKind::ByteArray: return QStringLiteral("QByteArray");
    case MemberKind::Timestamp: return QStringLiteral("Timestamp");
    case MemberKind::Geometry: return QStringLiteral("Geometry");
    case MemberKind::ColorimetricCondition: return QStringLiteral("ColorimetricCondition");
    case MemberKind::Uuid: return QStringLiteral("QUuid");
    case MemberKind::Variant: return QStringLiteral("QVariant");
    case MemberKind::Enum: return QStringLiteral("enum");
    case MemberKind::Byte: return QStringLiteral("unsigned char");
    case MemberKind::ValueObject: return QStringLiteral("object");
    case MemberKind::OwnedObject: return QStringLiteral("ownedObject");
    case MemberKind::OwnedObjectList: return QStringLiteral("ownedObjectList");
    case MemberKind::Reference: return QStringLiteral("reference");
    case MemberKind::ReferenceList: return QStringLiteral("referenceList");
    }
    return QString();
}

MemberDescriptor::MemberDescriptor(const QString &name, MemberKind kind, const QString &innerType)
    : m_name(name), m_kind(kind), m_innerType(innerType)
{
}

MemberDescriptor::~MemberDescriptor() = default;

MemberList::MemberList(std::initializer_list<MemberDescriptorPtr> members)
    : m_members(members)
{
}

MemberList::MemberList(const MemberList &base, std::initializer_list<MemberDescriptorPtr> members)
    : m_members(base.m_members)
{
    m_members.insert(m_members.end(), members.begin(), members.end());
}

const MemberDescriptor *MemberList::find(const QString &name) const
{
    for (const auto &m : m_members) {
        if (m->name() == name)
            return m.get();
    }
    return nullptr;
}

} // namespace vexa

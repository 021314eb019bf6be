#include <store/objectstore.h>

#include <mutex>
#include <QSet>

namespace vexa {

namespace {

struct TypeRegistry
{
    std::mutex mutex;
    QStringList types{
        QStringLiteral("Assortment"), QStringLiteral("ColorStandardsLibrary"), QStringLiteral("Colorant"),
        QStringLiteral("DatabaseConfiguration"), QStringLiteral("DirEntry"), QStringLiteral("Domain"),
        QStringLiteral("Folder"), QStringLiteral("Formula"), QStringLiteral("LabValue"),
        QStringLiteral("Letdown"), QStringLiteral("MeasurementConfiguration"), QStringLiteral("Property"),
        QStringLiteral("PropertyLibrary"), QStringLiteral("QAFilter"), QStringLiteral("QAJob"),
        QStringLiteral("QCJob"), QStringLiteral("QCJobTemplate"), QStringLiteral("Recipe"),
        QStringLiteral("RecipeTrial"), QStringLiteral("ReflectanceSpectrum"), QStringLiteral("Standard"),
        QStringLiteral("Substrate"), QStringLiteral("Tag"), QStringLiteral("TagDefinition"),
        QStringLiteral("Tolerance"), QStringLiteral("ToleranceSet"), QStringLiteral("Trial"),
        QStringLiteral("User")};
};

TypeRegistry &registry()
{
    static TypeRegistry r;
    return r;
}

} // namespace

ObjectStore::~ObjectStore() = default;

QString ObjectStore::rootFolderId() const
{
    return QStringLiteral("root");
}

QStringList ObjectStore::knownTypes()
{
    std::lock_guard<std::mutex> lock(registry().mutex);
    return registry().types;
}

bool ObjectStore::isKnownType(const QString &type)
{
    std::lock_guard<std::mutex> lock(registry().mutex);
    return registry().types.contains(type);
}

void ObjectStore::registerType(const QString &type)
{
    if (type.isEmpty())
        return;
    std::lock_guard<std::mutex> lock(registry().mutex);
    if (!registry().types.contains(type))
        registry().types.append(type);
}

} // namespace vexa

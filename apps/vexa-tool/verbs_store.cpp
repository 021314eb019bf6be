// Verbs over the object store: store init | ls | get | export | import.

#include "verbregistry.h"

#include <domain/baseobject.h>
#include <domain/serialization.h>

#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>

// Defined by linking Vexa::SampleData; without it "store init" creates an empty store.
#ifdef VEXA_HAS_SAMPLEDATA
#include <sampledata/sampledata.h>
#endif

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

using namespace vexa;

namespace {

const char *const Usage = "Usage: vexa-tool store init FILE | ls FILE [FOLDER] | get FILE ID | export FILE DIR | "
                          "import FILE DIR\n";

int fail(QTextStream &err, const ErrorInfo &error)
{
    err << error.toString();
    if (!error.internalMessage().isEmpty())
        err << " [" << error.internalMessage() << "]";
    err << "\n";
    return 1;
}

int init(const QString &file, QTextStream &out, QTextStream &err)
{
    if (QFileInfo::exists(file)) {
        err << "store init: " << file << " exists already\n";
        return 1;
    }
    SqliteObjectStore store(file);
    ErrorInfo error;
    if (!store.open(&error))
        return fail(err, error);
#ifdef VEXA_HAS_SAMPLEDATA
    if (!SampleData::populate(store, &error))
        return fail(err, error);
#endif
    out << "Created " << file << " with " << store.count(nullptr) << " objects\n";
    return 0;
}

int list(SqliteObjectStore &store, const QString &folder, QTextStream &out, QTextStream &err)
{
    std::vector<StoreRecord> entries;
    ErrorInfo error;
    if (!store.listEntries(folder, {}, &entries, &error))
        return fail(err, error);
    for (const StoreRecord &e : entries)
        out << e.id << "\t" << e.type << "\tv" << e.version << "\t" << e.name << "\n";
    return 0;
}

int get(SqliteObjectStore &store, const QString &id, QTextStream &out, QTextStream &err)
{
    std::vector<StoreRecord> records;
    ErrorInfo error;
    if (!store.fetch({id}, QString(), &records, &error))
        return fail(err, error);
    out << QString::fromUtf8(QJsonDocument::fromJson(records.front().data).toJson(QJsonDocument::Indented));
    return 0;
}

// DIR/index.json lists the objects parents first (id, type, parent, name);
// DIR/<id>.json holds each object's stored form.
int exportTo(SqliteObjectStore &store, const QString &dirPath, QTextStream &out, QTextStream &err)
{
    QDir dir(dirPath);
    if (!dir.mkpath(QStringLiteral("."))) {
        err << "store export: cannot create " << dirPath << "\n";
        return 1;
    }
    QJsonArray index;
    bool written = true;
    ErrorInfo error;
    const bool ok = store.visitAll(
        [&](const StoreRecord &r) {
            QFile file(dir.filePath(r.id + QStringLiteral(".json")));
            written = file.open(QIODevice::WriteOnly) && file.write(r.data) == r.data.size();
            index.append(QJsonObject{{"id", r.id}, {"type", r.type}, {"parent", r.parentId}, {"name", r.name}});
            return written;
        },
        &error);
    if (!ok)
        return fail(err, error);
    QFile indexFile(dir.filePath(QStringLiteral("index.json")));
    if (!written || !indexFile.open(QIODevice::WriteOnly)) {
        err << "store export: cannot write into " << dirPath << "\n";
        return 1;
    }
    indexFile.write(QJsonDocument(index).toJson());
    out << "Exported " << index.size() << " objects to " << dirPath << "\n";
    return 0;
}

int importFrom(SqliteObjectStore &store, const QString &dirPath, QTextStream &out, QTextStream &err)
{
    QDir dir(dirPath);
    QFile indexFile(dir.filePath(QStringLiteral("index.json")));
    if (!indexFile.open(QIODevice::ReadOnly)) {
        err << "store import: no index.json in " << dirPath << "\n";
        return 1;
    }
    const QJsonArray index = QJsonDocument::fromJson(indexFile.readAll()).array();
    int count = 0;
    for (const QJsonValue &value : index) {
        const QJsonObject item = value.toObject();
        const QString id = item.value(QStringLiteral("id")).toString();
        QFile file(dir.filePath(id + QStringLiteral(".json")));
        if (!file.open(QIODevice::ReadOnly)) {
            err << "store import: missing " << file.fileName() << "\n";
            return 1;
        }
        QString problem;
        const auto object = Serialization::fromBytes(file.readAll(), &problem);
        if (!object) {
            err << "store import: " << file.fileName() << ": " << problem << "\n";
            return 1;
        }
        object->setId(id);
        std::vector<StoreRecord> records(1);
        ErrorInfo error;
        if (!ObjectCodec::toRecord(*object, &records[0], &error)
            || !store.add(&records, item.value(QStringLiteral("parent")).toString(), &error))
            return fail(err, error);
        ++count;
    }
    out << "Imported " << count << " objects\n";
    return 0;
}

int runStore(const QStringList &args, QTextStream &out, QTextStream &err)
{
    const QString action = args.value(0);
    const int expected = action == QLatin1String("ls") ? (args.size() == 3 ? 3 : 2)
                         : action == QLatin1String("init") ? 2
                                                            : 3;
    if (args.size() != expected
        || !QStringList{"init", "ls", "get", "export", "import"}.contains(action)) {
        err << Usage;
        return 2;
    }
    const QString file = args.at(1);
    if (action == QLatin1String("init"))
        return init(file, out, err);
    // Importing may create the store; everything else reads an existing one.
    SqliteObjectStore store(file, action == QLatin1String("import") ? SqliteObjectStore::OpenMode::CreateIfMissing
                                                                    : SqliteObjectStore::OpenMode::MustExist);
    ErrorInfo error;
    if (!store.open(&error))
        return fail(err, error);
    if (action == QLatin1String("ls"))
        return list(store, args.value(2), out, err);
    if (action == QLatin1String("get"))
        return get(store, args.at(2), out, err);
    if (action == QLatin1String("export"))
        return exportTo(store, args.at(2), out, err);
    return importFrom(store, args.at(2), out, err);
}

const VerbRegistrar registrar{{QStringLiteral("store"),
                               QStringLiteral("init FILE | ls FILE [FOLDER] | get FILE ID | export FILE DIR | import FILE DIR"),
                               QStringLiteral("Create, list, read, export and import an object store"), &runStore}};

} // namespace

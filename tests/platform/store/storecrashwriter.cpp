// Test helper: writes batches of objects into a store for ever, printing the id
// of every object after its batch committed. The crash test kills it with SIGKILL.
#include <store/sqliteobjectstore.h>

#include <QCoreApplication>

#include <cstdio>

using namespace vexa;

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    if (argc < 2)
        return 2;
    SqliteObjectStore store(QString::fromLocal8Bit(argv[1]));
    ErrorInfo error;
    if (!store.open(&error)) {
        std::fprintf(stderr, "%s\n", qPrintable(error.toString()));
        return 1;
    }
    for (int batch = 0;; ++batch) {
        std::vector<StoreRecord> records(5);
        for (StoreRecord &r : records) {
            r.type = QStringLiteral("Trial");
            r.name = QStringLiteral("Batch %1").arg(batch);
            r.data = QByteArray(4096, char('a' + batch % 26)); // large enough to span pages
        }
        if (!store.add(&records, QString(), &error)) {
            std::fprintf(stderr, "%s\n", qPrintable(error.toString()));
            return 1;
        }
        for (const StoreRecord &r : records)
            std::printf("%s %c\n", qPrintable(r.id), 'a' + batch % 26);
        std::fflush(stdout);
    }
}

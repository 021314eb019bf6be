#include "verbregistry.h"

#include <utilities/applicationinfo.h>

#include <QCoreApplication>

namespace {

void printHelp(QTextStream &out)
{
    out << "Usage: vexa-tool VERB [ARGUMENTS]\n\nVerbs:\n";
    int width = 4;
    for (const Verb &verb : VerbRegistry::instance().verbs())
        width = std::max(width, int((verb.name + QLatin1Char(' ') + verb.arguments).size()));
    out << "  " << QStringLiteral("help").leftJustified(width) << "  Show this help\n";
    for (const Verb &verb : VerbRegistry::instance().verbs())
        out << "  " << (verb.name + QLatin1Char(' ') + verb.arguments).trimmed().leftJustified(width) << "  " << verb.help
            << "\n";
}

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    QTextStream out(stdout);
    QTextStream err(stderr);

    QStringList args = QCoreApplication::arguments().mid(1);
    if (args.isEmpty()) {
        printHelp(err);
        return 2;
    }
    const QString name = args.takeFirst();
    if (name == QLatin1String("help") || name == QLatin1String("--help") || name == QLatin1String("-h")) {
        printHelp(out);
        return 0;
    }
    const Verb *verb = VerbRegistry::instance().find(name);
    if (!verb) {
        err << "vexa-tool: unknown verb \"" << name << "\"\n\n";
        printHelp(err);
        return 2;
    }
    const int code = verb->run(args, out, err);
    out.flush();
    err.flush();
    return code;
}

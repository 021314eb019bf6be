#include "verbregistry.h"

#include <utilities/applicationinfo.h>

#include <QCoreApplication>

namespace {

// One line per verb: its usage, then its help in a column; a usage too long for the
// column puts the help on the next line.
void printHelp(QTextStream &out)
{
    constexpr int MaxColumn = 48;
    out << "Usage: vexa-tool VERB [ARGUMENTS]\n\nVerbs:\n";
    int width = 4;
    for (const Verb &verb : VerbRegistry::instance().verbs()) {
        const int length = int((verb.name + QLatin1Char(' ') + verb.arguments).trimmed().size());
        if (length <= MaxColumn)
            width = std::max(width, length);
    }
    out << "  " << QStringLiteral("help").leftJustified(width) << "  Show this help\n";
    for (const Verb &verb : VerbRegistry::instance().verbs()) {
        const QString usage = (verb.name + QLatin1Char(' ') + verb.arguments).trimmed();
        if (usage.size() > width)
            out << "  " << usage << "\n  " << QString(width, QLatin1Char(' ')) << "  " << verb.help << "\n";
        else
            out << "  " << usage.leftJustified(width) << "  " << verb.help << "\n";
    }
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

#include <utilities/applicationinfo.h>

#include <QCoreApplication>
#include <QTextStream>

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    QTextStream out(stdout);
    out << "vexa-tool " << vexa::ApplicationInfo::instance().version() << "\n";
    return 0;
}

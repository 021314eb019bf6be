#pragma once

// The outside tools some tests read their results back with. A test that needs one says
// which Debian package is missing (scripts/setup.sh installs them all) instead of failing on
// a side effect of its absence.

#include <QProcess>
#include <QString>
#include <QStringList>
#include <QtTest>

namespace testprerequisites {

// Debian's Python with its packages (not whichever python3 comes first on PATH).
inline QString python()
{
    return QStringLiteral("/usr/bin/python3");
}

// The Debian package that provides a Python module the tests import.
inline QString packageOfModule(const QString &module)
{
    if (module == QLatin1String("openpyxl"))
        return QStringLiteral("python3-openpyxl");
    if (module == QLatin1String("PIL"))
        return QStringLiteral("python3-pil");
    return QStringLiteral("python3-") + module.toLower();
}

// Empty when every module imports; else one sentence naming the missing packages.
inline QString missingPythonModules(const QStringList &modules)
{
    QStringList missing;
    for (const QString &module : modules) {
        QProcess probe;
        probe.start(python(), {QStringLiteral("-c"), QStringLiteral("import ") + module});
        if (!probe.waitForFinished(30000) || probe.exitStatus() != QProcess::NormalExit || probe.exitCode() != 0)
            missing << QStringLiteral("%1 (Python module %2)").arg(packageOfModule(module), module);
    }
    if (missing.isEmpty())
        return QString();
    return QStringLiteral("%1 needs the Debian package(s) %2; scripts/setup.sh installs them")
        .arg(python(), missing.join(QStringLiteral(", ")));
}

// The modules openpyxl needs to read our workbooks back, images included (Pillow).
inline QStringList workbookReaderModules()
{
    return {QStringLiteral("openpyxl"), QStringLiteral("PIL")};
}

} // namespace testprerequisites

// Fails the current test, naming the missing packages, when a module is missing.
#define REQUIRE_PYTHON_MODULES(modules)                                                                    \
    do {                                                                                                   \
        const QString vexaMissing = testprerequisites::missingPythonModules(modules);                      \
        if (!vexaMissing.isEmpty())                                                                        \
            QFAIL(qPrintable(vexaMissing));                                                                \
    } while (false)

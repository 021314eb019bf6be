#pragma once

#include <QString>
#include <QStringList>
#include <QTextStream>
#include <QVector>

// The verbs of the console tool. Each verb file registers its verbs with a static
// VerbRegistrar:
//   static const VerbRegistrar registrar{{"check", "FILE", "Validate a stored object file", &runCheck}};
// A verb returns the process exit code (0 success, 1 failure, 2 wrong usage).
struct Verb
{
    using Run = int (*)(const QStringList &args, QTextStream &out, QTextStream &err);

    QString name;
    QString arguments; // usage of the arguments, e.g. "FILE"; empty when none
    QString help;      // one line
    Run run = nullptr;
};

class VerbRegistry
{
public:
    static VerbRegistry &instance();

    void add(const Verb &verb);
    // Null for an unknown name.
    const Verb *find(const QString &name) const;
    // Sorted by name.
    QVector<Verb> verbs() const;

private:
    VerbRegistry() = default;
    QVector<Verb> m_verbs;
};

struct VerbRegistrar
{
    VerbRegistrar(std::initializer_list<Verb> verbs);
};

#include "verbregistry.h"

#include <algorithm>

VerbRegistry &VerbRegistry::instance()
{
    static VerbRegistry registry;
    return registry;
}

void VerbRegistry::add(const Verb &verb)
{
    m_verbs.append(verb);
}

const Verb *VerbRegistry::find(const QString &name) const
{
    for (const Verb &verb : m_verbs) {
        if (verb.name == name)
            return &verb;
    }
    return nullptr;
}

QVector<Verb> VerbRegistry::verbs() const
{
    QVector<Verb> sorted = m_verbs;
    std::sort(sorted.begin(), sorted.end(), [](const Verb &a, const Verb &b) { return a.name < b.name; });
    return sorted;
}

VerbRegistrar::VerbRegistrar(std::initializer_list<Verb> verbs)
{
    for (const Verb &verb : verbs)
        VerbRegistry::instance().add(verb);
}

#pragma once

#include <domain/domain_export.h>

namespace vexa {

class ClassRegistration;

// Registers every concrete class of the domain; called once by ClassRegistration.
// A new class is one line in domainclasses.cpp.
void registerDomainClasses(ClassRegistration &registration);

} // namespace vexa

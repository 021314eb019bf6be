#include "parameterchoice.h"

#include "membertraits.h"

namespace vexa {

const MemberList &ParameterChoice::staticMembers()
{
    static const MemberList list{
        member("value", &ParameterChoice::value, &ParameterChoice::setValue),
        member("displayText", &ParameterChoice::displayText, &ParameterChoice::setDisplayText),
    };
    return list;
}

} // namespace vexa

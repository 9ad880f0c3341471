#include "titlectl/PictureRules.h"

#include "titlectl/CheckedTitle.h"
#include "titlectl/PictureStates.h"

namespace
{

using State = PictureStates::State;

template <State wanted>
void check(const CheckedTitle& title, FindingList& findings)
{
    if (!title.isReadable())
        return;
    for (const PictureStates::Fault& fault : title.pictures().faults())
        if (fault.state == wanted)
            findings.append({title.path(), fault.picture, {}, fault.reason});
}

} // namespace

QList<CheckRule> PictureRules::table()
{
    return {{QStringLiteral("picture-missing"),
             QStringLiteral("a picture or the background of a title is missing"), nullptr,
             check<State::Missing>},
            {QStringLiteral("picture-torn"), QStringLiteral("a picture or the background cannot be decoded"),
             nullptr, check<State::Torn>},
            {QStringLiteral("picture-size"), QStringLiteral("a picture has the wrong size"), nullptr,
             check<State::WrongSize>},
            {QStringLiteral("picture-old"), QStringLiteral("a picture is older than its title"), nullptr,
             check<State::Old>}};
}

#include "desktop/registers/new_day.h"

#include "core/day_refusal.h"
#include "desktop/shell/typed_date.h"

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

bool used_by_another(const registers::DatedRegister& dated, const core::Date& day)
{
    return std::ranges::any_of(
        dated.dates(), [&](const auto& each) { return each.date == day && each.key != dated.open_date()->key; });
}

} // namespace

std::optional<core::Date> ask_new_day(core::Office& office, registers::DatedRegister& dated)
{
    core::Message question{.text = u"New date in place of %1"_s.arg(dated.open_date()->date.shown(office.day_order())),
                           .icon = core::Icon::question};
    while (const auto typed = office.dialogue.ask_text(question)) {
        const auto day = typed_date(office, *typed);
        if (!day || !day->year_known())
            office.dialogue.show(core::day_refusal(*typed, office.day_order()));
        else if (!used_by_another(dated, *day) || dated.change_date(*day)) // The register tells what it refuses.
            return day;
        question.more = u"You typed \"%1\"."_s.arg(*typed);
    }
    return {};
}

} // namespace kindrel::desktop

#include "desktop/registers/new_day.h"

#include "desktop/shell/typed_date.h"

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

/// Says so when what was typed is no day.
bool readable(core::Office& office, const std::optional<core::Date>& day)
{
    if (day && day->year_known())
        return true;
    office.dialogue.show(day ? core::Message{registers::year_missing} : core::bad_date_message(office.day_order()));
    return false;
}

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
        // The register tells what it refuses.
        if (readable(office, day) && (!used_by_another(dated, *day) || dated.change_date(*day)))
            return day;
        question.more = u"You typed \"%1\"."_s.arg(*typed);
    }
    return {};
}

} // namespace kindrel::desktop

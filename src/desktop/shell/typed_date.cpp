#include "desktop/shell/typed_date.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

std::optional<core::Date> typed_date(const core::Office& office, const QString& typed)
{
    const QString text = typed.trimmed();
    const QDate today = office.clock.today();
    if (text.compare(u"t"_s, Qt::CaseInsensitive) == 0)
        return core::Date::from(today);
    if (!text.startsWith(u'+') && !text.startsWith(u'-'))
        return core::parse_date(text, office.day_order(), today);
    bool number = false;
    const QDate day = today.addDays(text.toInt(&number));
    const auto date = core::Date::from(day);
    return number && date.valid() ? std::optional(date) : std::nullopt;
}

QString date_pattern(core::DayOrder order)
{
    return order == core::DayOrder::month_first ? u"MM/DD/YYYY"_s : u"DD/MM/YYYY"_s;
}

} // namespace kindrel::desktop

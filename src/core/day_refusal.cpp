#include "core/day_refusal.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

Message day_refusal(const QString& typed, DayOrder order)
{
    for (const auto& ending : {u""_s, u"/XXXX"_s, u"XXXX"_s}) {
        const auto date = parse_date(typed.trimmed() + ending, order, {});
        if (date && !date->year_known())
            return {year_missing};
    }
    return bad_date_message(order);
}

} // namespace kindrel::core

#include "registers/day_refusal.h"

namespace kindrel::registers {

using namespace Qt::StringLiterals;

core::Message day_refusal(const QString& typed, core::DayOrder order)
{
    for (const auto& ending : {u""_s, u"/XXXX"_s, u"XXXX"_s}) {
        const auto date = core::parse_date(typed.trimmed() + ending, order, {});
        if (date && !date->year_known())
            return {year_missing};
    }
    return core::bad_date_message(order);
}

} // namespace kindrel::registers

#pragma once

#include "core/session.h"

#include <vector>

namespace kindrel::people {

/// A piece of a statement with the values of its question marks, in their order.
struct Condition
{
    QString text;
    std::vector<core::Value> values = {};
};

template <class... V>
[[nodiscard]] Condition condition(const QString& text, const V&... values)
{
    return {text, {core::to_value(values)...}};
}

/// Puts pieces one behind the other with their values.
inline Condition& operator+=(Condition& left, const Condition& right)
{
    left.text += right.text;
    left.values.insert(left.values.end(), right.values.begin(), right.values.end());
    return left;
}
inline Condition& operator+=(Condition& left, const QString& text)
{
    left.text += text;
    return left;
}

/// In brackets, " AND " or " OR " between them; at least one.
[[nodiscard]] inline Condition joined(const std::vector<Condition>& parts, QStringView between)
{
    Condition whole;
    for (const auto& part : parts) {
        whole += whole.text.isEmpty() ? QString(u'(') : between.toString();
        whole += part;
    }
    return whole += QString(u')');
}

} // namespace kindrel::people

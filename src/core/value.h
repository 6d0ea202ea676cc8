#pragma once

#include "core/date.h"

#include <QByteArray>
#include <QString>

#include <concepts>
#include <optional>
#include <variant>

namespace kindrel::core {

/// Money or a weekly figure in whole ten-thousandths.
struct Amount
{
    qint64 ten_thousandths = 0;

    auto operator<=>(const Amount&) const = default;
};

/// What can be bound to a statement.
using Value = std::variant<std::monostate, qint64, QString, QByteArray>;

inline Value to_value(const Value& value)
{
    return value;
}
inline Value to_value(const std::same_as<bool> auto& flag)
{
    return qint64{flag ? -1 : 0};
}
template <class Number>
requires(std::integral<Number> && !std::same_as<Number, bool>) Value to_value(Number number)
{
    return static_cast<qint64>(number);
}
template <class Code>
requires std::is_enum_v<Code> Value to_value(Code code)
{
    return static_cast<qint64>(code);
}
/// Empty text is NULL.
inline Value to_value(const QString& text)
{
    return text.isEmpty() ? Value{} : Value{text};
}
inline Value to_value(const QByteArray& bytes)
{
    return bytes.isEmpty() ? Value{} : Value{bytes};
}
inline Value to_value(const Date& date)
{
    return to_value(date.stored());
}
inline Value to_value(const Amount& amount)
{
    return amount.ten_thousandths;
}
template <class Inner>
Value to_value(const std::optional<Inner>& maybe)
{
    return maybe ? to_value(*maybe) : Value{};
}

} // namespace kindrel::core

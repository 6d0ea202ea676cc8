#pragma once

#include "output/custom/custom_layout.h"

#include <span>

namespace kindrel::output {

/// The words of a layout's text, shared by those who read and write it.

template <class Value>
struct LayoutWord
{
    QStringView word;
    Value value;
};

[[nodiscard]] std::span<const LayoutWord<LayoutKind>> layout_kind_words();
[[nodiscard]] std::span<const LayoutWord<LayoutPlace>> layout_place_words();
[[nodiscard]] std::span<const LayoutWord<pages::Align>> layout_align_words();
[[nodiscard]] std::span<const LayoutWord<LayoutLines>> layout_line_words();
[[nodiscard]] std::span<const LayoutWord<QRgb>> layout_colour_words();

/// The styles that every layout has.
enum class BuiltInStyle { body, caption, small, heading, heading2, heading3 };
[[nodiscard]] std::span<const LayoutWord<BuiltInStyle>> built_in_styles();

template <class Value>
[[nodiscard]] std::optional<Value> value_of(std::span<const LayoutWord<Value>> words, QStringView word)
{
    for (const auto& one : words) {
        if (one.word.compare(word, Qt::CaseInsensitive) == 0)
            return one.value;
    }
    return std::nullopt;
}

template <class Value>
[[nodiscard]] QString word_of(std::span<const LayoutWord<Value>> words, const Value& value)
{
    for (const auto& one : words) {
        if (one.value == value)
            return one.word.toString();
    }
    return {};
}

template <class Value>
[[nodiscard]] QStringList all_of(std::span<const LayoutWord<Value>> words)
{
    QStringList all;
    for (const auto& one : words)
        all += one.word.toString();
    return all;
}

struct LayoutToken
{
    enum class Kind { word, text, field, bar, open, close };
    Kind kind = Kind::word;
    QString text = {}; ///< Of a word or a quoted text.
    LayoutField field = {};
};

/// The tokens of a line. What cannot be read is passed over and told in `faults`.
[[nodiscard]] std::vector<LayoutToken> layout_tokens(QStringView line, QStringList& faults);

/// The one of `known` that was probably meant; empty when none is near.
[[nodiscard]] QString nearest_word(const QString& word, const QStringList& known);
/// `; did you mean "surname"?`, or nothing.
[[nodiscard]] QString did_you_mean(const QString& word, const QStringList& known);

} // namespace kindrel::output

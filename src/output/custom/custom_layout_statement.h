#pragma once

#include "output/custom/custom_layout_words.h"

namespace kindrel::output {

/// The smallest and the largest number that makes sense somewhere.
struct LayoutRange
{
    double least, most;
};

/// One line of a layout's text, read token by token. What is wrong with it goes to the faults under its number.
class LayoutStatement
{
public:
    LayoutStatement(int line, QStringView text, std::vector<LayoutFault>& faults);

    [[nodiscard]] int line() const { return m_line; }
    [[nodiscard]] bool at_end() const { return m_at == m_tokens.size(); }
    /// The line's words in small letters with single blanks; nothing when it holds anything but words.
    [[nodiscard]] QString plain_words() const;
    /// The next token's word in small letters, whatever it is; empty for other tokens and at the end.
    [[nodiscard]] QString word_here() const;
    [[nodiscard]] const LayoutToken* here() const { return at_end() ? nullptr : &m_tokens[m_at]; }
    void pass() { m_at += at_end() ? 0 : 1; }
    /// Passes over the word when it is the next one.
    [[nodiscard]] bool take(QStringView word);
    [[nodiscard]] std::optional<QString> take_text();
    [[nodiscard]] std::optional<LayoutField> take_field();
    /// Points; "15mm", "1.5cm", "1in" and "12pt" are lengths too.
    [[nodiscard]] std::optional<double> take_length();

    /// A length in the range; 0 after telling that `what` needs one.
    double length(QStringView what, LayoutRange range);
    /// A text; empty after telling that `what` needs one.
    QString text(QStringView what);
    /// A word of the table; `otherwise` after telling which there are.
    template <class Value>
    Value choice(QStringView what, std::span<const LayoutWord<Value>> words, const Value& otherwise)
    {
        const auto value = value_of(words, word_here());
        if (!value)
            fault(QStringLiteral("\"%1\" can be %2%3").arg(what, all_of(words).join(QStringLiteral(", ")), instead()));
        pass();
        return value.value_or(otherwise);
    }

    void fault(const QString& text);
    [[nodiscard]] bool faulty() const { return m_faulty; }
    /// Tells of what is left over.
    void end();
    /// `, but not "…"` of the next token; nothing at the end.
    [[nodiscard]] QString instead() const;

private:
    int m_line;
    std::vector<LayoutToken> m_tokens;
    std::size_t m_at = 0;
    bool m_faulty = false;
    std::vector<LayoutFault>& m_faults;
};

} // namespace kindrel::output

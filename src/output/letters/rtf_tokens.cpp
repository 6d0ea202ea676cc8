#include "output/letters/rtf_tokens.h"

namespace kindrel::output {

namespace {

constexpr int most_digits = 9;

bool is_letter(char c)
{
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

bool is_digit(char c)
{
    return c >= '0' && c <= '9';
}

bool is_line_end(char c)
{
    return c == '\r' || c == '\n' || c == '\0';
}

bool ends_text(char c)
{
    return c == '{' || c == '}' || c == '\\' || is_line_end(c);
}

} // namespace

RtfToken RtfTokens::next()
{
    while (!at_end() && is_line_end(m_bytes[m_at]))
        ++m_at;
    if (at_end())
        return {};
    switch (m_bytes[m_at]) {
    case '{':
        ++m_at;
        return {RtfToken::Kind::open};
    case '}':
        ++m_at;
        return {RtfToken::Kind::close};
    case '\\':
        ++m_at;
        return control();
    default:
        return text();
    }
}

RtfToken RtfTokens::text()
{
    const auto start = m_at;
    while (!at_end() && !ends_text(m_bytes[m_at]))
        ++m_at;
    return {RtfToken::Kind::text, m_bytes.sliced(start, m_at - start)};
}

RtfToken RtfTokens::control()
{
    if (at_end())
        return {RtfToken::Kind::fault};
    if (is_letter(m_bytes[m_at]))
        return control_word();
    if (m_bytes[m_at] == '\'')
        return hex();
    return {RtfToken::Kind::symbol, m_bytes.sliced(m_at++, 1)};
}

RtfToken RtfTokens::hex()
{
    ++m_at;
    if (m_bytes.size() - m_at < 2)
        return {RtfToken::Kind::fault};
    bool right = false;
    const int byte = m_bytes.sliced(m_at, 2).toByteArray().toInt(&right, 16);
    m_at += 2;
    if (!right || byte < 0)
        return {RtfToken::Kind::fault};
    return {RtfToken::Kind::hex, {}, byte};
}

RtfToken RtfTokens::control_word()
{
    const auto start = m_at;
    while (!at_end() && is_letter(m_bytes[m_at]))
        ++m_at;
    RtfToken token{RtfToken::Kind::word, m_bytes.sliced(start, m_at - start)};
    if (!take_number(token))
        return {RtfToken::Kind::fault};
    if (!at_end() && m_bytes[m_at] == ' ')
        ++m_at;
    if (token.bytes != QByteArrayView("bin"))
        return token;
    if (token.number < 0 || token.number > m_bytes.size() - m_at)
        return {RtfToken::Kind::fault};
    m_at += token.number;
    return {RtfToken::Kind::binary, m_bytes.sliced(m_at - token.number, token.number)};
}

bool RtfTokens::take_number(RtfToken& token)
{
    const bool negative = !at_end() && m_bytes[m_at] == '-';
    auto at = m_at + (negative ? 1 : 0);
    int digits = 0;
    while (at < m_bytes.size() && is_digit(m_bytes[at])) {
        if (++digits > most_digits)
            return false;
        token.number = token.number * 10 + (m_bytes[at++] - '0');
    }
    if (digits == 0)
        return true;
    token.numbered = true;
    token.number = negative ? -token.number : token.number;
    m_at = at;
    return true;
}

} // namespace kindrel::output

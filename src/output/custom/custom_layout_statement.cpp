#include "output/custom/custom_layout_statement.h"

#include <cmath>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

struct Unit
{
    QStringView name;
    double points;
};

constexpr std::array units{Unit{u"mm", 72 / 25.4}, Unit{u"cm", 72 / 2.54}, Unit{u"in", 72}, Unit{u"pt", 1}};
constexpr double fineness = 100; ///< Lengths are kept to the hundredth of a point, so that they can be written again.

std::optional<double> points_of(QStringView word)
{
    double factor = 1;
    for (const auto& unit : units) {
        if (word.endsWith(unit.name, Qt::CaseInsensitive)) {
            word.chop(unit.name.size());
            factor = unit.points;
            break;
        }
    }
    bool fine = false;
    const auto number = word.toDouble(&fine);
    if (!fine || !std::isfinite(number))
        return std::nullopt;
    return std::round(number * factor * fineness) / fineness;
}

QString shown(const LayoutToken& token)
{
    using Kind = LayoutToken::Kind;
    switch (token.kind) {
    case Kind::field:
        return u'[' + token.field.name + u']';
    case Kind::bar:
        return u"|"_s;
    case Kind::open:
        return u"{"_s;
    case Kind::close:
        return u"}"_s;
    case Kind::word:
    case Kind::text:
        break;
    }
    return token.text;
}

} // namespace

LayoutStatement::LayoutStatement(int line, QStringView text, std::vector<LayoutFault>& faults)
    : m_line(line), m_faults(faults)
{
    QStringList unreadable;
    m_tokens = layout_tokens(text, unreadable);
    for (const auto& one : unreadable)
        fault(one);
}

QString LayoutStatement::plain_words() const
{
    QStringList words;
    for (const auto& token : m_tokens) {
        if (token.kind != LayoutToken::Kind::word)
            return {};
        words += token.text.toLower();
    }
    return words.join(u' ');
}

QString LayoutStatement::word_here() const
{
    return !at_end() && here()->kind == LayoutToken::Kind::word ? here()->text.toLower() : QString();
}

bool LayoutStatement::take(QStringView word)
{
    const bool found = word_here() == word;
    if (found)
        pass();
    return found;
}

std::optional<QString> LayoutStatement::take_text()
{
    if (at_end() || here()->kind != LayoutToken::Kind::text)
        return std::nullopt;
    return m_tokens[m_at++].text;
}

std::optional<LayoutField> LayoutStatement::take_field()
{
    if (at_end() || here()->kind != LayoutToken::Kind::field)
        return std::nullopt;
    return m_tokens[m_at++].field;
}

std::optional<double> LayoutStatement::take_length()
{
    const auto points = points_of(word_here());
    if (points)
        pass();
    return points;
}

double LayoutStatement::length(QStringView what, LayoutRange range)
{
    const auto found = instead();
    const auto points = take_length();
    if (points && *points >= range.least && *points <= range.most)
        return *points;
    fault(u"\"%1\" needs a number from %2 to %3 here%4"_s.arg(what, QString::number(range.least),
                                                              QString::number(range.most), found));
    if (!points)
        pass();
    return range.least;
}

QString LayoutStatement::text(QStringView what)
{
    if (auto text = take_text())
        return *text;
    fault(u"\"%1\" needs a text in quotation marks%2"_s.arg(what, instead()));
    pass();
    return {};
}

void LayoutStatement::fault(const QString& text)
{
    m_faulty = true;
    m_faults.push_back({m_line, text});
}

void LayoutStatement::end()
{
    if (!at_end())
        fault(u"\"%1\" has no meaning at this place of the line"_s.arg(shown(*here()).left(40)));
}

QString LayoutStatement::instead() const
{
    return at_end() ? QString() : u", but not \"%1\""_s.arg(shown(*here()).left(40));
}

} // namespace kindrel::output

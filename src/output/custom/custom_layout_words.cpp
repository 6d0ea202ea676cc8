#include "output/custom/custom_layout_words.h"

#include <algorithm>
#include <numeric>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array kinds{LayoutWord<LayoutKind>{u"report per family", LayoutKind::families},
                           LayoutWord<LayoutKind>{u"report per person", LayoutKind::people},
                           LayoutWord<LayoutKind>{u"receipt", LayoutKind::receipts}};

constexpr std::array places{
    LayoutWord<LayoutPlace>{u"page header", LayoutPlace::page_header},
    LayoutWord<LayoutPlace>{u"page footer", LayoutPlace::page_footer},
    LayoutWord<LayoutPlace>{u"start", LayoutPlace::start},
    LayoutWord<LayoutPlace>{u"each family", LayoutPlace::family},
    LayoutWord<LayoutPlace>{u"each person", LayoutPlace::person},
    LayoutWord<LayoutPlace>{u"each giver", LayoutPlace::giver},
    LayoutWord<LayoutPlace>{u"end of group", LayoutPlace::end_of_group},
    LayoutWord<LayoutPlace>{u"end", LayoutPlace::end},
};

constexpr std::array aligns{LayoutWord<pages::Align>{u"left", pages::Align::left},
                            LayoutWord<pages::Align>{u"centre", pages::Align::centre},
                            LayoutWord<pages::Align>{u"right", pages::Align::right},
                            LayoutWord<pages::Align>{u"justified", pages::Align::justified}};

constexpr std::array line_words{LayoutWord<LayoutLines>{u"plain", LayoutLines::none},
                                LayoutWord<LayoutLines>{u"rows", LayoutLines::rows},
                                LayoutWord<LayoutLines>{u"grid", LayoutLines::grid}};

constexpr std::array colours{LayoutWord<QRgb>{u"black", 0xff000000}, LayoutWord<QRgb>{u"grey", 0xff5a5a5a},
                             LayoutWord<QRgb>{u"red", 0xffb00020},   LayoutWord<QRgb>{u"green", 0xff1b6e3c},
                             LayoutWord<QRgb>{u"blue", 0xff1f4e8c},  LayoutWord<QRgb>{u"brown", 0xff7a4a1e},
                             LayoutWord<QRgb>{u"purple", 0xff6a2c80}};

constexpr std::array styles{LayoutWord<BuiltInStyle>{u"body", BuiltInStyle::body},
                            LayoutWord<BuiltInStyle>{u"caption", BuiltInStyle::caption},
                            LayoutWord<BuiltInStyle>{u"small", BuiltInStyle::small},
                            LayoutWord<BuiltInStyle>{u"heading", BuiltInStyle::heading},
                            LayoutWord<BuiltInStyle>{u"heading2", BuiltInStyle::heading2},
                            LayoutWord<BuiltInStyle>{u"heading3", BuiltInStyle::heading3}};

/// Reads one line from left to right.
class LineReader
{
public:
    LineReader(QStringView line, QStringList& faults) : m_line(line), m_faults(faults) {}

    std::vector<LayoutToken> tokens()
    {
        std::vector<LayoutToken> all;
        for (skip_blanks(); !at_end(); skip_blanks()) {
            const auto start = m_at;
            if (auto token = next())
                all.push_back(std::move(*token));
            m_at = std::max(m_at, start + 1);
        }
        return all;
    }

private:
    [[nodiscard]] bool at_end() const { return m_at >= m_line.size(); }
    [[nodiscard]] QChar here() const { return at_end() ? QChar() : m_line[m_at]; }
    [[nodiscard]] bool at_mark() const { return at_end() || here().isSpace() || u"\"[]{}|"_s.contains(here()); }

    void skip_blanks()
    {
        while (!at_end() && here().isSpace())
            ++m_at;
    }

    QString word()
    {
        const auto start = m_at;
        while (!at_mark())
            ++m_at;
        return m_line.sliced(start, m_at - start).toString();
    }

    /// From the opening quotation mark to behind the closing one; a doubled mark stands for itself.
    QString quoted()
    {
        QString text;
        for (++m_at; !at_end(); ++m_at) {
            if (here() == u'"' && (m_at + 1 >= m_line.size() || m_line[m_at + 1] != u'"')) {
                ++m_at;
                return text;
            }
            if (here() == u'"')
                ++m_at;
            text += here();
        }
        m_faults += u"the text \"%1\" has no closing quotation mark"_s.arg(text.left(40));
        return text;
    }

    std::optional<LayoutToken> next()
    {
        using Kind = LayoutToken::Kind;
        switch (here().unicode()) {
        case u'"':
            return LayoutToken{Kind::text, quoted()};
        case u'[':
            return field();
        case u'|':
            return LayoutToken{Kind::bar};
        case u'{':
            return LayoutToken{Kind::open};
        case u'}':
            return LayoutToken{Kind::close};
        case u']':
            m_faults += u"a \"]\" stands here without the \"[\" that a field begins with"_s;
            return std::nullopt;
        default:
            return LayoutToken{Kind::word, word()};
        }
    }

    std::optional<LayoutToken> field()
    {
        ++m_at;
        skip_blanks();
        LayoutField field{word()};
        for (skip_blanks(); !at_end() && here() != u']'; skip_blanks()) {
            if (!take_option(field))
                return std::nullopt;
        }
        if (at_end()) {
            m_faults += u"the field \"[%1\" has no closing \"]\""_s.arg(field.name);
            return std::nullopt;
        }
        ++m_at;
        return LayoutToken{LayoutToken::Kind::field, {}, field};
    }

    /// The item's name, or how several values are joined. False, with the rest of the line passed over, for anything
    /// else.
    bool take_option(LayoutField& field)
    {
        if (here() == u'"') {
            field.item = quoted();
            return true;
        }
        const auto option = word();
        skip_blanks();
        if (option.compare(u"lines", Qt::CaseInsensitive) == 0) {
            field.joint = u"\n"_s;
            return true;
        }
        if (option.compare(u"joined", Qt::CaseInsensitive) == 0 && here() == u'"') {
            field.joint = quoted();
            return true;
        }
        m_faults += u"in the field [%1] can stand the name of an item in quotation marks, \"lines\", or \"joined\" "
                    "with a text, but not \"%2\""_s.arg(field.name, option.isEmpty() ? QString(here()) : option);
        m_at = m_line.size();
        return false;
    }

    QStringView m_line;
    QStringList& m_faults;
    qsizetype m_at = 0;
};

/// How many letters must be changed, added, left out or exchanged with their neighbour.
qsizetype distance(const QString& from, const QString& to)
{
    std::vector<qsizetype> before, above(std::size_t(to.size()) + 1), row(above.size());
    std::iota(above.begin(), above.end(), 0);
    for (qsizetype i = 0; i < from.size(); ++i) {
        row[0] = i + 1;
        for (qsizetype j = 0; j < to.size(); ++j) {
            const auto k = std::size_t(j);
            row[k + 1] = std::min({above[k] + (from[i] == to[j] ? 0 : 1), above[k + 1] + 1, row[k] + 1});
            if (i > 0 && j > 0 && from[i] == to[j - 1] && from[i - 1] == to[j])
                row[k + 1] = std::min(row[k + 1], before[k - 1] + 1);
        }
        before = above;
        above = row;
    }
    return above.back();
}

} // namespace

std::span<const LayoutWord<LayoutKind>> layout_kind_words()
{
    return kinds;
}

std::span<const LayoutWord<LayoutPlace>> layout_place_words()
{
    return places;
}

std::span<const LayoutWord<pages::Align>> layout_align_words()
{
    return aligns;
}

std::span<const LayoutWord<LayoutLines>> layout_line_words()
{
    return line_words;
}

std::span<const LayoutWord<QRgb>> layout_colour_words()
{
    return colours;
}

std::span<const LayoutWord<BuiltInStyle>> built_in_styles()
{
    return styles;
}

std::vector<LayoutToken> layout_tokens(QStringView line, QStringList& faults)
{
    return LineReader(line, faults).tokens();
}

QString nearest_word(const QString& word, const QStringList& known)
{
    constexpr qsizetype longest = 60; // Nobody misspells a name at greater length.
    if (word.isEmpty() || word.size() > longest)
        return {};
    QString nearest;
    auto least = std::max(qsizetype(1), word.size() / 3) + 1;
    for (const auto& one : known) {
        if (const auto steps = distance(word.toLower(), one.toLower()); steps < least) {
            least = steps;
            nearest = one;
        }
    }
    return nearest;
}

QString did_you_mean(const QString& word, const QStringList& known)
{
    const auto nearest = nearest_word(word, known);
    return nearest.isEmpty() ? QString() : u"; did you mean \"%1\"?"_s.arg(nearest);
}

} // namespace kindrel::output

#include "pages/text_metrics.h"

#include <algorithm>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr int common_letters = 0x250;
constexpr qsizetype most_remembered = 4096;
/// Kerning may widen a text beyond the sum of its letters by no more than this.
constexpr qreal kerning_allowance = 1.02;

QString printing_family(const QString& family)
{
    if (family.compare("Arial"_L1, Qt::CaseInsensitive) == 0)
        return u"Liberation Sans"_s;
    if (family.compare("Arial Narrow"_L1, Qt::CaseInsensitive) == 0)
        return u"Liberation Sans Narrow"_s;
    return family;
}

bool common(QChar c)
{
    const auto code = c.unicode();
    return code >= 0x20 && code < common_letters && (code < 0x7f || code > 0xa0) && code != 0xad;
}

} // namespace

QFont reference_font(const TextStyle& style)
{
    QFont font(printing_family(style.family));
    font.setPixelSize(std::max(1, qRound(style.size * units_per_point)));
    font.setHintingPreference(QFont::PreferNoHinting);
    font.setBold(style.bold);
    font.setItalic(style.italic);
    font.setUnderline(style.underline);
    return font;
}

struct TextMetrics::Face
{
    explicit Face(const TextStyle& look) : style(look), font(reference_font(look)), metrics(font) { advances.fill(-1); }

    qreal advance(QChar c)
    {
        auto& known = advances[c.unicode()];
        if (known < 0)
            known = metrics.horizontalAdvance(c);
        return known;
    }

    TextStyle style;
    QFont font;
    QFontMetricsF metrics;
    std::array<qreal, common_letters> advances;
    QHash<QString, qreal> widths;
};

TextMetrics::TextMetrics() = default;
TextMetrics::~TextMetrics() = default;

TextMetrics::Face& TextMetrics::face(const TextStyle& style)
{
    const auto known =
        std::ranges::find(m_faces, style, [](const auto& face) -> const TextStyle& { return face->style; });
    return known != m_faces.end() ? **known : *m_faces.emplace_back(std::make_unique<Face>(style));
}

const QFont& TextMetrics::font(const TextStyle& style)
{
    return face(style).font;
}

qreal TextMetrics::ascent(const TextStyle& style)
{
    return face(style).metrics.ascent() / units_per_point;
}

qreal TextMetrics::line_height(const TextStyle& style)
{
    return face(style).metrics.lineSpacing() / units_per_point;
}

qreal TextMetrics::width(const QString& text, const TextStyle& style)
{
    auto& with = face(style);
    if (const auto known = with.widths.constFind(text); known != with.widths.cend())
        return *known;
    if (with.widths.size() >= most_remembered)
        with.widths.clear();
    return *with.widths.insert(text, with.metrics.horizontalAdvance(text) / units_per_point);
}

std::optional<qreal> TextMetrics::plain_width(const QString& text, const TextStyle& style, qreal room)
{
    auto& with = face(style);
    const auto most = room * units_per_point / kerning_allowance;
    qreal sum = 0;
    for (const QChar c : text) {
        if (!common(c) || (sum += with.advance(c)) > most)
            return std::nullopt;
    }
    return sum / units_per_point;
}

QString TextMetrics::elided(const QString& text, const TextStyle& style, qreal room)
{
    return face(style).metrics.elidedText(text, Qt::ElideRight, room * units_per_point);
}

} // namespace kindrel::pages

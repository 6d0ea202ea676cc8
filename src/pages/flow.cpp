#include "pages/flow.h"

#include "pages/composer.h"
#include "pages/text_metrics.h"

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr qreal band_padding = 4;

} // namespace

QString filing_letter(const QString& key)
{
    for (const QChar c : key.trimmed().normalized(QString::NormalizationForm_KD)) {
        if (!c.isMark())
            return c.isLetter() ? QString(c).toUpper() : u"#"_s;
    }
    return u"#"_s;
}

Flow::Flow(PageSpool& spool, const PageSetup& setup, const TypeScale& type)
    : Writer(std::make_shared<TextMetrics>(), type, setup.column_width()),
      m_composer(std::make_unique<Composer>(spool, setup, shared_metrics(), type))
{
}

Flow::~Flow() = default;

void Flow::set_header(BandWriter write)
{
    m_composer->set_header(std::move(write));
}

void Flow::set_footer(BandWriter write)
{
    m_composer->set_footer(std::move(write));
}

const PageSetup& Flow::setup() const
{
    return m_composer->setup();
}

void Flow::separator(const QString& key)
{
    const auto letter = filing_letter(key);
    if (letter == m_letter)
        return;
    m_letter = letter;
    const auto& style = type().separator;
    const auto height = metrics().line_height(style) + 2;
    const auto baseline = (height - metrics().line_height(style)) / 2 + metrics().ascent(style);
    const auto wide = metrics().width(letter, style);
    space(style.size * 0.5);
    write({.height = height,
           .items = {RectsItem{.rects = {{0, 0, width(), height}}, .fill = ink::shade},
                     TextItem{.at = {band_padding, baseline}, .width = wide, .style = style, .text = letter}},
           .glue = Glue::to_next});
    write({.height = style.size * 0.4, .kind = BlockKind::space, .glue = Glue::to_next});
}

void Flow::next_column()
{
    m_composer->next_column();
}

void Flow::next_page()
{
    m_composer->next_page();
}

void Flow::finish()
{
    m_composer->finish();
}

void Flow::put(Block block)
{
    m_composer->add(std::move(block));
}

qreal Flow::place_height()
{
    return m_composer->column_height();
}

Keep::Keep(Flow& flow) : m_flow(flow)
{
    m_flow.m_composer->open_keep();
}

Keep::~Keep()
{
    m_flow.m_composer->close_keep();
}

} // namespace kindrel::pages

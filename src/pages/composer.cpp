#include "pages/composer.h"

#include <algorithm>
#include <cassert>

namespace kindrel::pages {

namespace {

constexpr qreal band_distance = 8; ///< Between header or footer and the columns.
constexpr qreal tolerance = 0.01;

// Of the page's height between its margins.
constexpr qreal most_of_header = 0.5;
constexpr qreal least_of_columns = 0.125;

/// Of the blocks without the spaces at their end, which may run off the column.
qreal height_needed(std::span<const Block> group)
{
    while (!group.empty() && group.back().kind == BlockKind::space)
        group = group.first(group.size() - 1);
    qreal height = 0;
    for (const auto& block : group)
        height += block.height;
    return height;
}

/// A header that is too high loses its end, and a footer its beginning, so that something of the report always stands
/// between them.
void cut_to_room(Blocks& head, Blocks& foot, qreal room)
{
    while (height_of(head) > room * most_of_header)
        head.pop_back();
    while (!foot.empty() && height_of(head) + height_of(foot) + 2 * band_distance > room * (1 - least_of_columns))
        foot.erase(foot.begin());
}

} // namespace

Composer::Composer(PageSpool& spool, const PageSetup& setup, std::shared_ptr<TextMetrics> metrics,
                   const TypeScale& type)
    : m_spool(spool), m_setup(setup), m_metrics(std::move(metrics)), m_type(type)
{
}

qreal Composer::column_height()
{
    begin_page();
    return m_bottom - m_top;
}

bool Composer::waiting() const
{
    return (m_keeps > 0 && !m_keep_broken) || (!m_waiting.empty() && m_waiting.back().glue == Glue::to_next);
}

void Composer::add(Block block)
{
    assert(!m_finished);
    if (!waiting())
        place_waiting();
    else if (m_waiting_height > column_height())
        give_up_waiting();
    m_waiting_height += block.height;
    m_waiting.push_back(std::move(block));
}

/// A group that has outgrown the column cannot be kept whole; waiting for its end would only cost memory.
void Composer::give_up_waiting()
{
    m_keep_broken = m_keeps > 0;
    auto glued = m_waiting.end();
    while (glued != m_waiting.begin() && std::prev(glued)->glue == Glue::to_next)
        --glued;
    if (glued == m_waiting.begin())
        glued = m_waiting.end();
    Blocks tail(std::make_move_iterator(glued), std::make_move_iterator(m_waiting.end()));
    m_waiting.erase(glued, m_waiting.end());
    place_waiting();
    m_waiting = std::move(tail);
    m_waiting_height = height_of(m_waiting);
}

void Composer::open_keep()
{
    if (!waiting())
        place_waiting();
    ++m_keeps;
}

void Composer::close_keep()
{
    if (--m_keeps == 0)
        m_keep_broken = false;
}

void Composer::next_column()
{
    place_waiting();
    begin_page();
    turn_column();
}

void Composer::next_page()
{
    place_waiting();
    begin_page();
    end_page();
}

void Composer::finish()
{
    place_waiting();
    if (m_page || m_number == 0) {
        begin_page();
        end_page();
    }
    m_finished = true;
    m_spool.finish();
}

void Composer::place_waiting()
{
    auto group = std::exchange(m_waiting, {});
    m_waiting_height = 0;
    if (!group.empty())
        place(std::span(group));
}

bool Composer::fits(std::span<const Block> group) const
{
    const auto& heading = group.front().heading;
    const auto repeated = m_column_empty && heading ? height_of(*heading) : 0;
    return m_y + repeated + height_needed(group) <= m_bottom + tolerance;
}

void Composer::place(std::span<Block> group)
{
    begin_page();
    if (!fits(group) && !m_column_empty && height_needed(group) <= m_bottom - m_top) {
        turn_column();
        begin_page();
    }
    if (fits(group)) {
        for (auto& block : group)
            draw(block);
    } else {
        place_divided(group);
    }
}

/// Of a group that no column can hold, what is glued still goes together as long as it can.
void Composer::place_divided(std::span<Block> group)
{
    while (!group.empty()) {
        const auto last = std::ranges::find(group, Glue::none, &Block::glue);
        const auto length = size_t(last == group.end() ? group.size() : last - group.begin() + 1);
        auto glued = group.first(length);
        group = group.subspan(length);
        if (!fits(glued) && !m_column_empty && height_needed(glued) <= m_bottom - m_top) {
            turn_column();
            begin_page();
        }
        for (auto& block : glued)
            place(block);
    }
}

void Composer::place(Block& block)
{
    if (!fits(std::span(&block, 1)) && !m_column_empty) {
        turn_column();
        begin_page();
    }
    draw(block);
}

void Composer::draw(Block& block)
{
    begin_page();
    if (block.kind == BlockKind::space) {
        m_y += m_column_empty ? 0 : block.height;
        return;
    }
    if (m_column_empty && block.heading) {
        for (auto again : *block.heading)
            draw(again);
    }
    for (auto& item : block.items)
        m_page->items.push_back(moved(std::move(item), {column_left(), m_y}));
    m_y += block.height;
    m_column_empty = false;
}

qreal Composer::column_left() const
{
    return m_setup.margins.left() + m_column * (m_setup.column_width() + m_setup.column_gap);
}

void Composer::turn_column()
{
    if (m_column + 1 == m_setup.columns) {
        end_page();
        return;
    }
    ++m_column;
    m_y = m_top;
    m_column_empty = true;
}

Blocks Composer::band(const BandWriter& write)
{
    Box box(m_metrics, m_type, m_setup.body_width(), m_setup.size().height() / 3);
    if (write)
        write(box, m_number);
    return box.take();
}

void Composer::draw_band(const Blocks& blocks, qreal top)
{
    for (const auto& block : blocks) {
        for (const auto& item : block.items)
            m_page->items.push_back(moved(item, {m_setup.margins.left(), top}));
        top += block.height;
    }
}

void Composer::begin_page()
{
    if (m_page)
        return;
    ++m_number;
    m_page = Page{.number = m_number, .size = m_setup.size()};
    const auto& margins = m_setup.margins;
    auto head = band(m_header), foot = band(m_footer);
    cut_to_room(head, foot, m_page->size.height() - margins.top() - margins.bottom());
    m_top = margins.top() + (head.empty() ? 0 : height_of(head) + band_distance);
    const auto foot_top = m_page->size.height() - margins.bottom() - height_of(foot);
    m_bottom = foot_top - (foot.empty() ? 0 : band_distance);
    m_y = m_top;
    m_column = 0;
    m_column_empty = true;
    draw_band(head, margins.top());
    draw_band(foot, foot_top);
}

void Composer::end_page()
{
    for (int i = 1; i < m_setup.columns && m_setup.column_rule == ColumnRule::hairline; ++i) {
        const auto x =
            m_setup.margins.left() + i * (m_setup.column_width() + m_setup.column_gap) - m_setup.column_gap / 2;
        m_page->items.push_back(LineItem{{x, m_top}, {x, m_bottom}, 0.4, ink::hairline});
    }
    m_spool.append(*m_page);
    m_page.reset();
}

} // namespace kindrel::pages

#pragma once

#include "pages/flow.h"

namespace kindrel::pages {

/// Puts blocks into columns and columns on pages. What belongs together waits until it is complete.
class Composer
{
public:
    Composer(PageSpool& spool, const PageSetup& setup, std::shared_ptr<TextMetrics> metrics, const TypeScale& type);

    void set_header(BandWriter write) { m_header = std::move(write); }
    void set_footer(BandWriter write) { m_footer = std::move(write); }
    [[nodiscard]] const PageSetup& setup() const { return m_setup; }

    void add(Block block);
    void open_keep();
    void close_keep();
    void next_column();
    void next_page();
    void finish();
    [[nodiscard]] qreal column_height();

private:
    [[nodiscard]] bool waiting() const;
    void place_waiting();
    void give_up_waiting();
    void place(std::span<Block> group);
    void place_divided(std::span<Block> group);
    void place(Block& block);
    void draw(Block& block);
    [[nodiscard]] bool fits(std::span<const Block> group) const;

    void begin_page();
    void end_page();
    void turn_column();
    [[nodiscard]] Blocks band(const BandWriter& write);
    void draw_band(const Blocks& blocks, qreal top);
    [[nodiscard]] qreal column_left() const;

    PageSpool& m_spool;
    PageSetup m_setup;
    std::shared_ptr<TextMetrics> m_metrics;
    TypeScale m_type;
    BandWriter m_header;
    BandWriter m_footer;

    Blocks m_waiting;
    qreal m_waiting_height = 0;
    int m_keeps = 0;
    bool m_keep_broken = false; ///< What the open keep holds is known to be too high.

    std::optional<Page> m_page;
    int m_number = 0; ///< Of the page begun last.
    int m_column = 0;
    qreal m_top = 0;    ///< Of the columns of this page.
    qreal m_bottom = 0; ///< Likewise.
    qreal m_y = 0;
    bool m_column_empty = true;
    bool m_finished = false;
};

} // namespace kindrel::pages

#pragma once

#include "output/letters/letter_merge.h"
#include "pages/flow.h"
#include "pages/text_metrics.h"

#include <QHash>

namespace kindrel::output {

/// Writes a letter's copies into a flow, one after another. What is the same in all of them is laid out once.
class LetterPages
{
public:
    /// `letter` must outlive it. Text sizes are multiplied by `text_percent` / 100.
    LetterPages(const LetterForm& letter, pages::Flow& flow, int text_percent);

    void write(const LetterValues& values);

private:
    void lay_out_fixed_parts();
    void write_paragraph(pages::Writer& place, const LetterParagraph& paragraph);
    void write_runs(pages::Writer& place, std::span<const LetterRun> runs, const LetterShape& shape);
    void write_picture(pages::Writer& place, const LetterPicture& picture, const LetterShape& shape);
    /// Turns the page before a paragraph that asks for it.
    void begin_paragraph(const LetterShape& shape);

    const LetterForm& m_letter;
    pages::Flow& m_flow;
    qreal m_scale;
    std::vector<pages::Blocks> m_fixed;            ///< By the places of the parts; empty for those that differ.
    QHash<const char*, pages::Picture> m_pictures; ///< By the letter's own bytes, which all copies share.
    bool m_begun = false;
    bool m_at_top = true;    ///< Nothing of the present copy stands on the present page.
    bool m_page_due = false; ///< The next paragraph begins a page, whatever it asks for.
};

} // namespace kindrel::output

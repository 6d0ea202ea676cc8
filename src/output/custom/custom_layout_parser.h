#pragma once

#include "output/custom/custom_layout_statement.h"

namespace kindrel::output {

/// What the parser knows while it goes from line to line.
struct LayoutText
{
    ParsedLayout parsed;
    std::optional<LayoutPlace> place = {};          ///< The section that is open.
    std::vector<std::pair<QString, int>> said = {}; ///< Statements and sections that may stand once, with their lines.
};

/// Whether the line sets something above the first section, and was read.
[[nodiscard]] bool read_setting(LayoutStatement& statement, LayoutText& text);
/// Whether the line is one of a section's, and was read.
[[nodiscard]] bool read_element(LayoutStatement& statement, LayoutText& text);
/// The words with which these lines begin.
[[nodiscard]] QStringList setting_words();
[[nodiscard]] QStringList element_words();

/// Puts the field's name into its own spelling; tells what is wrong with it where it stands in `place`.
void check_field(LayoutStatement& statement, LayoutField& field, LayoutPlace place);
/// A column between the margins, without headers and footers, on the smaller of the papers.
[[nodiscard]] QSizeF column_room(const CustomLayout& layout);
/// "report per person", "receipt" …: what the whole layout is, for messages.
[[nodiscard]] QString words_of(LayoutKind kind);
[[nodiscard]] QString words_of(LayoutPlace place);
/// Tells of a statement that stands a second time.
void note_once(LayoutStatement& statement, LayoutText& text, const QString& what);

} // namespace kindrel::output

#pragma once

#include "people/family_editor.h"
#include "people/setup_lists.h"

namespace kindrel::desktop {

/// What stands in a column of one of the editor's lists. Item and ministry come from a setup list and are not typed.
enum class Cell { item, ministry, field, tagged, date, contact, phone, event };

struct RowColumn
{
    const char* caption;
    Cell cell;
    int share = 100; ///< Hundredths of the list's width.
};

/// How one of the editor's lists of rows looks.
struct RowListLook
{
    people::RowList list;
    const char* name; ///< The table's object name.
    const char* title;
    const char* one; ///< A row in a sentence: "group" in "Add a group".
    std::vector<RowColumn> columns;
    bool people::RecordAccess::*open;       ///< The section of the record that the list belongs to.
    std::optional<people::SetupKind> items; ///< What is picked from; the rows of other lists are typed.
    std::vector<Cell> typed = {};           ///< What is typed of a new row, in the order of typing.

    [[nodiscard]] QString caption_of(Cell cell) const;
};

[[nodiscard]] const RowListLook& row_list_look(people::RowList list);
[[nodiscard]] inline bool is_typed(Cell cell)
{
    return cell == Cell::field || cell == Cell::date || cell == Cell::contact || cell == Cell::phone ||
           cell == Cell::event;
}
/// Whether Space turns the cell from one state into the other.
[[nodiscard]] inline bool is_switch(Cell cell)
{
    return cell == Cell::tagged || cell == Cell::ministry;
}

/// "(Active) Choir"
[[nodiscard]] QString ministry_words(const QString& ministry, int state);

/// 0 for a person who is not there.
[[nodiscard]] int row_count(const people::FamilyFile& file, people::RowPlace place);
/// As shown, and as it stands in an open cell.
[[nodiscard]] QString cell_text(const people::FamilyFile& file, people::RowPlace place, Cell cell,
                                core::DayOrder order);
[[nodiscard]] bool carries(const people::FamilyFile& file, people::RowPlace place, int item, int type);

/// Of a cell that is typed and no date.
void set_words(people::FamilyFile& file, people::RowPlace place, Cell cell, const QString& words);
void set_date(people::FamilyFile& file, people::RowPlace place, std::optional<core::Date> date);
/// False when the person carries the row's ministry in the other state already.
[[nodiscard]] bool can_switch(const people::FamilyFile& file, people::RowPlace place, Cell cell);
void switch_over(people::FamilyFile& file, people::RowPlace place, Cell cell);

} // namespace kindrel::desktop

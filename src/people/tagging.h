#pragma once

#include "core/office.h"
#include "people/records.h"
#include "people/working_list.h"

#include <QDate>

#include <optional>

namespace kindrel::people {

/// What a bulk change gives or takes.
enum class TagKind { status = 1, group, ministry, date, flexi };

struct TagItem
{
    TagKind kind = TagKind::status;
    int item = 0; ///< 0 while none is chosen.
    QString text = {};
    MinistryState ministry = MinistryState::active;
    std::optional<core::Date> date = {}; ///< Personal dates.
    QString field = {};                  ///< Flexi fields.
    bool tagged = false;                 ///< Dates and flexi fields: marked.

    /// A date of which nobody said which day it is.
    [[nodiscard]] bool lacks_date() const { return kind == TagKind::date && !date; }
    friend bool operator==(const TagItem&, const TagItem&) = default;
};

/// What a bulk change does to the people of a list.
struct TagCount
{
    int changed = 0;    ///< Given the item, or parted from it; dates and flexi fields that get another value too.
    int as_it_was = 0;  ///< Carried it already, or did not.
    int booked_out = 0; ///< Skipped: the family is away.
    int closed = 0;     ///< Skipped: the section of the family's record is closed.
    int replaced = 0;   ///< Of those changed: another value or mark gives way.

    [[nodiscard]] int people() const { return changed + as_it_was + booked_out + closed; }
    /// "84 people change, 3 in booked out families skipped", "20 people get it, 4 get it in place of another value or
    /// mark". Before a change and after it.
    [[nodiscard]] QString words() const;
    friend bool operator==(const TagCount&, const TagCount&) = default;
};

enum class TagAct { give, take };

/// A bulk change that was carried out, with what it found: enough to take it back.
struct BulkChange
{
    TagAct act = TagAct::give;
    TagItem item;
    QDate day;
    TagCount count;
    std::vector<int> added; ///< People who got a row.
    struct Row
    {
        int person_id = 0;
        LinkRow row;
        int position = 0;
    };
    std::vector<Row> before; ///< The rows that were changed or deleted, as they were.
};

/// What tag() would do. Nothing is asked or written; a handful of statements.
[[nodiscard]] TagCount count_tagging(core::Office& office, const WorkingList& list, const TagItem& item, TagAct act);

/// Gives the item to everybody on the list, or takes it from them, in one transaction. A list that was never made is
/// nullopt. A date is not given without its day. Says what stands in the way, and what was done. Nullopt when nothing
/// was done. Throws core::DatabaseError.
[[nodiscard]] std::optional<BulkChange> tag(core::Office& office, const std::optional<WorkingList>& list,
                                            const TagItem& item, TagAct act);

/// Takes a bulk change back as far as its rows are as it left them; the number of people whose rows were changed since
/// and stay. Nullopt, after saying why, for who may not tag now. Throws core::DatabaseError, and then nothing is taken
/// back.
[[nodiscard]] std::optional<int> undo_tagging(core::Office& office, const BulkChange& change);

} // namespace kindrel::people

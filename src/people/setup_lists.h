#pragma once

#include "core/session.h"

#include <QString>

#include <array>
#include <span>
#include <vector>

namespace kindrel::people {

/// The church's own vocabularies, in the order in which they are shown and saved.
enum class SetupKind {
    status,
    groups,
    ministries,
    personal_dates,
    flexi_fields,
    family_groups,
    family_dates,
    titles,
    occupations,
    suburbs
};
inline constexpr int setup_list_count = 10;

/// Where people or families carry the items of a list.
struct Carriers
{
    const char* table;
    const char* owner; ///< `person_id` or `surname_id`.
    const char* item;
    bool by_text; ///< The item's text is stored in place of its key.
};

/// Where a setup list lies. `extra` is a list's further field, or null.
struct SetupList
{
    SetupKind kind;
    QStringView caption; ///< Of the list's tab.
    const char* table;
    const char* key;
    const char* text;
    const char* extra; ///< `not_active` of groups, `postcode` of suburbs.
    const char* query;
    core::Entity entity;
    Carriers carriers;

    [[nodiscard]] bool of_families() const;
};

/// One item of a list; its place is its position.
struct SetupItem
{
    int key = 0; ///< 0 until the first save.
    QString text = {};
    QString postcode = {};   ///< Suburbs.
    bool not_active = false; ///< Groups: no longer meets, kept for its history.
    int users = 0;           ///< People or families that carry it, as they were when the list was read.

    friend bool operator==(const SetupItem&, const SetupItem&) = default;
};

inline constexpr int longest_setup_text = 255;

[[nodiscard]] std::span<const SetupList> setup_lists();
[[nodiscard]] const SetupList& setup_list(SetupKind kind);

/// The list in its order, for pick lists: nothing is counted. One statement.
[[nodiscard]] std::vector<SetupItem> read_setup_items(core::Session& session, SetupKind kind);
/// The list in its order with the users of each item. Two statements.
[[nodiscard]] std::vector<SetupItem> read_setup_items_with_users(core::Session& session, SetupKind kind);

/// A typed or read text as it is stored: without blanks around it, accents joined to their letters.
[[nodiscard]] QString tidy(const QString& text);
/// Which typed field of an item cannot be stored: 1 when it is the postcode alone, else 0.
[[nodiscard]] int faulty_field(SetupKind kind, const QString& text, const QString& postcode);
/// Equal for two items that a list may not hold both: case and surrounding blanks make no difference, and a suburb
/// may stand under several postcodes.
[[nodiscard]] QString sameness(const QString& text, const QString& postcode = {});
[[nodiscard]] inline QString sameness(const SetupItem& item)
{
    return sameness(item.text, item.postcode);
}

} // namespace kindrel::people

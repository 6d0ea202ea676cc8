#pragma once

#include "core/entry.h"

#include <array>
#include <span>

namespace kindrel::registers {

/// The dated registers of a church.
enum class Kind { roll, finance, weekly };
inline constexpr std::array kinds{Kind::roll, Kind::finance, Kind::weekly};

/// A table whose rows belong to a date, and what the rows are called.
struct Belonging
{
    const char16_t* table;
    const char16_t* date_key; ///< Its field that holds the key of the date.
    const char16_t* one;
    const char16_t* many;
    bool typed = true; ///< Written by the register's own save; notes are written on a page of their own.
};

/// The sentence that refuses a project which somebody else is in, and the explanation beneath it; %1 stands for the
/// product.
struct HeldWords
{
    const char16_t* sentence;
    const char16_t* explanation;
};

/// What one register differs in from the others: stored names, counters, lock, rights and words.
struct RegisterKind
{
    Kind kind;

    const char16_t* projects_query;
    const char16_t* project_table;
    const char16_t* project_key;
    const char16_t* project_name;
    const char16_t* entry_position; ///< Fields of `tbl_project_position`.
    const char16_t* output_position;

    const char16_t* dates_query;
    const char16_t* date_table;
    const char16_t* date_key;
    const char16_t* date;
    std::array<Belonging, 3> belongings; ///< Those without a table are none.

    core::Entity project_entity;
    core::Entity date_entity;
    core::LockKind lock;
    core::AreaId area; ///< Any right that opens the area opens the register.
    core::Area right;  ///< The one that is named as missing.

    const char16_t* words; ///< "Weekly Project", within our own sentences.
    const char16_t* no_projects;
    HeldWords held_at_entry;
    HeldWords held_at_removal;
    const char16_t* unsaved_question;

    [[nodiscard]] std::span<const Belonging> belonging_tables() const;
};

/// A stored name as statements write it.
[[nodiscard]] QString named(const char16_t* name);

[[nodiscard]] const RegisterKind& register_kind(Kind kind);

/// Whether the person may work in the register; otherwise says so.
[[nodiscard]] bool permitted(const core::Office& office, const RegisterKind& kind);

} // namespace kindrel::registers

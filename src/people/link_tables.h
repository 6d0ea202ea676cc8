#pragma once

#include "core/entity.h"
#include "people/family_store.h"

#include <span>

namespace kindrel::people {

/// Which of a LinkRow's values a link table stores beside owner and item; a null name means that it has no such field.
struct LinkTable
{
    const char* table;
    const char* load_query;
    const char* owner; ///< `person_id` or `surname_id`.
    const char* item;
    const char* text; ///< The item's text in the load query.
    const char* position;
    const char* type;
    const char* date;
    const char* field;
    const char* tagged;
    Part part; ///< Under which its rows are read.
};

struct PersonLink
{
    LinkTable table;
    std::vector<LinkRow> Person::*rows;
};

struct FamilyLink
{
    LinkTable table;
    std::vector<LinkRow> FamilyFile::*rows;
};

[[nodiscard]] std::span<const PersonLink> person_links();
[[nodiscard]] std::span<const FamilyLink> family_links();

} // namespace kindrel::people

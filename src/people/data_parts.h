#pragma once

#include "core/rights.h"

#include <array>
#include <optional>
#include <span>

namespace kindrel::people {

enum class DataOwner { person, family };
/// What lies in a folder and not in the database.
enum class DataFiles { none, portraits, notebook };
enum class DataForm { text, date, number, ministry_state };

struct DataColumn
{
    const char* name = nullptr; ///< Null where a part has fewer columns.
    DataForm form = DataForm::text;
};

/// A part of the record in which a person or a family may have an entry: up to three columns of a table or view, one
/// row or several for each owner.
struct DataPart
{
    const char* name;
    DataOwner owner;
    const char* table = nullptr; ///< Null for files.
    std::array<DataColumn, 3> columns = {};
    const char* hidden =
        nullptr; ///< Not zero where the entry is unlisted; p is the person, d the details, a the address.
    const char* order = nullptr; ///< Orders the entries of one owner.
    const char* only = nullptr;  ///< Which rows of the table, named v, belong to the part.
    const char* joint = ": ";    ///< Between the columns.
    std::optional<core::Area> right = {};
    DataFiles files = DataFiles::none;
};

/// People's parts first, then those of families.
[[nodiscard]] std::span<const DataPart> data_parts();

} // namespace kindrel::people

#pragma once

#include "core/office.h"
#include "people/data_parts.h"
#include "people/listed_people.h"

#include <QSet>

#include <string_view>

namespace kindrel::people {

/// Somebody with an entry in a part of the record; a family is listed by the person at its head.
struct DataEntry
{
    Member member;
    QString surname = {};
    QString name = {}; ///< As of listed_name(); empty for a family without people.
    PersonStates states = {};
    FileStatus Condition = FileStatus::active; ///< Of the family's file.
    QString value = {};                        ///< Several are parted by "; ".
    QString order = {};                        ///< The value with its dates and numbers as they order.
    bool hidden = false;                       ///< The value is unlisted: nothing for paper or files.
};

/// In order of surname, family and place in it. Hidden entries are found like all others. Nullopt after saying which
/// right is missing. One statement.
[[nodiscard]] std::optional<std::vector<DataEntry>> people_with(core::Office& office, const DataPart& part);
/// The families in which somebody has an entry in the part of this name, unlisted ones too; not for parts that lie in
/// files. One statement. Throws core::DatabaseError.
[[nodiscard]] QSet<int> families_with(core::Session& session, std::string_view part_name);
/// What the list of a part is called: "People with an entry in Birth Date".
[[nodiscard]] QString heading_of(const DataPart& part);

/// Those with the entries of the part as a list to go on with; the first who lives stands for a family. No letter is to
/// go to those who have died.
[[nodiscard]] WorkingList living_with(core::Session& session, const DataPart& part,
                                      const std::vector<DataEntry>& entries);

} // namespace kindrel::people

#pragma once

#include "output/list_reader.h"

#include <QStringList>

namespace kindrel::output {

/// A line of a family data report.
struct DataRow
{
    QString who;        ///< Whom it is about; blank on their further lines.
    QStringList values; ///< One for each column.
    bool begins = true; ///< The first line of somebody, whose name may be blank.
};
using DataRows = std::vector<DataRow>;

/// What the listed people of a family have of one kind, person by person.
[[nodiscard]] DataRows birth_date_rows(const ListedFamily& listed);
[[nodiscard]] DataRows occupation_rows(const ListedFamily& listed);
[[nodiscard]] DataRows status_rows(const ListedFamily& listed);
[[nodiscard]] DataRows group_rows(const ListedFamily& listed);
[[nodiscard]] DataRows ministry_rows(const ListedFamily& listed); ///< Active, then potential.
[[nodiscard]] DataRows individual_date_rows(const ListedFamily& listed);
[[nodiscard]] DataRows flexi_rows(const ListedFamily& listed);
[[nodiscard]] DataRows preferred_name_rows(const ListedFamily& listed);
[[nodiscard]] DataRows school_year_rows(const ListedFamily& listed);
/// Of the family itself, then of its people.
[[nodiscard]] DataRows email_rows(const ListedFamily& listed);

/// What the family has of one kind; `who` is its listed people.
[[nodiscard]] DataRows other_contact_rows(const ListedFamily& listed);
[[nodiscard]] DataRows family_group_rows(const ListedFamily& listed);
[[nodiscard]] DataRows event_rows(const ListedFamily& listed);
[[nodiscard]] DataRows family_date_rows(const ListedFamily& listed);
[[nodiscard]] DataRows visit_rows(const ListedFamily& listed);
[[nodiscard]] DataRows edited_and_created_rows(const ListedFamily& listed);

} // namespace kindrel::output

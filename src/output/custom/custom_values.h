#pragma once

#include "output/custom/custom_fields.h"

namespace kindrel::output::custom {

/// What is stored, as the value of a field.
[[nodiscard]] FieldValues single(const QString& text);
[[nodiscard]] FieldValues single(const FieldSource& source, const std::optional<core::Date>& date);
[[nodiscard]] FieldValues single(int number);
[[nodiscard]] FieldValues listed(const QStringList& texts);

/// The values of a layout's fields that are more than what is stored: a function for each, named like its field.

/// Items with what they carry: "Baptism 12/05/1990", "Blood type: A". A bare item stands for itself.
[[nodiscard]] FieldValues values_of_rows(const people::DisclosedFamily& family,
                                         const std::vector<people::LinkRow>& rows);

FieldValues pages(const FieldSource& source);

FieldValues letter(const FieldSource& source);
FieldValues primary_name(const FieldSource& source);
FieldValues spouse_name(const FieldSource& source);
FieldValues both_names(const FieldSource& source);
FieldValues both_names_and_surname(const FieldSource& source);
FieldValues titled_names(const FieldSource& source);
FieldValues titled_initials(const FieldSource& source);
FieldValues primary_title(const FieldSource& source);
FieldValues spouse_title(const FieldSource& source);
FieldValues children(const FieldSource& source);
FieldValues adults(const FieldSource& source);
FieldValues everybody(const FieldSource& source);
FieldValues and_family(const FieldSource& source);
FieldValues people_in_family(const FieldSource& source);
FieldValues condition(const FieldSource& source);
FieldValues residential_lines(const FieldSource& source);
FieldValues suburb(const FieldSource& source);
FieldValues postcode(const FieldSource& source);
FieldValues suburb_address(const FieldSource& source);
FieldValues postal_lines(const FieldSource& source);
FieldValues postal_suburb(const FieldSource& source);
FieldValues postal_postcode(const FieldSource& source);
FieldValues mailing(const FieldSource& source);
FieldValues other_contacts(const FieldSource& source);
FieldValues events(const FieldSource& source);
FieldValues visits(const FieldSource& source);

FieldValues name(const FieldSource& source);
FieldValues full_name(const FieldSource& source);
FieldValues role(const FieldSource& source);
FieldValues age(const FieldSource& source);
FieldValues school_year(const FieldSource& source);
FieldValues ministries(const FieldSource& source);
FieldValues active_ministries(const FieldSource& source);
FieldValues potential_ministries(const FieldSource& source);

} // namespace kindrel::output::custom

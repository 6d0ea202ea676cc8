#pragma once

#include "output/custom/custom_fields.h"

namespace kindrel::output::custom {

/// The values of a layout's fields that are more than one stored text: a function for each, named like its field.

/// Items with what they carry: "Baptism 12/05/1990", "Blood type: A". A bare item stands for itself.
[[nodiscard]] FieldValues values_of_rows(const people::DisclosedFamily& family,
                                         const std::vector<people::LinkRow>& rows);

FieldValues today(const FieldSource& source);
FieldValues church_name(const FieldSource& source);
FieldValues report_title(const FieldSource& source);
FieldValues filters(const FieldSource& source);
FieldValues group(const FieldSource& source);
FieldValues number(const FieldSource& source);
FieldValues family_count(const FieldSource& source);
FieldValues person_count(const FieldSource& source);
FieldValues page(const FieldSource& source);
FieldValues pages(const FieldSource& source);

FieldValues surname(const FieldSource& source);
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
FieldValues created(const FieldSource& source);
FieldValues last_edit(const FieldSource& source);
FieldValues booked_out_person(const FieldSource& source);
FieldValues booked_out_date(const FieldSource& source);
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
FieldValues person_id(const FieldSource& source);
FieldValues role(const FieldSource& source);
FieldValues position(const FieldSource& source);
FieldValues birthdate(const FieldSource& source);
FieldValues age(const FieldSource& source);
FieldValues school_year(const FieldSource& source);
FieldValues ministries(const FieldSource& source);
FieldValues active_ministries(const FieldSource& source);
FieldValues potential_ministries(const FieldSource& source);

FieldValues project(const FieldSource& source);
FieldValues from(const FieldSource& source);
FieldValues to(const FieldSource& source);
FieldValues total(const FieldSource& source);
FieldValues gifts(const FieldSource& source);
FieldValues gift_list(const FieldSource& source);

} // namespace kindrel::output::custom

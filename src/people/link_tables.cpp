#include "people/link_tables.h"

#include <array>

namespace kindrel::people {

namespace {

const std::array person_tables{
    PersonLink{{"tbl_status", "qry_status_load", "person_id", "status_id", "status", "s_position", nullptr, nullptr,
                nullptr, nullptr, Part::status},
               &Person::status},
    PersonLink{{"tbl_group", "qry_group_load", "person_id", "group_id", "group", "g_position", nullptr, nullptr,
                nullptr, nullptr, Part::groups},
               &Person::groups},
    PersonLink{{"tbl_ministry", "qry_ministry_load", "person_id", "ministry_id", "ministry", "m_position",
                "ministry_type", nullptr, nullptr, nullptr, Part::ministries},
               &Person::ministries},
    PersonLink{{"tbl_flexi", "qry_flexi_load", "person_id", "flexi_id", "flexi", nullptr, nullptr, nullptr,
                "flexi_field", "flexi_tagged", Part::flexi},
               &Person::flexi},
    PersonLink{{"tbl_individual_date", "qry_individual_date_load", "person_id", "in_date_id", "date_description",
                nullptr, nullptr, "in_date", nullptr, "in_date_tagged", Part::dates},
               &Person::dates},
    PersonLink{{"tbl_occupation", "qry_occupation_load", "person_id", "occupation_id", "occupation", nullptr, nullptr,
                nullptr, nullptr, nullptr, Part::occupations},
               &Person::occupations},
};

const std::array family_tables{
    FamilyLink{{"tbl_family_group", "qry_family_group_load", "surname_id", "family_group_id", "family_group",
                "f_position", nullptr, nullptr, nullptr, nullptr, Part::family_groups},
               &FamilyFile::family_groups},
    FamilyLink{{"tbl_family_date", "qry_family_date_load", "surname_id", "family_date_id", "date_description", nullptr,
                nullptr, "family_date", nullptr, "family_date_tagged", Part::family_dates},
               &FamilyFile::family_dates},
};

} // namespace

std::span<const PersonLink> person_links()
{
    return person_tables;
}

std::span<const FamilyLink> family_links()
{
    return family_tables;
}

} // namespace kindrel::people

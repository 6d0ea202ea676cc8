#include "people/field_labels.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace kindrel::people {

namespace {

struct Label
{
    std::string_view name;
    const char* label;
};

constexpr std::array labels{
    Label{"family", "Family"},
    Label{"surname_id", "Key"},
    Label{"condition", "File status"},
    Label{"surname", "Surname"},
    Label{"Primary_name", "Primary person"},
    Label{"created", "File Created"},
    Label{"last_edit", "Last Edit"},
    Label{"booked_out", "Booked out"},
    Label{"booked_out_date", "Booked out on"},
    Label{"booked_out_person", "Booked out to"},
    Label{"active_in_book", "Booked in for editing"},
    Label{"address", "Address"},
    Label{"res_street", "Street"},
    Label{"res_street2", "Street, second line"},
    Label{"res_state", "State"},
    Label{"res_country", "Country"},
    Label{"res_map", "Map"},
    Label{"res_ref", "Map reference"},
    Label{"post_street", "Postal street"},
    Label{"post_street2", "Postal street, second line"},
    Label{"post_state", "Postal state"},
    Label{"post_country", "Postal country"},
    Label{"phone", "Phone"},
    Label{"family_fax", "Family fax"},
    Label{"family_mobile", "Family mobile"},
    Label{"family_email", "Family e-mail"},
    Label{"family_email_description", "Family e-mail belongs to"},
    Label{"res_hidden", "Residential address unlisted"},
    Label{"post_hidden", "Postal address unlisted"},
    Label{"phone_hidden", "Phone unlisted"},
    Label{"family_fax_hidden", "Family fax unlisted"},
    Label{"family_email_hidden", "Family e-mail unlisted"},
    Label{"family_mobile_hidden", "Family mobile unlisted"},
    Label{"transfer_exists", "Transfer mark"},
    Label{"audio_note", "Audio note"},
    Label{"residential_suburb", "Residential suburb"},
    Label{"postal_suburb", "Postal suburb"},
    Label{"suburb", "Suburb"},
    Label{"postcode", "Postcode"},
    Label{"other_contacts", "Other contacts"},
    Label{"events", "Events"},
    Label{"visits", "Visits"},
    Label{"tbl_family_group", "Family groups"},
    Label{"tbl_family_date", "Family dates"},
    Label{"closed_sections", "Sections closed to access"},
    Label{"people", "People"},
    Label{"person_id", "Key"},
    Label{"Name", "Name"},
    Label{"position", "Place in the family"},
    Label{"Marital", "Family role code"},
    Label{"preferred_name", "Preferred name"},
    Label{"Preferred_Name_hidden", "Preferred name unlisted"},
    Label{"Active", "Active"},
    Label{"Decease", "Deceased"},
    Label{"Privacy", "Privacy Request"},
    Label{"Prospect", "Prospect"},
    Label{"archive", "Archive"},
    Label{"contact", "Contact"},
    Label{"Title", "Title"},
    Label{"birthdate", "Birth Date"},
    Label{"school_year", "School Year"},
    Label{"middle_name", "Middle Name"},
    Label{"other_surname", "Other Surname"},
    Label{"mobile_phone", "Mobile"},
    Label{"Personal_email", "E-mail"},
    Label{"business_phone", "Business Phone"},
    Label{"business_fax", "Business Fax"},
    Label{"business_email", "Business E-mail"},
    Label{"Title_hidden", "Title unlisted"},
    Label{"birthdate_hidden", "Birth Date unlisted"},
    Label{"middle_hidden", "Middle Name unlisted"},
    Label{"surname_hidden", "Other Surname unlisted"},
    Label{"mobile_hidden", "Mobile unlisted"},
    Label{"email_hidden", "E-mail unlisted"},
    Label{"bussiness_phone_hidden", "Business Phone unlisted"},
    Label{"Bussiness_fax_hidden", "Business Fax unlisted"},
    Label{"bussiness_email_hidden", "Business E-mail unlisted"},
    Label{"Bussiness_hidden", "Business details unlisted"},
    Label{"personal_pin", "P.I.N."},
    Label{"tbl_status", "Statuses"},
    Label{"tbl_group", "Groups"},
    Label{"tbl_ministry", "Ministries"},
    Label{"tbl_flexi", "Flexi fields"},
    Label{"tbl_individual_date", "Dates"},
    Label{"tbl_occupation", "Occupations"},
};

} // namespace

QString label_of(const char* stored_name)
{
    const auto found = std::ranges::find(labels, std::string_view(stored_name), &Label::name);
    return found == labels.end() ? QString() : QString::fromLatin1(found->label);
}

} // namespace kindrel::people

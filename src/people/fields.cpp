#include "people/fields.h"

#include <array>

namespace kindrel::people {

namespace {

const std::array family_table{
    Field<Family>{"surname", &Family::surname},
    Field<Family>{"Primary_name", &Family::Primary_name},
    Field<Family>{"created", &Family::created},
    Field<Family>{"last_edit", &Family::last_edit},
};

const std::array booking_table{
    Field<Family>{"booked_out", &Family::booked_out},
    Field<Family>{"booked_out_date", &Family::booked_out_date},
    Field<Family>{"booked_out_person", &Family::booked_out_person},
    Field<Family>{"active_in_book", &Family::active_in_book},
};

const std::array address_table{
    Field<Address>{"res_street", &Address::res_street},
    Field<Address>{"res_street2", &Address::res_street2},
    Field<Address>{"res_state", &Address::res_state},
    Field<Address>{"res_country", &Address::res_country},
    Field<Address>{"res_map", &Address::res_map},
    Field<Address>{"res_ref", &Address::res_ref},
    Field<Address>{"post_street", &Address::post_street},
    Field<Address>{"post_street2", &Address::post_street2},
    Field<Address>{"post_state", &Address::post_state},
    Field<Address>{"post_country", &Address::post_country},
    Field<Address>{"phone", &Address::phone},
    Field<Address>{"family_fax", &Address::family_fax},
    Field<Address>{"family_mobile", &Address::family_mobile},
    Field<Address>{"family_email", &Address::family_email},
    Field<Address>{"family_email_description", &Address::family_email_description},
    Field<Address>{"res_hidden", &Address::res_hidden},
    Field<Address>{"post_hidden", &Address::post_hidden},
    Field<Address>{"phone_hidden", &Address::phone_hidden},
    Field<Address>{"family_fax_hidden", &Address::family_fax_hidden},
    Field<Address>{"family_email_hidden", &Address::family_email_hidden},
    Field<Address>{"family_mobile_hidden", &Address::family_mobile_hidden},
    Field<Address>{"transfer_exists", &Address::transfer_exists},
    Field<Address>{"audio_note", &Address::audio_note},
};

const std::array other_contact_table{
    Field<OtherContact>{"contact", &OtherContact::contact},
    Field<OtherContact>{"phone", &OtherContact::phone},
};

const std::array event_table{
    Field<Event>{"event_date", &Event::event_date},
    Field<Event>{"event", &Event::event},
};

const std::array visit_table{
    Field<Visit>{"date", &Visit::date},
    Field<Visit>{"visitor", &Visit::visitor},
    Field<Visit>{"comments", &Visit::comments},
};

const std::array access_table{
    Field<RecordAccess>{"Address", &RecordAccess::Address},
    Field<RecordAccess>{"Details", &RecordAccess::Details},
    Field<RecordAccess>{"status", &RecordAccess::status},
    Field<RecordAccess>{"groups", &RecordAccess::groups},
    Field<RecordAccess>{"ministry", &RecordAccess::ministry},
    Field<RecordAccess>{"date", &RecordAccess::date},
    Field<RecordAccess>{"flexi", &RecordAccess::flexi},
    Field<RecordAccess>{"contact", &RecordAccess::contact},
    Field<RecordAccess>{"visitation", &RecordAccess::visitation},
    Field<RecordAccess>{"family_group", &RecordAccess::family_group},
    Field<RecordAccess>{"family_date", &RecordAccess::family_date},
    Field<RecordAccess>{"occupation", &RecordAccess::occupation},
    Field<RecordAccess>{"events", &RecordAccess::events},
    Field<RecordAccess>{"pin", &RecordAccess::pin},
};

const std::array people_table{
    Field<Person>{"Name", &Person::Name},
    Field<Person>{"position", &Person::position},
    Field<Person>{"Marital", &Person::Marital},
    Field<Person>{"preferred_name", &Person::preferred_name},
    Field<Person>{"Preferred_Name_hidden", &Person::Preferred_Name_hidden},
    Field<Person>{"Active", &Person::Active},
    Field<Person>{"Decease", &Person::Decease},
    Field<Person>{"Privacy", &Person::Privacy},
    Field<Person>{"Prospect", &Person::Prospect},
    Field<Person>{"archive", &Person::archive},
    Field<Person>{"contact", &Person::contact},
};

const std::array detail_table{
    Field<Person>{"Title", &Person::Title},
    Field<Person>{"birthdate", &Person::birthdate},
    Field<Person>{"school_year", &Person::school_year},
    Field<Person>{"middle_name", &Person::middle_name},
    Field<Person>{"other_surname", &Person::other_surname},
    Field<Person>{"mobile_phone", &Person::mobile_phone},
    Field<Person>{"Personal_email", &Person::Personal_email},
    Field<Person>{"business_phone", &Person::business_phone},
    Field<Person>{"business_fax", &Person::business_fax},
    Field<Person>{"business_email", &Person::business_email},
    Field<Person>{"Title_hidden", &Person::Title_hidden},
    Field<Person>{"birthdate_hidden", &Person::birthdate_hidden},
    Field<Person>{"middle_hidden", &Person::middle_hidden},
    Field<Person>{"surname_hidden", &Person::surname_hidden},
    Field<Person>{"mobile_hidden", &Person::mobile_hidden},
    Field<Person>{"email_hidden", &Person::email_hidden},
    Field<Person>{"bussiness_phone_hidden", &Person::bussiness_phone_hidden},
    Field<Person>{"Bussiness_fax_hidden", &Person::Bussiness_fax_hidden},
    Field<Person>{"bussiness_email_hidden", &Person::bussiness_email_hidden},
    Field<Person>{"Bussiness_hidden", &Person::Bussiness_hidden},
};

} // namespace

std::span<const Field<Family>> family_fields()
{
    return family_table;
}

std::span<const Field<Family>> booking_fields()
{
    return booking_table;
}

std::span<const Field<Address>> address_fields()
{
    return address_table;
}

std::span<const Field<OtherContact>> other_contact_fields()
{
    return other_contact_table;
}

std::span<const Field<Event>> event_fields()
{
    return event_table;
}

std::span<const Field<Visit>> visit_fields()
{
    return visit_table;
}

std::span<const Field<RecordAccess>> access_fields()
{
    return access_table;
}

std::span<const Field<Person>> people_fields()
{
    return people_table;
}

std::span<const Field<Person>> detail_fields()
{
    return detail_table;
}

} // namespace kindrel::people

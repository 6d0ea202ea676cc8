#include "core/settings.h"

#include "core/session.h"

#include <array>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

template <class T>
struct Field
{
    const char16_t* name;
    T Settings::*member;
};

constexpr std::array numbers{
    Field<int>{u"Version", &Settings::Version},
    Field<int>{u"network_Version", &Settings::network_Version},
    Field<int>{u"pin_auto_number_start", &Settings::pin_auto_number_start},
    Field<int>{u"Kindrel_address_position", &Settings::Kindrel_address_position},
    Field<int>{u"search_position", &Settings::search_position},
    Field<int>{u"backup_position", &Settings::backup_position},
    Field<int>{u"vision_font_size", &Settings::vision_font_size},
    Field<int>{u"vision_alignment", &Settings::vision_alignment},
    Field<int>{u"vision_format", &Settings::vision_format},
    Field<int>{u"compact_count", &Settings::compact_count},
};

constexpr std::array flags{
    Field<bool>{u"Security", &Settings::Security},
    Field<bool>{u"autosave", &Settings::autosave},
    Field<bool>{u"audio_prompt", &Settings::audio_prompt},
    Field<bool>{u"American_date", &Settings::American_date},
    Field<bool>{u"Include_vision_reports", &Settings::Include_vision_reports},
    Field<bool>{u"title_date", &Settings::title_date},
    Field<bool>{u"title_filters", &Settings::title_filters},
    Field<bool>{u"title_church", &Settings::title_church},
    Field<bool>{u"title_logo", &Settings::title_logo},
    Field<bool>{u"encrpted_notebook", &Settings::encrpted_notebook},
    Field<bool>{u"include_vision_footer", &Settings::include_vision_footer},
    Field<bool>{u"vision_line", &Settings::vision_line},
    Field<bool>{u"vision_thick_line", &Settings::vision_thick_line},
    Field<bool>{u"footer_line", &Settings::footer_line},
    Field<bool>{u"follow_up", &Settings::follow_up},
    Field<bool>{u"use_preferred_names", &Settings::use_preferred_names},
};

constexpr std::array texts{
    Field<QString>{u"booked_out_code", &Settings::booked_out_code},
    Field<QString>{u"vision", &Settings::vision},
    Field<QString>{u"church_vision", &Settings::church_vision},
    Field<QString>{u"vision_font", &Settings::vision_font},
    Field<QString>{u"footer_vision", &Settings::footer_vision},
    Field<QString>{u"footer_vision_line2", &Settings::footer_vision_line2},
};

const Row& only_row(Rows& rows)
{
    const Row* row = rows.first();
    if (!row)
        throw DatabaseError(u"tbl_startup holds no row."_s);
    return *row;
}

} // namespace

Settings read_settings(Session& session)
{
    auto rows = session.select(u"SELECT * FROM [tbl_startup];"_s);
    const Row& row = only_row(rows);
    Settings settings;
    for (const auto& field : numbers)
        settings.*field.member = row.integer(rows.column(field.name));
    for (const auto& field : flags)
        settings.*field.member = row.flag(rows.column(field.name));
    for (const auto& field : texts)
        settings.*field.member = row.text(rows.column(field.name));
    return settings;
}

int read_version(Session& session)
{
    auto rows = session.select(u"SELECT [Version] FROM [tbl_startup];"_s);
    return only_row(rows).integer(rows.column(u"Version"));
}

void write_setting(Session& session, const QString& field, const Value& value)
{
    session.execute(u"UPDATE [tbl_startup] SET [%1]=?;"_s.arg(field), value);
}

} // namespace kindrel::core

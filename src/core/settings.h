#pragma once

#include "core/value.h"

#include <QString>

namespace kindrel::core {

class Session;

/// The one row of `tbl_startup` as it was read when the office was built, under the stored names. Written only
/// field by field, through write_setting().
struct Settings
{
    int Version = 0;
    int network_Version = 0;
    QString booked_out_code;
    bool Security = false;
    bool autosave = false;
    bool audio_prompt = false;
    bool American_date = false;
    int pin_auto_number_start = 0;
    QString vision;
    bool Include_vision_reports = false;
    bool title_date = false;
    bool title_filters = false;
    bool title_church = false;
    bool title_logo = false;
    bool encrpted_notebook = false;
    int Kindrel_address_position = 0;
    int search_position = 0;
    int backup_position = 0;
    QString vision_font;
    int vision_font_size = 0;
    bool include_vision_footer = false;
    int vision_alignment = 0; ///< 0 left, 1 centre, 2 right.
    int vision_format = 0;    ///< 0 plain, 1 bold, 2 italic, 3 both.
    bool vision_line = false;
    bool vision_thick_line = false;
    QString church_vision; ///< What reports print; empty: the text of `vision`.
    QString footer_vision;
    QString footer_vision_line2;
    bool footer_line = false;
    int compact_count = 0;
    bool follow_up = false;
    bool use_preferred_names = false; ///< The global option that lists people by their preferred names.

    [[nodiscard]] DayOrder day_order() const { return American_date ? DayOrder::month_first : DayOrder::day_first; }
};

/// Throws DatabaseError when `tbl_startup` holds no row.
[[nodiscard]] Settings read_settings(Session& session);
/// Can be read of a church of any version; 0 when it has none.
[[nodiscard]] int read_version(Session& session);
/// Writes one field of `tbl_startup`; the field's name is the program's own, never typed by a person.
void write_setting(Session& session, const QString& field, const Value& value);
template <class V>
void write_setting(Session& session, const QString& field, const V& value)
{
    write_setting(session, field, to_value(value));
}

} // namespace kindrel::core

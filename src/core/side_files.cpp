#include "core/side_files.h"

namespace kindrel::core::side_files {

namespace {

using enum SideType;

constexpr auto church_name_fields = consecutive(std::array{
    SideField{"church_1", 20, text, "Church1"},
    SideField{"church_2", 20, text, "Church2"},
    SideField{"church_3", 20, text, "Church3"},
    SideField{"church_4", 20, text, "Church4"},
    SideField{"church_5", 20, text, "Church5"},
    SideField{"church_6", 20, text, "Church6"},
    SideField{"church_7", 20, text, "Church7"},
});

constexpr auto sound_fields = consecutive(std::array{
    SideField{"entry_sound", 12, text, "entry.wav"},
    SideField{"exit_sound", 12, text, "exit.wav"},
    SideField{"play", 2, yes_no, "-1"},
    SideField{"spare", 2, spare, ""},
});

constexpr auto common_fields = consecutive(std::array{
    SideField{"logo", 20, text, "logo.jpg"},
    SideField{"starts_between_compactions", 2, number, "30"}, // 0: never by itself.
    SideField{"spare", 578, spare, ""},
});

/// A sheet of three by eight mailing labels and one of two by five name tags, both A4.
constexpr auto label_fields = consecutive(std::array{
    SideField{"label_page_width", 2, number, "2100"},
    SideField{"label_page_height", 2, number, "2970"},
    SideField{"label_columns", 2, number, "3"},
    SideField{"label_rows", 2, number, "8"},
    SideField{"label_width", 2, number, "635"},
    SideField{"label_height", 2, number, "339"},
    SideField{"label_column_gap", 2, number, "25"},
    SideField{"label_row_gap", 2, number, "0"},
    SideField{"label_left_margin", 2, number, "72"},
    SideField{"label_top_margin", 2, number, "129"},
    SideField{"label_start", 2, number, "1"},
    SideField{"tag_page_width", 2, number, "2100"},
    SideField{"tag_page_height", 2, number, "2970"},
    SideField{"tag_columns", 2, number, "2"},
    SideField{"tag_rows", 2, number, "5"},
    SideField{"tag_width", 2, number, "860"},
    SideField{"tag_height", 2, number, "550"},
    SideField{"tag_column_gap", 2, number, "0"},
    SideField{"tag_row_gap", 2, number, "0"},
    SideField{"tag_left_margin", 2, number, "190"},
    SideField{"tag_top_margin", 2, number, "110"},
    SideField{"tag_start", 2, number, "1"},
    SideField{"label_name_font", 40, text, "Arial"},
    SideField{"label_name_size", 2, number, "11"},
    SideField{"label_name_bold", 2, yes_no, "-1"},
    SideField{"label_name_italic", 2, yes_no, "0"},
    SideField{"label_address_font", 40, text, "Arial"},
    SideField{"label_address_size", 2, number, "10"},
    SideField{"label_address_bold", 2, yes_no, "0"},
    SideField{"label_address_italic", 2, yes_no, "0"},
    SideField{"tag_given_name_font", 40, text, "Arial"},
    SideField{"tag_given_name_size", 2, number, "28"},
    SideField{"tag_given_name_bold", 2, yes_no, "-1"},
    SideField{"tag_given_name_italic", 2, yes_no, "0"},
    SideField{"tag_surname_font", 40, text, "Arial"},
    SideField{"tag_surname_size", 2, number, "18"},
    SideField{"tag_surname_bold", 2, yes_no, "0"},
    SideField{"tag_surname_italic", 2, yes_no, "0"},
    SideField{"tag_church_font", 40, text, "Arial"},
    SideField{"tag_church_size", 2, number, "10"},
    SideField{"tag_church_bold", 2, yes_no, "0"},
    SideField{"tag_church_italic", 2, yes_no, "0"},
    SideField{"tag_shows_church", 2, yes_no, "-1"},
    SideField{"tag_shows_border", 2, yes_no, "0"},
    SideField{"spare", 430, spare, ""},
});

constexpr auto logo_fields = consecutive(std::array{SideField{"logo", 20, text, ""}});

constexpr auto network_fields = consecutive(std::array{
    SideField{"network", 2, yes_no, "0"},
    SideField{"path", 200, text, ""},
});

constexpr auto backup_fields = consecutive(std::array{
    SideField{"path", 250, text, ""},
    SideField{"next_folder", 2, number, "1"}, // Of `Backup1` to `Backup5`.
    SideField{"with_pictures", 2, yes_no, "-1"},
    SideField{"with_documents", 2, yes_no, "-1"},
    SideField{"with_letters", 2, yes_no, "-1"},
    SideField{"last_backup", 10, text, ""}, // A stored date.
    SideField{"spare", 34, spare, ""},
});

constexpr auto viewer_fields = consecutive(std::array{
    SideField{"path", 250, text, ""},
    SideField{"zoom", 2, number, "0"}, // In percent; 0 fits the page.
    SideField{"spare", 48, spare, ""},
});

constexpr auto email_delay_fields = consecutive(std::array{
    SideField{"batch", 2, number, "0"},
    SideField{"batch_size", 2, number, "20"},
    SideField{"pause_seconds", 2, number, "60"},
});

constexpr auto tracking_fields = consecutive(std::array{SideField{"people", 261, text, ""}});

constexpr auto marker_fields = consecutive(std::array{SideField{"mark", 10, text, "1234567890"}});

constexpr auto map_specification_fields = consecutive(std::array{SideField{"content", 11, text, ""}});
constexpr auto map_land_fields = consecutive(std::array{SideField{"content", 1616, text, ""}});
constexpr auto map_layer_fields = consecutive(std::array{SideField{"content", 198, text, ""}});

} // namespace

constexpr SideFile church_names = side_file("Church_S.Dat", Folder::global, 140, church_name_fields);
constexpr SideFile sounds = side_file("Enter_sound.Dat", Folder::global, 28, sound_fields);
constexpr SideFile common = side_file("Common.Dat", Folder::global, 600, common_fields);
constexpr SideFile labels = side_file("label_setup_2.dat", Folder::global, 708, label_fields);
constexpr SideFile workstation_logo = side_file("logo.dat", Folder::local_settings, 20, logo_fields);
constexpr SideFile network = side_file("network.dat", Folder::local_settings, 202, network_fields);
constexpr SideFile backup = side_file("backup.dat", Folder::global, 302, backup_fields);
constexpr SideFile viewer = side_file("viewer.dat", Folder::global, 300, viewer_fields);
constexpr SideFile email_delay = side_file("email_delay.dat", Folder::global, 6, email_delay_fields);
constexpr SideFile tracking = side_file("tracking.dat", Folder::global, 261, tracking_fields);
constexpr SideFile busy = side_file("lock.dat", Folder::church, 10, marker_fields);
constexpr SideFile opening = side_file("security.dat", Folder::church, 10, marker_fields);
constexpr SideFile write_test = side_file("test.dat", Folder::data_root, 10, marker_fields);
constexpr SideFile set_up = side_file("loaded.dat", Folder::church, 10, marker_fields);
constexpr SideFile map_specification = side_file("map_spec.dat", Folder::global, 11, map_specification_fields);
constexpr SideFile map_land = side_file("map_land.dat", Folder::global, 1616, map_land_fields);
constexpr SideFile map_layers = side_file("map_lay.dat", Folder::global, 198, map_layer_fields);

} // namespace kindrel::core::side_files

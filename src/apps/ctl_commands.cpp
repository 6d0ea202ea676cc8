#include "apps/ctl_command.h"

#include <array>

namespace kindrel::apps {

namespace {

constexpr Option json{"json", nullptr, "write the result as JSON"};
constexpr Option backup_password{"backup-password-file", "FILE", "the file of the backup's password, its first line"};

constexpr std::array list_options{json};
constexpr std::array make_church_options{
    Option{"families", "N", "how many families to make, 1 to 100000"},
    Option{"seed", "S", "a whole number; the same number makes the same church (default 1)"},
};
constexpr std::array families_options{
    Option{"status", "LIST",
           "all, active, privacy, active-privacy, prospect, archive, booked-in or booked-out (default all)"},
    json,
};
constexpr std::array people_options{
    Option{"list", "NAME", "the families' list by its name on the screen (default \"Active Families\")"},
    Option{"people", "STATES", "active, privacy, prospect, archived, contact, deceased (default active)"},
    Option{"status", "NAME", "who has the status; this and the next may be given again for another one"},
    Option{"not-status", "NAME", "who has not"},
    Option{"group", "NAME", "who is in the group"},
    Option{"not-group", "NAME", "who is not"},
    Option{"ministry", "NAME", "who is in the ministry, active or potential"},
    Option{"family-group", "NAME", "whose family is in the family group"},
    Option{"occupation", "NAME", "who has the occupation"},
    Option{"suburb", "NAME", "whose family lives there"},
    Option{"age", "A-B", "who is that old today"},
    Option{"born", "MONTH|D/M-D/M", "whose birthday is in the month, or between the days of any year"},
    Option{"surname", "A-M", "families from one letter to another"},
    Option{"sort", "ORDER",
           "family, individual, suburb, postcode, birth-date, visitation, family-events, or the name of a date "
           "(default family)"},
    Option{"fields", "A,B,C", "what to list; \"help\" names them (default surname,name,res_street,suburb,phone)"},
    Option{"format", "FORMAT", "text, csv or json (default text)"},
};
constexpr Option pdf{"pdf", "FILE", "the file to write; one that is there is replaced once the report is complete"};
constexpr Option paper{"paper", "SIZE", "a4 or letter (default a4)"};
constexpr std::array report_options{pdf, paper};
constexpr std::array weekly_report_options{
    Option{"project", "NAME", "the weekly project (default: the only one)"},
    Option{"category", "NAME", "a category to include, may be given again for another one (default: all)"},
    Option{"year", "YYYY", "the calendar year"},
    Option{"financial-year", "YYYY", "the financial year that begins in it"},
    Option{"from", "DATE|YYYY", "the first day, or the first of several years"},
    Option{"to", "DATE|YYYY", "the last day, or the last of several years"},
    Option{"chart", "STYLE", "\"3D Bar\" for example (default: none, or 3D Bar where the report is about its chart)"},
    pdf,
    paper,
};
constexpr std::array backup_options{
    Option{"to", "FOLDER", "where to put it (default: the next of the church's own folders Backup1 to Backup5)"},
    Option{"encrypt", nullptr, "encrypt it; without its password nobody can read it again"},
    backup_password,
    Option{"without", "LIST", "what to leave out: pictures, documents, letters"},
};
constexpr std::array show_backup_options{backup_password};
constexpr std::array restore_options{
    backup_password,
    Option{"yes", nullptr, "replace the present state without asking; it is kept as a backup all the same"},
};
constexpr std::array copy_church_options{
    Option{"from", "N", "the church to copy (default: the one in use)"},
    Option{"to", "END", "a church file (FILE.kdl), a server's keywords, or a file that holds them (FILE.server)"},
    Option{"replace", nullptr, "take the place of an older copy of the same church"},
    Option{"yes", nullptr, "replace it without asking"},
};

constexpr std::array command_table{
    Command{"install",
            "",
            "lay down the data folder",
            "Makes the folder Kindrel_10_Data with its churches, settings and training data on the data drive.\n"
            "What exists already stays as it is, so that it may be run again.",
            Needs::nothing,
            {},
            0,
            {},
            run_install},
    Command{"make-church", "--families N [--seed S]", "fill an empty church with invented families",
            "Fills the chosen church with families, people and everything they carry, all of it invented.\n"
            "Refused when the church holds families already.",
            Needs::church, core::Area::add_family, 0, make_church_options, run_make_church},
    Command{"totals", "[--json]", "count the families",
            "Lists how many families the church holds, by file status and booking.", Needs::church,
            core::Area::search_for_family, 0, list_options, run_totals},
    Command{"families", "[--status LIST] [--json]", "list families",
            "Lists the families of a file status with key, first person, address and phone.\n"
            "What is unlisted is left out.",
            Needs::church, core::Area::search_for_family, 0, families_options, run_families},
    Command{"family", "KEY [--json]", "show one family",
            "Shows what is stored about the family with this key (see \"families\") and about its people.\n"
            "What is unlisted, or what your rights do not cover, is left out.",
            Needs::church, core::Area::search_for_family, 1, list_options, run_family},
    Command{"people", "[CRITERIA] [--sort ORDER] [--fields A,B,C] [--format FORMAT]", "list chosen people",
            "Lists the people whom all criteria choose, with the fields asked for.\n"
            "What is unlisted, or what your rights do not cover, is left out.",
            Needs::church, core::Area::export_text, 0, people_options, run_people},
    Command{"reports", "[--json]", "list the reports",
            "Lists the catalogue and the church's own layouts: key, family, name and content.", Needs::church,
            core::Area::report_outputs, 0, list_options, run_reports},
    Command{"report", "KEY|NAME --pdf FILE [--paper SIZE]", "write a report of the active families to a PDF file",
            "Runs the report with this key or name (see \"reports\") over the active families.",
            Needs::church_and_fonts, core::Area::report_outputs, 1, report_options, run_report},
    Command{"weekly-report",
            "NAME --pdf FILE [--project NAME] [--year YYYY|--financial-year YYYY|--from DATE|YYYY --to DATE|YYYY]",
            "write a report of weekly statistics to a PDF file",
            "Runs the report with this name, \"Monthly Totals\" or \"weekly_table_report\" for example, over the\n"
            "figures of a period. A name that is none lists them all.",
            Needs::church_and_fonts, core::Area::weekly_statistics, 1, weekly_report_options, run_weekly_report},
    Command{"backup", "[--to FOLDER] [--encrypt --backup-password-file FILE] [--without LIST]", "back the church up",
            "Backs the church up, with its pictures, documents and letters, and compares everything in the backup.\n"
            "In the church's own folders it takes the place of the backup made five times before.",
            Needs::church, core::Area::backup_data, 0, backup_options, run_backup},
    Command{"backups", "[--json]", "list the backups",
            "Lists the church's backups, the newest first. A verified one was compared after it was written and has\n"
            "not changed since.",
            Needs::church, core::Area::backup_data, 0, list_options, run_backups},
    Command{"show-backup", "FILE [--backup-password-file FILE]", "show what is in a backup",
            "Shows what is in a backup beside what it would replace. Nothing changes.", Needs::church,
            core::Area::restore_data, 1, show_backup_options, run_show_backup},
    Command{"restore", "FILE [--backup-password-file FILE] [--yes]", "replace the church by a backup",
            "Replaces the church by a backup of it, once everything in the backup was compared. The state before is\n"
            "kept as a backup first. Asks on the terminal; where nobody sits at it, nothing changes without --yes.",
            Needs::church, core::Area::restore_data, 1, restore_options, run_restore},
    Command{
        "copy-church", "[--from N] --to END [--replace] [--yes]", "copy a church to a server, or back to a file",
        "Copies a church's database into an empty database of a server (--to \"host=HOST dbname=NAME user=NAME\")\n"
        "or into a church file, and compares every table of the copy before it appears. Refused while anybody works\n"
        "in the church. The church itself does not change, and is used as before until its folder says otherwise.",
        Needs::nothing, core::Area::backup_data, 0, copy_church_options, run_copy_church},
};

} // namespace

std::span<const Command> commands()
{
    return command_table;
}

} // namespace kindrel::apps

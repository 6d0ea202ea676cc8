#include "core/backup_parts.h"

#include <algorithm>

namespace kindrel::core {

namespace {

constexpr std::array parts{
    BackupPart{u"church/Portrait/", u"Photographs", Folder::portrait, &BackupChoice::with_pictures, false},
    BackupPart{u"church/NBook/", u"Notebook pages", Folder::notebook, &BackupChoice::with_documents, false},
    BackupPart{u"church/Roster_history/", u"Roster history", Folder::roster_history, &BackupChoice::with_documents,
               false},
    BackupPart{u"shared/Global/", u"Settings", Folder::global, nullptr, true},
    BackupPart{u"shared/Directory Setup/", u"Directory setup", Folder::directory_setup, nullptr, true},
    BackupPart{u"shared/images/", u"Pictures", Folder::images, &BackupChoice::with_pictures, true},
    BackupPart{u"shared/Audio/", u"Sounds", Folder::audio, &BackupChoice::with_documents, true},
    BackupPart{u"shared/Wardline/", u"Wardline documents", Folder::wardline, &BackupChoice::with_documents, true},
    BackupPart{u"shared/letter/", u"Letters", Folder::letter, &BackupChoice::with_letters, true},
    BackupPart{u"shared/custom/", u"Custom layouts", Folder::custom, &BackupChoice::with_letters, true},
    BackupPart{u"shared/plugin letters/", u"Plug-in letters", Folder::plugin_letters, &BackupChoice::with_letters,
               true},
    BackupPart{u"shared/plugin reports/", u"Plug-in reports", Folder::plugin_reports, &BackupChoice::with_letters,
               true},
};

constexpr std::array kinds{
    CountedKind{u"Families", u"tbl_surname"},
    CountedKind{u"People", u"tbl_people"},
    CountedKind{u"Group memberships", u"tbl_group"},
    CountedKind{u"Visitation notes", u"Tbl_visitation"},
    CountedKind{u"Group history", u"tbl_group_history"},
    CountedKind{u"Roll dates", u"tbl_roll_date"},
    CountedKind{u"Attendances", u"tbl_roll_attendance"},
    CountedKind{u"Giving dates", u"tbl_finance_date"},
    CountedKind{u"Gifts", u"tbl_finance_data"},
    CountedKind{u"Giving numbers", u"tbl_pin"},
    CountedKind{u"Weekly dates", u"tbl_weekly_date"},
    CountedKind{u"Weekly figures", u"tbl_weekly_amount"},
    CountedKind{u"Roster dates", u"tbl_roster_date"},
    CountedKind{u"Wardline documents", u"tbl_wardline_store_document"},
};

} // namespace

std::span<const BackupPart> backup_parts()
{
    return parts;
}

const BackupPart* part_of(const QString& name)
{
    const auto found =
        std::ranges::find_if(parts, [&](const BackupPart& part) { return name.startsWith(QStringView(part.name)); });
    return found == parts.end() ? nullptr : &*found;
}

bool chosen(const BackupPart& part, const BackupChoice& choice)
{
    return !part.choice || choice.*part.choice;
}

std::span<const CountedKind> counted_kinds()
{
    return kinds;
}

} // namespace kindrel::core

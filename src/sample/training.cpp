#include "sample/training.h"

#include "core/files.h"
#include "core/schema.h"
#include "core/side_files.h"
#include "core/sqlite_session.h"
#include "sample/church.h"
#include "sample/setup_lists.h"
#include "sample/word_list.h"

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

const ChurchPlan training_plan{.families = 190, .seed = 10, .training = true, .today = {2026, 7, 1}};

std::unique_ptr<core::Session> new_church(const QString& file)
{
    auto session = core::create_sqlite(file);
    core::create_schema(*session);
    return session;
}

/// A report and a receipt that every church can copy.
void lay_layouts(const QString& folder)
{
    core::make_folder(folder);
    core::write_file(folder + u"phones.rpt"_s, read_sample(u"phone_list_layout.txt"_s));
    core::write_file(folder + u"thanks.rct"_s, read_sample(u"receipt_layout.txt"_s));
}

/// Letters that every church can begin with.
void lay_letters(const QString& folder)
{
    core::make_folder(folder);
    core::write_file(folder + u"Welcome.ltr"_s, read_sample(u"welcome.ltr"_s));
    core::write_file(folder + u"Holiday Club.ltr"_s, read_sample(u"holiday_club.ltr"_s));
}

} // namespace

void lay_training_church(const QString& folder)
{
    const QString place = core::as_folder(folder);
    const QString portraits = place + u"Portrait"_s;
    const QString notebook = place + u"NBook"_s;
    for (const auto& needed : {place, portraits, notebook})
        core::make_folder(needed);
    fill_church(*new_church(place + u"KR10_records.kdl"_s), training_plan, portraits, notebook);
    lay_layouts(core::as_folder(place + u"custom"_s));
    lay_letters(core::as_folder(place + u"letter"_s));
    const core::SideRecord mark(core::side_files::set_up);
    core::write_file(place + QString::fromLatin1(mark.file().name), mark.bytes());
}

void make_master(const QString& file)
{
    write_titles(*new_church(file));
}

} // namespace kindrel::sample

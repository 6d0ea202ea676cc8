#include "sample/training.h"

#include "core/files.h"
#include "core/schema.h"
#include "core/side_files.h"
#include "core/sqlite_session.h"
#include "sample/church.h"
#include "sample/setup_lists.h"

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

} // namespace

void lay_training_church(const QString& folder)
{
    const QString place = core::as_folder(folder);
    const QString portraits = place + u"Portrait"_s;
    const QString notebook = place + u"NBook"_s;
    for (const auto& needed : {place, portraits, notebook})
        core::make_folder(needed);
    fill_church(*new_church(place + u"KR10_records.kdl"_s), training_plan, portraits, notebook);
    const core::SideRecord mark(core::side_files::set_up);
    core::write_file(place + QString::fromLatin1(mark.file().name), mark.bytes());
}

void make_master(const QString& file)
{
    write_titles(*new_church(file));
}

} // namespace kindrel::sample

#include "sample/church.h"

#include "core/files.h"
#include "people/family_store.h"
#include "sample/family_maker.h"
#include "sample/group_book.h"
#include "sample/portrait.h"
#include "sample/registers.h"
#include "sample/word_list.h"

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

constexpr int families_at_once = 1000;

/// Where pictures and pages go; empty for nowhere.
struct Folders
{
    QString portraits, notebook;
};

void write_page(const MadeFamily& family, const QStringList& notes, const QString& folder)
{
    const int key = family.file.family.Surname_ID;
    if (key % 7 == 0)
        core::write_file(core::as_folder(folder) + u"F%1.fll"_s.arg(key),
                         notes[family.index % notes.size()].toUtf8() + "\r\n");
}

void write_files(const std::vector<MadeFamily>& families, const Folders& folders)
{
    const auto notes = read_words(u"notes"_s);
    for (const auto& family : families) {
        if (!folders.portraits.isEmpty())
            write_photographs(family, folders.portraits);
        if (!folders.notebook.isEmpty())
            write_page(family, notes, folders.notebook);
    }
}

/// Makes and stores the next families; they come back with their keys.
std::vector<MadeFamily> add_next(core::Session& session, FamilyMaker& maker, int count, const QDate& today)
{
    std::vector<MadeFamily> families;
    std::vector<people::FamilyFile> files;
    for (int i = 0; i < count; ++i) {
        auto& family = families.emplace_back(maker.next());
        files.push_back(std::move(family.file));
    }
    people::add_families(session, files, today);
    for (std::size_t i = 0; i < files.size(); ++i)
        families[i].file = std::move(files[i]);
    return families;
}

/// Files were last edited over the past year; some are older than the field that tells when they were made.
void age_files(core::Session& session, const QDate& today)
{
    constexpr int edits = 30;
    for (int i = 0; i < edits; ++i) {
        const auto day = core::Date::from(today.addDays(-12 * i));
        session.execute(u"UPDATE [tbl_surname] SET [last_edit]=? WHERE [Surname_ID] % ? = ? AND [created] <= ?;"_s, day,
                        edits, i, day);
    }
    session.execute(u"UPDATE [tbl_surname] SET [created]=? WHERE [Surname_ID] % 19 = 7;"_s, core::Value{});
}

void write_decoration(core::Session& session)
{
    QStringList vision, footer;
    for (const auto& line : read_list(u"vision"_s))
        (line[0] == u"vision" ? vision : footer) += line[1];
    const auto statement = vision.join(u"\r\n"_s);
    session.execute(
        u"UPDATE [tbl_startup] SET [vision]=?, [church_vision]=?, [footer_vision]=?, "
        "[footer_vision_line2]=?, [Include_vision_reports]=-1, [include_vision_footer]=-1, "
        "[vision_line]=-1, [footer_line]=-1, [vision_alignment]=1, [vision_format]=2, [vision_font_size]=11, "
        "[title_date]=-1, [title_filters]=-1, [title_church]=-1, [title_logo]=-1;"_s,
        statement, statement, footer.value(0), footer.value(1));
}

} // namespace

void fill_church(core::Session& session, const ChurchPlan& plan, const QString& portrait_folder,
                 const QString& notebook_folder)
{
    core::Transaction transaction(session);
    const SetupLists lists(session);
    const Stock stock(lists, plan.today);
    FamilyMaker maker(stock, plan.seed);
    GroupBook groups;
    for (int left = plan.families; left > 0; left -= families_at_once) {
        const auto families = add_next(session, maker, std::min(left, families_at_once), plan.today);
        for (const auto& family : families)
            groups.note(family);
        write_files(families, {portrait_folder, notebook_folder});
    }
    groups.write(session, lists);
    age_files(session, plan.today);
    write_registers(session, plan.today, plan.seed);
    session.execute(u"UPDATE [tbl_startup] SET [pin_auto_number_start]=?;"_s, maker.next_pin());
    if (plan.training)
        write_decoration(session);
    transaction.commit();
}

} // namespace kindrel::sample

#include "people/setup_fixture.h"
#include "registers/dated_register.h"
#include "registers/notes.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Column;
using core::Date;
using core::to_value;
using registers::Kind;
using registers::named;
using registers::RegisterKind;

namespace {

/// The fields of the table that the rows of a kind stand in, beside that of the date.
struct RowFields
{
    const char16_t* of;
    const char16_t* value;
    registers::NotesArea notes;
};

RowFields fields_of(Kind kind)
{
    switch (kind) {
    case Kind::roll:
        return {u"person_id", u"Attendance", registers::NotesArea::roll};
    case Kind::finance:
        return {u"person_id", u"Data", registers::NotesArea::finance};
    case Kind::weekly:
        return {u"group_id", u"amount", registers::NotesArea::weekly};
    }
    return {};
}

/// Keeps one number on each date.
class PlainRegister : public registers::DatedRegister
{
public:
    PlainRegister(core::Office& office, const RegisterKind& kind) : DatedRegister(office, kind) {}

    int number = 0;
    [[nodiscard]] bool altered() const override { return number != m_stored; }

protected:
    void load_rows() override
    {
        const auto& rows_of = kind().belongings.front();
        auto rows =
            session().select(u"SELECT %1 FROM %2 WHERE %3=?;"_s.arg(named(fields_of(kind().kind).value),
                                                                    named(rows_of.table), named(rows_of.date_key)),
                             open_date()->key);
        const auto* row = rows.first();
        number = m_stored = row ? row->integer(Column{0}) : 0;
    }
    void save_rows() override
    {
        const auto& rows = kind().belongings.front();
        const auto fields = fields_of(kind().kind);
        session().execute(u"DELETE FROM %1 WHERE %2=?;"_s.arg(named(rows.table), named(rows.date_key)),
                          open_date()->key);
        session().insert(
            QString::fromUtf16(rows.table),
            {QString::fromUtf16(rows.date_key), QString::fromUtf16(fields.of), QString::fromUtf16(fields.value)},
            std::array{std::vector{to_value(open_date()->key), to_value(1), to_value(number)}});
    }
    void keep_rows() override { m_stored = number; }
    void drop_rows() override { number = m_stored; }
    void clear_rows() override { number = m_stored = 0; }

private:
    int m_stored = 0;
};

/// Each register in a church of two projects, 1 and 2.
class RegisterKindTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        desk.emplace(*church);
        for (const auto kind : registers::kinds) {
            const auto& names = registers::register_kind(kind);
            for (const int place : {2, 1})
                session().execute(u"INSERT INTO %1 (%2,%3,[position]) VALUES (?,?,?);"_s.arg(
                                      named(names.project_table), named(names.project_key), named(names.project_name)),
                                  session().allocate(names.project_entity), u"Place %1"_s.arg(place), place);
        }
    }
    [[nodiscard]] qint64 count(const char16_t* table)
    {
        return number_of(session(), u"SELECT COUNT(*) FROM %1;"_s.arg(named(table)));
    }
    /// Of all rows of a kind's dates.
    [[nodiscard]] qint64 count_rows(const RegisterKind& kind)
    {
        qint64 rows = count(kind.date_table);
        for (const auto& belonging : kind.belonging_tables())
            rows += count(belonging.table);
        return rows;
    }

    static constexpr Date first{2024, 4, 28}, second{2024, 5, 5}, third{2024, 5, 12};
    std::optional<SetupOffice> desk;
};

} // namespace

KINDREL_ON_BOTH_ENGINES(RegisterKindTest);

TEST_P(RegisterKindTest, EveryRegisterListsItsProjectsInOrderAndRemembersOneForEachPage)
{
    using registers::Page;
    for (const auto each : registers::kinds) {
        const auto& kind = registers::register_kind(each);
        SCOPED_TRACE(QString::fromUtf16(kind.words).toStdString());
        const auto projects = registers::read_projects(session(), kind);
        ASSERT_EQ(projects.size(), 2u);
        EXPECT_EQ(projects.front(), (registers::Project{2, u"Place 1"_s}));
        registers::remember_project(session(), kind, Page::entry, 1);
        EXPECT_EQ(registers::remembered_project(session(), kind, Page::entry), 1);
        EXPECT_EQ(registers::remembered_project(session(), kind, Page::output), 2);
    }
}

TEST_P(RegisterKindTest, EveryRegisterAddsReDatesSavesAndDropsUnderItsLock)
{
    for (const auto each : registers::kinds) {
        const auto& kind = registers::register_kind(each);
        SCOPED_TRACE(QString::fromUtf16(kind.words).toStdString());
        PlainRegister mine(desk->office, kind);
        ASSERT_TRUE(mine.enter() && mine.add(first));
        EXPECT_EQ(core::Locks(desk->office).held({kind.lock, core::LockKey(mine.project())}).size(), 1u);
        mine.number = 5;
        EXPECT_TRUE(mine.save());
        EXPECT_TRUE(mine.change_date(second));
        ASSERT_TRUE(mine.add(first));
        desk->dialogue.expect_box(u"Unable to change to this date as it already exists, please choose a date which has "
                                  "not been used yet."_s);
        EXPECT_FALSE(mine.change_date(second));
        mine.number = 7;
        desk->dialogue.expect_confirm_or_cancel(QString::fromUtf16(kind.unsaved_question), false);
        EXPECT_TRUE(mine.open(mine.dates().front().key));
        EXPECT_EQ(mine.open_date()->date, second);
        EXPECT_EQ(mine.number, 5);
        EXPECT_TRUE(mine.leave());
        EXPECT_TRUE(core::Locks(desk->office).held({kind.lock, core::LockKey(mine.project())}).empty());
        EXPECT_EQ(count(kind.belongings.front().table), 1);
    }
}

TEST_P(RegisterKindTest, EveryRegisterDeletesADateWithItsRowsAndItsNoteAndNoOther)
{
    for (const auto each : registers::kinds) {
        const auto& kind = registers::register_kind(each);
        SCOPED_TRACE(QString::fromUtf16(kind.words).toStdString());
        PlainRegister mine(desk->office, kind);
        ASSERT_TRUE(mine.enter());
        for (const auto& date : {first, second}) {
            ASSERT_TRUE(mine.add(date));
            mine.number = 5;
            ASSERT_TRUE(mine.save());
            registers::Notes notes(desk->office, fields_of(each).notes, mine.project(), mine.open_date()->key);
            notes.type(u"Rain"_s);
            ASSERT_TRUE(notes.save());
        }
        EXPECT_EQ(count_rows(kind), 6);
        const auto& rows = kind.belongings.front();
        desk->dialogue.expect_confirm(u"Please confirm that you wish to remove this record"_s, Answer::yes);
        EXPECT_TRUE(mine.remove(mine.open_date()->key));
        EXPECT_EQ(desk->dialogue.seen().back().more,
                  u"1 %1 and 1 note go with it."_s.arg(QString::fromUtf16(rows.one)));
        EXPECT_EQ(count_rows(kind), 3);
    }
}

TEST_P(RegisterKindTest, ALostLockGuardsEveryRegistersOwnRows)
{
    for (const auto each : registers::kinds) {
        const auto& kind = registers::register_kind(each);
        SCOPED_TRACE(QString::fromUtf16(kind.words).toStdString());
        PlainRegister mine(desk->office, kind);
        ASSERT_TRUE(mine.enter() && mine.add(third));
        mine.number = 5;
        ASSERT_TRUE(mine.save());
        core::Locks(desk->office).unlock(kind.lock, mine.project());
        session().execute(
            u"UPDATE %1 SET %2=6;"_s.arg(named(kind.belongings.front().table), named(fields_of(each).value)));
        mine.number = 7;
        desk->dialogue.expect_box(u"What is stored of this date has changed since it was opened here."_s);
        EXPECT_FALSE(mine.save());
        EXPECT_TRUE(desk->dialogue.seen().back().more.contains(QString::fromUtf16(kind.words)));
    }
}

} // namespace kindrel::test

#include "sample/church.h"
#include "sample/setup_lists.h"

#include "core/files.h"
#include "core/references.h"
#include "core/sqlite_session.h"
#include "people/family_store.h"
#include "people/names.h"
#include "people/working_list.h"
#include "sample/training.h"
#include "support/test_church.h"

#include <QCryptographicHash>
#include <QDir>

#include <algorithm>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

using core::EngineKind;
using core::Session;
using people::FamilyFile;
using people::Person;

const QDate today(2026, 7, 1);

sample::ChurchPlan plan_of(int families, quint32 seed)
{
    return {families, seed, false, today};
}

/// The tables that the rooms of this program name by their references, whatever the engine.
QStringList tables()
{
    QStringList names{u"tbl_surname"_s,      u"tbl_startup"_s,          u"tbl_status_setup"_s, u"tbl_group_setup"_s,
                      u"tbl_suburb_setup"_s, u"tbl_occupation_setup"_s, u"tbl_title"_s,        u"tbl_id_person"_s};
    for (const auto& reference : core::references())
        names += QString::fromLatin1(reference.table);
    names.removeDuplicates();
    return names;
}

QString cell(const core::Row& row, core::Column column)
{
    return row.is_null(column) ? u"-"_s : row.text(column);
}

/// The rows of all tables as one number; the order in which an engine returns rows does not count.
QByteArray fingerprint(Session& session)
{
    QCryptographicHash hash(QCryptographicHash::Sha256);
    for (const auto& table : tables()) {
        QStringList lines;
        auto rows = session.select(u"SELECT * FROM [%1];"_s.arg(table));
        const int columns = rows.column_count();
        for (const core::Row& row : rows) {
            auto& line = lines.emplace_back(table);
            for (int column = 0; column < columns; ++column)
                line += u'\t' + cell(row, core::Column{column});
        }
        lines.sort();
        hash.addData(lines.join(u'\n').toUtf8());
    }
    return hash.result().toHex();
}

QByteArray fingerprint_of(EngineKind engine, const sample::ChurchPlan& plan)
{
    TestChurch church(engine);
    sample::fill_church(church.session(), plan, {}, {});
    return fingerprint(church.session());
}

QByteArray content_of(const QString& folder)
{
    QByteArray content;
    for (const auto& name : QDir(folder).entryList(QDir::Files, QDir::Name))
        content += name.toUtf8() + '\n' + core::read_file(folder + u'/' + name).value();
    return content;
}

/// The training church, laid once; nobody changes it.
class TrainingChurchTest : public testing::Test
{
protected:
    static void SetUpTestSuite()
    {
        folder = std::make_unique<QTemporaryDir>();
        sample::lay_training_church(folder->path());
        session = core::open_sqlite(folder->filePath(u"KR10_records.kdl"_s));
    }
    static void TearDownTestSuite()
    {
        session.reset();
        folder.reset();
    }
    [[nodiscard]] static qint64 count(const QString& of)
    {
        return number_of(*session, u"SELECT COUNT(*) FROM "_s + of);
    }
    [[nodiscard]] static std::vector<FamilyFile> all_families()
    {
        std::vector<int> keys;
        for (const core::Row& row : session->select(u"SELECT [Surname_ID] FROM [tbl_surname];"_s))
            keys.push_back(row.integer(core::Column{0}));
        return people::load_families(*session, keys);
    }

    static inline std::unique_ptr<QTemporaryDir> folder;
    static inline std::unique_ptr<Session> session;
};

/// Rows of which the training church must hold at least one.
const QStringList rare_rows{
    u"[tbl_people] WHERE [Active] = 0 AND [Decease] = 0 AND [Privacy] = 0 AND [Prospect] = 0 AND [archive] = 0 "
    "AND [contact] = 0"_s,
    u"[tbl_people] WHERE [Active] = -1 AND [Decease] = -1 AND [Privacy] = -1 AND [Prospect] = -1 AND [archive] = "
    "-1 AND [contact] = -1"_s,
    u"[tbl_people] WHERE [position] = 1 AND [Decease] = -1"_s,
    u"[tbl_people] WHERE [position] = 17"_s,
    u"[tbl_people] WHERE LENGTH([Name]) = 60"_s,
    u"[tbl_people] WHERE [preferred_name] IS NOT NULL"_s,
    u"[tbl_surname] WHERE LENGTH([surname]) = 60"_s,
    u"[tbl_surname] WHERE [surname] >= 'א' AND [surname] < 'ת'"_s,
    u"[tbl_surname] WHERE [surname] >= 'ا' AND [surname] < 'ي'"_s,
    u"[tbl_surname] WHERE REPLACE([surname], '''', '') <> [surname]"_s,
    u"[tbl_surname] WHERE UPPER([surname]) <> [sort_key] AND [sort_key] >= 'A' AND [sort_key] <= 'ZZ'"_s,
    u"[tbl_surname] WHERE [created] IS NULL"_s,
    u"[tbl_surname] WHERE [booked_out] = -1 AND [active_in_book] = 0 AND [booked_out_date] IS NOT NULL"_s,
    u"[tbl_surname] WHERE [booked_out] = -1 AND [active_in_book] = -1 AND [booked_out_person] IS NOT NULL"_s,
    u"[tbl_surname] WHERE [booked_out] = 0 AND [active_in_book] = -1"_s,
    u"[tbl_personal_details] WHERE [birthdate] = '1800-02-29'"_s,
    u"[tbl_personal_details] WHERE [birthdate] = '1956-02-29'"_s,
    u"[tbl_personal_details] WHERE [birthdate] = '2026-07-01'"_s,
    u"[tbl_personal_details] WHERE [birthdate] IS NULL"_s,
    u"[tbl_personal_details] WHERE [other_surname] IS NOT NULL"_s,
    u"[tbl_events] WHERE [event_date] = '1800-02-29'"_s,
    u"[tbl_family_date] WHERE [family_date] = '1800-02-29' AND [family_date_tagged] = 0"_s,
    u"[tbl_family_date] WHERE [family_date_tagged] = -1"_s,
    u"[tbl_individual_date] WHERE [in_date] = '1800-03-12'"_s,
    u"[tbl_individual_date] WHERE [in_date_tagged] = -1"_s,
    u"[tbl_flexi] WHERE [flexi_tagged] = -1 AND [flexi_field] IS NOT NULL"_s,
    u"[tbl_address] WHERE [res_street] IS NULL AND [phone] IS NULL"_s,
    u"[tbl_address] WHERE [post_street] IS NOT NULL AND [res_street] IS NOT NULL"_s,
    u"[tbl_address] WHERE [res_country] IS NOT NULL"_s,
    u"[tbl_address] WHERE [transfer_exists] = -1"_s,
    u"[tbl_address] WHERE [audio_note] IS NOT NULL"_s,
    u"[tbl_suburb] WHERE [postcode_var] IS NOT NULL AND [suburb_id] IS NOT NULL"_s,
    u"[tbl_suburb] WHERE [postcode_var] IS NOT NULL AND [suburb_id] IS NULL"_s,
    u"[tbl_surname] WHERE [Surname_ID] NOT IN (SELECT [surname_id] FROM [tbl_suburb])"_s,
    u"[tbl_ministry] a JOIN [tbl_ministry] b ON a.[person_id]=b.[person_id] AND a.[ministry_id]=b.[ministry_id] "
    "WHERE a.[ministry_type] < b.[ministry_type]"_s,
    u"[tbl_group_history] WHERE [completed] = -1 AND [group_id] IN (SELECT [group_id] FROM [tbl_group_setup] "
    "WHERE [not_active] = -1)"_s,
    u"[tbl_other_contact]"_s,
    u"[tbl_visitation]"_s,
    u"[tbl_family_group]"_s,
    u"[tbl_pin]"_s,
};

struct RareValues
{
    QString table, field, values;
};

const std::vector<RareValues> rare_values{
    {u"tbl_people"_s, u"Marital"_s, u"1 2 3 4 5 6 7 8 9 10 11 12 13 14 15"_s},
    {u"tbl_surname"_s, u"Condition"_s, u"0 1 2 3"_s},
    {u"tbl_personal_details"_s, u"school_year"_s, u"-2 -1 1 2 3 4 5 6 7 8 9 10 11 12"_s},
    {u"tbl_ministry"_s, u"ministry_type"_s, u"1 2"_s},
};

struct RareSwitches
{
    QString table, fields;
    int value;
};

const std::vector<RareSwitches> rare_switches{
    {u"tbl_people"_s, u"Active Decease Privacy Prospect archive contact Preferred_Name_hidden"_s, -1},
    {u"tbl_personal_details"_s,
     u"Title_hidden birthdate_hidden middle_hidden surname_hidden mobile_hidden email_hidden bussiness_phone_hidden "
     "Bussiness_fax_hidden bussiness_email_hidden Bussiness_hidden"_s,
     -1},
    {u"tbl_address"_s,
     u"res_hidden post_hidden phone_hidden family_fax_hidden family_email_hidden family_mobile_hidden"_s, -1},
    {u"tbl_record_access"_s,
     u"Address Details status groups ministry date flexi contact visitation family_group family_date occupation events "
     "pin"_s,
     0},
};

} // namespace

TEST(SampleChurch, TheSamePlanGivesTheSameRowsAndAnotherSeedGivesOthers)
{
    const auto rows = fingerprint_of(EngineKind::sqlite, plan_of(200, 5));

    EXPECT_EQ(rows, fingerprint_of(EngineKind::sqlite, plan_of(200, 5)));
    EXPECT_NE(rows, fingerprint_of(EngineKind::sqlite, plan_of(200, 6)));
}

TEST(SampleChurch, BothEnginesHoldTheSameRows)
{
    if (!TestChurch::available(EngineKind::postgres))
        GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";

    EXPECT_EQ(fingerprint_of(EngineKind::postgres, plan_of(170, 5)),
              fingerprint_of(EngineKind::sqlite, plan_of(170, 5)));
}

TEST(SampleChurch, ALargerChurchBeginsWithTheFamiliesOfASmallerOne)
{
    const auto names =
        u"SELECT [surname] || [Primary_name] FROM [tbl_surname] WHERE [Surname_ID] <= 40 ORDER BY [Surname_ID];"_s;
    QStringList seen[2];
    for (const int larger : {0, 1}) {
        TestChurch church(EngineKind::sqlite);
        sample::fill_church(church.session(), plan_of(larger ? 60 : 40, 8), {}, {});
        for (const core::Row& row : church.session().select(names))
            seen[larger] += row.text(core::Column{0});
    }

    EXPECT_EQ(seen[0].size(), 40);
    EXPECT_EQ(seen[0], seen[1]);
}

TEST_F(TrainingChurchTest, EveryRareThingOccursSomewhere)
{
    for (const auto& condition : rare_rows)
        EXPECT_GT(count(condition), 0) << condition.toStdString();
}

TEST_F(TrainingChurchTest, EveryCodeAndEverySwitchOccursSomewhere)
{
    for (const auto& [table, field, values] : rare_values) {
        for (const auto& value : values.split(u' '))
            EXPECT_GT(count(u"[%1] WHERE [%2] = %3"_s.arg(table, field, value)), 0)
                << field.toStdString() << ' ' << value.toStdString();
    }
    for (const auto& [table, fields, value] : rare_switches) {
        for (const auto& field : fields.split(u' '))
            EXPECT_GT(count(u"[%1] WHERE [%2] = %3"_s.arg(table, field).arg(value)), 0) << field.toStdString();
    }
}

TEST_F(TrainingChurchTest, NothingPointsNowhereAndNothingContradicts)
{
    const QStringList faults{
        u"[tbl_people] WHERE [person_id] NOT IN (SELECT [person_id] FROM [tbl_personal_details])"_s,
        u"[tbl_surname] WHERE [Surname_ID] NOT IN (SELECT [surname_id] FROM [tbl_address])"_s,
        u"[tbl_surname] WHERE [Surname_ID] NOT IN (SELECT [Surname_ID] FROM [tbl_people] WHERE [position] = 1)"_s,
        u"(SELECT [Surname_ID] FROM [tbl_people] GROUP BY [Surname_ID] HAVING MAX([position]) <> COUNT(*) OR "
        "COUNT(DISTINCT [position]) <> COUNT(*)) f"_s,
        u"[tbl_surname] f JOIN [tbl_people] p ON p.[Surname_ID]=f.[Surname_ID] AND p.[position]=1 WHERE p.[Name] "
        "<> f.[Primary_name]"_s,
        u"[tbl_surname] WHERE [last_edit] < [created] OR [last_edit] > '2026-07-01'"_s,
        u"[tbl_personal_details] WHERE [Title] IS NOT NULL AND [Title] NOT IN (SELECT [Title] FROM [tbl_title])"_s,
        u"[tbl_personal_details] WHERE [birthdate] > '2026-07-01'"_s,
        u"[tbl_address] WHERE [res_street] IS NOT NULL AND [surname_id] NOT IN (SELECT [surname_id] FROM "
        "[tbl_suburb] WHERE [Type] = 1)"_s,
        u"[tbl_address] WHERE [post_street] IS NOT NULL AND [surname_id] NOT IN (SELECT [surname_id] FROM "
        "[tbl_suburb] WHERE [Type] = 2)"_s,
        u"[tbl_group] WHERE [group_id] IN (SELECT [group_id] FROM [tbl_group_setup] WHERE [not_active] = -1)"_s,
        u"[tbl_group] g LEFT JOIN [tbl_group_history] h ON h.[person_id]=g.[person_id] AND "
        "h.[group_id]=g.[group_id] AND h.[completed]=0 WHERE h.[history_id] IS NULL"_s,
        u"[tbl_group_history] h LEFT JOIN [tbl_group] g ON h.[person_id]=g.[person_id] AND "
        "h.[group_id]=g.[group_id] WHERE h.[completed]=0 AND g.[group_id] IS NULL"_s,
        u"[tbl_group_history] WHERE [completed]=-1 AND ([date_out] IS NULL OR [date_out] < [date_in] OR "
        "[date_out] > '2026-07-01')"_s,
        u"[tbl_group_history] WHERE [completed]=0 AND ([date_out] IS NOT NULL OR [date_in] > '2026-07-01')"_s,
        u"[tbl_group_setup] WHERE [group_id] NOT IN (SELECT [group_id] FROM [tbl_group_details] WHERE [leader] IS "
        "NOT NULL)"_s,
        u"[tbl_startup] WHERE [pin_auto_number_start] <= (SELECT MAX(CAST([personal_pin] AS INTEGER)) FROM "
        "[tbl_pin])"_s,
    };
    for (const auto& fault : faults)
        EXPECT_EQ(count(fault), 0) << fault.toStdString();
}

TEST_F(TrainingChurchTest, EveryKeyIsBackedByItsCounterAndEveryReferenceByARow)
{
    struct Home
    {
        core::Entity entity;
        QString table, key;
    };
    const std::vector<Home> homes{
        {core::Entity::surname, u"tbl_surname"_s, u"Surname_ID"_s},
        {core::Entity::person, u"tbl_people"_s, u"person_id"_s},
        {core::Entity::group, u"tbl_group_setup"_s, u"group_id"_s},
        {core::Entity::status, u"tbl_status_setup"_s, u"status_id"_s},
        {core::Entity::ministry, u"tbl_ministry_setup"_s, u"ministry_id"_s},
        {core::Entity::individual_date, u"tbl_individual_date_setup"_s, u"in_date_id"_s},
        {core::Entity::flexi, u"tbl_flexi_setup"_s, u"flexi_id"_s},
        {core::Entity::family_group, u"tbl_family_group_setup"_s, u"family_group_id"_s},
        {core::Entity::family_date, u"tbl_family_date_setup"_s, u"fam_date_id"_s},
        {core::Entity::title, u"tbl_title"_s, u"title_id"_s},
        {core::Entity::occupation, u"tbl_occupation_setup"_s, u"occupation_id"_s},
        {core::Entity::suburb, u"tbl_suburb_setup"_s, u"suburb_id"_s},
        {core::Entity::history, u"tbl_group_history"_s, u"history_id"_s},
    };
    for (const auto& home : homes) {
        EXPECT_GT(count(u"[%1]"_s.arg(home.table)), 0) << home.table.toStdString();
        EXPECT_EQ(count(u"[%1] WHERE [%2] > (SELECT MAX([id_found]) FROM [%3])"_s.arg(
                      home.table, home.key, core::counter_table(home.entity).toString())),
                  0)
            << home.table.toStdString();
        for (const auto& reference : core::references()) {
            if (reference.to != home.entity)
                continue;
            const auto field = QString::fromLatin1(reference.field);
            EXPECT_EQ(count(u"[%1] WHERE [%2] IS NOT NULL AND [%2] NOT IN (SELECT [%3] FROM [%4])"_s.arg(
                          QString::fromLatin1(reference.table), field, home.key, home.table)),
                      0)
                << reference.table << '.' << reference.field;
        }
    }
}

TEST_F(TrainingChurchTest, TheSetupListsAreWellFilled)
{
    const std::vector<std::pair<QString, int>> least{
        {u"tbl_status_setup"_s, 8},          {u"tbl_group_setup"_s, 14}, {u"tbl_ministry_setup"_s, 12},
        {u"tbl_individual_date_setup"_s, 6}, {u"tbl_flexi_setup"_s, 6},  {u"tbl_family_group_setup"_s, 6},
        {u"tbl_family_date_setup"_s, 4},     {u"tbl_title"_s, 8},        {u"tbl_occupation_setup"_s, 40},
        {u"tbl_suburb_setup"_s, 25},
    };
    for (const auto& [table, items] : least) {
        EXPECT_GE(count(u"[%1]"_s.arg(table)), items) << table.toStdString();
        EXPECT_EQ(number_of(*session, u"SELECT MAX([position]) FROM [%1];"_s.arg(table)), count(u"[%1]"_s.arg(table)));
    }
}

TEST_F(TrainingChurchTest, TheCodesOfAFamilyFitTogether)
{
    int further_adults = 0;
    for (const auto& file : all_families()) {
        const auto household = people::household_of(file.people);
        const int code = household.primary->Marital;
        const bool living_child =
            std::ranges::any_of(household.children, [](const auto* child) { return !child->Decease; });
        const bool couple = code == 3 || code == 4 || code == 14 || code == 15;
        const bool parent = code == 2 || code == 4 || (code >= 11 && code <= 13) || code == 15;
        further_adults += household.adults.size() > 2;

        EXPECT_FALSE(people::is_child(*household.primary)) << file.family.Surname_ID;
        EXPECT_EQ(household.spouse != nullptr, couple) << file.family.Surname_ID;
        EXPECT_EQ(living_child, parent) << file.family.Surname_ID;
    }
    EXPECT_GT(further_adults, 0);
}

TEST_F(TrainingChurchTest, ParentsAreOlderThanTheirChildren)
{
    const auto born = [](const Person& person) {
        return person.birthdate && person.birthdate->year_known() ? person.birthdate->year : 0;
    };
    for (const auto& file : all_families()) {
        const int parent = born(file.people.front());
        for (const auto& person : file.people) {
            if (people::is_child(person) && parent > 0 && born(person) > 0) {
                EXPECT_GE(born(person) - parent, 17) << file.family.Surname_ID;
            }
        }
    }
}

TEST_F(TrainingChurchTest, StandsCompleteInItsFolder)
{
    EXPECT_GE(count(u"[tbl_surname]"_s), 160);
    EXPECT_GE(count(u"[tbl_people]"_s), 450);
    EXPECT_EQ(count(u"[tbl_startup] WHERE [vision] IS NOT NULL AND [title_church]=-1 "
                    "AND [footer_vision_line2] IS NOT NULL"_s),
              1);
    EXPECT_EQ(core::read_file(folder->filePath(u"loaded.dat"_s)), "1234567890");
    EXPECT_FALSE(QDir(folder->filePath(u"NBook"_s)).entryList({u"*.fll"_s}).isEmpty());
}

TEST_F(TrainingChurchTest, PhotographsAreJpegsThatBelongToSomebody)
{
    qint64 size = 0;
    std::array<int, 2> found{};
    for (const auto& picture : QDir(folder->filePath(u"Portrait"_s)).entryInfoList(QDir::Files)) {
        const auto name = picture.completeBaseName();
        const bool family = name.startsWith(u'F');
        const auto owner = family ? u"[tbl_surname] WHERE [Surname_ID]=%1"_s : u"[tbl_people] WHERE [person_id]=%1"_s;
        ++found[family];
        size += picture.size();
        EXPECT_EQ(count(owner.arg(name.mid(family))), 1) << name.toStdString();
        EXPECT_TRUE(core::read_file(picture.filePath())->startsWith("\xff\xd8\xff")) << name.toStdString();
    }
    EXPECT_GT(found[false], 150);
    EXPECT_GT(found[true], 15);
    EXPECT_LT(size, 1500000);
}

TEST_F(TrainingChurchTest, IsLaidTheSameEveryTime)
{
    const QTemporaryDir again;
    sample::lay_training_church(again.path());

    for (const auto& part : QStringList{u"."_s, u"Portrait"_s, u"NBook"_s})
        EXPECT_EQ(content_of(folder->filePath(part)), content_of(again.filePath(part))) << part.toStdString();
}

TEST(MasterDatabase, HoldsTheUsualTitlesAndNoFamily)
{
    const QTemporaryDir folder;
    sample::make_master(folder.filePath(u"KR10_records.kdl"_s));
    const auto session = core::open_sqlite(folder.filePath(u"KR10_records.kdl"_s));

    EXPECT_GE(number_of(*session, u"SELECT COUNT(*) FROM [tbl_title];"_s), 8);
    EXPECT_EQ(number_of(*session, u"SELECT COUNT(*) FROM [tbl_surname];"_s), 0);
    EXPECT_GT(session->allocate(core::Entity::title),
              number_of(*session, u"SELECT MAX([title_id]) FROM [tbl_title];"_s));

    sample::write_titles(*session);
    EXPECT_EQ(number_of(*session, u"SELECT COUNT(*) FROM [tbl_title];"_s),
              number_of(*session, u"SELECT COUNT(DISTINCT [Title]) FROM [tbl_title];"_s));
}

} // namespace kindrel::test

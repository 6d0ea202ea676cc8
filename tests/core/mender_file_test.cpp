#include "mender_place.h"

#include "core/church_recovery.h"
#include "core/sqlite_session.h"
#include "core/verified_copy.h"

#include <QRandomGenerator>

// Damages of a church file, which only the embedded engine has.
namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

constexpr int page_size = 4096;
constexpr int families = 20000;

/// Empties a page, fills it with noise or with another page, or flips bits of it.
void harm(QByteArray& content, quint32 page, QRandomGenerator& random)
{
    const auto start = static_cast<qsizetype>(page) * page_size;
    const auto other = static_cast<qsizetype>(random.bounded(static_cast<quint32>(content.size() / page_size)));
    switch (random.bounded(4)) {
    case 0:
        content.replace(start, page_size, QByteArray(page_size, '\0'));
        break;
    case 1:
        content.replace(start, page_size, content.mid(other * page_size, page_size));
        break;
    case 2:
        std::generate_n(content.begin() + start, page_size, [&] { return static_cast<char>(random.generate()); });
        break;
    default:
        for (int flip = 0; flip < 20; ++flip)
            content[start + random.bounded(page_size)] ^= static_cast<char>(1 << random.bounded(7));
    }
}

/// Gives the row that holds the text another key of the same length: a cell is its size, its key, the sizes of its
/// values and then these.
void give_key(QByteArray& content, const QByteArray& text, int family, int key)
{
    const auto varint = [](int number) {
        return QByteArray().append(static_cast<char>(0x80 | (number >> 7))).append(static_cast<char>(number & 0x7F));
    };
    const auto at = content.lastIndexOf(varint(family), content.indexOf(text));
    ASSERT_LT(content.indexOf(text) - at, 100);
    content.replace(at, varint(family).size(), varint(key));
}

int rows_of(const std::vector<RecoveredTable>& tables, const QString& table)
{
    return std::ranges::find(tables, table, &RecoveredTable::table)->rows;
}

} // namespace

class MenderFileTest : public MenderPlaceTest
{
protected:
    void fill_many()
    {
        std::vector<std::vector<Value>> rows;
        for (int family = 100; family < 100 + families; ++family)
            rows.push_back({to_value(family), to_value(u"Family %1"_s.arg(family))});
        session().insert(u"tbl_surname"_s, {u"Surname_ID"_s, u"surname"_s}, rows);
    }
    /// The file's content once nobody has it open.
    [[nodiscard]] QByteArray closed_content()
    {
        place->session.reset();
        church->close();
        return DataFolder::read(church->file());
    }
    /// Every recovered family must be one that was there.
    void expect_true_families(const QString& file, int told)
    {
        const auto fresh = open_sqlite(file);
        EXPECT_EQ(number_of(*fresh, u"SELECT COUNT(*) FROM [tbl_surname];"_s), told);
        EXPECT_EQ(number_of(*fresh, u"SELECT COUNT(*) FROM [tbl_surname] WHERE [Surname_ID]>=100 AND "
                                    "[surname]<>'Family ' || [Surname_ID];"_s),
                  0);
    }
    [[nodiscard]] QString fresh() const { return folder.filePath(u"fresh.kdl"_s); }
};
INSTANTIATE_TEST_SUITE_P(Engines, MenderFileTest, testing::Values(EngineKind::sqlite), engine_name);

TEST_P(MenderFileTest, AStoredQueryThatIsNotTheProgramsIsMadeAgain)
{
    const QString count = u"SELECT COUNT([Version]) FROM [qry_search_window];"_s;
    ASSERT_EQ(number_of(session(), count), 1);
    run({u"DROP VIEW [qry_search_window];"_s, u"CREATE VIEW [qry_search_window] AS SELECT 1 AS [x];"_s});
    ASSERT_EQ(examine().size(), 1U) << told(examine());
    EXPECT_EQ(examine().front().words, u"The stored query 'qry_search_window' is not as the program makes it."_s);
    EXPECT_TRUE(mend_church(*place, {}).left.empty());
    EXPECT_EQ(number_of(session(), count), 1);
}

TEST_P(MenderFileTest, RowsThatAreThereTwiceLoseTheDouble)
{
    run({u"DROP TABLE [tbl_group];"_s,
         u"CREATE TABLE [tbl_group] ([person_id] INTEGER NOT NULL, "
         "[group_id] INTEGER NOT NULL, [g_position] INTEGER);"_s,
         u"INSERT INTO [tbl_group] VALUES (10,5,NULL),(10,5,NULL),(11,5,0);"_s});
    const auto mending = mend_church(*place, {});
    EXPECT_EQ(std::ranges::count(mending.mended, u"doubles"_s, &Finding::kind), 1) << told(mending.left);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group];"_s), 2);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group] WHERE [g_position] IS NULL;"_s), 1);
}

TEST_P(MenderFileTest, AnIndexThatDoesNotFitItsTableIsMadeAgain)
{
    const QString right = u"CREATE INDEX [idx_events_date] ON [tbl_events] ([event_date])"_s;
    const QString wrong = u"CREATE INDEX [idx_events_date] ON [tbl_events] ([event])"_s;
    const QString alter = u"UPDATE [sqlite_master] SET [sql]=? WHERE [name]='idx_events_date';"_s;
    for (const auto& text : {wrong, right}) {
        session().execute(u"PRAGMA writable_schema=ON;"_s);
        session().execute(alter, text);
        church->reopen();
        if (text == wrong)
            run({u"INSERT INTO [tbl_events] ([surname_id],[event_date],[event]) VALUES (1,'2024-01-01','x');"_s});
    }
    place->session = church->another();
    ASSERT_EQ(examine().size(), 1U) << told(examine());
    EXPECT_EQ(examine().front().kind, u"indexes"_s);
    EXPECT_TRUE(mend_church(*place, {}).left.empty());
}

TEST_P(MenderFileTest, ADamagedFileIsToldAndNotMendedInItsPlace)
{
    fill_many();
    QByteArray content = closed_content();
    const auto at = content.indexOf("Family 2000") / page_size * page_size;
    content.replace(at, page_size, QByteArray(page_size, '\x5A'));
    DataFolder::write(church->file(), content);
    place->session = open_sqlite(church->file());
    const auto found = examine();
    ASSERT_FALSE(found.empty());
    EXPECT_EQ(found.front().cure, Cure::recover) << told(found);
    EXPECT_TRUE(mend_church(*place, {}).refusal.contains(u"recovered into a new church file"));
    place->session.reset();
    EXPECT_EQ(DataFolder::read(church->file()), content);
}

TEST_P(MenderFileTest, AnOverwrittenPageCostsItsOwnRowsOnly)
{
    fill_many();
    const QByteArray whole = closed_content();
    QByteArray content = whole;
    for (const auto* name : {"Family 1500", "Family 3000"}) {
        const auto at = whole.indexOf(name) / page_size * page_size;
        content.replace(at, page_size, QByteArray(page_size, '\x5A'));
    }
    DataFolder::write(church->file(), content);
    const auto tables = recover_church(church->file(), fresh());
    const int told = rows_of(tables, u"tbl_surname"_s);
    EXPECT_GT(told, families * 9 / 10);
    EXPECT_LT(told, families + 2);
    EXPECT_FALSE(std::ranges::find(tables, u"tbl_surname"_s, &RecoveredTable::table)->whole);
    EXPECT_TRUE(std::ranges::find(tables, u"tbl_people"_s, &RecoveredTable::table)->whole);
    expect_true_families(fresh(), told);
    EXPECT_EQ(DataFolder::read(church->file()), content);
}

TEST_P(MenderFileTest, ADamagedEndOfATableCostsTheRowsThereOnly)
{
    fill_many();
    const QByteArray whole = closed_content();
    const QString first = u"Family 100"_s, last = u"Family %1"_s.arg(99 + families);
    for (const QStringList& damaged : {QStringList{first}, {last}, {first, last}}) {
        QByteArray content = whole;
        for (const auto& family : damaged)
            content.replace(whole.indexOf(family.toUtf8()) / page_size * page_size, page_size,
                            QByteArray(page_size, 'Z'));
        DataFolder::write(church->file(), content);
        QFile::remove(fresh());
        const auto tables = recover_church(church->file(), fresh());
        EXPECT_GT(rows_of(tables, u"tbl_surname"_s), families - 1000) << damaged.join(u' ').toStdString();
        EXPECT_LT(rows_of(tables, u"tbl_surname"_s), families) << damaged.join(u' ').toStdString();
        expect_true_families(fresh(), rows_of(tables, u"tbl_surname"_s));
    }
}

TEST_P(MenderFileTest, AWrongKeyCostsItsOwnRowOnly)
{
    fill_many();
    const QByteArray whole = closed_content();
    for (const int key : {14146, 5954}) {
        QByteArray content = whole;
        give_key(content, "Family 10050", 10050, key);
        ASSERT_EQ(content.size(), whole.size());
        DataFolder::write(church->file(), content);
        QFile::remove(fresh());
        const auto tables = recover_church(church->file(), fresh());
        EXPECT_GE(rows_of(tables, u"tbl_surname"_s), families - 10) << key;
        EXPECT_FALSE(std::ranges::find(tables, u"tbl_surname"_s, &RecoveredTable::table)->whole) << key;
        expect_true_families(fresh(), rows_of(tables, u"tbl_surname"_s));
    }
}

TEST_P(MenderFileTest, PagesDamagedAtRandomNeverBringTheRecoveryDown)
{
    fill_many();
    const QByteArray whole = closed_content();
    const auto pages = static_cast<quint32>(whole.size() / page_size);
    QRandomGenerator random(1205);
    int recovered = 0;
    for (int round = 0; round < 12; ++round) {
        QByteArray content = whole;
        for (int damage = 0; damage <= round % 8; ++damage)
            harm(content, random.bounded(1U, pages), random);
        DataFolder::write(church->file(), content);
        QFile::remove(fresh());
        try {
            (void)recover_church(church->file(), fresh());
            EXPECT_NO_THROW(check_church_file(fresh())) << round;
            ++recovered;
        } catch (const DatabaseError&) {
            EXPECT_FALSE(QFile::exists(fresh())) << round;
        }
    }
    EXPECT_GT(recovered, 6);
}

TEST_P(MenderFileTest, OfATruncatedFileComesBackWhatIsLeft)
{
    fill_many();
    const QByteArray whole = closed_content();
    for (const int percent : {90, 80}) {
        const QByteArray content = whole.left(whole.size() * percent / 100);
        DataFolder::write(church->file(), content);
        QFile::remove(fresh());
        const auto tables = recover_church(church->file(), fresh());
        const int told = rows_of(tables, u"tbl_surname"_s);
        EXPECT_GT(told, families / 10) << percent;
        EXPECT_LT(told, families + 2) << percent;
        EXPECT_EQ(rows_of(tables, u"tbl_people"_s), 3);
        expect_true_families(fresh(), told);
        EXPECT_EQ(DataFolder::read(church->file()), content);
    }
}

TEST_P(MenderFileTest, RecoveringNeverWritesOverAFileAndLeavesNothingOfAFailure)
{
    const QByteArray content = closed_content();
    DataFolder::write(fresh(), "mine");
    EXPECT_THROW((void)recover_church(church->file(), fresh()), FileError);
    EXPECT_EQ(DataFolder::read(fresh()), "mine");
    QFile::remove(fresh());

    DataFolder::write(church->file(), QByteArray(content.size(), 'x'));
    EXPECT_THROW((void)recover_church(church->file(), fresh()), DatabaseError);
    EXPECT_TRUE(QDir(folder.path()).entryList({u"fresh*"_s}, QDir::Files).isEmpty());
}

} // namespace kindrel::test

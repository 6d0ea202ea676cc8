#include "core/dialect.h"
#include "core/session.h"
#include "core/sqlite_session.h"
#include "support/processes.h"
#include "support/test_church.h"

#include <QFile>

#include <set>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString keys_of_groups = u"SELECT [id_found] FROM [tbl_id_group] ORDER BY [id_found];"_s;

std::vector<qint64> numbers(Session& session, const QString& statement)
{
    std::vector<qint64> found;
    auto rows = session.select(statement);
    for (const Row& row : rows)
        found.push_back(row.number(Column{0}));
    return found;
}

} // namespace

class SessionTest : public EngineTest
{
};
KINDREL_ON_BOTH_ENGINES(SessionTest);

TEST_P(SessionTest, ValuesComeBackAsTheyWereBound)
{
    session().execute(u"INSERT INTO [tbl_surname] ([SURNAME_id],[surname],[created],[booked_out],[Primary_name]) "
                      "VALUES (?,?,?,?,?);"_s,
                      7, u"D’Souza 中文 'q' ?"_s, Date{1800, 2, 29}, true, QString());

    auto rows = session().select(u"SELECT * FROM [tbl_surname] WHERE [surname]=?;"_s, u"D’Souza 中文 'q' ?"_s);
    const auto* row = rows.first();

    ASSERT_NE(row, nullptr);
    EXPECT_EQ(row->integer(rows.column(u"surname_ID")), 7);
    EXPECT_EQ(row->text(rows.column(u"SURNAME")), u"D’Souza 中文 'q' ?"_s);
    EXPECT_EQ(row->date(rows.column(u"created")), (Date{1800, 2, 29}));
    EXPECT_EQ(row->number(rows.column(u"booked_out")), -1);
    EXPECT_TRUE(row->is_null(rows.column(u"Primary_name")));
    EXPECT_THROW((void)rows.column(u"absent"), DatabaseError);
}

TEST_P(SessionTest, AFailedStatementThrowsAndLeavesTheSessionUsable)
{
    EXPECT_THROW((void)session().select(u"SELECT [nothing] FROM [tbl_people];"_s), DatabaseError);
    session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (1);"_s);
    try {
        session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (1);"_s);
        FAIL() << "A key was given twice.";
    } catch (const DatabaseError& error) {
        EXPECT_TRUE(error.constraint_broken());
    }
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_surname];"_s), 1);
}

TEST_P(SessionTest, ATransactionThatWasNotCommittedLeavesNothing)
{
    const auto add = [&](int key) {
        session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (?);"_s, key);
    };
    {
        Transaction outer(session());
        add(1);
        {
            Transaction lost(session());
            add(2);
        }
        {
            Transaction kept(session());
            add(3);
            kept.commit();
        }
        outer.commit();
    }
    {
        Transaction lost(session());
        add(4);
    }
    EXPECT_EQ(numbers(session(), u"SELECT [Surname_ID] FROM [tbl_surname] ORDER BY [Surname_ID];"_s),
              (std::vector<qint64>{1, 3}));
    EXPECT_EQ(session().transaction_depth(), 0);
}

TEST_P(SessionTest, ManyRowsAreInsertedAllOrNone)
{
    std::vector<std::vector<Value>> rows;
    for (qint64 key = 1; key <= 20000; ++key)
        rows.push_back({key, to_value(u"name %1"_s.arg(key))});
    session().insert(u"tbl_surname"_s, {u"Surname_ID"_s, u"surname"_s}, rows);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_surname];"_s), 20000);

    const std::vector<std::vector<Value>> clash{{qint64{20001}, {}}, {qint64{1}, {}}};
    EXPECT_THROW(session().insert(u"tbl_surname"_s, {u"Surname_ID"_s, u"surname"_s}, clash), DatabaseError);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_surname];"_s), 20000);
}

TEST_P(SessionTest, ATemporaryTableIsFilledAnewWithoutHoldingOthersUp)
{
    const auto other = church->another();
    Transaction others_work(*other);
    other->execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (1);"_s);
    const std::vector<std::vector<Value>> first{{qint64{1}, qint64{10}}, {qint64{2}, qint64{20}}};
    const std::vector<std::vector<Value>> second{{qint64{1}, qint64{30}}};

    session().fill_temporary(u"work_people"_s, {u"place"_s, u"person_id"_s}, first);
    session().fill_temporary(u"work_people"_s, {u"place"_s, u"person_id"_s}, second);

    EXPECT_EQ(numbers(session(), u"SELECT [person_id] FROM [work_people];"_s), std::vector<qint64>{30});
    EXPECT_THROW((void)other->select(u"SELECT * FROM [work_people];"_s), DatabaseError);
}

TEST_P(SessionTest, TheChangeMarkMovesWithEveryCommitOfAnyWorkstation)
{
    const auto other = church->another();
    const auto before = session().change_mark();
    other->execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (1);"_s);
    const auto after_theirs = session().change_mark();
    session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (2);"_s);

    EXPECT_NE(after_theirs, before);
    EXPECT_NE(session().change_mark(), after_theirs);
}

TEST_P(SessionTest, KeysStartAtOneAndTheCounterIsPrunedAfterFiftyRows)
{
    EXPECT_EQ(session().allocate(Entity::group), 1);
    for (int key = 2; key <= 50; ++key)
        EXPECT_EQ(session().allocate(Entity::group), key);
    EXPECT_EQ(numbers(session(), keys_of_groups).size(), 50U);

    EXPECT_EQ(session().allocate(Entity::group), 51);

    const auto left = numbers(session(), keys_of_groups);
    EXPECT_EQ(left.size(), 11U);
    EXPECT_EQ(left.front(), 41);
    EXPECT_EQ(left.back(), 51);
}

TEST_P(SessionTest, ManyKeysAtOnceLeaveTheCounterAsSingleAllocationsWould)
{
    for (const int count : {1, 30, 49, 50, 51, 91, 92, 250}) {
        TestChurch one_by_one(GetParam());
        TestChurch at_once(GetParam());
        for (int key = 1; key <= count; ++key)
            ASSERT_EQ(one_by_one.session().allocate(Entity::group), key);

        EXPECT_EQ(at_once.session().allocate(Entity::group, count), 1);

        EXPECT_EQ(numbers(at_once.session(), keys_of_groups), numbers(one_by_one.session(), keys_of_groups)) << count;
    }
}

TEST_P(SessionTest, BothIncidentEntitiesShareACounterAndUnknownOnesOpenNone)
{
    EXPECT_EQ(session().allocate(Entity::wardline_incident), 1);
    EXPECT_EQ(session().allocate(Entity::wardline_incident_record), 2);
    EXPECT_EQ(session().allocate(static_cast<Entity>(0)), 0);
    EXPECT_EQ(session().allocate(static_cast<Entity>(51)), 0);
}

TEST_P(SessionTest, SeveralProcessesNeverReceiveTheSameKey)
{
    church->close();
    const auto take = [&] {
        const auto own = church->another();
        QByteArray keys;
        for (int turn = 0; turn < 40; ++turn) {
            const int count = turn % 4 == 0 ? 5 : 1;
            const int first = own->allocate(Entity::person, count);
            for (int key = first; key < first + count; ++key)
                keys += QByteArray::number(key) + ' ';
        }
        return keys;
    };
    std::multiset<int> taken;
    for (const auto& keys : run_together({take, take, take, take})) {
        for (const auto& key : keys.split(' ')) {
            if (!key.isEmpty())
                taken.insert(key.toInt());
        }
    }
    EXPECT_EQ(taken.size(), 4U * 80U);
    EXPECT_EQ(std::set<int>(taken.begin(), taken.end()).size(), taken.size());
    EXPECT_EQ(*taken.rbegin(), 320);
}

TEST_P(SessionTest, AChurchCopiedOutAndBackIsTheSame)
{
    session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (?,?);"_s, 1, u"Åberg"_s);
    EXPECT_EQ(session().allocate(Entity::surname, 3), 1);
    const auto copy = church->folder() + u"/copy.kdl"_s;
    session().copy_to(copy);
    session().execute(u"DELETE FROM [tbl_surname];"_s);
    const auto other = church->another();

    session().replace_content(copy);

    EXPECT_EQ(number_of(*other, u"SELECT COUNT(*) FROM [tbl_surname] WHERE [surname]='Åberg';"_s), 1)
        << "An open workstation does not see what came back.";
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_startup];"_s), 1);
    EXPECT_EQ(session().allocate(Entity::surname), 4);
    EXPECT_THROW(session().copy_to(copy), DatabaseError) << "An existing file must not be written over.";
}

TEST(SqliteFileTest, WhatIsNoChurchFileIsRefusedAndNotTouched)
{
    QTemporaryDir folder;
    const auto church = folder.filePath(u"whole.kdl"_s);
    (void)create_sqlite(church)->execute(u"CREATE TABLE [big] ([x] TEXT);"_s);
    QFile whole(church);
    ASSERT_TRUE(whole.open(QFile::ReadOnly));
    const auto bytes = whole.readAll();
    const std::vector<QByteArray> contents{
        {}, "a text file of somebody's", bytes.left(1000), QByteArray(bytes).replace(0, 16, "broken header...")};
    for (const auto& content : contents) {
        QFile file(folder.filePath(u"other.kdl"_s));
        ASSERT_TRUE(file.open(QFile::WriteOnly | QFile::Truncate));
        file.write(content);
        file.close();
        EXPECT_THROW((void)open_sqlite(file.fileName()), DatabaseError) << content.left(20).toStdString();
        ASSERT_TRUE(file.open(QFile::ReadOnly));
        EXPECT_EQ(file.readAll(), content);
    }
    EXPECT_THROW((void)open_sqlite(folder.filePath(u"missing.kdl"_s)), DatabaseError);
    EXPECT_FALSE(QFile::exists(folder.filePath(u"missing.kdl"_s)));
}

TEST(DialectTest, StatementsAreTurnedForTheServer)
{
    EXPECT_EQ(for_postgres(u"SELECT [A_b] FROM [T] WHERE [x]=? AND [y]='[no]?' AND [z]<>?"_s),
              u"SELECT \"a_b\" FROM \"t\" WHERE \"x\"=$1 AND \"y\"='[no]?' AND \"z\"<>$2"_s);
    EXPECT_EQ(
        split_script(u"-- a comment\nCREATE TABLE [a] (\n  [b] TEXT -- what; it is\n) STRICT;\nDROP TABLE [a];\n"_s),
        (QStringList{u"CREATE TABLE [a] (\n[b] TEXT\n) STRICT"_s, u"DROP TABLE [a]"_s}));
}

} // namespace kindrel::test

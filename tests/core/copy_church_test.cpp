#include "copy_place.h"
#include "core/backup_meter.h"
#include "core/locks.h"
#include "core/schema.h"

#include <limits>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString unicode = u"Ünï \U0001F54A 中文 'q' \"x\" \\ [y] ? $1 e\u0301\n"_s;

struct FieldKind
{
    QString name;
    bool text;
    bool needed;
};

std::vector<FieldKind> fields_in(Session& file, const QString& table)
{
    auto rows = file.select(u"SELECT [name],[type],[notnull],[pk] FROM pragma_table_info(?);"_s, table);
    std::vector<FieldKind> fields;
    for (const Row& row : rows)
        fields.push_back({row.text(Column{0}), row.text(Column{1}) == u"TEXT",
                          row.number(Column{2}) != 0 || row.number(Column{3}) != 0});
    return fields;
}

/// Text that is there, that is not there, and that is empty.
Value text_in_turn(int turn, bool needed)
{
    if (turn == 1 && !needed)
        return {};
    return turn == 2 && !needed ? Value{QString(u""_s)} : Value{u"%1 %2"_s.arg(unicode).arg(turn)};
}

/// Three rows for every table that takes them; how many tables hold rows then.
int fill_every_table(Session& file)
{
    int filled = 0;
    for (const auto& table : church_tables(file)) {
        const auto fields = fields_in(file, table);
        for (int turn = 0; turn < 3; ++turn) {
            QStringList names;
            std::vector<Value> values;
            for (const auto& field : fields) {
                names += field.name;
                values.push_back(field.text ? text_in_turn(turn, field.needed) : Value{qint64{turn + 1}});
            }
            try {
                file.insert(table, names, std::vector<std::vector<Value>>{values});
            } catch (const DatabaseError& error) {
                EXPECT_TRUE(error.constraint_broken()) << error.what();
            }
        }
        filled += number_of(file, u"SELECT COUNT(*) FROM [%1];"_s.arg(table)) > 0 ? 1 : 0;
    }
    return filled;
}

} // namespace

class CopyChurchTest : public CopyTest
{
protected:
    [[nodiscard]] std::optional<CopyReport> copy(bool replace = false, Dialogue* dialogue = nullptr)
    {
        place->leave();
        auto& started = place->started(dialogue);
        return copy_church(started.office, {.to = place->target(), .replace = replace}, started.silent);
    }
    [[nodiscard]] QString told() { return place->started().dialogue.told.join(u'\n'); }
};
KINDREL_COPIED_FROM_BOTH_ENGINES(CopyChurchTest);

TEST_P(CopyChurchTest, ACopyHoldsWhatTheChurchHoldsAndTheChurchIsNotTouched)
{
    const auto file = place->folder() + u"KR10_records.kdl"_s;
    const auto bytes = QFile::exists(file) ? DataFolder::read(file) : QByteArray();
    const auto before = place->source_sums();

    const auto report = copy();

    ASSERT_TRUE(report) << told().toStdString();
    EXPECT_EQ(report->tables, before.size());
    EXPECT_EQ(place->target_sums(), before);
    EXPECT_EQ(place->source_sums(), before);
    EXPECT_EQ(QFile::exists(file) ? DataFolder::read(file) : QByteArray(), bytes);
    EXPECT_TRUE(place->tidy());
}

TEST_P(CopyChurchTest, NothingIsCopiedWhileSomebodyIsInside)
{
    auto& started = place->started();
    FakeWorkstation another;
    another.machine = u"office-2"_s;
    Locks theirs(*started.office.session, another, started.clock);
    ASSERT_TRUE(theirs.take(LockKind::area, LockKey(Value{qint64{1}})));

    EXPECT_FALSE(copy());
    EXPECT_TRUE(told().contains(u"Unable to copy the church while somebody is working in it."_s));
    EXPECT_TRUE(told().contains(u"office-2"_s)) << told().toStdString();
    Locks(*place->started().office.session, another, started.clock).unlock(LockKind::area, LockKey(Value{qint64{1}}));

    DataFolder::write(place->folder() + u"lock.dat"_s, "1234567890");
    EXPECT_FALSE(copy());
    EXPECT_TRUE(told().contains(u"Another user is either compacting files"_s)) << told().toStdString();
    QFile::remove(place->folder() + u"lock.dat"_s);

    EXPECT_FALSE(place->target_present());
    EXPECT_TRUE(copy());
}

TEST_P(CopyChurchTest, NothingIsCopiedIntoTheFolderOfAChurchThatIsBusy)
{
    const QTemporaryDir neighbour;
    const QString file = neighbour.filePath(u"KR10_records.kdl"_s);
    DataFolder::write(neighbour.filePath(u"LOCK.DAT"_s), "1234567890");
    auto& started = place->started();

    EXPECT_FALSE(copy_church(started.office, {.to = {.file = file}}, started.silent));

    EXPECT_TRUE(told().contains(u"Another user is either compacting files"_s)) << told().toStdString();
    EXPECT_EQ(QDir(neighbour.path()).entryList(QDir::Files), QStringList(u"LOCK.DAT"_s));
    EXPECT_TRUE(place->tidy());
    QFile::remove(neighbour.filePath(u"LOCK.DAT"_s));
    EXPECT_TRUE(copy_church(started.office, {.to = {.file = file}}, started.silent)) << told().toStdString();
}

TEST_P(CopyChurchTest, AnOlderCopyThatSomebodyWorksInIsNotReplaced)
{
    ASSERT_TRUE(copy());
    place->open_target()->execute(u"DELETE FROM [tbl_surname];"_s);
    place->leave();
    auto& started = place->started();
    FakeWorkstation another;
    another.machine = u"office-2"_s;
    const auto theirs = place->open_target();
    ASSERT_TRUE(Locks(*theirs, another, started.clock).take(LockKind::family, 3));
    const auto older = sums_in(*theirs);

    EXPECT_FALSE(copy_church(started.office, {.to = place->target(), .replace = true}, started.silent));

    EXPECT_TRUE(told().contains(u"Unable to copy the church while somebody is working in it."_s));
    EXPECT_TRUE(told().contains(u"office-2"_s)) << told().toStdString();
    EXPECT_EQ(told().contains(u"Connected to the database on the server: 1."_s), place->target().file.isEmpty());
    EXPECT_TRUE(started.dialogue.asked.isEmpty());
    EXPECT_EQ(sums_in(*theirs), older);
    EXPECT_TRUE(place->tidy());
}

TEST_P(CopyChurchTest, GivenUpAtAnyStepThereIsNoCopy)
{
    for (const int last : {1, 200, ByteMeter::meter_steps}) {
        place->leave();
        auto& started = place->started();
        StoppingProgress progress(last);
        EXPECT_FALSE(copy_church(started.office, {.to = place->target()}, progress));
        EXPECT_EQ(progress.taken, last);
        EXPECT_TRUE(progress.ended);
        EXPECT_TRUE(told().isEmpty()) << told().toStdString();
        EXPECT_FALSE(place->target_present());
        EXPECT_TRUE(place->tidy());
    }
}

TEST_P(CopyChurchTest, AnOlderCopyOfTheSameChurchGivesWayOnRequestAndAfterAQuestion)
{
    const auto source = place->source_sums();
    ASSERT_TRUE(copy());
    place->open_target()->execute(u"DELETE FROM [tbl_surname];"_s);
    const auto older = place->target_sums();

    EXPECT_FALSE(copy());
    EXPECT_TRUE(told().contains(u"There is a church already where the copy is to go."_s)) << told().toStdString();
    ScriptedDialogue unsure;
    unsure.expect_confirm(u"Do you wish to replace the older copy of 'Morning'?"_s, Answer::no, Answer::no);
    EXPECT_FALSE(copy(true, &unsure));
    EXPECT_EQ(place->target_sums(), older);
    place->leave();

    EXPECT_TRUE(copy(true)) << told().toStdString();
    EXPECT_EQ(place->target_sums(), source);
    EXPECT_TRUE(place->tidy());
}

TEST_P(CopyChurchTest, AnotherChurchOrAnotherEditionIsNeverReplaced)
{
    ASSERT_TRUE(copy());
    const std::vector<std::pair<QString, QString>> cases{
        {u"UPDATE [tbl_startup] SET [Version]=[Version]+1;"_s, u"made by another edition of Kindrel"_s},
        {u"UPDATE [tbl_startup] SET [church_code]=NULL;"_s, u"is another church"_s},
        {u"UPDATE [tbl_startup] SET [church_code]='theirs';"_s, u"is another church"_s},
        {u"DELETE FROM [tbl_startup];"_s, u"is another church"_s},
    };
    for (const auto& [change, words] : cases) {
        place->open_target()->execute(change);
        const auto before = place->target_sums();
        EXPECT_FALSE(copy(true));
        EXPECT_TRUE(told().contains(words)) << told().toStdString();
        EXPECT_EQ(place->target_sums(), before);
    }
}

TEST_P(CopyChurchTest, WhatARunThatWasCutOffLeftIsNoObstacle)
{
    if (!place->target().file.isEmpty()) {
        DataFolder::write(place->target().file + u".unfinished"_s, "half");
        DataFolder::write(place->target().file + u".unfinished-journal"_s, "half");
    }
    EXPECT_TRUE(copy()) << told().toStdString();
    EXPECT_EQ(place->target_sums(), place->source_sums());
    EXPECT_TRUE(place->tidy());
}

class CopyToServerTest : public testing::Test
{
protected:
    void SetUp() override
    {
        if (!TestChurch::available(EngineKind::postgres))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
    }
};

TEST_F(CopyToServerTest, EveryTableComesBackAsItWas)
{
    CopyPlace there(EngineKind::sqlite);
    {
        auto& session = *there.started().office.session;
        EXPECT_EQ(fill_every_table(session), church_tables(session).size());
        for (const auto& table : church_tables(session).filter(u"lock"_s)) // Nobody is inside.
            session.execute(u"DELETE FROM [%1];"_s.arg(table));
    }
    const auto source = there.source_sums();
    EXPECT_TRUE(copy_church(there.started().office, {.to = there.target()}, there.started().silent))
        << there.started().dialogue.told.join(u'\n').toStdString();

    DataFolder::write(there.folder() + connection_file.toString(), there.target().connection.toUtf8());
    there.leave();
    const QString file = there.folder() + u"back.kdl"_s;
    EXPECT_TRUE(copy_church(there.started().office, {.to = {.file = file}}, there.started().silent))
        << there.started().dialogue.told.join(u'\n').toStdString();

    EXPECT_EQ(sums_in(*open_sqlite(file)), source);
}

TEST_F(CopyToServerTest, EveryKindOfValueIsToldApartAndCopied)
{
    TestChurch file(EngineKind::sqlite), server(EngineKind::postgres), back(EngineKind::sqlite);
    for (auto* church : {&file, &server, &back})
        church->session().run_script(u"CREATE TABLE [extra] ([k] INTEGER PRIMARY KEY, [n] INTEGER, [t] TEXT, [b] BLOB) "
                                     "STRICT;"_s);
    const std::vector<std::vector<Value>> rows{
        {qint64{1}, {}, {}, {}},
        {qint64{2}, qint64{0}, QString(u""_s), QByteArray("")},
        {qint64{3}, std::numeric_limits<qint64>::max(), unicode, QByteArray("\0\1\xff\\x27", 6)},
        {qint64{4}, std::numeric_limits<qint64>::min(), u"1800-02-29"_s, QByteArray("0")},
        {qint64{5}, qint64{1}, u"1"_s, QByteArray("1")},
    };
    file.session().insert(u"extra"_s, {u"k"_s, u"n"_s, u"t"_s, u"b"_s}, rows);
    for (auto [from, to] : {std::pair{&file, &server}, std::pair{&server, &back}}) {
        const Transaction reading(from->session());
        Transaction writing(to->session());
        copy_tables(from->session(), to->session());
        writing.commit();
    }
    EXPECT_EQ(sums_in(back.session()), sums_in(file.session()));
    auto found = back.session().select(u"SELECT [k],[n],[t],[b] FROM [extra] ORDER BY [k];"_s);
    std::size_t place = 0;
    for (const Row& row : found) {
        for (int column = 0; column < 4; ++column)
            EXPECT_EQ(row.value(Column{column}), rows[place][static_cast<std::size_t>(column)]) << place << column;
        ++place;
    }
    for (const auto& change :
         {u"UPDATE [extra] SET [t]='' WHERE [k]=1;"_s, u"UPDATE [extra] SET [n]=NULL WHERE [k]=2;"_s,
          u"UPDATE [extra] SET [b]=NULL WHERE [k]=2;"_s, u"DELETE FROM [extra] WHERE [k]=5;"_s}) {
        const auto before = sums_in(back.session());
        back.session().execute(change);
        EXPECT_NE(sums_in(back.session()), before) << change.toStdString();
    }
}

TEST_F(CopyToServerTest, ACopyThatDiffersNeverAppears)
{
    CopyPlace there(EngineKind::sqlite);
    EXPECT_TRUE(copy_church(there.started().office, {.to = there.target()}, there.started().silent));
    {
        const auto target = there.open_target();
        target->execute(u"CREATE FUNCTION spoil() RETURNS trigger LANGUAGE plpgsql AS "
                        "'BEGIN NEW.surname := NULL; RETURN NEW; END'"_s);
        target->execute(u"CREATE TRIGGER spoil BEFORE INSERT ON [tbl_surname] FOR EACH ROW EXECUTE FUNCTION spoil()"_s);
    }
    const auto before = there.target_sums();
    there.leave();

    EXPECT_FALSE(copy_church(there.started().office, {.to = there.target(), .replace = true}, there.started().silent));

    const auto told = there.started().dialogue.told.join(u'\n');
    EXPECT_TRUE(told.contains(u"differs in 'tbl_surname': 20 rows instead of 20."_s)) << told.toStdString();
    EXPECT_EQ(there.target_sums(), before);
}

TEST_F(CopyToServerTest, NothingIsCopiedFromAServerThatOthersAreConnectedTo)
{
    CopyPlace there(EngineKind::postgres);
    const auto other = connect_church(there.paths());

    EXPECT_FALSE(copy_church(there.started().office, {.to = there.target()}, there.started().silent));

    const auto told = there.started().dialogue.told.join(u'\n');
    EXPECT_TRUE(told.contains(u"Connected to the database on the server: 1."_s)) << told.toStdString();
    EXPECT_FALSE(there.target_present());
}

TEST_F(CopyToServerTest, WhoComesInWhileAServerIsCopiedFromWaitsForTheTurnToWrite)
{
    class Newcomer : public SilentProgress
    {
    public:
        explicit Newcomer(Paths paths) : m_paths(std::move(paths)) {}
        bool step(const QString&) override
        {
            turns_held = number_of(*connect_church(m_paths),
                                   u"SELECT COUNT(*) FROM pg_locks WHERE locktype='advisory' AND granted AND objid=0 "
                                   "AND database=(SELECT oid FROM pg_database WHERE datname=current_database())"_s);
            return false;
        }
        qint64 turns_held = -1;

    private:
        Paths m_paths;
    };
    CopyPlace there(EngineKind::postgres);
    Newcomer newcomer(there.paths());

    EXPECT_FALSE(copy_church(there.started().office, {.to = there.target()}, newcomer));

    EXPECT_EQ(newcomer.turns_held, 1);
}

TEST_F(CopyToServerTest, StartUpRefusesAnEmptyDatabaseInPlainWords)
{
    CopyPlace there(EngineKind::sqlite);
    TestStart start;
    DataFolder::write(start.data.paths().file(Folder::church, connection_file.toString()),
                      there.target().connection.toUtf8());
    start.dialogue.expect_box(unable_to_connect({}).text,
                              u"The database on the server is empty: no church was copied into it yet."_s);

    EXPECT_FALSE(start.start({.purpose = Purpose::command_line}));
}

} // namespace kindrel::test

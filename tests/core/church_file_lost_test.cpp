#include "backup_place.h"

#include "core/verified_copy.h"
#include "support/processes.h"

#include <QFile>
#include <QRandomGenerator>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

QByteArray noise(qint64 size)
{
    QRandomGenerator random(20261123);
    QByteArray bytes(size, Qt::Uninitialized);
    std::ranges::generate(bytes, [&] { return static_cast<char>(random.generate()); });
    return bytes;
}

/// In its place, as a careless copy does it; the file stays the same one.
void overwrite(const QString& file, const QByteArray& content)
{
    QFile target(file);
    ASSERT_TRUE(target.open(QIODevice::WriteOnly));
    ASSERT_EQ(target.write(content), content.size());
}

struct Accident
{
    const char* name;
    void (*befall)(const QString& file);
};

const Accident accidents[]{
    {"Deleted",
     [](const QString& file) {
         ASSERT_TRUE(QFile::remove(file));
     }},
    {"Renamed",
     [](const QString& file) {
         ASSERT_TRUE(QFile::rename(file, file + u".old"_s));
     }},
    {"ReplacedByAnotherFile",
     [](const QString& file) {
         ASSERT_TRUE(QFile::copy(file, file + u".copy"_s) && QFile::remove(file));
         ASSERT_TRUE(QFile::rename(file + u".copy"_s, file));
     }},
    {"Emptied",
     [](const QString& file) {
         ASSERT_TRUE(QFile::resize(file, 0));
     }},
    {"CutOff",
     [](const QString& file) {
         ASSERT_TRUE(QFile::resize(file, QFile(file).size() / 3));
     }},
    {"OverwrittenWithNoise",
     [](const QString& file) {
         overwrite(file, noise(QFile(file).size()));
     }},
    {"OverwrittenWithText",
     [](const QString& file) {
         overwrite(file, "This is not a church.");
     }},
};

} // namespace

/// What befalls the church's file while the program has it open.
class ChurchFileLostTest : public testing::TestWithParam<Accident>
{
protected:
    TestChurch church{EngineKind::sqlite};
};
INSTANTIATE_TEST_SUITE_P(Accidents, ChurchFileLostTest, testing::ValuesIn(accidents),
                         [](const auto& of) { return std::string(of.param.name); });

TEST_P(ChurchFileLostTest, ASaveIsRefusedAloudAndNeverGoesNowhere)
{
    Session& session = church.session();
    session.execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (1,'Holm');"_s);
    GetParam().befall(church.file());

    for (int attempt = 0; attempt < 2; ++attempt) {
        EXPECT_THROW(
            {
                Transaction transaction(session);
                session.execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (?,'Berg');"_s,
                                2 + attempt);
                transaction.commit();
            },
            DatabaseError);
        EXPECT_THROW(session.execute(u"UPDATE [tbl_surname] SET [surname]='Dahl';"_s), DatabaseError);
    }
}

TEST(ChurchFileTest, AFullDiskRefusesTheSaveAndKeepsAllThatWasStored)
{
    TestChurch church(EngineKind::sqlite);
    church.session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (1,'Holm');"_s);
    const qint64 full = QFile(church.file()).size() + 40'000;
    church.close();
    const auto save_on_full_disk = [&]() -> QByteArray {
        fill_disk(static_cast<rlim_t>(full));
        const auto own = church.another();
        std::vector<std::vector<Value>> rows;
        for (int family = 2; family < 5000; ++family)
            rows.push_back({to_value(family), to_value(QString(100, u'x'))});
        for (int attempt = 0; attempt < 3; ++attempt) {
            try {
                own->insert(u"tbl_surname"_s, {u"Surname_ID"_s, u"surname"_s}, rows);
                return "stored";
            } catch (const DatabaseError&) {
                // The next attempt meets the same disk.
            }
        }
        own->execute(u"UPDATE [tbl_surname] SET [surname]='Berg';"_s);
        return "refused";
    };
    EXPECT_EQ(run_together({save_on_full_disk}).front(), "refused");

    church.reopen();
    EXPECT_EQ(number_of(church.session(), u"SELECT COUNT(*) FROM [tbl_surname];"_s), 1);
    EXPECT_EQ(number_of(church.session(), u"SELECT COUNT(*) FROM [tbl_surname] WHERE [surname]='Berg';"_s), 1)
        << "What has room is stored again.";
    church.close();
    EXPECT_NO_THROW(check_church_file(church.file()));
}

} // namespace kindrel::test

#include "core/backup_archive.h"

#include "backup_place.h"
#include "core/backup_reading.h"
#include "core/sqlite_session.h"

#include <QCryptographicHash>
#include <QFileInfo>
#include <QRandomGenerator>

#include <zip.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

struct Entry
{
    QByteArray name;
    QByteArray content;
    quint32 mode = 0100644;
};

/// An archive as any other program may have made it.
void make_zip(const QString& file, const std::vector<Entry>& entries)
{
    QFile::remove(file);
    zip_t* archive = zip_open(QFile::encodeName(file).constData(), ZIP_CREATE, nullptr);
    for (const auto& entry : entries) {
        zip_source_t* source =
            zip_source_buffer(archive, entry.content.constData(), static_cast<zip_uint64_t>(entry.content.size()), 0);
        const auto place = zip_file_add(archive, entry.name.constData(), source, ZIP_FL_ENC_UTF_8);
        ASSERT_GE(place, 0);
        zip_file_set_external_attributes(archive, static_cast<zip_uint64_t>(place), 0, ZIP_OPSYS_UNIX,
                                         entry.mode << 16);
    }
    ASSERT_EQ(zip_close(archive), 0);
}

QByteArray digest(const QByteArray& content)
{
    return QCryptographicHash::hash(content, QCryptographicHash::Sha256).toHex();
}

} // namespace

class BackupArchiveTest : public testing::Test
{
protected:
    void SetUp() override
    {
        DataFolder::make_church(data.root() + u"church1/"_s);
        const QString file = data.paths().database();
        {
            const auto session = open_sqlite(file);
            session->execute(u"UPDATE [tbl_startup] SET [church_code]='here';"_s);
            manifest.church = summary_of(*session, tables_of(*session));
        }
        manifest.made = QDateTime(QDate(2024, 5, 15), QTime(10, 30));
        manifest.parts = {u"church/Portrait/"_s};
        add("church/Portrait/1.jpg", "a picture");
        add("database/KR10_records.kdl", DataFolder::read(file));
    }
    void add(const QByteArray& name, const QByteArray& content)
    {
        entries.push_back({name, content});
        manifest.entries.push_back({QString::fromUtf8(name), content.size(), digest(content)});
        std::ranges::sort(manifest.entries, {}, &ManifestEntry::name);
    }
    [[nodiscard]] std::vector<Entry> with_manifest() const
    {
        auto all = entries;
        all.push_back({"manifest.json", manifest.to_json()});
        return all;
    }
    /// What reading all of it is answered with; nullopt when it is accepted.
    [[nodiscard]] std::optional<BackupFault> fault_of_file()
    {
        const QTemporaryDir scratch;
        SilentProgress progress;
        ByteMeter meter(progress, 1);
        try {
            const OpenBackup backup(archive, {});
            unpack(backup, scratch.path() + u'/', Unpack::everything, meter);
            EXPECT_EQ(DataFolder::read(scratch.path() + u"/church/Portrait/1.jpg"_s), "a picture");
            return std::nullopt;
        } catch (const BackupError& error) {
            return error.fault();
        }
    }
    [[nodiscard]] std::optional<BackupFault> fault_of(const std::vector<Entry>& all)
    {
        make_zip(archive, all);
        return fault_of_file();
    }
    [[nodiscard]] std::optional<BackupFault> fault_of_bytes(const QByteArray& bytes)
    {
        DataFolder::write(archive, bytes);
        return fault_of_file();
    }

    DataFolder data;
    QString archive = data.drive() + u"backup.zip"_s;
    Manifest manifest;
    std::vector<Entry> entries;
};

TEST_F(BackupArchiveTest, ASoundArchiveIsAccepted)
{
    EXPECT_EQ(fault_of(with_manifest()), std::nullopt);
}

TEST_F(BackupArchiveTest, NamesThatLeadOutAreRefused)
{
    for (const char* name : {"../escaped", "/etc/escaped", "church/Portrait/../../../escaped", "church/Portrait/..",
                             "C:/escaped", "church/Portrait/C:escaped", "church\\..\\escaped", "church//escaped",
                             "./escaped", "church/Portrait/", "church/Portrait/a\nb", "church/Portrait/\xff\xfe"}) {
        auto all = with_manifest();
        all.push_back({"PLACEHOLDER", "harm"});
        make_zip(archive, all);
        // Patched in, since the library refuses to write some of them.
        const QByteArray wanted(name);
        const QByteArray placeholder(wanted.size(), '#');
        all.back().name = placeholder;
        make_zip(archive, all);
        EXPECT_EQ(fault_of_bytes(DataFolder::read(archive).replace(placeholder, wanted)), BackupFault::hostile) << name;
    }
    EXPECT_FALSE(QFile::exists(data.drive() + u"escaped"_s));
}

TEST_F(BackupArchiveTest, LinksDevicesAndDuplicatesAreRefused)
{
    for (const quint32 mode : {0120777U, 0060660U, 0010660U, 0040755U}) {
        auto all = with_manifest();
        all.front().mode = mode;
        EXPECT_EQ(fault_of(all), BackupFault::hostile) << mode;
    }
    auto all = with_manifest();
    all.push_back({"church/Portrait/2.jpg", "another"});
    make_zip(archive, all);
    const auto twice = DataFolder::read(archive).replace("church/Portrait/2.jpg", "church/Portrait/1.jpg");
    EXPECT_NE(fault_of_bytes(twice), std::nullopt);
}

TEST_F(BackupArchiveTest, WhatIsNotListedMissingOrDifferentIsRefused)
{
    auto more = with_manifest();
    more.push_back({"church/Portrait/3.jpg", "unlisted"});
    EXPECT_EQ(fault_of(more), BackupFault::damaged);

    auto fewer = with_manifest();
    fewer.erase(fewer.begin());
    EXPECT_EQ(fault_of(fewer), BackupFault::damaged);

    auto changed = with_manifest();
    changed.front().content = "A picture";
    EXPECT_EQ(fault_of(changed), BackupFault::damaged);

    auto longer = with_manifest();
    longer.front().content = "a picture and more";
    EXPECT_EQ(fault_of(longer), BackupFault::damaged);

    add("program/kindrel", "belongs nowhere");
    EXPECT_EQ(fault_of(with_manifest()), BackupFault::damaged);
}

TEST_F(BackupArchiveTest, ADatabaseThatIsNotTheDescribedOneIsRefused)
{
    const auto with_database = [this](const QByteArray& content) {
        manifest.entries.clear();
        entries.clear();
        add("church/Portrait/1.jpg", "a picture");
        add("database/KR10_records.kdl", content);
        return fault_of(with_manifest());
    };
    const QByteArray sound = DataFolder::read(data.paths().database());
    EXPECT_EQ(with_database("no database"), BackupFault::damaged);
    EXPECT_EQ(with_database({}), BackupFault::damaged);
    EXPECT_EQ(with_database(sound.left(sound.size() / 2)), BackupFault::damaged);
    EXPECT_EQ(with_database(QByteArray(sound).replace(8192, 4096, QByteArray(4096, '?'))), BackupFault::damaged);
    EXPECT_EQ(with_database(sound), std::nullopt);

    open_sqlite(data.paths().database())
        ->execute(u"CREATE TRIGGER [t] AFTER INSERT ON [tbl_surname] BEGIN DELETE FROM [tbl_people]; END;"_s);
    EXPECT_EQ(with_database(DataFolder::read(data.paths().database())), BackupFault::damaged);
    open_sqlite(data.paths().database())->execute(u"DROP TRIGGER [t];"_s);
    open_sqlite(data.paths().database())->execute(u"INSERT INTO [tbl_surname] ([Surname_ID]) VALUES (1);"_s);
    EXPECT_EQ(with_database(DataFolder::read(data.paths().database())), BackupFault::damaged) << "One family more.";
}

TEST_F(BackupArchiveTest, ADescriptionThatCannotBeTrustedIsRefused)
{
    struct Case
    {
        QByteArray from, to;
        BackupFault fault;
    };
    const QByteArray sound = manifest.to_json();
    for (const auto& [from, to, fault] :
         {Case{"Kindrel backup", "Other backup", BackupFault::foreign},
          Case{"\"format_version\": 1", "\"format_version\": 2", BackupFault::newer},
          Case{"\"format_version\": 1", "\"format_version\": -1", BackupFault::damaged},
          Case{"\"size\": 9", "\"size\": -9", BackupFault::damaged},
          Case{"\"size\": 9", "\"size\": 1e300", BackupFault::damaged},
          Case{"\"size\": 9", "\"size\": 8", BackupFault::damaged},
          Case{"church/Portrait/1.jpg", "../../1.jpg", BackupFault::damaged},
          Case{"\"church_code\": \"here\"", "\"church_code\": \"\"", BackupFault::damaged},
          Case{"\"church_code\": \"here\"", "\"church_code\": \"elsewhere\"", BackupFault::damaged},
          Case{"2024-05-15", "yesterday", BackupFault::damaged}, Case{"{", "[", BackupFault::foreign}}) {
        ASSERT_TRUE(sound.contains(from)) << from.toStdString();
        auto all = entries;
        all.push_back({"manifest.json", QByteArray(sound).replace(from, to)});
        EXPECT_EQ(fault_of(all), fault) << from.toStdString() << " -> " << to.toStdString();
    }
    EXPECT_EQ(fault_of(entries), BackupFault::foreign) << "No description at all.";
}

TEST_F(BackupArchiveTest, WhatIsNoArchiveOrOnlyHalfOfOneIsRefused)
{
    make_zip(archive, with_manifest());
    const QByteArray whole = DataFolder::read(archive);
    EXPECT_NE(fault_of_bytes({}), std::nullopt);
    EXPECT_EQ(fault_of_bytes("hello"), BackupFault::foreign);
    EXPECT_NE(fault_of_bytes(QByteArray(100'000, 'P')), std::nullopt);
    for (int part = 1; part < 20; ++part)
        EXPECT_NE(fault_of_bytes(whole.left(whole.size() * part / 20)), std::nullopt) << part;
    EXPECT_NE(fault_of_bytes(whole.left(whole.size() - 1)), std::nullopt);
    EXPECT_NE(fault_of_bytes(whole.mid(100)), std::nullopt);
    QFile::remove(archive);
    EXPECT_EQ(fault_of_file(), BackupFault::missing);
}

TEST_F(BackupArchiveTest, ASizeThatTheContentDoesNotHaveIsRefused)
{
    // The size of a file in the directory and at the file itself: a few bytes that claim to be four thousand million.
    make_zip(archive, with_manifest());
    QByteArray bytes = DataFolder::read(archive);
    const auto claim = [&](qsizetype size_at) {
        bytes.replace(size_at, 4, "\xfe\xff\xff\xff");
    };
    claim(bytes.indexOf("church/Portrait/1.jpg") - 30 + 22);
    claim(bytes.lastIndexOf("church/Portrait/1.jpg") - 46 + 24);
    EXPECT_NE(fault_of_bytes(bytes), std::nullopt);
}

TEST_F(BackupArchiveTest, AByteThatFlippedNeverPassesForWhatWasSaved)
{
    make_zip(archive, with_manifest());
    const QByteArray whole = DataFolder::read(archive);
    QRandomGenerator random(20240515);
    int refused = 0;
    for (int round = 0; round < 300; ++round) {
        QByteArray bytes = whole;
        // Half of the flips go to the directory and the small files at the end.
        const auto span = round % 2 == 0 ? bytes.size() : std::min<qsizetype>(bytes.size(), 4000);
        for (int flips = 0; flips <= round % 3; ++flips) {
            const auto at = bytes.size() - 1 - random.bounded(static_cast<quint32>(span));
            bytes[at] = static_cast<char>(bytes[at] ^ (1 << random.bounded(8)));
        }
        refused += fault_of_bytes(bytes).has_value() ? 1 : 0;
    }
    EXPECT_GT(refused, 200);
}

} // namespace kindrel::test

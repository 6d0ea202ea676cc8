#include "core/backup_archive.h"

#include "backup_place.h"
#include "core/backup_files.h"
#include "core/backup_reading.h"
#include "core/sqlite_session.h"

#include <QCryptographicHash>
#include <QFileInfo>
#include <QRandomGenerator>
#include <QtEndian>

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
        ByteMeter meter(progress, manifest.bytes());
        try {
            const OpenBackup backup(archive, {});
            unpack(backup, scratch.path() + u'/', Unpack::everything, meter);
            for (const Entry& entry : entries)
                EXPECT_EQ(DataFolder::read(scratch.path() + u'/' + QString::fromUtf8(entry.name)), entry.content);
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
    for (qsizetype size = whole.size() - 1; size > 0; size -= size > whole.size() - 1500 ? 1 : whole.size() / 50)
        EXPECT_NE(fault_of_bytes(whole.left(size)), std::nullopt) << size;
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
    const auto database = whole.indexOf("database/KR10_records.kdl");
    const auto described = whole.indexOf("manifest.json");
    QRandomGenerator random(20240515);
    int flips = 0;
    int refused = 0;
    // All that the archive says of its files, and the description; of the database some.
    for (qsizetype at = 0; at<whole.size(); at += at> database + 100 && at < described - 100 ? 397 : 1) {
        QByteArray bytes = whole;
        bytes[at] = static_cast<char>(bytes[at] ^ (1 << random.bounded(8)));
        ++flips;
        refused += fault_of_bytes(bytes).has_value() ? 1 : 0;
    }
    EXPECT_GT(refused, flips / 2);
}

TEST_F(BackupArchiveTest, ADescriptionIsReadUpToItsLargestLength)
{
    auto all = with_manifest();
    all.back().content = all.back().content.leftJustified(largest_manifest, ' ');
    EXPECT_EQ(fault_of(all), std::nullopt);
    all.back().content += ' ';
    EXPECT_EQ(fault_of(all), BackupFault::foreign);

    const ManifestEntry photograph{u"church/Portrait/a name of fifty letters, as a camera gives it.jpg"_s, 4'000'000,
                                   QByteArray(64, 'f')};
    manifest.entries.assign(100'000, photograph);
    EXPECT_LT(manifest.to_json().size(), largest_manifest);
}

namespace {

/// What somebody does to a backup, to its files before they are packed and then to the bytes of the archive, and what
/// the person is told.
struct Attack
{
    const char* what;
    const char* told;
    std::function<void(std::vector<Entry>&)> pack;
    std::function<QByteArray(const QByteArray&)> spoil;
};

Attack named(const char* what, const char* told, const QByteArray& name, quint32 mode = 0100644)
{
    const QByteArray stand_in(name.size(), '#');
    return {what, told,
            [=](auto& entries) {
                entries.push_back({stand_in, "/etc", mode});
            },
            [=](const QByteArray& bytes) {
                return QByteArray(bytes).replace(stand_in, name);
            }};
}

std::vector<Attack> attacks_by_names()
{
    const char* out = "leads out of the church's folders";
    return {
        named("a name that leads up", out, "church/Portrait/../../../escaped"),
        named("a name from the root", out, "/escaped"),
        named("a name with backslashes", out, "church\\Portrait\\..\\..\\escaped"),
        named("a name on a drive", out, "C:/escaped"),
        named("a name that ends early", "not those that it lists", QByteArray("church/Portrait/escaped\0.jpg", 28)),
        named("a link", "a link or a device", "church/Portrait/escaped", 0120777),
        named("a file twice", "is damaged", "church/Portrait/1.jpg"),
    };
}

const QByteArray first_file = "church/NBook/F1.fll";

/// Lets the files whose names begin so claim that they are so many bytes long.
Attack claiming(const char* what, const char* told, const std::function<void(std::vector<Entry>&)>& pack,
                const QByteArray& names, quint32 size)
{
    return {what, told, pack, [=](QByteArray bytes) {
                const auto claim = [&](const QByteArray& mark, qsizetype size_at, qsizetype name_at) {
                    for (auto at = bytes.indexOf(mark); at >= 0; at = bytes.indexOf(mark, at + 4)) {
                        if (bytes.mid(at + name_at, names.size()) == names)
                            qToLittleEndian(size, bytes.data() + at + size_at);
                    }
                };
                claim("PK\3\4", 22, 30);
                claim("PK\1\2", 24, 46);
                return bytes;
            }};
}

std::vector<Attack> attacks_by_content(const Entry& first)
{
    constexpr quint32 most = 0xFFFFFFFE;
    const auto size = static_cast<quint32>(first.content.size());
    const auto nothing = [](auto&) {
    };
    const auto zeros = [](auto& entries) {
        entries.front().content = QByteArray(40'000'000, '\0');
    };
    const auto many = [](auto& entries) {
        for (int file = 0; file < 300; ++file)
            entries.push_back({"church/NBook/" + QByteArray::number(file), "x"});
    };
    const auto as_packed = [](const QByteArray& bytes) {
        return bytes;
    };
    return {
        claiming("a small file that unpacks to a large one", "is damaged", zeros, first_file, size),
        claiming("a file that is shorter than it says", "not those that it lists", nothing, first_file, most),
        claiming("files that would fill any disk", "would fill any disk", many, "church/NBook/", most),
        {"another content", "differs from what was saved",
         [](auto& entries) { entries.front().content.replace("first", "First"); }, as_packed},
        {"a file fewer", "not those that it lists", [](auto& entries) { entries.erase(entries.begin()); }, as_packed},
        {"half of it", "is not a Kindrel backup", nothing,
         [](auto& bytes) {
             return bytes.left(bytes.size() / 2);
         }},
        {"a byte less", "is not a Kindrel backup", nothing,
         [](auto& bytes) {
             return bytes.chopped(1);
         }},
        {"nothing", "is not a Kindrel backup", nothing,
         [](auto&) {
             return QByteArray();
         }},
    };
}

} // namespace

class AttackedBackupTest : public testing::Test
{
protected:
    void SetUp() override
    {
        const ArchiveReader reader(place.back_up(), {});
        for (const ArchiveEntry& entry : reader.entries()) {
            QByteArray content;
            reader.read(entry, [&](QByteArrayView piece) { content += piece; });
            entries.push_back({entry.name.toUtf8(), content});
        }
        place.write_church(u"second"_s);
        before = place.state();
    }
    void expect_refusal(const std::string& what, const char* words, const RestoreRequest& request)
    {
        place.dialogue().told.clear();
        EXPECT_FALSE(restore_backup(place.office(), request, place.started->silent)) << what;

        const QString told = place.dialogue().told.join(u'|');
        EXPECT_TRUE(told.startsWith(u"Restoring files failed because:-\n"_s)) << what << ": " << told.toStdString();
        EXPECT_TRUE(told.contains(QString::fromUtf8(words))) << what << ": " << told.toStdString();
        EXPECT_EQ(place.state(), before) << what;
        EXPECT_TRUE(place.leftovers().isEmpty()) << what << place.leftovers().join(u' ').toStdString();
        EXPECT_EQ(files_within(place.data.drive()).filter(u"escaped"_s), QStringList()) << what;
    }
    void expect_refusals(const std::vector<Attack>& attacks)
    {
        for (const Attack& attack : attacks) {
            auto changed = entries;
            attack.pack(changed);
            make_zip(archive, changed);
            DataFolder::write(archive, attack.spoil(DataFolder::read(archive)));
            expect_refusal(attack.what, attack.told, {.file = archive});
        }
    }

    BackupPlace place{EngineKind::sqlite};
    QString archive = place.data.drive() + u"backup.zip"_s;
    std::vector<Entry> entries;
    QMap<QString, QByteArray> before;
};

TEST_F(AttackedBackupTest, WhateverIsWrongIsToldAndTheChurchStaysAsItIs)
{
    ASSERT_EQ(entries.front().name, first_file);
    expect_refusals(attacks_by_names());
    expect_refusals(attacks_by_content(entries.front()));

    make_zip(archive, entries);
    EXPECT_TRUE(restore_backup(place.office(), {.file = archive}, place.started->silent)) << "As it was, it is sound.";
}

TEST_F(AttackedBackupTest, WithoutThePasswordOrWithAnotherNothingIsRestored)
{
    const QTemporaryDir disk;
    const QString locked = place.back_up({.folder = disk.path(), .password = u"für uns"_s});
    expect_refusal("no password", "only be read with its password", {.file = locked});
    for (const auto& password : {u"fur uns"_s, u"für uns "_s, u"FÜR UNS"_s})
        expect_refusal(password.toStdString(), "The password of the backup is wrong",
                       {.file = locked, .password = password});
}

} // namespace kindrel::test

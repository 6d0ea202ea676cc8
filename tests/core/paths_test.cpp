#include "core/paths.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

TEST(PathsTest, EveryFolderLiesWhereItsModePutsIt)
{
    const Paths normal(u"/program"_s, u"/drive"_s, u"/drive/Kindrel_10_Data"_s, Mode::normal, 3);
    const Paths network(u"/program"_s, u"/drive"_s, u"/share"_s, Mode::network, 7);
    const Paths training(u"/program"_s, u"/drive"_s, u"/data"_s, Mode::training, training_church);
    const Paths booked_out(u"/program"_s, u"/drive"_s, u"/data"_s, Mode::booked_out, booked_out_church);
    struct Case
    {
        Folder folder;
        const char* normal;
        const char* network;
        const char* training;
        const char* booked_out;
    };
    const Case cases[]{
        {Folder::program, "/program/", "/program/", "/program/", "/program/"},
        {Folder::data_root, "/drive/Kindrel_10_Data/", "/share/", "/data/Training/", "/data/booked out/"},
        {Folder::local_settings, "/drive/Kindrel_10_Data/Local_settings/", "/drive/Kindrel_10_Data/Local_settings/",
         "/drive/Kindrel_10_Data/Local_settings/", "/drive/Kindrel_10_Data/Local_settings/"},
        {Folder::church, "/drive/Kindrel_10_Data/church3/", "/share/church7/", "/data/Training/", "/data/booked out/"},
        {Folder::roster_history, "/drive/Kindrel_10_Data/church3/Roster_history/", "/share/church7/Roster_history/",
         "/data/Training/Roster_history/", "/data/booked out/Roster_history/"},
        {Folder::notebook, "/drive/Kindrel_10_Data/church3/NBook/", "/share/church7/NBook/", "/data/Training/NBook/",
         "/data/booked out/NBook/"},
        {Folder::portrait, "/drive/Kindrel_10_Data/church3/Portrait/", "/share/church7/Portrait/",
         "/data/Training/Portrait/", "/data/booked out/Portrait/"},
        {Folder::global, "/drive/Kindrel_10_Data/Global/", "/share/Global/", "/data/Training/Global/",
         "/data/booked out/Global/"},
        {Folder::audio, "/drive/Kindrel_10_Data/Audio/", "/share/Audio/", "/data/Audio/", "/data/Audio/"},
        {Folder::wardline, "/drive/Kindrel_10_Data/Wardline/", "/share/Wardline/", "/data/Training/Wardline/",
         "/data/Wardline/"},
        {Folder::images, "/drive/Kindrel_10_Data/images/", "/share/images/", "/data/Training/images/",
         "/data/booked out/images/"},
        {Folder::letter, "/drive/Kindrel_10_Data/letter/", "/share/letter/", "/data/Training/letter/",
         "/data/booked out/letter/"},
        {Folder::reports, "/drive/Kindrel_10_Data/Reports/", "/share/Reports/", "/data/Training/Reports/",
         "/data/booked out/Reports/"},
        {Folder::custom, "/drive/Kindrel_10_Data/custom/", "/share/custom/", "/data/Training/custom/",
         "/data/booked out/custom/"},
        {Folder::plugin_reports, "/drive/Kindrel_10_Data/plugin reports/", "/share/plugin reports/",
         "/data/plugin reports/", "/data/plugin reports/"},
        {Folder::plugin_letters, "/drive/Kindrel_10_Data/plugin letters/", "/share/plugin letters/",
         "/data/plugin letters/", "/data/plugin letters/"},
        {Folder::export_text, "/drive/Kindrel_10_Data/export/", "/share/export/", "/data/Training/export/",
         "/data/booked out/export/"},
        {Folder::directory_setup, "/drive/Kindrel_10_Data/Directory Setup/", "/share/Directory Setup/",
         "/data/Directory Setup/", "/data/booked out/Directory Setup/"},
    };
    static_assert(std::size(cases) == folder_count);
    for (const auto& expected : cases) {
        EXPECT_EQ(QDir::fromNativeSeparators(normal.folder(expected.folder)).toStdString(), expected.normal);
        EXPECT_EQ(QDir::fromNativeSeparators(network.folder(expected.folder)).toStdString(), expected.network);
        EXPECT_EQ(QDir::fromNativeSeparators(training.folder(expected.folder)).toStdString(), expected.training);
        EXPECT_EQ(QDir::fromNativeSeparators(booked_out.folder(expected.folder)).toStdString(), expected.booked_out);
    }
}

TEST(PathsTest, FilesAndFoldersAreFoundInTheSpellingTheyHave)
{
    const QTemporaryDir drive;
    const QString root = drive.filePath(u"kindrel_10_data"_s);
    ASSERT_TRUE(QDir().mkpath(root + u"/BOOKED OUT/nbook"_s));
    QFile marker(root + u"/BOOKED OUT/Lock.DAT"_s);
    ASSERT_TRUE(marker.open(QIODevice::WriteOnly));

    const Paths paths({}, drive.path(), drive.filePath(existing_name(drive.path(), u"Kindrel_10_Data"_s)),
                      Mode::booked_out, booked_out_church);

    EXPECT_EQ(paths.folder(Folder::notebook), root + u"/BOOKED OUT/nbook/"_s);
    EXPECT_EQ(paths.file(Folder::church, u"lock.dat"_s), marker.fileName());
    EXPECT_TRUE(paths.exists(Folder::church, u"lock.dat"_s));
    EXPECT_FALSE(paths.exists(Folder::church, u"loaded.dat"_s));
    EXPECT_EQ(paths.file(Folder::church, u"Other.Dat"_s), root + u"/BOOKED OUT/Other.Dat"_s);
    EXPECT_EQ(existing_name(drive.path(), u"Kindrel_10_Data/booked out/LOCK.dat"_s),
              u"kindrel_10_data/BOOKED OUT/Lock.DAT"_s);
}

} // namespace kindrel::test

#include "core/side_files.h"

#include "core/marker.h"
#include "core/windows1252.h"
#include "support/data_folder.h"

#include <QFileInfo>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

QByteArray blanks(int count)
{
    return QByteArray(count, ' ');
}

} // namespace

class SideFileTest : public testing::Test
{
protected:
    DataFolder data;
    Paths paths = data.paths();
};

TEST_F(SideFileTest, NewRecordsHoldTheirDefaultsByteForByte)
{
    struct Case
    {
        const SideFile& file;
        QByteArray start;
        int length;
    };
    const Case cases[]{
        {side_files::church_names, "Church1" + blanks(13) + "Church2" + blanks(13) + "Church3", 140},
        {side_files::sounds, QByteArray("entry.wav   exit.wav    \xFF\xFF\0\0", 28), 28},
        {side_files::common, "logo.jpg" + blanks(12) + QByteArray("\x1E\0\0\0", 4), 600},
        {side_files::labels, QByteArray("\x34\x08\x9A\x0B\x03\0\x08\0", 8), 708},
        {side_files::workstation_logo, blanks(20), 20},
        {side_files::network, QByteArray(2, '\0') + blanks(200), 202},
        {side_files::backup, blanks(250), 302},
        {side_files::viewer, blanks(250), 300},
        {side_files::email_delay, QByteArray("\0\0\x14\0\x3C\0", 6), 6},
        {side_files::tracking, blanks(261), 261},
        {side_files::busy, "1234567890", 10},
        {side_files::opening, "1234567890", 10},
        {side_files::write_test, "1234567890", 10},
        {side_files::set_up, "1234567890", 10},
        {side_files::map_specification, blanks(11), 11},
        {side_files::map_land, blanks(1616), 1616},
        {side_files::map_layers, blanks(198), 198},
    };
    for (const auto& expected : cases) {
        const QByteArray bytes = SideRecord(expected.file).bytes();
        EXPECT_EQ(bytes.left(expected.start.size()).toHex(' '), expected.start.toHex(' ')) << expected.file.name;
        EXPECT_EQ(bytes.size(), expected.length) << expected.file.name;
    }
    const SideRecord labels(side_files::labels);
    for (const char* font :
         {"label_name_font", "label_address_font", "tag_given_name_font", "tag_surname_font", "tag_church_font"})
        EXPECT_EQ(labels.text(font), u"Arial"_s);
}

TEST_F(SideFileTest, AWrittenRecordIsReadBackFromTheSpellingItLiesUnder)
{
    const QString file = paths.folder(Folder::global) + u"ENTER_SOUND.DAT"_s;
    DataFolder::write(file, QByteArray(28, '\0'));
    SideRecord record(side_files::sounds);
    record.set_text("entry_sound", u"Glück €.wav"_s);
    record.set_flag("play", false);

    write_side_file(paths, record);

    EXPECT_EQ(DataFolder::read(file), QByteArray("Gl\xFC"
                                                 "ck \x80.wav exit.wav    \0\0\0\0",
                                                 28));
    const auto found = read_side_file(paths, side_files::sounds);
    ASSERT_TRUE(found);
    EXPECT_EQ(found->text("entry_sound"), u"Glück €.wav"_s);
    EXPECT_EQ(found->text("exit_sound"), u"exit.wav"_s);
    EXPECT_FALSE(found->flag("play"));
}

TEST_F(SideFileTest, BytesWithoutAMeaningSurviveAChange)
{
    QByteArray content = SideRecord(side_files::common).bytes();
    content.replace(22, 578, QByteArray(578, 'x'));
    DataFolder::write(paths.folder(Folder::global) + u"Common.Dat"_s, content);

    auto record = read_side_file(paths, side_files::common);
    record->set_number("starts_between_compactions", -2);
    write_side_file(paths, *record);

    content.replace(20, 2, "\xFE\xFF");
    EXPECT_EQ(DataFolder::read(paths.file(Folder::global, u"Common.Dat"_s)), content);
}

TEST_F(SideFileTest, AMissingFileIsAbsentAndOneOfAnotherLengthIsRefused)
{
    EXPECT_FALSE(read_side_file(paths, side_files::viewer));

    for (const int length : {0, 299, 301}) {
        DataFolder::write(paths.folder(Folder::global) + u"viewer.dat"_s, blanks(length));
        EXPECT_THROW((void)read_side_file(paths, side_files::viewer), FileError) << length;
    }
}

TEST_F(SideFileTest, WhatDoesNotFitIsRefusedAndChangesNothing)
{
    SideRecord record(side_files::church_names);
    record.set_text("church_1", u"Twenty characters ok"_s);
    const QByteArray before = record.bytes();

    EXPECT_THROW(record.set_text("church_1", u"Twenty-one characters"_s), FileError);
    EXPECT_THROW(record.set_text("church_1", u"中"_s), FileError);
    EXPECT_EQ(record.bytes(), before);

    SideRecord delay(side_files::email_delay);
    EXPECT_THROW(delay.set_number("pause_seconds", 32768), FileError);
    delay.set_number("pause_seconds", -32768);
    EXPECT_EQ(delay.number("pause_seconds"), -32768);
}

TEST_F(SideFileTest, RecordsFilledUpWithZerosReadAsBlank)
{
    SideRecord labels(side_files::labels, QByteArray(708, '\0'));
    EXPECT_EQ(labels.text("tag_surname_font"), QString());

    labels.fill_blanks();

    EXPECT_EQ(labels.text("tag_surname_font"), u"Arial"_s);
}

TEST(Windows1252Test, EveryByteComesBackAndJoinedAccentsAreFound)
{
    QByteArray all;
    for (int code = 0; code < 256; ++code)
        all.append(static_cast<char>(code));

    EXPECT_EQ(to_windows1252(from_windows1252(all)), all);
    EXPECT_EQ(from_windows1252("\x80\x93\x9F\xE9"), u"€“Ÿé"_s);
    EXPECT_EQ(to_windows1252(u"e\u0301"_s), QByteArray("\xE9"));
    EXPECT_EQ(to_windows1252(u"Ł"_s), std::nullopt);
}

TEST_F(SideFileTest, AMarkerStandsWhileItIsHeldAndOnlyOnce)
{
    {
        const auto held = Marker::take(paths, side_files::busy);
        ASSERT_TRUE(held);
        EXPECT_EQ(DataFolder::read(paths.file(Folder::church, u"lock.dat"_s)), "1234567890");
        EXPECT_FALSE(Marker::take(paths, side_files::busy));
        EXPECT_TRUE(paths.exists(Folder::church, u"lock.dat"_s));
    }
    EXPECT_FALSE(paths.exists(Folder::church, u"lock.dat"_s));

    DataFolder::write(paths.folder(Folder::church) + u"lock.Dat"_s, "1234567890");
    EXPECT_FALSE(Marker::take(paths, side_files::busy));
    EXPECT_TRUE(QFileInfo::exists(paths.folder(Folder::church) + u"lock.Dat"_s));
}

} // namespace kindrel::test

#include "people/person_files.h"

#include "core/files.h"
#include "support/data_folder.h"

#include <QDir>
#include <QFileInfo>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Folder;

namespace {

class PersonFilesTest : public testing::Test
{
protected:
    [[nodiscard]] QString path(Folder folder, const QString& name) const { return paths.folder(folder) + name; }
    [[nodiscard]] QStringList names(Folder folder) const
    {
        return QDir(paths.folder(folder)).entryList(QDir::Files | QDir::Dirs | QDir::NoDotAndDotDot);
    }
    void write_page(const QString& name, const QByteArray& content) const
    {
        DataFolder::write(path(Folder::notebook, name), content);
    }

    QTemporaryDir place;
    core::Paths paths{place.path(), place.path(), place.path(), core::Mode::normal, 1};
};

} // namespace

TEST_F(PersonFilesTest, FilesOfAPersonOrAFamilyGoInAnySpellingAndNobodyElsesDo)
{
    for (const auto& name : {u"12.jpg"_s, u"12.JPG"_s, u"F12.jpg"_s, u"120.jpg"_s, u"f7.Jpg"_s})
        DataFolder::write(path(Folder::portrait, name), "picture");
    for (const auto& name : {u"12.FLL"_s, u"F12.fll"_s, u"2.fll"_s})
        write_page(name, "page");

    remove_files(paths, files_of_person(12));
    EXPECT_EQ(names(Folder::portrait), (QStringList{u"120.jpg"_s, u"F12.jpg"_s, u"f7.Jpg"_s}));
    EXPECT_EQ(names(Folder::notebook), (QStringList{u"2.fll"_s, u"F12.fll"_s}));

    remove_files(paths, files_of_family(12));
    remove_files(paths, files_of_family(7));
    remove_files(paths, files_of_person(4711));
    EXPECT_EQ(names(Folder::portrait), QStringList{u"120.jpg"_s});
    EXPECT_EQ(names(Folder::notebook), QStringList{u"2.fll"_s});
}

TEST_F(PersonFilesTest, AFileThatCannotBeDeletedDoesNotKeepTheOthers)
{
    core::make_folder(path(Folder::portrait, u"12.jpg/in the way"_s));
    write_page(u"12.fll"_s, "page");

    EXPECT_THROW(remove_files(paths, files_of_person(12)), core::FileError);

    EXPECT_EQ(names(Folder::notebook), QStringList());
}

TEST_F(PersonFilesTest, APhotographTakesThePlaceOfTheEarlierOne)
{
    const QByteArray jpeg("\xff\xd8\0\r\n", 5);
    set_portrait(paths, portrait_of_person(12), jpeg);
    EXPECT_EQ(DataFolder::read(path(Folder::portrait, u"12.jpg"_s)), jpeg);

    DataFolder::write(path(Folder::portrait, u"f3.JPG"_s), "old");
    set_portrait(paths, portrait_of_family(3), jpeg);
    EXPECT_EQ(names(Folder::portrait), (QStringList{u"12.jpg"_s, u"f3.JPG"_s}));
    EXPECT_EQ(DataFolder::read(path(Folder::portrait, u"f3.JPG"_s)), jpeg);

    set_portrait(paths, portrait_of_person(12), std::nullopt);
    set_portrait(paths, portrait_of_family(3), std::nullopt);
    EXPECT_EQ(names(Folder::portrait), QStringList());
}

TEST_F(PersonFilesTest, ANotebookPageReadsAsItWasWritten)
{
    const auto page = notebook_of_family(3);
    EXPECT_EQ(read_notebook(paths, page), QString());
    const auto text = u"Żółć\n\n’tis “fine”.\n"_s;
    write_notebook(paths, page, text);
    EXPECT_EQ(DataFolder::read(path(Folder::notebook, u"F3.fll"_s)), text.toUtf8().replace("\n", "\r\n"));
    EXPECT_EQ(read_notebook(paths, page), text);

    write_notebook(paths, page, u"One\r\nTwo"_s);
    EXPECT_EQ(read_notebook(paths, page), u"One\nTwo"_s);
    write_notebook(paths, page, {});
    EXPECT_EQ(names(Folder::notebook), QStringList());
}

TEST_F(PersonFilesTest, PagesOfOtherProgramsLoseNothing)
{
    const std::vector<std::pair<QByteArray, QString>> cases{{"One\r\nTwo\r\n", u"One\nTwo\n"_s},
                                                            {"One\nTwo", u"One\nTwo"_s},
                                                            {"\xef\xbb\xbfOne", u"One"_s},
                                                            {"Caf\xe9 \x93ok\x94", u"Café “ok”"_s}};
    for (const auto& [content, text] : cases) {
        write_page(u"5.Fll"_s, content);
        EXPECT_EQ(read_notebook(paths, notebook_of_person(5)), text) << content.toStdString();
    }
}

TEST_F(PersonFilesTest, ASoundComesIntoTheAudioFolderUnderAFreeName)
{
    const QString other = place.path() + u"/elsewhere/hello.wav"_s;
    DataFolder::write(other, "sound");
    DataFolder::write(path(Folder::audio, u"hello.wav"_s), "earlier");

    EXPECT_EQ(attach_sound(paths, other), u"hello (2).wav");
    EXPECT_EQ(DataFolder::read(path(Folder::audio, u"hello (2).wav"_s)), "sound");
    EXPECT_EQ(DataFolder::read(path(Folder::audio, u"hello.wav"_s)), "earlier");
    EXPECT_EQ(attach_sound(paths, path(Folder::audio, u"hello.wav"_s)), u"hello.wav");
}

} // namespace kindrel::test

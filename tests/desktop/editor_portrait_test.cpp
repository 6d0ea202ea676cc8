#include "desktop/people/editor_portrait.h"

#include "desktop/editor_bench_fixture.h"
#include "desktop/people/church_dialog.h"
#include "desktop/people/portrait.h"
#include "desktop/people/transfer_dialog.h"
#include "people/person_files.h"
#include "support/families.h"

#include <QFile>
#include <QImage>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString question = u"Photograph of Ann"_s;

class EditorPortraitTest : public EditorBenchTest
{
protected:
    EditorPortraitTest()
    {
        open(family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}));
        part = std::make_unique<desktop::EditorPortrait>(*bench);
        part->show();
    }
    ~EditorPortraitTest() override { part.reset(); }
    [[nodiscard]] bool shows_picture() { return !child<desktop::Portrait>(*part, u"portrait"_s).empty(); }
    [[nodiscard]] QString photograph()
    {
        const auto name = people::portrait_of_person(file().people.front().person_id);
        return desk().office.paths.file(name.folder, name.name);
    }
    void press_button(const QString& name)
    {
        child<QAbstractButton>(*part, name).setFocus();
        press(*part, Qt::Key_Space);
    }
    void add(const QString& file)
    {
        place.dialogue.expect_file(question, file);
        press_button(u"add_photograph"_s);
    }
    [[nodiscard]] QString picture_file(QSize size)
    {
        QImage picture(size, QImage::Format_ARGB32);
        picture.fill(Qt::transparent);
        picture.setPixelColor(0, 0, Qt::red);
        const QString file = place.data.drive() + u"picture.png"_s;
        picture.save(file);
        return file;
    }

    std::unique_ptr<desktop::EditorPortrait> part;
};

} // namespace

TEST_F(EditorPortraitTest, APictureIsTakenInAsAJpegOfModestSizeOnWhite)
{
    add(picture_file({3000, 1500}));
    EXPECT_TRUE(shows_picture());
    const QImage taken(photograph(), "JPG");
    EXPECT_EQ(taken.size(), QSize(1200, 600));
    EXPECT_EQ(taken.pixelColor(600, 300), QColor(Qt::white));
    add(picture_file({40, 30}));
    EXPECT_EQ(QImage(photograph(), "JPG").size(), QSize(40, 30));
}

TEST_F(EditorPortraitTest, AFileThatIsNoPictureIsRefused)
{
    const QString file = place.data.drive() + u"holiday.jpg"_s;
    DataFolder::write(file, "Dear all");
    place.dialogue.expect_file(question, file);
    place.dialogue.expect_box(u"holiday.jpg is not a picture that can be read"_s);
    press_button(u"add_photograph"_s);
    EXPECT_FALSE(shows_picture());
    EXPECT_FALSE(QFile::exists(photograph()));
}

TEST_F(EditorPortraitTest, RemovingAsksFirst)
{
    EXPECT_FALSE(child<QAbstractButton>(*part, u"remove_photograph"_s).isVisible());
    add(picture_file({40, 30}));
    for (const auto answer : {core::Answer::no, core::Answer::yes}) {
        place.dialogue.expect_confirm(u"Do you wish to remove the photograph of Ann?"_s, answer, core::Answer::no);
        press_button(u"remove_photograph"_s);
        EXPECT_EQ(shows_picture(), answer == core::Answer::no);
    }
    EXPECT_FALSE(QFile::exists(photograph()));
}

TEST_F(EditorPortraitTest, AnUnsavedFamilyHasNoPhotographs)
{
    ASSERT_TRUE(bench->editor.start_new());
    ASSERT_TRUE(bench->editor.add_adult(u"Cleo"_s));
    place.dialogue.expect_box(u"Unable to open the Portrait program until the family file is saved"_s);
    press_button(u"add_photograph"_s);
}

TEST_F(EditorPortraitTest, WithReadOnlyAccessAPhotographIsOnlySeen)
{
    add(picture_file({40, 30}));
    desk().office.rights.set(core::Area::read_only_family_data, true);
    part->show_file();
    EXPECT_TRUE(shows_picture());
    for (const auto& name : {u"add_photograph"_s, u"remove_photograph"_s})
        EXPECT_FALSE(child<QAbstractButton>(*part, name).isVisible());
}

namespace {

class EditorDialogsTest : public DesktopTest
{
};

} // namespace

TEST_F(EditorDialogsTest, AFamilyToTransferIntoIsFoundByTyping)
{
    begin({family(u"Adams"_s, {u"Ann"_s}), family(u"Baker"_s, {u"Ben"_s}), family(u"Barton"_s, {u"Cleo"_s})});
    desktop::TransferDialog dialog(desk(), stored[1].family.Surname_ID);
    dialog.show();
    settle();
    type(dialog, u"ba"_s);
    press(dialog, Qt::Key_Return);
    EXPECT_FALSE(dialog.family()); // The person is a Baker.
    EXPECT_TRUE(visible_texts(dialog).contains(u"The person is in this family already."_s));
    press(dialog, Qt::Key_Down);
    press(dialog, Qt::Key_Down);
    press(dialog, Qt::Key_Return);
    EXPECT_EQ(dialog.family(), stored[2].family.Surname_ID);
    EXPECT_FALSE(dialog.isVisible());
}

TEST_F(EditorDialogsTest, NoChurchIsChosenUnlessThePersonChoosesOne)
{
    begin();
    DataFolder::make_church(place.data.paths(core::Mode::normal, 2).folder(core::Folder::church));
    {
        desktop::ChurchDialog dialog(desk().office);
        dialog.show();
        press(dialog, Qt::Key_Return);
        EXPECT_FALSE(dialog.choice().cancelled);
        EXPECT_FALSE(dialog.choice().church);
    }
    {
        desktop::ChurchDialog dialog(desk().office);
        dialog.show();
        press(dialog, Qt::Key_Down);
        press(dialog, Qt::Key_Return);
        EXPECT_EQ(dialog.choice().church, 2);
    }
    desktop::ChurchDialog dialog(desk().office);
    dialog.show();
    press(dialog, Qt::Key_Escape);
    EXPECT_TRUE(dialog.choice().cancelled);
}

} // namespace kindrel::test

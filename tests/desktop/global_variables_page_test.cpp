#include "core/global_variables.h"
#include "desktop/desktop_fixture.h"
#include "desktop/output/head_picture.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QCheckBox>
#include <QImage>
#include <QSpinBox>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString save_question = u"The global database variables have been altered. Do you wish to save them?"_s;

class GlobalVariablesPageTest : public DesktopTest
{
protected:
    void SetUp() override
    {
        begin({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
        running->open_area(u"global_data"_s);
        settle();
    }
    void push(const QString& name)
    {
        tab_to(name);
        press(window(), Qt::Key_Space);
    }
    void save() { press(window(), Qt::Key_S, Qt::ControlModifier); }
    void close_page() { press(window(), Qt::Key_W, Qt::ControlModifier); }
    [[nodiscard]] bool in_page() { return window().page()->objectName() == u"setup_global_data"_s; }
    [[nodiscard]] core::Settings stored() { return core::read_settings(*desk().office.session); }
    [[nodiscard]] core::SideRecord file(const core::SideFile& file)
    {
        return *core::read_side_file(desk().office.paths, file);
    }
    [[nodiscard]] bool logo_printed()
    {
        const auto& items = child<desktop::HeadPicture>(window(), u"head_picture"_s).page().items;
        return std::ranges::any_of(items,
                                   [](const auto& item) { return std::holds_alternative<pages::PictureItem>(item); });
    }
    QString make_picture(const QString& name)
    {
        QImage picture(40, 20, QImage::Format_RGB32);
        picture.fill(Qt::red);
        const QString file = place.data.drive() + name;
        EXPECT_TRUE(picture.save(file));
        return file;
    }
};

} // namespace

TEST_F(GlobalVariablesPageTest, OptionsAreSetAndSavedByKeyboardAlone)
{
    press(window(), Qt::Key_Space); // American_date has the cursor.
    push(u"use_preferred_names"_s);
    tab_to(u"pin_auto_number_start"_s);
    type(window(), u"4001"_s);
    push(u"title_filters"_s);
    tab_to(u"starts_between_compactions"_s);
    type(window(), u"0"_s);
    EXPECT_TRUE(window().page()->altered());

    save();

    EXPECT_FALSE(window().page()->altered());
    const auto now = stored();
    EXPECT_TRUE(now.American_date && now.use_preferred_names && now.title_filters);
    EXPECT_EQ(now.pin_auto_number_start, 4001);
    EXPECT_EQ(file(core::side_files::common).number("starts_between_compactions"), 0);
    EXPECT_EQ(desk().office.day_order(), core::DayOrder::day_first);
    EXPECT_EQ(
        window().page()->note().text(),
        u"Saved. Pages that are open already follow when they are opened again. The order of day and month changes "
        "the next time Kindrel is started."_s);
    close_page();
    EXPECT_FALSE(in_page());
}

TEST_F(GlobalVariablesPageTest, ALogoIsChosenShownAndTakenAwayAgain)
{
    push(u"title_logo"_s);
    EXPECT_FALSE(logo_printed());
    place.dialogue.expect_file(u"Logo on reports"_s, make_picture(u"church.png"_s));
    push(u"choose_logo_of_all_churches"_s);
    EXPECT_TRUE(logo_printed());
    EXPECT_TRUE(visible_texts(window()).contains(u"church.png"_s));

    place.dialogue.expect_file(u"Logo on reports"_s, make_picture(u"own.png"_s));
    push(u"choose_logo_of_workstation"_s);
    save();
    EXPECT_EQ(file(core::side_files::common).text("logo"), u"church.png"_s);
    EXPECT_EQ(file(core::side_files::workstation_logo).text("logo"), u"own.png"_s);
    EXPECT_TRUE(desk().office.logo.endsWith(u"own.png"_s));

    push(u"remove_logo_of_workstation"_s);
    save();
    EXPECT_TRUE(desk().office.logo.endsWith(u"church.png"_s));
    EXPECT_TRUE(visible_texts(window()).contains(u"The logo of all churches"_s));
}

TEST_F(GlobalVariablesPageTest, APictureIsReadAgainOnlyWhenItsFileWasWrittenTo)
{
    const QString name = make_picture(u"church.png"_s);
    desktop::PictureFile logo({110, 36});
    ASSERT_FALSE(logo.read(name).empty());
    QFile file(name);
    ASSERT_TRUE(file.open(QIODevice::ReadWrite));
    const auto written = file.fileTime(QFileDevice::FileModificationTime);
    file.write(QByteArray(file.size(), 'x'));
    file.flush();

    ASSERT_TRUE(file.setFileTime(written, QFileDevice::FileModificationTime));
    EXPECT_FALSE(logo.read(name).empty());
    ASSERT_TRUE(file.setFileTime(written.addSecs(1), QFileDevice::FileModificationTime));
    EXPECT_TRUE(logo.read(name).empty());
    EXPECT_FALSE(logo.read(make_picture(u"own.png"_s)).empty());
}

TEST_F(GlobalVariablesPageTest, AFileThatIsNoPictureIsRefused)
{
    const QString letter = place.data.drive() + u"letter.png"_s;
    DataFolder::write(letter, "Dear all");
    place.dialogue.expect_file(u"Logo on reports"_s, letter);
    place.dialogue.expect_box(u"'letter.png' is not a picture that can be read."_s);
    push(u"choose_logo_of_all_churches"_s);
    EXPECT_FALSE(window().page()->altered());
    place.dialogue.expect_file(u"Logo on reports"_s, std::nullopt);
    push(u"choose_logo_of_all_churches"_s);
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(GlobalVariablesPageTest, ARefusalLeadsToTheFieldAndNothingIsStored)
{
    tab_to(u"pin_auto_number_start"_s);
    type(window(), u"0"_s);
    push(u"title_filters"_s);
    place.dialogue.expect_box(u"The next P.I.N. Number must be from 1 to 999999999."_s);
    save();
    EXPECT_EQ(window().focusWidget()->objectName(), u"pin_auto_number_start"_s);
    EXPECT_FALSE(stored().title_filters);
    type(window(), u"5"_s);
    save();
    EXPECT_TRUE(stored().title_filters);
    EXPECT_EQ(stored().pin_auto_number_start, 5);
}

TEST_F(GlobalVariablesPageTest, UnsavedOptionsAreAskedForOnLeaving)
{
    press(window(), Qt::Key_Space);
    place.dialogue.expect_confirm_or_cancel(save_question, std::nullopt);
    close_page();
    EXPECT_TRUE(in_page());
    place.dialogue.expect_confirm_or_cancel(save_question, false);
    close_page();
    EXPECT_FALSE(in_page());
    EXPECT_FALSE(stored().American_date);
}

TEST_F(GlobalVariablesPageTest, TabLeadsThroughTheFieldsAsTheyAreRead)
{
    const QStringList fields{u"American_date"_s,
                             u"use_preferred_names"_s,
                             u"pin_auto_number_start"_s,
                             u"title_date"_s,
                             u"title_filters"_s,
                             u"title_church"_s,
                             u"title_logo"_s,
                             u"starts_between_compactions"_s,
                             u"choose_logo_of_all_churches"_s,
                             u"remove_logo_of_all_churches"_s,
                             u"choose_logo_of_workstation"_s,
                             u"remove_logo_of_workstation"_s};
    QStringList reached;
    for (qsizetype step = 0; step < fields.size(); ++step) {
        reached += window().focusWidget()->objectName();
        press(window(), Qt::Key_Tab);
    }
    EXPECT_EQ(reached.join(u' '), fields.join(u' '));
}

} // namespace kindrel::test

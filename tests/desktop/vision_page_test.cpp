#include "desktop/desktop_fixture.h"
#include "desktop/output/head_picture.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QComboBox>
#include <QPlainTextEdit>
#include <QSpinBox>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString save_question = u"The vision statement has been altered. Do you wish to save it?"_s;

class VisionPageTest : public DesktopTest
{
protected:
    void SetUp() override
    {
        begin({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
        running->open_area(u"vision"_s);
        settle();
    }
    void save() { press(window(), Qt::Key_S, Qt::ControlModifier); }
    void close_page() { press(window(), Qt::Key_W, Qt::ControlModifier); }
    [[nodiscard]] bool in_page() { return window().page()->objectName() == u"setup_vision"_s; }
    [[nodiscard]] core::Settings stored() { return core::read_settings(*desk().office.session); }
    [[nodiscard]] QStringList printed()
    {
        return pages::texts_of(child<desktop::HeadPicture>(window(), u"head_picture"_s).page(), 1);
    }
};

} // namespace

TEST_F(VisionPageTest, AStatementIsTypedDressedAndSavedByKeyboardAlone)
{
    type(window(), u"To serve this town"_s);
    tab_to(u"Include_vision_reports"_s);
    press(window(), Qt::Key_Space);
    tab_to(u"vision_font_size"_s);
    type(window(), u"14"_s);
    tab_to(u"vision_format"_s);
    press(window(), Qt::Key_End);
    tab_to(u"vision_alignment"_s);
    press(window(), Qt::Key_Down);
    tab_to(u"vision_line"_s);
    type(window(), u"T"_s); // Thin
    press(window(), Qt::Key_Down);
    tab_to(u"include_vision_footer"_s);
    press(window(), Qt::Key_Space);
    tab_to(u"footer_vision_line2"_s);
    type(window(), u"1 High Street"_s);
    EXPECT_TRUE(window().page()->altered());

    save();

    EXPECT_FALSE(window().page()->altered());
    const auto now = stored();
    EXPECT_EQ(now.vision, u"To serve this town"_s);
    EXPECT_TRUE(now.Include_vision_reports && now.vision_line && now.vision_thick_line && now.include_vision_footer);
    EXPECT_EQ((std::array{now.vision_font_size, now.vision_format, now.vision_alignment}), (std::array{14, 3, 1}));
    EXPECT_EQ(now.footer_vision_line2, u"1 High Street"_s);
    EXPECT_EQ(window().page()->note().text(), u"The vision statement is saved. The next report has it."_s);
    close_page();
    EXPECT_FALSE(in_page());
    EXPECT_TRUE(visible_texts(window()).contains(u"To serve this town"_s)) << "the main menu shows it";
}

TEST_F(VisionPageTest, ThePictureShowsWhatTheNextReportWouldPrint)
{
    type(window(), u"To serve"_s);
    EXPECT_FALSE(printed().contains(u"To serve"_s));
    tab_to(u"Include_vision_reports"_s);
    press(window(), Qt::Key_Space);
    EXPECT_TRUE(printed().contains(u"To serve"_s));
    press(window(), Qt::Key_Backtab, Qt::ShiftModifier);
    type(window(), u"Serving"_s);
    EXPECT_TRUE(printed().contains(u"Serving"_s));
    EXPECT_FALSE(printed().contains(u"To serve"_s));
    EXPECT_EQ(desk().office.settings.vision, QString()) << "nothing is saved yet";
}

TEST_F(VisionPageTest, ARefusalLeadsToTheFieldWithItsTextSelectedAndNothingIsLost)
{
    tab_to(u"vision_font_size"_s);
    type(window(), u"60"_s);
    press(window(), Qt::Key_Tab);
    place.dialogue.expect_box(u"Please choose letters from 6 to 48 points high."_s);
    save();
    EXPECT_EQ(window().focusWidget()->objectName(), u"vision_font_size"_s);
    EXPECT_EQ(stored().vision_font_size, 10);

    type(window(), u"16"_s);
    press(window(), Qt::Key_Escape);
    save();
    EXPECT_EQ(stored().vision_font_size, 16);
}

TEST_F(VisionPageTest, AnUnsavedStatementIsAskedForOnLeaving)
{
    type(window(), u"Kept"_s);
    place.dialogue.expect_confirm_or_cancel(save_question, std::nullopt);
    close_page();
    EXPECT_TRUE(in_page());

    place.dialogue.expect_confirm_or_cancel(save_question, true);
    close_page();
    EXPECT_FALSE(in_page());
    EXPECT_EQ(stored().vision, u"Kept"_s);

    running->open_area(u"vision"_s);
    settle();
    type(window(), u"Dropped"_s);
    place.dialogue.expect_confirm_or_cancel(save_question, false);
    close_page();
    EXPECT_EQ(stored().vision, u"Kept"_s);
}

TEST_F(VisionPageTest, TabLeadsThroughTheFieldsAsTheyAreRead)
{
    const QStringList fields{u"vision"_s,           u"church_vision"_s,       u"Include_vision_reports"_s,
                             u"vision_font"_s,      u"vision_font_size"_s,    u"vision_format"_s,
                             u"vision_alignment"_s, u"vision_line"_s,         u"include_vision_footer"_s,
                             u"footer_vision"_s,    u"footer_vision_line2"_s, u"footer_line"_s};
    QStringList reached;
    for (qsizetype step = 0; step < fields.size(); ++step) {
        reached += window().focusWidget()->objectName();
        press(window(), Qt::Key_Tab);
    }
    EXPECT_EQ(reached.join(u' '), fields.join(u' '));
}

} // namespace kindrel::test

#include "desktop/shell/rail.h"

#include "desktop/areas.h"
#include "desktop/desktop_fixture.h"
#include "desktop/shell/page.h"

#include <QToolButton>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

struct Size
{
    QSize window;
    int percent;
};

class RailTest : public DesktopTest
{
protected:
    void SetUp() override { begin(); }
    [[nodiscard]] desktop::RailButton& button(const char* key)
    {
        return child<desktop::RailButton>(window(), QString::fromLatin1(key));
    }
    /// Nothing of it lies outside of what is seen, nor beneath an arrow.
    [[nodiscard]] bool in_sight(desktop::RailButton& area)
    {
        if (area.visibleRegion().boundingRect() != area.rect())
            return false;
        for (auto* arrow : area.window()->findChild<desktop::Rail*>()->findChildren<QToolButton*>()) {
            const QRect lies(area.mapTo(area.window(), QPoint()), area.size());
            const QRect over(arrow->mapTo(arrow->window(), QPoint()), arrow->size());
            if (arrow->isVisible() && lies.intersects(over))
                return false;
        }
        return true;
    }
    void resize(const Size& size)
    {
        look.apply(desktop::Appearance::light, size.percent);
        window().resize(size.window);
        settle();
        settle();
    }
    [[nodiscard]] QToolButton& arrow(const QString& words)
    {
        for (auto* arrow : window().findChild<desktop::Rail*>()->findChildren<QToolButton*>())
            if (arrow->accessibleName() == words)
                return *arrow;
        throw std::runtime_error("There is no such arrow");
    }

    static constexpr std::array sizes{Size{{1024, 690}, 100}, Size{{1024, 690}, 130}, Size{{720, 480}, 100},
                                      Size{{720, 480}, 130}};
};

} // namespace

TEST_F(RailTest, AtTheFirstSizeOfTheWindowEveryAreaIsSeenWithoutScrolling)
{
    resize(sizes[0]);
    for (const auto& area : desktop::all_areas())
        EXPECT_TRUE(in_sight(button(area.key))) << area.key;
}

TEST_F(RailTest, EveryAreaIsReachedWithTheArrowKeysAndOpenedWithEnter)
{
    for (const Size& size : sizes) {
        resize(size);
        button("main_menu").setFocus(Qt::TabFocusReason);
        for (const auto& area : desktop::all_areas()) {
            EXPECT_EQ(window().focusWidget()->objectName(), QString::fromLatin1(area.key));
            EXPECT_TRUE(in_sight(button(area.key))) << area.key << " at " << size.window.height();
            press(window(), Qt::Key_Down);
        }
        EXPECT_EQ(window().page()->objectName(), u"main_menu"_s); // Passing by opens nothing.
    }
    press(window(), Qt::Key_Up);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(window().page()->objectName(), u"Backup"_s);
}

TEST_F(RailTest, AnAreaThatIsNotGrantedIsPassedOver)
{
    button("editor").setEnabled(false);
    button("main_menu").setFocus(Qt::TabFocusReason);
    press(window(), Qt::Key_Down);
    EXPECT_EQ(window().focusWidget()->objectName(), u"search"_s);
    press(window(), Qt::Key_Up);
    EXPECT_EQ(window().focusWidget()->objectName(), u"main_menu"_s);
}

TEST_F(RailTest, EveryAreaIsReachedWithTheMouse)
{
    for (const Size& size : sizes) {
        resize(size);
        for (int click = 0; click < 40 && arrow(u"Earlier areas"_s).isVisible(); ++click)
            QTest::mouseClick(&arrow(u"Earlier areas"_s), Qt::LeftButton);
        for (const auto& area : desktop::all_areas()) {
            for (int click = 0; click < 40 && !in_sight(button(area.key)) && arrow(u"Further areas"_s).isVisible();
                 ++click)
                QTest::mouseClick(&arrow(u"Further areas"_s), Qt::LeftButton);
            EXPECT_TRUE(in_sight(button(area.key))) << area.key << " at " << size.window.height();
        }
    }
}

TEST_F(RailTest, TheChosenAreaComesIntoSight)
{
    resize(sizes[2]);
    const auto* last = desktop::all_areas().back().key;
    EXPECT_FALSE(in_sight(button(last)));
    running->open_area(QString::fromLatin1(last));
    settle();
    EXPECT_TRUE(in_sight(button(last)));
    EXPECT_FALSE(in_sight(button("main_menu")));
}

} // namespace kindrel::test

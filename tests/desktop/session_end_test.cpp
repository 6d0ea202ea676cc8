#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/shell/progress.h"
#include "support/families.h"

#include <QDialog>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

/// Asks in a box over the window, and the session ends before anybody answers.
class BoxedPrinting : public desktop::Printing
{
public:
    bool print(const desktop::PrintJob&, QWidget& parent) override
    {
        const QPointer<QWidget> there(&parent);
        QDialog box(&parent);
        QMetaObject::invokeMethod(
            &box, [] { QCoreApplication::quit(); }, Qt::QueuedConnection);
        box.exec();
        settle(); // What was put off by the end is done as soon as can be.
        outlived = !there.isNull();
        return true;
    }
    bool outlived = false;
};

class SessionEndTest : public DesktopTest
{
protected:
    /// Does it inside the program's own event loop, until that ends.
    void run(const std::function<void()>& act)
    {
        QMetaObject::invokeMethod(QCoreApplication::instance(), act, Qt::QueuedConnection);
        QApplication::exec();
    }

    BoxedPrinting boxes;
};

} // namespace

TEST_F(SessionEndTest, AnOpenBoxAndItsPreviewOutliveTheEnd)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    running.reset();
    running = std::make_unique<desktop::Running>(desktop::Surroundings{.workstation = place.workstation,
                                                                       .dialogue = place.dialogue,
                                                                       .clock = place.clock,
                                                                       .progress = place.progress,
                                                                       .printing = boxes,
                                                                       .look = look,
                                                                       .data_drive = {},
                                                                       .ended = [this] {
                                                                           ++ended;
                                                                       }});
    ASSERT_TRUE(running->start(1));
    settle();
    press(window(), Qt::Key_P, Qt::ControlModifier);
    auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1U);
    run([&] { press(*previews[0], Qt::Key_P, Qt::ControlModifier); });
    EXPECT_TRUE(boxes.outlived);
    EXPECT_EQ(ended, 1);
    EXPECT_FALSE(window().isVisible());
}

TEST_F(SessionEndTest, NothingClosesWhileWorkIsUnderWay)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    press(window(), Qt::Key_P, Qt::ControlModifier);
    auto* preview = desk().windows.all<desktop::PreviewWindow>().at(0);
    bool ends = false;
    run([&] {
        desktop::QtProgress progress(place.dialogue);
        progress.begin(u"Backup"_s, 10, {});
        QCoreApplication::quit();
        EXPECT_FALSE(window().close());
        EXPECT_FALSE(preview->close());
        settle();
        EXPECT_TRUE(window().isVisible() && preview->isVisible());
        EXPECT_EQ(ended, 0);
        QDialog question(&window());
        question.setModal(true);
        question.show();
        EXPECT_TRUE(question.close()) << "The work itself may ask.";
        progress.end();
        ends = true;
        QCoreApplication::quit();
    });
    EXPECT_TRUE(ends);
    EXPECT_EQ(ended, 1);
}

} // namespace kindrel::test

#include "desktop/desktop_fixture.h"

#include "core/sqlite_session.h"
#include "desktop/shell/application.h"
#include "people/family_store.h"
#include "support/families.h"

#include <QApplication>
#include <QTableWidget>

namespace kindrel::test {

namespace {

/// More than any page has widgets to step through.
constexpr int most_steps = 80;

} // namespace

DesktopTest::DesktopTest() : look(*qobject_cast<QApplication*>(QCoreApplication::instance()))
{
    qobject_cast<desktop::Application*>(QCoreApplication::instance())->set_dialogue(place.dialogue);
}

void DesktopTest::begin(std::vector<people::FamilyFile> families)
{
    const core::Paths paths = place.data.paths();
    DataFolder::make_church(paths.folder(core::Folder::church));
    const auto session = core::open_sqlite(paths.database());
    add_setup_items(*session);
    for (auto& family : families)
        stored.push_back(people::save_family(*session, std::move(family), place.clock.today()));
    begin_again();
}

void DesktopTest::begin_again()
{
    running.reset();
    running = std::make_unique<desktop::Running>(desktop::Surroundings{.workstation = place.workstation,
                                                                       .dialogue = place.dialogue,
                                                                       .clock = place.clock,
                                                                       .progress = place.progress,
                                                                       .printing = printing,
                                                                       .look = look,
                                                                       .data_drive = {},
                                                                       .ended = [this] {
                                                                           ++ended;
                                                                       }});
    if (!running->start(1))
        throw std::runtime_error("The program does not start");
    settle();
}

void DesktopTest::tab_to(const QString& name)
{
    for (int step = 0; step < most_steps && window().focusWidget()->objectName() != name; ++step)
        press(window(), Qt::Key_Tab);
    ASSERT_EQ(window().focusWidget()->objectName(), name);
}

QStringList visible_texts(const QWidget& window)
{
    QStringList texts;
    const auto labels = window.findChildren<QLabel*>();
    for (const QLabel* label : labels)
        if (label->isVisibleTo(&window) && !label->text().isEmpty())
            texts += label->text();
    const auto tables = window.findChildren<QTableWidget*>();
    for (const QTableWidget* table : tables)
        for (int row = 0; row < table->rowCount(); ++row)
            for (int column = 0; column < table->columnCount(); ++column)
                texts += table->item(row, column)->text();
    return texts;
}

void press(QWidget& window, Qt::Key key, Qt::KeyboardModifiers modifiers)
{
    QWidget* focus = window.focusWidget();
    QTest::keyClick(focus ? focus : &window, key, modifiers);
    settle();
}

void type(QWidget& window, const QString& text)
{
    QTest::keyClicks(window.focusWidget(), text);
}

void settle()
{
    QApplication::processEvents();
    QApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

} // namespace kindrel::test

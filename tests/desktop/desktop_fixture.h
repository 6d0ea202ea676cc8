#pragma once

#include "desktop/running.h"
#include "desktop/shell/main_window.h"
#include "desktop/shell/printing.h"
#include "people/records.h"
#include "support/data_folder.h"

#include <QLabel>
#include <QTest>

#include <gtest/gtest.h>

namespace kindrel::test {

/// Notes what went to the printer.
class FakePrinting : public desktop::Printing
{
public:
    bool print(const desktop::PrintJob& job, QWidget&) override
    {
        titles += job.title;
        pages = job.spool.page_count();
        return true;
    }

    QStringList titles;
    int pages = 0;
};

/// The program with its windows, on a data folder of its own. Church 1 holds the families given to begin().
class DesktopTest : public testing::Test
{
protected:
    DesktopTest();

    /// Starts the program. The families' keys are those they were stored with.
    void begin(std::vector<people::FamilyFile> families = {});
    void begin_again();

    [[nodiscard]] desktop::Desk& desk() { return *running->desk(); }
    [[nodiscard]] desktop::MainWindow& window() { return *running->window(); }
    /// Goes on with Tab until the widget of this name has the cursor.
    void tab_to(const QString& name);

    TestStart place;
    FakePrinting printing;
    desktop::Look look;
    int ended = 0;
    std::vector<people::FamilyFile> stored;
    std::unique_ptr<desktop::Running> running;
};

/// The widget of this object name; its absence ends the test.
template <class W>
W& child(const QWidget& of, const QString& name)
{
    W* found = of.findChild<W*>(name);
    if (!found)
        throw std::runtime_error("There is no " + name.toStdString());
    return *found;
}

/// Everything that can be read in the window, hidden widgets left out.
[[nodiscard]] QStringList visible_texts(const QWidget& window);
/// Types and presses on whatever has the focus of the window.
void press(QWidget& window, Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
void type(QWidget& window, const QString& text);
/// Lets everything happen that was put off to the event loop.
void settle();

} // namespace kindrel::test

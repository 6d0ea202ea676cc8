#pragma once

#include "desktop/desktop_fixture.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "people/family_store.h"
#include "people/setup_lists.h"
#include "support/families.h"

#include <QAbstractButton>
#include <QLineEdit>
#include <QListWidget>
#include <QMenu>

namespace kindrel::test {

/// The program with the family editor, worked with by keys.
class EditorTest : public DesktopTest
{
protected:
    void begin_with(std::vector<people::FamilyFile> families)
    {
        begin(std::move(families));
        for (const auto& list : people::setup_lists())
            (void)session().allocate(list.entity, 3);
    }
    [[nodiscard]] core::Session& session() { return *desk().office.session; }
    [[nodiscard]] desktop::Page& page() { return *window().page(); }
    [[nodiscard]] bool is_open() { return page().objectName() == QStringLiteral("Editor"); }
    [[nodiscard]] QString in_focus()
    {
        return window().focusWidget() ? window().focusWidget()->objectName() : QString();
    }
    [[nodiscard]] QString note() { return page().note().text(); }
    [[nodiscard]] QLineEdit& line(const QString& name) { return child<QLineEdit>(page(), name); }
    [[nodiscard]] people::FamilyFile read(std::size_t family)
    {
        return people::load_family(session(), stored.at(family).family.Surname_ID).value_or(people::FamilyFile());
    }

    /// From the main menu, as one finds a family: words and Enter.
    void open(const QString& words)
    {
        press(window(), Qt::Key_1, Qt::ControlModifier);
        auto& filter = child<QLineEdit>(window(), QStringLiteral("filter"));
        filter.clear();
        type(window(), words);
        press(window(), Qt::Key_Return);
    }
    void control(Qt::Key key) { press(window(), key, Qt::ControlModifier); }
    void alt(Qt::Key key) { press(window(), key, Qt::AltModifier); }
    /// Puts the cursor into a field, in place of whose text this is typed.
    void fill(const QString& name, const QString& text)
    {
        line(name).setFocus();
        line(name).selectAll();
        type(window(), text);
        settle();
    }
    /// A line of the menu, by its letter.
    void choose_in_menu(Qt::Key letter)
    {
        alt(Qt::Key_O);
        QTest::keyClick(&child<QMenu>(page(), QStringLiteral("more")), letter);
        settle();
    }
    void take_offer()
    {
        child<QAbstractButton>(page(), QStringLiteral("offer")).click();
        settle();
    }
    [[nodiscard]] QStringList names(const QString& list)
    {
        auto& shown = child<QListWidget>(page(), list);
        QStringList names;
        for (int row = 0; row < shown.count(); ++row)
            names += shown.item(row)->text();
        return names;
    }
    /// Chooses a person and leaves the cursor in the list.
    void choose(const QString& list, int row)
    {
        auto& shown = child<QListWidget>(page(), list);
        shown.setFocus();
        shown.setCurrentRow(row);
        settle();
    }
};

} // namespace kindrel::test

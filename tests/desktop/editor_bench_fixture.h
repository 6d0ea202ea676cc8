#pragma once

#include "desktop/desktop_fixture.h"
#include "desktop/people/editor_tab.h"
#include "people/setup_lists.h"

#include <QAbstractButton>

namespace kindrel::test {

/// The family editor's bench with one family open, and one part of the screen working on it.
class EditorBenchTest : public DesktopTest
{
protected:
    /// The editor with this family open, the first person chosen.
    void open(people::FamilyFile opened)
    {
        begin({std::move(opened)});
        for (const auto& list : people::setup_lists())
            (void)desk().office.session->allocate(list.entity, 3);
        bench = std::make_unique<desktop::EditorBench>(desk(), nullptr);
        ASSERT_TRUE(bench->editor.open(stored.front().family.Surname_ID));
        bench->choose_person(0);
    }
    void show(desktop::EditorTab* (*make)(desktop::EditorBench&))
    {
        tab.reset(make(*bench));
        QObject::connect(bench.get(), &desktop::EditorBench::changed, tab.get(), [this] { tab->show_file(); });
        QObject::connect(bench.get(), &desktop::EditorBench::person_chosen, tab.get(), [this] { tab->show_file(); });
        tab->show();
        tab->activateWindow();
        settle();
    }
    [[nodiscard]] QWidget* in_focus() { return tab->focusWidget(); }
    [[nodiscard]] const people::FamilyFile& file() { return bench->editor.file(); }
    [[nodiscard]] const people::Person& person() { return file().people.front(); }
    void click(const QString& name)
    {
        child<QAbstractButton>(*tab, name).click();
        settle();
    }

    ~EditorBenchTest() override
    {
        tab.reset();
        bench.reset();
    }

    std::unique_ptr<desktop::EditorBench> bench;
    std::unique_ptr<desktop::EditorTab> tab;
};

} // namespace kindrel::test

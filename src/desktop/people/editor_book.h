#pragma once

#include "desktop/people/editor_tab.h"

#include <QTabWidget>

namespace kindrel::desktop {

class EditorFamilyTab;
class EditorPersonTab;
class NoteBar;

/// The tabs of the editor. Only the one in front is kept up to date; another shows the family when it is turned to.
class EditorBook : public QTabWidget
{
    Q_OBJECT

public:
    EditorBook(EditorBench& bench, NoteBar& note);

    /// Setup lists may have changed while the page was parked.
    void read_lists();
    void show_file();
    [[nodiscard]] bool finish_typing();
    /// Turns to the tab where a refused save belongs.
    void focus_guilty(people::SaveRefusal::Where where);
    void open_person();
    /// The first field in the order of the Tab key.
    [[nodiscard]] QWidget* first_field() const;

private:
    void add(EditorTab* tab, const QString& title);
    void turned();

    EditorFamilyTab* m_family;
    EditorPersonTab* m_person;
    std::vector<EditorTab*> m_parts; ///< In the order of the tabs.
};

} // namespace kindrel::desktop

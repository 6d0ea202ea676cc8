#pragma once

#include "desktop/people/editor_suburb.h"

namespace kindrel::desktop {

/// The two addresses of the family and where it can be reached.
class EditorFamilyTab : public EditorTab
{
    Q_OBJECT

public:
    EditorFamilyTab(EditorBench& bench, NoteBar& note);

    void show_file() override;
    [[nodiscard]] bool finish_typing() override;
    [[nodiscard]] bool focus_guilty(people::SaveRefusal::Where where) override;
    [[nodiscard]] QWidget* first_field() const { return m_street; }
    /// After the church's suburbs may have changed.
    void read_suburbs();

private:
    [[nodiscard]] EditorForm* make_residential();
    [[nodiscard]] EditorForm* make_postal();
    [[nodiscard]] EditorForm* make_further();
    void choose_sound();
    [[nodiscard]] EditorForm* make_contacts();
    void copy_residential();

    NoteBar& m_note;
    QWidget* m_street = nullptr;
    SuburbBook m_suburbs;
    SuburbFields* m_residential = nullptr;
    SuburbFields* m_postal = nullptr;
    std::vector<EditorForm*> m_forms;
};

} // namespace kindrel::desktop

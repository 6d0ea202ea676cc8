#pragma once

#include "desktop/people/editor_fields.h"

class QComboBox;

namespace kindrel::desktop {

class ChoiceLine;
class DateField;
class EditorPortrait;

/// The chosen person's own data: names, standing, ways to reach them, giving number and portrait.
class EditorPersonTab : public EditorTab
{
    Q_OBJECT

public:
    explicit EditorPersonTab(EditorBench& bench);

    void show_file() override;
    [[nodiscard]] bool finish_typing() override;
    [[nodiscard]] bool focus_guilty(people::SaveRefusal::Where where) override;
    void focus_name();
    /// After the church's titles may have changed.
    void read_titles();

private:
    [[nodiscard]] EditorForm* make_names();
    [[nodiscard]] EditorForm* make_reach();
    void add_title(EditorForm& form);
    void add_family_type(EditorForm& form);
    void add_birth_date(EditorForm& form);
    void add_school_year(EditorForm& form);
    void add_pin(EditorForm& form);
    void show_family_type();
    bool finish_school_year();

    ChoiceLine* m_title = nullptr;
    TypedLine* m_name = nullptr;
    QComboBox* m_type = nullptr;
    DateField* m_birth_date = nullptr; ///< Null where the password does not show birth dates.
    QLineEdit* m_school_year = nullptr;
    std::vector<EditorForm*> m_forms;
    EditorPortrait* m_portrait;
};

} // namespace kindrel::desktop

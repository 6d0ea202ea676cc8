#pragma once

#include "desktop/people/editor_fields.h"

class QComboBox;
class QVBoxLayout;

namespace kindrel::desktop {

class PeopleList;

/// The surname, the file status, and the people of the family: adults and children in two lists that share one
/// selection, each with a line that adds to it.
class EditorPeople : public QWidget
{
    Q_OBJECT

public:
    explicit EditorPeople(EditorBench& bench);

    void show_file();
    void focus_surname();
    void focus_people();
    void focus_add_line();
    /// Names that were typed and not entered yet go into the family; false when one is refused.
    [[nodiscard]] bool finish_typing();
    /// In the order of the Tab key it stands before the fields of the tabs.
    [[nodiscard]] QWidget* last_field() const { return m_children.line; }

Q_SIGNALS:
    /// A person was asked for.
    void opened();
    /// A name was entered.
    void name_entered();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    using Add = bool (people::FamilyEditor::*)(const QString&);
    /// One of the two lists.
    struct Side
    {
        PeopleList* list;
        QLineEdit* line;
        Add add;
    };

    void add_family_fields(QVBoxLayout& column);
    void furnish_line(const Side& side, const QString& name, const QString& label);
    void furnish_list(const Side& side, const QString& name);
    void show_people();
    bool add(const Side& side);
    void enter(const Side& side);
    void remove();
    void move(const PeopleList& list, int by);

    EditorBench& m_bench;
    TypedLine* m_surname;
    FieldLink<QString> m_surname_link;
    QComboBox* m_condition;
    Side m_adults;
    Side m_children;
};

} // namespace kindrel::desktop

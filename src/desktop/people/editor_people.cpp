#include "desktop/people/editor_people.h"

#include "desktop/people/people_list.h"
#include "desktop/people/status_words.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QComboBox>
#include <QKeyEvent>
#include <QLabel>
#include <QShortcut>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyEditor;
using people::FileStatus;

namespace {

constexpr int column_width = 216;
constexpr std::array statuses{FileStatus::active, FileStatus::privacy, FileStatus::prospect, FileStatus::archive};

} // namespace

EditorPeople::EditorPeople(EditorBench& bench)
    : m_bench(bench), m_surname(new TypedLine), m_surname_link(field_link(bench, "surname", &people::Family::surname)),
      m_condition(new QComboBox), m_adults{new PeopleList(PeopleList::Who::adults, u"Adults"_s), new QLineEdit,
                                           &FamilyEditor::add_adult},
      m_children{new PeopleList(PeopleList::Who::children, u"Children"_s), new QLineEdit, &FamilyEditor::add_child}
{
    keep_width(*this, column_width);
    furnish_list(m_adults, u"adults"_s);
    furnish_list(m_children, u"children"_s);
    furnish_line(m_adults, u"add_adult"_s, u"Add ad&ult"_s);
    furnish_line(m_children, u"add_child"_s, u"Add &child"_s);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, 0, space::field, space::margin);
    column->setSpacing(space::field / 2);
    add_family_fields(*column);
    for (const Side& side : {m_adults, m_children}) {
        column->addSpacing(space::field);
        column->addWidget(make_heading(side.list->accessibleName()));
        column->addWidget(side.list, 1);
        column->addWidget(side.line);
    }
    // A new family is typed from the surname to the names; what was there before is passed by.
    const std::array<QWidget*, 6> order{m_condition, m_adults.list, m_children.list,
                                        m_surname,   m_adults.line, m_children.line};
    for (std::size_t place = 1; place < order.size(); ++place)
        setTabOrder(order[place - 1], order[place]);
}

void EditorPeople::add_family_fields(QVBoxLayout& column)
{
    m_surname->setObjectName(u"surname"_s);
    m_surname->setAccessibleName(u"Surname"_s);
    connect(m_surname, &QLineEdit::textEdited, this, m_surname_link.change);
    m_condition->setObjectName(u"family_condition"_s);
    m_condition->setAccessibleName(u"File status"_s);
    for (const FileStatus status : statuses)
        m_condition->addItem(status_word(status));
    const auto link = field_link(m_bench, "condition", &people::Family::Condition);
    connect(m_condition, &QComboBox::activated, this,
            [change = link.change](int row) { change(statuses.at(std::size_t(row))); });
    const auto add = [&column](const QString& label, QWidget* field) {
        auto* words = new QLabel(label);
        words->setBuddy(field);
        column.addWidget(words);
        column.addWidget(field);
    };
    add(u"&Surname"_s, m_surname);
    add(u"File st&atus"_s, m_condition);
}

void EditorPeople::furnish_list(const Side& side, const QString& name)
{
    side.list->setObjectName(name);
    connect(side.list, &PeopleList::person_chosen, &m_bench, &EditorBench::choose_person);
    connect(side.list, &PeopleList::opened, this, &EditorPeople::opened);
    connect(side.list, &PeopleList::removal_wanted, this, &EditorPeople::remove);
    connect(side.list, &PeopleList::adding_wanted, side.line, qOverload<>(&QWidget::setFocus));
    connect(side.list, &PeopleList::move_wanted, this, [this, list = side.list](int by) { move(*list, by); });
}

void EditorPeople::furnish_line(const Side& side, const QString& name, const QString& label)
{
    const QString plain = QString(label).remove(u'&');
    const QKeySequence key = QKeySequence::mnemonic(label);
    side.line->setObjectName(name);
    side.line->setPlaceholderText(plain);
    side.line->setAccessibleName(plain);
    side.line->setToolTip(u"%1 (%2); Enter adds the name"_s.arg(plain, key.toString(QKeySequence::NativeText)));
    side.line->installEventFilter(this);
    connect(side.line, &QLineEdit::editingFinished, this, [this, side] { add(side); });
    connect(new QShortcut(key, this), &QShortcut::activated, side.line, qOverload<>(&QWidget::setFocus));
}

void EditorPeople::focus_surname()
{
    m_surname->setFocus();
    m_surname->selectAll();
}

void EditorPeople::focus_people()
{
    const int person = m_bench.person();
    (stands_with_children(m_bench.editor.file(), person) ? m_children : m_adults).list->setFocus();
}

void EditorPeople::focus_add_line()
{
    m_adults.line->setFocus();
}

bool EditorPeople::finish_typing()
{
    return add(m_adults) && add(m_children);
}

void EditorPeople::show_file()
{
    m_surname->show_text(m_surname_link.value());
    const auto condition = std::ranges::find(statuses, m_bench.editor.file().family.Condition);
    m_condition->setCurrentIndex(int(condition - statuses.begin()));
    show_people();
    set_editable(*this, m_bench.editor.may_edit());
}

void EditorPeople::show_people()
{
    for (const Side& side : {m_adults, m_children})
        side.list->show_people(m_bench.editor.file(), m_bench.person());
}

bool EditorPeople::add(const Side& side)
{
    const QString name = side.line->text().trimmed();
    if (name.isEmpty() || side.line->isReadOnly())
        return true;
    side.line->clear(); // While a box answers, the name must not be found here again.
    if (!(m_bench.editor.*side.add)(name)) {
        side.line->setText(name);
        return false;
    }
    m_bench.choose_person(int(m_bench.editor.file().people.size()) - 1);
    m_bench.show_again();
    Q_EMIT name_entered();
    return true;
}

void EditorPeople::enter(const Side& side)
{
    if (side.line->text().trimmed().isEmpty())
        focusNextPrevChild(true);
    else
        (void)add(side);
}

void EditorPeople::remove()
{
    if (m_bench.editor.remove_person(m_bench.person()))
        m_bench.choose_person(m_bench.person());
    m_bench.show_again();
    focus_people();
}

void EditorPeople::move(const PeopleList& list, int by)
{
    const int person = m_bench.person();
    const int other = list.person_at(by);
    const bool moved = by < 0 ? m_bench.editor.move_person_up(person) : m_bench.editor.move_person_down(person);
    if (moved)
        m_bench.choose_person(other);
    m_bench.show_again();
}

bool EditorPeople::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(target, event);
    const int key = static_cast<QKeyEvent*>(event)->key();
    for (const Side& side : {m_adults, m_children})
        if (target == side.line && (key == Qt::Key_Return || key == Qt::Key_Enter)) {
            enter(side);
            return true;
        }
    return QWidget::eventFilter(target, event);
}

void EditorPeople::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::FontChange)
        show_people();
}

} // namespace kindrel::desktop

#include "desktop/people/editor_tabs.h"
#include "desktop/people/notebook_page.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/family_store.h"

#include <QHBoxLayout>
#include <QPushButton>
#include <QStackedWidget>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Area;

namespace {

/// The pages open by themselves where nothing stands in the way; otherwise a button asks for them, so that whoever
/// only passes the tab meets no question.
class NotesTab : public EditorTab
{
public:
    explicit NotesTab(EditorBench& bench);

    void show_file() override;
    [[nodiscard]] bool finish_typing() override { return save(); }

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    /// Whose pages are open.
    struct Owner
    {
        int family = 0;
        int person = 0; ///< 0 for one who is not stored yet.
        friend bool operator==(const Owner&, const Owner&) = default;
    };

    [[nodiscard]] QWidget* make_closed_panel();
    [[nodiscard]] QWidget* make_pages();
    [[nodiscard]] NotebookPage* make_page(Area area, const QString& name);
    [[nodiscard]] Owner owner() const;
    void ask_to_open();
    void open();
    void turn_to(const Owner& owner);
    [[nodiscard]] bool put_away();
    bool save();
    void each_page(const std::function<void(NotebookPage&)>& work) const;

    NotebookPage* m_family_page; ///< Null without the right to it, as is the person's.
    NotebookPage* m_person_page;
    QStackedWidget* m_stack;
    EmptyPanel* m_closed = nullptr;
    QPushButton* m_open = nullptr;
    QPushButton* m_save = nullptr;
    std::optional<Owner> m_opened;
};

NotesTab::NotesTab(EditorBench& bench)
    : EditorTab(bench), m_family_page(make_page(Area::family_file_notebook, u"family_notes"_s)),
      m_person_page(make_page(Area::personal_notes_in_notebook, u"person_notes"_s)), m_stack(new QStackedWidget)
{
    m_stack->addWidget(make_closed_panel());
    m_stack->addWidget(make_pages());
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::margin, space::field, space::margin, space::margin);
    column->addWidget(m_stack);
    show_file();
}

NotebookPage* NotesTab::make_page(Area area, const QString& name)
{
    auto& office = bench().desk.office;
    return office.may(area) ? new NotebookPage(office, name, this) : nullptr;
}

QWidget* NotesTab::make_closed_panel()
{
    auto* panel = new QWidget;
    m_closed = new EmptyPanel;
    m_open = new QPushButton(u"Open the note&book"_s);
    m_open->setObjectName(u"open_notebook"_s);
    connect(m_open, &QPushButton::clicked, this, &NotesTab::ask_to_open);
    auto* column = new QVBoxLayout(panel);
    column->addStretch(1);
    column->addWidget(m_closed);
    column->addWidget(m_open, 0, Qt::AlignHCenter);
    column->addStretch(2);
    return panel;
}

QWidget* NotesTab::make_pages()
{
    auto* sheet = new QWidget;
    auto* pages = new QHBoxLayout;
    pages->setSpacing(2 * space::margin);
    each_page([&](NotebookPage& page) {
        pages->addWidget(&page, 1);
        connect(&page, &NotebookPage::typed, this, [this] {
            bool altered = false;
            each_page([&](const NotebookPage& each) { altered = altered || each.altered(); });
            m_save->setEnabled(altered);
        });
    });
    m_save = new QPushButton(icon(u"document-save"_s), u"Sa&ve notes"_s);
    m_save->setObjectName(u"save_notes"_s);
    m_save->setEnabled(false);
    connect(m_save, &QPushButton::clicked, this, &NotesTab::save);
    auto* column = new QVBoxLayout(sheet);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addLayout(pages, 1);
    column->addWidget(m_save, 0, Qt::AlignLeft);
    return sheet;
}

void NotesTab::each_page(const std::function<void(NotebookPage&)>& work) const
{
    for (NotebookPage* page : {m_family_page, m_person_page})
        if (page)
            work(*page);
}

NotesTab::Owner NotesTab::owner() const
{
    const int person = bench().person();
    const auto& people = file().people;
    const bool there = person >= 0 && person < std::ssize(people);
    return {.family = file().family.Surname_ID, .person = there ? people[std::size_t(person)].person_id : 0};
}

void NotesTab::show_file()
{
    if (m_opened && m_opened->family != owner().family && !put_away())
        return;
    const bool nothing_asked = !editor().is_new() && !editor().altered() && !file().people.empty();
    if (m_opened || (isVisible() && nothing_asked))
        open();
    const bool permitted = m_family_page || m_person_page;
    m_closed->say(permitted ? u"The notebook is closed"_s : u"Your password does not open the notebook"_s,
                  permitted ? u"It opens once this family file is saved."_s : QString());
    m_open->setVisible(permitted);
    m_save->setVisible(editor().may_edit());
    m_stack->setCurrentIndex(m_opened && permitted ? 1 : 0);
}

void NotesTab::open()
{
    if (const Owner now = owner(); m_opened != now) {
        if (!save())
            return; // What could not be written stays in sight, under the name it belongs to.
        turn_to(now);
    }
    const int person = bench().person();
    if (m_family_page)
        m_family_page->set_heading(u"Notes on the family: %1"_s.arg(file().family.surname));
    if (m_person_page)
        m_person_page->set_heading(person < 0 ? u"Notes on a person"_s
                                              : u"Notes on %1"_s.arg(file().people.at(std::size_t(person)).Name));
    each_page([this](NotebookPage& page) { page.set_editable(editor().may_edit()); });
}

void NotesTab::turn_to(const Owner& owner)
{
    if (m_family_page)
        m_family_page->turn_to(people::notebook_of_family(owner.family));
    if (m_person_page && owner.person != 0)
        m_person_page->turn_to(people::notebook_of_person(owner.person));
    else if (m_person_page)
        m_person_page->turn_to({}, u"Notes on this person can be written once the family file is saved."_s);
    m_opened = owner;
}

void NotesTab::ask_to_open()
{
    if (editor().may_open_notebook())
        open();
    bench().show_again(); // The family may have been saved on the way.
}

bool NotesTab::put_away()
{
    // A family that was deleted or moved away has lost its pages: they must not come back.
    if (people::load_family(*bench().desk.office.session, m_opened->family) && !save())
        return false;
    each_page([](NotebookPage& page) { page.turn_to({}); });
    m_opened.reset();
    return true;
}

bool NotesTab::save()
{
    bool saved = true;
    each_page([&saved](NotebookPage& page) { saved = page.save() && saved; });
    return saved;
}

void NotesTab::showEvent(QShowEvent* event)
{
    EditorTab::showEvent(event);
    show_file();
}

void NotesTab::hideEvent(QHideEvent* event)
{
    EditorTab::hideEvent(event);
    save();
}

} // namespace

EditorTab* make_notes_tab(EditorBench& bench)
{
    return new NotesTab(bench);
}

} // namespace kindrel::desktop

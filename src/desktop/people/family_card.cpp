#include "desktop/people/family_card.h"

#include "desktop/people/card_header.h"
#include "desktop/people/portrait.h"
#include "desktop/people/status_words.h"
#include "desktop/shell/help.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "people/family_store.h"
#include "people/names.h"

#include <QEvent>
#include <QGridLayout>
#include <QListWidget>
#include <QShortcut>
#include <QTabWidget>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{960, 640};
constexpr int people_width = 210;

/// Parts of a tab in `across` columns.
QWidget* in_grid(const std::vector<QWidget*>& parts, int across)
{
    auto* tab = new QWidget;
    auto* grid = new QGridLayout(tab);
    grid->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    grid->setHorizontalSpacing(2 * space::group);
    grid->setVerticalSpacing(space::group);
    for (int part = 0; part < int(parts.size()); ++part) {
        grid->addWidget(parts[std::size_t(part)], part / across, part % across);
        grid->setColumnStretch(part % across, 1);
        if (qobject_cast<CardListView*>(parts[std::size_t(part)]))
            grid->setRowStretch(part / across, 1);
    }
    return tab;
}

} // namespace

FamilyCard::FamilyCard(Desk& desk, std::vector<int> surname_ids)
    : m_desk(desk), m_surname_ids(std::move(surname_ids)), m_header(new CardHeader), m_note(new NoteBar),
      m_people(new QListWidget), m_portrait(new Portrait)
{
    setObjectName(u"family_card"_s);
    m_people->setObjectName(u"people"_s);
    m_people->setAccessibleName(u"People of the family"_s);
    keep_width(*m_people, people_width);
    m_people->setWordWrap(true);
    m_people->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    connect(m_people, &QListWidget::currentRowChanged, this, &FamilyCard::show_person);

    auto* row = new QHBoxLayout;
    row->setContentsMargins(space::group, 0, space::group, space::group);
    row->setSpacing(space::margin);
    row->addWidget(m_people);
    row->addWidget(make_tabs(), 1);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(m_header);
    column->addWidget(m_note);
    column->addLayout(row, 1);
    add_keys();
    m_people->setFocus();
}

QTabWidget* FamilyCard::make_tabs()
{
    auto* tabs = new QTabWidget;
    tabs->setObjectName(u"sections"_s);
    tabs->setDocumentMode(true);
    tabs->addTab(make_family_tab(), u"&Family"_s);
    tabs->addTab(make_person_tab(), u"&Person"_s);
    const auto lists = [](auto& sections, const auto& of) {
        std::vector<QWidget*> parts;
        for (const auto& list : of)
            parts.push_back(sections.add_list(list));
        return parts;
    };
    tabs->addTab(in_grid(lists(m_person, group_lists()), 2), u"&Groups"_s);
    tabs->addTab(in_grid(lists(m_person, date_lists()), 1), u"&Dates and flexi"_s);
    tabs->addTab(in_grid(lists(m_family, event_lists()), 1), u"&Events"_s);
    if (m_desk.office.may(core::Area::visitation_tab))
        tabs->addTab(in_grid({m_family.add_list(visit_list())}, 1), u"&Visits"_s);
    tabs->addTab(in_grid({m_family.add_list(access_list())}, 1), u"&Access"_s);
    return tabs;
}

QWidget* FamilyCard::make_family_tab()
{
    using people::RecordAccess;
    return in_grid({m_family.add_form(u"Residential address"_s, residential_fields(), &RecordAccess::Address),
                    m_family.add_form(u"Postal address"_s, postal_fields(), &RecordAccess::Address),
                    m_family.add_form(u"Contacts"_s, contact_fields(), &RecordAccess::Address),
                    m_family.add_list(other_contact_list())},
                   2);
}

QWidget* FamilyCard::make_person_tab()
{
    using people::RecordAccess;
    QWidget* names = m_person.add_form(u"Person"_s, name_fields(), &RecordAccess::Details);
    QWidget* reach = m_person.add_form(u"Contact"_s, reach_fields(), &RecordAccess::Details);
    auto* tab = new QWidget;
    auto* row = new QHBoxLayout(tab);
    row->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    row->setSpacing(2 * space::group);
    auto* forms = new QVBoxLayout;
    forms->setSpacing(space::group);
    forms->addWidget(names);
    forms->addWidget(reach);
    forms->addStretch(1);
    row->addWidget(m_portrait, 0, Qt::AlignTop);
    row->addLayout(forms, 1);
    return tab;
}

void FamilyCard::add_keys()
{
    const auto key = [this](const QKeySequence& keys, auto action) {
        connect(new QShortcut(keys, this), &QShortcut::activated, this, action);
    };
    key(Qt::CTRL | Qt::Key_PageUp, [this] { turn(-1); });
    key(Qt::CTRL | Qt::Key_PageDown, [this] { turn(1); });
    key(Qt::CTRL | Qt::Key_K, [this] { m_desk.navigation.find_family(); });
    key(Qt::Key_F1, [this] { open_help(m_desk.windows, u"family_card"_s); });
    key(Qt::Key_Escape, [this] { close(); });
}

void FamilyCard::turn(int by)
{
    const int place = m_place + by;
    if (place < 0)
        m_note->say(u"This is the first family of the list."_s);
    else if (place >= int(m_surname_ids.size()))
        m_note->say(u"This is the last family of the list."_s);
    else if (show_place(place))
        m_note->clear();
}

bool FamilyCard::show_place(int place)
{
    auto file = people::load_family(*m_desk.office.session, m_surname_ids.at(std::size_t(place)));
    if (!file) {
        m_desk.office.dialogue.show({u"Unable to access this family file because another user has removed it from the "
                                     "database."_s});
        return false;
    }
    m_place = place;
    m_file = std::move(*file);
    m_history = people::read_group_history(*m_desk.office.session, m_file.family.Surname_ID);
    show_family();
    return true;
}

CardReader FamilyCard::reader() const
{
    CardReader reader{people::Disclosure::of(m_desk.office)};
    reader.disclosure.pins = reader.disclosure.pins && m_file.access.pin;
    reader.history = m_history;
    return reader;
}

void FamilyCard::show_family()
{
    const auto order = m_desk.office.day_order();
    setWindowTitle(card_caption(m_file.family, order));
    m_header->show_family(m_file.family, order);
    m_family.show(m_file, m_file.access, reader());
    show_people();
}

void FamilyCard::show_people()
{
    const QSignalBlocker quiet(m_people);
    m_people->clear();
    for (const auto& person : m_file.people) {
        const QString name = people::display_name(person, m_desk.office.settings.use_preferred_names);
        m_people->addItem(name + people::markers(person, people::Markers::full));
    }
    colour_people();
    m_people->setCurrentRow(0);
    show_person();
}

void FamilyCard::colour_people()
{
    for (int row = 0; row < m_people->count(); ++row) {
        const people::Person& person = m_file.people[std::size_t(row)];
        QFont font = m_people->font();
        font.setItalic(person.Decease);
        m_people->item(row)->setFont(font);
        m_people->item(row)->setForeground(state_colour(state_of(states_of(person)), shade_of(palette())));
    }
}

void FamilyCard::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::FontChange)
        colour_people();
}

void FamilyCard::show_person()
{
    const int row = m_people->currentRow();
    if (row < 0)
        return;
    const people::Person& person = m_file.people[std::size_t(row)];
    m_person.show(person, m_file.access, reader());
    m_portrait->show_file(m_desk.office.paths.file(core::Folder::portrait, u"%1.jpg"_s.arg(person.person_id)));
}

void open_family_card(Desk& desk, const std::vector<int>& surname_ids, int place)
{
    for (auto* card : desk.windows.all<FamilyCard>())
        if (card->surname_id() == surname_ids.at(std::size_t(place))) {
            bring_forward(*card);
            return;
        }
    auto card = std::make_unique<FamilyCard>(desk, surname_ids);
    if (card->show_place(place))
        desk.windows.open(card.release(), first_size);
}

} // namespace kindrel::desktop

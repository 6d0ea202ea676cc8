#include "desktop/people/editor_family_tab.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/person_files.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QPushButton>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::Address;
using people::RecordAccess;
using people::SuburbType;
using Where = people::SaveRefusal::Where;
using Line = FormLine<Address>;

namespace {

constexpr std::array residential_street{Line{"res_street", "S&treet", &Address::res_street, &Address::res_hidden},
                                        Line{"res_street2", "", &Address::res_street2}};
constexpr std::array residential_rest{
    Line{"res_state", "State", &Address::res_state}, Line{"res_country", "Country", &Address::res_country},
    Line{"res_map", "Map", &Address::res_map}, Line{"res_ref", "Map reference", &Address::res_ref}};
constexpr std::array further{Line{"audio_note", "Audio note", &Address::audio_note}};
constexpr std::array postal_street{Line{"post_street", "Street", &Address::post_street, &Address::post_hidden},
                                   Line{"post_street2", "", &Address::post_street2}};
constexpr std::array postal_rest{Line{"post_state", "State", &Address::post_state},
                                 Line{"post_country", "Country", &Address::post_country}};
constexpr std::array contacts{Line{"phone", "P&hone", &Address::phone, &Address::phone_hidden},
                              Line{"family_email", "E-mai&l", &Address::family_email, &Address::family_email_hidden},
                              Line{"family_email_description", "E-mail is of", &Address::family_email_description},
                              Line{"family_mobile", "&Mobile", &Address::family_mobile, &Address::family_mobile_hidden},
                              Line{"family_fax", "Fa&x", &Address::family_fax, &Address::family_fax_hidden}};

} // namespace

EditorFamilyTab::EditorFamilyTab(EditorBench& bench, NoteBar& note) : EditorTab(bench), m_note(note)
{
    auto* left = new QVBoxLayout;
    left->setSpacing(space::group);
    left->addWidget(make_residential());
    left->addWidget(make_further());
    left->addStretch(1);
    auto* right = new QVBoxLayout;
    right->setSpacing(space::group);
    right->addWidget(make_contacts());
    right->addWidget(make_postal());
    right->addStretch(1);
    auto* row = side_by_side({left, right});
    row->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    setLayout(row);
    read_suburbs();
}

EditorForm* EditorFamilyTab::make_residential()
{
    auto* form = new EditorForm(bench(), u"Residential address"_s, &RecordAccess::Address);
    form->add_lines<Address>(residential_street);
    m_street = form->findChild<TypedLine*>(QString::fromLatin1(residential_street.front().name));
    m_residential = new SuburbFields(bench(), m_note, m_suburbs, SuburbType::residential, *form);
    form->add_lines<Address>(residential_rest);
    m_forms.push_back(form);
    return form;
}

EditorForm* EditorFamilyTab::make_further()
{
    auto* form = new EditorForm(bench(), u"Further"_s, &RecordAccess::Address);
    form->add_lines<Address>(further);
    auto* buttons = new QWidget;
    auto* row = new QHBoxLayout(buttons);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    const auto add = [&](const QString& name, const QString& text, auto act) {
        auto* button = new QPushButton(text);
        button->setObjectName(name);
        connect(button, &QPushButton::clicked, this, act);
        row->addWidget(button);
        return button;
    };
    QPushButton* choose = add(u"choose_sound"_s, u"Choose sound\u2026"_s, [this] { choose_sound(); });
    add(u"play_sound"_s, u"Play"_s, [this] {
        if (!file().address.audio_note.isEmpty())
            bench().desk.office.dialogue.play(file().address.audio_note);
    });
    row->addStretch(1);
    form->add_wide(buttons);
    auto* transferred = new QCheckBox(u"Somebody was transferred"_s);
    transferred->setObjectName(u"transfer_exists"_s);
    const auto link = field_link(bench(), "transfer_exists", &Address::transfer_exists);
    connect(transferred, &QCheckBox::clicked, form, link.change);
    form->on_show([this, choose, transferred, value = link.value] {
        transferred->setChecked(value());
        choose->setEnabled(editor().may_edit());
    });
    form->add_wide(transferred);
    m_forms.push_back(form);
    return form;
}

void EditorFamilyTab::choose_sound()
{
    auto& office = bench().desk.office;
    const auto chosen = office.dialogue.choose_file({.title = u"Sound of the family"_s,
                                                     .filter = u"Sounds (*.wav *.mp3 *.ogg *.flac)"_s,
                                                     .suggested = office.paths.folder(core::Folder::audio)});
    if (!chosen)
        return;
    field_link(bench(), "audio_note", &Address::audio_note).change(people::attach_sound(office.paths, *chosen));
}

EditorForm* EditorFamilyTab::make_contacts()
{
    auto* form = new EditorForm(bench(), u"Contacts"_s, &RecordAccess::Address);
    form->add_lines<Address>(contacts);
    m_forms.push_back(form);
    return form;
}

EditorForm* EditorFamilyTab::make_postal()
{
    auto* form = new EditorForm(bench(), u"Postal address"_s, &RecordAccess::Address);
    form->add_lines<Address>(postal_street);
    m_postal = new SuburbFields(bench(), m_note, m_suburbs, SuburbType::postal, *form);
    form->add_lines<Address>(postal_rest);
    auto* copy = new QPushButton(icon(u"edit-copy"_s), u"Cop&y the residential address"_s);
    copy->setObjectName(u"copy_residential"_s);
    connect(copy, &QPushButton::clicked, this, &EditorFamilyTab::copy_residential);
    form->add_wide(copy);
    m_forms.push_back(form);
    return form;
}

void EditorFamilyTab::show_file()
{
    for (EditorForm* form : m_forms)
        form->show_file();
}

bool EditorFamilyTab::finish_typing()
{
    m_residential->finish_typing();
    m_postal->finish_typing();
    return true;
}

void EditorFamilyTab::read_suburbs()
{
    m_suburbs.read(*bench().desk.office.session);
    show_file();
}

void EditorFamilyTab::copy_residential()
{
    editor().change(u"copied address"_s, [](people::FamilyFile& file) {
        Address& address = file.address;
        address.post_street = address.res_street;
        address.post_street2 = address.res_street2;
        address.post_state = address.res_state;
        address.post_country = address.res_country;
        file.postal = file.residential;
        if (file.postal)
            file.postal->Type = SuburbType::postal;
    });
    bench().show_again();
}

bool EditorFamilyTab::focus_guilty(Where where)
{
    switch (where) {
    case Where::residential_suburb:
        m_residential->focus_suburb();
        return true;
    case Where::residential_postcode:
        m_residential->focus_postcode();
        return true;
    case Where::postal_suburb:
        m_postal->focus_suburb();
        return true;
    case Where::postal_postcode:
        m_postal->focus_postcode();
        return true;
    case Where::surname:
    case Where::people:
    case Where::given_name:
        break;
    }
    return false;
}

} // namespace kindrel::desktop

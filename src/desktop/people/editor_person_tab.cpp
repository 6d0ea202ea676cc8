#include "desktop/people/editor_person_tab.h"

#include "desktop/people/choice_line.h"
#include "desktop/people/editor_portrait.h"
#include "desktop/people/person_flags.h"
#include "desktop/people/pin_field.h"
#include "desktop/shell/date_field.h"
#include "desktop/shell/look.h"
#include "people/disclosed.h"
#include "people/family_roles.h"
#include "people/names.h"
#include "people/setup_lists.h"

#include <QCheckBox>
#include <QComboBox>
#include <QHBoxLayout>
#include <QIntValidator>
#include <QStandardItemModel>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::Person;
using people::RecordAccess;
using Line = FormLine<Person>;

namespace {

constexpr int short_width = 112;
constexpr int least_type_length = 10;
constexpr int greatest_school_year = 99;

constexpr std::array further_names{
    Line{"preferred_name", "Preferred name", &Person::preferred_name, &Person::Preferred_Name_hidden},
    Line{"middle_name", "Middle name", &Person::middle_name, &Person::middle_hidden},
    Line{"other_surname", "Other surname", &Person::other_surname, &Person::surname_hidden}};
constexpr std::array reach{
    Line{"mobile_phone", "&Mobile", &Person::mobile_phone, &Person::mobile_hidden},
    Line{"Personal_email", "E-mai&l", &Person::Personal_email, &Person::email_hidden},
    Line{"business_phone", "Business phone", &Person::business_phone, &Person::bussiness_phone_hidden},
    Line{"business_fax", "Business fax", &Person::business_fax, &Person::Bussiness_fax_hidden},
    Line{"business_email", "Business e-mail", &Person::business_email, &Person::bussiness_email_hidden}};

/// The three kinds of children have one word in reports; here they are told apart.
QString type_words(int code)
{
    switch (code) {
    case people::marital::before_school:
        return u"Child before school"_s;
    case people::marital::at_school:
        return u"Child at school"_s;
    case people::marital::after_school:
        return u"Child after school"_s;
    default:
        return people::marital_word(code);
    }
}

} // namespace

EditorPersonTab::EditorPersonTab(EditorBench& bench) : EditorTab(bench), m_portrait(new EditorPortrait(bench))
{
    auto* left = new QVBoxLayout;
    left->addWidget(make_names());
    left->addStretch(1);
    auto* right = new QVBoxLayout;
    right->setSpacing(space::group);
    right->addWidget(make_reach());
    right->addWidget(m_portrait);
    right->addStretch(1);
    auto* row = side_by_side({left, right});
    row->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    setLayout(row);
    read_titles();
}

EditorForm* EditorPersonTab::make_names()
{
    auto* form = new EditorForm(bench(), u"Person"_s, &RecordAccess::Details);
    add_title(*form);
    m_name = form->add_line(u"Name"_s, u"Gi&ven name"_s, field_link(bench(), "Name", &Person::Name));
    form->add_lines<Person>(further_names);
    add_family_type(*form);
    if (people::Disclosure::of(bench().desk.office).birth_dates)
        add_birth_date(*form);
    add_school_year(*form);
    form->add_wide(make_person_flags(bench(), *form));
    m_forms.push_back(form);
    return form;
}

EditorForm* EditorPersonTab::make_reach()
{
    auto* form = new EditorForm(bench(), u"Contact"_s, &RecordAccess::Details);
    form->add_lines<Person>(reach);
    form->add_wide(make_business_switch(bench(), *form));
    if (people::Disclosure::of(bench().desk.office).pins)
        add_pin(*form);
    m_forms.push_back(form);
    return form;
}

void EditorPersonTab::add_title(EditorForm& form)
{
    m_title = new ChoiceLine;
    m_title->setObjectName(u"Title"_s);
    keep_width(*m_title, short_width);
    const auto link = field_link(bench(), "Title", &Person::Title);
    connect(m_title, &QLineEdit::textEdited, this, link.change);
    connect(m_title, &ChoiceLine::taken, this, link.change);
    form.on_show([this, value = link.value] { m_title->show_text(value()); });
    form.add_row(u"&Title"_s, m_title, form.make_eye("Title", u"Title"_s, &Person::Title_hidden));
}

void EditorPersonTab::add_family_type(EditorForm& form)
{
    m_type = new QComboBox;
    m_type->setObjectName(u"Marital"_s);
    m_type->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon); // Its words are long.
    m_type->setMinimumContentsLength(least_type_length);
    for (int code = 1; code <= people::marital::codes; ++code)
        m_type->addItem(type_words(code));
    const auto link = field_link(bench(), "Marital", &Person::Marital);
    connect(m_type, &QComboBox::activated, this, [change = link.change](int row) { change(row + 1); });
    form.on_show([this] { show_family_type(); });
    form.add_row(u"Famil&y type"_s, m_type);
}

void EditorPersonTab::show_family_type()
{
    const int person = bench().person();
    auto& rows = static_cast<QStandardItemModel&>(*m_type->model());
    for (int row = 0; row < rows.rowCount(); ++row) {
        Person as_shown;
        as_shown.Marital = row + 1;
        rows.item(row)->setEnabled(person != 0 || !people::is_child(as_shown)); // The first is always an adult.
    }
    const Person* shown = record_of<Person>(file(), person);
    m_type->setCurrentIndex(shown ? shown->Marital - 1 : -1);
}

void EditorPersonTab::add_birth_date(EditorForm& form)
{
    m_birth_date = new DateField(bench().desk.office);
    m_birth_date->setObjectName(u"birthdate"_s);
    keep_width(*m_birth_date, short_width);
    const auto link = field_link(bench(), "birthdate", &Person::birthdate);
    connect(m_birth_date, &DateField::entered, this, link.change);
    form.on_show([this, value = link.value] { m_birth_date->show_date(value()); });
    form.add_row(u"&Birth date"_s, m_birth_date,
                 form.make_eye("birthdate", u"Birth date"_s, &Person::birthdate_hidden));
}

void EditorPersonTab::add_school_year(EditorForm& form)
{
    m_school_year = new QLineEdit;
    m_school_year->setObjectName(u"school_year"_s);
    m_school_year->setValidator(new QIntValidator(-greatest_school_year, greatest_school_year, m_school_year));
    m_school_year->setToolTip(u"1 upwards for school years, -1 for the year before, -2 for kinder"_s);
    keep_width(*m_school_year, short_width);
    connect(m_school_year, &QLineEdit::editingFinished, this, &EditorPersonTab::finish_school_year);
    form.on_show([this] {
        const Person* shown = record_of<Person>(file(), bench().person());
        if (!m_school_year->isModified())
            m_school_year->setText(shown && shown->school_year ? QString::number(*shown->school_year) : QString());
    });
    form.add_row(u"School yea&r"_s, m_school_year);
}

bool EditorPersonTab::finish_school_year()
{
    if (!m_school_year->isModified())
        return true;
    m_school_year->setModified(false);
    const QString typed = m_school_year->text();
    const bool taken =
        editor().set_school_year(bench().person(), typed.isEmpty() ? std::nullopt : std::optional(typed.toInt()));
    bench().show_again();
    if (!taken) {
        m_school_year->setFocus();
        m_school_year->selectAll();
    }
    return taken;
}

void EditorPersonTab::add_pin(EditorForm& form)
{
    auto* pin = new PinField(bench());
    form.on_show([pin] { pin->show_file(); });
    form.add_row(u"P&IN"_s, pin);
    form.add_wide(pin->buttons());
}

void EditorPersonTab::show_file()
{
    for (EditorForm* form : m_forms)
        form->show_file();
    setEnabled(bench().person() >= 0);
    m_portrait->show_file();
}

bool EditorPersonTab::finish_typing()
{
    return (!m_birth_date || m_birth_date->finish()) && finish_school_year();
}

bool EditorPersonTab::focus_guilty(people::SaveRefusal::Where where)
{
    if (where != people::SaveRefusal::Where::given_name)
        return false;
    focus_name();
    return true;
}

void EditorPersonTab::focus_name()
{
    m_name->setFocus();
    m_name->selectAll();
}

void EditorPersonTab::read_titles()
{
    QStringList titles;
    for (const auto& item : people::read_setup_items(*bench().desk.office.session, people::SetupKind::titles))
        titles += item.text;
    m_title->set_choices(titles);
    show_file();
}

} // namespace kindrel::desktop

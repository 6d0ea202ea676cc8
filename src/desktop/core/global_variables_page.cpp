#include "desktop/core/global_variables_page.h"

#include "desktop/core/logo_fields.h"
#include "desktop/core/setting_fields.h"
#include "desktop/core/setup_form.h"
#include "desktop/output/head_picture.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/value_form.h"

#include <QAction>
#include <QCheckBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QScrollArea>
#include <QSignalBlocker>
#include <QSpinBox>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Settings;

namespace {

const QString save_question = u"The global database variables have been altered. Do you wish to save them?"_s;
const QString saved_note = u"Saved. Pages that are open already follow when they are opened again."_s;
const QString day_order_note = u" The order of day and month changes the next time %1 is started."_s.arg(core::product);
const QString saved_for_others = u" Other workstations follow the next time %1 is started there."_s.arg(core::product);

struct Part
{
    const char16_t* name;
    bool Settings::*on;
    const char16_t* text;
};

constexpr std::array head_parts{
    Part{u"title_date", &Settings::title_date, u"The &date of the report"},
    Part{u"title_filters", &Settings::title_filters, u"The fi&lters in use"},
    Part{u"title_church", &Settings::title_church, u"The church's &name"},
    Part{u"title_logo", &Settings::title_logo, u"The lo&go"},
};

} // namespace

GlobalVariablesPage* GlobalVariablesPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::global_data);
    if (!entry)
        return nullptr;
    auto variables = core::GlobalVariables::open(desk.office);
    return variables ? new GlobalVariablesPage(desk, std::move(*entry), std::move(*variables)) : nullptr;
}

GlobalVariablesPage::GlobalVariablesPage(Desk& desk, core::AreaEntry entry, core::GlobalVariables variables)
    : Page(u"Global Database Variables"_s), m_desk(desk), m_entry(std::move(entry)), m_variables(std::move(variables)),
      m_fields(new SettingFields([this]() -> Settings& { return m_variables.settings(); }, this)),
      m_starts(new QSpinBox), m_logos(new LogoFields), m_picture(new HeadPicture(desk.office))
{
    setObjectName(u"setup_global_data"_s);
    auto* of_church = new QHBoxLayout;
    of_church->setSpacing(2 * space::group);
    of_church->addLayout(make_church(), 3);
    of_church->addLayout(make_head(), 2);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::group);
    column->addLayout(of_church);
    column->addLayout(make_logos());
    column->addLayout(make_picture(), 1);
    set_content(make_scrolling(column));
    auto* keep = add_action(u"Save"_s, u"document-save"_s, u"Saves these options (Ctrl+S)"_s);
    connect(keep, &QAction::triggered, this, &GlobalVariablesPage::save);
    connect(m_fields, &SettingFields::edited, this, &GlobalVariablesPage::show_state);
    show_all();
}

QBoxLayout* GlobalVariablesPage::make_church()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"In this church, %1"_s.arg(m_desk.office.church_name)));
    column->addWidget(
        m_fields->tick(&Settings::American_date, u"American_date"_s,
                       u"Dates have the &month first, MM/DD/YYYY, from the next start of %1"_s.arg(core::product)));
    column->addWidget(m_fields->tick(&Settings::use_preferred_names, u"use_preferred_names"_s,
                                     u"People are listed by their &preferred names"_s));
    add_beside_caption(
        *column, u"Next P.&I.N. Number to be given"_s,
        m_fields->number(&Settings::pin_auto_number_start, u"pin_auto_number_start"_s, core::largest_pin_start));
    column->addWidget(make_explanation(u"A number that somebody has already is passed over."_s));
    column->addStretch(1);
    return column;
}

QBoxLayout* GlobalVariablesPage::make_head()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"At the head of this church's reports"_s));
    for (const auto& part : head_parts)
        column->addWidget(m_fields->tick(part.on, QString::fromUtf16(part.name), QString::fromUtf16(part.text)));
    column->addStretch(1);
    return column;
}

QBoxLayout* GlobalVariablesPage::make_logos()
{
    m_starts->setObjectName(u"starts_between_compactions"_s);
    m_starts->setRange(0, 9999);
    m_starts->setSpecialValueText(u"Never"_s);
    connect(m_starts, &QSpinBox::valueChanged, this, [this](int starts) {
        m_variables.set_starts_between_compactions(starts);
        show_state();
    });
    connect(m_logos, &LogoFields::choosing_wanted, this, &GlobalVariablesPage::choose_logo);
    connect(m_logos, &LogoFields::removal_wanted, this, [this](core::LogoOf whose) {
        m_variables.remove_logo(whose);
        show_state();
    });
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"In all churches"_s));
    auto* compaction = new QVBoxLayout;
    add_beside_caption(*compaction, u"&Starts of the program after which it compacts a church's database by itself"_s,
                       m_starts);
    column->addLayout(compaction);
    column->addWidget(make_heading(u"The logo on reports"_s));
    column->addWidget(m_logos);
    return column;
}

QBoxLayout* GlobalVariablesPage::make_picture()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Head and foot of a report"_s));
    column->addWidget(m_picture, 1);
    return column;
}

void GlobalVariablesPage::find()
{
    lead_to(*this, u"American_date"_s);
}

void GlobalVariablesPage::choose_logo(core::LogoOf whose)
{
    const auto file = m_desk.office.dialogue.choose_file(
        {.title = u"Logo on reports"_s, .filter = u"Pictures (*.jpg *.jpeg *.png *.bmp *.gif)"_s, .suggested = {}});
    if (file && m_variables.choose_logo(whose, *file, is_picture))
        show_state();
}

bool GlobalVariablesPage::save()
{
    if (!m_variables.save()) {
        lead_to(*this, m_variables.faulty());
        return false;
    }
    show_all();
    note().say(saved_note + (m_variables.waits_for_next_start() ? day_order_note : QString()) +
               (m_desk.office.shared() ? saved_for_others : QString()));
    return true;
}

bool GlobalVariablesPage::leave()
{
    return save_or_drop(m_desk.office.dialogue, save_question, [this] {
        if (auto stored = core::GlobalVariables::open(m_desk.office))
            m_variables = std::move(*stored);
        show_all();
    });
}

void GlobalVariablesPage::show_all()
{
    m_fields->show();
    const QSignalBlocker quiet(m_starts);
    m_starts->setValue(m_variables.starts_between_compactions());
    show_state();
}

void GlobalVariablesPage::show_state()
{
    m_logos->show_logos(m_variables);
    m_picture->show_settings(m_variables.settings(), m_variables.logo_in_use());
    chip().set(altered() ? u"Altered"_s : QString(), State::altered);
    Q_EMIT state_changed();
}

} // namespace kindrel::desktop

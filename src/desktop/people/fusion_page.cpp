#include "desktop/people/fusion_page.h"

#include "desktop/people/fusion_chooser.h"
#include "desktop/people/fusion_entries.h"
#include "desktop/people/fusion_names.h"
#include "desktop/people/fusion_words.h"
#include "desktop/people/person_switches.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/value_form.h"

#include <QAction>
#include <QGridLayout>
#include <QLabel>
#include <QShortcut>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int names_width = 200;
constexpr int switch_columns = 3;

} // namespace

FusionPage* FusionPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::fusions);
    return entry ? new FusionPage(desk, std::move(*entry)) : nullptr;
}

FusionPage::FusionPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Filter Fusion"_s), m_desk(desk), m_entry(std::move(entry)),
      m_setup(std::make_unique<people::FusionSetup>(desk.office)), m_names(new FusionNames(m_setup)),
      m_chooser(new FusionChooser(desk.office, desk.remembered, m_setup,
                                  [this](const people::FilterItem& item) { return entry_of(item); })),
      m_entries(new FusionEntries(m_setup)), m_states(new PersonSwitches(switch_columns)), m_sentence(make_value())
{
    setObjectName(u"Setup_Fusion"_s);
    add_actions();
    set_content(make_content());
    connect_parts();
    m_chooser->reload();
    m_names->show_names(0);
}

FusionPage::~FusionPage() = default;

void FusionPage::add_actions()
{
    auto* save_all = add_action(u"Save"_s, u"document-save"_s, u"Save the fusions (Ctrl+S)"_s);
    connect(save_all, &QAction::triggered, this, &FusionPage::save);
    auto* cancel_all =
        add_action(u"Cancel"_s, u"edit-undo"_s, u"Drop every change since the fusions were last saved"_s);
    connect(cancel_all, &QAction::triggered, this, &FusionPage::cancel);
    auto* insert = new QShortcut(Qt::Key_Insert, this);
    insert->setContext(Qt::WidgetWithChildrenShortcut);
    connect(insert, &QShortcut::activated, m_names, &FusionNames::focus_line);
}

QWidget* FusionPage::make_content()
{
    auto* purpose = new QLabel(u"Combine a combination of groups together under a single 'Fusion' name to assist in "
                               "applying filters before creating a report."_s);
    purpose->setWordWrap(true);
    dress(*purpose, TextSize::secondary);
    m_sentence->setObjectName(u"sentence"_s);
    m_sentence->setAccessibleName(u"The fusion in words"_s);
    keep_width(*m_names, names_width);
    auto* content = new QWidget;
    auto* grid = new QGridLayout(content);
    grid->setContentsMargins(space::group, 0, space::group, space::margin);
    grid->setHorizontalSpacing(space::group);
    grid->setVerticalSpacing(space::margin);
    grid->addWidget(purpose, 0, 0, 1, 3);
    grid->addWidget(m_names, 1, 0);
    grid->addWidget(m_chooser, 1, 1);
    grid->addWidget(m_entries, 1, 2);
    grid->addWidget(m_states, 2, 0, 1, 3);
    grid->addWidget(m_sentence, 3, 0, 1, 3);
    grid->setRowStretch(1, 1);
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    return content;
}

void FusionPage::connect_parts()
{
    connect(m_names, &FusionNames::chosen_changed, this, &FusionPage::show_fusion);
    connect(m_names, &FusionNames::changed, this, &FusionPage::show_state);
    connect(m_chooser, &FusionChooser::add_wanted, this, &FusionPage::add_entry);
    connect(m_entries, &FusionEntries::changed, this, &FusionPage::show_state);
    connect(m_states, &PersonSwitches::turned, this, &FusionPage::set_states);
}

const people::FusionEntry* FusionPage::entry_of(const people::FilterItem& item) const
{
    const int fusion = m_names->chosen();
    if (!m_setup->fusions().holds(fusion))
        return nullptr;
    const auto& entries = m_setup->fusions()[fusion].entries;
    const auto found = std::ranges::find_if(entries, [&](const people::FusionEntry& entry) {
        return entry.item.kind == item.kind && entry.item.item == item.item && entry.item.ministry == item.ministry;
    });
    return found == entries.end() ? nullptr : &*found;
}

void FusionPage::add_entry(const people::FilterItem& item, people::FusionMode mode)
{
    const int fusion = m_names->chosen();
    if (!m_setup->add_entry(fusion, item, mode))
        return m_setup->fusions().holds(fusion) ? void() : m_names->focus_list();
    m_entries->show_fusion(fusion, int(m_setup->fusions()[fusion].entries.size()) - 1);
    show_state();
}

void FusionPage::set_states()
{
    if (!m_setup->set_states(m_names->chosen(), m_states->states()))
        m_states->show_states({});
    show_state();
}

void FusionPage::show_fusion()
{
    const int fusion = m_names->chosen();
    const auto& fusions = m_setup->fusions();
    m_entries->show_fusion(fusion, 0);
    m_states->show_states(fusions.holds(fusion) ? fusions[fusion].states : people::PersonStates{});
    show_state();
}

void FusionPage::show_state()
{
    const int fusion = m_names->chosen();
    const auto& fusions = m_setup->fusions();
    m_sentence->setText(fusions.holds(fusion)
                            ? fusion_sentence(fusions[fusion])
                            : u"Type the name of a fusion into the line at the left and press Enter."_s);
    m_chooser->show_entries();
    const bool unsaved = altered();
    m_saved = m_saved && !unsaved;
    chip().set(unsaved ? u"not saved"_s : QString(), State::altered);
    set_status(m_saved ? u"Saved"_s : QString());
    Q_EMIT state_changed();
}

void FusionPage::entered()
{
    m_chooser->reload();
    m_names->focus_list();
}

void FusionPage::find()
{
    m_chooser->setFocus();
}

bool FusionPage::altered() const
{
    return m_setup->altered() || m_names->typing();
}

bool FusionPage::save()
{
    bool typed = false;
    bool saved = false;
    try {
        typed = m_names->finish_typing();
        saved = typed && m_setup->save();
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"Unable to save the fusions"_s, error.text()});
    }
    if (!typed)
        return false; // Everything stands as it was typed.
    m_saved = saved;
    m_names->show_names(m_names->chosen());
    return saved;
}

void FusionPage::cancel()
{
    if (altered() && m_desk.office.dialogue.confirm(
                         {u"Do you wish to drop every change since the fusions were saved?"_s}, core::Answer::no))
        drop();
}

void FusionPage::drop()
{
    m_names->drop_typing();
    m_setup = std::make_unique<people::FusionSetup>(m_desk.office);
    note().clear();
    m_names->show_names(std::max(m_names->chosen(), 0));
}

bool FusionPage::leave()
{
    return save_or_drop(m_desk.office.dialogue, u"Do you wish to save the changes made to the fusions?"_s,
                        [this] { drop(); });
}

} // namespace kindrel::desktop

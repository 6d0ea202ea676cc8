#include "desktop/output/label_setup_page.h"

#include "desktop/core/setup_form.h"
#include "desktop/output/label_fields.h"
#include "desktop/output/preview_window.h"
#include "desktop/output/sheet_picture.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "output/labels/label_sheets.h"
#include "output/labels/labels.h"

#include <QAbstractSpinBox>
#include <QAction>
#include <QBoxLayout>
#include <QLabel>
#include <QScrollArea>
#include <QShortcut>
#include <QTabWidget>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString save_question = u"The label setup has been altered. Do you wish to save it?"_s;
const QString saved_note = u"The label setup is saved. The next labels and tags are printed by it."_s;
const QString saved_for_others = u" Other workstations have it the next time %1 is started there."_s.arg(core::product);
const QString tab_key = u"label_setup/tab"_s;

enum Kind { labels, tags };

} // namespace

LabelSetupPage* LabelSetupPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::reports);
    return entry ? new LabelSetupPage(desk, std::move(*entry)) : nullptr;
}

LabelSetupPage::LabelSetupPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Labels and Name Tags"_s), m_desk(desk), m_entry(std::move(entry)),
      m_stored(output::reload_label_setup(desk.office)), m_setup(m_stored),
      m_tabs(new QTabWidget), m_sheets{make_labels(), make_tags()}
{
    setObjectName(u"label_setup"_s);
    m_tabs->setObjectName(u"label_tabs"_s);
    m_tabs->setDocumentMode(true);
    add_tab(m_sheets[labels], u"&Mailing Labels"_s);
    add_tab(m_sheets[tags], u"&Name Tags"_s);
    m_tabs->setCurrentIndex(desk.remembered.value(tab_key, int(labels)).toInt());
    connect(m_tabs, &QTabWidget::currentChanged, this, [this](int tab) {
        m_desk.remembered.keep(tab_key, tab);
        draw();
        find();
    });
    add_actions();
    set_content(m_tabs);
}

LabelSetupPage::Tab LabelSetupPage::make_labels()
{
    auto& [grid, name, address] = m_setup.labels;
    const auto tab = make_tab(u"label_"_s, grid);
    tab.fields->add_text(u"name"_s, u"&Family's names"_s, name);
    tab.fields->add_text(u"address"_s, u"A&ddress"_s, address);
    return tab;
}

LabelSetupPage::Tab LabelSetupPage::make_tags()
{
    auto& [grid, given_name, surname, church, shows_church, shows_border] = m_setup.tags;
    const auto tab = make_tab(u"tag_"_s, grid);
    tab.fields->add_text(u"given_name"_s, u"Gi&ven name"_s, given_name);
    tab.fields->add_text(u"surname"_s, u"S&urname"_s, surname);
    tab.fields->add_text(u"church"_s, u"Church's nam&e"_s, church);
    tab.fields->add_tick(u"shows_church"_s, u"Church's name &on top"_s, shows_church);
    tab.fields->add_tick(u"shows_border"_s, u"&Frame around each tag"_s, shows_border);
    return tab;
}

LabelSetupPage::Tab LabelSetupPage::make_tab(const QString& prefix, output::LabelGrid& grid)
{
    const Tab tab{grid, new LabelFields(prefix, grid), new SheetPicture(m_desk)};
    tab.picture->setObjectName(prefix + "sheet"_L1);
    connect(tab.fields, &LabelFields::edited, this, &LabelSetupPage::show_state);
    connect(tab.picture, &SheetPicture::start_chosen, this, [this, tab](int label) {
        tab.grid.start = label;
        tab.fields->show_values();
        show_state();
    });
    return tab;
}

void LabelSetupPage::add_tab(const Tab& tab, const QString& title)
{
    auto* fields = new QVBoxLayout;
    fields->addWidget(tab.fields);
    fields->addStretch(1);
    auto* sheet = new QVBoxLayout;
    sheet->setSpacing(space::field);
    sheet->addWidget(make_explanation(
        u"The first sheet as it would be printed now, without the broken lines. Click the label to start at, or choose "
        u"it with the arrow keys; those before it are used already."_s));
    sheet->addWidget(tab.picture, 1);
    auto* content = new QWidget;
    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(0, space::margin, space::group, space::margin);
    row->setSpacing(space::group);
    row->addWidget(make_scrolling(fields), 3);
    row->addLayout(sheet, 2);
    m_tabs->addTab(content, title);
}

void LabelSetupPage::add_actions()
{
    for (const auto key : {Qt::Key_PageUp, Qt::Key_PageDown}) { // Either leads to the other one.
        auto* turn = new QShortcut(Qt::CTRL | key, this);
        turn->setContext(Qt::WidgetWithChildrenShortcut);
        connect(turn, &QShortcut::activated, this, [this] { m_tabs->setCurrentIndex(1 - m_tabs->currentIndex()); });
    }
    auto* test = add_action(u"Test Sheet"_s, u"document-print-preview"_s,
                            u"Shows where the labels lie, to be printed and held against a real sheet (Ctrl+P)"_s);
    connect(test, &QAction::triggered, this, &LabelSetupPage::open_test_sheet);
    auto* keep = add_action(u"Save"_s, u"document-save"_s, u"Saves both sheets (Ctrl+S)"_s);
    connect(keep, &QAction::triggered, this, &LabelSetupPage::save);
}

const LabelSetupPage::Tab& LabelSetupPage::shown() const
{
    return m_sheets[std::size_t(m_tabs->currentIndex())];
}

output::ReportChoice LabelSetupPage::shown_report() const
{
    return m_tabs->currentIndex() == labels ? output::mailing_labels_on(m_setup.labels)
                                            : output::name_tags_on(m_setup.tags);
}

void LabelSetupPage::entered()
{
    m_list = people::active_families(*m_desk.office.session);
    show_state();
    find();
}

void LabelSetupPage::find()
{
    lead_to(*this, m_tabs->currentIndex() == labels ? u"label_stock"_s : u"tag_stock"_s);
}

bool LabelSetupPage::save()
{
    if (!output::save_label_setup(m_desk.office, m_setup)) {
        if (const auto fault = output::fault_of(m_setup))
            lead_to_field(fault.field);
        return false;
    }
    m_stored = output::load_label_setup(m_desk.office);
    if (m_setup != m_stored) // Another workstation changed other parts meanwhile.
        show_stored();
    show_state();
    note().say(saved_note + (m_desk.office.shared() ? saved_for_others : QString()));
    return true;
}

bool LabelSetupPage::leave()
{
    return save_or_drop(m_desk.office.dialogue, save_question, [this] {
        show_stored();
        show_state();
    });
}

void LabelSetupPage::show_stored()
{
    m_setup = m_stored;
    for (const auto& tab : m_sheets)
        tab.fields->show_values();
}

void LabelSetupPage::lead_to_field(const QString& name)
{
    m_tabs->setCurrentIndex(name.startsWith("tag_"_L1) ? tags : labels);
    lead_to(*this, name);
    if (auto* number = findChild<QAbstractSpinBox*>(name))
        number->selectAll();
}

void LabelSetupPage::show_state()
{
    chip().set(altered() ? u"Altered"_s : QString(), State::altered);
    draw();
    Q_EMIT state_changed();
}

void LabelSetupPage::draw()
{
    const auto& [grid, fields, picture] = shown();
    const auto fault = output::fault_of(grid);
    if (fault)
        picture->show_fault(fault.text);
    else
        picture->show_sheet(grid, shown_report(), m_list);
    set_status(fault ? QString() : u"%1 labels on a sheet"_s.arg(grid.labels()));
}

void LabelSetupPage::open_test_sheet()
{
    const auto grid = shown().grid;
    if (const auto fault = output::fault_of(grid)) {
        m_desk.office.dialogue.show({fault.text});
        lead_to_field((m_tabs->currentIndex() == labels ? u"label_"_s : u"tag_"_s) + fault.field);
        return;
    }
    open_preview(m_desk, u"Test Sheet"_s, [grid](core::Progress&, pages::PageSpool& spool) {
        output::write_test_sheet(grid, spool);
        return true;
    });
}

} // namespace kindrel::desktop

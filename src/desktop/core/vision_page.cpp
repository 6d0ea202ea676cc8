#include "desktop/core/vision_page.h"

#include "desktop/core/setting_fields.h"
#include "desktop/core/setup_form.h"
#include "desktop/output/head_picture.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/value_form.h"

#include <QAction>
#include <QCheckBox>
#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QScrollArea>
#include <QSpinBox>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Settings;

namespace {

const QString save_question = u"The vision statement has been altered. Do you wish to save it?"_s;
const QString saved_note = u"The vision statement is saved. The next report has it."_s;
const QString saved_for_others = u" Other workstations have it the next time %1 is started there."_s.arg(core::product);

constexpr int statement_lines = 4;

/// Beneath the statement: two yes/no fields, shown as one choice.
int line_of(const Settings& settings)
{
    return settings.vision_thick_line ? 2 : settings.vision_line;
}

void set_line(Settings& settings, int line)
{
    settings.vision_line = line > 0;
    settings.vision_thick_line = line == 2;
}

QPlainTextEdit* with_lines(QPlainTextEdit* text, int lines)
{
    text->setMinimumHeight(2 * text->fontMetrics().lineSpacing() + space::margin);
    text->setMaximumHeight(lines * text->fontMetrics().lineSpacing() + space::margin);
    return text;
}

} // namespace

VisionPage* VisionPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::vision_setup);
    if (!entry)
        return nullptr;
    auto setup = core::VisionSetup::open(desk.office);
    return setup ? new VisionPage(desk, std::move(*entry), std::move(*setup)) : nullptr;
}

VisionPage::VisionPage(Desk& desk, core::AreaEntry entry, core::VisionSetup setup)
    : Page(u"Vision Statement"_s), m_desk(desk), m_entry(std::move(entry)), m_setup(std::move(setup)),
      m_fields(new SettingFields([this]() -> Settings& { return m_setup.settings(); }, this)),
      m_picture(new HeadPicture(desk.office))
{
    setObjectName(u"setup_vision"_s);
    auto* fields = new QHBoxLayout;
    fields->setSpacing(2 * space::group);
    fields->addLayout(make_statement(), 3);
    fields->addLayout(make_look(), 2);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::group);
    column->addLayout(fields);
    column->addLayout(make_picture(), 1);
    set_content(make_scrolling(column));
    auto* keep = add_action(u"Save"_s, u"document-save"_s, u"Saves the vision statement (Ctrl+S)"_s);
    connect(keep, &QAction::triggered, this, &VisionPage::save);
    connect(m_fields, &SettingFields::edited, this, &VisionPage::show_state);
    show_state();
}

QBoxLayout* VisionPage::make_statement()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(u"The purpose of this church"_s));
    column->addWidget(make_explanation(u"Setup a vision statement that states the purpose of your church."_s));
    column->addSpacing(space::field);
    add_below_caption(*column, u"&Vision statement"_s,
                      with_lines(m_fields->paragraph(&Settings::vision, u"vision"_s), statement_lines));
    column->addSpacing(space::field);
    auto* on_reports = with_lines(m_fields->paragraph(&Settings::church_vision, u"church_vision"_s), statement_lines);
    on_reports->setPlaceholderText(u"The same text"_s);
    add_below_caption(*column, u"On &reports, where it reads otherwise"_s, on_reports);
    column->addSpacing(space::field);
    column->addWidget(m_fields->tick(&Settings::Include_vision_reports, u"Include_vision_reports"_s,
                                     u"Print it at the &head of every page of reports"_s));
    column->addWidget(make_explanation(u"The statement stands on the main menu as well."_s));
    column->addStretch(1);
    return column;
}

QBoxLayout* VisionPage::make_look()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(u"How it is printed"_s));
    add_beside_caption(*column, u"&Font"_s,
                       m_fields->font(&Settings::vision_font, u"vision_font"_s, u"As reports have it"_s));
    auto* size = m_fields->number(&Settings::vision_font_size, u"vision_font_size"_s, 999);
    size->setSuffix(u" pt"_s);
    add_beside_caption(*column, u"Si&ze"_s, size);
    add_beside_caption(*column, u"St&yle"_s,
                       m_fields->choice(&Settings::vision_format, u"vision_format"_s,
                                        {u"Plain"_s, u"Bold"_s, u"Italic"_s, u"Bold and italic"_s}));
    add_beside_caption(
        *column, u"&Alignment"_s,
        m_fields->choice(&Settings::vision_alignment, u"vision_alignment"_s, {u"Left"_s, u"Centre"_s, u"Right"_s}));
    add_beside_caption(*column, u"Line &beneath"_s,
                       m_fields->choice(line_of, set_line, u"vision_line"_s, {u"None"_s, u"Thin"_s, u"Thick"_s}));
    column->addSpacing(space::field);
    column->addWidget(make_heading(u"At the foot of reports"_s));
    column->addWidget(m_fields->tick(&Settings::include_vision_footer, u"include_vision_footer"_s,
                                     u"&Print these lines on every page"_s));
    auto* first = m_fields->line(&Settings::footer_vision, u"footer_vision"_s);
    first->setAccessibleName(u"First line at the foot"_s);
    auto* second = m_fields->line(&Settings::footer_vision_line2, u"footer_vision_line2"_s);
    second->setAccessibleName(u"Second line at the foot"_s);
    column->addWidget(first);
    column->addWidget(second);
    column->addWidget(m_fields->tick(&Settings::footer_line, u"footer_line"_s, u"&Line above the foot"_s));
    column->addStretch(1);
    return column;
}

QBoxLayout* VisionPage::make_picture()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Head and foot of a report"_s));
    column->addWidget(m_picture, 1);
    return column;
}

void VisionPage::find()
{
    lead_to(*this, u"vision"_s);
}

bool VisionPage::save()
{
    if (!m_setup.save()) {
        lead_to(*this, m_setup.faulty());
        return false;
    }
    m_fields->show();
    show_state();
    note().say(saved_note + (m_desk.office.shared() ? saved_for_others : QString()));
    return true;
}

bool VisionPage::leave()
{
    return save_or_drop(m_desk.office.dialogue, save_question, [this] {
        if (auto stored = core::VisionSetup::open(m_desk.office))
            m_setup = std::move(*stored);
        m_fields->show();
        show_state();
    });
}

void VisionPage::show_state()
{
    m_picture->show_settings(m_setup.settings(), m_desk.office.logo);
    chip().set(altered() ? u"Altered"_s : QString(), State::altered);
    Q_EMIT state_changed();
}

} // namespace kindrel::desktop

#include "desktop/people/filter_panel.h"

#include "desktop/people/filter_dates.h"
#include "desktop/people/filter_families.h"
#include "desktop/people/filter_items_part.h"
#include "desktop/people/filter_ranges.h"
#include "desktop/people/saved_filter_bar.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"
#include "desktop/shell/value_form.h"

#include <QEvent>
#include <QGridLayout>
#include <QLabel>
#include <QListWidget>
#include <QLocale>
#include <QScrollArea>
#include <QStackedWidget>
#include <QTimer>

#include <chrono>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

using namespace std::chrono_literals;
constexpr int kinds_width = 184;
constexpr int sentence_lines = 4;
/// A pause in typing, after which people are counted.
constexpr auto typing_pause = 150ms;

people::Filter first_filter()
{
    people::Filter filter;
    filter.families = people::FamilyList::active;
    return filter;
}

} // namespace

FilterPanel::FilterPanel(Desk& desk, QWidget* parent)
    : QWidget(parent), m_desk(desk), m_filter(first_filter()),
      m_saved(new SavedFilterBar(desk, m_filter, [this] { return finish_parts(); })), m_kinds(make_kinds()),
      m_parts(new QStackedWidget), m_count(make_value()), m_sentence(make_value()), m_faults(make_value()),
      m_pause(new QTimer(this))
{
    setObjectName(u"filter_panel"_s);
    m_pause->setSingleShot(true);
    m_pause->setInterval(typing_pause);
    connect(m_pause, &QTimer::timeout, this, &FilterPanel::count_now);
    connect(m_saved, &SavedFilterBar::recalled, this, &FilterPanel::adopt);
    connect(m_saved, &SavedFilterBar::clear_wanted, this, [this] { set_filter(first_filter()); });
    add_parts();
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::group);
    grid->setVerticalSpacing(space::margin);
    grid->setRowStretch(1, 1);
    grid->setColumnStretch(1, 1);
    grid->addWidget(m_saved, 0, 0, 1, 2);
    grid->addWidget(m_kinds, 1, 0);
    grid->addWidget(m_parts, 1, 1);
    grid->addWidget(make_outcome(), 2, 0, 1, 2);
    m_kinds->setCurrentRow(0);
    colour_faults();
}

QListWidget* FilterPanel::make_kinds()
{
    auto* kinds = new QListWidget;
    kinds->setObjectName(u"kinds"_s);
    kinds->setAccessibleName(u"Kinds of criteria"_s);
    keep_width(*kinds, kinds_width);
    connect(kinds, &QListWidget::currentRowChanged, this, &FilterPanel::show_part);
    // Enter in the list leads to what it shows.
    connect(kinds, &QListWidget::itemActivated, this, [this] { part(m_kinds->currentRow()).focus_first(); });
    return kinds;
}

QWidget* FilterPanel::make_outcome()
{
    keep_text_size(*m_count, TextSize::group);
    m_count->setAccessibleName(u"People found"_s);
    m_sentence->setAccessibleName(u"The filter in words"_s);
    auto* column = new QVBoxLayout;
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    for (const auto& [text, name] :
         {std::pair(m_count, u"count"_s), std::pair(m_faults, u"faults"_s), std::pair(m_sentence, u"sentence"_s)}) {
        text->setObjectName(name);
        column->addWidget(text);
    }
    column->addStretch(1);
    auto* scroll = new QScrollArea;
    auto* texts = new QWidget;
    texts->setLayout(column);
    scroll->setWidget(texts);
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->viewport()->setAutoFillBackground(false);
    texts->setAutoFillBackground(false);
    scroll->setFixedHeight(sentence_lines * row_height());
    return scroll;
}

void FilterPanel::add_parts()
{
    add_part(new FilterFamilies(m_desk, m_filter));
    for (const auto& kind : people::filter_kinds())
        add_part(new FilterItemsPart(m_desk, m_filter, kind));
    add_part(new FilterFusionsPart(m_desk, m_filter));
    add_part(new FilterRanges(m_desk, m_filter));
    add_part(new FilterDates(m_desk, m_filter));
    add_part(new FilterFamilyType(m_desk, m_filter));
}

void FilterPanel::add_part(FilterPart* part)
{
    connect(part, &FilterPart::changed, this, &FilterPanel::take_change);
    m_parts->addWidget(part);
    m_kinds->addItem(part->caption());
}

FilterPart& FilterPanel::part(int row) const
{
    return *static_cast<FilterPart*>(m_parts->widget(row));
}

void FilterPanel::show_part(int row)
{
    m_parts->setCurrentIndex(row);
    if (m_read)
        part(row).reload();
    show_uses();
}

void FilterPanel::show_uses()
{
    for (int row = 0; row < m_parts->count(); ++row) {
        const int uses = part(row).uses();
        QListWidgetItem* kind = m_kinds->item(row);
        kind->setText(uses == 0 ? part(row).caption() : u"%1 (%2)"_s.arg(part(row).caption()).arg(uses));
        QFont font = m_kinds->font();
        font.setBold(uses > 0);
        kind->setFont(font);
    }
}

void FilterPanel::take_change()
{
    m_saved->show_changed();
    show_uses();
    m_pause->start();
}

void FilterPanel::set_filter(const people::Filter& filter)
{
    adopt(filter);
    m_saved->show_changed();
}

void FilterPanel::adopt(const people::Filter& filter)
{
    for (int row = 0; row < m_parts->count(); ++row)
        part(row).forget_typed();
    m_filter = filter;
    show_part(m_kinds->currentRow());
    m_pause->start();
}

void FilterPanel::reload()
{
    m_read = true;
    m_saved->reload();
    show_part(m_kinds->currentRow());
    m_pause->start();
}

void FilterPanel::focus_kinds()
{
    m_kinds->setFocus(Qt::OtherFocusReason);
}

bool FilterPanel::finish_parts()
{
    for (int row = 0; row < m_parts->count(); ++row) {
        if (QWidget* lacking = part(row).finish()) {
            m_kinds->setCurrentRow(row);
            lacking->setFocus(Qt::OtherFocusReason);
            return false;
        }
    }
    return true;
}

bool FilterPanel::finish()
{
    if (!finish_parts())
        return false;
    if (people::complete(m_desk.office.dialogue, m_filter))
        return true;
    m_kinds->setCurrentRow(0);
    part(0).focus_first();
    return false;
}

void FilterPanel::count_now()
{
    m_pause->stop();
    if (!m_filter.families)
        return show_outcome({}, people::no_families_chosen.toString(), {});
    core::Session& session = *m_desk.office.session;
    const auto day = filter_day(m_desk.office);
    QStringList faults = people::lost_items(session, m_filter);
    const int count = people::count_people(session, m_filter, day);
    if (const auto emptying = count == 0 ? people::emptying_criterion(session, m_filter, day) : std::nullopt)
        faults.prepend(u"What leaves nobody: %1"_s.arg(*emptying));
    const QString words = count == 1 ? u"1 person is found"_s : u"%1 people are found"_s.arg(QLocale().toString(count));
    show_outcome(count == 0 ? u"Nobody is found"_s : words, people::sentence(session, m_filter, day), faults);
}

void FilterPanel::colour_faults()
{
    QPalette own;
    own.setColor(QPalette::WindowText, state_colour(State::error, shade_of(palette())));
    m_faults->setPalette(own);
}

void FilterPanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        colour_faults();
}

void FilterPanel::show_outcome(const QString& count, const QString& sentence, const QStringList& faults)
{
    m_count->setText(count);
    m_count->setVisible(!count.isEmpty());
    m_sentence->setText(sentence);
    m_faults->setText(faults.join(u'\n'));
    m_faults->setVisible(!faults.isEmpty());
}

} // namespace kindrel::desktop

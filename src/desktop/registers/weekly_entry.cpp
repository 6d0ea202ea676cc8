#include "desktop/registers/weekly_entry.h"

#include "desktop/output/list_report.h"
#include "desktop/registers/figure_grid.h"
#include "desktop/registers/notes_dialog.h"
#include "desktop/registers/register_dates.h"
#include "desktop/registers/weekly_grid_model.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/table_text.h"
#include "desktop/shell/value_form.h"

#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLocale>
#include <QPushButton>
#include <QStackedWidget>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::FigureKind;
using registers::NotesArea;

namespace {

constexpr int dates_width = 208;
constexpr std::array column_shares{46, 18, 18, 18};

} // namespace

WeeklyEntry::WeeklyEntry(Desk& desk, registers::WeeklyRegister& weekly, QWidget* parent)
    : QWidget(parent), m_desk(desk), m_weekly(weekly),
      m_dates(new RegisterDates(desk, weekly, [this] { return finish_typing(); })),
      m_model(new WeeklyGridModel(weekly, desk.office.day_order(), this)), m_grid(new FigureGrid),
      m_notes(new QPushButton(icon(u"view-list-details"_s), {})), m_heading(make_heading({})), m_totals(make_value()),
      m_work(new QStackedWidget)
{
    m_notes->setObjectName(u"notes"_s);
    connect(m_notes, &QPushButton::clicked, this, &WeeklyEntry::open_notes);
    m_dates->add_button(m_notes);
    keep_width(*m_dates, dates_width);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(space::group, space::margin, space::group, space::margin);
    row->setSpacing(space::group);
    row->addWidget(m_dates);
    row->addWidget(make_work(), 1);
    connect(m_dates, &RegisterDates::changed, this, &WeeklyEntry::show_date);
    connect(m_dates, &RegisterDates::opened, m_grid, &FigureGrid::start);
    connect(m_dates, &RegisterDates::remarked, this, &WeeklyEntry::remarked);
    connect(m_dates, &RegisterDates::chosen_changed, this, &WeeklyEntry::show_notes_button);
    connect(m_grid, &FigureGrid::edited, this, &WeeklyEntry::changed);
    connect(m_model, &QAbstractItemModel::dataChanged, this, [this] {
        show_totals();
        Q_EMIT changed();
    });
}

QWidget* WeeklyEntry::make_work()
{
    m_grid->setObjectName(u"figures"_s);
    m_grid->setAccessibleName(u"Figures"_s);
    m_grid->setModel(m_model);
    m_grid->horizontalHeader()->setObjectName(u"weekly_figures"_s);
    follow(m_desk.remembered, *m_grid->horizontalHeader(), column_shares);
    m_heading->setObjectName(u"open_date"_s);
    m_heading->setBuddy(m_grid);
    m_totals->setObjectName(u"totals"_s);
    m_totals->setAlignment(Qt::AlignRight);
    auto* figures = new QWidget;
    auto* column = new QVBoxLayout(figures);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_heading);
    column->addWidget(m_grid, 1);
    column->addWidget(m_totals);
    auto* none = new EmptyPanel;
    none->say(u"No date is open"_s,
              u"Choose a date at the left and press Enter, or press Insert, type a new date and press Enter."_s);
    m_work->addWidget(figures);
    m_work->addWidget(none);
    return m_work;
}

void WeeklyEntry::show_register()
{
    m_dates->show_register();
    show_date();
}

void WeeklyEntry::show_date()
{
    m_model->refresh();
    const auto& open = m_weekly.open_date();
    m_work->setCurrentIndex(open ? 0 : 1);
    if (open)
        m_heading->setText(u"&Figures of %1 %2"_s.arg(QLocale::c().dayName(open->date.qdate().dayOfWeek()),
                                                      open->date.shown(m_desk.office.day_order())));
    show_totals();
    show_notes_button();
    Q_EMIT changed();
}

void WeeklyEntry::show_totals()
{
    const auto count = registers::shown_figure(m_weekly.total(FigureKind::attendance), FigureKind::attendance);
    m_totals->setText(u"Attendance: %1     $ Amount: %2"_s.arg(
        count.isEmpty() ? u"0"_s : count,
        registers::shown_figure(m_weekly.total(FigureKind::money), FigureKind::money)));
}

void WeeklyEntry::show_notes_button()
{
    try {
        m_notes->setText(registers::notes_button(*m_desk.office.session, NotesArea::weekly, m_dates->chosen()));
    } catch (const core::DatabaseError&) {
        // The page must be able to close without its database; opening the notes tells what is wrong.
    }
}

void WeeklyEntry::open_notes()
{
    if (finish_typing())
        desktop::open_notes(m_desk.office, NotesArea::weekly, m_weekly.project(), m_dates->chosen(), this,
                            [this] { show_notes_button(); });
}

void WeeklyEntry::focus_work()
{
    if (m_weekly.open_date())
        m_grid->setFocus();
    else
        m_dates->focus_dates();
}

void WeeklyEntry::focus_dates()
{
    if (finish_typing())
        m_dates->focus_dates();
}

void WeeklyEntry::focus_new_date()
{
    if (finish_typing())
        m_dates->focus_new_date();
}

bool WeeklyEntry::typing() const
{
    return m_grid->cells().altered();
}

bool WeeklyEntry::finish_typing()
{
    return m_grid->cells().finish();
}

bool WeeklyEntry::ready()
{
    if (!m_weekly.open_date())
        Q_EMIT remarked(u"No date is open."_s);
    return finish_typing() && m_weekly.open_date();
}

QString WeeklyEntry::title() const
{
    return m_heading->text().remove(u'&');
}

void WeeklyEntry::print()
{
    if (ready())
        print_list(m_desk, title(), *m_model);
}

void WeeklyEntry::save_csv()
{
    if (core::permitted(m_desk.office, core::Area::export_text) && ready())
        save_as_csv(*m_model, title().replace(u'/', u'-'), m_desk.office.dialogue);
}

} // namespace kindrel::desktop

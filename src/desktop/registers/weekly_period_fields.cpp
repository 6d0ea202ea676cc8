#include "desktop/registers/weekly_period_fields.h"

#include "core/day_refusal.h"
#include "desktop/registers/year_field.h"
#include "desktop/shell/date_field.h"
#include "desktop/shell/look.h"

#include <QComboBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::PeriodKind;
using registers::ReportPeriod;

namespace {

const QString period_key = u"weekly/period_"_s;
constexpr int years_proposed = 5;
constexpr int year_width = 96;
constexpr int caption_width = 52;

struct KindName
{
    PeriodKind kind;
    const char* name;
};
constexpr std::array all_kinds{
    KindName{PeriodKind::date_range, "Date range"},
    KindName{PeriodKind::calendar_year, "Calendar year"},
    KindName{PeriodKind::financial_year, "Financial year"},
    KindName{PeriodKind::year_span, "Several years"},
};

QString kind_key(ReportPeriod report)
{
    return period_key + u"kind_%1"_s.arg(int(report));
}

bool fits(PeriodKind kind, ReportPeriod report)
{
    const bool year = kind == PeriodKind::calendar_year || kind == PeriodKind::financial_year;
    switch (report) {
    case ReportPeriod::any_days:
        return kind != PeriodKind::year_span;
    case ReportPeriod::one_year:
        return year;
    case ReportPeriod::years:
    case ReportPeriod::two_years:
        return kind == PeriodKind::year_span;
    }
    return false;
}

/// The year so far, this year, the last five years and the last two.
QHash<QString, QString> proposals(const core::Date& today)
{
    const auto year = QString::number(today.year);
    return {{u"from"_s, core::Date{today.year, 1, 1}.stored()},
            {u"to"_s, today.stored()},
            {u"year"_s, year},
            {u"from_year"_s, QString::number(today.year - years_proposed + 1)},
            {u"to_year"_s, year},
            {u"compared_year"_s, QString::number(today.year - 1)},
            {u"with_year"_s, year}};
}

} // namespace

QLayout* with_caption(const QString& caption, QWidget* control)
{
    auto* words = new QLabel(caption);
    words->setBuddy(control);
    keep_width(*words, caption_width);
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(words);
    row->addWidget(control, 1);
    return row;
}

WeeklyPeriodFields::WeeklyPeriodFields(Desk& desk, QWidget* parent)
    : QWidget(parent), m_desk(desk), m_kind(new QComboBox),
      m_proposed(proposals(core::Date::from(desk.office.clock.today()))), m_from(make_date(u"from"_s, m_from_date)),
      m_to(make_date(u"to"_s, m_to_date)), m_year(make_year(u"year"_s)), m_from_year(make_year(u"from_year"_s)),
      m_to_year(make_year(u"to_year"_s)), m_years{remembered(u"from_year"_s), remembered(u"to_year"_s)},
      m_two_years{remembered(u"compared_year"_s), remembered(u"with_year"_s)}, m_first(new QLabel),
      m_second(new QLabel(u"&To"_s))
{
    m_kind->setObjectName(u"period_kind"_s);
    m_year->setCurrentText(remembered(u"year"_s));
    show_span();
    auto* caption = new QLabel(u"P&eriod"_s);
    caption->setBuddy(m_kind);
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::field);
    grid->setVerticalSpacing(space::field);
    grid->addWidget(caption, 0, 0);
    grid->addWidget(m_kind, 0, 1, 1, 3);
    grid->addWidget(m_first, 1, 0);
    grid->addWidget(m_from, 1, 1);
    grid->addWidget(m_year, 1, 1);
    grid->addWidget(m_from_year, 1, 1);
    grid->addWidget(m_second, 1, 2);
    grid->addWidget(m_to, 1, 3);
    grid->addWidget(m_to_year, 1, 3);
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(3, 1);
    keep_width(*caption, caption_width);
    connect(m_kind, &QComboBox::currentIndexChanged, this, &WeeklyPeriodFields::show_fields);
    connect(m_kind, &QComboBox::currentIndexChanged, this, &WeeklyPeriodFields::keep_kind);
    fit(m_report);
}

DateField* WeeklyPeriodFields::make_date(const QString& name, std::optional<core::Date>& date)
{
    date = core::Date::from_stored(remembered(name));
    auto* field = new DateField(m_desk.office);
    field->setObjectName(name);
    field->require_year(core::day_refusal);
    field->show_date(date);
    connect(field, &DateField::entered, this, [&date](std::optional<core::Date> typed) { date = typed; });
    return field;
}

YearField* WeeklyPeriodFields::make_year(const QString& name)
{
    auto* field = new YearField(registers::offered_years());
    field->setObjectName(name);
    keep_width(*field, year_width);
    return field;
}

QString WeeklyPeriodFields::remembered(const QString& name) const
{
    const auto kept = m_desk.remembered.value(period_key + name).toString();
    return kept.isEmpty() ? m_proposed.value(name) : kept;
}

WeeklyPeriodFields::Span& WeeklyPeriodFields::span()
{
    return m_report == ReportPeriod::two_years ? m_two_years : m_years;
}

void WeeklyPeriodFields::show_span()
{
    m_from_year->setCurrentText(span().from);
    m_to_year->setCurrentText(span().to);
}

void WeeklyPeriodFields::take_span()
{
    span() = {m_from_year->currentText(), m_to_year->currentText()};
}

void WeeklyPeriodFields::fit(ReportPeriod report)
{
    take_span();
    m_report = report;
    show_span();
    {
        const QSignalBlocker quiet(m_kind);
        m_kind->clear();
        for (const auto& each : all_kinds)
            if (fits(each.kind, report))
                m_kind->addItem(QString::fromLatin1(each.name), int(each.kind));
        m_kind->setCurrentIndex(std::max(m_kind->findData(m_desk.remembered.value(kind_key(report))), 0));
    }
    show_fields();
}

PeriodKind WeeklyPeriodFields::kind() const
{
    return static_cast<PeriodKind>(m_kind->currentData().toInt());
}

void WeeklyPeriodFields::show_fields()
{
    const bool range = kind() == PeriodKind::date_range;
    const bool span = kind() == PeriodKind::year_span;
    m_from->setVisible(range);
    m_to->setVisible(range);
    m_year->setVisible(!range && !span);
    m_from_year->setVisible(span);
    m_to_year->setVisible(span);
    m_second->setVisible(range || span);
    m_first->setText(range || span ? u"&From"_s : u"&Year"_s);
    m_first->setBuddy(range ? static_cast<QWidget*>(m_from) : span ? m_from_year : m_year);
    m_second->setBuddy(range ? static_cast<QWidget*>(m_to) : m_to_year);
}

std::optional<registers::PeriodChoice> WeeklyPeriodFields::choice()
{
    if (kind() == PeriodKind::date_range && !(m_from->finish() && m_to->finish()))
        return {};
    return registers::PeriodChoice{.kind = kind(),
                                   .from = m_from_date,
                                   .to = m_to_date,
                                   .year = (kind() == PeriodKind::year_span ? m_from_year : m_year)->currentText(),
                                   .to_year = m_to_year->currentText()};
}

void WeeklyPeriodFields::keep(const QString& name, const QString& value)
{
    m_desk.remembered.keep(period_key + name, value == m_proposed.value(name) ? QString() : value);
}

void WeeklyPeriodFields::keep_kind()
{
    m_desk.remembered.keep(kind_key(m_report), int(kind()));
}

void WeeklyPeriodFields::remember()
{
    take_span();
    keep(u"from"_s, m_from_date ? m_from_date->stored() : QString());
    keep(u"to"_s, m_to_date ? m_to_date->stored() : QString());
    keep(u"year"_s, m_year->currentText());
    keep(u"from_year"_s, m_years.from);
    keep(u"to_year"_s, m_years.to);
    keep(u"compared_year"_s, m_two_years.from);
    keep(u"with_year"_s, m_two_years.to);
}

void WeeklyPeriodFields::focus_end(registers::ReportField end)
{
    auto* label = end == registers::ReportField::to ? m_second : m_first;
    auto* field = label->buddy();
    field->setFocus();
    auto* year = qobject_cast<QComboBox*>(field);
    (year ? year->lineEdit() : qobject_cast<QLineEdit*>(field))->selectAll();
}

} // namespace kindrel::desktop

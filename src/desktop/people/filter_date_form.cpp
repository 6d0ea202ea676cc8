#include "desktop/people/filter_date_form.h"

#include "core/day_refusal.h"
#include "desktop/people/filter_end_field.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "people/setup_lists.h"

#include <QComboBox>
#include <QFormLayout>
#include <QLabel>
#include <QLocale>
#include <QPushButton>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::DateCriterion;
using people::DateSource;
using people::DateSpan;

namespace {

constexpr int months = 12;

struct SourceRow
{
    DateSource source;
    const char* caption;
    std::optional<core::Area> right = {};
};
constexpr std::array sources{SourceRow{DateSource::birth_date, "Birth date", core::Area::birth_dates},
                             SourceRow{DateSource::personal_date, "Date of the person"},
                             SourceRow{DateSource::family_date, "Date of the family"},
                             SourceRow{DateSource::events, "Event of the family"},
                             SourceRow{DateSource::visits, "Visit to the family", core::Area::visitation_tab}};

/// In the order of DateSpan.
constexpr std::array spans{"From day to day", "Anniversary in any year", "Month of any year"};

std::optional<people::SetupKind> list_of(DateSource source)
{
    if (source == DateSource::personal_date)
        return people::SetupKind::personal_dates;
    return source == DateSource::family_date ? std::optional(people::SetupKind::family_dates) : std::nullopt;
}

} // namespace

FilterDateForm::FilterDateForm(const Desk& desk)
    : m_office(desk.office), m_source(new QComboBox), m_item(new QComboBox), m_span(new QComboBox),
      m_month(new QComboBox), m_ends{End{new FilterEndField(desk.office)}, End{new FilterEndField(desk.office)}},
      m_form(make_rows())
{
    for (const auto& [source, caption, right] : sources)
        if (!right || m_office.may(*right))
            m_source->addItem(QString::fromLatin1(caption), int(source));
    for (const char* words : spans)
        m_span->addItem(QString::fromLatin1(words));
    for (int month = 1; month <= months; ++month)
        m_month->addItem(QLocale::c().monthName(month));
    connect(m_source, &QComboBox::currentIndexChanged, this, &FilterDateForm::fill_items);
    connect(m_span, &QComboBox::currentIndexChanged, this, &FilterDateForm::show_span);
    for (End& end : m_ends) {
        connect(end.field, &DateField::entered, this, [&end](std::optional<core::Date> day) { end.day = day; });
        connect(
            end.field, &QLineEdit::returnPressed, this,
            [this, &end] {
                if (!end.field->isModified()) // Otherwise the field has refused what was typed.
                    Q_EMIT add_wanted();
            },
            Qt::QueuedConnection);
    }
    auto* button = new QPushButton(icon(u"list-add"_s), u"&Add"_s);
    button->setObjectName(u"add_date"_s);
    connect(button, &QPushButton::clicked, this, &FilterDateForm::add_wanted);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"One more date"_s));
    column->addLayout(m_form);
    column->addWidget(button, 0, Qt::AlignLeft);
    fill_items();
    show_span();
}

QFormLayout* FilterDateForm::make_rows()
{
    auto* form = new QFormLayout;
    form->setRowWrapPolicy(QFormLayout::DontWrapRows);
    form->setHorizontalSpacing(space::field);
    form->setVerticalSpacing(space::field);
    add_row(*form, u"&Date"_s, m_source, u"date_source"_s);
    add_row(*form, u"&Kind"_s, m_item, u"date_item"_s);
    add_row(*form, u"&Lies"_s, m_span, u"date_span"_s);
    add_row(*form, u"Fro&m"_s, m_ends[0].field, u"date_from"_s);
    add_row(*form, u"&To"_s, m_ends[1].field, u"date_to"_s);
    add_row(*form, u"&Month"_s, m_month, u"date_month"_s);
    return form;
}

void FilterDateForm::add_row(QFormLayout& form, const QString& caption, QWidget* field, const QString& name)
{
    field->setObjectName(name);
    field->setAccessibleName(QString(caption).remove(u'&'));
    if (auto* box = qobject_cast<QComboBox*>(field))
        box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    auto* label = new QLabel(caption);
    label->setBuddy(field);
    form.addRow(label, field);
}

DateSource FilterDateForm::source() const
{
    return DateSource(m_source->currentData().toInt());
}

DateSpan FilterDateForm::span() const
{
    return DateSpan(m_span->currentIndex());
}

void FilterDateForm::fill_items()
{
    m_item->clear();
    m_item->addItem(u"All kinds"_s, 0);
    if (const auto list = list_of(source()))
        for (const auto& stored : people::read_setup_items(*m_office.session, *list))
            m_item->addItem(stored.text, stored.key);
    m_form->setRowVisible(m_item, list_of(source()).has_value());
}

void FilterDateForm::show_span()
{
    m_form->setRowVisible(m_month, span() == DateSpan::month);
    for (const End& end : m_ends) {
        m_form->setRowVisible(end.field, span() != DateSpan::month);
        end.field->allow_any_year(span() == DateSpan::anniversaries);
    }
}

void FilterDateForm::reload()
{
    const int item = m_item->currentData().toInt();
    fill_items();
    m_item->setCurrentIndex(std::max(0, m_item->findData(item)));
}

void FilterDateForm::focus_first()
{
    m_source->setFocus(Qt::TabFocusReason);
}

bool FilterDateForm::typed() const
{
    return span() != DateSpan::month &&
           std::ranges::any_of(m_ends, [](const End& end) { return !end.field->text().isEmpty(); });
}

bool FilterDateForm::whole() const
{
    return span() != DateSpan::month && std::ranges::all_of(m_ends, [this](const End& end) {
               return end.day && !end.field->isModified() && !lacks_year(end);
           });
}

bool FilterDateForm::lacks_year(const End& end) const
{
    return end.day && !end.day->year_known() && span() != DateSpan::anniversaries;
}

QWidget* FilterDateForm::lacking()
{
    if (span() == DateSpan::month)
        return nullptr;
    for (const End& end : m_ends)
        if (!end.field->finish_end())
            return end.field;
    const auto unfit = std::ranges::find_if(m_ends, [this](const End& end) { return !end.day || lacks_year(end); });
    if (unfit == m_ends.end())
        return nullptr;
    m_office.dialogue.show({unfit->day ? core::year_missing : u"Please enter both dates of the range"_s});
    return unfit->field;
}

DateCriterion FilterDateForm::take()
{
    DateCriterion taken{.source = source(), .item = m_item->currentData().toInt(), .span = span()};
    if (taken.item != 0)
        taken.text = m_item->currentText();
    if (taken.span == DateSpan::month) {
        taken.month = m_month->currentIndex() + 1;
    } else {
        taken.from = *m_ends[0].day;
        taken.to = *m_ends[1].day;
    }
    forget_typed();
    return taken;
}

void FilterDateForm::forget_typed()
{
    for (End& end : m_ends) {
        end.day.reset();
        end.field->setModified(false);
        end.field->show_date({});
    }
}

} // namespace kindrel::desktop

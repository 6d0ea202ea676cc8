#include "desktop/people/filter_dates.h"

#include "desktop/shell/date_field.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"
#include "desktop/shell/value_form.h"
#include "people/disclosed.h"
#include "people/filter_words.h"

#include <QComboBox>
#include <QFormLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QLocale>
#include <QPushButton>
#include <QScrollArea>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::DateCriterion;
using people::DateSource;
using people::DateSpan;

namespace {

constexpr int form_width = 256;
constexpr int months = 12;

struct SourceWords
{
    DateSource source;
    const char* caption;
};
constexpr std::array sources{
    SourceWords{DateSource::birth_date, "Birth date"}, SourceWords{DateSource::personal_date, "Date of the person"},
    SourceWords{DateSource::family_date, "Date of the family"}, SourceWords{DateSource::events, "Event of the family"},
    SourceWords{DateSource::visits, "Visit to the family"}};

/// In the order of DateSpan.
constexpr std::array spans{"From day to day", "Anniversary in any year", "Month of any year"};

std::optional<people::SetupKind> list_of(DateSource source)
{
    if (source == DateSource::personal_date)
        return people::SetupKind::personal_dates;
    return source == DateSource::family_date ? std::optional(people::SetupKind::family_dates) : std::nullopt;
}

} // namespace

FilterDates::FilterDates(Desk& desk, people::Filter& filter)
    : FilterPart(desk, filter, u"Birth and Other Dates"_s), m_list(new QListWidget), m_source(new QComboBox),
      m_item(new QComboBox), m_span(new QComboBox),
      m_month(new QComboBox), m_ends{End{new DateField(desk.office)}, End{new DateField(desk.office)}}
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::group);
    row->addLayout(make_list(), 1);
    row->addWidget(make_side_panel(make_form(), form_width));
    fill_sources();
    for (const char* words : spans)
        m_span->addItem(QString::fromLatin1(words));
    for (int month = 1; month <= months; ++month)
        m_month->addItem(QLocale::c().monthName(month));
    connect(m_source, &QComboBox::currentIndexChanged, this, &FilterDates::fill_items);
    connect(m_span, &QComboBox::currentIndexChanged, this, &FilterDates::show_span);
    for (End& end : m_ends) {
        connect(end.field, &DateField::entered, this, [&end](std::optional<core::Date> day) { end.day = day; });
        connect(end.field, &DateField::returnPressed, this, &FilterDates::add);
    }
    fill_items();
    show_span();
}

void FilterDates::fill_sources()
{
    for (const auto& [source, caption] : sources)
        if (source != DateSource::birth_date || people::Disclosure::of(desk().office).birth_dates)
            m_source->addItem(QString::fromLatin1(caption), int(source));
}

QVBoxLayout* FilterDates::make_list()
{
    m_list->setObjectName(u"dates"_s);
    m_list->setAccessibleName(u"Dates of the filter"_s);
    m_list->setWordWrap(true);
    m_list->installEventFilter(this);
    auto* drop = new QPushButton(icon(u"edit-delete"_s), u"Remo&ve"_s);
    drop->setObjectName(u"remove_date"_s);
    drop->setToolTip(u"Take the chosen date out of the filter (Delete)"_s);
    connect(drop, &QPushButton::clicked, this, &FilterDates::remove);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Every one of these must hold"_s));
    column->addWidget(m_list, 1);
    column->addWidget(drop, 0, Qt::AlignLeft);
    return column;
}

QVBoxLayout* FilterDates::make_form()
{
    m_form = new QFormLayout;
    m_form->setRowWrapPolicy(QFormLayout::DontWrapRows);
    m_form->setHorizontalSpacing(space::field);
    m_form->setVerticalSpacing(space::field);
    add_row(*m_form, u"&Date"_s, m_source, u"date_source"_s);
    add_row(*m_form, u"&Kind"_s, m_item, u"date_item"_s);
    add_row(*m_form, u"&Lies"_s, m_span, u"date_span"_s);
    add_row(*m_form, u"Fr&om"_s, m_ends[0].field, u"date_from"_s);
    add_row(*m_form, u"&To"_s, m_ends[1].field, u"date_to"_s);
    add_row(*m_form, u"&In"_s, m_month, u"date_month"_s);
    auto* button = new QPushButton(icon(u"list-add"_s), u"&Add"_s);
    button->setObjectName(u"add_date"_s);
    connect(button, &QPushButton::clicked, this, &FilterDates::add);
    auto* column = new QVBoxLayout;
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"One more date"_s));
    column->addLayout(m_form);
    column->addWidget(button, 0, Qt::AlignLeft);
    column->addStretch(1);
    return column;
}

void FilterDates::add_row(QFormLayout& form, const QString& caption, QWidget* field, const QString& name)
{
    field->setObjectName(name);
    field->setAccessibleName(QString(caption).remove(u'&'));
    if (auto* box = qobject_cast<QComboBox*>(field))
        box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    auto* label = new QLabel(caption);
    label->setBuddy(field);
    form.addRow(label, field);
}

DateSource FilterDates::source() const
{
    return DateSource(m_source->currentData().toInt());
}

DateSpan FilterDates::span() const
{
    return DateSpan(m_span->currentIndex());
}

void FilterDates::fill_items()
{
    m_item->clear();
    m_item->addItem(u"All kinds"_s, 0);
    if (const auto list = list_of(source()))
        for (const auto& stored : people::read_setup_items(*desk().office.session, *list))
            m_item->addItem(stored.text, stored.key);
    m_form->setRowVisible(m_item, list_of(source()).has_value());
}

void FilterDates::show_span()
{
    m_form->setRowVisible(m_month, span() == DateSpan::month);
    for (const End& end : m_ends)
        m_form->setRowVisible(end.field, span() != DateSpan::month);
}

void FilterDates::add()
{
    DateCriterion added{.source = source(), .item = m_item->currentData().toInt(), .span = span()};
    if (added.item != 0)
        added.text = m_item->currentText();
    if (added.span == DateSpan::month) {
        added.month = m_month->currentIndex() + 1;
    } else {
        for (const End& end : m_ends)
            if (!end.field->finish())
                return;
        const auto lacking = std::ranges::find_if(m_ends, [](const End& end) { return !end.day; });
        if (lacking != m_ends.end()) {
            desk().office.dialogue.show({u"Please enter both dates of the range"_s});
            return lacking->field->setFocus();
        }
        added.from = *m_ends[0].day;
        added.to = *m_ends[1].day;
    }
    filter().dates.push_back(added);
    show_filter();
    m_list->setCurrentRow(m_list->count() - 1);
    Q_EMIT changed();
}

void FilterDates::remove()
{
    const int row = m_list->currentRow();
    if (row < 0)
        return desk().office.dialogue.show({u"Please select an item for removing"_s});
    filter().dates.erase(filter().dates.begin() + row);
    show_filter();
    m_list->setCurrentRow(std::min(row, m_list->count() - 1));
    Q_EMIT changed();
}

void FilterDates::show_filter()
{
    m_list->clear();
    for (const DateCriterion& criterion : filter().dates)
        m_list->addItem(people::words_of(criterion, desk().office.day_order()));
}

void FilterDates::reload()
{
    const int item = m_item->currentData().toInt();
    fill_items();
    m_item->setCurrentIndex(std::max(0, m_item->findData(item)));
    show_filter();
}

void FilterDates::focus_first()
{
    m_source->setFocus(Qt::TabFocusReason);
}

bool FilterDates::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() == QEvent::KeyPress && static_cast<QKeyEvent*>(event)->key() == Qt::Key_Delete) {
        remove();
        return true;
    }
    return FilterPart::eventFilter(target, event);
}

} // namespace kindrel::desktop

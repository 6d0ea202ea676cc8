#include "desktop/people/date_search.h"

#include "desktop/shell/date_field.h"
#include "desktop/shell/look.h"

#include <QComboBox>
#include <QIntValidator>
#include <QLabel>
#include <QLocale>
#include <QStackedWidget>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::DateSearch;

namespace {

constexpr int oldest_age = 150;

QWidget* beside_each_other(QWidget* one, QWidget* other)
{
    auto* pair = new QWidget;
    auto* row = new QHBoxLayout(pair);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(one);
    row->addWidget(new QLabel(u"to"_s));
    row->addWidget(other);
    return pair;
}

QComboBox* make_choice(const QString& name, const QString& caption, const QStringList& texts)
{
    auto* choice = new QComboBox;
    choice->setObjectName(name);
    choice->setAccessibleName(caption);
    choice->addItems(texts);
    return choice;
}

/// The first one stands for none.
QStringList months()
{
    QStringList names{QString()};
    for (int month = 1; month <= 12; ++month)
        names += QLocale::c().monthName(month);
    return names;
}

} // namespace

DateSearchFields::DateSearchFields(Desk& desk)
    : m_office(desk.office),
      m_search(make_choice(u"search"_s, u"Search by date"_s, {u"All dates"_s, u"One month"_s, u"Ages"_s, u"Dates"_s})),
      m_month(make_choice(u"month"_s, u"Month"_s, months())), m_youngest(make_age(u"age_from"_s, u"Youngest age"_s)),
      m_oldest(make_age(u"age_to"_s, u"Oldest age"_s)), m_from(make_date(u"date_from"_s, u"First date"_s, m_first)),
      m_to(make_date(u"date_to"_s, u"Last date"_s, m_last)), m_values(new QStackedWidget)
{
    m_month->setCurrentIndex(m_office.clock.today().month());
    m_values->addWidget(new QWidget);
    m_values->addWidget(m_month);
    m_values->addWidget(beside_each_other(m_youngest, m_oldest));
    m_values->addWidget(beside_each_other(m_from, m_to));
    m_values->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
    for (QComboBox* choice : {m_search, m_month})
        connect(choice, &QComboBox::currentIndexChanged, this, &DateSearchFields::changed);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_search);
    column->addWidget(m_values);
}

QLineEdit* DateSearchFields::make_age(const QString& name, const QString& caption)
{
    auto* age = new QLineEdit;
    age->setObjectName(name);
    age->setAccessibleName(caption);
    age->setValidator(new QIntValidator(0, oldest_age, age));
    connect(age, &QLineEdit::textChanged, this, &DateSearchFields::changed);
    return age;
}

DateField* DateSearchFields::make_date(const QString& name, const QString& caption, std::optional<core::Date>& date)
{
    auto* field = new DateField(m_office);
    field->setObjectName(name);
    field->setAccessibleName(caption);
    connect(field, &DateField::entered, this, [this, &date](std::optional<core::Date> entered) {
        date = entered;
        Q_EMIT changed();
    });
    return field;
}

void DateSearchFields::allow(bool by_date)
{
    m_search->setEnabled(by_date);
    m_values->setCurrentIndex(by_date ? m_search->currentIndex() : 0);
}

void DateSearchFields::take(people::SortOrder& order) const
{
    order.search = DateSearch(m_search->currentIndex());
    if (order.search == DateSearch::month && m_month->currentIndex() > 0)
        order.month = m_month->currentIndex();
    if (order.search == DateSearch::ages && m_youngest->hasAcceptableInput() && m_oldest->hasAcceptableInput())
        order.ages = std::minmax({m_youngest->text().toInt(), m_oldest->text().toInt()});
    if (order.search == DateSearch::dates && m_first && m_last)
        order.dates = std::minmax({*m_first, *m_last});
}

bool DateSearchFields::finish()
{
    const bool by_dates = m_values->currentIndex() == int(DateSearch::dates);
    return !by_dates || (m_from->finish() && m_to->finish());
}

void DateSearchFields::focus_lacking()
{
    switch (DateSearch(m_search->currentIndex())) {
    case DateSearch::month:
        return m_month->setFocus(Qt::OtherFocusReason);
    case DateSearch::ages:
        return (m_youngest->hasAcceptableInput() ? m_oldest : m_youngest)->setFocus(Qt::OtherFocusReason);
    case DateSearch::dates:
        return (m_first ? m_to : m_from)->setFocus(Qt::OtherFocusReason);
    case DateSearch::none:
        break;
    }
}

} // namespace kindrel::desktop

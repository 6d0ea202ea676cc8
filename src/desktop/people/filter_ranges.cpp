#include "desktop/people/filter_ranges.h"

#include "desktop/shell/date_field.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "people/disclosed.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QIntValidator>
#include <QLabel>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int end_width = 64;
constexpr int date_width = 112;

enum GridColumn { caption_column, from_column, word_column, to_column, further_column, spare_column };

} // namespace

FilterRanges::FilterRanges(Desk& desk, people::Filter& filter)
    : FilterPart(desk, filter, u"Surnames, Years, Ages"_s),
      m_own_surname(new QCheckBox(u"The person's o&wn surname"_s)), m_on(new DateField(desk.office))
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::field);
    grid->setVerticalSpacing(space::field);
    m_surnames = add_range(*grid, u"Surna&mes from"_s, u"surname"_s);
    for (QLineEdit* end : {m_surnames.from, m_surnames.to})
        end->setMaxLength(1);
    m_surnames.from->setPlaceholderText(u"A"_s);
    m_surnames.to->setPlaceholderText(u"Z"_s);
    m_own_surname->setObjectName(u"own_surname"_s);
    m_own_surname->setToolTip(u"Otherwise the surname of the family counts"_s);
    connect(m_own_surname, &QCheckBox::clicked, this, &FilterRanges::take_typed);
    grid->addWidget(m_own_surname, 0, further_column);
    m_years = add_numbers(*grid, u"School &years from"_s, u"year"_s, school_years);
    m_years.from->setToolTip(u"\u22122 is kinder, \u22121 the year before school"_s);
    m_ages = add_numbers(*grid, u"A&ges from"_s, u"age"_s, ages);
    m_on->setObjectName(u"age_on"_s);
    m_on->setAccessibleName(u"Ages on"_s);
    m_on->setToolTip(u"The day that ages are counted to; today when it is left empty"_s);
    keep_width(*m_on, date_width);
    connect(m_on, &DateField::entered, this, [this](std::optional<core::Date> day) {
        m_day = day;
        take_typed();
    });
    for (QWidget* field : std::initializer_list<QWidget*>{m_ages.from, m_ages.to, m_on})
        field->setEnabled(people::Disclosure::of(desk.office).birth_dates);
    auto* on = new QHBoxLayout;
    on->addWidget(new QLabel(u"on"_s));
    on->addWidget(m_on);
    on->addStretch(1);
    grid->addLayout(on, 2, further_column);
    grid->setColumnStretch(spare_column, 1);
    grid->setRowStretch(3, 1);
}

FilterRanges::Ends FilterRanges::add_range(QGridLayout& grid, const QString& caption, const QString& name)
{
    const int row = grid.count() == 0 ? 0 : grid.rowCount();
    const Ends ends{new QLineEdit, new QLineEdit};
    auto* label = new QLabel(caption);
    label->setBuddy(ends.from);
    ends.from->setObjectName(name + u"_from"_s);
    ends.to->setObjectName(name + u"_to"_s);
    ends.from->setAccessibleName(QString(caption).remove(u'&'));
    ends.to->setAccessibleName(QString(caption).remove(u'&').replace(u" from"_s, u" to"_s));
    for (QLineEdit* end : {ends.from, ends.to}) {
        keep_width(*end, end_width);
        connect(end, &QLineEdit::textEdited, this, &FilterRanges::take_typed);
    }
    grid.addWidget(label, row, caption_column);
    grid.addWidget(ends.from, row, from_column);
    grid.addWidget(new QLabel(u"to"_s), row, word_column);
    grid.addWidget(ends.to, row, to_column);
    return ends;
}

FilterRanges::Ends FilterRanges::add_numbers(QGridLayout& grid, const QString& caption, const QString& name,
                                             Limits limits)
{
    const Ends ends = add_range(grid, caption, name);
    for (QLineEdit* end : {ends.from, ends.to})
        end->setValidator(new QIntValidator(limits.least, 999, end));
    ends.from->setPlaceholderText(QString::number(limits.least));
    ends.to->setPlaceholderText(QString::number(limits.greatest));
    return ends;
}

std::optional<FilterRanges::Limits> FilterRanges::read(const Ends& ends, Limits limits)
{
    bool from_given = false, to_given = false;
    const int from = ends.from->text().toInt(&from_given);
    const int to = ends.to->text().toInt(&to_given);
    if (!from_given && !to_given)
        return std::nullopt;
    return Limits{from_given ? from : limits.least, to_given ? to : std::max(limits.greatest, from)};
}

void FilterRanges::take_typed()
{
    auto& wanted = filter();
    const QString first = m_surnames.from->text().trimmed(), last = m_surnames.to->text().trimmed();
    wanted.surnames.reset();
    if (!first.isEmpty() || !last.isEmpty())
        wanted.surnames = people::SurnameRange{first, last, m_own_surname->isChecked()};
    wanted.school_years.reset();
    if (const auto years = read(m_years, school_years))
        wanted.school_years = people::SchoolYears{years->least, years->greatest};
    wanted.ages.reset();
    if (const auto range = read(m_ages, ages))
        wanted.ages = people::Ages{range->least, range->greatest, m_day};
    Q_EMIT changed();
}

int FilterRanges::uses() const
{
    return int(filter().surnames.has_value()) + int(filter().school_years.has_value()) + int(filter().ages.has_value());
}

void FilterRanges::show_filter()
{
    const auto number = [](std::optional<int> value) {
        return value ? QString::number(*value) : QString();
    };
    const auto& surnames = filter().surnames;
    const auto& years = filter().school_years;
    const auto& range = filter().ages;
    m_surnames.from->setText(surnames ? surnames->first : QString());
    m_surnames.to->setText(surnames ? surnames->last : QString());
    m_own_surname->setChecked(surnames && surnames->own_surname);
    m_years.from->setText(number(years ? std::optional(years->first) : std::nullopt));
    m_years.to->setText(number(years ? std::optional(years->last) : std::nullopt));
    m_ages.from->setText(number(range ? std::optional(range->youngest) : std::nullopt));
    m_ages.to->setText(number(range ? std::optional(range->oldest) : std::nullopt));
    m_day = range ? range->on : std::nullopt;
    m_on->show_date(m_day);
}

void FilterRanges::focus_first()
{
    m_surnames.from->setFocus(Qt::TabFocusReason);
}

FilterFamilyType::FilterFamilyType(Desk& desk, people::Filter& filter)
    : FilterPart(desk, filter, u"Family Type, Address"_s), m_type(new QComboBox),
      m_suburb_known(new QCheckBox(u"Only families whose residential su&burb is known"_s)),
      m_own_postcode(new QCheckBox(u"Only families with a pos&tcode that differs from their suburb's"_s))
{
    m_type->setObjectName(u"family_type"_s);
    m_type->setAccessibleName(u"Family type"_s);
    for (const auto& row : people::family_types())
        m_type->addItem(row.label.toString());
    m_suburb_known->setObjectName(u"suburb_known"_s);
    m_own_postcode->setObjectName(u"own_postcode"_s);
    connect(m_type, &QComboBox::activated, this, [this](int row) {
        this->filter().family_type = people::FamilyType(row);
        Q_EMIT changed();
    });
    const auto follow_switch = [this](QCheckBox* box, bool people::Filter::*criterion) {
        connect(box, &QCheckBox::clicked, this, [this, criterion](bool on) {
            this->filter().*criterion = on;
            Q_EMIT changed();
        });
    };
    follow_switch(m_suburb_known, &people::Filter::suburb_known);
    follow_switch(m_own_postcode, &people::Filter::own_postcode);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Family type"_s));
    column->addWidget(m_type, 0, Qt::AlignLeft);
    column->addSpacing(space::field);
    column->addWidget(make_heading(u"Residential address"_s));
    column->addWidget(m_suburb_known);
    column->addWidget(m_own_postcode);
    column->addStretch(1);
}

int FilterFamilyType::uses() const
{
    return int(filter().family_type != people::FamilyType::all_people) + int(filter().suburb_known) +
           int(filter().own_postcode);
}

void FilterFamilyType::show_filter()
{
    m_type->setCurrentIndex(int(filter().family_type));
    m_suburb_known->setChecked(filter().suburb_known);
    m_own_postcode->setChecked(filter().own_postcode);
}

void FilterFamilyType::focus_first()
{
    m_type->setFocus(Qt::TabFocusReason);
}

} // namespace kindrel::desktop

#include "desktop/people/filter_dates.h"

#include "desktop/people/filter_date_form.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"
#include "desktop/shell/value_form.h"
#include "people/filter_words.h"

#include <QBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QScrollArea>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::DateCriterion;

namespace {

constexpr int form_width = 256;

} // namespace

FilterDates::FilterDates(Desk& desk, people::Filter& filter)
    : FilterPart(desk, filter, u"Birth and Other Dates"_s), m_list(new QListWidget), m_form(new FilterDateForm(desk))
{
    connect(m_form, &FilterDateForm::add_wanted, this, [this] {
        if (QWidget* lacking = m_form->lacking())
            lacking->setFocus();
        else
            add();
    });
    auto* side = new QVBoxLayout;
    side->setContentsMargins(0, 0, 0, 0);
    side->addWidget(m_form);
    side->addStretch(1);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::group);
    row->addLayout(make_list(), 1);
    row->addWidget(make_side_panel(side, form_width));
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

QWidget* FilterDates::finish()
{
    if (!m_form->typed())
        return nullptr;
    QWidget* lacking = m_form->lacking();
    if (!lacking)
        add();
    return lacking;
}

void FilterDates::hideEvent(QHideEvent* event)
{
    FilterPart::hideEvent(event);
    if (m_form->whole())
        add();
}

void FilterDates::forget_typed()
{
    m_form->forget_typed();
}

void FilterDates::add()
{
    filter().dates.push_back(m_form->take());
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
    m_form->reload();
    show_filter();
}

void FilterDates::focus_first()
{
    m_form->focus_first();
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

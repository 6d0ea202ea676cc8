#include "desktop/people/sort_panel.h"

#include "core/entry.h"
#include "desktop/people/date_search.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "people/setup_lists.h"

#include <QComboBox>
#include <QLabel>
#include <QListWidget>
#include <QSignalBlocker>
#include <QVBoxLayout>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SortBy;
using people::SortOrder;

namespace {

constexpr int by_role = Qt::UserRole;
constexpr int item_role = Qt::UserRole + 1;
/// The orders without a kind of date of their own.
constexpr std::array plain_orders{SortBy::family,     SortBy::individual, SortBy::suburb,       SortBy::postcode,
                                  SortBy::birth_date, SortBy::visitation, SortBy::family_events};

} // namespace

SortPanel::SortPanel(Desk& desk, TaggingSheet& sheet)
    : StepPanel(sheet, u"Sort"_s), m_desk(desk), m_orders(new QListWidget), m_search(new DateSearchFields(desk)),
      m_types(make_types())
{
    setObjectName(u"sort_panel"_s);
    make_orders();
    connect(m_search, &DateSearchFields::changed, this, &SortPanel::take);
    auto* today = new QLabel(u"Based on Today's date being "_s +
                             core::Date::from(desk.office.clock.today()).shown(desk.office.day_order()));
    today->setObjectName(u"based_on"_s);
    dress(*today, TextSize::secondary);

    auto* column = make_step_column(*this, u"Order"_s);
    column->addWidget(m_orders, 1);
    column->addWidget(make_heading(u"Search by date"_s));
    column->addWidget(m_search);
    column->addWidget(make_heading(u"Family type"_s));
    column->addWidget(m_types);
    column->addWidget(today);
    take();
}

void SortPanel::make_orders()
{
    m_orders->setObjectName(u"orders"_s);
    m_orders->setAccessibleName(u"Order"_s);
    for (const auto by : plain_orders)
        add_order(by, 0, people::sort_label(by));
    m_orders->setCurrentRow(0);
    connect(m_orders, &QListWidget::currentRowChanged, this, &SortPanel::take);
}

QComboBox* SortPanel::make_types()
{
    QStringList labels;
    for (const auto& type : people::family_types())
        labels += type.label.toString();
    auto* types = new QComboBox;
    types->setObjectName(u"family_type"_s);
    types->setAccessibleName(u"Family type"_s);
    types->addItems(labels);
    connect(types, &QComboBox::currentIndexChanged, this, &SortPanel::take);
    return types;
}

void SortPanel::add_order(SortBy by, int item, const QString& text)
{
    auto* row = new QListWidgetItem(text, m_orders);
    row->setData(by_role, int(by));
    row->setData(item_role, item);
}

void SortPanel::add_kinds(SortBy by, people::SetupKind kind)
{
    const auto kinds = people::read_setup_items(*m_desk.office.session, kind);
    if (kinds.empty())
        return;
    auto* heading = new QListWidgetItem(people::sort_label(by), m_orders);
    heading->setFlags(Qt::NoItemFlags);
    for (const auto& item : kinds)
        add_order(by, item.key, item.text);
}

void SortPanel::reload()
{
    const QSignalBlocker quiet(m_orders);
    const SortOrder now = sheet().plan.sort;
    while (m_orders->count() > int(plain_orders.size()))
        delete m_orders->takeItem(m_orders->count() - 1);
    add_kinds(SortBy::personal_date, people::SetupKind::personal_dates);
    add_kinds(SortBy::family_date, people::SetupKind::family_dates);
    m_orders->setCurrentRow(0);
    for (int row = 0; row < m_orders->count(); ++row) {
        const auto* order = m_orders->item(row);
        const bool same = order->data(by_role) == int(now.by) && order->data(item_role) == now.item;
        if (same && order->flags() != Qt::NoItemFlags)
            m_orders->setCurrentRow(row);
    }
    take();
}

void SortPanel::take()
{
    SortOrder order;
    if (const auto* row = m_orders->currentItem()) {
        order.by = SortBy(row->data(by_role).toInt());
        order.item = row->data(item_role).toInt();
        order.item_text = order.item > 0 ? row->text() : QString();
    }
    order.type = people::FamilyType(m_types->currentIndex());
    const bool by_date = people::is_by_date(order.by);
    m_search->allow(by_date);
    if (by_date)
        m_search->take(order);
    if (order == sheet().plan.sort)
        return;
    sheet().plan.sort = order;
    Q_EMIT changed();
}

bool SortPanel::is_set() const
{
    return sheet().plan.sort.by != SortBy::family || sheet().plan.sort.type != people::FamilyType::all_people;
}

void SortPanel::focus_first()
{
    m_orders->setFocus(Qt::OtherFocusReason);
}

bool SortPanel::may_sort() const
{
    const auto right = people::right_for(sheet().plan.sort.by);
    return !right || core::permitted(m_desk.office, *right);
}

bool SortPanel::finish()
{
    if (!m_search->finish())
        return false;
    if (!may_sort()) {
        m_orders->setFocus(Qt::OtherFocusReason);
        return false;
    }
    const auto refusal = people::sort_refusal(sheet().plan.sort);
    if (refusal) {
        m_desk.office.dialogue.show(*refusal);
        m_search->focus_lacking();
    }
    return !refusal;
}

} // namespace kindrel::desktop

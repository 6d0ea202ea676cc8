#include "desktop/people/bulk_panel.h"

#include "desktop/shell/date_field.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/search_words.h"
#include "people/setup_lists.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QTimer>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::TagAct;
using people::TagKind;

namespace {

constexpr int key_role = Qt::UserRole;
/// A pause in typing, after which people are counted.
constexpr int typing_pause = 150;

struct KindRow
{
    TagKind kind;
    people::SetupKind list;
    const char* caption;
};

constexpr std::array kind_rows{
    KindRow{TagKind::status, people::SetupKind::status, "Status"},
    KindRow{TagKind::group, people::SetupKind::groups, "Group"},
    KindRow{TagKind::ministry, people::SetupKind::ministries, "Ministry"},
    KindRow{TagKind::date, people::SetupKind::personal_dates, "Date"},
    KindRow{TagKind::flexi, people::SetupKind::flexi_fields, "Flexi"},
};

} // namespace

BulkPanel::BulkPanel(Desk& desk)
    : m_desk(desk), m_kind(new QComboBox), m_filter(new QLineEdit), m_items(new QListWidget), m_details(new QWidget),
      m_state(new QComboBox), m_date(new DateField(desk.office)), m_field(new QLineEdit),
      m_mark(new QCheckBox(u"&Marked for filters and reports"_s)), m_pause(new QTimer(this))
{
    m_pause->setSingleShot(true);
    connect(m_pause, &QTimer::timeout, this, &BulkPanel::count);
    m_kind->setObjectName(u"kind"_s);
    m_kind->setAccessibleName(u"What is given"_s);
    for (const auto& row : kind_rows)
        m_kind->addItem(QString::fromLatin1(row.caption));
    connect(m_kind, &QComboBox::currentIndexChanged, this, &BulkPanel::choose_kind);
    make_items();
    make_details();
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, space::field, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_kind);
    column->addWidget(m_filter);
    column->addWidget(m_items, 1);
    column->addWidget(m_details);
    column->addWidget(make_buttons());
}

void BulkPanel::make_items()
{
    m_filter->setObjectName(u"item_filter"_s);
    m_filter->setAccessibleName(u"Find an item"_s);
    m_filter->setPlaceholderText(u"Type to find"_s);
    m_filter->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_filter->installEventFilter(this);
    m_items->setObjectName(u"items"_s);
    m_items->setAccessibleName(u"Items"_s);
    m_items->setUniformItemSizes(true);
    connect(m_filter, &QLineEdit::textChanged, this, &BulkPanel::show_items);
    connect(m_items, &QListWidget::currentRowChanged, this, &BulkPanel::choose_item);
}

void BulkPanel::make_details()
{
    m_state->setObjectName(u"ministry_state"_s);
    m_state->addItems({u"Active"_s, u"Potential"_s});
    connect(m_state, &QComboBox::currentIndexChanged, this, &BulkPanel::take_details);
    m_date->setObjectName(u"date"_s);
    connect(m_date, &DateField::entered, this, [this](std::optional<core::Date> date) {
        m_item.date = date;
        m_pause->start(0);
    });
    m_field->setObjectName(u"flexi"_s);
    m_field->setMaxLength(people::longest_setup_text);
    connect(m_field, &QLineEdit::textChanged, this, [this] {
        m_item.field = m_field->text().trimmed();
        m_pause->start(typing_pause);
    });
    m_mark->setObjectName(u"mark"_s);
    connect(m_mark, &QCheckBox::toggled, this, &BulkPanel::take_details);
    auto* form = new QFormLayout(m_details);
    form->setContentsMargins(0, 0, 0, 0);
    form->addRow(u"St&ate"_s, m_state);
    form->addRow(u"&Date"_s, m_date);
    form->addRow(u"Te&xt"_s, m_field);
    form->addRow(m_mark);
}

QWidget* BulkPanel::make_buttons()
{
    auto* panel = new QWidget;
    auto* rows = new QGridLayout(panel);
    rows->setContentsMargins(0, 0, 0, 0);
    rows->setSpacing(space::field);
    rows->setColumnStretch(1, 1);
    add_button(*rows, TagAct::give, u"btn_tag_all"_s, u"&Tag all"_s);
    add_button(*rows, TagAct::take, u"btn_untag"_s, u"Unta&g"_s);
    return panel;
}

void BulkPanel::add_button(QGridLayout& rows, TagAct act, const QString& name, const QString& text)
{
    auto* button = new QPushButton(text);
    button->setObjectName(name);
    connect(button, &QPushButton::clicked, this, [this, act] { run(act); });
    auto* count = new QLabel;
    count->setObjectName(act == TagAct::give ? u"count_tag_all"_s : u"count_untag"_s);
    count->setWordWrap(true);
    dress(*count, TextSize::secondary);
    m_buttons[std::size_t(act)] = button;
    m_counts[std::size_t(act)] = count;
    rows.addWidget(button, int(act), 0);
    rows.addWidget(count, int(act), 1);
}

void BulkPanel::reload()
{
    choose_kind(m_kind->currentIndex());
}

void BulkPanel::focus_first()
{
    m_kind->setFocus(Qt::OtherFocusReason);
}

void BulkPanel::set_list(const people::WorkingList& list)
{
    m_list = list;
    m_pause->start(0);
}

void BulkPanel::choose_kind(int row)
{
    const TagKind kind = kind_rows[std::size_t(row)].kind;
    m_known = people::read_setup_items(*m_desk.office.session, kind_rows[std::size_t(row)].list);
    if (kind != m_item.kind) {
        m_item.item = 0;
        m_filter->clear();
    }
    m_item.kind = kind;
    auto* form = static_cast<QFormLayout*>(m_details->layout());
    form->setRowVisible(m_state, kind == TagKind::ministry);
    form->setRowVisible(m_date, kind == TagKind::date);
    form->setRowVisible(m_field, kind == TagKind::flexi);
    form->setRowVisible(m_mark, kind == TagKind::date || kind == TagKind::flexi);
    show_items();
}

void BulkPanel::show_items()
{
    const int chosen = m_item.item;
    const QStringList wanted = people::wanted_words(m_filter->text());
    m_items->clear();
    for (const auto& item : m_known) {
        if (item.not_active || !people::has_all(people::search_words(item.text), wanted))
            continue;
        auto* row = new QListWidgetItem(item.text, m_items);
        row->setData(key_role, item.key);
        if (item.key == chosen)
            m_items->setCurrentItem(row);
    }
    if (!m_items->currentItem() && !wanted.isEmpty())
        m_items->setCurrentRow(0);
    choose_item();
}

void BulkPanel::choose_item()
{
    const auto* row = m_items->currentItem();
    m_item.item = row ? row->data(key_role).toInt() : 0;
    m_item.text = row ? row->text() : QString();
    m_pause->start(0);
}

void BulkPanel::take_details()
{
    m_item.ministry = m_state->currentIndex() == 0 ? people::MinistryState::active : people::MinistryState::potential;
    m_item.tagged = m_mark->isChecked();
    m_pause->start(0);
}

void BulkPanel::count()
{
    for (const TagAct act : {TagAct::give, TagAct::take}) {
        const bool known = m_list && m_item.item > 0;
        m_counts[std::size_t(act)]->setText(known ? people::count_tagging(m_desk.office, *m_list, m_item, act).words()
                                                  : QString());
    }
}

void BulkPanel::run(TagAct act)
{
    if (act == TagAct::give && m_item.kind == TagKind::date && !m_date->finish())
        return;
    std::optional<people::BulkChange> change;
    try {
        change = people::tag(m_desk.office, m_list, m_item, act);
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"The people could not be tagged; nothing was changed."_s, error.text()});
    }
    QWidget* next = m_buttons[std::size_t(act)]; // A line that was typed in would keep Ctrl+Z to itself.
    if (act == TagAct::give && m_item.lacks_date())
        next = m_date;
    if (m_item.item == 0)
        next = m_filter;
    next->setFocus(Qt::OtherFocusReason);
    m_pause->start(0);
    if (change)
        Q_EMIT done(*change);
}

/// Down leads from the words into the items.
bool BulkPanel::eventFilter(QObject* target, QEvent* event)
{
    const bool down = target == m_filter && event->type() == QEvent::KeyPress &&
                      static_cast<QKeyEvent*>(event)->key() == Qt::Key_Down;
    if (down) {
        if (m_items->currentRow() < 0)
            m_items->setCurrentRow(0);
        m_items->setFocus(Qt::TabFocusReason);
    }
    return down || QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop

#include "desktop/people/data_search_tab.h"

#include "core/entry.h"
#include "desktop/people/family_card.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"
#include "people/text_search.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QLocale>
#include <QPushButton>
#include <QSplitter>
#include <QStackedWidget>
#include <QTableView>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array column_shares{22, 20, 42, 16};
constexpr int parts_width = 216;

} // namespace

DataSearchTab::DataSearchTab(Desk& desk)
    : m_desk(desk), m_parts(new QListWidget), m_model(new DataSearchModel(Unlisted::shown, this)),
      m_view(new QTableView), m_empty(new EmptyPanel), m_stack(new QStackedWidget), m_count(new QLabel),
      m_to_tagging(new QPushButton(icon(u"tag"_s), u"To &Tagging"_s))
{
    setObjectName(u"data_search"_s);
    set_up_parts();
    set_up_list();
    auto* splitter = new QSplitter;
    splitter->setObjectName(u"data_search_parts"_s);
    splitter->setChildrenCollapsible(false);
    splitter->setHandleWidth(space::margin);
    splitter->addWidget(m_parts);
    splitter->addWidget(make_list_side());
    splitter->setStretchFactor(1, 1);
    splitter->setSizes({parts_width, 3 * parts_width});
    follow(desk.remembered, *splitter);
    auto* whole = new QVBoxLayout(this);
    whole->setContentsMargins(space::group, space::margin, space::group, space::margin);
    whole->addWidget(splitter);
}

void DataSearchTab::set_up_parts()
{
    m_parts->setObjectName(u"parts"_s);
    m_parts->setAccessibleName(u"Parts of the record"_s);
    m_parts->setUniformItemSizes(true);
    for (const auto& part : people::data_parts())
        m_parts->addItem(QString::fromLatin1(part.name));
    m_parts->setCurrentRow(0);
    m_parts->installEventFilter(this);
    connect(m_parts, &QListWidget::itemClicked, this, &DataSearchTab::list_part);
}

void DataSearchTab::set_up_list()
{
    m_view->setObjectName(u"entries"_s);
    m_view->setAccessibleName(u"Who has an entry"_s);
    m_view->setModel(m_model);
    make_row_list(*m_view);
    m_view->horizontalHeader()->setObjectName(u"entries"_s);
    m_view->horizontalHeader()->setSortIndicator(DataSearchModel::surname, Qt::AscendingOrder);
    follow(m_desk.remembered, *m_view->horizontalHeader(), column_shares);
    m_view->setSortingEnabled(true);
    m_view->installEventFilter(this);
    connect(m_model, &DataSearchModel::layoutChanged, this, [this] { m_view->scrollTo(m_view->currentIndex()); });
    connect(m_view, &QTableView::doubleClicked, this, &DataSearchTab::open);
    m_empty->say(u"Choose a part of the record"_s, u"Enter lists everybody who has an entry in it."_s);
    m_stack->addWidget(m_view);
    m_stack->addWidget(m_empty);
    m_stack->setCurrentWidget(m_empty);
}

QWidget* DataSearchTab::make_list_side()
{
    m_count->setObjectName(u"data_count"_s);
    m_to_tagging->setObjectName(u"to_tagging"_s);
    m_to_tagging->setToolTip(u"Puts those who are listed on the list of Tagging"_s);
    m_to_tagging->setEnabled(false);
    connect(m_to_tagging, &QPushButton::clicked, this, &DataSearchTab::to_tagging);
    auto* foot = new QHBoxLayout;
    foot->addWidget(m_count, 1);
    foot->addWidget(m_to_tagging);
    auto* side = new QWidget;
    auto* column = new QVBoxLayout(side);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_stack, 1);
    column->addLayout(foot);
    return side;
}

void DataSearchTab::entered()
{
    if (m_part && m_change_mark != m_desk.office.session->change_mark())
        list_part();
    m_parts->setFocus(Qt::ShortcutFocusReason);
}

void DataSearchTab::list_part()
{
    const auto& part = people::data_parts()[std::size_t(std::max(0, m_parts->currentRow()))];
    const qint64 mark = m_desk.office.session->change_mark();
    auto entries = people::people_with(m_desk.office, part);
    m_part = entries ? &part : nullptr;
    m_change_mark = mark;
    show_entries(entries ? std::move(*entries) : std::vector<people::DataEntry>());
}

void DataSearchTab::show_entries(std::vector<people::DataEntry> entries)
{
    m_model->set_entries(std::move(entries));
    const bool none = m_model->rowCount() == 0;
    if (m_part && none)
        m_empty->say(u"Nobody has an entry in %1"_s.arg(QString::fromLatin1(m_part->name)), {});
    else if (none)
        m_empty->say(u"Choose a part of the record"_s, u"Enter lists everybody who has an entry in it."_s);
    else
        m_view->setCurrentIndex(m_model->index(0, 0));
    m_stack->setCurrentIndex(none ? 1 : 0);
    m_to_tagging->setEnabled(!none && core::may_enter(m_desk.office, core::AreaId::tagging));
    m_count->setText(m_part ? u"%1 with an entry in %2"_s.arg(count_words(), QString::fromLatin1(m_part->name))
                            : QString());
    Q_EMIT counted();
}

QString DataSearchTab::count_words() const
{
    if (!m_part)
        return {};
    const int count = m_model->rowCount();
    const bool of_families = m_part->owner == people::DataOwner::family;
    if (count == 1)
        return of_families ? u"1 family"_s : u"1 person"_s;
    return (of_families ? u"%1 families"_s : u"%1 people"_s).arg(QLocale().toString(count));
}

std::vector<int> DataSearchTab::families(int& place) const
{
    const int row = m_view->currentIndex().row();
    if (!people::can_open(m_desk.office, std::size_t(m_model->rowCount())) || row < 0)
        return {};
    people::WorkingList listed;
    for (const auto& entry : m_model->entries())
        listed.members.push_back(entry.member);
    const auto keys = listed.families();
    place = int(std::ranges::find(keys, m_model->entry(row).member.surname_id) - keys.begin());
    return keys;
}

void DataSearchTab::open()
{
    int place = 0;
    const auto keys = families(place);
    if (!keys.empty())
        m_desk.navigation.open_family(keys[std::size_t(place)], keys, people::heading_of(*m_part));
}

void DataSearchTab::look()
{
    int place = 0;
    const auto keys = families(place);
    if (!keys.empty())
        open_family_card(m_desk, keys, place);
}

void DataSearchTab::to_tagging()
{
    auto listed = people::living_with(*m_desk.office.session, *m_part, m_model->entries());
    if (listed.members.empty())
        return m_desk.office.dialogue.show({u"Nobody who is listed can be put on the list"_s});
    m_desk.navigation.to_tagging(std::move(listed));
}

void DataSearchTab::lend_list(const std::function<void(const QString& title, const QAbstractItemModel&)>& use) const
{
    DataSearchModel paper(Unlisted::withheld);
    paper.set_entries(m_model->entries());
    use(m_part ? people::heading_of(*m_part) : u"Data Search"_s, paper);
}

bool DataSearchTab::key_pressed(const QObject* target, int key)
{
    const bool enter = key == Qt::Key_Return || key == Qt::Key_Enter;
    if (target == m_parts && enter)
        list_part();
    else if (target == m_view && enter)
        open();
    else if (target == m_view && key == Qt::Key_Space)
        look();
    else
        return false;
    return true;
}

bool DataSearchTab::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() == QEvent::KeyPress && key_pressed(target, static_cast<const QKeyEvent*>(event)->key()))
        return true;
    return SearchTab::eventFilter(target, event);
}

} // namespace kindrel::desktop

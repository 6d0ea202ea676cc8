#include "desktop/people/family_search_tab.h"

#include "desktop/people/family_card.h"
#include "desktop/people/family_list.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/setup_lists.h"

#include <QCheckBox>
#include <QComboBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>
#include <QTableView>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SearchFields;

namespace {

constexpr auto list_key = "search_list";
constexpr auto names_key = "search_names_only";

} // namespace

FamilySearchTab::FamilySearchTab(Desk& desk)
    : m_desk(desk), m_search(desk.office), m_text(new QLineEdit), m_names_only(new QCheckBox(u"&Names only"_s)),
      m_button(new QPushButton(icon(u"edit-find"_s), people::search_caption(false))), m_groups(new QComboBox),
      m_families(new FamilyListWidget(desk)), m_count(new QLabel), m_found(new QLabel)
{
    set_up_list();
    m_count->setObjectName(u"count"_s);
    m_found->setObjectName(u"found_in"_s);
    dress(*m_found, TextSize::secondary);
    auto* foot = new QHBoxLayout;
    foot->addWidget(m_count);
    foot->addStretch(1);
    foot->addWidget(m_found);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::margin, space::group, space::margin);
    column->setSpacing(space::field);
    column->addWidget(make_question());
    column->addWidget(m_families, 1);
    column->addLayout(foot);
}

QWidget* FamilySearchTab::make_question()
{
    m_text->setObjectName(u"search_text"_s);
    m_text->setPlaceholderText(u"Any part of a name, phone, e-mail, street, state or country"_s);
    m_text->setClearButtonEnabled(true);
    m_text->installEventFilter(this);
    m_names_only->setObjectName(u"names_only"_s);
    m_names_only->setToolTip(u"Looks at names alone, preferred names among them"_s);
    m_names_only->setChecked(m_desk.remembered.value(QLatin1String(names_key), false).toBool());
    m_button->setObjectName(u"search"_s);
    auto* caption = new QLabel(u"&Text"_s);
    caption->setBuddy(m_text);
    connect(m_text, &QLineEdit::textChanged, this, &FamilySearchTab::start_anew);
    connect(m_text, &QLineEdit::returnPressed, this, &FamilySearchTab::search);
    connect(m_button, &QPushButton::clicked, this, &FamilySearchTab::search);
    connect(m_names_only, &QCheckBox::toggled, this, [this](bool names_only) {
        m_desk.remembered.keep(QLatin1String(names_key), names_only);
        start_anew();
    });
    auto* question = new QWidget;
    auto* row = new QHBoxLayout(question);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(caption);
    row->addWidget(m_text, 1);
    row->addWidget(m_names_only);
    row->addWidget(m_button);
    return question;
}

void FamilySearchTab::set_up_list()
{
    m_groups->setObjectName(u"family_group"_s);
    m_groups->setAccessibleName(u"Which family group"_s);
    m_groups->setSizeAdjustPolicy(QComboBox::AdjustToContents);
    m_families->replace_filter(m_groups);
    connect(m_families, &FamilyListWidget::opened, this, &FamilySearchTab::open);
    connect(m_families, &FamilyListWidget::looked_at, this, &FamilySearchTab::look);
    connect(m_families, &FamilyListWidget::shown_changed, this, [this] {
        start_anew();
        show_count();
    });
    connect(m_groups, &QComboBox::currentIndexChanged, this,
            [this] { m_families->narrow_to_group(m_groups->currentData().toInt()); });
}

void FamilySearchTab::read_groups()
{
    const QSignalBlocker quiet(m_groups);
    const QVariant chosen = m_groups->currentData();
    m_groups->clear();
    m_groups->addItem(u"Every family group"_s, 0);
    for (const auto& group : people::read_setup_items(*m_desk.office.session, people::SetupKind::family_groups))
        m_groups->addItem(group.text, group.key);
    m_groups->setCurrentIndex(std::max(0, m_groups->findData(chosen)));
}

void FamilySearchTab::entered()
{
    const qint64 mark = m_desk.office.session->change_mark();
    if (m_change_mark != mark) {
        read_groups();
        if (m_change_mark)
            m_families->narrow_to_group(m_groups->currentData().toInt());
        else
            m_families->choose(people::FamilyList(
                m_desk.remembered.value(QLatin1String(list_key), int(people::FamilyList::active)).toInt()));
        m_change_mark = mark;
    }
    m_text->setFocus(Qt::ShortcutFocusReason);
    m_text->selectAll();
}

void FamilySearchTab::start_anew()
{
    m_search.start_anew();
    m_button->setText(people::search_caption(false));
    m_found->clear();
}

void FamilySearchTab::search()
{
    const auto fields = m_names_only->isChecked() ? SearchFields::names : SearchFields::all;
    const auto match = m_search.next(m_text->text(), fields, m_families->model().surname_ids());
    m_button->setText(people::search_caption(m_search.under_way()));
    m_found->setText(match ? people::found_words(*match) : QString());
    if (match) {
        m_families->choose_family(match->surname_id);
        return;
    }
    m_text->setFocus();
    m_text->selectAll();
}

void FamilySearchTab::open()
{
    const FamilyListModel& listed = m_families->model();
    if (people::can_open(m_desk.office, std::size_t(listed.rowCount())) && m_families->chosen_row() >= 0)
        m_desk.navigation.open_family(listed.entry(m_families->chosen_row()).Surname_ID, listed.surname_ids(),
                                      people::family_list_name(m_families->list()));
}

void FamilySearchTab::look()
{
    const FamilyListModel& listed = m_families->model();
    if (people::can_open(m_desk.office, std::size_t(listed.rowCount())) && m_families->chosen_row() >= 0)
        open_family_card(m_desk, listed.surname_ids(), m_families->chosen_row());
}

void FamilySearchTab::lend_list(const std::function<void(const QString& title, const QAbstractItemModel&)>& use) const
{
    QString title = people::family_list_name(m_families->list());
    if (m_groups->currentIndex() > 0)
        title += u", "_s + m_groups->currentText();
    use(title, m_families->model());
}

QString FamilySearchTab::count_words() const
{
    return m_families->count_words();
}

void FamilySearchTab::show_count()
{
    m_desk.remembered.keep(QLatin1String(list_key), int(m_families->list()));
    m_count->setText(u"Total Amount of Families Found = %1"_s.arg(m_families->model().rowCount()));
    Q_EMIT counted();
}

bool FamilySearchTab::eventFilter(QObject* target, QEvent* event)
{
    if (target == m_text && event->type() == QEvent::KeyPress &&
        static_cast<const QKeyEvent*>(event)->key() == Qt::Key_Down) {
        m_families->view().setFocus(Qt::TabFocusReason);
        return true;
    }
    return SearchTab::eventFilter(target, event);
}

} // namespace kindrel::desktop

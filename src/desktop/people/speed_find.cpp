#include "desktop/people/speed_find.h"

#include "core/entry.h"
#include "desktop/people/family_card.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"

#include <QFrame>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QPushButton>
#include <QShortcut>
#include <QStackedWidget>
#include <QTableView>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize window_size{760, 384};
constexpr int below_top = 72;
constexpr int most_shown = 100;
constexpr std::array column_shares{19, 33, 16, 17, 15};

bool is_enter(int key)
{
    return key == Qt::Key_Return || key == Qt::Key_Enter;
}

/// What was typed as it stands in a file: small letters alone begin with a capital. Empty where a number was typed.
QString surname_of(const QString& typed)
{
    QString name = typed.simplified();
    if (std::ranges::any_of(name, [](QChar letter) { return letter.isDigit(); }))
        return {};
    if (!name.isEmpty() && name == name.toLower())
        name[0] = name[0].toUpper();
    return name;
}

} // namespace

SpeedFindWindow::SpeedFindWindow(Desk& desk, QWidget& over)
    : QDialog(&over, Qt::Dialog | Qt::FramelessWindowHint), m_desk(desk), m_families(desk.office),
      m_model(new SpeedFindModel(this)), m_words(new QLineEdit), m_view(new QTableView), m_empty(new EmptyPanel),
      m_stack(new QStackedWidget), m_count(new QLabel),
      m_add(new QPushButton(icon(u"list-add"_s), u"&Add a new family"_s))
{
    setObjectName(u"find"_s);
    setWindowTitle(u"Find a family"_s);
    set_up_words();
    set_up_list();
    m_add->setObjectName(u"add_family"_s);
    connect(m_add, &QPushButton::clicked, this, &SpeedFindWindow::add_family);
    dress(*m_count, TextSize::secondary);
    m_count->setObjectName(u"hits"_s);
    auto* foot = new QHBoxLayout;
    foot->addWidget(m_count, 1);
    foot->addWidget(m_add);
    auto* frame = new QFrame;
    frame->setFrameShape(QFrame::StyledPanel);
    auto* column = new QVBoxLayout(frame);
    column->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    column->setSpacing(space::field);
    column->addWidget(m_words);
    column->addWidget(m_stack, 1);
    column->addLayout(foot);
    auto* whole = new QVBoxLayout(this);
    whole->setContentsMargins(0, 0, 0, 0);
    whole->addWidget(frame);
    auto* again = new QShortcut(Qt::CTRL | Qt::Key_K, this);
    connect(again, &QShortcut::activated, this, &SpeedFindWindow::ask);
}

void SpeedFindWindow::set_up_words()
{
    m_words->setObjectName(u"words"_s);
    m_words->setAccessibleName(u"Find a family"_s);
    m_words->setPlaceholderText(u"Names, suburb or phone, in any order"_s);
    m_words->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_words->installEventFilter(this);
    connect(m_words, &QLineEdit::textChanged, this, &SpeedFindWindow::find);
}

void SpeedFindWindow::set_up_list()
{
    m_view->setObjectName(u"hit_list"_s);
    m_view->setAccessibleName(u"Families found"_s);
    m_view->setModel(m_model);
    make_row_list(*m_view);
    m_view->horizontalHeader()->hide();
    m_view->horizontalHeader()->setObjectName(u"speed_find"_s);
    follow(m_desk.remembered, *m_view->horizontalHeader(), column_shares);
    m_view->installEventFilter(this);
    connect(m_view, &QTableView::clicked, this, &SpeedFindWindow::open_chosen);
    m_stack->addWidget(m_view);
    m_stack->addWidget(m_empty);
}

void SpeedFindWindow::ask()
{
    if (!m_families.renew()) {
        hide();
        return;
    }
    const QWidget& over = *parentWidget();
    const QSize size = window_size.boundedTo(over.size());
    setGeometry(QRect(over.mapToGlobal(QPoint((over.width() - size.width()) / 2, below_top)), size));
    m_words->clear();
    find();
    show();
    bring_forward(*this);
    m_words->setFocus(Qt::ShortcutFocusReason);
}

void SpeedFindWindow::reject()
{
    QDialog::reject();
    bring_forward(*parentWidget());
}

void SpeedFindWindow::find()
{
    m_model->set_hits(m_families.find(m_words->text(), most_shown));
    if (m_model->rowCount() > 0)
        m_view->setCurrentIndex(m_model->index(0, 0));
    show_outcome();
}

void SpeedFindWindow::show_outcome()
{
    const QString typed = m_words->text().trimmed();
    const int shown = m_model->rowCount();
    const int total = m_model->hits().total;
    const bool none = shown == 0;
    if (typed.isEmpty())
        m_empty->say(u"Whom are you looking for?"_s,
                     u"Begin any of their names, their suburb or their phone number."_s);
    else if (none)
        m_empty->say(u"No family answers to \u201c%1\u201d"_s.arg(typed), u"Shorten the words, or add a new family."_s);
    const QLocale locale;
    if (none)
        m_count->clear();
    else if (shown < total)
        m_count->setText(u"The first %1 of %2 families"_s.arg(shown).arg(locale.toString(total)));
    else
        m_count->setText(total == 1 ? u"1 family"_s : u"%1 families"_s.arg(total));
    m_add->setVisible(none && !typed.isEmpty() && m_desk.office.may(core::Area::add_family));
    m_stack->setCurrentIndex(none ? 1 : 0);
}

void SpeedFindWindow::open_chosen()
{
    const int row = m_view->currentIndex().row();
    if (row < 0)
        return;
    const auto keys = m_model->hits().surname_ids();
    hide();
    if (core::may_enter(m_desk.office, core::AreaId::family_editor))
        m_desk.navigation.open_family(keys[std::size_t(row)], keys, u"Families Found"_s);
    else
        open_family_card(m_desk, keys, row);
}

void SpeedFindWindow::add_family()
{
    hide();
    Q_EMIT family_wanted(surname_of(m_words->text()));
}

bool SpeedFindWindow::key_in_words(int key)
{
    if (is_enter(key)) {
        // A slip of the keys must not open a new family: that takes one more Enter.
        if (m_model->rowCount() > 0)
            open_chosen();
        else if (m_add->isVisible())
            m_add->setFocus(Qt::TabFocusReason);
        return true;
    }
    if (key != Qt::Key_Down && key != Qt::Key_PageDown)
        return false;
    // The first family stands chosen already: Down goes to it, not past it.
    if (m_model->rowCount() > 0)
        m_view->setFocus(Qt::TabFocusReason);
    else if (m_add->isVisible())
        m_add->setFocus(Qt::TabFocusReason);
    return true;
}

bool SpeedFindWindow::key_in_list(const QKeyEvent& key)
{
    if (is_enter(key.key())) {
        open_chosen();
        return true;
    }
    const bool back = key.key() == Qt::Key_Up && m_view->currentIndex().row() <= 0;
    const bool erased = key.key() == Qt::Key_Backspace;
    const bool typed = !key.text().isEmpty() && key.text()[0].isPrint();
    if (!back && !erased && !typed)
        return false;
    m_words->setFocus();
    if (erased)
        m_words->backspace();
    else if (typed)
        m_words->insert(key.text());
    return true;
}

bool SpeedFindWindow::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QDialog::eventFilter(target, event);
    const auto& key = static_cast<const QKeyEvent&>(*event);
    const bool used = target == m_words ? key_in_words(key.key()) : target == m_view && key_in_list(key);
    return used || QDialog::eventFilter(target, event);
}

void SpeedFindWindow::changeEvent(QEvent* event)
{
    QDialog::changeEvent(event);
    if (event->type() == QEvent::ActivationChange && !isActiveWindow())
        hide();
}

} // namespace kindrel::desktop

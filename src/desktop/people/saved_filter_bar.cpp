#include "desktop/people/saved_filter_bar.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QAction>
#include <QComboBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SavedFilter;

namespace {

constexpr int not_saved_row = 0;

}

SavedFilterBar::SavedFilterBar(Desk& desk, const people::Filter& filter)
    : m_desk(desk), m_filter(filter), m_not_saved(filter), m_names(new QComboBox), m_name(new QLineEdit)
{
    m_names->setObjectName(u"saved_filters"_s);
    m_names->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_names->addItem({});
    show_first_row();
    connect(m_names, &QComboBox::activated, this, &SavedFilterBar::recall);
    auto* label = new QLabel(u"Saved filte&r"_s);
    label->setBuddy(m_names);
    m_names->setAccessibleName(u"Saved filter"_s);
    set_up_name();
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(label);
    row->addWidget(m_names, 1);
    row->addWidget(m_name, 1);
    add_button(u"save_filter"_s, u"Save"_s, u"document-save"_s, u"Keep this filter in the place of the saved one"_s,
               &SavedFilterBar::save);
    add_button(u"save_filter_as"_s, u"Save as"_s, u"document-save-as"_s, u"Keep this filter under a name"_s,
               &SavedFilterBar::save_as);
    add_button(u"rename_filter"_s, u"Rename"_s, u"edit-rename"_s, u"Give the chosen saved filter another name"_s,
               &SavedFilterBar::rename);
    add_button(u"remove_filter"_s, u"Remove"_s, u"edit-delete"_s, u"Remove the chosen saved filter"_s,
               &SavedFilterBar::remove);
    add_button(u"clear_filter"_s, u"&Clear"_s, u"edit-undo"_s, u"Start again with the active families alone"_s,
               &SavedFilterBar::clear);
}

void SavedFilterBar::add_button(const QString& name, const QString& text, const QString& icon_name, const QString& tip,
                                void (SavedFilterBar::*run)())
{
    auto* button = new QPushButton(icon(icon_name), text);
    button->setObjectName(name);
    button->setToolTip(tip);
    connect(button, &QPushButton::clicked, this, run);
    layout()->addWidget(button);
}

void SavedFilterBar::set_up_name()
{
    m_name->setObjectName(u"filter_name"_s);
    m_name->setToolTip(u"Enter takes the name, Escape leaves everything as it is"_s);
    m_name->installEventFilter(this);
    m_name->hide();
    connect(m_name, &QLineEdit::returnPressed, this, &SavedFilterBar::take_name);
    auto* take = m_name->addAction(icon(u"dialog-ok-apply"_s), QLineEdit::TrailingPosition);
    take->setToolTip(u"Take the name (Enter)"_s);
    connect(take, &QAction::triggered, this, &SavedFilterBar::take_name);
}

void SavedFilterBar::reload()
{
    const int row = m_names->currentIndex();
    const int before = row == not_saved_row ? 0 : m_saved[std::size_t(row - 1)].filter_id;
    m_saved = people::saved_filters(*m_desk.office.session);
    while (m_names->count() > 1)
        m_names->removeItem(m_names->count() - 1);
    for (const SavedFilter& saved : m_saved)
        m_names->addItem(saved.name);
    choose(before);
    show_first_row();
}

void SavedFilterBar::choose(int filter_id)
{
    const auto found = std::ranges::find(m_saved, filter_id, &SavedFilter::filter_id);
    m_names->setCurrentIndex(found == m_saved.end() ? not_saved_row : int(found - m_saved.begin()) + 1);
}

void SavedFilterBar::choose_kept(int filter_id)
{
    m_changed_from = 0;
    reload();
    choose(filter_id);
}

void SavedFilterBar::show_first_row()
{
    const auto from = std::ranges::find(m_saved, m_changed_from, &SavedFilter::filter_id);
    m_names->setItemText(not_saved_row, from == m_saved.end() ? u"(not saved)"_s : u"%1, changed"_s.arg(from->name));
}

void SavedFilterBar::show_changed()
{
    if (m_names->currentIndex() != not_saved_row)
        m_changed_from = base()->filter_id;
    m_not_saved = m_filter;
    m_names->setCurrentIndex(not_saved_row);
    show_first_row();
}

const SavedFilter* SavedFilterBar::base() const
{
    const int row = m_names->currentIndex();
    if (row != not_saved_row)
        return &m_saved[std::size_t(row - 1)];
    const auto from = std::ranges::find(m_saved, m_changed_from, &SavedFilter::filter_id);
    return from == m_saved.end() ? nullptr : &*from;
}

const SavedFilter* SavedFilterBar::chosen() const
{
    const SavedFilter* saved = base();
    if (!saved)
        m_desk.office.dialogue.show({u"Please choose a saved filter first"_s});
    return saved;
}

void SavedFilterBar::recall(int row)
{
    if (row == not_saved_row) {
        Q_EMIT recalled(m_not_saved);
        return;
    }
    const auto stored = people::load_filter(m_desk.office, m_saved[std::size_t(row - 1)].filter_id);
    if (!stored) {
        m_names->setCurrentIndex(not_saved_row);
        return reload();
    }
    Q_EMIT recalled(*stored);
}

void SavedFilterBar::clear()
{
    m_changed_from = 0;
    m_names->setCurrentIndex(not_saved_row);
    Q_EMIT clear_wanted();
}

void SavedFilterBar::save()
{
    const SavedFilter* saved = base();
    if (!saved)
        return save_as();
    const int key = saved->filter_id;
    if (people::replace_filter(m_desk.office, key, m_filter))
        choose_kept(key);
    else
        reload();
}

void SavedFilterBar::save_as()
{
    const SavedFilter* saved = base();
    ask_name(u"Please enter a name for this filter"_s, saved ? saved->name : QString(), [this](const QString& name) {
        const auto key = people::save_filter(m_desk.office, name, m_filter);
        if (key)
            choose_kept(*key);
        return key.has_value();
    });
}

void SavedFilterBar::rename()
{
    const SavedFilter* saved = chosen();
    if (!saved)
        return;
    ask_name(u"Please enter another name for this filter"_s, saved->name,
             [this, key = saved->filter_id](const QString& name) {
                 const bool renamed = people::rename_filter(m_desk.office, key, name);
                 if (renamed)
                     reload();
                 return renamed;
             });
}

void SavedFilterBar::remove()
{
    const SavedFilter* saved = chosen();
    if (!saved || !people::remove_filter(m_desk.office, *saved))
        return;
    m_not_saved = m_filter; // It stands as it is, under no name.
    m_changed_from = 0;
    m_names->setCurrentIndex(not_saved_row);
    reload();
}

void SavedFilterBar::ask_name(const QString& question, const QString& suggested,
                              std::function<bool(const QString&)> use)
{
    m_use_name = std::move(use);
    m_name->setPlaceholderText(question);
    m_name->setAccessibleName(question);
    m_name->setText(suggested);
    m_names->hide();
    m_name->show();
    m_name->setFocus(Qt::OtherFocusReason);
    m_name->selectAll();
}

void SavedFilterBar::take_name()
{
    if (m_use_name(m_name->text()))
        return end_naming();
    m_name->setFocus(Qt::OtherFocusReason);
    m_name->selectAll();
}

void SavedFilterBar::end_naming()
{
    m_name->hide();
    m_names->show();
    m_names->setFocus(Qt::OtherFocusReason);
}

bool SavedFilterBar::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() == QEvent::KeyPress && static_cast<const QKeyEvent*>(event)->key() == Qt::Key_Escape) {
        end_naming();
        return true;
    }
    return QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop

#include "desktop/people/saved_filter_bar.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SavedFilter;

namespace {

constexpr int not_saved_row = 0;

}

SavedFilterBar::SavedFilterBar(Desk& desk, const people::Filter& filter)
    : m_desk(desk), m_filter(filter), m_not_saved(filter), m_names(new QComboBox)
{
    m_names->setObjectName(u"saved_filters"_s);
    m_names->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_names->addItem(u"(not saved)"_s);
    connect(m_names, &QComboBox::activated, this, &SavedFilterBar::recall);
    auto* label = new QLabel(u"Saved filte&r"_s);
    label->setBuddy(m_names);
    m_names->setAccessibleName(u"Saved filter"_s);
    auto* clear = make_button(u"clear_filter"_s, u"&Clear"_s, u"edit-undo"_s,
                              u"Start again with the active families alone"_s, &SavedFilterBar::clear_wanted);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(label);
    row->addWidget(m_names, 1);
    row->addWidget(make_button(u"save_filter"_s, u"Save as"_s, u"document-save"_s, u"Keep this filter under a name"_s,
                               &SavedFilterBar::save));
    row->addWidget(make_button(u"rename_filter"_s, u"Rename"_s, u"edit-rename"_s,
                               u"Give the chosen saved filter another name"_s, &SavedFilterBar::rename));
    row->addWidget(make_button(u"remove_filter"_s, u"Remove"_s, u"edit-delete"_s, u"Remove the chosen saved filter"_s,
                               &SavedFilterBar::remove));
    row->addWidget(clear);
}

QPushButton* SavedFilterBar::make_button(const QString& name, const QString& text, const QString& icon_name,
                                         const QString& tip, void (SavedFilterBar::*run)())
{
    auto* button = new QPushButton(icon(icon_name), text);
    button->setObjectName(name);
    button->setToolTip(tip);
    connect(button, &QPushButton::clicked, this, run);
    return button;
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
}

void SavedFilterBar::choose(int filter_id)
{
    const auto found = std::ranges::find(m_saved, filter_id, &SavedFilter::filter_id);
    m_names->setCurrentIndex(found == m_saved.end() ? not_saved_row : int(found - m_saved.begin()) + 1);
    if (found != m_saved.end())
        m_last_name = found->name;
}

void SavedFilterBar::show_changed()
{
    m_not_saved = m_filter;
    m_names->setCurrentIndex(not_saved_row);
}

const SavedFilter* SavedFilterBar::chosen() const
{
    const int row = m_names->currentIndex();
    if (row > not_saved_row)
        return &m_saved[std::size_t(row - 1)];
    m_desk.office.dialogue.show({u"Please choose a saved filter first"_s});
    return nullptr;
}

void SavedFilterBar::recall(int row)
{
    if (row == not_saved_row) {
        Q_EMIT recalled(m_not_saved);
        return;
    }
    const SavedFilter saved = m_saved[std::size_t(row - 1)];
    const auto stored = people::load_filter(m_desk.office, saved.filter_id);
    if (!stored) {
        m_names->setCurrentIndex(not_saved_row);
        return reload();
    }
    m_last_name = saved.name;
    Q_EMIT recalled(*stored);
}

void SavedFilterBar::save()
{
    const QString hint = m_last_name.isEmpty() ? QString() : u"The last one was \u201c%1\u201d."_s.arg(m_last_name);
    const auto name = m_desk.office.dialogue.ask_text(
        {.text = u"Please enter a name for this filter"_s, .more = hint, .icon = core::Icon::question});
    if (!name)
        return;
    if (const auto key = people::save_filter(m_desk.office, *name, m_filter)) {
        reload();
        choose(*key);
    }
}

void SavedFilterBar::rename()
{
    const SavedFilter* saved = chosen();
    if (!saved)
        return;
    const auto name = m_desk.office.dialogue.ask_text(
        {.text = u"Please enter another name for this filter"_s, .more = saved->name, .icon = core::Icon::question});
    if (name && people::rename_filter(m_desk.office, saved->filter_id, *name))
        reload();
}

void SavedFilterBar::remove()
{
    const SavedFilter* saved = chosen();
    if (!saved || !people::remove_filter(m_desk.office, *saved))
        return;
    m_not_saved = m_filter; // It stands as it is, under no name.
    m_last_name.clear();
    reload();
}

} // namespace kindrel::desktop

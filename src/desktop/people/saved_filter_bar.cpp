#include "desktop/people/saved_filter_bar.h"

#include "desktop/people/filter_name_line.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/setup_lists.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

#include <algorithm>
#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SavedFilter;

namespace {

constexpr int not_saved_row = 0;

}

SavedFilterBar::SavedFilterBar(Desk& desk, const people::Filter& filter, std::function<bool()> finish_typing)
    : m_desk(desk), m_filter(filter), m_finish_typing(std::move(finish_typing)), m_not_saved(filter),
      m_names(new QComboBox), m_name(new FilterNameLine(*m_names))
{
    m_names->setObjectName(u"saved_filters"_s);
    m_names->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_names->addItem({});
    show_row();
    connect(m_names, &QComboBox::activated, this, &SavedFilterBar::recall);
    auto* label = new QLabel(u"Saved filte&r"_s);
    label->setBuddy(m_names);
    m_names->setAccessibleName(u"Saved filter"_s);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(label);
    row->addWidget(m_names, 1);
    row->addWidget(m_name, 1);
    add_button({u"save_filter"_s, u"Save"_s, u"document-save"_s, u"Keep this filter in the place of the saved one"_s},
               Typed::taken, &SavedFilterBar::save);
    add_button({u"save_filter_as"_s, u"Save as"_s, u"document-save-as"_s, u"Keep this filter under a name"_s},
               Typed::taken, &SavedFilterBar::save_as);
    add_button({u"rename_filter"_s, u"Rename"_s, u"edit-rename"_s, u"Give the chosen saved filter another name"_s},
               Typed::dropped, &SavedFilterBar::rename);
    add_button({u"remove_filter"_s, u"Remove"_s, u"edit-delete"_s, u"Remove the chosen saved filter"_s}, Typed::dropped,
               &SavedFilterBar::remove);
    add_button({u"clear_filter"_s, u"&Clear"_s, u"edit-undo"_s, u"Start again with the active families alone"_s},
               Typed::dropped, &SavedFilterBar::clear);
}

void SavedFilterBar::add_button(const Button& looks, Typed typed, void (SavedFilterBar::*run)())
{
    auto* button = new QPushButton(icon(looks.icon), looks.text);
    button->setObjectName(looks.name);
    button->setToolTip(looks.tip);
    connect(button, &QPushButton::clicked, this, [this, typed, run] {
        if (m_name->asks() && typed == Typed::taken)
            return m_name->take();
        m_name->end();
        (this->*run)();
    });
    layout()->addWidget(button);
}

void SavedFilterBar::reload()
{
    m_name->end();
    m_saved = people::saved_filters(*m_desk.office.session);
    while (m_names->count() > 1)
        m_names->removeItem(m_names->count() - 1);
    for (const SavedFilter& saved : m_saved)
        m_names->addItem(saved.name);
    if (m_on_screen.filter_id != 0 && !stored(m_on_screen))
        detach();
    if (!stored(m_changed_from))
        m_changed_from = {};
    show_row();
}

const SavedFilter* SavedFilterBar::stored(const SavedFilter& saved) const
{
    const auto found = std::ranges::find(m_saved, saved);
    return found == m_saved.end() ? nullptr : &*found;
}

void SavedFilterBar::show_row()
{
    const SavedFilter* from = stored(m_changed_from);
    const SavedFilter* shown = stored(m_on_screen);
    m_names->setItemText(not_saved_row, from ? u"%1, changed"_s.arg(from->name) : u"(not saved)"_s);
    m_names->setCurrentIndex(shown ? int(shown - m_saved.data()) + 1 : not_saved_row);
}

void SavedFilterBar::choose_kept(const SavedFilter& saved)
{
    m_changed_from = {};
    m_on_screen = saved;
    reload();
}

void SavedFilterBar::detach()
{
    m_not_saved = m_filter;
    m_changed_from = {};
    m_on_screen = {};
}

void SavedFilterBar::show_changed()
{
    if (m_on_screen.filter_id != 0)
        m_changed_from = std::exchange(m_on_screen, {});
    m_not_saved = m_filter;
    show_row();
}

const SavedFilter* SavedFilterBar::base() const
{
    return stored(m_on_screen.filter_id != 0 ? m_on_screen : m_changed_from);
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
    const SavedFilter wanted = row == not_saved_row ? SavedFilter() : m_saved[std::size_t(row - 1)];
    show_row(); // Until the wanted one is there.
    const auto filter =
        row == not_saved_row ? std::optional(m_not_saved) : people::load_filter(m_desk.office, wanted.filter_id);
    if (!filter)
        return reload();
    m_on_screen = wanted;
    show_row();
    Q_EMIT recalled(*filter);
}

void SavedFilterBar::clear()
{
    m_changed_from = {};
    m_on_screen = {};
    show_row();
    Q_EMIT clear_wanted();
}

void SavedFilterBar::save()
{
    if (!base())
        return save_as();
    if (!m_finish_typing())
        return;
    const SavedFilter saved = *base();
    if (people::replace_filter(m_desk.office, saved, m_filter))
        choose_kept(saved);
    else
        reload();
}

void SavedFilterBar::save_as()
{
    if (!m_finish_typing())
        return;
    const SavedFilter* saved = base();
    m_name->ask(u"Please enter a name for this filter"_s, saved ? saved->name : QString(), [this](const QString& name) {
        if (!m_finish_typing())
            return;
        if (const auto key = people::save_filter(m_desk.office, name, m_filter))
            choose_kept({*key, people::tidy(name)});
        else
            m_name->ask_again();
    });
}

void SavedFilterBar::rename()
{
    const SavedFilter* saved = chosen();
    if (!saved)
        return;
    m_name->ask(u"Please enter another name for this filter"_s, saved->name, [this, old = *saved](const QString& name) {
        if (!people::rename_filter(m_desk.office, old, name))
            return m_name->ask_again();
        for (SavedFilter* renamed : {&m_changed_from, &m_on_screen})
            if (*renamed == old)
                renamed->name = people::tidy(name);
        reload();
    });
}

void SavedFilterBar::remove()
{
    const SavedFilter* saved = chosen();
    if (!saved)
        return;
    if (people::remove_filter(m_desk.office, *saved))
        detach();
    reload();
}

} // namespace kindrel::desktop

#pragma once

#include "desktop/shell/desk.h"
#include "people/saved_filters.h"

#include <QWidget>

#include <functional>

class QComboBox;

namespace kindrel::desktop {

class FilterNameLine;

/// Filters by name: to recall, change, save, rename and remove. What is not saved waits in the first row while a saved
/// one is looked at, under the name of the one that it was made from.
class SavedFilterBar : public QWidget
{
    Q_OBJECT

public:
    /// `filter` is the panel's and outlives the bar. Before it is saved, `finish_typing` takes into it what is being
    /// typed; false, after saying why, stops the save.
    SavedFilterBar(Desk& desk, const people::Filter& filter, std::function<bool()> finish_typing);

    /// A name that is being typed is dropped.
    void reload();
    /// The filter was changed: it differs from the saved one.
    void show_changed();

Q_SIGNALS:
    void recalled(const people::Filter& filter);
    void clear_wanted();

private:
    struct Button
    {
        QString name, text, icon, tip;
    };
    /// What becomes of a name that is being typed.
    enum class Typed { taken, dropped };

    void add_button(const Button& looks, Typed typed, void (SavedFilterBar::*run)());
    /// As the list has it; null when it is not among them.
    [[nodiscard]] const people::SavedFilter* stored(const people::SavedFilter& saved) const;
    /// The saved filter in front, changed or not; null when there is none.
    [[nodiscard]] const people::SavedFilter* base() const;
    /// Says so when there is none.
    [[nodiscard]] const people::SavedFilter* chosen() const;
    /// The list stands on the filter of the screen.
    void show_row();
    /// The filter of the screen has just been stored under it.
    void choose_kept(const people::SavedFilter& saved);
    /// The filter of the screen stands as it is, under no name.
    void detach();
    void recall(int row);
    void clear();
    void save();
    void save_as();
    void rename();
    void remove();

    Desk& m_desk;
    const people::Filter& m_filter;
    std::function<bool()> m_finish_typing;
    people::Filter m_not_saved;
    people::SavedFilter m_changed_from; ///< What `m_not_saved` was made from; of key 0 when there is none.
    people::SavedFilter m_on_screen;    ///< What stands on the screen as it was read or kept; key 0: `m_not_saved`.
    std::vector<people::SavedFilter> m_saved;
    QComboBox* m_names;
    FilterNameLine* m_name;
};

} // namespace kindrel::desktop

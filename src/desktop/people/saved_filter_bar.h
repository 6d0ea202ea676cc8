#pragma once

#include "desktop/shell/desk.h"
#include "people/saved_filters.h"

#include <QWidget>

#include <functional>

class QComboBox;
class QLineEdit;
class QPushButton;

namespace kindrel::desktop {

/// Filters by name: to recall, change, save, rename and remove. What is not saved waits in the first row while a saved
/// one is looked at, under the name of the one that it was made from.
class SavedFilterBar : public QWidget
{
    Q_OBJECT

public:
    /// `filter` is the panel's and outlives the bar.
    SavedFilterBar(Desk& desk, const people::Filter& filter);

    void reload();
    /// The filter was changed: it differs from the saved one.
    void show_changed();

Q_SIGNALS:
    void recalled(const people::Filter& filter);
    void clear_wanted();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void add_button(const QString& name, const QString& text, const QString& icon_name, const QString& tip,
                    void (SavedFilterBar::*run)());
    void set_up_name();
    /// The saved filter in front, changed or not; null when there is none.
    [[nodiscard]] const people::SavedFilter* base() const;
    /// Says so when there is none.
    [[nodiscard]] const people::SavedFilter* chosen() const;
    void choose(int filter_id);
    /// The filter has just been stored under it.
    void choose_kept(int filter_id);
    void show_first_row();
    void recall(int row);
    void clear();
    void save();
    void save_as();
    void rename();
    void remove();
    /// Asks for a name in the place of the list, `suggested` standing there. `use` says whether it will do.
    void ask_name(const QString& question, const QString& suggested, std::function<bool(const QString&)> use);
    void take_name();
    void end_naming();

    Desk& m_desk;
    const people::Filter& m_filter;
    people::Filter m_not_saved;
    int m_changed_from = 0; ///< The saved filter that `m_not_saved` was made from.
    std::vector<people::SavedFilter> m_saved;
    QComboBox* m_names;
    QLineEdit* m_name; ///< There while a name is asked for.
    std::function<bool(const QString&)> m_use_name;
};

} // namespace kindrel::desktop

#pragma once

#include "desktop/shell/desk.h"
#include "people/saved_filters.h"

#include <QWidget>

class QComboBox;
class QPushButton;

namespace kindrel::desktop {

/// Filters by name: to recall, save, rename and remove. What is not saved waits in the first row while a saved one is
/// looked at.
class SavedFilterBar : public QWidget
{
    Q_OBJECT

public:
    /// `filter` is the panel's and outlives the bar.
    SavedFilterBar(Desk& desk, const people::Filter& filter);

    void reload();
    /// The filter was changed: it is the saved one no more.
    void show_changed();

Q_SIGNALS:
    void recalled(const people::Filter& filter);
    void clear_wanted();

private:
    [[nodiscard]] QPushButton* make_button(const QString& name, const QString& text, const QString& icon_name,
                                           const QString& tip, void (SavedFilterBar::*run)());
    /// Says so when none is.
    [[nodiscard]] const people::SavedFilter* chosen() const;
    void choose(int filter_id);
    void recall(int row);
    void save();
    void rename();
    void remove();

    Desk& m_desk;
    const people::Filter& m_filter;
    people::Filter m_not_saved;
    std::vector<people::SavedFilter> m_saved;
    QComboBox* m_names;
    QString m_last_name; ///< Under which the filter was recalled or saved.
};

} // namespace kindrel::desktop

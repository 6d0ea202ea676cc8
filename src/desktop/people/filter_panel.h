#pragma once

#include "desktop/people/filter_part.h"

class QLabel;
class QListWidget;
class QStackedWidget;
class QTimer;

namespace kindrel::desktop {

class SavedFilterBar;

/// A filter to be built: the kinds of criteria at the left, what each offers beside them, and below the filter in plain
/// English with the number of people whom it finds. Nothing is read before the first reload().
class FilterPanel : public QWidget
{
    Q_OBJECT

public:
    explicit FilterPanel(Desk& desk, QWidget* parent = nullptr);

    [[nodiscard]] const people::Filter& filter() const { return m_filter; }
    void set_filter(const people::Filter& filter);
    /// Reads lists and saved filters again; the filter stays.
    void reload();
    void focus_kinds();
    /// Takes what was typed into the filter. False, after saying why, when something is lacking: the cursor is there.
    [[nodiscard]] bool finish();
    /// Counts at once, without waiting for a pause in typing.
    void count_now();

protected:
    void changeEvent(QEvent* event) override;

private:
    void add_parts();
    void add_part(FilterPart* part);
    [[nodiscard]] QListWidget* make_kinds();
    [[nodiscard]] QWidget* make_outcome();
    [[nodiscard]] FilterPart& part(int row) const;
    void show_part(int row);
    /// As finish(), but for what the filter as a whole may lack.
    [[nodiscard]] bool finish_parts();
    void adopt(const people::Filter& filter);
    void show_uses();
    void take_change();
    void colour_faults();
    void show_outcome(const QString& count, const QString& sentence, const QStringList& faults);

    Desk& m_desk;
    people::Filter m_filter;
    SavedFilterBar* m_saved;
    QListWidget* m_kinds;
    QStackedWidget* m_parts;
    QLabel *m_count, *m_sentence, *m_faults;
    QTimer* m_pause;
    bool m_read = false; ///< There was a first reload().
};

} // namespace kindrel::desktop

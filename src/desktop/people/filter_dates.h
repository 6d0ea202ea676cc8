#pragma once

#include "desktop/people/filter_part.h"

class QListWidget;
class QVBoxLayout;

namespace kindrel::desktop {

class FilterDateForm;

/// Spans in which a date of the person or the family lies: those of the filter in a list, and a form for one more. A
/// span that is typed whole goes into the filter when the person turns to something else, too.
class FilterDates : public FilterPart
{
    Q_OBJECT

public:
    FilterDates(Desk& desk, people::Filter& filter);

    [[nodiscard]] int uses() const override { return int(filter().dates.size()); }
    void show_filter() override;
    void reload() override;
    void focus_first() override;
    [[nodiscard]] QWidget* finish() override;
    void forget_typed() override;

protected:
    void hideEvent(QHideEvent* event) override;
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    [[nodiscard]] QVBoxLayout* make_list();
    void add();
    void remove();

    QListWidget* m_list;
    FilterDateForm* m_form;
};

} // namespace kindrel::desktop

#pragma once

#include "desktop/people/filter_part.h"

#include <array>

class QComboBox;
class QFormLayout;
class QListWidget;
class QVBoxLayout;

namespace kindrel::desktop {

class DateField;

/// Spans in which a date of the person or the family lies: those of the filter in a list, and a form for one more.
class FilterDates : public FilterPart
{
    Q_OBJECT

public:
    FilterDates(Desk& desk, people::Filter& filter);

    [[nodiscard]] int uses() const override { return int(filter().dates.size()); }
    void show_filter() override;
    void reload() override;
    void focus_first() override;

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    struct End
    {
        DateField* field;
        std::optional<core::Date> day = {};
    };

    [[nodiscard]] QVBoxLayout* make_list();
    [[nodiscard]] QVBoxLayout* make_form();
    void fill_sources();
    void add_row(QFormLayout& form, const QString& caption, QWidget* field, const QString& name);
    void fill_items();
    void show_span();
    [[nodiscard]] people::DateSource source() const;
    [[nodiscard]] people::DateSpan span() const;
    void add();
    void remove();

    QListWidget* m_list;
    QFormLayout* m_form = nullptr;
    QComboBox *m_source, *m_item, *m_span, *m_month;
    std::array<End, 2> m_ends;
};

} // namespace kindrel::desktop

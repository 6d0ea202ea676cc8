#pragma once

#include "desktop/shell/desk.h"
#include "people/filter.h"

#include <QWidget>

#include <array>

class QComboBox;
class QFormLayout;

namespace kindrel::desktop {

class FilterEndField;

/// One more span of dates for a filter, as it is being put together.
class FilterDateForm : public QWidget
{
    Q_OBJECT

public:
    explicit FilterDateForm(const Desk& desk);

    /// Reads the kinds of dates again.
    void reload();
    void focus_first();
    /// Whether an end was typed, be it one that makes no date yet.
    [[nodiscard]] bool typed() const;
    /// Whether both ends were typed as they can be taken.
    [[nodiscard]] bool whole() const;
    /// The end that is missing, or lacks its year, after saying so; null for a span that can be taken.
    [[nodiscard]] QWidget* lacking();
    /// The span; its ends are empty afterwards.
    [[nodiscard]] people::DateCriterion take();
    void forget_typed();

Q_SIGNALS:
    /// The span is wanted: Enter in an end, or the button.
    void add_wanted();

private:
    struct End
    {
        FilterEndField* field;
        std::optional<core::Date> day = {};
    };

    [[nodiscard]] QFormLayout* make_rows();
    void add_row(QFormLayout& form, const QString& caption, QWidget* field, const QString& name);
    void fill_items();
    void show_span();
    /// An anniversary alone can do without.
    [[nodiscard]] bool lacks_year(const End& end) const;
    [[nodiscard]] people::DateSource source() const;
    [[nodiscard]] people::DateSpan span() const;

    core::Office& m_office;
    QComboBox *m_source, *m_item, *m_span, *m_month;
    std::array<End, 2> m_ends;
    QFormLayout* m_form;
};

} // namespace kindrel::desktop

#pragma once

#include "desktop/shell/desk.h"
#include "people/filter_search.h"

#include <QWidget>

namespace kindrel::desktop {

/// One kind of criteria: shows those of the panel's filter and changes them.
class FilterPart : public QWidget
{
    Q_OBJECT

public:
    /// The filter belongs to the panel and outlives its parts.
    FilterPart(Desk& desk, people::Filter& filter, const QString& caption)
        : m_desk(desk), m_filter(filter), m_caption(caption)
    {
        setAccessibleName(caption);
    }

    [[nodiscard]] QString caption() const { return m_caption; }
    /// How many criteria of this kind the filter has.
    [[nodiscard]] virtual int uses() const = 0;
    /// The filter was changed elsewhere.
    virtual void show_filter() = 0;
    /// Reads again what is chosen from, and shows the filter.
    virtual void reload() { show_filter(); }
    virtual void focus_first() = 0;
    /// Takes what was typed into the filter. The field that lacks something, after saying so; null when none does.
    [[nodiscard]] virtual QWidget* finish() { return nullptr; }
    /// Drops what was typed and is not in the filter.
    virtual void forget_typed() {}

Q_SIGNALS:
    /// The filter was changed here.
    void changed();

protected:
    [[nodiscard]] Desk& desk() const { return m_desk; }
    [[nodiscard]] people::Filter& filter() const { return m_filter; }

private:
    Desk& m_desk;
    people::Filter& m_filter;
    QString m_caption;
};

/// What a filter asked today is told with.
[[nodiscard]] inline people::FilterDay filter_day(const core::Office& office)
{
    return {office.clock.today(), office.day_order()};
}

} // namespace kindrel::desktop

#pragma once

#include "desktop/shell/desk.h"
#include "people/sorting.h"

#include <QWidget>

class QComboBox;
class QLineEdit;
class QStackedWidget;

namespace kindrel::desktop {

class DateField;

/// How an order by date narrows the list: to a month, to ages or to dates.
class DateSearchFields : public QWidget
{
    Q_OBJECT

public:
    explicit DateSearchFields(Desk& desk);

    /// An order that is not by date cannot be searched.
    void allow(bool by_date);
    /// Gives the order the search and, as far as it is entered, its value.
    void take(people::SortOrder& order) const;
    /// Reads what is being typed into the dates of the search; false, after saying why, when it is no date.
    [[nodiscard]] bool finish();
    /// The cursor goes to what the search lacks.
    void focus_lacking();

Q_SIGNALS:
    void changed();

private:
    [[nodiscard]] QLineEdit* make_age(const QString& name, const QString& caption);
    [[nodiscard]] DateField* make_date(const QString& name, const QString& caption, std::optional<core::Date>& date);

    core::Office& m_office;
    std::optional<core::Date> m_first, m_last;
    QComboBox *m_search, *m_month;
    QLineEdit *m_youngest, *m_oldest;
    DateField *m_from, *m_to;
    QStackedWidget* m_values; ///< In the order of people::DateSearch.
};

} // namespace kindrel::desktop

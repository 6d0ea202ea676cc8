#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_reports.h"

#include <QHash>
#include <QWidget>

class QComboBox;
class QLabel;
class QLayout;

namespace kindrel::desktop {

class DateField;
class YearField;

/// The control behind its caption, which ends where those of the period's fields do.
[[nodiscard]] QLayout* with_caption(const QString& caption, QWidget* control);

/// The period of a report: a date range, a calendar or financial year, or several years, as far as the report is made
/// of them. What was chosen last is remembered.
class WeeklyPeriodFields : public QWidget
{
    Q_OBJECT

public:
    explicit WeeklyPeriodFields(Desk& desk, QWidget* parent = nullptr);

    /// Offers the kinds of period that the report can be of.
    void fit(registers::ReportPeriod report);
    /// As chosen and typed. Nullopt, after saying why, when a date cannot be read.
    [[nodiscard]] std::optional<registers::PeriodChoice> choice();
    void remember();
    /// Puts the cursor where the period begins or, where it has one, into the field in which it ends.
    void focus_end(registers::ReportField end);

private:
    /// The years of a span.
    struct Span
    {
        QString from, to;
    };
    /// Of the kind of report: those that compare two years have one of their own.
    [[nodiscard]] Span& span();
    void show_span();
    void take_span();
    /// What was chosen last, else what is proposed.
    [[nodiscard]] QString remembered(const QString& name) const;
    /// A proposal that stands is not kept: it goes on with the calendar.
    void keep(const QString& name, const QString& value);
    void keep_kind();
    [[nodiscard]] registers::PeriodKind kind() const;
    [[nodiscard]] YearField* make_year(const QString& name);
    [[nodiscard]] DateField* make_date(const QString& name, std::optional<core::Date>& date);
    void show_fields();

    Desk& m_desk;
    registers::ReportPeriod m_report = registers::ReportPeriod::any_days;
    QComboBox* m_kind;
    QHash<QString, QString> m_proposed; ///< When the fields were made: years, and dates as they are stored.
    std::optional<core::Date> m_from_date, m_to_date;
    DateField *m_from, *m_to;
    YearField *m_year, *m_from_year, *m_to_year;
    Span m_years, m_two_years;
    QLabel *m_first, *m_second;
};

} // namespace kindrel::desktop

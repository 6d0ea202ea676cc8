#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_reports.h"

#include <QWidget>

class QComboBox;
class QLabel;

namespace kindrel::desktop {

class DateField;
class YearField;

/// The period of a report: a date range, a calendar or financial year, or several years, as far as the report is made
/// of them. What was chosen last is remembered.
class WeeklyPeriodFields : public QWidget
{
    Q_OBJECT

public:
    static constexpr int caption_width = 52;

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
    void keep(const QString& name, const QVariant& value);
    void keep_kind();
    [[nodiscard]] registers::PeriodKind kind() const;
    [[nodiscard]] YearField* make_year(const QString& name);
    [[nodiscard]] QString kept_year(const QString& name, int proposed) const;
    [[nodiscard]] DateField* make_date(const QString& name, const core::Date& proposed,
                                       std::optional<core::Date>& date);
    void show_fields();

    Desk& m_desk;
    registers::ReportPeriod m_report = registers::ReportPeriod::any_days;
    QComboBox* m_kind;
    core::Date m_today; ///< When the fields were made.
    std::optional<core::Date> m_from_date, m_to_date;
    DateField *m_from, *m_to;
    YearField *m_year, *m_from_year, *m_to_year;
    Span m_years, m_two_years;
    QLabel *m_first, *m_second;
};

} // namespace kindrel::desktop

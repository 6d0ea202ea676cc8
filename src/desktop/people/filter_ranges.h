#pragma once

#include "desktop/people/filter_part.h"

class QCheckBox;
class QComboBox;
class QGridLayout;
class QLineEdit;

namespace kindrel::desktop {

class DateField;

/// From the first surname letter, school year or age to the last.
class FilterRanges : public FilterPart
{
    Q_OBJECT

public:
    FilterRanges(Desk& desk, people::Filter& filter);

    [[nodiscard]] int uses() const override;
    void show_filter() override;
    void focus_first() override;

private:
    /// A range that is open at an end goes as far as these.
    struct Limits
    {
        int least, greatest;
    };
    struct Ends
    {
        QLineEdit *from, *to;
    };

    [[nodiscard]] Ends add_range(QGridLayout& grid, const QString& caption, const QString& name);
    [[nodiscard]] Ends add_numbers(QGridLayout& grid, const QString& caption, const QString& name, Limits limits);
    [[nodiscard]] static std::optional<Limits> read(const Ends& ends, Limits limits);
    void take_typed();

    static constexpr Limits school_years{-2, 13};
    static constexpr Limits ages{1, 120};

    Ends m_surnames, m_years, m_ages;
    QCheckBox* m_own_surname;
    DateField* m_on;
    std::optional<core::Date> m_day; ///< Of `m_on`.
};

/// The family's type and what is known of its residential address.
class FilterFamilyType : public FilterPart
{
    Q_OBJECT

public:
    FilterFamilyType(Desk& desk, people::Filter& filter);

    [[nodiscard]] int uses() const override;
    void show_filter() override;
    void focus_first() override;

private:
    QComboBox* m_type;
    QCheckBox* m_suburb_known;
    QCheckBox* m_own_postcode;
};

} // namespace kindrel::desktop

#pragma once

#include "registers/dated_register.h"
#include "registers/figures.h"

namespace kindrel::registers {

/// A category of a weekly project.
struct Category
{
    int key = 0;
    QString name;
    FigureKind kind = FigureKind::attendance;

    friend bool operator==(const Category&, const Category&) = default;
};

/// Those of attendance first, each kind in its own order.
[[nodiscard]] std::vector<Category> read_categories(core::Session& session, int project);

/// A line of the entry list.
struct WeeklyRow
{
    Category category;
    std::optional<core::Amount> figure;
    std::optional<core::Amount> last; ///< On the date before the open one.

    friend bool operator==(const WeeklyRow&, const WeeklyRow&) = default;
};

/// Head counts and money of a date, one figure for each category.
class WeeklyRegister : public DatedRegister
{
public:
    explicit WeeklyRegister(core::Office& office) : DatedRegister(office, register_kind(Kind::weekly)) {}

    /// Of the open date, in the order of read_categories(); empty when none is open.
    [[nodiscard]] const std::vector<WeeklyRow>& rows() const { return m_rows; }
    /// The project's date before the open one, whose figures stand beside those of the open one.
    [[nodiscard]] std::optional<core::Date> last_date() const;
    /// Takes what was typed into the row; empty text clears the figure. False, after saying why, when it cannot be one.
    [[nodiscard]] bool enter_figure(int row, const QString& typed);
    [[nodiscard]] core::Amount total(FigureKind kind) const;
    [[nodiscard]] bool altered() const override;

protected:
    void load_rows() override;
    void save_rows() override;
    void keep_rows() override { m_stored = m_rows; }
    void drop_rows() override { m_rows = m_stored; }
    void clear_rows() override;
    void date_moved() override { load_last(); }
    [[nodiscard]] bool setup_unchanged() override;

private:
    [[nodiscard]] const RegisterDate* date_before() const;
    void load_last();

    std::vector<WeeklyRow> m_rows;
    std::vector<WeeklyRow> m_stored;
};

} // namespace kindrel::registers

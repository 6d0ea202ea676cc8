#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_register.h"

#include <QWidget>

class QLabel;
class QPushButton;
class QStackedWidget;

namespace kindrel::desktop {

class FigureGrid;
class RegisterDates;
class WeeklyGridModel;

/// The dates of a weekly project and the figures of the open one.
class WeeklyEntry : public QWidget
{
    Q_OBJECT

public:
    WeeklyEntry(Desk& desk, registers::WeeklyRegister& weekly, QWidget* parent = nullptr);

    /// After the register was entered, saved or left.
    void show_register();
    /// To the figures of the open date, else to the dates.
    void focus_work();
    void focus_dates();
    void focus_new_date();
    /// A cell is open and holds another text than the register.
    [[nodiscard]] bool typing() const;
    /// Takes over the open cell; false when it was refused, with the cursor in it.
    [[nodiscard]] bool finish_typing();
    void print();
    void save_csv();

Q_SIGNALS:
    /// The register, or what is being typed.
    void changed();
    void remarked(const QString& note);

private:
    [[nodiscard]] QWidget* make_work();
    void show_date();
    void show_totals();
    void show_notes_button();
    void open_notes();
    /// Whether a date is open whose figures can be handed on; otherwise says so.
    [[nodiscard]] bool ready();
    [[nodiscard]] QString title() const;

    Desk& m_desk;
    registers::WeeklyRegister& m_weekly;
    RegisterDates* m_dates;
    WeeklyGridModel* m_model;
    FigureGrid* m_grid;
    QPushButton* m_notes;
    QLabel* m_heading;
    QLabel* m_totals;
    QStackedWidget* m_work;
};

} // namespace kindrel::desktop

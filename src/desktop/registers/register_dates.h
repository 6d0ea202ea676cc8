#pragma once

#include "desktop/shell/desk.h"
#include "registers/dated_register.h"

#include <QWidget>

class QComboBox;
class QListWidget;
class QPushButton;
class QVBoxLayout;

namespace kindrel::desktop {

class DateField;

/// The projects of a register and the dates of the chosen one, newest first: opens, adds, re-dates and deletes them.
class RegisterDates : public QWidget
{
    Q_OBJECT

public:
    /// `finish_typing` takes over what is being typed on the open date before anything happens to it; false when that
    /// was refused.
    RegisterDates(Desk& desk, registers::DatedRegister& dated, std::function<bool()> finish_typing,
                  QWidget* parent = nullptr);

    /// After the register was changed elsewhere.
    void show_register();
    /// The list of dates, or where there is none the field for a new one.
    void focus_dates();
    void focus_new_date();
    /// The date under the list's cursor, 0 when there is none.
    [[nodiscard]] int chosen() const;
    /// Below the buttons for dates.
    void add_button(QPushButton* button);

Q_SIGNALS:
    /// The project, its dates or the open date may be others.
    void changed();
    /// The open date is to be filled in.
    void opened();
    /// What is odd about a date, empty when nothing is.
    void remarked(const QString& note);
    /// The list's cursor stands on another date.
    void chosen_changed();

private:
    void lay_out();
    [[nodiscard]] QWidget* make_new_line();
    struct Button
    {
        QString text, icon, name, tip;
    };
    [[nodiscard]] QPushButton* make_button(const Button& looks, void (RegisterDates::*act)());
    void show_dates();
    /// `act`, once nothing is being typed on the open date any more. When it fails, what the register holds is shown.
    [[nodiscard]] std::function<void()> settled(void (RegisterDates::*act)());
    void choose_project();
    void open_chosen();
    void add_typed();
    void change_date();
    void remove();
    void done(bool made);

    Desk& m_desk;
    registers::DatedRegister& m_register;
    std::function<bool()> m_finish_typing;
    QVBoxLayout* m_column;
    QComboBox* m_project;
    DateField* m_new;
    QListWidget* m_dates;
    std::optional<core::Date> m_typed;
};

} // namespace kindrel::desktop

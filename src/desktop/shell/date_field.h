#pragma once

#include "core/office.h"

#include <QLineEdit>

namespace kindrel::desktop {

/// A date to be typed, as of typed_date().
class DateField : public QLineEdit
{
    Q_OBJECT

public:
    explicit DateField(core::Office& office, QWidget* parent = nullptr);

    /// What is said to what was typed and is no date.
    using Refusal = core::Message (*)(const QString& typed, core::DayOrder order);
    /// From now on a date without its year is no date.
    void require_year(Refusal refusal);
    /// What is being typed stays.
    void show_date(std::optional<core::Date> date);
    /// Reads what was typed; false, after saying why, when it is no date. It then stays, with the cursor in it.
    bool finish();

Q_SIGNALS:
    /// Nothing for an emptied field.
    void entered(std::optional<core::Date> date);

protected:
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void give_up();
    /// Says why what was typed is not taken.
    void refuse(const core::Message& why);

    core::Office& m_office;
    Refusal m_year_refusal = nullptr; ///< Null: the year need not be known.
    std::optional<core::Date> m_date;
    bool m_telling = false;
};

/// Whether the event asks a field whether it takes the key for undoing.
[[nodiscard]] bool asks_for_undo(const QEvent& event);

} // namespace kindrel::desktop

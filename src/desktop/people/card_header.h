#pragma once

#include "people/records.h"

#include <QWidget>

class QLabel;

namespace kindrel::desktop {

class Chip;

/// The head of a family card: surname, file status, booking out, and the days of the file.
class CardHeader : public QWidget
{
    Q_OBJECT

public:
    explicit CardHeader(QWidget* parent = nullptr);
    void show_family(const people::Family& family, core::DayOrder order);

private:
    QLabel* m_surname;
    Chip* m_status;
    Chip* m_booked_out;
    QLabel* m_dates;
    QLabel* m_note;
};

} // namespace kindrel::desktop

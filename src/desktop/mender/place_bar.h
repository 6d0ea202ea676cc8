#pragma once

#include "desktop/mender/church_list.h"

#include <QWidget>

class QComboBox;
class QLineEdit;
class QPushButton;

namespace kindrel::desktop {

/// Where the data lies and which church is meant.
class PlaceBar : public QWidget
{
    Q_OBJECT

public:
    PlaceBar();
    void show_list(const ChurchList& list);
    [[nodiscard]] QString data_drive() const;
    /// 0 while none is chosen.
    [[nodiscard]] int church() const;
    [[nodiscard]] QString church_in_words() const;
    /// Asks for the churches of a data drive that was typed and not confirmed yet; false where there is none.
    bool settle_drive();
    /// To the button, or to the church while none is chosen.
    void lead_to_check();
    void lead_to_drive();

Q_SIGNALS:
    void drive_chosen();
    void browse_wanted();
    void church_chosen();
    void check_wanted();

private:
    ChurchList m_list;
    QLineEdit* m_drive;
    QPushButton* m_browse;
    QComboBox* m_church;
    QPushButton* m_check;
};

} // namespace kindrel::desktop

#pragma once

#include "core/users.h"

#include <QScrollArea>

class QBoxLayout;
class QLabel;
class QLineEdit;
class QPlainTextEdit;

namespace kindrel::desktop {

class AccessAreas;

/// Whom a password belongs to, its e-mail sender and its access areas.
class UserDetails : public QScrollArea
{
    Q_OBJECT

public:
    UserDetails();

    void show_user(const QString& title, const core::User& user);
    [[nodiscard]] AccessAreas& areas() { return *m_areas; }
    void set_title(const QString& title);
    void focus_people();
    /// The cursor goes to this area's box, scrolled into sight.
    void focus_area(core::Area area);

Q_SIGNALS:
    void people_edited(const QStringList& people);
    void email_edited(const QString& name, const QString& address);

private:
    [[nodiscard]] QBoxLayout* make_people();
    [[nodiscard]] QBoxLayout* make_email();
    [[nodiscard]] QLineEdit* make_line(const QString& name);
    void tell_people();

    QLabel* m_title;
    QPlainTextEdit* m_people;
    QLineEdit* m_email_name;
    QLineEdit* m_email_address;
    AccessAreas* m_areas;
};

} // namespace kindrel::desktop

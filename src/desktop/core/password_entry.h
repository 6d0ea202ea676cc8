#pragma once

#include <QWidget>

class QBoxLayout;
class QLabel;
class QLineEdit;

namespace kindrel::desktop {

class Chip;

/// A new password, typed twice and never shown.
class PasswordEntry : public QWidget
{
    Q_OBJECT

public:
    explicit PasswordEntry(QWidget* parent = nullptr);

    /// What was typed; nothing of it stays here.
    [[nodiscard]] QString take();
    void start();

Q_SIGNALS:
    /// Both times the same was typed, and it is to be taken as a new password.
    void add_wanted();
    /// The same for the password that is chosen in the list.
    void change_wanted();

private:
    [[nodiscard]] QLineEdit* add_field(QBoxLayout& column, const QString& caption, const QString& name);
    [[nodiscard]] QBoxLayout* make_buttons();
    void go_on();
    /// True when both are the same; otherwise leads to the second.
    [[nodiscard]] bool agreed();
    void show_hint();

    QLineEdit* m_first;
    QLineEdit* m_second;
    QLabel* m_hint;
    Chip* m_difference;
};

} // namespace kindrel::desktop

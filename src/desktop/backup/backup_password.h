#pragma once

#include <QWidget>

class QBoxLayout;
class QLabel;
class QLineEdit;

namespace kindrel::desktop {

class Chip;

/// A password that may be left out, typed twice and never shown.
class BackupPassword : public QWidget
{
    Q_OBJECT

public:
    BackupPassword();

    /// True when both fields hold the same; otherwise leads to the second.
    [[nodiscard]] bool agreed();
    [[nodiscard]] QString password() const;
    void clear();

Q_SIGNALS:
    /// Enter in the last field.
    void finished();

private:
    [[nodiscard]] QLineEdit* add_field(QBoxLayout& column, const QString& caption, const QString& name);
    void show_warning();

    QLineEdit* m_first;
    QLineEdit* m_second;
    Chip* m_difference;
    QLabel* m_warning;
};

} // namespace kindrel::desktop

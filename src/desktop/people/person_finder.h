#pragma once

#include "desktop/shell/desk.h"
#include "people/listed_people.h"

#include <QWidget>

class QLineEdit;
class QListWidget;

namespace kindrel::desktop {

/// Finds a person among everybody: the beginnings of any words of name and family, in any order. Enter takes the
/// person and clears the line for the next. Everybody is read with the first letter.
class PersonFinder : public QWidget
{
    Q_OBJECT

public:
    explicit PersonFinder(Desk& desk);

    void focus_line();

Q_SIGNALS:
    void chosen(const people::ListedPerson& person);

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void find(const QString& typed);
    /// Again when any workstation has stored something since.
    void read();
    void take();
    [[nodiscard]] bool line_key(int key);

    Desk& m_desk;
    QLineEdit* m_line;
    QListWidget* m_found;
    std::optional<qint64> m_change_mark;
    std::vector<people::ListedPerson> m_people;
    std::vector<QString> m_words; ///< Beside `m_people`.
};

} // namespace kindrel::desktop

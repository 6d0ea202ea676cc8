#pragma once

#include "desktop/people/found_people_model.h"

#include <QWidget>

class QKeyEvent;
class QLineEdit;
class QTableView;

namespace kindrel::desktop {

/// The people whom a filter found: typed words narrow the list, Down leads into it, Enter asks for the family.
class FoundPeople : public QWidget
{
    Q_OBJECT

public:
    explicit FoundPeople(Remembered& remembered, QWidget* parent = nullptr);

    void show_people(std::vector<FoundPerson> people);
    [[nodiscard]] const FoundPeopleModel& model() const { return *m_model; }
    void focus_line();
    /// "12 of 312 people".
    [[nodiscard]] QString count_words() const;

Q_SIGNALS:
    void opened(int surname_id);
    void shown_changed();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void set_up_line();
    void set_up_table(Remembered& remembered);
    void typed(const QString& text);
    void open_chosen();
    [[nodiscard]] bool line_key(const QKeyEvent& key);

    FoundPeopleModel* m_model;
    QLineEdit* m_line;
    QTableView* m_table;
};

} // namespace kindrel::desktop

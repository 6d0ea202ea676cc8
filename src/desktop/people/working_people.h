#pragma once

#include "desktop/people/working_people_model.h"
#include "desktop/shell/desk.h"

#include <QWidget>

class QTableView;

namespace kindrel::desktop {

class PersonFinder;

/// The working list with a line that adds people to it. Delete strikes the chosen ones, Down leads from the line into
/// the list, Insert back, Enter asks for the family.
class WorkingPeople : public QWidget
{
    Q_OBJECT

public:
    explicit WorkingPeople(Desk& desk);

    /// The chosen row stays where it is.
    void show_people(const std::vector<people::ListedPerson>& people);
    [[nodiscard]] const WorkingPeopleModel& model() const { return *m_model; }
    void focus_list();
    void focus_line();

Q_SIGNALS:
    void added(const people::ListedPerson& person);
    void struck(const std::vector<int>& people);
    void opened(int surname_id);

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void set_up_table();
    void strike_chosen();

    Desk& m_desk;
    WorkingPeopleModel* m_model;
    PersonFinder* m_finder;
    QTableView* m_table;
};

} // namespace kindrel::desktop

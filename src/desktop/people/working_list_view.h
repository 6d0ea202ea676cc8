#pragma once

#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"

#include <functional>

class QLabel;
class QPushButton;

namespace kindrel::desktop {

class WorkingPeople;

/// The working list under the sentence that made it. People are added and struck by hand, which can be taken back.
class WorkingListView : public QWidget
{
    Q_OBJECT

public:
    WorkingListView(Desk& desk, TaggingSheet& sheet);

    [[nodiscard]] const people::WorkingList& list() const { return m_made.list; }
    [[nodiscard]] bool is_made() const { return m_is_made; }
    /// "84 people".
    [[nodiscard]] QString count_words() const;
    /// Makes the list of what the sheet says now. An order that lacks something yet, or that is not granted, leaves it
    /// as it is.
    void make();
    /// Those who are not on the list yet join it, as if by hand.
    void add_people(const std::vector<people::Member>& members);
    void focus_line();
    void print();
    void save();

Q_SIGNALS:
    void made();
    void told(const QString& words);
    /// The list was changed by hand, which `undo` takes back.
    void changed_by_hand(const QString& words, const std::function<void()>& undo);

private:
    [[nodiscard]] bool can_make() const;
    void add(const people::ListedPerson& person);
    void strike(const std::vector<int>& people);
    void change_by_hand(const QString& words, const std::function<void()>& change);
    void drop_changes_by_hand();
    [[nodiscard]] bool has_people() const;

    Desk& m_desk;
    TaggingSheet& m_sheet;
    people::MadeList m_made;
    bool m_is_made = false;
    QLabel* m_state;
    QPushButton* m_as_filtered;
    WorkingPeople* m_people;
};

/// "1 person", "84 people".
[[nodiscard]] QString people_words(qsizetype people);

} // namespace kindrel::desktop

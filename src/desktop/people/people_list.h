#pragma once

#include "people/records.h"

#include <QListWidget>

namespace kindrel::desktop {

/// The adults or the children of a family, with markers, state colours and roles. The people of both lists are told by
/// their places in the family.
class PeopleList : public QListWidget
{
    Q_OBJECT

public:
    enum class Who { adults, children };
    PeopleList(Who who, const QString& title, QWidget* parent = nullptr);

    void show_people(const people::FamilyFile& file, int chosen);
    /// The place of the person so many rows further down; -1 where there is none.
    [[nodiscard]] int person_at(int rows_further) const;

Q_SIGNALS:
    void person_chosen(int person);
    void opened();
    void adding_wanted();
    void removal_wanted();
    void move_wanted(int by);

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    void show_row(int row, const people::FamilyFile& file, int person);

    Who m_who;
};

/// Whether a person stands among the children: whoever is first is the primary adult, whatever the code says.
[[nodiscard]] bool stands_with_children(const people::FamilyFile& file, int person);

} // namespace kindrel::desktop

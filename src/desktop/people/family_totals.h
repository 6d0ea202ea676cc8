#pragma once

#include "people/address_book.h"

#include <QWidget>

#include <vector>

namespace kindrel::desktop {

class LinkButton;

/// The totals of the main menu; each is a link to the families that it counts.
class FamilyTotals : public QWidget
{
    Q_OBJECT

public:
    explicit FamilyTotals(QWidget* parent = nullptr);

    void show_totals(const std::vector<people::FamilyTotal>& totals);
    /// The list that is on the screen now.
    void mark(people::FamilyList list);

Q_SIGNALS:
    void chosen(kindrel::people::FamilyList list);

private:
    struct Link
    {
        people::FamilyList list;
        LinkButton* button;
    };

    void make_links(const std::vector<people::FamilyTotal>& totals);

    std::vector<Link> m_links;
};

} // namespace kindrel::desktop

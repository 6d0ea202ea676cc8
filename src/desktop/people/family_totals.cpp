#include "desktop/people/family_totals.h"

#include "desktop/shell/link_button.h"

#include <QLocale>
#include <QVBoxLayout>

namespace kindrel::desktop {

FamilyTotals::FamilyTotals(QWidget* parent) : QWidget(parent)
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
}

void FamilyTotals::make_links(const std::vector<people::FamilyTotal>& totals)
{
    for (const auto& total : totals) {
        auto* button = new LinkButton(total.caption);
        button->setObjectName(total.caption);
        button->setCheckable(true);
        button->setAutoExclusive(true);
        connect(button, &QAbstractButton::clicked, this, [this, list = total.list] { Q_EMIT chosen(list); });
        layout()->addWidget(button);
        m_links.push_back({total.list, button});
    }
}

void FamilyTotals::show_totals(const std::vector<people::FamilyTotal>& totals)
{
    if (m_links.empty())
        make_links(totals);
    const QLocale locale;
    for (std::size_t place = 0; place < totals.size(); ++place)
        m_links[place].button->set_figure(locale.toString(totals[place].count));
}

void FamilyTotals::mark(people::FamilyList list)
{
    for (const Link& link : m_links)
        if (link.list == list)
            link.button->setChecked(true);
}

} // namespace kindrel::desktop

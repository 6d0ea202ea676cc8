#include "desktop/core/password_list.h"

#include "desktop/shell/empty_panel.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

enum Columns { owner, areas, column_count };
constexpr int areas_width = 64;
constexpr int least_rows = 5;
const QString no_areas = u"none"_s;

int count_of(const core::Rights& rights)
{
    int count = 0;
    for (int area = 0; area < core::area_count; ++area)
        count += rights.may(static_cast<core::Area>(area)) ? 1 : 0;
    return count;
}

} // namespace

PasswordList::PasswordList() : QTableWidget(0, column_count), m_nothing(new EmptyPanel)
{
    setObjectName(u"passwords"_s);
    setAccessibleName(u"Passwords"_s);
    setHorizontalHeaderLabels({u"Password of"_s, u"Areas"_s});
    make_row_list(*this);
    horizontalHeader()->setStretchLastSection(false);
    horizontalHeader()->setSectionResizeMode(owner, QHeaderView::Stretch);
    horizontalHeader()->setSectionResizeMode(areas, QHeaderView::Fixed);
    horizontalHeader()->resizeSection(areas, areas_width);
    horizontalHeaderItem(areas)->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
    setMinimumHeight(least_rows * row_height());
    m_nothing->say(u"No passwords yet"_s, u"Type the first one below, twice, and press Enter."_s);
    auto* over = new QVBoxLayout(viewport());
    over->setContentsMargins(0, 0, 0, 0);
    over->addWidget(m_nothing);
}

void PasswordList::show_users(const core::SecuritySetup& setup)
{
    const auto& users = setup.users();
    const auto count = static_cast<int>(users.size());
    setRowCount(count);
    for (int place = 0; place < count; ++place)
        show_user(place, setup.title(place), count_of(users[static_cast<std::size_t>(place)].areas));
    m_nothing->setVisible(users.empty());
    colour();
}

void PasswordList::show_user(int place, const QString& title, int area_count)
{
    auto* who = new QTableWidgetItem(title);
    who->setToolTip(title);
    auto* number = new QTableWidgetItem(area_count > 0 ? QString::number(area_count) : no_areas);
    number->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
    setItem(place, owner, who);
    setItem(place, areas, number);
}

void PasswordList::colour()
{
    const QColor error = state_colour(desktop::State::error, shade_of(palette()));
    for (int place = 0; place < rowCount(); ++place) {
        if (QTableWidgetItem* number = item(place, areas); number && number->text() == no_areas)
            number->setForeground(error);
    }
}

int PasswordList::chosen() const
{
    const auto rows = selectionModel()->selectedRows();
    return rows.isEmpty() ? -1 : rows.first().row();
}

void PasswordList::choose(int place)
{
    if (place >= 0 && place < rowCount())
        selectRow(place);
    else
        clearSelection();
}

void PasswordList::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Delete)
        Q_EMIT removal_wanted();
    else
        QTableWidget::keyPressEvent(event);
}

void PasswordList::changeEvent(QEvent* event)
{
    QTableWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        colour();
}

} // namespace kindrel::desktop

#include "desktop/people/people_list.h"

#include "desktop/people/status_words.h"
#include "desktop/shell/look.h"
#include "people/names.h"

#include <QKeyEvent>
#include <QPainter>
#include <QStyledItemDelegate>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::Person;

namespace {

constexpr int person_role = Qt::UserRole;
constexpr int role_words_role = Qt::UserRole + 1;

/// Writes the role, quietly, at the right of the name where there is room for both.
class RoleDelegate : public QStyledItemDelegate
{
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override
    {
        QStyledItemDelegate::paint(painter, option, index);
        const QFont font = font_for(TextSize::secondary);
        const QString role = index.data(role_words_role).toString();
        const QRect place = option.rect.adjusted(0, 0, -space::field, 0);
        const int taken = option.fontMetrics.horizontalAdvance(index.data().toString()) + 3 * space::field;
        if (taken + QFontMetrics(font).horizontalAdvance(role) > place.width())
            return;
        const bool selected = option.state & QStyle::State_Selected;
        painter->save();
        painter->setFont(font);
        painter->setPen(selected ? option.palette.color(QPalette::HighlightedText)
                                 : quiet_colour(shade_of(option.palette)));
        painter->drawText(place, Qt::AlignRight | Qt::AlignVCenter, role);
        painter->restore();
    }
};

QString role_words(const people::FamilyFile& file, int person)
{
    const Person* shown = &file.people[std::size_t(person)];
    if (person == 0)
        return u"primary"_s;
    if (people::household_of(file.people).spouse == shown)
        return u"spouse"_s;
    return shown->school_year ? u"school year %1"_s.arg(*shown->school_year) : QString();
}

} // namespace

bool stands_with_children(const people::FamilyFile& file, int person)
{
    return person > 0 && people::is_child(file.people[std::size_t(person)]);
}

PeopleList::PeopleList(Who who, const QString& title, QWidget* parent) : QListWidget(parent), m_who(who)
{
    setAccessibleName(title);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setWordWrap(true);
    setItemDelegate(new RoleDelegate(this));
    connect(this, &QListWidget::itemSelectionChanged, this, [this] {
        const auto chosen = selectedItems();
        if (!chosen.isEmpty())
            Q_EMIT person_chosen(chosen.front()->data(person_role).toInt());
    });
    connect(this, &QListWidget::itemDoubleClicked, this, &PeopleList::opened);
}

void PeopleList::show_people(const people::FamilyFile& file, int chosen)
{
    const QSignalBlocker quiet(this);
    int row = 0;
    for (int person = 0; person < int(file.people.size()); ++person) {
        const Who who = stands_with_children(file, person) ? Who::children : Who::adults;
        if (who != m_who)
            continue;
        show_row(row, file, person);
        if (person == chosen)
            setCurrentRow(row);
        ++row;
    }
    while (count() > row)
        delete takeItem(row);
    if (chosen < 0 || (stands_with_children(file, chosen) ? Who::children : Who::adults) != m_who)
        clearSelection();
}

void PeopleList::show_row(int row, const people::FamilyFile& file, int person)
{
    const Person& shown = file.people[std::size_t(person)];
    if (row == count())
        addItem(new QListWidgetItem);
    QListWidgetItem* line = item(row);
    const QString role = role_words(file, person);
    line->setText(shown.Name + people::markers(shown, people::Markers::full));
    line->setData(person_role, person);
    line->setData(role_words_role, role);
    line->setToolTip(role);
    QFont font = this->font();
    font.setItalic(shown.Decease);
    line->setFont(font);
    line->setForeground(state_colour(state_of(states_of(shown)), shade_of(palette())));
}

int PeopleList::person_at(int rows_further) const
{
    const QListWidgetItem* line = item(currentRow() + rows_further);
    return line ? line->data(person_role).toInt() : -1;
}

void PeopleList::keyPressEvent(QKeyEvent* event)
{
    const bool alt = event->modifiers() == Qt::AltModifier;
    const int key = event->key();
    if (key == Qt::Key_Delete)
        Q_EMIT removal_wanted();
    else if (key == Qt::Key_Insert)
        Q_EMIT adding_wanted();
    else if ((key == Qt::Key_Up || key == Qt::Key_Down) && alt)
        Q_EMIT move_wanted(key == Qt::Key_Up ? -1 : 1);
    else if (key == Qt::Key_Return || key == Qt::Key_Enter)
        Q_EMIT opened();
    else
        QListWidget::keyPressEvent(event);
}

} // namespace kindrel::desktop

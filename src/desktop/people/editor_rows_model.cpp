#include "desktop/people/editor_rows_model.h"

#include "desktop/shell/typed_date.h"

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyFile;
using people::RowPlace;

EditorRowsModel::EditorRowsModel(EditorBench& bench, const RowListLook& look, QObject* parent)
    : QAbstractTableModel(parent), m_bench(bench), m_look(look)
{
}

EditorRowsModel::Shown EditorRowsModel::what_is_there() const
{
    const int person = is_of_person(m_look.list) ? m_bench.person() : -1;
    const int rows = open() ? row_count(file(), place(0)) : 0;
    return {.family = file().family.Surname_ID, .person = person, .rows = rows};
}

void EditorRowsModel::refresh(const QModelIndex& typing)
{
    if (const Shown now = what_is_there(); now != m_shown) {
        beginResetModel();
        m_shown = now;
        endResetModel();
        return;
    }
    // Cell by cell: the view puts the model's text into an open cell that it is told of.
    for (int row = 0; row < m_shown.rows; ++row)
        for (int column = 0; column < columnCount(); ++column)
            if (const QModelIndex changed = index(row, column); changed != typing)
                Q_EMIT dataChanged(changed, changed);
}

bool EditorRowsModel::editable() const
{
    const bool somebody = !is_of_person(m_look.list) || m_bench.person() >= 0;
    return m_bench.editor.may_edit() && open() && somebody;
}

int EditorRowsModel::typed_column() const
{
    const auto found = std::ranges::find_if(m_look.columns, is_typed, &RowColumn::cell);
    return found == m_look.columns.end() ? 0 : int(found - m_look.columns.begin());
}

int EditorRowsModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_shown.rows;
}

int EditorRowsModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_look.columns.size());
}

QVariant EditorRowsModel::data(const QModelIndex& index, int role) const
{
    // Between a change of the family and the refresh that follows there may be fewer rows than are shown.
    if (!checkIndex(index, CheckIndexOption::IndexIsValid) || index.row() >= row_count(file(), place(0)))
        return {};
    const Cell shown = cell(index.column());
    switch (role) {
    case Qt::DisplayRole:
    case Qt::EditRole:
        return cell_text(file(), place(index.row()), shown, m_bench.desk.office.day_order());
    case Qt::ToolTipRole:
        if (is_switch(shown) && editable())
            return shown == Cell::tagged ? u"Space tags it for filters and reports, or takes the tag away"_s
                                         : u"Space changes between active and potential"_s;
        return {};
    default:
        return {};
    }
}

QVariant EditorRowsModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Horizontal && role == Qt::DisplayRole)
        return QString::fromLatin1(m_look.columns.at(std::size_t(section)).caption);
    return {};
}

Qt::ItemFlags EditorRowsModel::flags(const QModelIndex& index) const
{
    const auto flags = QAbstractTableModel::flags(index);
    return index.isValid() && is_typed(cell(index.column())) && editable() ? flags | Qt::ItemIsEditable : flags;
}

bool EditorRowsModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (role != Qt::EditRole || !index.isValid() || !editable())
        return false;
    const RowPlace at = place(index.row());
    const Cell typed = cell(index.column());
    std::optional<core::Date> date;
    if (typed == Cell::date && !read_date(value.toString(), date))
        return false;
    change(at, index.column(), [&](FamilyFile& changed) {
        if (typed == Cell::date)
            set_date(changed, at, date);
        else
            set_words(changed, at, typed, people::tidy(value.toString()));
    });
    return true;
}

void EditorRowsModel::change(const RowPlace& place, int column, const std::function<void(FamilyFile&)>& make)
{
    m_bench.editor.change(u"%1 %2 %3 %4"_s.arg(QLatin1String(m_look.name)).arg(place.person).arg(place.row).arg(column),
                          make);
    m_bench.show_again();
}

bool EditorRowsModel::read_date(const QString& typed, std::optional<core::Date>& date) const
{
    const auto& office = m_bench.desk.office;
    date = typed_date(office, typed);
    if (date || typed.trimmed().isEmpty())
        return true;
    office.dialogue.show(core::bad_date_message(office.day_order()));
    return false;
}

bool EditorRowsModel::add_typed(const QStringList& texts)
{
    std::optional<core::Date> date;
    const int new_row = rowCount();
    const RowPlace at = place(new_row);
    const auto text_of = [&](Cell cell) {
        const auto found = std::ranges::find(m_look.typed, cell);
        return found == m_look.typed.end() ? QString() : people::tidy(texts.value(found - m_look.typed.begin()));
    };
    if (!editable() || texts.join(QString()).trimmed().isEmpty() || !read_date(text_of(Cell::date), date))
        return false;
    change(at, columnCount(), [&](FamilyFile& changed) {
        if (at.list == people::RowList::events)
            changed.events.push_back({date, text_of(Cell::event)});
        else
            changed.other_contacts.push_back({text_of(Cell::contact), text_of(Cell::phone)});
    });
    return true;
}

bool EditorRowsModel::switch_over(const QModelIndex& index)
{
    if (!index.isValid() || !editable())
        return false;
    const auto found = std::ranges::find_if(m_look.columns, is_switch, &RowColumn::cell);
    if (found == m_look.columns.end())
        return false;
    const RowPlace at = place(index.row());
    const Cell turned = found->cell;
    if (!can_switch(file(), at, turned))
        return false;
    change(at, int(found - m_look.columns.begin()),
           [&](FamilyFile& changed) { desktop::switch_over(changed, at, turned); });
    return true;
}

} // namespace kindrel::desktop

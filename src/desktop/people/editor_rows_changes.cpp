#include "desktop/people/editor_rows.h"

#include "desktop/people/editor_rows_model.h"
#include "desktop/shell/add_line.h"
#include "desktop/shell/in_place_editing.h"
#include "desktop/shell/item_picker.h"
#include "people/quick_add.h"

#include <QTableView>

#include <array>
#include <span>

// What keys and buttons do to the rows.
namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::LinkRow;
using people::MinistryState;
using people::RowList;

bool EditorRows::finish_typing()
{
    if (!m_cells->finish())
        return false;
    return !m_add_line || m_add_line->is_empty() || add_typed();
}

void EditorRows::done(bool made, int row)
{
    if (made) {
        m_bench.show_again();
        select(row);
    }
    m_table->setFocus();
}

void EditorRows::add()
{
    if (!m_model->editable() || !m_cells->finish())
        return;
    if (!m_add_line)
        pick();
    else if (m_add_line->is_empty() || !add_typed())
        m_add_line->focus_lacking_field();
}

std::vector<LinkRow> EditorRows::items_to_add() const
{
    static constexpr std::array plain{0};
    static constexpr std::array states{int(MinistryState::active), int(MinistryState::potential)};
    const auto types = m_look.list == RowList::ministries ? std::span<const int>(states) : std::span<const int>(plain);
    std::vector<LinkRow> items;
    for (const auto& item : people::read_setup_items(*m_bench.desk.office.session, *m_look.items))
        for (const int type : types)
            if (!item.not_active && !carries(m_bench.editor.file(), m_model->place(0), item.key, type))
                items.push_back({item.key, item.text, type, {}, {}, false});
    return items;
}

void EditorRows::pick()
{
    const auto offered = items_to_add();
    std::vector<PickerItem> shown;
    for (const LinkRow& item : offered)
        shown.push_back({int(shown.size()), item.type == 0 ? item.text : ministry_words(item.text, item.type)});
    auto* picker =
        new ItemPicker(u"Add: %1"_s.arg(QLatin1String(m_look.one)), std::move(shown),
                       u"Nothing is left to add. What can be chosen here stands in the setup lists."_s, this);
    picker->setAttribute(Qt::WA_DeleteOnClose);
    if (m_look.list == RowList::occupations)
        picker->allow_new();
    connect(picker, &ItemPicker::chosen, this, [this, offered](int place) { add_item(offered[std::size_t(place)]); });
    connect(picker, &ItemPicker::new_wanted, this, &EditorRows::add_new_item);
    picker->open();
}

void EditorRows::add_item(const LinkRow& item)
{
    const bool added = m_bench.editor.add_item(m_model->place(-1), item.item, item.text, item.type);
    done(added, m_model->rowCount());
    if (!added)
        return;
    if (const int typed = m_model->typed_column(); is_typed(m_model->cell(typed))) {
        m_table->setCurrentIndex(m_table->currentIndex().siblingAtColumn(typed));
        open_cell();
    }
}

void EditorRows::add_new_item(const QString& text)
{
    if (const auto key = people::add_occupation(m_bench.desk.office, text))
        add_item({*key, people::tidy(text), 0, {}, {}, false});
}

bool EditorRows::add_typed()
{
    const bool added = m_model->add_typed(m_add_line->texts());
    if (added) {
        m_add_line->clear();
        select(m_model->rowCount() - 1);
        m_add_line->focus_field(0);
    } else if (!m_add_line->is_empty()) {
        const bool dated = m_look.typed.back() == Cell::date;
        m_add_line->focus_field(dated ? int(m_look.typed.size()) - 1 : 0);
    }
    return added;
}

void EditorRows::remove()
{
    const int row = current();
    if (m_cells->finish())
        done(m_bench.editor.remove_row(m_model->place(row)), row);
}

void EditorRows::move_up()
{
    const int row = current();
    if (m_cells->finish())
        done(m_bench.editor.move_row_up(m_model->place(row)), row - 1);
}

void EditorRows::move_down()
{
    const int row = current();
    if (m_cells->finish())
        done(m_bench.editor.move_row_down(m_model->place(row)), row + 1);
}

void EditorRows::set_today()
{
    const int row = current();
    if (m_cells->finish())
        done(m_bench.editor.set_today(m_model->place(row)), row);
}

void EditorRows::turn_over()
{
    (void)m_model->switch_over(m_table->currentIndex());
}

void EditorRows::open_cell()
{
    QModelIndex cell = m_table->currentIndex();
    if (!cell.isValid() || !m_cells->finish())
        return;
    if (is_switch(m_model->cell(cell.column())))
        return turn_over();
    if (!(cell.flags() & Qt::ItemIsEditable))
        cell = cell.siblingAtColumn(m_model->typed_column());
    if (!(cell.flags() & Qt::ItemIsEditable))
        return;
    m_table->setFocus();
    m_table->setCurrentIndex(cell);
    m_table->edit(cell);
}

} // namespace kindrel::desktop

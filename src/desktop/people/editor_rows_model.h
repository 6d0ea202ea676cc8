#pragma once

#include "desktop/people/editor_row_lists.h"
#include "desktop/people/editor_tab.h"

#include <QAbstractTableModel>

namespace kindrel::desktop {

/// One list of rows of the family in the editor, or of the person chosen in it. What is typed goes through the editor;
/// a date that cannot be read is told and refused.
class EditorRowsModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    EditorRowsModel(EditorBench& bench, const RowListLook& look, QObject* parent);

    /// The family or the chosen person may be another one. `typing` is the cell that is being typed into; it keeps its
    /// text as long as it is the same person's.
    void refresh(const QModelIndex& typing);
    /// Closed to the person at the keyboard, or to this record.
    [[nodiscard]] bool editable() const;
    [[nodiscard]] bool open() const { return file().access.*m_look.open; }
    [[nodiscard]] people::RowPlace place(int row) const { return {m_look.list, m_bench.person(), row}; }
    [[nodiscard]] Cell cell(int column) const { return m_look.columns.at(std::size_t(column)).cell; }
    /// The first column that is typed, 0 where there is none.
    [[nodiscard]] int typed_column() const;

    /// An empty text is no date, "t" is today. False, after saying why, when the date cannot be read.
    [[nodiscard]] bool read_date(const QString& typed, std::optional<core::Date>& date) const;
    /// At the end of a list whose rows are typed. `texts` are in the order of typing.
    [[nodiscard]] bool add_typed(const QStringList& texts);
    /// Turns tag or ministry state over; false where there is nothing to turn.
    [[nodiscard]] bool switch_over(const QModelIndex& index);

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    [[nodiscard]] Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;

private:
    /// Whose rows these are, and how many.
    struct Shown
    {
        int family = 0;
        int person = 0;
        int rows = 0;
        friend bool operator==(const Shown&, const Shown&) = default;
    };

    [[nodiscard]] const people::FamilyFile& file() const { return m_bench.editor.file(); }
    [[nodiscard]] Shown what_is_there() const;
    void change(const people::RowPlace& place, int column, const std::function<void(people::FamilyFile&)>& make);

    EditorBench& m_bench;
    const RowListLook& m_look;
    Shown m_shown;
};

} // namespace kindrel::desktop

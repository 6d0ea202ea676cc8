#pragma once

#include <QAbstractTableModel>

#include <optional>

namespace kindrel::desktop {

/// One row of an ordered list as it is shown.
struct ListRow
{
    QStringList texts;             ///< One for each field.
    QString remark = {};           ///< What sets the item apart; its row then stands back.
    std::optional<int> users = {}; ///< Nothing for an item that is not stored yet.
};

/// What the columns of an ordered list are called.
struct ListCaptions
{
    QStringList fields;  ///< What is typed of an item, at least one.
    QString remark = {}; ///< Without a caption there is no such column; the same for the users.
    QString users = {};
};

/// The list behind an editor. What may stand in the way of a change is told by the change itself, which then returns
/// false and leaves the list as it was. An index of -1 means that nothing is chosen.
class ListOperations
{
public:
    virtual ~ListOperations() = default;

    [[nodiscard]] virtual ListCaptions captions() const = 0;
    [[nodiscard]] virtual int count() const = 0;
    [[nodiscard]] virtual ListRow row(int index) const = 0;
    /// The line below the list.
    [[nodiscard]] virtual QString count_line() const = 0;

    /// At the end of the list. `texts` are one for each field, here and in rename().
    [[nodiscard]] virtual bool add(const QStringList& texts) = 0;
    /// The place of the text for which add() refused; 0 when it is none in particular.
    [[nodiscard]] virtual int faulty_field(const QStringList&) const { return 0; }
    [[nodiscard]] virtual bool rename(int index, const QStringList& texts) = 0;
    [[nodiscard]] virtual bool remove(int index) = 0;
    [[nodiscard]] virtual bool move_up(int index) = 0;
    [[nodiscard]] virtual bool move_down(int index) = 0;

    /// Whether the list can be sorted and imported into.
    [[nodiscard]] virtual bool has_tools() const { return true; }
    [[nodiscard]] virtual bool sort() { return false; }
    /// What the import brought, in words; nothing when there was none.
    [[nodiscard]] virtual std::optional<QString> import() { return {}; }
};

/// Shows an ordered list as a table: its fields, which can be edited in place, then remark and users.
class OrderedListModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    explicit OrderedListModel(ListOperations& list, QObject* parent = nullptr);

    /// The list was changed.
    void refresh();

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    [[nodiscard]] Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;

private:
    [[nodiscard]] bool is_field(int column) const { return column < m_fields; }
    [[nodiscard]] bool is_users(int column) const { return m_has_users && column == int(m_headings.size()) - 1; }
    [[nodiscard]] QString text_of(const ListRow& row, int column) const;
    [[nodiscard]] QVariant colour_of(const ListRow& row, int column) const;

    ListOperations& m_list;
    int m_fields;
    bool m_has_users;
    QStringList m_headings;
};

} // namespace kindrel::desktop

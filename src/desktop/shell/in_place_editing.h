#pragma once

#include <QPersistentModelIndex>
#include <QPointer>
#include <QStyledItemDelegate>

class QAbstractItemView;
class QLineEdit;

namespace kindrel::desktop {

/// Edits the cells of a list in place. A text that the model refuses stays where it was typed, selected and with the
/// cursor in it; only Escape gives it up.
class InPlaceEditing : public QStyledItemDelegate
{
    Q_OBJECT

public:
    /// Makes itself the view's delegate.
    explicit InPlaceEditing(QAbstractItemView& view);

    /// Hands the text of an open cell to the model and closes the cell; false when it was refused.
    [[nodiscard]] bool finish();
    /// Closes an open cell and drops what was typed into it.
    void give_up();
    /// A cell is open and holds another text than the model.
    [[nodiscard]] bool altered() const;

    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    /// The text is handed over before the cell closes, see finish().
    void setModelData(QWidget*, QAbstractItemModel*, const QModelIndex&) const override {}

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    [[nodiscard]] bool hand_over();
    [[nodiscard]] bool left_by(const QEvent& event) const;
    void come_back(const QString& refused);

    QAbstractItemView& m_view;
    bool m_handing_over = false;
    // The view opens a cell through a function that is const.
    mutable QPointer<QLineEdit> m_cell;
    mutable QPersistentModelIndex m_index;
};

} // namespace kindrel::desktop

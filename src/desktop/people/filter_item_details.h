#pragma once

#include "people/filter.h"

#include <QWidget>

class QComboBox;
class QLabel;
class QVBoxLayout;

namespace kindrel::desktop {

/// What a filter asks of an item beyond that somebody carries it: the ministry's state, the mark of a date, the value
/// of a flexi field. Only what the kind has is there.
class FilterItemDetails : public QWidget
{
    Q_OBJECT

public:
    explicit FilterItemDetails(const people::FilterKindRow& kind, QWidget* parent = nullptr);

    /// `values` are those of a flexi field.
    void show_item(const people::FilterItem& item, const QStringList& values);
    void show_nothing();
    /// Writes what is chosen into the item.
    void read_into(people::FilterItem& item) const;
    /// The cursor goes to an empty value.
    void ask_for_value();

Q_SIGNALS:
    /// Something was chosen by the person at the keyboard.
    void chosen();
    /// One more value of the same flexi field is to be asked for.
    void another_wanted();

private:
    [[nodiscard]] QComboBox* add_choice(QVBoxLayout& column, const QString& name, const QString& caption,
                                        const QStringList& words);
    void add_value(QVBoxLayout& column);
    [[nodiscard]] std::optional<QString> value() const;

    QLabel* m_title;
    QWidget* m_fields;
    QComboBox* m_ministry = nullptr;
    QComboBox* m_marks = nullptr;
    QComboBox* m_value = nullptr;
};

/// The words of an item's further wishes, each after a comma: ", potential", ", marked", ", = Piano or = Violin". The
/// criteria are those of one item and differ in the value alone.
[[nodiscard]] QString detail_words(const std::vector<people::FilterItem>& criteria);

} // namespace kindrel::desktop

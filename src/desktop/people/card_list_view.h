#pragma once

#include "desktop/people/card_text.h"

#include <QWidget>

class QLabel;
class QTableWidget;

namespace kindrel::desktop {

/// A heading with a list to be read and copied; says so when there is nothing, or when the section is closed.
class CardListView : public QWidget
{
    Q_OBJECT

public:
    /// Without column words the list has one column and no heading row.
    CardListView(const QString& title, const std::vector<const char*>& columns, QWidget* parent = nullptr);

    void show_rows(const CardRows& rows);
    void show_closed();

private:
    void say(const QString& words);

    QTableWidget* m_table;
    QLabel* m_words;
};

/// Instead of a section that booking has closed.
[[nodiscard]] QString closed_words();

} // namespace kindrel::desktop

#include "desktop/people/card_list_view.h"

#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QHeaderView>
#include <QLabel>
#include <QTableWidget>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int first_column_width = 170;
/// With more columns than these, all but the first take what they need.
constexpr std::size_t most_wide_columns = 3;

QStringList words_of(const std::vector<const char*>& columns)
{
    QStringList words;
    for (const char* column : columns)
        words << QString::fromLatin1(column);
    return words;
}

} // namespace

QString closed_words()
{
    return u"This section of the record is closed."_s;
}

CardListView::CardListView(const QString& title, const std::vector<const char*>& columns, QWidget* parent)
    : QWidget(parent), m_table(new QTableWidget(0, std::max(1, int(columns.size())))), m_words(new QLabel)
{
    make_row_list(*m_table);
    m_table->setObjectName(title);
    m_table->setAccessibleName(title);
    m_table->setWordWrap(true);
    m_table->setHorizontalHeaderLabels(words_of(columns));
    m_table->horizontalHeader()->setVisible(columns.size() > 1);
    m_table->verticalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    for (std::size_t column = 0; column + 1 < columns.size(); ++column)
        m_table->setColumnWidth(int(column), first_column_width);
    if (columns.size() > most_wide_columns) {
        m_table->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
        m_table->horizontalHeader()->setSectionResizeMode(0, QHeaderView::Stretch);
    }
    dress(*m_words, TextSize::secondary);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(space::field / 2);
    layout->addWidget(make_heading(title));
    layout->addWidget(m_words);
    layout->addWidget(m_table, 1);
    layout->addStretch(0);
    say(u"None"_s);
}

void CardListView::say(const QString& words)
{
    m_words->setText(words);
    m_words->setVisible(!words.isEmpty());
    m_table->setVisible(words.isEmpty());
}

void CardListView::show_rows(const CardRows& rows)
{
    m_table->setRowCount(int(rows.size()));
    for (int row = 0; row < int(rows.size()); ++row)
        for (int column = 0; column < m_table->columnCount(); ++column)
            m_table->setItem(row, column, new QTableWidgetItem(rows[std::size_t(row)].value(column)));
    say(rows.empty() ? u"None"_s : QString());
}

void CardListView::show_closed()
{
    m_table->setRowCount(0);
    say(closed_words());
}

} // namespace kindrel::desktop

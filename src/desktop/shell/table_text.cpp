#include "desktop/shell/table_text.h"

#include "core/files.h"

#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QItemSelectionModel>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

QString quoted(QString text)
{
    const bool needed = std::any_of(text.cbegin(), text.cend(),
                                    [](QChar c) { return c == u',' || c == u'"' || c == u'\n' || c == u'\r'; });
    return needed ? u'"' + text.replace(u'"', u"\"\""_s) + u'"' : text;
}

QStringList headings(const QAbstractItemModel& model)
{
    QStringList words;
    for (int column = 0; column < model.columnCount(); ++column)
        words << model.headerData(column, Qt::Horizontal).toString();
    return words;
}

QStringList row_texts(const QAbstractItemModel& model, int row)
{
    QStringList words;
    for (int column = 0; column < model.columnCount(); ++column)
        words << model.index(row, column).data().toString();
    return words;
}

QString csv_line(QStringList words)
{
    std::transform(words.cbegin(), words.cend(), words.begin(), quoted);
    return words.join(u',') + u"\r\n"_s;
}

} // namespace

QByteArray csv_of(const QAbstractItemModel& model)
{
    QString text = csv_line(headings(model));
    for (int row = 0; row < model.rowCount(); ++row)
        text += csv_line(row_texts(model, row));
    return "\xEF\xBB\xBF" + text.toUtf8();
}

QString tabbed_text(const QAbstractItemView& view)
{
    QList<int> rows;
    const auto chosen = view.selectionModel()->selectedIndexes();
    for (const auto& index : chosen)
        if (rows.isEmpty() || rows.last() != index.row())
            rows << index.row();
    std::sort(rows.begin(), rows.end());
    rows.erase(std::unique(rows.begin(), rows.end()), rows.end());
    QStringList lines;
    for (const int row : rows)
        lines << row_texts(*view.model(), row).join(u'\t');
    return lines.join(u'\n');
}

void save_as_csv(const QAbstractItemModel& model, const QString& suggested, core::Dialogue& dialogue)
{
    const auto file = dialogue.choose_file({.title = u"Save this list"_s,
                                            .filter = u"Comma-separated text (*.csv)"_s,
                                            .suggested = suggested + u".csv"_s,
                                            .kind = core::FileQuestion::Kind::save});
    if (!file)
        return;
    try {
        core::write_file(*file, csv_of(model));
    } catch (const core::FileError& error) {
        dialogue.show({u"The list could not be saved."_s, error.text()});
    }
}

void enable_copy(QAbstractItemView& view)
{
    auto* copy = new QAction(u"Copy"_s, &view);
    copy->setShortcut(QKeySequence::Copy);
    copy->setShortcutContext(Qt::WidgetShortcut);
    QObject::connect(copy, &QAction::triggered, &view,
                     [&view] { QApplication::clipboard()->setText(tabbed_text(view)); });
    view.addAction(copy);
}

} // namespace kindrel::desktop

#include "apps/ctl_listing.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStringList>

#include <algorithm>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

QString shown(const QJsonValue& value)
{
    if (value.isBool())
        return value.toBool() ? u"yes"_s : QString();
    return value.isDouble() ? QString::number(value.toInteger()) : value.toString();
}

/// As a cell of comma-separated values.
QString quoted(QString text)
{
    const bool needed = std::ranges::any_of(text, [](QChar c) { return u",\"\r\n"_s.contains(c); });
    return needed ? u'"' + text.replace(u'"', u"\"\""_s) + u'"' : text;
}

void print_line(QTextStream& out, const QStringList& cells, const std::vector<qsizetype>& widths)
{
    QString line;
    for (std::size_t i = 0; i < widths.size(); ++i)
        line += cells[qsizetype(i)].leftJustified(widths[i] + 2);
    while (line.endsWith(u' '))
        line.chop(1);
    out << line << '\n';
}

} // namespace

void Listing::print(QTextStream& out, Format format) const
{
    switch (format) {
    case Format::text:
        print_text(out);
        break;
    case Format::csv:
        print_csv(out);
        break;
    case Format::json:
        print_json(out);
        break;
    }
    out.flush();
}

/// The names stand in the first line; lines end in CR LF.
void Listing::print_csv(QTextStream& out) const
{
    QStringList names;
    for (const auto& column : m_columns)
        names += quoted(column.name);
    out << names.join(u',') << "\r\n";
    for (const auto& row : m_rows) {
        QStringList cells;
        for (const auto& value : row)
            cells += quoted(shown(value));
        out << cells.join(u',') << "\r\n";
    }
}

void Listing::print_json(QTextStream& out) const
{
    QJsonArray array;
    for (const auto& row : m_rows) {
        QJsonObject object;
        for (std::size_t i = 0; i < m_columns.size(); ++i)
            object.insert(m_columns[i].name, row[i]);
        array.append(object);
    }
    out << QJsonDocument(array).toJson();
}

void Listing::print_text(QTextStream& out) const
{
    QStringList headings;
    for (const auto& column : m_columns)
        headings += column.heading;
    std::vector<QStringList> lines{headings};
    for (const auto& row : m_rows) {
        auto& line = lines.emplace_back();
        for (const auto& value : row)
            line += shown(value);
    }
    std::vector<qsizetype> widths(m_columns.size(), 0);
    for (const auto& line : lines) {
        for (std::size_t i = 0; i < widths.size(); ++i)
            widths[i] = std::max(widths[i], line[qsizetype(i)].size());
    }
    for (const auto& line : lines)
        print_line(out, line, widths);
}

} // namespace kindrel::apps

#pragma once

#include <QJsonValue>
#include <QTextStream>

#include <vector>

namespace kindrel::apps {

/// A list as a person reads it, in aligned columns, or as a program does: in JSON or as comma-separated values.
class Listing
{
public:
    enum class Format { text, csv, json };
    struct Column
    {
        QString name; ///< In JSON.
        QString heading;
    };
    using Row = std::vector<QJsonValue>;

    explicit Listing(std::vector<Column> columns) : m_columns(std::move(columns)) {}
    void add(Row row) { m_rows.push_back(std::move(row)); }
    void print(QTextStream& out, Format format) const;
    void print(QTextStream& out, bool json) const { print(out, json ? Format::json : Format::text); }

private:
    void print_json(QTextStream& out) const;
    void print_csv(QTextStream& out) const;
    void print_text(QTextStream& out) const;

    std::vector<Column> m_columns;
    std::vector<Row> m_rows;
};

} // namespace kindrel::apps

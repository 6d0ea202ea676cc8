#include "core/dialect.h"

#include <QRegularExpression>

namespace kindrel::core {

using namespace Qt::StringLiterals;

QString for_postgres(const QString& statement)
{
    QString translated;
    translated.reserve(statement.size() + 16);
    int values = 0;
    bool in_text = false;
    for (qsizetype i = 0; i < statement.size(); ++i) {
        const QChar c = statement[i];
        if (c == u'\'')
            in_text = !in_text;
        if (in_text || (c != u'[' && c != u'?')) {
            translated += c;
        } else if (c == u'?') {
            translated += u'$' + QString::number(++values);
        } else {
            const auto close = statement.indexOf(u']', i);
            Q_ASSERT(close > i);
            translated += u'"' + statement.mid(i + 1, close - i - 1).toLower() + u'"';
            i = close;
        }
    }
    return translated;
}

QString schema_for_postgres(const QString& statement)
{
    static const QRegularExpression strict(u"\\)\\s*STRICT\\s*;?\\s*$"_s);
    QString translated = for_postgres(statement);
    if (!translated.startsWith(u"CREATE TABLE"_s))
        return translated;
    static const QRegularExpression integer(u"\\bINTEGER\\b"_s);
    static const QRegularExpression blob(u"\\bBLOB\\b"_s);
    static const QRegularExpression text(u"\\bTEXT\\b"_s);
    // Both engines order texts by their bytes: what sorts by the reader's alphabet has a sort key.
    return translated.replace(strict, u")"_s)
        .replace(integer, u"bigint"_s)
        .replace(blob, u"bytea"_s)
        .replace(text, u"text COLLATE \"C\""_s);
}

QString temporary_table(const QString& table, const QStringList& columns)
{
    QStringList definitions;
    for (const auto& column : columns)
        definitions += u"[%1] bigint"_s.arg(column);
    definitions.front() = u"[%1] INTEGER PRIMARY KEY"_s.arg(columns.front());
    return u"CREATE TEMPORARY TABLE IF NOT EXISTS [%1] (%2)"_s.arg(table, definitions.join(u','));
}

QStringList split_script(const QString& script)
{
    QStringList statements;
    QString statement;
    for (const auto& line : script.split(u'\n')) {
        const auto comment = line.indexOf(u"--"_s);
        const auto code = (comment < 0 ? line : line.left(comment)).trimmed();
        if (code.isEmpty())
            continue;
        statement += statement.isEmpty() ? code : u'\n' + code;
        if (!code.endsWith(u';'))
            continue;
        statement.chop(1);
        statements += statement;
        statement.clear();
    }
    if (!statement.isEmpty())
        statements += statement;
    return statements;
}

} // namespace kindrel::core

#include "core/backup_manifest.h"
#include "core/mender_checks.h"
#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QRegularExpression>
#include <QTemporaryDir>

#include <algorithm>
#include <map>

// What the engine says of its file, and the schema beside the one that the program makes.
namespace kindrel::core::mender_checks {

using namespace Qt::StringLiterals;

namespace {

QStringList engine_faults(Session& session)
{
    QStringList faults;
    try {
        auto rows = session.select(u"PRAGMA integrity_check;"_s);
        for (const Row& row : rows)
            faults += row.text(Column{0}).split(u'\n');
    } catch (const FileDatabaseError& error) {
        if (error.trouble() != FileTrouble::damage)
            throw;
        faults += error.text();
    }
    faults.removeIf([](const QString& line) { return line == u"ok" || line.startsWith(u"*** "); });
    return faults;
}

bool is_of_index(const QString& fault)
{
    static const QRegularExpression spoken(u"(missing from|entries in|non-unique entry in) index "_s);
    return fault.contains(spoken);
}

/// The schema of an empty church as the program lays it.
class Model
{
public:
    Model() : m_session(create_sqlite(m_folder.filePath(u"model.kdl"_s))) { create_schema(*m_session); }
    [[nodiscard]] Session& session() { return *m_session; }

private:
    QTemporaryDir m_folder;
    std::unique_ptr<Session> m_session;
};

/// A table, stored query or index.
struct Piece
{
    QString type, name, statement;
};

/// In the order in which they were made. A server does not tell the statements as they were given.
std::vector<Piece> pieces_of(Session& session)
{
    const QString of_server = u"SELECT 'table',[tablename],'' FROM [pg_tables] WHERE [schemaname]='public' UNION ALL "
                              "SELECT 'view',[viewname],'' FROM [pg_views] WHERE [schemaname]='public' UNION ALL "
                              "SELECT 'index',[indexname],'' FROM [pg_indexes] WHERE [schemaname]='public';"_s;
    const QString of_file =
        u"SELECT [type],[name],[sql] FROM [sqlite_master] WHERE [sql] IS NOT NULL ORDER BY [rowid];"_s;
    auto rows = session.select(session.engine() == EngineKind::postgres ? of_server : of_file);
    std::vector<Piece> pieces;
    for (const Row& row : rows)
        pieces.push_back({row.text(Column{0}), row.text(Column{1}), row.text(Column{2})});
    return pieces;
}

/// "name type" of every field, in small letters, sorted.
QStringList fields_of(Session& session, const QString& table)
{
    auto rows = session.select(u"SELECT [name],[type],[pk] FROM pragma_table_info('%1');"_s.arg(table));
    QStringList fields;
    for (const Row& row : rows)
        fields += u"%1 %2 %3"_s.arg(row.text(Column{0}), row.text(Column{1}), row.text(Column{2})).toLower();
    fields.sort();
    return fields;
}

enum class Fit { right, missing, different };

/// `found` is null where the church has no such piece.
Fit fit_of(const Piece& wanted, const Piece* found, Session& model, Session& church)
{
    if (!found)
        return Fit::missing;
    if (church.engine() == EngineKind::postgres)
        return Fit::right;
    if (wanted.type != u"table")
        return found->statement.simplified() == wanted.statement.simplified() ? Fit::right : Fit::different;
    const auto fields = fields_of(church, wanted.name);
    const auto lacking = [&](const QString& field) {
        return !fields.contains(field);
    };
    return std::ranges::any_of(fields_of(model, wanted.name), lacking) ? Fit::different : Fit::right;
}

/// What does not fit, tables first: their indexes and stored queries are made on them.
std::vector<std::pair<Piece, Fit>> misfits(Session& church)
{
    Model model;
    std::map<QString, Piece> there;
    for (const auto& piece : pieces_of(church))
        there.emplace(piece.name.toLower(), piece);
    std::vector<std::pair<Piece, Fit>> found;
    for (const auto& piece : pieces_of(model.session())) {
        const auto same = there.find(piece.name.toLower());
        const auto fit = fit_of(piece, same == there.end() ? nullptr : &same->second, model.session(), church);
        if (fit != Fit::right)
            found.emplace_back(piece, fit);
    }
    std::ranges::stable_partition(found, [](const auto& misfit) { return misfit.first.type == u"table"; });
    return found;
}

std::vector<Piece> lock_pieces()
{
    Model model;
    auto pieces = pieces_of(model.session());
    std::erase_if(pieces, [](const Piece& piece) {
        return piece.type != u"table" || !piece.statement.contains(u"[workstation]") ||
               !piece.statement.contains(u"[taken]");
    });
    return pieces;
}

/// The fields of a key that no two rows may share.
struct Unique
{
    QString table;
    QStringList fields;
};

std::vector<Unique> uniques_of(Session& model)
{
    auto rows =
        model.select(u"SELECT t.[name],i.[name],f.[name] FROM [sqlite_master] t, pragma_index_list(t.[name]) i, "
                     "pragma_index_info(i.[name]) f WHERE t.[type]='table' AND i.[unique]=1 "
                     "ORDER BY t.[name],i.[name],f.[seqno];"_s);
    std::map<QString, Unique> found;
    for (const Row& row : rows) {
        auto& unique = found[row.text(Column{0}) + u' ' + row.text(Column{1})];
        unique.table = row.text(Column{0});
        unique.fields += row.text(Column{2});
    }
    std::vector<Unique> all;
    for (auto& [name, unique] : found)
        all.push_back(std::move(unique));
    return all;
}

QStringList columns_of(Session& session, const QString& table)
{
    const auto rows = session.select(u"SELECT * FROM [%1] WHERE 1=0;"_s.arg(table));
    QStringList columns;
    for (int index = 0; index < rows.column_count(); ++index)
        columns += rows.column_name(index);
    return columns;
}

/// The values of these fields that several rows have.
std::vector<std::vector<Value>> shared_values(Session& session, const QString& table, const QStringList& fields,
                                              const QString& where = {})
{
    const QString list = u"[%1]"_s.arg(fields.join(u"],["_s));
    auto rows =
        session.select(u"SELECT %1 FROM [%2]%3 GROUP BY %1 HAVING COUNT(*)>1 ORDER BY %1;"_s.arg(list, table, where));
    std::vector<std::vector<Value>> found;
    for (const Row& row : rows) {
        auto& values = found.emplace_back();
        for (int index = 0; index < fields.size(); ++index)
            values.push_back(row.value(Column{index}));
    }
    return found;
}

std::vector<std::vector<Value>> broken_keys(Session& session, const Unique& unique)
{
    const QString where = u" WHERE [%1] IS NOT NULL"_s.arg(unique.fields.join(u"] IS NOT NULL AND ["_s));
    return shared_values(session, unique.table, unique.fields, where);
}

QString shown(const std::vector<Value>& values)
{
    QStringList words;
    for (const auto& value : values) {
        if (const auto* number = std::get_if<qint64>(&value))
            words += QString::number(*number);
        else if (const auto* text = std::get_if<QString>(&value))
            words += *text;
    }
    return words.join(u" / "_s);
}

/// Leaves one of the rows that are the same in everything.
void leave_one(Session& session, const QString& table, const QStringList& columns, const std::vector<Value>& values)
{
    session.execute_with(u"DELETE FROM [%1] WHERE [%2] IS NOT DISTINCT FROM ?;"_s.arg(
                             table, columns.join(u"] IS NOT DISTINCT FROM ? AND ["_s)),
                         values);
    session.insert(table, columns, {&values, 1});
}

QString verb(int count)
{
    return count == 1 ? u"is"_s : u"are"_s;
}

} // namespace

int number_from(Session& session, const QString& statement)
{
    auto rows = session.select(statement);
    const Row* row = rows.first();
    return row ? row->integer(Column{0}) : 0;
}

QStringList lock_tables()
{
    QStringList names;
    for (const auto& piece : lock_pieces())
        names += piece.name;
    return names;
}

void make_lock_tables(MenderPlace& place)
{
    const QStringList there = tables_of(*place.session);
    for (const auto& piece : lock_pieces()) {
        if (!there.contains(piece.name, Qt::CaseInsensitive))
            place.session->run_script(piece.statement + u';');
    }
}

QString in_words(QStringView table)
{
    static const std::map<QString, QString> called{
        {u"tbl_surname"_s, u"families"_s},
        {u"tbl_people"_s, u"people"_s},
        {u"tbl_address"_s, u"addresses"_s},
        {u"tbl_personal_details"_s, u"personal details"_s},
        {u"tbl_pin"_s, u"giving numbers"_s},
        {u"tbl_group"_s, u"group memberships"_s},
        {u"tbl_finance_data"_s, u"giving amounts"_s},
        {u"tbl_visitation"_s, u"visitation notes"_s},
        {u"tbl_startup"_s, u"settings"_s},
    };
    if (const auto found = called.find(table.toString().toLower()); found != called.end())
        return found->second;
    return table.mid(4).toString().replace(u'_', u' ').toLower();
}

QStringList faults_of_file(Session& session)
{
    auto faults = engine_faults(session);
    faults.removeIf(is_of_index);
    return faults;
}

Findings examine_engine(MenderPlace& place)
{
    if (place.session->engine() != EngineKind::sqlite)
        return {};
    const auto faults = engine_faults(*place.session);
    const auto of_indexes = static_cast<int>(std::ranges::count_if(faults, is_of_index));
    const auto others = static_cast<int>(faults.size()) - of_indexes;
    Findings findings;
    if (others > 0)
        findings.push_back(
            {u"damaged"_s,
             u"The database file is damaged in %1: %2"_s.arg(counted(others, u"place"_s, u"places"_s),
                                                             faults_of_file(*place.session).first()),
             others, Cure::recover,
             u"Put back a backup, or let what can still be read be recovered into a new church file."_s});
    if (of_indexes > 0)
        findings.push_back({u"indexes"_s,
                            u"An index of the database does not fit its table in %1."_s.arg(
                                counted(of_indexes, u"place"_s, u"places"_s)),
                            of_indexes, Cure::mend, u"The indexes are made again from the tables."_s});
    return findings;
}

void mend_engine(MenderPlace& place)
{
    Session& session = *place.session;
    if (session.engine() != EngineKind::sqlite || std::ranges::none_of(engine_faults(session), is_of_index))
        return;
    try {
        Transaction attempt(session);
        session.execute(u"REINDEX;"_s);
        attempt.commit();
    } catch (const DatabaseError& error) {
        if (!error.constraint_broken()) // Rows that break a key are told apart from it.
            throw;
    }
}

Findings examine_schema(MenderPlace& place)
{
    Findings findings;
    for (const auto& [piece, fit] : misfits(*place.session)) {
        const QString state = fit == Fit::missing ? u"is missing"_s : u"is not as the program makes it"_s;
        if (piece.type == u"table" && fit == Fit::different)
            findings.push_back({u"schema"_s, u"The table '%1' lacks fields."_s.arg(piece.name), 1, Cure::recover,
                                u"Recover the church into a new file, which has every field."_s});
        else if (piece.type == u"table")
            findings.push_back({u"schema"_s, u"The table '%1' is missing."_s.arg(piece.name), 1, Cure::mend,
                                u"An empty one is made. What it held can only come from a backup."_s});
        else
            findings.push_back(
                {u"schema"_s,
                 u"The %1 '%2' %3."_s.arg(piece.type == u"view" ? u"stored query"_s : u"index"_s, piece.name, state), 1,
                 Cure::mend, u"It is made again; no record changes."_s});
    }
    return findings;
}

void mend_schema(MenderPlace& place)
{
    for (const auto& [piece, fit] : misfits(*place.session)) {
        if (piece.type == u"table" && fit == Fit::different)
            continue;
        try {
            Transaction attempt(*place.session);
            if (fit == Fit::different)
                place.session->execute(u"DROP %1 [%2];"_s.arg(piece.type, piece.name));
            place.session->run_script(piece.statement + u';');
            attempt.commit();
        } catch (const DatabaseError& error) {
            if (!error.constraint_broken()) // Rows that break a key are told apart from it.
                throw;
        }
    }
}

Findings examine_doubles(MenderPlace& place)
{
    Model model;
    Findings findings;
    for (const auto& unique : uniques_of(model.session())) {
        Session& session = *place.session;
        const auto broken = broken_keys(session, unique);
        if (broken.empty())
            continue;
        const auto all = static_cast<int>(broken.size());
        const auto same =
            static_cast<int>(shared_values(session, unique.table, columns_of(session, unique.table)).size());
        if (same > 0)
            findings.push_back({u"doubles"_s,
                                u"%1 in '%2' %3 there more than once, the same in everything."_s.arg(
                                    counted(same, u"entry"_s, u"entries"_s), in_words(unique.table), verb(same)),
                                same, Cure::mend, u"One of each stays."_s});
        if (all > same)
            findings.push_back({u"doubles"_s,
                                u"%1 in '%2' %3 there more than once with different content (the first: %4)."_s.arg(
                                    counted(all - same, u"entry"_s, u"entries"_s), in_words(unique.table),
                                    verb(all - same), shown(broken.front())),
                                all - same, Cure::by_hand,
                                u"Change or remove all but one of each in Kindrel, then mend again."_s});
    }
    return findings;
}

void mend_doubles(MenderPlace& place)
{
    Model model;
    Session& session = *place.session;
    QStringList lost;
    for (const auto& [piece, fit] : misfits(session)) {
        if (piece.type == u"table" && fit == Fit::missing)
            lost += piece.name.toLower();
    }
    for (const auto& unique : uniques_of(model.session())) {
        if (lost.contains(unique.table.toLower()) || broken_keys(session, unique).empty())
            continue;
        const auto columns = columns_of(session, unique.table);
        for (const auto& values : shared_values(session, unique.table, columns))
            leave_one(session, unique.table, columns, values);
    }
}

} // namespace kindrel::core::mender_checks

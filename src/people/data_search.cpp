#include "people/data_search.h"

#include "core/entry.h"
#include "people/pins.h"

#include <QDateTime>
#include <QDirIterator>
#include <QHash>
#include <QRegularExpression>

#include <algorithm>
#include <functional>
#include <stdexcept>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Column;

/// What stands before a part's own columns.
enum Fixed {
    key_of_family,
    key_of_person,
    surname,
    condition,
    given,
    preferred,
    preferred_hidden,
    own_surname,
    own_surname_hidden,
    active,
    deceased,
    archived,
    privacy,
    prospect,
    contact,
    hidden,
    first_own
};

QString latin(const char* text)
{
    return QString::fromLatin1(text);
}

/// The rows of a part as v, with the people who have them as p and the order that a list of them has.
struct Source
{
    const char* key;
    const char* files_table; ///< Temporary: the keys of those who have a file.
    const char16_t* joined;
    const char16_t* order;
};

/// Families stand as f with the person at their head.
constexpr Source sources[]{
    {"person_id", "work_people_with_file",
     u"INNER JOIN [tbl_people] p ON p.[person_id]=v.[person_id] "
     "INNER JOIN [tbl_surname] f ON f.[Surname_ID]=p.[Surname_ID] "
     "LEFT JOIN [tbl_personal_details] d ON d.[person_id]=p.[person_id]",
     u"f.[sort_key],f.[Primary_name],f.[Surname_ID],p.[position],p.[person_id]"},
    {"surname_id", "work_families_with_file",
     u"INNER JOIN [qry_Kindrel_address_book_include_decease] p ON p.[Surname_ID]=v.[surname_id] "
     "LEFT JOIN [tbl_personal_details] d ON d.[person_id]=p.[person_id] "
     "LEFT JOIN [tbl_address] a ON a.[surname_id]=v.[surname_id]",
     u"p.[sort_key],p.[Primary_name],p.[Surname_ID]"},
};

const Source& source_of(const DataPart& part)
{
    return sources[static_cast<std::size_t>(part.owner)];
}

QStringList own_columns(const DataPart& part)
{
    QStringList columns;
    for (const DataColumn& column : part.columns)
        if (column.name)
            columns += u"v.[%1]"_s.arg(latin(column.name));
    return columns;
}

QString condition_of(const DataPart& part, const QStringList& columns)
{
    QStringList conditions;
    if (!columns.isEmpty())
        conditions += u'(' + columns.join(u" IS NOT NULL OR "_s) + u" IS NOT NULL)"_s;
    if (part.only)
        conditions += latin(part.only);
    return conditions.isEmpty() ? QString() : u" WHERE "_s + conditions.join(u" AND "_s);
}

QString statement_of(const DataPart& part, const QString& table)
{
    const bool of_person = part.owner == DataOwner::person;
    const Source& source = source_of(part);
    const QString family = of_person ? u"f"_s : u"p"_s;
    const QStringList own = own_columns(part);
    const QStringList fixed{u"p.[Surname_ID]"_s,
                            u"p.[person_id]"_s,
                            family + u".[surname]"_s,
                            family + u".[Condition]"_s,
                            u"p.[Name]"_s,
                            u"p.[preferred_name]"_s,
                            u"p.[Preferred_Name_hidden]"_s,
                            u"d.[other_surname]"_s,
                            u"d.[surname_hidden]"_s,
                            u"p.[Active]"_s,
                            u"p.[Decease]"_s,
                            u"p.[archive]"_s,
                            u"p.[Privacy]"_s,
                            u"p.[Prospect]"_s,
                            u"p.[contact]"_s,
                            part.hidden ? latin(part.hidden) : u"0"_s};
    const QString within = part.order ? u",v.[%1]"_s.arg(latin(part.order)) : QString();
    return u"SELECT %1 FROM [%2] v %3%4 ORDER BY %5%6;"_s.arg(
        (fixed + own).join(u','), table, QString::fromUtf16(source.joined), condition_of(part, own),
        QString::fromUtf16(source.order), within);
}

QString shown(const core::Row& row, const DataColumn& column, int place, core::DayOrder order)
{
    switch (column.form) {
    case DataForm::text:
        return row.text(Column{place}).simplified();
    case DataForm::date: {
        const auto date = row.date(Column{place});
        return date ? date->shown(order) : QString();
    }
    case DataForm::number:
        return QString::number(row.integer(Column{place}));
    case DataForm::ministry_state:
        return MinistryState(row.integer(Column{place})) == MinistryState::potential ? u"(Potential) "_s
                                                                                     : u"(Active) "_s;
    }
    return {};
}

/// The same as it orders: dates from the year on, numbers from the least.
QString ordering(const core::Row& row, const DataColumn& column, int place, core::DayOrder order)
{
    constexpr int least = -1000;
    if (column.form == DataForm::date)
        return row.text(Column{place});
    if (column.form == DataForm::number)
        return u"%1"_s.arg(row.integer(Column{place}) - least, 10, 10, QChar(u'0'));
    return shown(row, column, place, order);
}

struct Value
{
    QString shown, order;
};

Value value_of(const core::Row& row, const DataPart& part, core::DayOrder order)
{
    QStringList texts, keys;
    for (int place = first_own; const DataColumn& column : part.columns) {
        if (!column.name)
            continue;
        texts += shown(row, column, place, order);
        keys += ordering(row, column, place, order);
        ++place;
    }
    texts.removeAll(QString());
    return {texts.join(QString::fromUtf8(part.joint)), keys.join(u' ')};
}

Member member_of(const core::Row& row)
{
    return {row.integer(Column{key_of_person}), row.integer(Column{key_of_family})};
}

DataEntry entry_of(const core::Row& row, bool use_preferred_names)
{
    Person person;
    person.Name = row.text(Column{given});
    person.preferred_name = row.text(Column{preferred});
    person.Preferred_Name_hidden = row.flag(Column{preferred_hidden});
    person.other_surname = row.text(Column{own_surname});
    person.surname_hidden = row.flag(Column{own_surname_hidden});
    person.Active = row.flag(Column{active});
    person.Decease = row.flag(Column{deceased});
    person.archive = row.flag(Column{archived});
    person.Privacy = row.flag(Column{privacy});
    person.Prospect = row.flag(Column{prospect});
    person.contact = row.flag(Column{contact});
    const QString of_family = row.text(Column{surname});
    return {.member = member_of(row),
            .surname = of_family,
            .name = listed_name(person, of_family, use_preferred_names),
            .states = states_of(person),
            .Condition = FileStatus(row.integer(Column{condition})),
            .hidden = row.flag(Column{hidden})};
}

/// The days on which the files of a folder were last changed, by the keys in their names.
using FileDays = QHash<int, core::Date>;

FileDays file_days(const core::Office& office, const DataPart& part)
{
    const bool pictures = part.files == DataFiles::portraits;
    const QString folder = office.paths.folder(pictures ? core::Folder::portrait : core::Folder::notebook);
    const QRegularExpression name(
        QRegularExpression::anchoredPattern(u"%1(\\d+)\\.%2"_s.arg(part.owner == DataOwner::family ? u"F"_s : QString(),
                                                                   pictures ? u"jpg"_s : u"fll"_s)),
        QRegularExpression::CaseInsensitiveOption);
    FileDays days;
    for (QDirIterator file(folder, QDir::Files); file.hasNext();) {
        file.next();
        if (const auto match = name.match(file.fileName()); match.hasMatch())
            days.insert(match.captured(1).toInt(), core::Date::from(file.fileInfo().lastModified().date()));
    }
    return days;
}

void lend_keys(core::Session& session, const FileDays& days, const DataPart& part)
{
    std::vector<std::vector<core::Value>> rows;
    for (auto day = days.keyBegin(); day != days.keyEnd(); ++day)
        rows.push_back({core::to_value(*day)});
    const Source& source = source_of(part);
    session.fill_temporary(latin(source.files_table), {latin(source.key)}, rows);
}

bool may_read(const core::Office& office, const DataPart& part)
{
    if (!core::permitted(office, core::Area::search_for_family))
        return false;
    if (part.right == core::Area::pin_financial_only)
        return pins_permitted(office);
    return !part.right || core::permitted(office, *part.right);
}

bool is_same(const Member& one, const Member& other)
{
    return one.person_id == other.person_id && one.surname_id == other.surname_id;
}

std::vector<DataEntry> read_entries(core::Office& office, const QString& statement,
                                    const std::function<Value(const core::Row&)>& value)
{
    std::vector<DataEntry> entries;
    auto rows = office.session->select(statement);
    for (const core::Row& row : rows) {
        const Value read = value(row);
        if (entries.empty() || !is_same(entries.back().member, member_of(row))) {
            DataEntry& entry = entries.emplace_back(entry_of(row, office.settings.use_preferred_names));
            entry.value = read.shown;
            entry.order = read.order;
        } else {
            entries.back().value += u"; "_s + read.shown;
            entries.back().order += u' ' + read.order;
        }
    }
    return entries;
}

} // namespace

std::optional<std::vector<DataEntry>> people_with(core::Office& office, const DataPart& part)
{
    if (!may_read(office, part))
        return std::nullopt;
    if (part.files == DataFiles::none)
        return read_entries(office, statement_of(part, latin(part.table)),
                            [&](const core::Row& row) { return value_of(row, part, office.day_order()); });
    const FileDays days = file_days(office, part);
    lend_keys(*office.session, days, part);
    const Column key{part.owner == DataOwner::person ? key_of_person : key_of_family};
    return read_entries(office, statement_of(part, latin(source_of(part).files_table)), [&](const core::Row& row) {
        const core::Date day = days.value(row.integer(key));
        return Value{day.shown(office.day_order()), day.stored()};
    });
}

QSet<int> families_with(core::Session& session, std::string_view part_name)
{
    const auto parts = data_parts();
    const auto part = std::ranges::find(parts, part_name, &DataPart::name);
    if (part == parts.end() || !part->table)
        throw std::logic_error("no such part of the record");
    const bool of_person = part->owner == DataOwner::person;
    auto rows = session.select(u"SELECT DISTINCT %1.[surname_id] FROM [%2] v%3%4;"_s.arg(
        of_person ? u"p"_s : u"v"_s, latin(part->table),
        of_person ? u" INNER JOIN [tbl_people] p ON p.[person_id]=v.[person_id]"_s : QString(),
        condition_of(*part, own_columns(*part))));
    QSet<int> families;
    for (const core::Row& row : rows)
        families.insert(row.integer(Column{0}));
    return families;
}

QString heading_of(const DataPart& part)
{
    return (part.owner == DataOwner::person ? u"People with an entry in %1"_s : u"Families with an entry in %1"_s)
        .arg(latin(part.name));
}

WorkingList living_with(core::Session& session, const DataPart& part, const std::vector<DataEntry>& entries)
{
    WorkingList living{{}, u"%1, without the deceased"_s.arg(heading_of(part))};
    if (part.owner == DataOwner::person) {
        for (const DataEntry& entry : entries)
            if (!entry.states.deceased)
                living.members.push_back(entry.member);
        return living;
    }
    QHash<int, int> heads;
    auto rows = session.select(u"SELECT [Surname_ID],[person_id] FROM [qry_Kindrel_address_book];"_s);
    for (const core::Row& row : rows)
        heads.insert(row.integer(Column{0}), row.integer(Column{1}));
    for (const DataEntry& entry : entries)
        if (const int head = heads.value(entry.member.surname_id))
            living.members.push_back({head, entry.member.surname_id});
    return living;
}

} // namespace kindrel::people

#include "core/references.h"
#include "support/test_church.h"

#include <algorithm>
#include <initializer_list>
#include <set>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

struct Field
{
    QString name;
    QString type;
    bool in_key = false;
};

struct Relation
{
    QString name;
    bool stored_query = false;
    std::vector<Field> fields;
};

using Records = std::vector<std::vector<Value>>;

std::vector<Field> fields_of(Session& session, const QString& relation)
{
    auto rows = session.select(u"SELECT [name],[type],[pk] FROM pragma_table_info('%1');"_s.arg(relation));
    std::vector<Field> fields;
    for (const Row& row : rows)
        fields.push_back({row.text(Column{0}), row.text(Column{1}), row.flag(Column{2})});
    return fields;
}

/// Every table and stored query, as the embedded engine describes them.
std::vector<Relation> catalogue(Session& session)
{
    auto rows = session.select(u"SELECT [name],[type] FROM [sqlite_master] WHERE [type] IN ('table','view');"_s);
    std::vector<Relation> found;
    for (const Row& row : rows)
        found.push_back({row.text(Column{0}), row.text(Column{1}) == u"view", {}});
    for (auto& relation : found)
        relation.fields = fields_of(session, relation.name);
    return found;
}

std::vector<Relation> catalogue()
{
    TestChurch church(EngineKind::sqlite);
    return catalogue(church.session());
}

bool same(const QString& one, QLatin1StringView other)
{
    return one.compare(other, Qt::CaseInsensitive) == 0;
}

/// "table.field" in small letters.
QString place_of(const QString& table, const QString& field)
{
    return (table + u'.' + field).toLower();
}

struct OwnKey
{
    Entity entity;
    QLatin1StringView table, field;
};

std::vector<OwnKey> keys_at_home()
{
    std::vector<OwnKey> keys;
    for (const auto& home : homes())
        keys.push_back({home.entity, QLatin1StringView(home.table), QLatin1StringView(home.field)});
    return keys;
}

const std::vector<OwnKey> own_keys = keys_at_home();

bool is_own_key(const QString& table, const QString& field)
{
    return std::ranges::any_of(own_keys,
                               [&](const OwnKey& own) { return same(table, own.table) && same(field, own.field); });
}

/// Names that a key goes by away from home.
constexpr std::array other_names{"family_date_id"_L1, "review_id"_L1, "weekly_project"_L1};

bool named_after_a_key(const QString& field)
{
    const auto ends = [&](QLatin1StringView key) {
        return field.endsWith(key, Qt::CaseInsensitive);
    };
    return std::ranges::any_of(own_keys, ends, &OwnKey::field) || std::ranges::any_of(other_names, ends);
}

qsizetype common_start(const QString& one, QLatin1StringView other)
{
    qsizetype length = 0;
    while (length < one.size() && length < other.size() && one[length].toLower() == QChar(other[length]).toLower())
        ++length;
    return length;
}

/// The entity a field's name speaks of; where several share the name, the one whose home is named most like the table.
const OwnKey* entity_named(const QString& table, const QString& field)
{
    const OwnKey* found = nullptr;
    for (const auto& own : own_keys) {
        if (same(field, own.field) && (!found || common_start(table, own.table) > common_start(table, found->table)))
            found = &own;
    }
    return found;
}

bool is_lock(const Relation& relation)
{
    return relation.fields.size() == 4 && relation.fields[1].name == u"workstation";
}

/// A row for each of these numbers goes into every table. Keys and places are the number, texts a day of that number,
/// everything else one of the values that flags and codes take.
constexpr std::array<int, 4> flag_values{0, -1, 1, 2};

Value filling(const Field& field, int number)
{
    if (field.type == u"TEXT")
        return to_value(u"2007-06-0%1"_s.arg(number));
    const bool never_zero = field.in_key || named_after_a_key(field.name) || field.name.endsWith(u"position") ||
                            field.name == u"school_year";
    return to_value(never_zero ? number : flag_values[static_cast<std::size_t>(number - 1)]);
}

void fill_table(Session& session, const Relation& table)
{
    if (table.stored_query || number_of(session, u"SELECT COUNT(*) FROM [%1];"_s.arg(table.name)) > 0)
        return;
    QStringList names;
    Records rows(flag_values.size());
    for (const auto& field : table.fields) {
        names += field.name;
        for (std::size_t i = 0; i < rows.size(); ++i)
            rows[i].push_back(filling(field, static_cast<int>(i) + 1));
    }
    session.insert(table.name, names, rows);
}

void fill(Session& session, const std::vector<Relation>& relations)
{
    Transaction transaction(session);
    for (const auto& relation : relations)
        fill_table(session, relation);
    transaction.commit();
}

/// Everything that a statement returns, in an order of its own, after a row of the columns' names.
Records content(Session& session, const QString& relation)
{
    auto rows = session.select(u"SELECT * FROM [%1];"_s.arg(relation));
    Records found;
    std::vector<Value> names;
    for (int index = 0; index < rows.column_count(); ++index)
        names.push_back(to_value(rows.column_name(index).toLower()));
    for (const Row& row : rows) {
        auto& values = found.emplace_back();
        for (int index = 0; index < rows.column_count(); ++index)
            values.push_back(row.value(Column{index}));
    }
    std::ranges::sort(found);
    found.insert(found.begin(), std::move(names));
    return found;
}

} // namespace

TEST(SchemaTest, EveryReferenceNamesAFieldAndTheEntityOfItsName)
{
    std::set<QString> places;
    for (const auto& relation : catalogue()) {
        for (const auto& field : relation.fields)
            places.insert(relation.stored_query ? QString() : place_of(relation.name, field.name));
    }
    for (const auto& reference : references()) {
        const QString table = QString::fromLatin1(reference.table);
        const QString field = QString::fromLatin1(reference.field);
        EXPECT_TRUE(places.contains(place_of(table, field))) << reference.table << '.' << reference.field;
        const auto* named = entity_named(table, field);
        const auto expected = table == u"tbl_weekly_amount" && field == u"date_id" ? Entity::weekly_date
                              : named                                              ? named->entity
                                                                                   : reference.to;
        EXPECT_EQ(reference.to, expected) << reference.table << '.' << reference.field;
    }
}

TEST(SchemaTest, EveryFieldThatHoldsAnotherKeyIsAReference)
{
    std::set<QString> known;
    for (const auto& reference : references())
        known.insert(place_of(QString::fromLatin1(reference.table), QString::fromLatin1(reference.field)));
    for (const auto& relation : catalogue()) {
        for (const auto& field : relation.fields) {
            const auto place = place_of(relation.name, field.name);
            if (relation.stored_query || is_lock(relation) || field.type == u"TEXT" || !named_after_a_key(field.name))
                continue;
            EXPECT_TRUE(known.contains(place) || is_own_key(relation.name, field.name)) << place.toStdString();
        }
    }
}

TEST(SchemaTest, PastTotalsAndAuditsOutliveThePersonButNotTheirOwner)
{
    struct Case
    {
        const char* table;
        Entity to;
        Bond bond;
    };
    for (const auto& [table, to, bond] : {
             Case{"tbl_roll_attendance", Entity::person, Bond::keep},
             Case{"tbl_roll_attendance", Entity::roll_date, Bond::owned},
             Case{"tbl_finance_data", Entity::person, Bond::keep},
             Case{"tbl_finance_data", Entity::finance_date, Bond::owned},
             Case{"tbl_wardline_audit_risk", Entity::person, Bond::keep},
             Case{"tbl_wardline_audit_risk", Entity::wardline_risk, Bond::keep},
             Case{"tbl_wardline_audit_risk", Entity::wardline_compliance, Bond::owned},
             Case{"tbl_group_history", Entity::group, Bond::keep},
             Case{"tbl_group", Entity::group, Bond::link},
             Case{"tbl_roster_duty", Entity::master_duty, Bond::keep},
         }) {
        const auto found = std::ranges::find_if(references(), [&](const Reference& reference) {
            return reference.to == to && qstrcmp(reference.table, table) == 0;
        });
        ASSERT_NE(found, references().end()) << table;
        EXPECT_EQ(found->bond, bond) << table << " to " << static_cast<int>(to);
    }
}

TEST(SchemaTest, EveryEntityIsAtHomeInATableThatHasItsKey)
{
    const auto relations = catalogue();
    for (int number = 1; number <= entity_count; ++number) {
        const auto entity = static_cast<Entity>(number);
        const auto own = std::ranges::find(own_keys, entity, &OwnKey::entity);
        ASSERT_NE(own, own_keys.end()) << number;
        const auto home = std::ranges::find_if(relations, [&](const Relation& r) { return same(r.name, own->table); });
        ASSERT_NE(home, relations.end()) << own->table.data();
        EXPECT_TRUE(std::ranges::any_of(home->fields, [&](const Field& f) { return same(f.name, own->field); }))
            << own->table.data();
        EXPECT_TRUE(std::ranges::any_of(relations, [&](const Relation& r) { return r.name == counter_table(entity); }))
            << number;
    }
}

TEST(SchemaTest, EveryTableButALockHasAKeyOrAnIndex)
{
    TestChurch church(EngineKind::sqlite);
    for (const auto& relation : catalogue(church.session())) {
        if (relation.stored_query || is_lock(relation))
            continue;
        const auto indexes = u"SELECT COUNT(*) FROM [sqlite_master] WHERE [type]='index' AND [tbl_name]='%1';"_s;
        EXPECT_TRUE(std::ranges::any_of(relation.fields, &Field::in_key) ||
                    number_of(church.session(), indexes.arg(relation.name)) > 0)
            << relation.name.toStdString();
    }
}

class StoredQueryTest : public EngineTest
{
protected:
    void add(const QString& table, const QStringList& fields, const Records& rows)
    {
        session().insert(table, fields, rows);
    }
    /// The first column of what a statement returns, in its order.
    std::string listed(const QString& statement)
    {
        auto rows = session().select(statement);
        QStringList found;
        for (const Row& row : rows)
            found += row.text(Column{0});
        return found.join(u", "_s).toStdString();
    }
    /// People given as key, family, name, position and whether they have died.
    void add_people(std::initializer_list<std::tuple<int, int, QString, int, bool>> people)
    {
        Records rows;
        for (const auto& [key, family, name, position, died] : people)
            rows.push_back({to_value(key), to_value(family), to_value(name), to_value(position), to_value(died)});
        add(u"tbl_people"_s, {u"person_id"_s, u"Surname_ID"_s, u"Name"_s, u"position"_s, u"Decease"_s}, rows);
    }
};
KINDREL_ON_BOTH_ENGINES(StoredQueryTest);

TEST_P(StoredQueryTest, EveryOneReadsTheSameRowsAndTypesAsTheEmbeddedEngineFromAFilledChurch)
{
    TestChurch embedded(EngineKind::sqlite);
    const auto relations = catalogue(embedded.session());
    fill(embedded.session(), relations);
    fill(session(), relations);
    for (const auto& relation : relations) {
        const auto found = content(session(), relation.name);
        EXPECT_EQ(found, content(embedded.session(), relation.name)) << relation.name.toStdString();
        EXPECT_GT(found.size(), 1U) << relation.name.toStdString() << " returns nothing.";
        EXPECT_EQ(std::set(found[0].begin(), found[0].end()).size(), found[0].size()) << relation.name.toStdString();
    }
}

TEST_P(StoredQueryTest, TheAddressBookListsEachFamilyOnceWithItsFirstLivingPerson)
{
    add(u"tbl_surname"_s, {u"Surname_ID"_s, u"sort_key"_s},
        {{1, u"D"_s}, {2, u"C"_s}, {3, u"B"_s}, {4, u"A"_s}, {5, u"E"_s}});
    add_people({{11, 1, u"Ann"_s, 1, true}, {12, 1, u"Ben"_s, 2, false}, {13, 1, u"Cid"_s, 3, false}});
    add_people({{21, 2, u"Dot"_s, 1, true}});
    add_people({{32, 3, u"Eve"_s, 1, false}, {31, 3, u"Fay"_s, 1, false}});
    add_people({{51, 5, u"Guy"_s, 1, false}});

    EXPECT_EQ(listed(u"SELECT [Name] FROM [qry_Kindrel_address_book];"_s), "Fay, Ben, Guy");
    EXPECT_EQ(listed(u"SELECT [Name] FROM [qry_Kindrel_address_book_include_decease];"_s), ", Fay, Dot, Ann, Guy");
}

TEST_P(StoredQueryTest, AFilterLetsWhoCarriesNothingPassAnExclusion)
{
    add(u"tbl_surname"_s, {u"Surname_ID"_s}, {{1}});
    add_people({{1, 1, u"Ann"_s, 1, false}, {2, 1, u"Ben"_s, 2, false}, {3, 1, u"Cid"_s, 3, false}});
    add(u"tbl_group"_s, {u"person_id"_s, u"group_id"_s}, {{1, 7}, {2, 7}, {2, 8}});

    EXPECT_EQ(listed(u"SELECT [Name] FROM [qry_filter3_in_group] WHERE ([group_id] <> 7 OR [group_id] Is Null) "
                     "ORDER BY [Position];"_s),
              "Ben, Cid");
}

TEST_P(StoredQueryTest, ABirthdayIsFoundInAnyYearAndASurnameSortsUnlessHidden)
{
    add(u"tbl_surname"_s, {u"Surname_ID"_s, u"surname"_s, u"sort_key"_s}, {{1, u"Ng"_s, u"NG"_s}});
    add_people({{1, 1, u"Ann"_s, 1, false}, {2, 1, u"Ben"_s, 2, false}, {3, 1, u"Cid"_s, 3, false}});
    add(u"tbl_personal_details"_s, {u"person_id"_s, u"birthdate"_s, u"other_surname"_s, u"surname_hidden"_s},
        {{1, u"1800-02-29"_s, u"Old"_s, 0}, {2, u"1970-03-01"_s, u"Out"_s, -1}});

    EXPECT_EQ(listed(u"SELECT [Name] FROM [qry_filter1_all] WHERE [birthdate_month_day] >= 229 "
                     "AND [birthdate_month_day] <= 229;"_s),
              "Ann");
    EXPECT_EQ(listed(u"SELECT [sort_surname] FROM [qry_filter1_all] WHERE [Alpha_sort] >= 'N' "
                     "AND [Alpha_sort] <= 'N' ORDER BY [Position];"_s),
              "Old, Ng, Ng");
}

TEST_P(StoredQueryTest, GivingNumbersComeInTheOrderOfNumbers)
{
    add(u"tbl_surname"_s, {u"Surname_ID"_s}, {{1}});
    add_people({{1, 1, u"Ann"_s, 1, false}, {2, 1, u"Ben"_s, 2, false}, {3, 1, u"Cid"_s, 3, false}});
    add(u"tbl_pin"_s, {u"person_id"_s, u"personal_pin"_s}, {{1, u"100"_s}, {2, u"99"_s}, {3, u"7"_s}});

    EXPECT_EQ(listed(u"SELECT [personal_pin] FROM [Qry_finance_pin_order];"_s), "7, 99, 100");
}

TEST_P(StoredQueryTest, AnAbsenceAndAForbiddenPartnerCountOnEveryDuty)
{
    add(u"tbl_surname"_s, {u"Surname_ID"_s}, {{1}});
    add_people({{1, 1, u"Ann"_s, 1, false}, {2, 1, u"Ben"_s, 2, false}});
    add(u"tbl_roster_date"_s, {u"date_id"_s, u"roster_project_id"_s, u"date"_s},
        {{1, 1, u"2026-03-01"_s}, {2, 1, u"2026-03-08"_s}});
    add(u"tbl_roster_people"_s, {u"roster_people_id"_s, u"duty_id"_s, u"person_id"_s},
        {{10, 1, 1}, {11, 1, 2}, {12, 2, 2}});
    add(u"tbl_roster_absence"_s, {u"roster_people_id"_s, u"absent_from"_s, u"absent_to"_s},
        {{12, u"2026-03-08"_s, u"2026-03-20"_s}});
    add(u"tbl_roster_not_connected"_s, {u"roster_people_id"_s, u"not_to_be_connected"_s}, {{10, 11}});
    add(u"tbl_roster_build"_s, {u"date_id"_s, u"roster_people_id"_s}, {{1, 12}});

    EXPECT_EQ(listed(u"SELECT [date] FROM [qry_roster_find_not] WHERE [person_id]=2;"_s), "2026-03-08");
    EXPECT_EQ(listed(u"SELECT [date] FROM [qry_roster_not_allowed] WHERE [Roster_people_id]=10;"_s), "2026-03-01");
}

TEST_P(StoredQueryTest, ATeamHasServedOnceOnADateWhereverItIsNamed)
{
    add(u"tbl_roster_date"_s, {u"date_id"_s, u"roster_project_id"_s, u"date"_s}, {{1, 1, u"2026-03-01"_s}});
    add(u"tbl_roster_people"_s, {u"roster_people_id"_s, u"duty_id"_s, u"person_id"_s}, {{10, 1, 1}, {11, 1, 2}});
    add(u"tbl_roster_build"_s, {u"date_id"_s, u"roster_people_id"_s, u"team_memory1"_s, u"team_memory2"_s},
        {{1, 10, 5, 6}, {1, 11, 6, 0}});

    EXPECT_EQ(listed(u"SELECT [team_id] FROM [qry_roster_auto_build_history_team] ORDER BY [team_id];"_s), "5, 6");
}

} // namespace kindrel::test

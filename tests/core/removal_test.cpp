#include "core/removal.h"
#include "support/test_church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class RemovalTest : public EngineTest
{
protected:
    void add(const QString& table, const QStringList& fields, std::initializer_list<qint64> values)
    {
        std::vector<std::vector<Value>> rows(1);
        for (const auto value : values)
            rows.front().push_back(value);
        session().insert(table, fields, rows);
    }
    [[nodiscard]] qint64 rows_of(const QString& table)
    {
        return number_of(session(), u"SELECT COUNT(*) FROM [%1];"_s.arg(table));
    }
};
KINDREL_ON_BOTH_ENGINES(RemovalTest);

TEST_P(RemovalTest, AFamilyTakesItsPeopleAlongAndTheirPastTotalsStay)
{
    for (const qint64 family : {1, 2}) {
        add(u"tbl_surname"_s, {u"Surname_ID"_s}, {family});
        add(u"tbl_people"_s, {u"person_id"_s, u"Surname_ID"_s, u"position"_s}, {family * 10, family, 1});
        add(u"tbl_personal_details"_s, {u"person_id"_s}, {family * 10});
        add(u"tbl_status"_s, {u"person_id"_s, u"status_id"_s}, {family * 10, 1});
        add(u"tbl_finance_data"_s, {u"finance_date_id"_s, u"person_id"_s, u"Data"_s}, {1, family * 10, 50000});
        add(u"tbl_roster_people"_s, {u"roster_people_id"_s, u"duty_id"_s, u"person_id"_s},
            {family * 100, 1, family * 10});
        add(u"tbl_roster_absence"_s, {u"roster_people_id"_s}, {family * 100});
    }
    const int first = 1;

    Transaction transaction(session());
    remove_entities(session(), Entity::surname, {&first, 1});
    transaction.commit();

    for (const auto* table : {u"tbl_surname", u"tbl_people", u"tbl_personal_details", u"tbl_status",
                              u"tbl_roster_people", u"tbl_roster_absence"})
        EXPECT_EQ(rows_of(QString::fromUtf16(table)), 1) << QString::fromUtf16(table).toStdString();
    EXPECT_EQ(rows_of(u"tbl_finance_data"_s), 2) << "A past total was changed.";
    EXPECT_EQ(number_of(session(), u"SELECT [roster_people_id] FROM [tbl_roster_absence];"_s), 200);
}

} // namespace kindrel::test

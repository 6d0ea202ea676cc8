#include "apps/kindrelctl_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

/// A church of 120 families, whose people are listed.
class KindrelctlPeopleTest : public KindrelctlTest
{
protected:
    void SetUp() override { make_church(120); }
    [[nodiscard]] QJsonArray people(const QStringList& criteria, const QString& fields)
    {
        return list(QStringList{u"people"_s, u"--fields"_s, fields, u"--format"_s, u"json"_s} + criteria, {});
    }
    /// One field of everybody chosen, in order.
    [[nodiscard]] QStringList values(const QStringList& criteria, const QString& field)
    {
        QStringList found;
        for (const auto& person : people(criteria, field))
            found += person[field].toVariant().toString();
        return found;
    }
};

} // namespace

TEST_F(KindrelctlPeopleTest, EachCriterionChoosesThePeopleItNames)
{
    struct Case
    {
        QStringList criteria;
        QString field;
        std::function<bool(const QString&)> fits;
    };
    const auto group = values({}, u"groups"_s).filter(QRegularExpression(u"^[^,]+$"_s)).value(0);
    ASSERT_FALSE(group.isEmpty());
    const std::vector<Case> cases{
        {{u"--born"_s, u"March"_s},
         u"birthdate"_s,
         [](const auto& date) {
             return date.mid(5, 2) == "03"_L1;
         }},
        {{u"--born"_s, u"20/12-10/1"_s},
         u"birthdate"_s,
         [](const auto& date) {
             return date.mid(5) >= "12-20"_L1 || date.mid(5) <= "01-10"_L1;
         }},
        {{u"--age"_s, u"30-39"_s},
         u"age"_s,
         [](const auto& age) {
             return age.toInt() >= 30 && age.toInt() <= 39;
         }},
        {{u"--surname"_s, u"b-c"_s},
         u"surname"_s,
         [](const auto& name) {
             const QChar first = name.normalized(QString::NormalizationForm_D)[0];
             return first == u'B' || first == u'C';
         }},
        {{u"--group"_s, group},
         u"groups"_s,
         [&](const auto& groups) {
             return groups.split(u", "_s).contains(group);
         }},
    };
    for (const auto& [criteria, field, fits] : cases) {
        const auto found = values(criteria, field);
        EXPECT_FALSE(found.isEmpty()) << criteria.join(u' ').toStdString();
        EXPECT_LT(found.size(), values({}, field).size());
        // A hidden value is chosen by, but not shown.
        for (const auto& value : found)
            EXPECT_TRUE(value.isEmpty() || fits(value)) << value.toStdString();
    }
}

TEST_F(KindrelctlPeopleTest, TheSameOptionGivenAgainOffersAnotherChoice)
{
    const auto groups = values({}, u"groups"_s).filter(QRegularExpression(u"^[^,]+$"_s));
    const QString one = groups.first();
    const auto other = std::ranges::find_if(groups, [&](const auto& group) { return group != one; });
    ASSERT_NE(other, groups.end());
    const auto keys = [this](const QStringList& criteria) {
        const auto found = values(criteria, u"person_id"_s);
        return QSet<QString>(found.begin(), found.end());
    };
    EXPECT_EQ(keys({u"--group"_s, one, u"--group"_s, *other}),
              keys({u"--group"_s, one}) + keys({u"--group"_s, *other}));
}

TEST_F(KindrelctlPeopleTest, PeopleComeInTheOrderAskedFor)
{
    auto dates = values({u"--sort"_s, u"birth-date"_s}, u"birthdate"_s);
    dates.removeAll(QString());
    ASSERT_GT(dates.size(), 20);
    EXPECT_TRUE(std::ranges::is_sorted(dates, {}, [](const QString& date) { return date.mid(5); }));
    EXPECT_NE(values({}, u"person_id"_s), values({u"--sort"_s, u"suburb"_s}, u"person_id"_s));
}

TEST_F(KindrelctlPeopleTest, CommaSeparatedValuesAreQuotedWhereNeeded)
{
    const auto ended = run({u"people"_s, u"--fields"_s, u"name,groups"_s, u"--format"_s, u"csv"_s});
    EXPECT_EQ(ended.status, 0) << ended;
    EXPECT_TRUE(ended.out.startsWith("name,groups\r\n")) << ended;
    const auto with_two = values({}, u"groups"_s).filter(u", "_s).value(0);
    ASSERT_FALSE(with_two.isEmpty()) << "the church made for the test has nobody in two groups";
    EXPECT_TRUE(ended.out.contains(",\"" + with_two.toUtf8() + "\"\r\n")) << with_two.toStdString();
}

TEST_F(KindrelctlPeopleTest, AnUnlistedPhoneIsNotListed)
{
    const auto phone_is_hidden = [this](int family) {
        const auto shown = run({u"family"_s, QString::number(family), u"--json"_s});
        return QJsonDocument::fromJson(shown.out)[u"address"_s][u"phone_hidden"_s].toBool();
    };
    QHash<int, QString> phones;
    for (const auto& person : people({}, u"surname_id,phone"_s))
        phones.insert(person[u"surname_id"_s].toInt(), person[u"phone"_s].toString());
    ASSERT_GT(phones.size(), 20);
    int hidden = 0;
    for (const auto& family : list({u"families"_s})) {
        const int key = family[u"surname_id"_s].toInt();
        if (!phones.contains(key))
            continue;
        EXPECT_EQ(phones[key], family[u"phone"_s].toString()) << key;
        if (hidden == 0 && phones[key].isEmpty() && phone_is_hidden(key))
            ++hidden;
    }
    EXPECT_EQ(hidden, 1) << "the church made for the test hides too little";
}

} // namespace kindrel::test

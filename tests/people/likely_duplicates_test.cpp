#include "people/family_store.h"
#include "people/likely_duplicates.h"
#include "support/families.h"
#include "support/test_church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

class LikelyDuplicatesTest : public EngineTest
{
protected:
    FamilyFile add(FamilyFile file) { return save_family(session(), std::move(file), QDate(2026, 11, 22)); }
    /// "Family: reason" of each, in order.
    [[nodiscard]] QStringList found(const FamilyFile& file)
    {
        QStringList lines;
        for (const auto& likeness : likely_duplicates(session(), file))
            lines += likeness.family + u": "_s + likeness.reason;
        return lines;
    }
};

FamilyFile with_phone(const QString& phone)
{
    auto file = family(u"Typed"_s, {u"Zoe"_s});
    file.address.phone = phone;
    return file;
}

FamilyFile with_email(const QString& email)
{
    auto file = family(u"Typed"_s, {u"Zoe"_s});
    file.people[0].Personal_email = email;
    return file;
}

} // namespace

KINDREL_ON_BOTH_ENGINES(LikelyDuplicatesTest);

TEST_P(LikelyDuplicatesTest, AFamilyWithTheSurnameAndAGivenNameIsTold)
{
    const auto stored = add(family(u"Žižek"_s, {u"Ann"_s, u"José"_s}));
    (void)add(family(u"Naismith"_s, {u"Jose"_s}));
    auto gone = family(u"ZIZEK"_s, {u"Ian"_s});
    gone.family.Condition = FileStatus::archive;
    gone.people[0].Decease = true;
    (void)add(gone);

    EXPECT_EQ(found(family(u" zizek"_s, {u"Tom"_s, u"JOSE "_s})), QStringList{u"Žižek, Ann: José Žižek is in it"_s});
    EXPECT_EQ(found(family(u"Zizek"_s, {u"Ian"_s})), QStringList{u"ZIZEK, Ian: Ian ZIZEK is in it"_s});
    EXPECT_EQ(found(family(u"Zizek"_s, {u"Jo"_s, {}})), QStringList());
    EXPECT_EQ(found(family({}, {u"Jose"_s})), QStringList()) << "Without a surname.";
    EXPECT_EQ(found(stored), QStringList()) << "The family itself was told.";
}

TEST_P(LikelyDuplicatesTest, PreferredNamesAndSurnamesOfTheirOwnCountToo)
{
    auto stored = family(u"Naismith"_s, {u"Annabel"_s, u"Rose"_s});
    stored.people[0].preferred_name = u"Ann"_s;
    stored.people[1].other_surname = u"Grey"_s;
    (void)add(stored);

    EXPECT_EQ(found(family(u"Naismith"_s, {u"Ann"_s})), QStringList{u"Naismith, Annabel: Annabel Naismith is in it"_s});
    for (const auto& surname : {u"Naismith"_s, u"Grey"_s})
        EXPECT_EQ(found(family(surname, {u"Rose"_s})).size(), 1) << surname.toStdString();
    auto married = family(u"Typed"_s, {u"Rose"_s});
    married.people[0].other_surname = u"GREY"_s;
    EXPECT_EQ(found(married).size(), 1) << "A surname of one's own in the file.";
    EXPECT_EQ(found(family(u"Grey"_s, {u"Ann"_s})), QStringList()) << "The surname of one and the name of another.";
}

TEST_P(LikelyDuplicatesTest, TheSamePhoneIsToldHoweverItIsSpaced)
{
    auto stored = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    stored.address.phone = u"(03) 5550 1234"_s;
    stored.address.family_mobile = u"0400-123.456 (Ben)"_s;
    stored.people[1].mobile_phone = u"+61 400 999 888"_s;
    stored.people[1].business_phone = u"555 777 1"_s;
    (void)add(stored);
    auto short_one = family(u"Short"_s, {u"Cy"_s});
    short_one.address.phone = u"12345"_s;
    (void)add(short_one);

    for (const auto& phone : {u"0355501234"_s, u" 03-5550-1234"_s, u"0400 123 456"_s, u"61400999888 "_s}) {
        EXPECT_EQ(found(with_phone(phone)), QStringList{u"Naismith, Ann: the same phone "_s + phone.trimmed()});
        auto mobile = with_phone({});
        mobile.people[0].mobile_phone = phone;
        EXPECT_EQ(found(mobile).size(), 1) << phone.toStdString();
    }
    for (const auto& phone : {u"5550 1234"_s, u"12345"_s, u"5557771"_s, u"03 5550 12345"_s})
        EXPECT_EQ(found(with_phone(phone)), QStringList()) << phone.toStdString();
}

TEST_P(LikelyDuplicatesTest, TheSameEmailIsToldWithoutRegardToCase)
{
    auto stored = family(u"Naismith"_s, {u"Ann"_s});
    stored.people[0].Personal_email = u"Ann.É@Example.org "_s;
    stored.address.family_email = u"home@example.org"_s;
    (void)add(stored);

    EXPECT_EQ(found(with_email(u"ann.é@EXAMPLE.ORG"_s)),
              QStringList{u"Naismith, Ann: the same e-mail ann.é@EXAMPLE.ORG"_s});
    EXPECT_EQ(found(with_email(u" HOME@example.org"_s)),
              QStringList{u"Naismith, Ann: the same e-mail HOME@example.org"_s});
    EXPECT_EQ(found(with_email(u"home@example.com"_s)), QStringList());
}

TEST_P(LikelyDuplicatesTest, EachFamilyIsToldOnceByItsStrongestReasonAndTheMostAlikeComeFirst)
{
    const auto like = [](bool name, bool phone, bool email) {
        auto file = family(u"Naismith"_s, {name ? u"Ann"_s : u"Ben"_s});
        file.address.phone = phone ? u"555 1234"_s : QString();
        file.address.family_email = email ? u"a@b.org"_s : QString();
        return file;
    };
    for (const auto& stored : {like(false, false, true), like(false, true, false), like(true, false, false),
                               like(false, true, true), like(true, true, true)})
        (void)add(stored);
    const auto by_email = u"Naismith, Ben: the same e-mail a@b.org"_s;
    const auto by_phone = u"Naismith, Ben: the same phone 555 1234"_s;
    const auto by_name = u"Naismith, Ann: Ann Naismith is in it"_s;
    EXPECT_EQ(found(like(true, true, true)), (QStringList{by_name, by_phone, by_name, by_phone, by_email}));

    (void)add(like(true, false, true));
    EXPECT_EQ(found(like(true, true, true)), (QStringList{by_name, by_name, by_phone, by_name, by_phone}))
        << "Five at most.";
}

} // namespace kindrel::test

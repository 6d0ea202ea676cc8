#include "people/editor_fixture.h"
#include "people/speed_find.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

class SpeedFindTest : public EditorTest
{
protected:
    void keep(FamilyFile file) { (void)save_family(session(), file, desk->clock.today()); }
    [[nodiscard]] QStringList found(const QString& typed, int most = 10)
    {
        if (!find)
            find.emplace(office());
        EXPECT_TRUE(find->renew());
        QStringList surnames;
        for (const auto* line : find->find(typed, most).lines)
            surnames += line->surname;
        return surnames;
    }

    std::optional<SpeedFind> find;
};
KINDREL_ON_BOTH_ENGINES(SpeedFindTest);

FamilyFile talkative()
{
    auto file = family(u"Żak-O’Brien"_s, {u"Anna"_s, u"Ben"_s});
    file.people[0].preferred_name = u"Nan"_s;
    file.people[0].middle_name = u"María"_s;
    file.people[0].mobile_phone = u"0412 345 678"_s;
    file.people[1].other_surname = u"Quist"_s;
    file.people[1].Decease = true;
    file.residential = Suburb{1, SuburbType::residential, {}, {}, {}};
    file.address.phone = u"(03) 9876-5432"_s;
    return file;
}

} // namespace

TEST_P(SpeedFindTest, TheBeginningsOfAnyWordsInAnyOrderFindAFamily)
{
    keep(talkative());
    add(u"Smith"_s, {u"Zora"_s});
    const QStringList it{u"Żak-O’Brien"_s};
    struct Case
    {
        QString typed;
        bool finds;
    };
    for (const auto& [typed, finds] :
         {Case{u"zak"_s, true}, Case{u"ŻAK o'br"_s, true}, Case{u"brien"_s, true}, Case{u"ben nan"_s, true},
          Case{u"maria zak"_s, true}, Case{u"qui"_s, true}, Case{u"suburb 1 anna"_s, true}, Case{u"98765432"_s, true},
          Case{u"9876 5432"_s, true}, Case{u"0398"_s, true}, Case{u"345678"_s, true}, Case{u"+0398"_s, true},
          Case{u"+"_s, false}, Case{u"ak"_s, false}, Case{u"zak zora"_s, false}, Case{u"5439"_s, false},
          Case{u"876"_s, false}, Case{u"  "_s, false}})
        EXPECT_EQ(found(typed), finds ? it : QStringList()) << typed.toStdString();
}

TEST_P(SpeedFindTest, WhatIsHiddenIsNotShownAndNoPlaceOrNumberIsFoundByIt)
{
    auto file = talkative();
    file.address.res_hidden = file.address.phone_hidden = true;
    for (auto& person : file.people)
        person.Preferred_Name_hidden = person.surname_hidden = person.mobile_hidden = true;
    keep(file);
    for (const auto& typed : {u"suburb"_s, u"9876"_s, u"0412"_s})
        EXPECT_EQ(found(typed), QStringList()) << typed.toStdString();

    EXPECT_EQ(found(u"nan"_s).size(), 1) << "The office knows people by names that no list shows.";
    const auto hits = find->find(u"nan"_s, 1);
    ASSERT_EQ(hits.lines.size(), 1U);
    EXPECT_EQ(hits.lines[0]->people, u"Anna, Ben (Dec)"_s);
    EXPECT_EQ(hits.lines[0]->suburb + hits.lines[0]->phone, QString());
}

TEST_P(SpeedFindTest, AFamilyIsListedWithItsPeopleAndWhereItLives)
{
    keep(talkative());
    ASSERT_EQ(found(u"zak"_s).size(), 1);
    const auto* line = find->find(u"zak"_s, 1).lines.at(0);
    EXPECT_EQ(line->people, u"Anna (Nan), Ben Quist (Dec)"_s);
    EXPECT_EQ(line->suburb + u' ' + line->phone, u"suburb 1 (03) 9876-5432"_s);
}

TEST_P(SpeedFindTest, FamiliesOfTheSurnameComeBeforeThoseWithSuchAPerson)
{
    add(u"Adder"_s, {u"Martin"_s});
    add(u"Martin"_s, {u"Zoe"_s});
    add(u"Martello"_s, {u"Ann"_s});
    EXPECT_EQ(found(u"mart"_s), (QStringList{u"Martello"_s, u"Martin"_s, u"Adder"_s}));
    EXPECT_EQ(found(u"mart"_s, 2), (QStringList{u"Martello"_s, u"Martin"_s}));
    EXPECT_EQ(find->find(u"mart"_s, 2).total, 3);
}

TEST_P(SpeedFindTest, WhatAnotherWorkstationStoresIsFoundAfterTheNextRenewal)
{
    const int changed = add(u"Adder"_s, {u"Una"_s});
    EXPECT_EQ(found(u"una"_s), QStringList{u"Adder"_s});
    const auto elsewhere = church->another();
    auto file = *load_family(*elsewhere, changed);
    file.family.surname = u"Viper"_s;
    (void)save_family(*elsewhere, file, desk->clock.today());
    (void)save_family(*elsewhere, family(u"Nash"_s, {u"Una"_s}), desk->clock.today());

    EXPECT_EQ(find->find(u"una"_s, 9).total, 1);
    EXPECT_EQ(found(u"una"_s), (QStringList{u"Nash"_s, u"Viper"_s}));
    EXPECT_EQ(found(u"adder"_s), QStringList());
}

TEST_P(SpeedFindTest, WithoutTheRightToItNothingIsRead)
{
    add(u"Adder"_s, {u"Una"_s});
    office().rights.set(core::Area::fast_find, false);
    dialogue().expect_box(
        u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::fast_find)));
    SpeedFind closed(office());
    EXPECT_FALSE(closed.renew());
    EXPECT_EQ(closed.find(u"una"_s, 9).total, 0);
}

} // namespace kindrel::test

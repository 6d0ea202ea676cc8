#include "people/mender_people.h"

#include "people/family_store.h"
#include "support/data_folder.h"
#include "support/families.h"
#include "support/test_church.h"

#include <QFile>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Findings;
using core::Folder;

class MenderPeopleTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        add_setup_items(session());
        for (auto list = core::Entity::group; list <= core::Entity::suburb; list = core::Entity(int(list) + 1))
            (void)session().allocate(list, 3); // The keys of those items.
        for (const bool hidden : {false, true}) {
            auto full = full_family(hidden);
            for (auto& person : full.people)
                person.personal_pin.clear(); // Nobody shares one.
            (void)people::save_family(session(), full, {2024, 5, 15});
        }
        saved = people::save_family(session(), family(u"Žižek"_s, {u"Ann"_s, u"Bob"_s}), {2024, 5, 15});
        const QString drive = folder.path() + u'/';
        place.emplace(core::MenderPlace{.paths = {drive, drive, drive + u"Kindrel_10_Data/"_s, core::Mode::normal, 1},
                                        .workstation = workstation,
                                        .clock = clock,
                                        .session = church->another()});
        core::make_folder(place->paths.folder(Folder::church));
    }
    [[nodiscard]] Findings examine() { return core::examine_church(*place, people::mender_checks()); }
    [[nodiscard]] core::Mending mend() { return core::mend_church(*place, people::mender_checks()); }
    [[nodiscard]] QString text_of(const QString& statement)
    {
        auto rows = session().select(statement);
        return rows.first()->text(core::Column{0});
    }
    QString lay(Folder where, const QString& name)
    {
        const QString file = place->paths.folder(where) + name;
        DataFolder::write(file, "content");
        return file;
    }

    QTemporaryDir folder;
    FakeWorkstation workstation;
    FixedClock clock;
    people::FamilyFile saved;
    std::optional<core::MenderPlace> place;
};
KINDREL_ON_BOTH_ENGINES(MenderPeopleTest);

TEST_P(MenderPeopleTest, WhatTheProgramStoresHasNoFindings)
{
    const auto found = examine();
    EXPECT_TRUE(found.empty()) << found.front().words.toStdString();
}

TEST_P(MenderPeopleTest, NamesThatDoNotFollowAreWorkedOutAgain)
{
    struct Damage
    {
        QString damage, words, proof, proven;
    };
    const QString family = QString::number(saved.family.Surname_ID);
    for (const auto& [damage, words, proof, proven] : {
             Damage{u"UPDATE [tbl_surname] SET [Primary_name]='Zoe' WHERE [Surname_ID]="_s + family,
                    u"1 family listed under the name of somebody who is not at the head."_s,
                    u"SELECT [Primary_name] FROM [tbl_surname] WHERE [Surname_ID]="_s + family, u"Ann"_s},
             Damage{u"UPDATE [tbl_surname] SET [sort_key]=NULL WHERE [Surname_ID]="_s + family,
                    u"1 family at a wrong place of the alphabet."_s,
                    u"SELECT [sort_key] FROM [tbl_surname] WHERE [Surname_ID]="_s + family, u"ZIZEK"_s},
             Damage{u"UPDATE [tbl_people] SET [sort_key]='A' WHERE [Surname_ID]="_s + family,
                    u"2 people at a wrong place of the alphabet."_s,
                    u"SELECT DISTINCT [sort_key] FROM [tbl_people] WHERE [Surname_ID]="_s + family, u"ZIZEK"_s},
             Damage{u"UPDATE [tbl_people] SET [position]=3-[position] WHERE [Surname_ID]="_s + family,
                    u"1 family listed under the name of somebody who is not at the head."_s,
                    u"SELECT [Primary_name] FROM [tbl_surname] WHERE [Surname_ID]="_s + family, u"Bob"_s},
         }) {
        session().execute(damage);
        const auto found = examine();
        ASSERT_EQ(found.size(), 1U) << damage.toStdString();
        EXPECT_EQ(found.front().words, words);
        EXPECT_TRUE(mend().left.empty()) << damage.toStdString();
        EXPECT_EQ(text_of(proof), proven);
    }
}

TEST_P(MenderPeopleTest, AFamilyThatWasLostComesBackWithItsPeopleInOrder)
{
    session().execute(u"DELETE FROM [tbl_surname] WHERE [Surname_ID]=?;"_s, saved.family.Surname_ID);
    EXPECT_TRUE(mend().left.empty());
    const auto back = people::load_family(session(), saved.family.Surname_ID);
    ASSERT_TRUE(back);
    EXPECT_EQ(back->family.surname, u"Recovered family %1"_s.arg(saved.family.Surname_ID));
    EXPECT_EQ(back->family.Primary_name, u"Ann"_s);
    EXPECT_EQ(back->people.size(), 2U);
}

TEST_P(MenderPeopleTest, FilesOfNobodyAreSetAsideAndAllOthersStay)
{
    const QString person = QString::number(saved.people.front().person_id);
    const QString surname = QString::number(saved.family.Surname_ID);
    const QStringList own{
        lay(Folder::portrait, person + u".jpg"_s), lay(Folder::portrait, u"f"_s + surname + u".JPG"_s),
        lay(Folder::notebook, u"F"_s + surname + u".fll"_s), lay(Folder::portrait, u"camp 2019.jpg"_s)};
    const QStringList of_nobody{lay(Folder::portrait, u"90001.jpg"_s), lay(Folder::portrait, u"F90001.jpg"_s),
                                lay(Folder::notebook, u"90001.fll"_s)};
    ASSERT_EQ(examine().size(), 1U);
    EXPECT_EQ(examine().front().words,
              u"3 photographs and notebook pages of families or people who are not in the church."_s);
    EXPECT_TRUE(mend().left.empty());
    for (const auto& file : own)
        EXPECT_TRUE(QFile::exists(file)) << file.toStdString();
    for (const auto& file : of_nobody) {
        EXPECT_FALSE(QFile::exists(file)) << file.toStdString();
        const QString aside = place->paths.folder(Folder::church) + u"mended/"_s + QFileInfo(file).fileName();
        EXPECT_EQ(DataFolder::read(aside), "content") << aside.toStdString();
    }
}

} // namespace kindrel::test

#include "people/drafts.h"
#include "people/fields.h"
#include "setup_fixture.h"

#include <QDir>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

class DraftsTest : public SetupRuleTest
{
protected:
    [[nodiscard]] static Draft draft(int surname_id, const QString& typed, int minute)
    {
        Draft made{family(u"Stored"_s, {u"Ann"_s}), family(typed, {u"Ann"_s}),
                   QDateTime({2026, 11, 22}, {10, minute, 7, 123})};
        made.stored.family.Surname_ID = made.typed.family.Surname_ID = surname_id;
        return made;
    }
    [[nodiscard]] QStringList typed() const
    {
        QStringList found;
        for (const auto& one : Drafts(desk.office).all())
            found += one.typed.family.surname;
        return found;
    }
    /// The drafts' files, whatever their church.
    [[nodiscard]] QStringList files() const
    {
        QStringList found;
        const QString top = desk.office.paths.folder(core::Folder::local_settings) + u"Drafts/"_s;
        for (const auto& folder : QDir(top).entryList(QDir::Dirs | QDir::NoDotAndDotDot)) {
            for (const auto& file : QDir(top + folder).entryList(QDir::Files | QDir::Hidden))
                found += top + folder + u'/' + file;
        }
        return found;
    }
    [[nodiscard]] QString only_file() const
    {
        const auto found = files();
        EXPECT_EQ(found.size(), 1);
        return found.value(0);
    }
};

} // namespace

TEST_F(DraftsTest, EverythingThatWasTypedComesBackAsItWas)
{
    Draft kept{full_family(false), full_family(true), QDateTime({2026, 11, 22}, {10, 30, 7, 123})};
    kept.stored.family.Surname_ID = kept.typed.family.Surname_ID = 2'000'000'001;
    kept.typed.family.Condition = FileStatus::archive;
    kept.typed.family.booked_out = kept.typed.family.active_in_book = true;
    kept.typed.family.booked_out_person = u"\"Ann\" \\ 日本 🎺\n\t"_s;
    kept.typed.family.booked_out_date = core::Date{core::Date::unknown_year, 2, 29};
    kept.typed.people[0].person_id = 12;
    kept.typed.people[0].Surname_ID = 13;
    kept.typed.people[0].ministries[0].date = core::Date{2026, 1, 2};
    kept.typed.people[1].school_year.reset();
    kept.typed.people[2].birthdate.reset();
    kept.typed.residential.reset();
    kept.typed.access.pin = false;

    Drafts(desk.office).keep(kept);

    const auto found = Drafts(desk.office).all();
    ASSERT_EQ(found.size(), 1U);
    EXPECT_TRUE(found[0].stored == kept.stored);
    EXPECT_TRUE(found[0].typed == kept.typed);
    EXPECT_EQ(found[0].kept, kept.kept);
}

TEST_F(DraftsTest, AFamilyHasOneDraftAndTheNewestComesFirst)
{
    const Drafts drafts(desk.office);
    drafts.keep(draft(5, u"First"_s, 1));
    drafts.keep(draft(0, u"New file"_s, 2));
    drafts.keep(draft(10, u"Ten"_s, 4));
    drafts.keep(draft(5, u"Second"_s, 3));
    EXPECT_EQ(typed(), (QStringList{u"Ten"_s, u"Second"_s, u"New file"_s}));

    drafts.forget(5);
    drafts.forget(5);
    EXPECT_EQ(typed(), (QStringList{u"Ten"_s, u"New file"_s}));
}

TEST_F(DraftsTest, ADraftBelongsToItsChurchAlone)
{
    auto& office = desk.office;
    const auto root = church.folder();
    Drafts(office).keep(draft(5, u"Own"_s, 1));
    office.church = 2;
    EXPECT_EQ(typed(), QStringList());
    office.church = 1;
    office.mode = core::Mode::network;
    for (const auto& place : {u"/net1"_s, u"/net2"_s}) {
        office.paths = core::Paths(root, root, root + place, core::Mode::network, 1);
        EXPECT_EQ(typed(), QStringList()) << place.toStdString();
        Drafts(office).keep(draft(5, place, 1));
        EXPECT_EQ(typed(), QStringList{place});
    }
}

TEST_F(DraftsTest, OnlyTheOwnerCanReadADraft)
{
    constexpr auto others = QFile::ReadGroup | QFile::WriteGroup | QFile::ReadOther | QFile::WriteOther;
    for (int round = 0; round < 2; ++round) {
        Drafts(desk.office).keep(draft(5, u"Typed"_s, round));
        EXPECT_FALSE(QFile::permissions(only_file()) & others);
    }
    QFile::setPermissions(only_file(), others | QFile::ReadOwner | QFile::WriteOwner);
    Drafts(desk.office).keep(draft(5, u"Typed"_s, 3));
    EXPECT_FALSE(QFile::permissions(only_file()) & others) << "Open permissions were taken over.";
}

TEST_F(DraftsTest, WhatIsNoDraftIsPassedOverAndStays)
{
    const Drafts drafts(desk.office);
    drafts.keep(draft(5, u"Typed"_s, 1));
    const auto file = only_file();
    const auto good = DataFolder::read(file);
    const auto changed = [&](const char* from, const char* to) {
        return QByteArray(good).replace(from, to);
    };
    ASSERT_NE(changed("\"format\":1", "\"format\":2"), good);
    for (const auto& content :
         {QByteArray(), good.chopped(1), good.left(good.size() / 2), changed("\"format\":1", "\"format\":2"),
          changed("\"school_year\"", "\"other\""), changed("\"Ann\"", "17"), changed("\"people\":[", "\"people\":[3,"),
          QByteArray("\x00\x01\xff", 3)}) {
        DataFolder::write(file, content);
        EXPECT_EQ(typed(), QStringList()) << content.left(200).toStdString();
        EXPECT_EQ(DataFolder::read(file), content);
    }
    DataFolder::write(file, good);
    EXPECT_EQ(typed(), QStringList{u"Typed"_s});
}

TEST_F(DraftsTest, ADraftThatCannotBeWrittenIsAnError)
{
    DataFolder::write(desk.office.paths.folder(core::Folder::local_settings) + u"Drafts"_s, "a file in the way");
    EXPECT_THROW(Drafts(desk.office).keep(draft(5, u"Typed"_s, 1)), core::FileError);
    EXPECT_EQ(typed(), QStringList());
}

} // namespace kindrel::test

#include "desktop/people/family_card.h"

#include "desktop/desktop_fixture.h"
#include "desktop/people/portrait.h"
#include "desktop/shell/note_bar.h"
#include "people/fields.h"
#include "support/families.h"

#include <QImage>
#include <QListWidget>
#include <QTabWidget>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Date;
using desktop::FamilyCard;

namespace {

class FamilyCardTest : public DesktopTest
{
protected:
    /// The card of the family at `row` of those given to begin().
    FamilyCard& open(std::size_t row = 0)
    {
        std::vector<int> keys;
        for (const auto& file : stored)
            keys.push_back(file.family.Surname_ID);
        desktop::open_family_card(desk(), keys, int(row));
        settle();
        return *desk().windows.all<FamilyCard>().back();
    }
    static void choose_person(FamilyCard& card, int row) { child<QListWidget>(card, u"people"_s).setCurrentRow(row); }
    static QString text(const FamilyCard& card, const QString& caption)
    {
        const auto labels = card.findChildren<QLabel*>();
        for (const QLabel* label : labels)
            if (label->text() == caption && label->buddy())
                return static_cast<const QLabel*>(label->buddy())->text();
        return u"no such caption"_s;
    }
};

/// What can be read on all tabs of the card.
QStringList everything(const FamilyCard& card)
{
    QStringList texts;
    auto& tabs = child<QTabWidget>(card, u"sections"_s);
    for (int tab = 0; tab < tabs.count(); ++tab) {
        tabs.setCurrentIndex(tab);
        texts += visible_texts(card);
    }
    return texts;
}

/// The texts of a record that stand under the stored fields' names.
template <class Record>
QStringList texts_of(const Record& record, std::span<const people::Field<Record>> fields)
{
    QStringList texts;
    for (const auto& field : fields)
        if (const auto* member = std::get_if<QString Record::*>(&field.member))
            texts += record.*(*member);
    return texts;
}

/// How many hidden marks can be seen.
qsizetype hidden_marks(const FamilyCard& card)
{
    return everything(card).count(desktop::hidden_mark());
}

} // namespace

TEST_F(FamilyCardTest, EveryStoredTextOfTheFamilyCanBeRead)
{
    begin({full_family(false)});
    const FamilyCard& card = open();
    const QString seen = everything(card).join(u'\n');
    for (const auto& text : texts_of(stored[0].address, people::address_fields()))
        EXPECT_TRUE(seen.contains(text)) << text.toStdString();
    for (const auto& text : {u"suburb 1 3999"_s, u"suburb 2 3000"_s, u"Neighbour"_s, u"555 2"_s, u"Moved here"_s,
                             u"06/05/2011"_s, u"02/01/XXXX"_s, u"family_group 2"_s, u"08/08/1988"_s,
                             u"File Created 31/12/1999"_s, u"Last Edit 15/05/2024"_s, u"Prospect"_s})
        EXPECT_TRUE(seen.contains(text)) << text.toStdString();
}

TEST_F(FamilyCardTest, EveryStoredTextOfThePersonWhoIsChosenCanBeRead)
{
    begin({full_family(false)});
    FamilyCard& card = open();
    choose_person(card, 1);
    const QString seen = everything(card).join(u'\n');
    const people::Person& person = stored[0].people[1];
    for (const auto& text : texts_of(person, people::detail_fields()))
        EXPECT_TRUE(seen.contains(text)) << text.toStdString();
    for (const auto& text : {person.preferred_name, person.personal_pin, u"17/07/1977"_s, u"-2 (kinder)"_s,
                             u"29/02/XXXX"_s, u"01/01/2001"_s, u"(Active) ministry 1"_s, u"(Potential) ministry 1"_s,
                             u"Stanisławflexi"_s, u"occupation 2"_s, u"group 3"_s, u"status 1"_s, u"Yes"_s})
        EXPECT_TRUE(seen.contains(text)) << text.toStdString();
}

TEST_F(FamilyCardTest, AHiddenValueIsShownWithItsMark)
{
    people::FamilyFile file = family(u"Naismith"_s, {u"Ann"_s});
    file.address.phone = u"555 1234"_s;
    file.people[0].mobile_phone = u"0400 1"_s;
    begin({file});
    EXPECT_EQ(hidden_marks(open()), 0);
    desk().windows.all<FamilyCard>().front()->close();
    settle();

    place.in_database(u"UPDATE [tbl_address] SET [phone_hidden]=-1;"_s);
    place.in_database(u"UPDATE [tbl_personal_details] SET [mobile_hidden]=-1;"_s);
    FamilyCard& card = open();
    EXPECT_EQ(text(card, u"Phone"_s), u"555 1234"_s);
    EXPECT_EQ(hidden_marks(card), 2);
}

TEST_F(FamilyCardTest, PeopleStandInOrderWithTheirMarkers)
{
    people::FamilyFile file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    auto& ben = file.people[1];
    ben.Privacy = ben.Prospect = ben.archive = ben.contact = ben.Decease = true;
    begin({file});
    const auto& people = child<QListWidget>(open(), u"people"_s);
    EXPECT_EQ(people.item(0)->text(), u"Ann"_s);
    EXPECT_EQ(people.item(1)->text(), u"Ben (Privacy) (Prospect) (Archive) (Contact) (Deceased)"_s);
    EXPECT_TRUE(people.item(1)->font().italic());
}

TEST_F(FamilyCardTest, BirthDatesAndPinsStayAwayFromThoseWhoMayNotSeeThem)
{
    begin({full_family(false)});
    desk().office.rights.set(core::Area::birth_dates, false);
    desk().office.rights.set(core::Area::full_financial, false);
    desk().office.rights.set(core::Area::pin_financial_only, false);
    const QString seen = everything(open()).join(u'\n');
    EXPECT_FALSE(seen.contains(u"17/07/1977"_s));
    EXPECT_FALSE(everything(open()).contains(stored[0].people[0].personal_pin));
}

TEST_F(FamilyCardTest, AClosedSectionShowsNothingOfWhatItHolds)
{
    people::FamilyFile file = full_family(false);
    file.access = {};
    file.access.Address = file.access.groups = file.access.pin = false;
    begin({file});
    const QString seen = everything(open()).join(u'\n');
    EXPECT_TRUE(seen.contains(u"This section of the record is closed."_s));
    for (const auto& text : {stored[0].address.res_street, stored[0].address.phone, u"group 3"_s})
        EXPECT_FALSE(seen.contains(text)) << text.toStdString();
    EXPECT_FALSE(everything(open()).contains(stored[0].people[0].personal_pin));
    EXPECT_TRUE(seen.contains(u"status 2"_s));
}

TEST_F(FamilyCardTest, TheCaptionTellsOfBookingOut)
{
    people::FamilyFile file = family(u"Naismith"_s, {u"Ann"_s});
    file.family.booked_out = true;
    file.family.booked_out_person = u"Vera"_s;
    file.family.booked_out_date = Date{2024, 5, 1};
    begin({file});
    EXPECT_EQ(open().windowTitle(),
              u"Naismith Family File (Booked out to Vera on 01/05/2024) (Unable to Edit this Family file)"_s);
}

TEST_F(FamilyCardTest, CardsTurnThroughTheListThatTheyWereOpenedFrom)
{
    begin({family(u"Adder"_s, {u"Una"_s}), family(u"Naismith"_s, {u"Ann"_s})});
    FamilyCard& card = open();
    auto& note = child<desktop::NoteBar>(card, u"note_bar"_s);
    press(card, Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(card.windowTitle(), u"Naismith Family File"_s);
    press(card, Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(card.windowTitle(), u"Naismith Family File"_s);
    EXPECT_EQ(note.text(), u"This is the last family of the list."_s);
    press(card, Qt::Key_PageUp, Qt::ControlModifier);
    EXPECT_EQ(card.windowTitle(), u"Adder Family File"_s);
    EXPECT_EQ(note.text(), QString());
}

TEST_F(FamilyCardTest, AFamilyThatIsGoneIsToldAndNoCardOpens)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    place.in_database(u"DELETE FROM [tbl_surname];"_s);
    place.dialogue.expect_box(
        u"Unable to access this family file because another user has removed it from the database."_s);
    desktop::open_family_card(desk(), {stored[0].family.Surname_ID}, 0);
    EXPECT_TRUE(desk().windows.all<FamilyCard>().empty());
}

TEST_F(FamilyCardTest, APhotographIsShownAndAMissingOneLeavesTheFrameEmpty)
{
    begin({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
    QImage red(40, 60, QImage::Format_RGB32);
    red.fill(Qt::red);
    const QString folder = desk().office.paths.folder(core::Folder::portrait);
    DataFolder::write(folder + u"note.txt"_s, "x");
    ASSERT_TRUE(red.save(u"%1%2.jpg"_s.arg(folder).arg(stored[0].people[0].person_id)));
    FamilyCard& card = open();
    const auto& portrait = child<desktop::Portrait>(card, u"portrait"_s);
    EXPECT_FALSE(portrait.empty());
    choose_person(card, 1);
    EXPECT_TRUE(portrait.empty());
}

} // namespace kindrel::test

#include "desktop/people/family_list_model.h"

#include "desktop/people/status_words.h"
#include "desktop/shell/table_text.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using desktop::FamilyListModel;
using people::AddressBookEntry;
using people::FileStatus;

namespace {

AddressBookEntry entry(int key, const QString& surname, const QString& name, const QString& suburb)
{
    AddressBookEntry made;
    made.Surname_ID = key;
    made.surname = surname;
    made.name = name;
    made.suburb = suburb;
    made.phone = u"555 %1"_s.arg(1000 - key);
    return made;
}

std::vector<AddressBookEntry> some_families()
{
    return {entry(1, u"de la Cruz"_s, u"Begoña"_s, u"Pepperwood"_s),  entry(2, u"Hannan"_s, u"Lee"_s, u"Ann Bay"_s),
            entry(3, u"Naismith"_s, u"Ann"_s, u"Ironstone"_s),        entry(4, u"O'Brien"_s, u"Zoë"_s, u"Ironstone"_s),
            entry(5, u"Smith-Jones"_s, u"Anna"_s, u"Heron's Rest"_s), entry(6, u"Žižek"_s, u"Jan"_s, u"Dry Willow"_s)};
}

QStringList shown_surnames(const FamilyListModel& model)
{
    QStringList names;
    for (int row = 0; row < model.rowCount(); ++row)
        names += model.entry(row).surname;
    return names;
}

struct Typed
{
    const char16_t* words;
    QStringList found;
};

} // namespace

TEST(FamilyListModel, EveryTypedWordBeginsAWordOfNameOrSuburbInAnyOrder)
{
    FamilyListModel model;
    model.set_entries(some_families());
    const std::vector<Typed> cases{
        {u"ann", {u"Hannan"_s, u"Naismith"_s, u"Smith-Jones"_s}},
        {u"ann nai", {u"Naismith"_s}},
        {u"  IRON  nai ", {u"Naismith"_s}},
        {u"zizek", {u"Žižek"_s}},
        {u"ZOË", {u"O'Brien"_s}},
        {u"begona", {u"de la Cruz"_s}},
        {u"cruz de", {u"de la Cruz"_s}},
        {u"obr", {u"O'Brien"_s}},
        {u"brien", {u"O'Brien"_s}},
        {u"o'br", {u"O'Brien"_s}},
        {u"jones", {u"Smith-Jones"_s}},
        {u"smith-j", {u"Smith-Jones"_s}},
        {u"herons", {u"Smith-Jones"_s}},
        {u"mith", {}},
    };
    for (const auto& typed : cases) {
        model.narrow(QString::fromUtf16(typed.words));
        EXPECT_EQ(shown_surnames(model), typed.found) << QString::fromUtf16(typed.words).toStdString();
    }
}

TEST(FamilyListModel, TypingOnNarrowsSixtyThousandFamiliesToTheSameAsTypingItAtOnce)
{
    std::vector<AddressBookEntry> many;
    for (int key = 0; key < 60'000; ++key)
        many.push_back(
            entry(key, u"Family%1"_s.arg(key % 7919), u"Name%1"_s.arg(key % 31), u"Suburb%1"_s.arg(key % 97)));
    FamilyListModel model;
    model.set_entries(many);

    for (const auto& typed : {u"f"_s, u"family1"_s, u"family12"_s, u"family12 n"_s, u"family12 name3"_s})
        model.narrow(typed);

    const auto expected = std::count_if(many.begin(), many.end(), [](const AddressBookEntry& one) {
        return one.surname.startsWith(u"Family12") && one.name.startsWith(u"Name3");
    });
    EXPECT_EQ(model.rowCount(), int(expected));
    model.narrow(u"family12"_s);
    EXPECT_EQ(model.rowCount(), int(std::count_if(many.begin(), many.end(), [](const AddressBookEntry& one) {
                  return one.surname.startsWith(u"Family12");
              })));
    model.narrow({});
    EXPECT_EQ(model.rowCount(), 60'000);
}

TEST(FamilyListModel, AColumnsOrderHoldsThroughTheFilterAndANewList)
{
    FamilyListModel model;
    model.set_entries(some_families());
    model.sort(FamilyListModel::first_name, Qt::DescendingOrder);
    EXPECT_EQ(shown_surnames(model),
              QStringList({u"O'Brien"_s, u"Hannan"_s, u"Žižek"_s, u"de la Cruz"_s, u"Smith-Jones"_s, u"Naismith"_s}));

    model.narrow(u"ann"_s);
    EXPECT_EQ(shown_surnames(model), QStringList({u"Hannan"_s, u"Smith-Jones"_s, u"Naismith"_s}));

    model.set_entries(some_families());
    EXPECT_EQ(shown_surnames(model), QStringList({u"Hannan"_s, u"Smith-Jones"_s, u"Naismith"_s}));
    EXPECT_EQ(model.surname_ids(), std::vector<int>({2, 5, 3}));
}

TEST(FamilyListModel, AStatusIsAWordAndBookedOutHasAnArrow)
{
    AddressBookEntry lent = entry(1, u"Naismith"_s, u"Ann"_s, {});
    lent.booked_out = true;
    EXPECT_EQ(desktop::status_words(lent), u"\u2192 Booked out"_s);
    EXPECT_EQ(desktop::state_of(lent), desktop::State::booked_out);
    lent.Condition = FileStatus::archive;
    EXPECT_EQ(desktop::status_words(lent), u"Archive \u2192 Booked out"_s);
    lent.booked_out = false;
    EXPECT_EQ(desktop::status_words(lent), u"Archive"_s);
    EXPECT_EQ(desktop::state_of(lent), desktop::State::archive);
}

TEST(FamilyListModel, IsSavedAsSeparatedTextThatASpreadsheetReads)
{
    FamilyListModel model;
    model.set_entries({entry(1, u"Lee, \"Bud\""_s, u"Zoë"_s, u"Ironstone"_s)});
    EXPECT_EQ(desktop::csv_of(model), QByteArray("\xEF\xBB\xBF"
                                                 "Name,First name,Suburb,Phone,Status\r\n"
                                                 "\"Lee, \"\"Bud\"\"\",Zo\xC3\xAB,Ironstone,555 999,Active\r\n"));
}

} // namespace kindrel::test

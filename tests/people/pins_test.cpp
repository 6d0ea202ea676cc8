#include "people/family_store.h"
#include "people/pins.h"
#include "setup_fixture.h"
#include "support/processes.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Answer;
using core::Area;

namespace {

const QDate today(2026, 11, 22);
const auto search_on =
    u"A P.I.N. Number already exists for this person, do you wish to continue in searching for a new one?"_s;
const auto in_use = u"Caution: This P.I.N. is in use by another person and cannot be used."_s;
const auto safe = u"This P.I.N. is NOT in use by any other person and is safe to be used on this person."_s;
const auto no_access = u"Your security setup does not allow you access to any of the P.I.N. functions"_s;

class PinTest : public SetupTest
{
protected:
    static FamilyFile with_pins(const QString& surname, std::initializer_list<QString> pins)
    {
        auto file = family(surname, {});
        for (const auto& pin : pins) {
            file.people.push_back(person(u"%1 %2"_s.arg(surname).arg(file.people.size() + 1), 1));
            file.people.back().personal_pin = pin;
        }
        return file;
    }
    FamilyFile add(const QString& surname, std::initializer_list<QString> pins)
    {
        return save_family(session(), with_pins(surname, pins), today);
    }
    /// People without a name and family, for the sake of their PINs.
    void take(const QStringList& pins)
    {
        std::vector<std::vector<core::Value>> rows;
        for (const auto& pin : pins)
            rows.push_back({qint64{1000} + static_cast<qint64>(rows.size()), core::to_value(pin)});
        session().execute(u"DELETE FROM [tbl_pin];"_s);
        session().insert(u"tbl_pin"_s, {u"person_id"_s, u"personal_pin"_s}, rows);
    }
    void set_start(int start) { core::write_setting(session(), u"pin_auto_number_start"_s, start); }
    [[nodiscard]] qint64 start()
    {
        return number_of(session(), u"SELECT [pin_auto_number_start] FROM [tbl_startup];"_s);
    }
    [[nodiscard]] QString allocated(const FamilyFile& file, int index = 0)
    {
        return allocate_pin(desk->office, file, index).value_or(u"none"_s);
    }
};

QStringList numbers(int from, int to)
{
    QStringList found;
    for (int number = from; number <= to; ++number)
        found += QString::number(number);
    return found;
}

} // namespace

KINDREL_ON_BOTH_ENGINES(PinTest);

TEST(Pins, ATypedPinIsStoredAsANumberWithoutLeadingZeros)
{
    const std::vector<std::pair<QString, QString>> cases{
        {u" 0102\t"_s, u"102"_s}, {u"000"_s, u"0"_s}, {u"99999999999999999999"_s, u"99999999999999999999"_s},
        {u"12a"_s, {}},           {u"1 2"_s, {}},     {u"-5"_s, {}},
        {u"1.5"_s, {}},           {u"  "_s, {}},      {u"٤٢"_s, {}}};
    for (const auto& [typed, stored] : cases)
        EXPECT_EQ(tidy_pin(typed), stored) << typed.toStdString();
}

TEST_P(PinTest, TheNextNumberThatNobodyHasIsOfferedAndTheCounterStandsBehindIt)
{
    struct Case
    {
        int start;
        QStringList taken;
        int offered;
    };
    for (const auto& [from, taken, offered] :
         {Case{100, {u"100"_s, u"101"_s}, 102}, Case{100, {}, 100}, Case{0, {u"2"_s}, 1}, Case{-7, {u"1"_s}, 2},
          Case{8, {u"8"_s, u"9"_s, u"10"_s, u"11"_s, u"100"_s}, 12}, Case{9, {u"90"_s, u"9a"_s, u"9"_s, u"x"_s}, 10},
          Case{5, {u"1"_s, u"3"_s, u"6"_s}, 5}, Case{1, numbers(1, 12000), 12001}}) {
        take(taken);
        set_start(from);
        EXPECT_EQ(allocated(with_pins(u"New"_s, {{}})), QString::number(offered)) << "from " << from;
        EXPECT_EQ(start(), offered + 1);
        EXPECT_EQ(desk->office.settings.pin_auto_number_start, offered + 1);
    }
}

TEST_P(PinTest, NumbersTypedForOthersOfTheFileAndNotYetSavedArePassedOver)
{
    take({u"101"_s, u"103"_s});
    set_start(100);
    EXPECT_EQ(allocated(with_pins(u"New"_s, {u"100"_s, {}, u"104"_s, u"102"_s}), 1), u"105"_s);
}

TEST_P(PinTest, TheCounterCountsAsItStandsInTheRegisterNow)
{
    desk->office.settings.pin_auto_number_start = 100;
    set_start(500);
    EXPECT_EQ(allocated(with_pins(u"New"_s, {{}})), u"500"_s);
}

TEST_P(PinTest, APersonWhoHasANumberKeepsItUnlessANewOneIsWanted)
{
    const auto file = add(u"Smith"_s, {u"7"_s});
    set_start(7);
    desk->dialogue.expect_confirm(search_on, Answer::no, Answer::no);
    EXPECT_EQ(allocate_pin(desk->office, file, 0), std::nullopt);
    EXPECT_EQ(start(), 7) << "The counter moved although nothing was allocated.";
    desk->dialogue.expect_confirm(search_on, Answer::yes);
    EXPECT_EQ(allocated(file), u"8"_s);
}

TEST_P(PinTest, OnlyWhoSeesGivingWorksWithNumbers)
{
    const auto file = with_pins(u"New"_s, {{}});
    set_start(5);
    for (const auto area : {Area::full_financial, Area::pin_financial_only}) {
        desk->office.rights = {};
        desk->office.rights.set(area, true);
        EXPECT_TRUE(pins_permitted(desk->office));
    }
    desk->office.rights = core::Rights::all();
    desk->office.rights.set(Area::full_financial, false);
    desk->office.rights.set(Area::pin_financial_only, false);
    for (int times = 0; times < 2; ++times)
        desk->dialogue.expect_box(no_access);
    EXPECT_EQ(allocate_pin(desk->office, file, 0), std::nullopt);
    check_pin(desk->office, file, 0);
    EXPECT_EQ(start(), 5);
}

TEST_P(PinTest, WorkstationsThatAllocateAtOnceAreOfferedDifferentNumbers)
{
    constexpr int each = 25;
    const auto allocate = [this] {
        desk->office.session = church->another();
        QStringList found;
        for (int round = 0; round < each; ++round)
            found += allocated(with_pins(u"New"_s, {{}}));
        return found.join(u' ').toUtf8();
    };
    set_start(1);
    desk->office.session.reset();
    church->close();

    QSet<QByteArray> offered;
    for (const auto& result : run_together({allocate, allocate, allocate})) {
        for (const auto& number : result.split(' '))
            offered.insert(number);
    }

    church->reopen();
    EXPECT_EQ(offered.size(), 3 * each);
    EXPECT_EQ(start(), 3 * each + 1);
}

TEST_P(PinTest, CheckingANumberLooksAtTheFileInMemoryAndAtTheRegister)
{
    (void)add(u"Other"_s, {u"7"_s});
    auto stored = add(u"Smith"_s, {u"20"_s, u"21"_s});
    stored.people[0].personal_pin = u"22"_s;
    struct Case
    {
        QString pin, answer;
    };
    for (const auto& [pin, answer] :
         {Case{u"7"_s, in_use}, Case{u"22"_s, in_use}, Case{u"21"_s, safe}, Case{u"20"_s, safe}, Case{u"8"_s, safe},
          Case{{},
               u"Before using this option, enter a persons P.I.N. number to see if anyone else has the same P.I.N. "
               "number."_s}}) {
        stored.people[1].personal_pin = pin;
        desk->dialogue.expect_box(answer);
        check_pin(desk->office, stored, 1);
        desk->dialogue.verify();
    }
}

TEST_P(PinTest, ASaveIsRefusedForThePersonWhoIsGivenANumberOfAnother)
{
    (void)add(u"Other"_s, {u"7"_s});
    const auto stored = add(u"Smith"_s, {u"20"_s, u"21"_s, u"22"_s});
    struct Case
    {
        std::initializer_list<const char*> pins;
        int refused; ///< The place of the person; -1 for none.
    };
    for (const auto& [pins, refused] :
         {Case{{"20", "21", "22"}, -1}, Case{{"20", "7", "22"}, 1}, Case{{"", "", ""}, -1}, Case{{"30", "31", "30"}, 2},
          Case{{"21", "21", "22"}, 0}, Case{{"20", "20", "22"}, 1}, Case{{"22", "20", "21"}, -1},
          Case{{"22", "20"}, -1}}) {
        auto file = stored;
        file.people.resize(pins.size());
        std::ranges::transform(pins, file.people, file.people.begin(), [](const char* pin, Person person) {
            person.personal_pin = QString::fromLatin1(pin);
            return person;
        });
        const auto message = pin_clash(session(), file);
        EXPECT_EQ(message.has_value(), refused >= 0) << *pins.begin();
        if (refused < 0) {
            EXPECT_NO_THROW((void)save_family(session(), file, today));
            (void)save_family(session(), stored, today);
        } else if (message) {
            const auto& name = stored.people[static_cast<std::size_t>(refused)].Name;
            EXPECT_EQ(message->text,
                      u"You have attempted to add a P.I.N. number to %1 that is already in use by another person, "
                      "please assign a new P.I.N. number to %1"_s.arg(name));
        }
    }
}

TEST_P(PinTest, ANewFileIsRefusedANumberOfTheRegisterOrOneGivenTwice)
{
    (void)add(u"Other"_s, {u"7"_s});
    EXPECT_FALSE(pin_clash(session(), with_pins(u"New"_s, {u"8"_s, {}, {}})));
    EXPECT_TRUE(pin_clash(session(), with_pins(u"New"_s, {u"8"_s, u"8"_s})));
    EXPECT_TRUE(pin_clash(session(), with_pins(u"New"_s, {u"8"_s, u"7"_s})));
    session().execute(u"DELETE FROM [tbl_people];"_s);
    EXPECT_TRUE(pin_clash(session(), with_pins(u"New"_s, {u"7"_s}))) << "The number of a row whose person is gone.";
}

} // namespace kindrel::test

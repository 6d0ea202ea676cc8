#include "output/output_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int child = 5;
constexpr int married = 4;

people::FamilyFile naismith()
{
    auto one = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s});
    one.address.res_street = u"12 Long Street"_s;
    one.residential = people::Suburb{1, people::SuburbType::residential, {}, {}, {}};
    one.address.phone = u"9555 1234"_s;
    one.address.family_mobile = u"0411 222"_s;
    one.address.family_email = u"n@example.org"_s;
    auto& ann = one.people[0];
    ann.birthdate = core::Date{core::Date::unknown_year, 5, 12};
    ann.middle_name = u"May"_s;
    ann.mobile_phone = u"0412 333"_s;
    ann.Personal_email = u"ann@example.org"_s;
    ann.business_phone = u"9555 9"_s;
    one.people[2].school_year = 3;
    return one;
}

/// Somebody whose address is not to be printed.
people::FamilyFile unlisted(const QString& surname, const QString& name)
{
    auto one = family(surname, {name});
    one.address.res_hidden = true;
    return one;
}

class DirectoryLayoutsTest : public ReportTest
{
protected:
    void choose(QStringView key)
    {
        report = *output::find_report(key);
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
    }
    /// The texts of the entries, header and footer left out.
    [[nodiscard]] std::string entries() { return texts().sliced(3).join(u" | "_s).toStdString(); }
};

} // namespace

TEST_F(DirectoryLayoutsTest, EachDirectoryPrintsItsOwnPartOfTheFamilyInItsOrder)
{
    add({naismith()});
    const std::string plain = "Naismith | Ann & Ben | Cid | 12 Long Street | suburb 1 3000 | Family Ph: 9555 1234 | "
                              "Family Mobile: 0411 222 | Family Email: n@example.org";
    const std::string phones = "Naismith | Ann & Ben | Cid | 12 Long Street | suburb 1 3000 | Family Ph: 9555 1234 | "
                               "Family Mobile: 0411 222 | Ann  Mobile: 0412 333 | Ann  Business Phone: 9555 9";
    const std::string details =
        "Naismith | 12 Long Street | suburb 1 3000 | Family Ph: 9555 1234 | "
        "Family Mobile: 0411 222 | Family Email: n@example.org | Ann | Birth Date: 12/05/XXXX | "
        "Middle Name: May | Mobile: 0412 333  Business Phone: 9555 9 | "
        "Email: ann@example.org | Ben | Cid | School Year: 3";
    const auto narrow = QString::fromStdString(details).replace(u"  "_s, u" | "_s).toStdString();
    struct Case
    {
        QString name, key;
        std::string entry;
    };
    const std::vector<Case> cases{
        {u"Directory 1"_s, u"k10"_s, plain},
        {u"Directory 2"_s, u"k11"_s, plain},
        {u"Directory 3"_s, u"k12"_s, "N | " + plain},
        {u"Directory 4 (Landscape)"_s, u"k13"_s, plain},
        {u"Directory 5 (Landscape)"_s, u"k14"_s, "N | " + plain},
        {u"Directory 6"_s, u"k15"_s, details},
        {u"Directory 7"_s, u"k16"_s, details},
        {u"Directory 8"_s, u"k17"_s, narrow},
        {u"Directory 9 (Landscape)"_s, u"k18"_s, details},
        {u"Directory 10 (Landscape)"_s, u"k19"_s, plain},
        {u"Directory 11 (Landscape)"_s, u"k20"_s, "N | " + plain},
        {u"Directory 12 (Landscape)"_s, u"k21"_s, phones},
        {u"Directory 13 (Landscape)"_s, u"k22"_s, "N | " + phones},
        {u"Directory 14 (Landscape)"_s, u"k23"_s, details},
    };
    for (const auto& one : cases) {
        choose(one.key);
        EXPECT_EQ(QString::fromUtf8(report.leaf), one.name);
        EXPECT_EQ(entries(), one.entry) << one.name.toStdString();
    }
}

TEST_F(DirectoryLayoutsTest, TheLandscapeOnesLieAndTheOthersStand)
{
    add({naismith()});
    for (const auto& one : output::catalogue()) {
        if (QByteArray(one.family) != "Church Directories")
            continue;
        report = one;
        pages::PageSpool spool;
        ASSERT_TRUE(run(spool));
        const auto size = spool.page(1).size;
        EXPECT_EQ(size.width() > size.height(), QByteArray(one.leaf).contains("(Landscape)")) << one.leaf;
    }
}

TEST_F(DirectoryLayoutsTest, ALetterOfAnotherAlphabetIsFiledWhereTheListFilesIt)
{
    choose(u"k12");
    add({unlisted(u"Dobson"_s, u"Di"_s), unlisted(u"Đorđić"_s, u"Zdeňka"_s), unlisted(u"Dunn"_s, u"Al"_s)});

    EXPECT_EQ(entries(), "D | Dobson | Di | Đorđić | Zdeňka | Dunn | Al");
}

TEST_F(DirectoryLayoutsTest, AListInAnotherOrderThanThatOfSurnamesHasNoLetters)
{
    const std::vector<std::pair<QStringList, std::string>> cases{
        {{u"Abel"_s, u"Zuse"_s, u"Adams"_s}, "Abel | Ann | Zuse | Ann | Adams | Ann"},
        {{u"Abel"_s, u"4 Square"_s, u"Adams"_s}, "Abel | Ann | 4 Square | Ann | Adams | Ann"},
        {{u"4 Square"_s, u"Abel"_s, u"[Unknown]"_s}, "# | 4 Square | Ann | A | Abel | Ann | # | [Unknown] | Ann"},
        {{u"Abel"_s, u"Zuse"_s}, "A | Abel | Ann | Z | Zuse | Ann"},
    };
    choose(u"k12");
    for (const auto& [surnames, printed] : cases) {
        list.members.clear();
        for (const auto& surname : surnames)
            add({unlisted(surname, u"Ann"_s)});
        EXPECT_EQ(entries(), printed);
    }
}

TEST_F(DirectoryLayoutsTest, TheFootTellsWhichDirectoryItIsWhateverTheTitle)
{
    add({naismith()});
    for (const auto& title : {QString(), u"Camp in May"_s}) {
        options.title = title;
        for (const auto& key : {u"k10"_s, u"k13"_s}) {
            choose(key);
            const auto all = texts();
            EXPECT_EQ(all[0], title.isEmpty() ? u"Church Directory"_s : title);
            EXPECT_EQ(all[1], QString::fromUtf8(report.leaf));
        }
    }
}

TEST_F(DirectoryLayoutsTest, OnlyThePeopleOfTheListStandWithTheirDetails)
{
    choose(u"k15");
    add({naismith()});
    list.members.erase(list.members.begin());

    EXPECT_EQ(entries(), "Naismith | 12 Long Street | suburb 1 3000 | Family Ph: 9555 1234 | Family Mobile: 0411 222 | "
                         "Family Email: n@example.org | Ben | Cid | School Year: 3");
}

TEST_F(DirectoryLayoutsTest, APersonWithoutDetailsLeavesOnlyTheName)
{
    for (const auto& key : {u"k15"_s, u"k17"_s, u"k23"_s}) {
        list.members.clear();
        choose(key);
        add({unlisted(u"Abel"_s, u"Niels"_s)});
        EXPECT_EQ(entries(), "Abel | Niels") << key.toStdString();
    }
}

TEST_F(DirectoryLayoutsTest, AFamilyHigherThanAColumnIsDividedAndNamedAgain)
{
    auto large = family(u"Large"_s, {});
    for (int number = 1; number <= people::most_people; ++number) {
        auto one = person(u"Person%1x"_s.arg(number), number < 3 ? married : child);
        one.birthdate = core::Date{2000, 1, number};
        one.middle_name = one.other_surname = u"Middle"_s;
        one.mobile_phone = u"0400 %1"_s.arg(1000 + number);
        one.Personal_email = u"person%1x@example.org"_s.arg(number);
        one.business_email = u"work@example.org"_s;
        one.business_phone = one.business_fax = u"9555 1234 after six, or ask"_s;
        large.people.push_back(one);
    }
    for (const auto& key : {u"k15"_s, u"k17"_s, u"k18"_s, u"k23"_s}) {
        list.members.clear();
        choose(key);
        add({large});
        const auto text = pdf_text(pages::Paper::letter);
        for (const auto& one : large.people) {
            EXPECT_EQ(text.count(one.Name), 1) << key.toStdString() << one.Name.toStdString();
            EXPECT_EQ(text.count(one.mobile_phone), 1) << key.toStdString();
        }
        const bool stacked = key == u"k17"_s || key == u"k18"_s;
        EXPECT_EQ(text.contains(u"Large (continued)"_s), stacked) << key.toStdString();
    }
}

} // namespace kindrel::test

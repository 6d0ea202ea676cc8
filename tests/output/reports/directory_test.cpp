#include "output/output_fixture.h"

#include "output/reports/directory.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int child = 5;
constexpr int married = 4;
constexpr int single = 1;

people::FamilyFile at_home(people::FamilyFile family)
{
    family.address.res_street = u"12 Long Street"_s;
    family.address.res_state = u"VIC"_s;
    family.residential = people::Suburb{1, people::SuburbType::residential, {}, {}, {}};
    return family;
}

/// Somebody whose address is not to be printed.
people::FamilyFile unlisted(const QString& surname, const QString& name)
{
    auto one = family(surname, {name});
    one.address.res_hidden = true;
    return one;
}

class DirectoryTest : public ReportTest
{
protected:
    /// The texts behind those of header and footer.
    [[nodiscard]] QStringList entries()
    {
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
        const auto all = texts();
        EXPECT_EQ(all.value(2), u"Page: 1 of 1"_s);
        return all.sliced(3);
    }
    /// For the tales of failing tests.
    [[nodiscard]] static std::string told(const QStringList& lines) { return lines.join(u" | "_s).toStdString(); }
};

} // namespace

TEST_F(DirectoryTest, AnEntryHoldsNamesThenAddressThenContacts)
{
    auto one = at_home(family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s, u"Dot"_s}));
    one.address.phone = u"9555 1234"_s;
    one.address.family_fax = u"9555 1235"_s;
    one.address.family_email = u"naismith@example.org"_s;
    one.address.res_map = u"72"_s;
    one.address.res_ref = u"B12"_s;
    add({one});

    const QStringList expected{u"Naismith"_s,
                               u"Ann & Ben"_s,
                               u"Cid, Dot"_s,
                               u"12 Long Street"_s,
                               u"suburb 1 VIC 3000"_s,
                               u"Family Ph: 9555 1234  Family Fax: 9555 1235"_s,
                               u"Family Email: naismith@example.org"_s,
                               u"Map: 72 Ref: B12"_s};
    EXPECT_EQ(told(entries()), told(expected));
}

TEST_F(DirectoryTest, TheSpouseComesBeforeTheChildrenWhateverTheFamilyOrder)
{
    auto one = unlisted(u"Naismith"_s, u"Ann"_s);
    one.people = {person(u"Ann"_s, married), person(u"Cid"_s, child), person(u"Ben"_s, married),
                  person(u"Dot"_s, child), person(u"Edna"_s, single)};
    add({one});

    EXPECT_EQ(told(entries()), "Naismith | Ann & Ben & Edna | Cid, Dot");
}

TEST_F(DirectoryTest, WhatIsNotThereLeavesNoLine)
{
    struct Case
    {
        const char* what;
        QString street, state;
        bool suburb, hidden;
        QStringList lines;
    };
    const std::vector<Case> cases{
        {"nothing", {}, {}, false, false, {u"Unknown Suburb"_s}},
        {"hidden", u"1 Main St"_s, u"SA"_s, false, true, {}},
        {"suburb alone", {}, {}, true, false, {u"suburb 1 3000"_s}},
        {"state alone", {}, u"SA"_s, false, false, {u"Unknown Suburb SA"_s}},
        {"street without suburb", u"1 Main St"_s, {}, false, false, {u"1 Main St"_s, u"Unknown Suburb"_s}},
        {"street, state and suburb", u"1 Main St"_s, u"SA"_s, true, false, {u"1 Main St"_s, u"suburb 1 SA 3000"_s}},
    };
    for (const auto& one : cases) {
        list.members.clear();
        auto file = family(u"Abel"_s, {u"Niels"_s});
        file.address.res_street = one.street;
        file.address.res_state = one.state;
        file.address.res_hidden = one.hidden;
        if (one.suburb)
            file.residential = people::Suburb{1, people::SuburbType::residential, {}, {}, {}};
        add({file});

        EXPECT_EQ(told(entries()), told(QStringList({u"Abel"_s, u"Niels"_s}) + one.lines)) << one.what;
    }
}

TEST_F(DirectoryTest, AFaxWithoutAPhoneStandsAtTheBeginningOfItsLine)
{
    auto one = unlisted(u"Abel"_s, u"Niels"_s);
    one.address.family_fax = u"9555 1235"_s;
    add({one});

    EXPECT_EQ(told(entries()), "Abel | Niels | Family Fax: 9555 1235");
}

TEST_F(DirectoryTest, PhoneAndFaxThatDoNotFitBesideEachOtherStandOnLinesOfTheirOwn)
{
    auto one = unlisted(u"Abel"_s, u"Niels"_s);
    one.address.phone = u"(03) 9555 1234 after six, or next door"_s;
    one.address.family_fax = u"9555 1235"_s;
    add({one});

    EXPECT_EQ(told(entries()),
              "Abel | Niels | Family Ph: (03) 9555 1234 after six, or next door | Family Fax: 9555 1235");
}

TEST_F(DirectoryTest, EveryLayoutPrintsTheSameContentAndItsLetterBands)
{
    auto ann = at_home(family(u"Abel"_s, {u"Ann"_s}));
    ann.address.phone = u"9555 1234"_s;
    add({ann, unlisted(u"Ångström"_s, u"Bo"_s), unlisted(u"Zuse"_s, u"Konrad"_s)});
    const std::string plain =
        "Abel | Ann | 12 Long Street | suburb 1 VIC 3000 | Family Ph: 9555 1234 | Ångström | Bo | "
        "Zuse | Konrad";
    const std::string banded =
        "A | Abel | Ann | 12 Long Street | suburb 1 VIC 3000 | Family Ph: 9555 1234 | Ångström | "
        "Bo | Z | Zuse | Konrad";

    for (const auto shape : {output::EntryShape::side_by_side, output::EntryShape::stacked}) {
        for (const auto bands : {output::LetterBands::off, output::LetterBands::on}) {
            const output::DirectoryLayout layout{
                {.title = "Church Directory", .page = {.columns = shape == output::EntryShape::stacked ? 2 : 1}},
                shape,
                bands};
            report.layout = &layout;
            EXPECT_EQ(told(entries()), bands == output::LetterBands::on ? banded : plain);
        }
    }
}

TEST_F(DirectoryTest, AFamilyStaysTogetherOnItsPage)
{
    std::vector<people::FamilyFile> families;
    for (int number = 0; number < 60; ++number) {
        const auto mark = QString::number(1000 + number);
        auto one = at_home(family(u"Family"_s + mark, {u"Ann"_s + mark, u"Ben"_s}));
        one.address.res_country = u"Country"_s + mark;
        one.address.phone = u"Phone"_s + mark;
        families.push_back(one);
    }
    add(families);

    const auto pages = this->pages();

    ASSERT_GT(pages.size(), 2u);
    for (const auto& texts : pages) {
        const auto page = texts.join(u'\n');
        for (int mark = 1000; mark < 1060; ++mark)
            EXPECT_EQ(page.count(QString::number(mark)) % 4, 0) << mark;
    }
}

TEST_F(DirectoryTest, AFamilyOfSeventeenIsPrintedWhole)
{
    auto one = family(u"Large"_s, {u"Ann"_s, u"Ben"_s});
    for (int number = 3; number <= people::most_people; ++number)
        one.people.push_back(person(u"Child%1x"_s.arg(number), child));
    add({one});

    const auto text = pdf_text();

    for (const auto& member : one.people)
        EXPECT_TRUE(text.contains(member.Name)) << member.Name.toStdString();
}

TEST_F(DirectoryTest, NamesOfSixtyLettersAreBrokenNotCut)
{
    const auto surname = u"Wolfeschlegelsteinhausenbergerdorffwelchevoralternwarengewiss"_s.first(60);
    const auto name = u"Hubertblainewolfgangadolphcharlesdavidearlfrederickgeraldxyz"_s;
    auto one = family(surname, {name, name});
    one.address.family_email = name + u'@' + surname + u".example.org"_s;
    add({one});

    const auto text = pdf_text().remove(u' ');

    EXPECT_EQ(text.count(name), 3);
    EXPECT_EQ(text.count(surname), 2);
}

TEST_F(DirectoryTest, AccentsAndRightToLeftNamesAreKept)
{
    auto polish = family(u"Żółć-O’Brien"_s, {u"Zoë"_s, u"Stanisław"_s});
    auto hebrew = family(u"כהן"_s, {u"אברהם"_s, u"שרה"_s, u"יצחק"_s});
    auto arabic = family(u"الخطيب"_s, {u"محمد"_s});
    add({polish, hebrew, arabic});

    const auto all = texts();

    for (const auto& text :
         {u"Żółć-O’Brien"_s, u"Zoë & Stanisław"_s, u"כהן"_s, u"אברהם & שרה"_s, u"יצחק"_s, u"الخطيب"_s, u"محمد"_s})
        EXPECT_TRUE(all.contains(text)) << text.toStdString();
    const auto pdf = pdf_text().normalized(QString::NormalizationForm_KC).remove(u' ');
    for (const auto& text : {u"Żółć-O’Brien"_s, u"Zoë&Stanisław"_s, u"כהן"_s, u"الخطيب"_s, u"محمد"_s})
        EXPECT_TRUE(pdf.contains(text)) << pdf.toStdString();
}

TEST_F(DirectoryTest, ThePaperIsTheOneAskedFor)
{
    add({at_home(family(u"Abel"_s, {u"Niels"_s}))});

    static_cast<void>(pdf_text(pages::Paper::a4));
    EXPECT_TRUE(output_of(u"pdfinfo"_s, {pdf_file()}).contains(u"(A4)"_s));
    static_cast<void>(pdf_text(pages::Paper::letter));
    EXPECT_TRUE(output_of(u"pdfinfo"_s, {pdf_file()}).contains(u"(letter)"_s));
}

} // namespace kindrel::test

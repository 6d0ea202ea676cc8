#include "output/output_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class NamesReportTest : public ReportTest
{
protected:
    NamesReportTest()
    {
        report = *output::find_report(u"Names Report");
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
    }
    [[nodiscard]] std::string names() { return texts().sliced(3).join(u" | "_s).toStdString(); }
};

} // namespace

TEST_F(NamesReportTest, PeopleStandInTheOrderOfTheListWhateverTheirFamilies)
{
    add({family(u"Zuse"_s, {u"Konrad"_s, u"Gisela"_s}), family(u"Abel"_s, {u"Niels"_s})});
    std::swap(list.members[1], list.members[2]);

    EXPECT_EQ(names(), "Zuse, Konrad | Abel, Niels | Zuse, Gisela");
}

TEST_F(NamesReportTest, OnlyNamesArePrintedAndPreferredOnesWhereTheChurchPrefersThem)
{
    auto one = full_family(false);
    for (auto& person : one.people)
        person.other_surname.clear();
    add({one});
    EXPECT_EQ(names(), "Żółć-O’Brien, Zoë | Żółć-O’Brien, Stanisław | Żółć-O’Brien, Kid");

    office.settings.use_preferred_names = true;
    EXPECT_EQ(names(), "Żółć-O’Brien, Zoëpreferred | Żółć-O’Brien, Stanisławpreferred | Żółć-O’Brien, Kidpreferred");
}

TEST_F(NamesReportTest, WhoHasOneNameAloneStandsWithoutAComma)
{
    add({family(u"Naismith"_s, {u"Prince"_s})});
    office.session->execute(u"UPDATE [tbl_surname] SET [surname]='';"_s);

    EXPECT_EQ(names(), "Prince");
}

TEST_F(NamesReportTest, ALongNameIsBrokenNotCut)
{
    const auto surname = u"Wolfeschlegelsteinhausenbergerdorffwelchevoralternwarengewiss"_s;
    add({family(surname, {u"Hubertblainewolfgangadolphcharlesdavidearlfrederickgeraldxyz"_s})});

    const auto text = pdf_text().remove(u' ');

    EXPECT_TRUE(text.contains(surname + u",Hubertblainewolfgangadolphcharlesdavidearlfrederickgeraldxyz"_s))
        << text.toStdString();
}

} // namespace kindrel::test

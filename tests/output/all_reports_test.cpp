#include "output/output_fixture.h"

#include <QRegularExpression>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int married = 4;
constexpr int child = 5;

/// Runs every report of the catalogue over one list.
class AllReportsTest : public ReportTest
{
protected:
    void SetUp() override { office.settings.use_preferred_names = true; }

    /// The page for testing a barcode reader shows the first two of the list alone, and is left out where asked.
    enum class Reader { with, without };

    template <class Check>
    void for_each_report(const Check& check, Reader reader = Reader::with)
    {
        for (const auto& each : output::catalogue()) {
            if (reader == Reader::without && std::string_view(each.leaf) == "Test Your Barcode Reader Report")
                continue;
            SCOPED_TRACE(std::string(each.key) + ' ' + each.leaf);
            report = each;
            check(each);
        }
    }
    /// All texts on all pages in one, as they are laid out.
    [[nodiscard]] QString printed() { return texts().join(u' '); }
};

/// Whether a report without entries says that it has none.
bool says_nobody(const QString& text)
{
    return QRegularExpression(u"There (is|are) no |Nobody |No family "_s).match(text).hasMatch();
}

/// Reports that speak of families, or of groups, and name no more than those who head them.
bool names_everybody(const output::ReportDefinition& report)
{
    static const QStringList families{
        u"Mailing Labels"_s,      u"Brief Report (Landscape)"_s, u"Other Contact Report"_s,
        u"Family Group Report"_s, u"Family Events Report"_s,     u"Family Date Report"_s,
        u"Visitation Report"_s,   u"All Family Group Report"_s,  u"Family Edited & Created Report"_s};
    return !families.contains(QString::fromUtf8(report.leaf));
}

/// Everybody of the family carries what the first one carries, so that every report has something to say of each.
people::FamilyFile crowd(const QString& surname, const QStringList& names)
{
    auto family = full_family(false);
    family.family.surname = surname;
    const auto example = family.people.front();
    family.people.clear();
    for (const auto& name : names) {
        auto& person = family.people.emplace_back(example);
        person.Name = name;
        person.preferred_name = name;
        person.Marital = family.people.size() <= 2 ? married : child;
        person.other_surname.clear();
        person.personal_pin.clear();
    }
    return family;
}

/// Breaks between lines and inside of words do not count.
QString pressed(const QString& text)
{
    return text.normalized(QString::NormalizationForm_KC).remove(u' ');
}

} // namespace

TEST_F(AllReportsTest, NoHiddenWordIsInAnyPdf)
{
    const auto family = full_family(true);
    add({family});
    auto words = hidden_words(family);
    words += u"occupation 2"_s;

    for_each_report([&](const auto&) {
        const auto text = pdf_text();
        EXPECT_TRUE(text.contains(u"Zoë"_s) || text.contains(u"Żółć"_s) || says_nobody(text)) << qPrintable(text);
        for (const auto& word : words)
            EXPECT_FALSE(text.contains(word)) << word.toStdString() << " in " << qPrintable(text);
    });
}

TEST_F(AllReportsTest, WithoutTheirRightsBirthDatesNumbersAndVisitsAreInNoReport)
{
    add({full_family(false)});
    report = *output::find_report(u"All Information Report");
    const QStringList guarded{u"1977"_s, u"304"_s, u"A visitor"_s};
    const auto all = printed();
    for (const auto& word : guarded)
        ASSERT_TRUE(all.contains(word)) << qPrintable(all);
    for (const auto right : {core::Area::birth_dates, core::Area::full_financial, core::Area::pin_financial_only,
                             core::Area::visitation_tab})
        office.rights.set(right, false);

    for_each_report([&](const auto& each) {
        if (each.also && !office.may(*each.also))
            return;
        const auto text = printed();
        for (const auto& word : guarded)
            EXPECT_FALSE(text.contains(word)) << qPrintable(word + u" in "_s + text);
    });
}

TEST_F(AllReportsTest, PeopleAreListedUnderTheirOwnSurnameUnlessItIsHidden)
{
    const auto by_person = {u"k30",  u"k40",  u"k61",  u"k90",  u"k91",  u"k100", u"k103",
                            u"k110", u"k111", u"k130", u"k132", u"k140", u"k146", u"k150"};
    for (const bool hidden : {false, true}) {
        list.members.clear();
        auto one = crowd(u"Naismith"_s, {u"Ann"_s});
        one.people[0].other_surname = u"Quist"_s;
        one.people[0].surname_hidden = hidden;
        add({one});
        office.session->execute(u"DELETE FROM [tbl_group_history];"_s);
        office.session->execute(u"INSERT INTO [tbl_group_history] ([history_id],[person_id],[group_id],[group]) "
                                "VALUES (1,?,1,'group 1');"_s,
                                list.members[0].person_id);
        for (const auto* key : by_person) {
            report = *output::find_report(key);
            const auto text = printed();
            EXPECT_EQ(text.contains(u"Quist"_s), !hidden) << report.leaf << qPrintable(text);
            EXPECT_FALSE(text.contains(u"Other Surname"_s)) << report.leaf << qPrintable(text);
            EXPECT_EQ(text.contains(u"Naismith"_s), hidden) << report.leaf << qPrintable(text);
        }
    }
}

TEST_F(AllReportsTest, AnEmptyListIsRefusedByEach)
{
    for_each_report([&](const auto&) {
        dialogue.expect_box(u"No people found for creating a report"_s);
        pages::PageSpool spool;
        EXPECT_FALSE(run(spool));
        EXPECT_EQ(spool.page_count(), 0);
    });
}

TEST_F(AllReportsTest, SomebodyWithoutAnythingMakesAPageAllTheSame)
{
    add({family(u"Abel"_s, {u"Niels"_s})});

    for_each_report([&](const auto&) {
        const auto text = printed();
        EXPECT_TRUE(text.contains(u"Niels"_s) || text.contains(u"Abel"_s) || says_nobody(text)) << qPrintable(text);
    });
}

TEST_F(AllReportsTest, EverybodyOfAFamilyOfSeventeenIsNamed)
{
    QStringList names;
    for (int number = 1; number <= people::most_people; ++number)
        names += u"Name%1x"_s.arg(number);
    add({crowd(u"Large"_s, names)});

    for_each_report(
        [&](const auto& each) {
            const auto text = printed();
            EXPECT_TRUE(text.contains(u"Large"_s));
            for (const auto& name : names)
                EXPECT_TRUE(text.contains(name) || !names_everybody(each)) << qPrintable(name + u" in "_s + text);
        },
        Reader::without);
}

TEST_F(AllReportsTest, NamesOfSixtyLettersAreBrokenNotCut)
{
    const auto surname = u"Wolfeschlegelsteinhausenbergerdorffwelchevoralternwarengewiss"_s.first(60);
    const auto name = u"Hubertblainewolfgangadolphcharlesdavidearlfrederickgeraldxyz"_s;
    add({crowd(surname, {name})});

    for_each_report(
        [&](const auto& each) {
            const auto text = pressed(printed());
            EXPECT_TRUE(text.contains(surname)) << qPrintable(text);
            EXPECT_TRUE(text.contains(name) || !names_everybody(each)) << qPrintable(text);
        },
        Reader::without);
}

TEST_F(AllReportsTest, AccentsAndRightToLeftNamesAreKept)
{
    add({crowd(u"Żółć-O’Brien"_s, {u"Zoë"_s, u"Stanisław"_s}), crowd(u"כהן"_s, {u"אברהם"_s}),
         crowd(u"الخطيب"_s, {u"محمد"_s})});

    for_each_report(
        [&](const auto& each) {
            const auto text = printed();
            for (const auto& surname : {u"Żółć-O’Brien"_s, u"כהן"_s, u"الخطيب"_s})
                EXPECT_TRUE(text.contains(surname)) << qPrintable(surname + u" in "_s + text);
            for (const auto& name : {u"Zoë"_s, u"Stanisław"_s, u"אברהם"_s, u"محمد"_s})
                EXPECT_TRUE(text.contains(name) || !names_everybody(each)) << qPrintable(name + u" in "_s + text);
        },
        Reader::without);
}

TEST_F(AllReportsTest, NothingIsPrintedBeyondThePaper)
{
    QStringList names;
    for (int number = 1; number <= people::most_people; ++number)
        names += u"Some very long given name of person %1"_s.arg(number);
    add({crowd(u"A surname of considerable length"_s, names)});

    for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
        for_each_report([&](const auto&) {
            pages::PageSpool spool;
            ASSERT_TRUE(run(spool, paper));
            for (int number = 1; number <= spool.page_count(); ++number) {
                const auto page = spool.page(number);
                for (const auto& item : page.items) {
                    const auto* text = std::get_if<pages::TextItem>(&item);
                    if (!text || text->angle != 0)
                        continue;
                    EXPECT_GE(text->at.x(), 0) << qPrintable(text->text);
                    EXPECT_LE(text->at.x() + text->width, page.size.width() + 0.5) << qPrintable(text->text);
                    EXPECT_LE(text->at.y(), page.size.height()) << qPrintable(text->text);
                }
            }
        });
    }
}

} // namespace kindrel::test

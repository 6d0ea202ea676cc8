#include "output/output_fixture.h"
#include "output/page_reader.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

struct Sheet
{
    int number;
    bool print_name;
    int blanks;
    bool landscape;
    bool large;
};
const std::vector<Sheet> sheets{
    {1, false, 1, false, false}, {2, false, 1, false, true}, {3, false, 1, false, false}, {4, false, 1, false, true},
    {5, false, 2, false, false}, {6, false, 2, false, true}, {7, true, 1, true, false},   {8, true, 1, true, true},
    {9, true, 1, true, false},   {10, true, 1, true, true},  {11, true, 2, true, false},  {12, true, 2, true, true},
    {13, false, 1, true, false}, {14, false, 1, true, true},
};

const QStringList plain_headings{u"Name"_s, u"Time In"_s, u"Signature"_s, u"Time Out"_s, u"Signature"_s};
const QStringList print_name_headings{u"Name"_s,     u"Time In"_s,    u"Print Name"_s, u"Signature"_s,
                                      u"Time Out"_s, u"Print Name"_s, u"Signature"_s};

class SignInTest : public ReportTest
{
protected:
    void choose(const Sheet& sheet) { report = *output::find_report(u"Sign In/Out Report %1"_s.arg(sheet.number)); }
    void add_many(int count)
    {
        std::vector<people::FamilyFile> families;
        for (int number = 1; number <= count; ++number)
            families.push_back(family(u"Family"_s, {u"Child%1"_s.arg(number)}));
        add(families);
    }
    [[nodiscard]] std::vector<pages::Page> sheets_of(const Sheet& sheet, pages::Paper paper = pages::Paper::a4)
    {
        choose(sheet);
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool, paper));
        std::vector<pages::Page> all;
        for (int number = 1; number <= spool.page_count(); ++number)
            all.push_back(spool.page(number));
        return all;
    }
};

/// The headings of the table, from left to right.
QStringList headings_of(const pages::Page& page)
{
    QStringList headings;
    for (const auto& text : pages::texts_of(page, 1)) {
        if (print_name_headings.contains(text))
            headings += text;
    }
    return headings;
}

} // namespace

TEST_F(SignInTest, EveryPageHasTheSheetsHeadingsItsBlankColumnsAndItsNumber)
{
    add_many(30);

    for (const auto& sheet : sheets) {
        const auto all = sheets_of(sheet);
        ASSERT_GT(all.size(), 1u) << sheet.number;
        for (const auto& page : all) {
            const auto& headings = sheet.print_name ? print_name_headings : plain_headings;
            EXPECT_EQ(headings_of(page), headings) << sheet.number;
            EXPECT_EQ(lines_down(page).size(), std::size_t(headings.size() + sheet.blanks + 1)) << sheet.number;
            EXPECT_EQ(page.size.width() > page.size.height(), sheet.landscape) << sheet.number;
            EXPECT_EQ(texts_reading(page, u"Page: %1 of "_s.arg(page.number) + pages::page_total_mark).size(), 1u)
                << sheet.number;
        }
    }
}

TEST_F(SignInTest, ThereIsRoomToSignOnEveryPaper)
{
    add_many(1);
    constexpr qreal least_signature = 89.9, least_time = 50, least_blank = 30;

    for (const auto& sheet : sheets) {
        for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
            const auto lines = lines_down(sheets_of(sheet, paper).front());
            const auto& headings = sheet.print_name ? print_name_headings : plain_headings;
            for (qsizetype i = 0; i + 1 < qsizetype(lines.size()); ++i) {
                const auto heading = headings.value(i);
                const auto least = heading.isEmpty()               ? least_blank
                                   : heading.startsWith("Time"_L1) ? least_time
                                                                   : least_signature;
                EXPECT_GE(lines[std::size_t(i) + 1] - lines[std::size_t(i)], least) << sheet.number;
            }
        }
    }
}

TEST_F(SignInTest, LargeSpacingPutsFewerNamesOnAPage)
{
    add_many(30);

    for (std::size_t i = 0; i < sheets.size(); i += 2) {
        ASSERT_TRUE(!sheets[i].large && sheets[i + 1].large);
        EXPECT_GT(barcodes_of(sheets_of(sheets[i]).front()).size(),
                  1.2 * double(barcodes_of(sheets_of(sheets[i + 1]).front()).size()));
    }
}

TEST_F(SignInTest, TheBarcodeOfEachNameIsThatPersons)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}), family(u"Abel"_s, {u"Niels"_s})});
    std::swap(list.members[1], list.members[2]);

    for (const auto& sheet : sheets) {
        const auto page = sheets_of(sheet).front();
        const auto places = barcodes_of(page);
        const auto codes = scanned(page);
        ASSERT_EQ(codes.size(), 3) << sheet.number;
        const QStringList names{u"Naismith, Ann"_s, u"Abel, Niels"_s, u"Naismith, Ben"_s};
        for (qsizetype i = 0; i < 3; ++i) {
            EXPECT_EQ(codes[i], QString::number(list.members[std::size_t(i)].person_id) + u'$') << sheet.number;
            const auto name = texts_reading(page, names[i]);
            ASSERT_EQ(name.size(), 1u);
            const auto above = places[std::size_t(i)].top() - name.front().at.y();
            EXPECT_TRUE(above > 0 && above < 10) << "the name does not stand above its barcode";
        }
    }
}

TEST_F(SignInTest, TheFootersVisionLinesStandOnTheSheetsToo)
{
    office.settings.include_vision_footer = true;
    office.settings.footer_vision = u"Everyone at the table"_s;
    office.settings.vision_alignment = 2;
    add_many(1);

    const auto page = sheets_of(sheets.front()).front();

    const auto line = texts_reading(page, u"Everyone at the table"_s);
    ASSERT_EQ(line.size(), 1u);
    EXPECT_GT(line.front().at.x(), page.size.width() / 2);
}

} // namespace kindrel::test

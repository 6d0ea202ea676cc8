#include "output/output_fixture.h"
#include "output/page_reader.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int enough_for_every_column = 200;

class CheckListTest : public ReportTest
{
protected:
    void choose(QStringView key) { report = *output::find_report(key); }
    void add_many(int count)
    {
        std::vector<people::FamilyFile> families;
        for (int number = 1; number <= count; ++number)
            families.push_back(family(u"Family%1"_s.arg(number), {u"Ann"_s}));
        add(families);
    }
    /// The first page of the list `key`.
    [[nodiscard]] pages::Page first_page(QStringView key, pages::Paper paper)
    {
        choose(key);
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool, paper));
        return spool.page(1);
    }
};

struct Layout
{
    QString key, leaf;
    int columns, spaces;
    bool landscape;
};
const std::vector<Layout> check_lists{
    {u"k30"_s, u"Check Lists 1 (Condensed)"_s, 1, 23, false},
    {u"k31"_s, u"Check Lists 2 (Condensed)"_s, 1, 11, false},
    {u"k32"_s, u"Check Lists 3 (Large)"_s, 1, 23, false},
    {u"k33"_s, u"Check Lists 4 (Large)"_s, 1, 11, false},
    {u"k34"_s, u"Check Lists 5 (Two Column)"_s, 2, 7, false},
    {u"k35"_s, u"Check Lists 6 (Two Column)"_s, 2, 3, false},
    {u"k36"_s, u"Check Lists 7 (Three Column)"_s, 3, 5, true},
    {u"k37"_s, u"Check Lists 8 (Three Column)"_s, 3, 3, true},
};

/// Widths of all cells from left to right, with the gaps between the page's columns.
std::vector<qreal> widths_between(const std::vector<qreal>& lines)
{
    std::vector<qreal> widths;
    for (std::size_t i = 1; i < lines.size(); ++i)
        widths.push_back(lines[i] - lines[i - 1]);
    return widths;
}

} // namespace

TEST_F(CheckListTest, EachListHasItsColumnsWithTheirSpacesToTick)
{
    add_many(enough_for_every_column);
    constexpr qreal least_space = 14, least_name = 110;

    for (const auto& layout : check_lists) {
        for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
            const auto page = first_page(layout.key, paper);
            const auto widths = widths_between(lines_down(page));

            EXPECT_EQ(layout.leaf, QString::fromUtf8(report.leaf));
            EXPECT_EQ(page.size.width() > page.size.height(), layout.landscape) << layout.key.toStdString();
            const auto step = std::size_t(layout.spaces + 2); // The name, the spaces, the gap to the next column.
            ASSERT_EQ(widths.size(), layout.columns * step - 1) << layout.key.toStdString();
            for (std::size_t i = 0; i < widths.size(); ++i) {
                if (i % step != step - 1) {
                    EXPECT_GE(widths[i], i % step == 0 ? least_name : least_space - 0.01) << layout.key.toStdString();
                }
            }
        }
    }
}

TEST_F(CheckListTest, LargeListsHaveHigherRowsThanCondensedOnes)
{
    add_many(enough_for_every_column);
    const auto names_on_first_page = [&](QStringView key) {
        int names = 0;
        for (const auto& text : pages::texts_of(first_page(key, pages::Paper::a4), 1))
            names += text.startsWith("Family"_L1);
        return names;
    };

    EXPECT_GT(names_on_first_page(u"k30"), 40);
    EXPECT_GT(names_on_first_page(u"k30"), 1.3 * names_on_first_page(u"k32"));
    EXPECT_GT(names_on_first_page(u"k31"), 1.3 * names_on_first_page(u"k33"));
}

TEST_F(CheckListTest, EveryColumnBeginsWithAnEmptyRowForDates)
{
    add_many(enough_for_every_column);
    constexpr qreal room_for_a_date = 36;

    for (const auto& layout : check_lists) {
        choose(layout.key);
        pages::PageSpool spool;
        ASSERT_TRUE(run(spool));
        const auto page = spool.page(1);

        EXPECT_EQ(texts_reading(page, u"Name"_s).size(), std::size_t(layout.columns)) << layout.key.toStdString();
        EXPECT_FALSE(texts_reading(spool.page(2), u"Name"_s).empty() && spool.page_count() > 1);
        qreal highest = 0;
        for (const auto& item : page.items) {
            if (const auto* lines = std::get_if<pages::RectsItem>(&item); lines && lines->fill != pages::ink::none)
                highest = std::max(highest, lines->rects.back().height());
        }
        EXPECT_GE(highest, room_for_a_date) << layout.key.toStdString();
    }
}

TEST_F(CheckListTest, PeopleStandInTheOrderOfTheListEvenWhenItPartsAFamily)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}), family(u"Abel"_s, {u"Niels"_s})});
    std::swap(list.members[1], list.members[2]);

    for (const auto& layout : check_lists) {
        choose(layout.key);
        auto names = texts();
        names.removeIf([](const QString& text) { return !text.contains(", "_L1); });
        EXPECT_EQ(names, QStringList({u"Naismith, Ann"_s, u"Abel, Niels"_s, u"Naismith, Ben"_s}));
    }
}

TEST_F(CheckListTest, LongNamesAreWrappedNotCut)
{
    const auto surname = u"Wolfeschlegelsteinhausenbergerdorffwelchevoralternwarengewis"_s;
    add({family(surname, {u"Hubert Blaine Wolfgang Adolph Charles David Earl Frederick"_s})});

    for (const auto& layout : check_lists) {
        choose(layout.key);
        const auto all = texts().join(QString()).remove(u' ');
        EXPECT_TRUE(all.contains(surname + u",HubertBlaineWolfgangAdolphCharlesDavidEarlFrederick"_s))
            << layout.key.toStdString();
    }
}

} // namespace kindrel::test

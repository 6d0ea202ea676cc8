#include "output/output_fixture.h"
#include "output/page_reader.h"

#include "output/labels/label_setup.h"

#include <QDir>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QStringList list_reports{u"k140"_s, u"k141"_s, u"k142"_s, u"k143"_s, u"k144"_s, u"k145"_s, u"k148"_s};
const QStringList tag_reports{u"k146"_s, u"k147"_s};
constexpr qreal least_module = 0.25 * 72 / 25.4;
constexpr qreal ten_millimetres = 10 * 72 / 25.4;

class BarcodeReportTest : public ReportTest
{
protected:
    /// A person for each key.
    void add_people(const std::vector<int>& keys)
    {
        std::vector<people::FamilyFile> families;
        for (const int key : keys)
            families.push_back(family(u"Family"_s + QString::number(key), {u"Ann"_s}));
        add(families);
        for (std::size_t i = keys.size(); i-- > 0;) { // From the end, so that none takes a key still in use.
            auto& member = list.members[list.members.size() - keys.size() + i];
            church.session().execute(u"UPDATE [tbl_people] SET [person_id]=? WHERE [person_id]=?;"_s, keys[i],
                                     member.person_id);
            member.person_id = keys[i];
        }
    }
    [[nodiscard]] std::vector<pages::Page> pages_of(const QString& key, pages::Paper paper = pages::Paper::a4)
    {
        report = *output::find_report(key);
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool, paper)) << key.toStdString();
        std::vector<pages::Page> all;
        for (int number = 1; number <= spool.page_count(); ++number)
            all.push_back(spool.page(number));
        return all;
    }
    [[nodiscard]] QStringList codes_of(const QString& key, pages::Paper paper)
    {
        QStringList codes;
        for (const auto& page : pages_of(key, paper))
            codes += scanned(page);
        return codes;
    }
    [[nodiscard]] QStringList expected() const
    {
        QStringList codes;
        for (const auto& member : list.members)
            codes += QString::number(member.person_id) + u'$';
        return codes;
    }
};

const std::vector<int> keys_of_one_to_seven_digits{9,      10,     42,      99,      123,     777,
                                                   1234,   5678,   9999,    12345,   99887,   100001,
                                                   654321, 999999, 1000000, 1234567, 7654321, 9999999};

/// The narrowest bar.
qreal module_of(const pages::Page& page, std::size_t barcode)
{
    std::size_t place = 0;
    for (const auto& item : page.items) {
        const auto* bars = std::get_if<pages::RectsItem>(&item);
        if (bars && bars->fill == pages::ink::black && bars->rects.size() > 12 && place++ == barcode)
            return std::ranges::min_element(bars->rects, {}, &QRectF::width)->width();
    }
    return 0;
}

} // namespace

TEST_F(BarcodeReportTest, EveryBarcodeOfEveryReportReadsBackAsItsPersonsKey)
{
    add_people(keys_of_one_to_seven_digits);

    for (const auto& key : list_reports + tag_reports) {
        for (const auto paper : {pages::Paper::a4, pages::Paper::letter})
            EXPECT_EQ(codes_of(key, paper), expected()) << key.toStdString();
    }
}

TEST_F(BarcodeReportTest, BarsAreWideAndHighEnoughForAHandScanner)
{
    add_people(keys_of_one_to_seven_digits);

    for (const auto& key : list_reports + tag_reports + QStringList{u"k149"_s}) {
        for (const auto& page : pages_of(key, pages::Paper::letter)) {
            const auto places = barcodes_of(page);
            for (std::size_t i = 0; i < places.size(); ++i) {
                EXPECT_GE(module_of(page, i), least_module) << key.toStdString();
                EXPECT_GE(places[i].height(), ten_millimetres) << key.toStdString();
            }
        }
    }
}

TEST_F(BarcodeReportTest, NoBarcodeStandsInAnothersWay)
{
    add_people(keys_of_one_to_seven_digits);
    constexpr qreal between_rows = 4 * 72 / 25.4;

    for (const auto& key : list_reports + tag_reports) {
        for (const auto& page : pages_of(key)) {
            const auto places = barcodes_of(page);
            for (std::size_t i = 0; i < places.size(); ++i) {
                EXPECT_TRUE(QRectF({}, page.size).contains(places[i])) << key.toStdString();
                const auto around = places[i].adjusted(0, -between_rows, 0, between_rows);
                for (std::size_t other = i + 1; other < places.size(); ++other)
                    EXPECT_FALSE(around.intersects(places[other])) << key.toStdString();
            }
        }
    }
}

TEST_F(BarcodeReportTest, NamesStandOnTheirSideOfTheBarcode)
{
    add_people({1234});
    struct Case
    {
        QString key;
        bool name_is_left, name_is_above;
    };
    const std::vector<Case> cases{
        {u"k140"_s, false, false}, {u"k141"_s, true, false}, {u"k142"_s, false, false}, {u"k143"_s, false, true},
        {u"k144"_s, true, false},  {u"k145"_s, true, false}, {u"k148"_s, true, false},
    };
    for (const auto& one : cases) {
        const auto page = pages_of(one.key).front();
        const auto name = texts_reading(page, u"Family1234, Ann"_s);
        const auto bars = barcodes_of(page);
        ASSERT_TRUE(name.size() == 1 && bars.size() == 1) << one.key.toStdString();
        const auto end = name.front().at.x() + name.front().width;
        EXPECT_EQ(end <= bars.front().left(), one.name_is_left) << one.key.toStdString();
        EXPECT_EQ(name.front().at.y() < bars.front().top(), one.name_is_above) << one.key.toStdString();
        EXPECT_TRUE(one.name_is_above || one.name_is_left || name.front().at.x() >= bars.front().right());
    }
}

TEST_F(BarcodeReportTest, EveryListPageIsCountedAndTagsAreNot)
{
    std::vector<int> keys(60);
    for (std::size_t i = 0; i < keys.size(); ++i)
        keys[i] = 1000 + int(i);
    add_people(keys);

    for (const auto& key : list_reports) {
        const auto all = pages_of(key);
        EXPECT_GT(all.size(), 1u);
        for (const auto& page : all)
            EXPECT_EQ(texts_reading(page, u"Page: %1 of "_s.arg(page.number) + pages::page_total_mark).size(), 1u)
                << key.toStdString();
    }
    for (const auto& key : tag_reports)
        EXPECT_TRUE(pages::texts_of(pages_of(key).front(), 1).filter(u"Page"_s).isEmpty());
}

TEST_F(BarcodeReportTest, EachReportShowsWhatItsNamePromises)
{
    auto one = family(u"Naismith"_s, {u"Ann"_s});
    one.address.res_street = u"12 Long Street"_s;
    add({one});
    const auto number = QString::number(list.members.front().person_id);
    const auto printed = [&](const QString& key) {
        report = *output::find_report(key);
        return texts();
    };

    for (const auto& key : list_reports)
        EXPECT_EQ(printed(key).contains(u"12 Long Street"_s), key == u"k144"_s) << key.toStdString();
    for (const auto& key : list_reports + tag_reports)
        EXPECT_EQ(printed(key).contains(number), key == u"k147"_s || key == u"k148"_s) << key.toStdString();
    EXPECT_TRUE(printed(u"k148"_s).contains(u"Personal ID"_s));
}

TEST_F(BarcodeReportTest, AHiddenAddressIsNotOnTheListWithAddresses)
{
    auto one = family(u"Naismith"_s, {u"Ann"_s});
    one.address.res_street = u"12 Long Street"_s;
    one.address.res_hidden = true;
    add({one});
    report = *output::find_report(u"k144");

    EXPECT_TRUE(texts().filter(u"Long Street"_s).isEmpty());
}

TEST_F(BarcodeReportTest, TheCheckListHasRuledSpacesBehindTheBarcode)
{
    add_people({1234});
    const auto page = pages_of(u"k145"_s).front();
    const auto bars = barcodes_of(page).front();

    const auto lines = lines_down(page);

    const auto behind = std::ranges::count_if(lines, [&](qreal x) { return x > bars.right(); });
    EXPECT_EQ(behind, 8) << "seven spaces";
}

TEST_F(BarcodeReportTest, TheReaderTestShowsBesideEachCodeWhatTheReaderTypes)
{
    add_people({7, 1234567, 55});

    const auto all = pages_of(u"k149"_s);

    ASSERT_EQ(all.size(), 1u);
    const auto codes = scanned(all.front());
    EXPECT_EQ(codes, QStringList({u"7$"_s, u"7$"_s, u"7$"_s, u"1234567$"_s, u"1234567$"_s, u"1234567$"_s}));
    const auto places = barcodes_of(all.front());
    for (qsizetype i = 0; i < codes.size(); ++i) {
        const auto& place = places[std::size_t(i)];
        const auto typed = texts_reading(all.front(), codes[i]);
        EXPECT_EQ(std::ranges::count_if(typed,
                                        [&](const pages::TextItem& text) {
                                            return text.at.x() > place.right() && text.at.y() > place.top() &&
                                                   text.at.y() < place.bottom();
                                        }),
                  1);
    }
    EXPECT_GT(places[0].width(), places[1].width());
    EXPECT_GT(places[1].width(), places[2].width());
}

TEST_F(BarcodeReportTest, BarcodesOnSmallTagsStayInsideThemAndCanBeRead)
{
    QDir(church.folder()).mkpath(u"Global"_s);
    auto setup = output::load_label_setup(office);
    setup.tags.grid = {2100, 2970, 4, 10, 450, 250, 30, 10, 60, 60, 1};
    setup.tags.shows_border = true;
    for (auto* font : {&setup.tags.given_name, &setup.tags.surname})
        font->size = 30;
    ASSERT_TRUE(output::save_label_setup(office, setup));
    add_people({9, 1234567});

    for (const auto& key : tag_reports) {
        const auto page = pages_of(key).front();
        EXPECT_EQ(scanned(page), expected()) << key.toStdString();
        for (int tag = 0; tag < 2; ++tag)
            EXPECT_TRUE(setup.tags.grid.label(tag).contains(barcodes_of(page)[std::size_t(tag)])) << key.toStdString();
    }
}

} // namespace kindrel::test

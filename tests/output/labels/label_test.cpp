#include "output/output_fixture.h"
#include "output/page_reader.h"

#include "core/side_file.h"
#include "output/labels/label_setup.h"
#include "output/labels/label_stock.h"

#include <QDir>
#include <QRegularExpression>
#include <QSet>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr qreal a_hair = 0.05; ///< Points.

class LabelTest : public ReportTest
{
protected:
    LabelTest() { QDir(church.folder()).mkpath(u"Global"_s); }

    void choose(QStringView key) { report = *output::find_report(key); }
    void use(const output::LabelGrid& grid)
    {
        auto setup = output::load_label_setup(office);
        setup.labels.grid = setup.tags.grid = grid;
        ASSERT_TRUE(output::save_label_setup(office, setup));
    }
    void add_many(int count)
    {
        std::vector<people::FamilyFile> families;
        for (int number = 1; number <= count; ++number)
            families.push_back(at_street(u"%1 Long Street"_s.arg(number)));
        add(families);
    }
    [[nodiscard]] static people::FamilyFile at_street(const QString& street)
    {
        auto one = family(u"Naismith"_s, {u"Ann"_s});
        one.address.res_street = street;
        one.residential = people::Suburb{1, people::SuburbType::residential, {}, {}, {}};
        return one;
    }
    [[nodiscard]] std::vector<pages::Page> sheets()
    {
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool));
        std::vector<pages::Page> all;
        for (int number = 1; number <= spool.page_count(); ++number)
            all.push_back(spool.page(number));
        return all;
    }
};

/// What the texts between the first and the last of a label take on the page.
QRectF room_of(const std::vector<pages::TextItem>& texts)
{
    QRectF room;
    for (const auto& text : texts)
        room |= QRectF(text.at.x(), text.at.y() - text.style.size, std::max(text.width, 0.1), text.style.size);
    return room;
}

std::vector<pages::TextItem> texts_in(const pages::Page& page, const QRectF& label)
{
    std::vector<pages::TextItem> texts;
    for (const auto& item : page.items) {
        if (const auto* text = std::get_if<pages::TextItem>(&item); text && label.contains(text->at))
            texts.push_back(*text);
    }
    return texts;
}

QString words_in(const pages::Page& page, const QRectF& label)
{
    QStringList words;
    for (const auto& text : texts_in(page, label))
        words += text.text.trimmed();
    return words.join(u" | "_s);
}

} // namespace

TEST_F(LabelTest, EveryLabelStandsInItsPlaceOnTheSheet)
{
    struct Case
    {
        const char* stock;
        int place;      ///< From 0, row by row.
        QPointF corner; ///< Upper left, in millimetres, measured on the sheet.
    };
    const std::vector<Case> cases{
        {"A4, 3 x 8, 63.5 x 33.9 mm", 0, {7.2, 12.9}},
        {"A4, 3 x 8, 63.5 x 33.9 mm", 2, {139.2, 12.9}},
        {"A4, 3 x 8, 63.5 x 33.9 mm", 23, {139.2, 250.2}},
        {"A4, 2 x 7, 99.1 x 38.1 mm", 1, {106.3, 15.1}},
        {"A4, 2 x 7, 99.1 x 38.1 mm", 12, {4.7, 243.7}},
        {"A4, name tags, 2 x 4, 80.0 x 50.0 mm", 7, {112.5, 207.5}},
        {"Letter, 3 x 10, 2 5/8 x 1 in", 29, {144.4, 241.3}},
        {"Letter, 2 x 5, 4 x 2 in", 3, {110.4, 63.5}},
    };
    add_many(30);
    choose(u"k60");
    for (const auto& one : cases) {
        const auto stock = std::ranges::find(output::label_stocks(), QLatin1StringView(one.stock),
                                             [](const auto& known) { return QLatin1StringView(known.name); });
        ASSERT_NE(stock, output::label_stocks().end()) << one.stock;
        use(stock->grid);
        const auto page = sheets().front();

        const auto street = texts_reading(page, u"%1 Long Street"_s.arg(one.place + 1));

        ASSERT_EQ(street.size(), 1u) << one.stock;
        const auto corner = one.corner * 72 / 25.4;
        constexpr qreal padding = 9;
        EXPECT_NEAR(street.front().at.x(), corner.x() + padding, a_hair) << one.stock;
        const auto label = stock->grid.label(one.place);
        EXPECT_NEAR(label.left(), corner.x(), a_hair) << one.stock;
        EXPECT_NEAR(label.top(), corner.y(), a_hair) << one.stock;
        EXPECT_TRUE(label.contains(room_of(texts_in(page, label)))) << one.stock;
    }
}

TEST_F(LabelTest, PrintingBeginsAtTheChosenLabelOfTheFirstSheetAlone)
{
    auto grid = output::load_label_setup(office).labels.grid;
    grid.start = 23;
    use(grid);
    add_many(4);

    for (const auto key : {u"k60", u"k61"}) {
        choose(key);
        const auto all = sheets();
        ASSERT_EQ(all.size(), 2u);
        for (int place = 0; place < grid.labels(); ++place) {
            EXPECT_EQ(texts_in(all[0], grid.label(place)).empty(), place < 22) << place;
            EXPECT_EQ(texts_in(all[1], grid.label(place)).empty(), place > 1) << place;
        }
    }
}

TEST_F(LabelTest, AFullSheetIsNotFollowedByAnEmptyOne)
{
    add_many(24);
    choose(u"k60");

    EXPECT_EQ(sheets().size(), 1u);
}

TEST_F(LabelTest, WhereNobodyOfTheListIsLeftThereIsNoSheet)
{
    add_many(2);
    for (const auto& table : {u"tbl_people"_s, u"tbl_surname"_s}) {
        office.session->execute(u"DELETE FROM [%1];"_s.arg(table));
        for (const auto key : {u"k60", u"k61"}) {
            for (const int start : {1, 5}) {
                auto grid = output::load_label_setup(office).labels.grid;
                grid.start = start;
                use(grid);
                choose(key);
                dialogue.expect_box(u"No people found for creating a report"_s);
                pages::PageSpool spool;

                EXPECT_FALSE(run(spool));

                EXPECT_EQ(spool.page_count(), 0);
                dialogue.verify();
            }
        }
    }
}

TEST_F(LabelTest, AFamilyThatTheListedPeopleHaveLeftGetsNoLabel)
{
    add({family(u"Left"_s, {u"Ann"_s}), family(u"Naismith"_s, {u"Ben"_s})});
    office.session->execute(u"DELETE FROM [tbl_people] WHERE [Surname_ID]=?;"_s, list.members.front().surname_id);
    choose(u"k60");

    const auto page = sheets().front();

    EXPECT_EQ(words_in(page, output::load_label_setup(office).labels.grid.label(0)), u"Ben Naismith"_s);
}

TEST_F(LabelTest, ALabelHoldsTheFamilysNamesAndTheAddressThatPostGoesTo)
{
    struct Case
    {
        const char* what;
        QString home, postal;
        bool suburb, res_hidden, post_hidden;
        std::string expected;
    };
    const auto home = u"1 Main St"_s, box = u"PO Box 7"_s;
    const std::vector<Case> cases{
        {"home", home, {}, true, false, false, "Ann & Ben Naismith | 1 Main St | suburb 1 SA 3000"},
        {"home without suburb", home, {}, false, false, false, "Ann & Ben Naismith | 1 Main St | SA"},
        {"states alone", {}, {}, false, false, false, "Ann & Ben Naismith"},
        {"postal", home, box, true, false, false, "Ann & Ben Naismith | PO Box 7 | VIC | Australia"},
        {"postal hidden", home, box, true, false, true, "Ann & Ben Naismith | 1 Main St | suburb 1 SA 3000"},
        {"all hidden", home, box, true, true, true, "Ann & Ben Naismith"},
    };
    choose(u"k60");
    for (const auto& one : cases) {
        list.members.clear();
        auto file = at_street(one.home);
        if (!one.suburb)
            file.residential.reset();
        file.address.res_state = u"SA"_s;
        file.address.post_state = u"VIC"_s;
        file.address.post_country = u"Australia"_s;
        file.people = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s}).people;
        file.people[2].Marital = 5;
        file.address.post_street = one.postal;
        file.address.res_hidden = one.res_hidden;
        file.address.post_hidden = one.post_hidden;
        add({file});

        const auto page = sheets().front();
        const auto label = output::load_label_setup(office).labels.grid.label(0);
        EXPECT_EQ(words_in(page, label).toStdString(), one.expected) << one.what;
        EXPECT_EQ(texts_in(page, label).size(), pages::texts_of(page, 1).size()) << "more than one label";
    }
}

TEST_F(LabelTest, LongTextIsShrunkIntoItsLabelAndNeverCutOff)
{
    const auto name = u"Hubertblainewolfgangadolphcharlesdavidearlfrederickgeraldxyz"_s;
    const auto surname = u"Wolfeschlegelsteinhausenbergerdorffwelchevoralternwarengewis"_s;
    auto one = at_street(u"Apartment 1204, Tower of the Seven Stars, 1077 Upper Kingfisher Crescent West"_s);
    one.family.surname = surname;
    one.people = {person(name, 4), person(name, 4)};
    one.address.res_street2 = u"Lakeside Retirement Village, behind the old post office and the mill"_s;
    one.address.res_country = u"The United Kingdom of Great Britain and Northern Ireland"_s;
    add({one});
    for (const auto key : {u"k60", u"k61"}) {
        for (const auto& stock : output::label_stocks()) {
            choose(key);
            use(stock.grid);
            const auto page = sheets().front();
            const auto label = stock.grid.label(0);
            const auto texts = texts_in(page, label);

            EXPECT_TRUE(label.contains(room_of(texts))) << stock.name;
            const auto all = words_in(page, label);
            EXPECT_TRUE(all.contains(name) && all.contains(surname)) << stock.name << all.toStdString();
            EXPECT_EQ(all.contains("Ireland"_L1) && all.contains("mill"_L1), key == u"k60"_s) << stock.name;
        }
    }
}

TEST_F(LabelTest, TextThatFitsKeepsTheSizeAndFontThatWereChosen)
{
    auto setup = output::load_label_setup(office);
    setup.labels.name = {u"Liberation Serif"_s, 14, true, true};
    setup.labels.address = {u"Liberation Mono"_s, 8, false, false};
    ASSERT_TRUE(output::save_label_setup(office, setup));
    add_many(1);
    choose(u"k60");

    const auto page = sheets().front();

    const pages::TextStyle name{u"Liberation Serif"_s, 14, true, true}, address{u"Liberation Mono"_s, 8};
    EXPECT_EQ(texts_reading(page, u"Ann Naismith"_s).front().style, name);
    EXPECT_EQ(texts_reading(page, u"1 Long Street"_s).front().style, address);
}

TEST_F(LabelTest, ADoubleSurnameIsBrokenBehindItsHyphenBeforeItShrinks)
{
    auto setup = output::load_label_setup(office);
    setup.tags.surname.size = 20;
    setup.tags.shows_church = false;
    ASSERT_TRUE(output::save_label_setup(office, setup));
    add({family(u"Featherstonehaugh-Cholmondeley"_s, {u"Ann"_s})});
    choose(u"k61");

    const auto page = sheets().front();

    EXPECT_EQ(words_in(page, setup.tags.grid.label(0)).toStdString(), "Ann | Featherstonehaugh- | Cholmondeley");
    const auto parts = texts_reading(page, u"Featherstonehaugh-"_s);
    ASSERT_EQ(parts.size(), 1u);
    EXPECT_EQ(parts[0].style.size, 20);
}

TEST_F(LabelTest, ATagShowsTheNamesAndWhatTheSetupAsksFor)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
    choose(u"k61");
    for (const bool head : {false, true}) {
        for (const bool border : {false, true}) {
            auto setup = output::load_label_setup(office);
            setup.tags.shows_church = head;
            setup.tags.shows_border = border;
            ASSERT_TRUE(output::save_label_setup(office, setup));

            const auto page = sheets().front();

            const auto above = std::string(head ? "St Aidan's | " : "");
            EXPECT_EQ(words_in(page, setup.tags.grid.label(0)).toStdString(), above + "Ann | Naismith");
            EXPECT_EQ(words_in(page, setup.tags.grid.label(1)).toStdString(), above + "Ben | Naismith");
            const auto framed = std::ranges::count_if(
                page.items, [](const auto& item) { return std::holds_alternative<pages::RectsItem>(item); });
            EXPECT_EQ(framed, border ? 2 : 0);
            EXPECT_GT(texts_reading(page, u"Ann"_s).front().style.size, 20);
        }
    }
}

TEST_F(LabelTest, ThePdfHasTheSheetsOwnSizeWhicheverWayItLies)
{
    const std::vector<std::pair<output::LabelGrid, QString>> cases{
        {{1000, 1500, 1, 2, 800, 600, 0, 50, 100, 100, 1}, u"Page size: +283(\\.\\d+)? x 425(\\.\\d+)?"_s},
        {{1500, 1000, 2, 1, 600, 800, 50, 0, 100, 100, 1}, u"Page size: +425(\\.\\d+)? x 283(\\.\\d+)?"_s},
        {{2159, 2794, 1, 1, 2000, 2000, 0, 0, 0, 0, 1}, u"\\(letter\\)"_s},
    };
    add_many(1);
    choose(u"k60");
    for (const auto& [grid, size] : cases) {
        use(grid);
        EXPECT_TRUE(pdf_text().contains(u"1 Long Street"_s));
        const auto said = output_of(u"pdfinfo"_s, {pdf_file()});
        EXPECT_TRUE(said.contains(QRegularExpression(size))) << said.toStdString();
    }
}

TEST_F(LabelTest, ASavedSetupIsReadBackFromTheFile)
{
    auto setup = output::load_label_setup(office);
    setup.labels.grid = {2159, 2794, 3, 10, 667, 254, 31, 0, 48, 127, 7};
    setup.labels.address = {u"Noto Sans"_s, 12, true, false};
    setup.tags.church.italic = setup.tags.shows_border = true;
    setup.tags.grid.start = 10;

    ASSERT_TRUE(output::save_label_setup(office, setup));

    office.side.labels = *core::read_side_file(office.paths, core::side_files::labels);
    EXPECT_EQ(output::load_label_setup(office), setup);
}

TEST_F(LabelTest, OfTwoWorkstationsEachSavesOnlyWhatItChanged)
{
    const auto opened_by_both = office.side.labels;
    auto mine = output::load_label_setup(office), theirs = mine;
    mine.labels.grid = output::label_stocks()[5].grid;
    mine.labels.name.italic = true;
    theirs.labels.address.size = 8;
    theirs.tags.grid.start = 4;
    theirs.tags.shows_border = true;
    ASSERT_TRUE(output::save_label_setup(office, theirs));
    office.side.labels = opened_by_both;

    ASSERT_TRUE(output::save_label_setup(office, mine));

    auto both = theirs;
    both.labels.grid = mine.labels.grid;
    both.labels.name = mine.labels.name;
    EXPECT_EQ(output::load_label_setup(office), both);
    EXPECT_EQ(output::reload_label_setup(office), both);
}

TEST_F(LabelTest, ALabelToStartAtStaysOnTheSheetThatAnotherWorkstationChose)
{
    const auto opened_by_both = office.side.labels;
    auto mine = output::load_label_setup(office), theirs = mine;
    mine.labels.grid.start = 20;
    theirs.labels.grid = output::label_stocks()[3].grid;
    ASSERT_TRUE(output::save_label_setup(office, theirs));
    office.side.labels = opened_by_both;

    ASSERT_TRUE(output::save_label_setup(office, mine));

    theirs.labels.grid.start = 8;
    EXPECT_EQ(output::load_label_setup(office), theirs);
}

TEST_F(LabelTest, NumbersThatCannotBePrintedAreRefusedAndNothingIsWritten)
{
    struct Case
    {
        int output::LabelGrid::*field;
        int value;
        QString message, faulty;
    };
    using Grid = output::LabelGrid;
    const std::vector<Case> cases{
        {&Grid::columns, 0, u"There must be between 1 and 50 columns on a sheet."_s, u"label_columns"_s},
        {&Grid::columns, 4,
         u"4 columns with the left margin and the gaps need 268.7 mm, but the page's width is 210.0 mm."_s,
         u"label_columns"_s},
        {&Grid::rows, 9, u"9 rows with the top margin and the gaps need 318.0 mm, but the page's height is 297.0 mm."_s,
         u"label_rows"_s},
        {&Grid::height, 49, u"The label's height must be at least 5.0 mm."_s, u"label_height"_s},
        {&Grid::row_gap, -1, u"The top margin and the gap between the rows cannot be less than zero."_s,
         u"label_row_gap"_s},
        {&Grid::row_gap, 40000, u"The gap between the rows cannot be larger than the page."_s, u"label_row_gap"_s},
        {&Grid::left_margin, -1, u"The left margin and the gap between the columns cannot be less than zero."_s,
         u"label_left_margin"_s},
        {&Grid::page_width, 0, u"The page's width must be between 5.0 mm and 1000.0 mm."_s, u"label_page_width"_s},
        {&Grid::start, 25, u"The first label must be between 1 and 24."_s, u"label_start"_s},
        {&Grid::start, 0, u"The first label must be between 1 and 24."_s, u"label_start"_s},
    };
    const auto before = office.side.labels.bytes();
    for (const auto& one : cases) {
        auto setup = output::load_label_setup(office);
        setup.labels.grid.*one.field = one.value;
        dialogue.expect_box(u"Mailing labels: "_s + one.message);
        EXPECT_FALSE(output::save_label_setup(office, setup));
        dialogue.verify();
        EXPECT_EQ(output::fault_of(setup).field, one.faulty);
        EXPECT_EQ(office.side.labels.bytes(), before);
        EXPECT_FALSE(core::read_side_file(office.paths, core::side_files::labels));
    }
}

TEST_F(LabelTest, FontsThatCannotBeKeptAreRefused)
{
    const std::vector<std::pair<output::LabelFont, QString>> cases{
        {{{}, 10}, u"Name tags: A font must be chosen."_s},
        {{u"Arial"_s, 3}, u"Name tags: The size of a font must be between 4 and 144 points."_s},
        {{u"宋体"_s, 10},
         u"Name tags: The font '宋体' cannot be kept: its name is too long or holds unusual letters."_s},
    };
    for (const auto& [font, message] : cases) {
        auto setup = output::load_label_setup(office);
        setup.tags.surname = font;
        dialogue.expect_box(message);
        EXPECT_FALSE(output::save_label_setup(office, setup));
        dialogue.verify();
    }
}

TEST_F(LabelTest, AStoredSheetThatCannotBePrintedIsToldInsteadOfPrinted)
{
    add_many(1);
    office.side.labels.set_number("label_columns", 0);
    office.side.labels.set_number("label_page_width", 0);
    choose(u"k60");
    dialogue.expect_box(u"The page's width must be between 5.0 mm and 1000.0 mm."_s);
    pages::PageSpool spool;

    EXPECT_FALSE(run(spool));
    EXPECT_EQ(spool.page_count(), 0);
}

TEST(LabelStockTest, EveryStockCanBePrintedAndIsKnownByItsMeasures)
{
    QSet<QString> names;
    for (const auto& stock : output::label_stocks()) {
        EXPECT_FALSE(output::fault_of(stock.grid)) << stock.name;
        auto used = stock.grid;
        used.start = used.labels();
        EXPECT_EQ(output::stock_of(used), &stock) << stock.name;
        names += QString::fromLatin1(stock.name);
        const auto left = stock.grid.label(0), right = stock.grid.label(stock.grid.columns - 1);
        EXPECT_NEAR(left.left(), stock.grid.sheet().width() - right.right(), 6) << stock.name << " is not centred";
    }
    EXPECT_EQ(names.size(), qsizetype(output::label_stocks().size()));
    EXPECT_EQ(output::stock_of({}), nullptr);
}

} // namespace kindrel::test

#include "output/output_fixture.h"

#include "people/person_files.h"

#include <QBuffer>
#include <QImage>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class PhotoAlbumTest : public ReportTest
{
protected:
    void choose(QStringView album)
    {
        report = *output::find_report(album);
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
    }
    void add_people(int count)
    {
        std::vector<people::FamilyFile> families;
        for (int number = 1; number <= count; ++number)
            families.emplace_back(family(u"Family%1"_s.arg(number), {u"Ann"_s})).address.res_hidden = true;
        add(families);
    }
    void give_portrait(int person_id, QSize pixels)
    {
        QImage image(pixels, QImage::Format_RGB32);
        image.fill(Qt::darkCyan);
        QBuffer jpeg;
        image.save(&jpeg, "JPG");
        const auto [folder, name] = people::portrait_of_person(person_id);
        DataFolder::write(office.paths.file(folder, name), jpeg.data());
    }
    [[nodiscard]] std::vector<pages::Page> album(pages::Paper paper = pages::Paper::a4)
    {
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool, paper));
        std::vector<pages::Page> pages;
        for (int number = 1; number <= spool.page_count(); ++number)
            pages.push_back(spool.page(number));
        return pages;
    }
    [[nodiscard]] static std::vector<QRectF> frames_of(const pages::Page& page)
    {
        std::vector<QRectF> frames;
        for (const auto& item : page.items) {
            if (const auto* rects = std::get_if<pages::RectsItem>(&item))
                frames.insert(frames.end(), rects->rects.begin(), rects->rects.end());
        }
        return frames;
    }
    [[nodiscard]] static std::vector<QRectF> pictures_of(const pages::Page& page)
    {
        std::vector<QRectF> pictures;
        for (const auto& item : page.items) {
            if (const auto* picture = std::get_if<pages::PictureItem>(&item))
                pictures.push_back(picture->where);
        }
        return pictures;
    }
};

struct Album
{
    const char16_t* name;
    std::size_t photos, columns;
};

constexpr std::array albums{
    Album{u"Album 1", 12, 3}, Album{u"Album 2", 9, 3}, Album{u"Album 3", 8, 2}, Album{u"Album 4", 6, 2},
    Album{u"Album 5", 6, 1},  Album{u"Album 6", 5, 1}, Album{u"Album 7", 4, 1}, Album{u"Album 8", 3, 1},
};

} // namespace

TEST_F(PhotoAlbumTest, EachPageHoldsItsNumberOfEqualFramesOnEitherPaperWhateverStandsAroundThem)
{
    add_people(25);
    for (const auto& one : albums) {
        for (const bool long_header : {false, true}) {
            choose(one.name);
            office.settings.Include_vision_reports = office.settings.include_vision_footer = long_header;
            office.settings.vision = u"To gather\nto grow\nto go\nand to come again"_s;
            office.settings.footer_vision = u"Below"_s;
            for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
                const auto pages = album(paper);
                ASSERT_EQ(pages.size(), (25 + one.photos - 1) / one.photos) << report.leaf;
                const auto frames = frames_of(pages.front());
                ASSERT_EQ(frames.size(), one.photos) << report.leaf;
                for (const auto& frame : frames) {
                    EXPECT_NEAR(frame.width(), frames[0].width(), 0.01);
                    EXPECT_NEAR(frame.height(), frames[0].height(), 0.01);
                }
                const auto in_first_row =
                    std::ranges::count_if(frames, [&](const auto& frame) { return frame.y() == frames[0].y(); });
                EXPECT_EQ(std::size_t(in_first_row), one.columns) << report.leaf;
            }
        }
    }
}

TEST_F(PhotoAlbumTest, APhotographFillsTheMiddleOfItsFrameAndAMissingOneLeavesItEmpty)
{
    add_people(4);
    give_portrait(list.members[1].person_id, {300, 400});
    give_portrait(list.members[2].person_id, {400, 100});
    DataFolder::write(office.paths.file(core::Folder::portrait, u"%1.jpg"_s.arg(list.members[3].person_id)), "no jpeg");
    for (const auto& one : albums) {
        choose(one.name);
        const auto page = album().front();
        const auto frames = frames_of(page);
        const auto pictures = pictures_of(page);
        ASSERT_EQ(pictures.size(), 2u) << report.leaf;
        for (std::size_t i : {0, 1}) {
            EXPECT_TRUE(frames[i + 1].contains(pictures[i])) << report.leaf;
            EXPECT_NEAR(frames[i + 1].center().x(), pictures[i].center().x(), 0.1);
            EXPECT_NEAR(frames[i + 1].center().y(), pictures[i].center().y(), 0.1);
        }
        EXPECT_NEAR(pictures[1].width() / pictures[1].height(), 4, 0.1) << "the shape is kept";
    }
}

TEST_F(PhotoAlbumTest, ALongListKeepsItsOrderFromRowToRow)
{
    constexpr int people = 250;
    add_people(people);
    QStringList expected;
    for (int number = 1; number <= people; ++number)
        expected += u"Ann Family%1"_s.arg(number);
    for (const auto& name : {u"Album 1"_s, u"Album 3"_s}) {
        choose(name);
        QStringList printed;
        for (const auto& page : pages())
            printed += page.sliced(3);
        EXPECT_EQ(printed, expected) << name.toStdString();
    }
}

TEST_F(PhotoAlbumTest, WhatStandsWithThePhotographGrowsFromTheNameToBothAddresses)
{
    auto one = family(u"Naismith"_s, {u"Ann"_s});
    one.address.res_street = u"1 Elm Lane"_s;
    one.address.post_street = u"P.O. Box 7"_s;
    one.address.phone = u"9555 1234"_s;
    one.people[0].mobile_phone = u"0412 333"_s;
    add({one});
    const std::string contacts = "Family Ph: 9555 1234 | Mobile: 0412 333";
    for (const auto& each : albums) {
        choose(each.name);
        const auto expected = each.columns == 3  ? "Ann Naismith"
                              : each.photos == 3 ? "Ann Naismith | " + contacts +
                                                       " | Residential address | 1 Elm Lane | Unknown Suburb"
                                                       " | Postal address | P.O. Box 7"
                                                 : "Ann Naismith | 1 Elm Lane, Unknown Suburb | " + contacts;
        EXPECT_EQ(texts().sliced(3).join(u" | "_s).toStdString(), expected) << report.leaf;
    }
}

TEST_F(PhotoAlbumTest, PhonesAndAddressesOfTheNetBesideAPhotographAreNotBroken)
{
    auto one = family(u"Naismith"_s, {u"Margaret"_s});
    one.address.phone = u"03 9555 1234"_s;
    one.people[0].business_phone = u"0412 333 444"_s;
    one.people[0].business_email = u"margaret.naismith@staff.saint-aidans-church.example.org"_s;
    add({one});
    for (const auto& each : albums) {
        if (each.columns == 3)
            continue;
        choose(each.name);
        const auto all = texts().join(u" | "_s);
        for (const auto& contact : {one.address.phone, one.people[0].business_phone})
            EXPECT_TRUE(all.contains(contact)) << report.leaf << all.toStdString();
        EXPECT_FALSE(all.contains(u"margaret.naismit |"_s)) << report.leaf << all.toStdString();
        EXPECT_TRUE(all.contains(u"margaret.naismith@staff.saint-"_s)) << report.leaf << all.toStdString();
    }
}

TEST_F(PhotoAlbumTest, TextThatIsTooLongForItsPlaceShrinksAndLeavesTheFrames)
{
    const auto long_name = u"Hubertblainewolfgangadolphcharlesdavidearlfrederickgeraldxyz"_s;
    auto wordy = family(long_name, {long_name});
    wordy.address.family_email = (long_name + u'@' + long_name + u' ').repeated(8);
    add({wordy, family(u"Abel"_s, {u"Niels"_s})});
    for (const auto& one : albums) {
        choose(one.name);
        const auto pages = album();
        ASSERT_EQ(pages.size(), 1u);
        const auto frames = frames_of(pages[0]);
        ASSERT_EQ(frames.size(), 2u);
        EXPECT_NEAR(frames[0].height(), frames[1].height(), 0.01) << report.leaf;
        EXPECT_EQ(pdf_text().remove(u' ').count(long_name), one.columns == 3 ? 2 : 18) << report.leaf;
    }
}

} // namespace kindrel::test

#include "output/letters/letter_merge.h"

#include "people/disclosed.h"
#include "support/families.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using output::LetterAddress;
using output::LetterForm;
using output::LetterParagraph;
using output::LetterText;
using output::LetterValues;

namespace {

const pages::TextStyle usual = output::letter_style();

/// A paragraph for each line.
LetterText letter_of(const QString& text)
{
    LetterText letter;
    for (const auto& line : text.split(u'\n'))
        letter.paragraphs.push_back({{{line, usual}}});
    return letter;
}

LetterValues values_of(std::initializer_list<std::pair<QStringView, QString>> values)
{
    LetterValues all(output::letter_fields().size());
    for (const auto& [field, value] : values)
        all[output::field_at_start(field)->place] = value;
    return all;
}

const LetterValues naismiths = values_of({{u"[Surname]", u"Naismith"_s},
                                          {u"[Primary_Name]", u"Ann"_s},
                                          {u"[Primary_&_Spouse_Name]", u"Ann & Ben"_s},
                                          {u"[____Street_Address____]", u"1 High Street"_s},
                                          {u"[____Suburb_Address____]", u"Kew VIC 3101"_s}});

QString merged(const LetterText& letter)
{
    const LetterForm form(letter);
    EXPECT_EQ(form.fault(), std::nullopt);
    return output::plain_text(form.merged(naismiths)).chopped(1);
}

struct Merge
{
    QString letter, copy;
};

TEST(LetterMerge, PutsValuesInPlaceOfFieldsAndLeavesTheRest)
{
    const Merge merges[]{
        {u"Dear [Primary_Name] [Surname],"_s, u"Dear Ann Naismith,"_s},
        {u"[First_&_Second_Adult_Name]: [First_Adult_Name]."_s, u"Ann & Ben: Ann."_s},
        {u"[Surname][Surname]"_s, u"NaismithNaismith"_s},
        {u"[Spouse_Name] hello"_s, u" hello"_s},
        {u"[Spouse_Name]\nhello"_s, u"\nhello"_s},
        {u"[surname] [Surname [Nobody] [] [R [[Surname]]"_s, u"[surname] [Surname [Nobody] [] [R [Naismith]"_s},
        {u"[Street_Address] [____Street_Address___]"_s, u"[Street_Address] [____Street_Address___]"_s},
        {u"\n\n"_s, u"\n\n"_s},
    };
    for (const auto& [letter, copy] : merges)
        EXPECT_EQ(merged(letter_of(letter)), copy) << letter.toStdString();
}

TEST(LetterMerge, RemovesWhatStandsBetweenFiltersWithTheLineThatTheyEmpty)
{
    const Merge merges[]{
        // A field with a value stays, and so does what stands around it.
        {u"[R][Surname][R]\nx"_s, u"Naismith\nx"_s},
        {u"a [R]and [Surname] [R]b"_s, u"a and Naismith b"_s},
        // A field without one takes the stretch along, and the line when it is empty then.
        {u"[____Street_Address____]\n[R][____Street_line_2_____][R]\n[____Suburb_Address____]"_s,
         u"1 High Street\nKew VIC 3101"_s},
        {u"a [R]and [Spouse_Name] [R]b"_s, u"a b"_s},
        {u"a\n  [R][Spouse_Name][R] \t\nb"_s, u"a\nb"_s},
        {u"[R][Spouse_Name][R]"_s, u""_s},
        {u"[R][Spouse_Name][R]\na"_s, u"a"_s},
        {u"[R][Spouse_Name][R][R][Spouse_Title][R]\na"_s, u"a"_s},
        {u"[R][Spouse_Name][R][R][Surname][R]\na"_s, u"Naismith\na"_s},
        // What stands between two pairs is nobody's.
        {u"[R][Surname][R] a[Spouse_Name]b [R][Spouse_Name][R]c"_s, u"Naismith ab c"_s},
        // Across the ends of paragraphs.
        {u"x\n[R][____Street_line_2_____]\n[R][____Suburb_Address____]"_s, u"x\nKew VIC 3101"_s},
        {u"x\n[R][____Street_Address____]\n[R][____Suburb_Address____]"_s, u"x\n1 High Street\nKew VIC 3101"_s},
        {u"x[R]\n[Spouse_Name]\n[R]\ny"_s, u"x\ny"_s},
        {u"[R]\nyour wife [Spouse_Name]\n[R]\ny"_s, u"y"_s},
        // Of several fields one with a value is enough to stay; without a field nothing is empty.
        {u"[R][Spouse_Name][Primary_Name][R]"_s, u"Ann"_s},
        {u"[R][Spouse_Name][Children_Names][R]\na"_s, u"a"_s},
        {u"[R]words[R]"_s, u"words"_s},
        // Lines that no filter emptied stay.
        {u"\n[R][Spouse_Name][R]\n\na"_s, u"\n\na"_s},
        {u"[Spouse_Name]\n[R][Surname][R]"_s, u"\nNaismith"_s},
    };
    for (const auto& [letter, copy] : merges)
        EXPECT_EQ(merged(letter_of(letter)), copy) << letter.toStdString();
}

TEST(LetterMerge, RemovesEmptiedLinesWithinAParagraphToo)
{
    const Merge merges[]{
        {u"[Surname]|[R][Spouse_Name][R]|[____Suburb_Address____]"_s, u"Naismith\nKew VIC 3101"_s},
        {u"[Surname]|[R][Spouse_Name][R]"_s, u"Naismith"_s},
        {u"[R][Spouse_Name][R]|[Surname]"_s, u"Naismith"_s},
        {u"a||[R][Spouse_Name][R]|b"_s, u"a\n\nb"_s},
    };
    for (const auto& [lines, copy] : merges) {
        const LetterText letter{{{{{QString(lines).replace(u'|', u'\n'), usual}}}}};
        EXPECT_EQ(LetterForm(letter).merged(naismiths).paragraphs.size(), 1);
        EXPECT_EQ(merged(letter), copy) << lines.toStdString();
    }
}

TEST(LetterMerge, KeepsThePagesThatWhatGoesWasToBegin)
{
    // "/" stands for the beginning of a page.
    const Merge merges[]{
        {u"a\n/[R][Spouse_Name][R]\nb"_s, u"a\n/b"_s},
        {u"a\n/[R][Spouse_Name][R]\n[R][Spouse_Title][R]\nb\nc"_s, u"a\n/b\nc"_s},
        {u"a\n/[R][Spouse_Name][R]\n/b\nc"_s, u"a\n/b\nc"_s},
        {u"a\n/[R]x [Spouse_Name]\n[R]b\nc"_s, u"a\n/b\nc"_s},
        {u"a\n/x [R][Spouse_Name]\n[R]b\nc"_s, u"a\n/x b\nc"_s},
        {u"a\n[R][Spouse_Name]\n/Dear\n[R]\nb"_s, u"a\n/b"_s},
        {u"a\n/[R][Spouse_Name][R]"_s, u"a"_s},
    };
    for (const auto& [lines, copy] : merges) {
        auto letter = letter_of(QString(lines).remove(u'/'));
        const auto texts = lines.split(u'\n');
        for (qsizetype line = 0; line < texts.size(); ++line)
            letter.paragraphs[std::size_t(line)].shape.new_page = texts[line].startsWith(u'/');
        QStringList paragraphs;
        for (const auto& paragraph : LetterForm(letter).merged(naismiths).paragraphs)
            paragraphs +=
                (paragraph.shape.new_page ? u"/"_s : QString()) + output::plain_text({{paragraph}}).chopped(1);
        EXPECT_EQ(paragraphs.join(u'\n'), copy) << lines.toStdString();
    }
}

TEST(LetterMerge, FindsAFieldThatChangesItsLookAndKeepsItsFirstCharactersLook)
{
    const auto bold = usual.bolder();
    const auto red = usual.coloured(0xffff0000);
    const LetterText letter{{{{{u"Dear "_s, usual},
                               {u"[Sur"_s, bold},
                               {u"na"_s, red},
                               {u"me],[R"_s, usual},
                               {u"][Primary_Name]["_s, red},
                               {u"R] x"_s, usual}},
                              {.align = pages::Align::centre}}}};

    EXPECT_EQ(
        LetterForm(letter).merged(naismiths),
        (LetterText{{{{{u"Dear "_s, usual}, {u"Naismith"_s, bold}, {u","_s, usual}, {u"Ann"_s, red}, {u" x"_s, usual}},
                      {.align = pages::Align::centre}}}}));
}

TEST(LetterMerge, KeepsPicturesAndTheShapesOfParagraphs)
{
    const output::LetterPicture picture{"bytes", {9, 9}};
    const LetterParagraph drawn{{{u"[R][Spouse_Name][R]"_s, usual}, {{}, usual, picture}}, {.indent = 9}};
    const LetterParagraph gone{{{u"[R]"_s, usual}, {{}, usual, picture}, {u"[Spouse_Name][R]"_s, usual}}};
    const LetterParagraph split{{{u"[Sur"_s, usual}, {{}, usual, picture}, {u"name]"_s, usual}}, {.after = 3}};

    EXPECT_EQ(LetterForm({{drawn, gone, split}}).merged(naismiths),
              (LetterText{{{{{{}, usual, picture}}, {.indent = 9}}, split}}));
}

TEST(LetterMerge, RefusesFiltersThatHaveNoPartnerOrNothingBetweenThem)
{
    const core::Message uneven{u"You have incorrectly used the removal filter, an uneven amount are on this letter, as "
                               "a removal filter must have one before an object and after an object, so an even amount "
                               "must exist on the letter."_s,
                               u"Please fix this up before continuing."_s};
    const core::Message empty{u"A removal filter exists on this letter that does not have an object between it"_s};
    const struct
    {
        QString letter;
        std::optional<core::Message> fault;
    } letters[]{
        {u"no filter"_s, {}},
        {u"[R][Surname][R] [R]x[R]"_s, {}},
        {u"[R]a[R][R]b\n[R]"_s, {}},
        {u"[R][Surname]"_s, uneven},
        {u"[R][Surname][R]\nand [R]"_s, uneven},
        {u"[R][R]"_s, empty},
        {u"[R]x[R] y [R] \n\t[R]"_s, empty},
        {u"[R]x[R]\n[R][R]\n[R]y[R]"_s, empty},
        {u"[R][R][R]"_s, uneven},
    };
    for (const auto& [letter, fault] : letters)
        EXPECT_EQ(LetterForm(letter_of(letter)).fault(), fault) << letter.toStdString();
}

people::FamilyFile family_with(std::initializer_list<QString> titles)
{
    auto made = family(u"Naismith"_s, {u"Ann"_s, u"ben"_s, u"Cath"_s, u"Dan"_s, u"Eve"_s});
    auto person = made.people.begin();
    for (const auto& title : titles)
        (person++)->Title = title;
    made.address.res_street = u"1 High Street"_s;
    made.address.res_street2 = u"Rear"_s;
    made.address.res_state = u"VIC"_s;
    made.residential = people::Suburb{1, people::SuburbType::residential, {}, u"Kew"_s, u"3101"_s};
    made.address.post_street = u"Box 5"_s;
    made.postal = people::Suburb{2, people::SuburbType::postal, u"9000"_s, u"Hawthorn"_s, u"3122"_s};
    return made;
}

/// The letter's copy for a family.
QString copy_for(const people::FamilyFile& file, const QString& letter,
                 LetterAddress address = LetterAddress::residential, const people::Disclosure& disclosure = {})
{
    const auto family = people::disclose(file, disclosure);
    const LetterForm form(letter_of(letter));
    const auto values = form.values(output::LetterFamily::of(family, address, {2024, 5, 9}));
    return output::plain_text(form.merged(values)).chopped(1);
}

TEST(LetterFields, SayTheSameInBothSpellings)
{
    const auto file = family_with({u"Mrs"_s, u"Mr"_s});
    const struct
    {
        QString newer, older, value;
    } fields[]{
        {u"[Primary_Name]"_s, u"[First_Adult_Name]"_s, u"Ann"_s},
        {u"[Spouse_Name]"_s, u"[Second_Adult_Name]"_s, u"ben"_s},
        {u"[Primary_&_Spouse_Name]"_s, u"[First_&_Second_Adult_Name]"_s, u"Ann & ben"_s},
        {u"[Primary_&_Spouse_Name_&_Surname]"_s, u"[First_&_Second_Adult_Name_&_Surname]"_s, u"Ann & ben Naismith"_s},
        {u"[Titles_&_Primary_&_Spouse_Name_&_Surname]"_s, u"[Titles_&_First_&_Second_Adult_Name_&_Surname]"_s,
         u"Mrs & Mr Ann & ben Naismith"_s},
        {u"[Titles_&_Primary_&_Spouse_initial_&_Surname]"_s, u"[Titles_&_First_&_Second_Adult_initial_&_Surname]"_s,
         u"Mrs & Mr A & B Naismith"_s},
        {u"[Primary_Title]"_s, u"[First_Adult_Title]"_s, u"Mrs"_s},
        {u"[Spouse_Title]"_s, u"[Second_Adult_Title]"_s, u"Mr"_s},
        {u"[Surname]"_s, u"[Surname]"_s, u"Naismith"_s},
        {u"[Children_Names]"_s, u"[Children_Names]"_s, u"Cath, Dan & Eve"_s},
        {u"[____Street_Address____]"_s, u"[____Street_Address____]"_s, u"1 High Street"_s},
        {u"[____Street_line_2_____]"_s, u"[____Street_line_2_____]"_s, u"Rear"_s},
        {u"[____Suburb_Address____]"_s, u"[____Suburb_Address____]"_s, u"Kew VIC 3101"_s},
        {u"[&_Family]"_s, u"[&_Family]"_s, u"& Family"_s},
        {u"[Computer_Date]"_s, u"[Computer_Date]"_s, u"09/05/24"_s},
    };
    EXPECT_EQ(std::size(fields), output::letter_fields().size());
    for (const auto& [newer, older, value] : fields) {
        EXPECT_EQ(copy_for(file, newer), value) << newer.toStdString();
        EXPECT_EQ(copy_for(file, older), value) << older.toStdString();
    }
}

TEST(LetterFields, KeepASingleTitleWithItsOwnName)
{
    const struct
    {
        std::initializer_list<QString> titles;
        QString by_name, by_initial;
    } families[]{
        {{u"Mrs"_s, {}}, u"Mrs Ann & ben Naismith"_s, u"Mrs A & B Naismith"_s},
        {{{}, u"Dr"_s}, u"Ann & Dr ben Naismith"_s, u"A & Dr B Naismith"_s},
        {{}, u"Ann & ben Naismith"_s, u"A & B Naismith"_s},
    };
    for (const auto& [titles, by_name, by_initial] : families) {
        const auto file = family_with(titles);
        EXPECT_EQ(copy_for(file, u"[Titles_&_Primary_&_Spouse_Name_&_Surname]"_s), by_name);
        EXPECT_EQ(copy_for(file, u"[Titles_&_Primary_&_Spouse_initial_&_Surname]"_s), by_initial);
    }
}

TEST(LetterFields, LeaveOutWhoIsNotThere)
{
    auto single = family(u"Hale"_s, {u"𝒪li"_s});
    single.people[0].Title = u"Sir"_s;
    auto widow = family_with({u"Mr"_s, u"Mrs"_s});
    widow.people[0].Decease = widow.people[3].Decease = true;
    auto widower = family_with({u"Mr"_s, u"Mrs"_s});
    widower.people[1].Decease = true;
    auto orphans = family_with({});
    orphans.people[0].Decease = orphans.people[1].Decease = true;
    const auto all = u"[Primary_Name]|[Spouse_Name]|[Spouse_Title]|[First_&_Second_Adult_Name]|[Children_Names]|"
                     "[Titles_&_Primary_&_Spouse_initial_&_Surname]"_s;

    EXPECT_EQ(copy_for(single, all), u"𝒪li|||𝒪li||Sir 𝒪 Hale"_s);
    EXPECT_EQ(copy_for(widow, all), u"ben|||ben|Cath & Eve|Mrs B Naismith"_s);
    EXPECT_EQ(copy_for(widower, all), u"Ann|||Ann|Cath, Dan & Eve|Mr A Naismith"_s);
    EXPECT_EQ(copy_for(orphans, all), u"||||Cath, Dan & Eve|Naismith"_s);
}

TEST(LetterFields, TakeTheAddressThatTheRunChose)
{
    const auto all = u"[____Street_Address____]|[____Street_line_2_____]|[____Suburb_Address____]"_s;
    auto without_box = family_with({});
    without_box.address.post_street.clear();
    without_box.postal.reset();
    auto state_alone = without_box;
    state_alone.address.post_state = u"NSW"_s;
    state_alone.address.post_country = u"Australia"_s;
    auto unknown_suburb = family_with({});
    unknown_suburb.residential.reset();

    EXPECT_EQ(copy_for(family_with({}), all, LetterAddress::residential), u"1 High Street|Rear|Kew VIC 3101"_s);
    EXPECT_EQ(copy_for(family_with({}), all, LetterAddress::postal), u"Box 5||Hawthorn 9000"_s);
    EXPECT_EQ(copy_for(family_with({}), all, LetterAddress::mailing), u"Box 5||Hawthorn 9000"_s);
    EXPECT_EQ(copy_for(without_box, all, LetterAddress::postal), u"||"_s);
    EXPECT_EQ(copy_for(without_box, all, LetterAddress::mailing), u"1 High Street|Rear|Kew VIC 3101"_s);
    EXPECT_EQ(copy_for(state_alone, all, LetterAddress::postal), u"||"_s);
    EXPECT_EQ(copy_for(state_alone, all, LetterAddress::mailing), u"1 High Street|Rear|Kew VIC 3101"_s);
    EXPECT_EQ(copy_for(unknown_suburb, all, LetterAddress::residential), u"1 High Street|Rear|VIC"_s);
}

TEST(LetterFields, AreEmptyWhereASwitchHidesThem)
{
    auto file = family_with({u"Mrs"_s, u"Mr"_s});
    file.address.res_hidden = file.people[0].Title_hidden = file.people[1].Preferred_Name_hidden = true;
    file.people[0].preferred_name = u"Annie"_s;
    file.people[1].preferred_name = u"Benny"_s;
    const people::Disclosure preferred{.use_preferred_names = true};
    const auto letter = u"[Titles_&_Primary_&_Spouse_Name_&_Surname]|[Primary_Title]|[____Street_Address____]|"
                        "[____Street_line_2_____]|[____Suburb_Address____]"_s;

    EXPECT_EQ(copy_for(file, letter, LetterAddress::residential, preferred), u"Annie & Mr ben Naismith||||"_s);
    file.address.res_hidden = false;
    file.address.post_hidden = true;
    EXPECT_EQ(copy_for(file, u"[____Street_Address____]"_s, LetterAddress::postal), u""_s);
}

} // namespace

} // namespace kindrel::test

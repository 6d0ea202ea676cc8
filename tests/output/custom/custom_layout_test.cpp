#include "output/custom/custom_fixture.h"

#include "core/files.h"
#include "output/custom/custom_fields.h"
#include "people/fields.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace output;

namespace {

/// A layout that uses everything there is.
const auto whole_layout = uR"layout(# Made for the spring camp
report per person
title "The ""Camp"" List"
page landscape
columns 2 gap 10.5 hairline
margins 20mm 36 42 1in
text 8.25
font "Liberation Serif"
tabs 100 200.5
decoration no
one to a page
style name font "Liberation Sans" size 12 plain bold italic underline colour #123abc right
style caption colour blue
table grid striped
column "Name" share 3
column "" width 90 right
column "Ticks"
group by [groups "Choir"] new page leave out others

page header
    line [today] tab "Page " [page] " of " [pages]
page footer
    rule
start
    # Comments of a section stay in it
    line heading "Welcome"
    space 6
each person
    if [status "Member"] line always name "Phone: " caption [phone] { " (" [suburb] ")" }
    unless [phone] line "No phone"
    row always [Name] | name [groups lines] | [dates "Baptism" joined "; "]
    portrait 80 by 100 centre
    barcode 120 by 24
end of group
    line [family_count] " families"
end
    rule 2
    line [person_count] " people"
)layout"_s;

QStringList shown(const ParsedLayout& parsed)
{
    QStringList lines;
    for (const auto& fault : parsed.faults)
        lines += fault.shown();
    return lines;
}

std::string told(const ParsedLayout& parsed)
{
    return shown(parsed).join(u'\n').toStdString();
}

/// A layout and what is told of it.
struct Faulty
{
    QString text, fault;
};

/// A layout per family whose one section holds these lines from line 3 on.
QString in_section(const QString& lines)
{
    return u"report per family\neach family\n"_s + lines;
}

/// The same with settings from line 2 on.
QString with_settings(const QString& lines)
{
    return u"report per family\n"_s + lines + u"\neach family\nline [surname]\n"_s;
}

} // namespace

TEST(CustomLayout, EverythingThatALayoutCanSayIsReadAndWrittenBackTheSame)
{
    const auto parsed = parse_layout(whole_layout, LayoutKind::families);
    ASSERT_EQ(told(parsed), "");
    const auto& layout = parsed.layout;

    EXPECT_EQ(parse_layout(to_text(layout), LayoutKind::families).layout, layout) << to_text(layout).toStdString();
    EXPECT_EQ(to_text(parse_layout(to_text(layout), LayoutKind::receipts).layout), to_text(layout));
    EXPECT_EQ(layout.kind, LayoutKind::people);
    EXPECT_EQ(layout.title, u"The \"Camp\" List"_s);
    EXPECT_EQ(layout.page.margins, QMarginsF(56.69, 36, 42, 72));
    EXPECT_EQ(layout.notes, QStringList{u"Made for the spring camp"_s});
    EXPECT_EQ(layout.section(LayoutPlace::start).front().text, u"Comments of a section stay in it"_s);
    EXPECT_EQ(layout.section(LayoutPlace::person)[2].cells[1][1].field.joint, u"\n"_s);
    EXPECT_EQ(layout.styles.front().colour, QRgb(0xff123abc));
}

TEST(CustomLayout, TheFilesEndingTellsWhatItHoldsUnlessItsFirstLineDoes)
{
    EXPECT_EQ(layout_kind_of(u"/custom/Phones.RPT"_s), LayoutKind::families);
    EXPECT_EQ(layout_kind_of(u"a.rpy"_s), LayoutKind::people);
    EXPECT_EQ(layout_kind_of(u"thanks.rct"_s), LayoutKind::receipts);
    EXPECT_EQ(parse_layout(u"each person\nline [Name]"_s, LayoutKind::people).layout.kind, LayoutKind::people);
    EXPECT_EQ(parse_layout(u"receipt\neach giver\nline [Name]"_s, LayoutKind::people).layout.kind,
              LayoutKind::receipts);
}

TEST(CustomLayout, EachFaultIsToldWithItsLine)
{
    const std::vector<Faulty> cases{
        {in_section(u"line [surnam]"_s), u"Line 3: there is no field \"surnam\"; did you mean \"surname\"?"_s},
        {in_section(u"line [qqqqqqqq]"_s), u"Line 3: there is no field \"qqqqqqqq\"."_s},
        {in_section(u"line [Name]"_s), u"Line 3: the field \"Name\" has no value in \"each family\"."_s},
        {in_section(u"line [total]"_s), u"Line 3: the field \"total\" has no value in \"each family\"."_s},
        {in_section(u"line [phone \"Home\"]"_s),
         u"Line 3: the field \"phone\" is no list from which \"Home\" could be taken."_s},
        {in_section(u"line [phone loud]"_s),
         u"Line 3: in the field [phone] can stand the name of an item in quotation marks, \"lines\", or \"joined\" "
         "with a text, but not \"loud\"."_s},
        {in_section(u"line \"Phone"_s), u"Line 3: the text \"Phone\" has no closing quotation mark."_s},
        {in_section(u"line \"x\" [phone"_s), u"Line 3: the field \"[phone\" has no closing \"]\"."_s},
        {in_section(u"line captoin [phone]"_s), u"Line 3: there is no style \"captoin\"; did you mean \"caption\"?"_s},
        {in_section(u"line { [phone]"_s), u"Line 3: a \"{\" has no closing \"}\"."_s},
        {in_section(u"line [phone] }"_s), u"Line 3: a \"}\" stands here without its \"{\"."_s},
        {in_section(u"lien [phone]"_s), u"Line 3: no line begins with \"lien\"; did you mean \"line\"?"_s},
        {in_section(u"[phone]"_s),
         u"Line 3: a line begins with a word that tells what it is, such as \"line\" or \"title\"."_s},
        {in_section(u"line [phone]\ntitle \"x\""_s), u"Line 4: \"title\" belongs above the first section."_s},
        {in_section(u"line [phone]\neach famly"_s),
         u"Line 4: there is no \"each famly\"; did you mean \"each family\"?"_s},
        {in_section(u"line [phone]\neach family"_s), u"Line 4: \"each family\" stands on line 2 already."_s},
        {in_section(u"line [phone]\neach giver"_s),
         u"Line 4: a \"report per family\" has no section \"each giver\"."_s},
        {in_section(u"line [phone]\nend of group"_s),
         u"Line 4: \"end of group\" needs a line \"group by\" above the first section."_s},
        {in_section(u"line [phone]\nreceipt"_s), u"Line 4: \"receipt\" belongs on the first line."_s},
        {in_section(u"row [phone]"_s),
         u"Line 3: a row needs a table: write \"table\" and its columns above the first section."_s},
        {in_section(u"barcode 90 by 20\nline [phone]"_s),
         u"Line 3: a barcode is a person's and cannot stand in \"each family\"."_s},
        {in_section(u"portrait 80 100"_s),
         u"Line 3: \"portrait\" needs width and height, as in \"portrait 80 by 100\", but not \"100\"."_s},
        {in_section(u"space much"_s), u"Line 3: \"space\" needs a number from 0.5 to 500 here, but not \"much\"."_s},
        {in_section(u"if line [phone]"_s), u"Line 3: \"if\" needs a field, as in \"if [phone]\", but not \"line\"."_s},
        {in_section(u"rule 1 2"_s), u"Line 3: \"2\" has no meaning at this place of the line."_s},
        {with_settings(u"line \"x\""_s), u"Line 2: \"line\" belongs into a section, such as \"each family\"."_s},
        {with_settings(u"title \"a\"\ntitle \"b\""_s), u"Line 3: \"title\" stands on line 2 already."_s},
        {with_settings(u"page upright"_s), u"Line 2: \"page\" can be portrait, landscape, but not \"upright\"."_s},
        {with_settings(u"columns 9"_s), u"Line 2: \"columns\" needs a number from 1 to 4 here, but not \"9\"."_s},
        {with_settings(u"text nan"_s), u"Line 2: \"text\" needs a number from 4 to 36 here, but not \"nan\"."_s},
        {with_settings(u"style big sise 12"_s), u"Line 2: a style has no property \"sise\"; did you mean \"size\"?\n"
                                                "Line 2: a style has no property \"12\"."_s},
        {with_settings(u"style big\nstyle Big"_s), u"Line 3: there is a style \"big\" already."_s},
        {with_settings(u"group by surname"_s),
         u"Line 2: \"group\" goes on with a field, as in \"group by [suburb]\", but not \"surname\".\n"
         "Line 2: \"surname\" has no meaning at this place of the line."_s},
        {with_settings(u"group by [status]"_s), u"Line 2: the field \"status\" has no value in \"each family\"."_s},
        {u"each person"_s, u"The layout prints nobody: it needs a section \"each family\" with lines in it."_s},
    };
    for (const auto& one : cases)
        EXPECT_EQ(told(parse_layout(one.text, LayoutKind::families)), one.fault.toStdString())
            << one.text.toStdString();
}

TEST(CustomLayout, WhatHasNoRoomOnThePagesIsRefusedWithItsLine)
{
    const std::vector<Faulty> cases{
        {with_settings(u"margins 250 36 250 36\ncolumns 4"_s), u"The margins and columns leave no room to print in."_s},
        {with_settings(u"page portrait\npage header\nspace 300"_s),
         u"Line 3: the section \"page header\" is too high: it leaves no room on the pages."_s},
        {with_settings(u"text 36\npage footer\nline heading \"a\"\nline heading \"b\"\nline heading \"c\""_s),
         u"Line 3: the section \"page footer\" is too high: it leaves no room on the pages."_s},
        {with_settings(u"page landscape\nmargins 36 90 36 90\npage header\nspace 110\npage footer\nspace 110"_s),
         u"Line 6: page header and page footer leave no room between them on the pages."_s},
        {with_settings(u"margins 36 300 36 36"_s),
         u"Line 2: \"margins\" needs a number from 0 to 250 here, but not \"300\"."_s},
        {u"report per person\neach person\nbarcode 84 by 20"_s,
         u"Line 3: \"barcode\" needs a number from 85 to 400 here, but not \"84\"."_s},
        {u"report per person\ncolumns 4\neach person\nbarcode 120 by 20"_s,
         u"Line 4: the barcode is wider than the columns, which have room for 114 points."_s},
    };
    for (const auto& one : cases)
        EXPECT_EQ(told(parse_layout(one.text, LayoutKind::families)), one.fault.toStdString())
            << one.text.toStdString();
}

TEST(CustomLayout, AllFaultsOfATextAreToldAtOnceInTheOrderOfTheirLines)
{
    const auto parsed = parse_layout(u"titel \"x\"\neach family\n  line [surnam] \", \" [phon]\n  lin [phone]\n"_s,
                                     LayoutKind::families);

    EXPECT_EQ(shown(parsed), QStringList({u"Line 1: no line begins with \"titel\"; did you mean \"title\"?"_s,
                                          u"Line 3: there is no field \"surnam\"; did you mean \"surname\"?"_s,
                                          u"Line 3: there is no field \"phon\"; did you mean \"phone\"?"_s,
                                          u"Line 4: no line begins with \"lin\"; did you mean \"line\"?"_s}));
}

TEST(CustomLayout, AFileThatIsNoTextIsRefusedInWords)
{
    struct Case
    {
        QByteArray content;
        const char* fault;
    };
    const std::vector<Case> cases{
        {"", "The file is empty."},
        {" \r\n\t\n", "The file is empty."},
        {"\xef\xbb\xbf", "The file is empty."},
        {"title \"M\xfcller\"", "The file is not saved as UTF-8 text; save it again with this encoding."},
        {QByteArray("line\0x", 6),
         "The file is no text: it holds something else, such as a picture or a program's data."},
        {QByteArray(largest_layout + 1, 'x'), "The file is too large for a layout, which can have one megabyte."},
    };
    for (const auto& one : cases)
        EXPECT_EQ(told(parse_layout_file(one.content, LayoutKind::families)), one.fault);
    EXPECT_EQ(told(load_layout(u"/nowhere/gone.rpt"_s)), "The file is no longer there.");
}

TEST(CustomLayout, LineEndsAndAByteOrderMarkOfAnyEditorAreTaken)
{
    const auto parsed = parse_layout_file("\xef\xbb\xbfreport per family\r\ntitle \"Zoë\"\reach family\r\nline [phone]",
                                          LayoutKind::people);

    EXPECT_EQ(told(parsed), "");
    EXPECT_EQ(parsed.layout.title, u"Zoë"_s);
}

TEST(CustomLayout, TextsThatAreDamagedAtRandomNeverBreakTheParser)
{
    std::mt19937 chance(20);
    int whole = 0;
    for (int round = 0; round < 4000; ++round) {
        const auto text = damaged(whole_layout, chance);
        const auto parsed = parse_layout(text, LayoutKind::families);
        if (!parsed.faults.empty())
            continue;
        ++whole;
        ASSERT_EQ(parse_layout(to_text(parsed.layout), LayoutKind::families).layout, parsed.layout)
            << text.toStdString();
    }
    EXPECT_GT(whole, 100);
}

TEST(CustomLayout, EveryTextDateAndNumberThatARecordStoresHasItsField)
{
    const auto expect_fields = [](const auto& stored) {
        for (const auto& field : stored) {
            const auto name = QString::fromLatin1(field.name);
            const bool switches = name.endsWith(u"_hidden") || name == u"transfer_exists" || name == u"Marital";
            EXPECT_TRUE(switches || find_custom_field(name)) << field.name;
        }
    };
    expect_fields(people::family_fields());
    expect_fields(people::address_fields());
    expect_fields(people::people_fields());
    expect_fields(people::detail_fields());
}

TEST(CustomLayout, FieldsAreFoundInAnyCaseAndByTheNamesOfTheLetters)
{
    struct Case
    {
        QString asked;
        const char* found;
    };
    const std::vector<Case> cases{
        {u"SURNAME"_s, "surname"},
        {u"First_Adult_Name"_s, "Primary_Name"},
        {u"titles_&_first_&_second_adult_initial_&_surname"_s, "Titles_&_Primary_&_Spouse_initial_&_Surname"},
        {u"____Street_Address____"_s, "res_street"},
        {u"____Suburb_Address____"_s, "Suburb_Address"},
        {u"&_Family"_s, "&_Family"},
        {u"Computer_Date"_s, "today"},
    };
    for (const auto& one : cases) {
        const auto* field = find_custom_field(one.asked);
        ASSERT_TRUE(field) << one.asked.toStdString();
        EXPECT_STREQ(field->name, one.found);
    }
    EXPECT_FALSE(find_custom_field({}));
    for (const auto& field : custom_fields())
        EXPECT_EQ(find_custom_field(QString::fromLatin1(field.name)), &field) << field.name;
}

TEST(CustomLayout, TheGuideListsEveryFieldAndItsExamplesCanBeRun)
{
    const std::vector<std::pair<FieldScope, QString>> sections{
        {FieldScope::run, u"everywhere"_s},
        {FieldScope::group, u"entries and `end of group`"_s},
        {FieldScope::totals, u"`end`, `end of group`"_s},
        {FieldScope::page, u"`page header`, `page footer`"_s},
        {FieldScope::family, u"`each family`, `each person`, `each giver`"_s},
        {FieldScope::person, u"`each person`, `each giver`"_s},
        {FieldScope::receipt, u"`each giver`"_s},
    };
    const auto content = core::read_file(QString::fromLatin1(KINDREL_DOCS "/custom-layouts.md"));
    ASSERT_TRUE(content);
    const auto guide = QString::fromUtf8(*content);

    QString table;
    for (const auto& field : custom_fields()) {
        const auto place = std::ranges::find(sections, field.scope, &std::pair<FieldScope, QString>::first);
        table += u"| `%1` | %2 | %3 | %4 |\n"_s.arg(QString::fromLatin1(field.name), QString::fromLatin1(field.words),
                                                    place->second, field.items ? u"yes"_s : QString());
    }
    EXPECT_TRUE(guide.contains(table)) << table.toStdString();
    const auto parts = guide.split(u"```\n"_s);
    ASSERT_EQ(parts.size(), 5);
    const std::vector<std::pair<int, QString>> examples{{1, u"phone_list_layout.txt"_s}, {3, u"receipt_layout.txt"_s}};
    for (const auto& [part, sample] : examples) {
        EXPECT_EQ(told(parse_layout(parts[part], LayoutKind::people)), "");
        EXPECT_EQ(parts[part].toUtf8(), core::read_file(QString::fromLatin1(KINDREL_SAMPLES "/") + sample));
    }
}

} // namespace kindrel::test

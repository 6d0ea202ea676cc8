#include "setup_fixture.h"

#include <QFile>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using enum SetupKind;

namespace {

const auto one_item = u"Nothing was imported. Each line holds one item."_s;
const auto a_suburb =
    u"Nothing was imported. Each line holds a suburb and its postcode with a comma, a semicolon or a tab "
    "between them."_s;

class SetupImportTest : public SetupRuleTest
{
protected:
    /// A file of this content.
    [[nodiscard]] QString file(const QByteArray& content)
    {
        const QString path = church.folder() + u"/items.txt"_s;
        DataFolder::write(path, content);
        return path;
    }
};

} // namespace

TEST_F(SetupImportTest, ItemsComeInTheOrderOfTheirLinesWhateverTheirLineEndsAndLetters)
{
    struct Case
    {
        SetupKind kind;
        QByteArray content;
        QStringList imported;
    };
    const std::vector<Case> cases{
        {occupations, "Nurse\n\n  Plumber, gas \t\nCook", {u"Nurse"_s, u"Plumber, gas"_s, u"Cook"_s}},
        {occupations, "Nurse\r\n \r\nCook\r\n", {u"Nurse"_s, u"Cook"_s}},
        {occupations, "Nurse\rCook\r", {u"Nurse"_s, u"Cook"_s}},
        {occupations,
         "\xEF\xBB\xBF"
         "Caf\xC3\xA9",
         {u"Café"_s}},
        {occupations, "Caf\xE9\nA\x80rt", {u"Café"_s, u"A€rt"_s}},
        {suburbs,
         "Richmond,3121\nSt Kilda East ; 3183\nUlm\t89073 \nRichmond,2753",
         {u"Richmond 3121"_s, u"St Kilda East 3183"_s, u"Ulm 89073"_s, u"Richmond 2753"_s}},
    };
    for (const auto& [kind, content, imported] : cases) {
        auto editor = open();
        EXPECT_TRUE(editor.import_file(kind, file(content))) << content.constData();
        EXPECT_EQ(texts(editor.list(kind)).mid(3), imported) << content.constData();
    }
}

TEST_F(SetupImportTest, ABadLineIsNamedByItsNumberAndNothingIsImported)
{
    struct Case
    {
        SetupKind kind;
        QByteArray content;
        QString fault;
    };
    const std::vector<Case> cases{
        {suburbs, "Richmond,3121\n\nHawthorn", u"line 3 has no postcode"_s},
        {suburbs, "Richmond,3121\nHawthorn; ", u"line 2 has no postcode"_s},
        {suburbs, ",3121", u"line 1 has no suburb"_s},
        {suburbs, "East,Richmond,3121", u"line 1 holds more than a suburb and a postcode"_s},
        {suburbs, "Ulm,1\nBonn,2\n ulm ; 1", u"line 3 repeats line 1"_s},
        {suburbs, "Ulm," + QByteArray(256, '1'), u"line 1 is longer than 255 characters"_s},
        {titles, "Dr\n" + QByteArray(256, 'x'), u"line 2 is longer than 255 characters"_s},
        {titles, "Dr\nRev\n\nDR", u"line 4 repeats line 1"_s},
        {titles, "Dr\t5", u"line 1 holds a tab or another character that cannot be shown"_s},
    };
    for (const auto& [kind, content, fault] : cases) {
        auto editor = open();
        dialogue.expect_box(u"Unable to import this file as %1"_s.arg(fault), kind == suburbs ? a_suburb : one_item);
        EXPECT_FALSE(editor.import_file(kind, file(content)));
        EXPECT_FALSE(editor.altered());
    }
}

TEST_F(SetupImportTest, WhatExistsAlreadyIsLeftOutAndCounted)
{
    auto editor = open();
    const auto count = editor.import_file(flexi_fields, file("FLEXI 2\nShoe size\n flexi 1\nAllergy"));
    ASSERT_TRUE(count);
    EXPECT_EQ(count->words(), u"2 items were added, 2 exist already."_s);
    EXPECT_EQ(texts(editor.list(flexi_fields)),
              (QStringList{u"flexi 1"_s, u"flexi 2"_s, u"flexi 3"_s, u"Shoe size"_s, u"Allergy"_s}));
    const auto again = editor.import_file(flexi_fields, file("Allergy"));
    ASSERT_TRUE(again);
    EXPECT_EQ(again->words(), u"0 items were added, 1 exists already."_s);
}

TEST_F(SetupImportTest, AFileThatHoldsNoListIsRefused)
{
    auto editor = open();
    const auto missing = church.folder() + u"/none.txt"_s;
    dialogue.expect_box(u"Unable to find the file '%1'"_s.arg(missing));
    EXPECT_FALSE(editor.import_file(status, missing));
    dialogue.expect_box(u"Unable to import this file as it holds no items"_s);
    EXPECT_FALSE(editor.import_file(status, file("\r\n  \n")));
    for (const auto& content : {QByteArray("PK\3\4\0\0", 6), QByteArray("N\0u\0r\0s\0e\0", 10)}) {
        dialogue.expect_box(u"Unable to import this file as it is not a text file"_s);
        EXPECT_FALSE(editor.import_file(status, file(content)));
    }
    EXPECT_FALSE(editor.altered());
}

TEST_F(SetupImportTest, TheFileIsAskedFor)
{
    auto editor = open();
    dialogue.expect_file(u"Import Family Groups"_s, std::nullopt);
    EXPECT_FALSE(editor.import(family_groups));
    dialogue.expect_file(u"Import Family Groups"_s, file("Northside"));
    const auto count = editor.import(family_groups);
    ASSERT_TRUE(count);
    EXPECT_EQ(count->words(), u"1 item was added."_s);
}

} // namespace kindrel::test

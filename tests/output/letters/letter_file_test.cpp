#include "output/letters/letter_file.h"

#include "core/files.h"

#include <QBuffer>
#include <QFile>
#include <QImage>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using output::LetterParagraph;
using output::LetterRun;
using output::LetterText;
using pages::Align;
using pages::TextStyle;

namespace {

const TextStyle usual = output::letter_style();

QByteArray picture_bytes(const char* format)
{
    QImage image(12, 8, QImage::Format_RGB32);
    image.fill(0xff336699);
    QByteArray bytes;
    QBuffer buffer(&bytes);
    image.save(&buffer, format);
    return bytes;
}

LetterText letter_of(std::vector<LetterParagraph> paragraphs)
{
    return {std::move(paragraphs)};
}

/// One of everything that a letter can hold.
LetterText full_letter()
{
    const TextStyle heading{.family = u"Times {New} \\ Roman"_s, .size = 22.5, .bold = true, .colour = 0xff12ab9f};
    const TextStyle odd{.family = u"Żółw"_s, .size = 9, .italic = true, .underline = true};
    return letter_of({
        {{{u"St Aidan’s {Church} \\ 5 > 3"_s, heading}}, {.align = Align::centre, .after = 12.05}},
        {{{{}, odd}}},
        {{{u"Dear\t"_s, usual}, {u"[Surname]\nZoë €—שלום 🕊 \u00a0"_s, odd}, {u" end "_s, usual}},
         {.align = Align::justified, .indent = 36, .first_indent = -18, .before = 3, .tabs = {36, 90.5}}},
        {{{{}, usual, {picture_bytes("PNG"), {90, 60}}},
          {u"between"_s, usual},
          {{}, odd, {picture_bytes("JPG"), {12.5, 8}}}},
         {.align = Align::right}},
        {{{u"2\\page"_s, usual.coloured(0xffff0000)}}, {.new_page = true}},
        {{{{}, usual}}},
    });
}

/// A foreign program's way of saying things, and the plain text that it comes to.
struct Foreign
{
    const char* rtf;
    QString text;
};

QString read_text(const QByteArray& rtf)
{
    const auto read = output::read_letter(rtf);
    EXPECT_EQ(read.fault, QString()) << rtf.constData();
    return output::plain_text(read.letter);
}

TEST(LetterFile, ReadsBackWhatItWrites)
{
    const auto letter = full_letter();

    const auto read = output::read_letter(output::letter_bytes(letter));

    EXPECT_EQ(read.fault, QString());
    ASSERT_EQ(read.letter.paragraphs.size(), letter.paragraphs.size());
    for (std::size_t i = 0; i < letter.paragraphs.size(); ++i) {
        EXPECT_EQ(read.letter.paragraphs[i].shape, letter.paragraphs[i].shape) << i;
        EXPECT_EQ(read.letter.paragraphs[i].runs, letter.paragraphs[i].runs) << i;
    }
}

TEST(LetterFile, IsWrittenInPlainBytesThatEveryReaderKnows)
{
    const auto bytes = output::letter_bytes(full_letter());

    EXPECT_TRUE(bytes.startsWith("{\\rtf1\\ansi\\ansicpg1252\\deff0"));
    EXPECT_TRUE(std::ranges::all_of(bytes, [](char c) { return (c >= ' ' && c <= '~') || c == '\r' || c == '\n'; }));
    EXPECT_TRUE(bytes.contains("\\u8217\\'92")) << "a reader without Unicode shows the byte beside it";
    EXPECT_TRUE(bytes.contains("St Aidan"));
}

TEST(LetterFile, ReadsTheTextOfOtherPrograms)
{
    const Foreign files[]{
        {"{\\rtf1}", u"\n"_s},
        {"{\\rtf1 one\\par two}", u"one\ntwo\n"_s},
        {"{\\rtf1 one\\par two\\par}", u"one\ntwo\n"_s},
        {"{\\rtf1 on\r\ne\\par\r\n\\par}\r\n\0", u"one\n\n"_s},
        {"{\\rtf1 a\\\nb}", u"a\nb\n"_s},
        {"{\\rtf1 caf\\'e9 \\'80 \xE9}", u"café € é\n"_s},
        {"{\\rtf1 \\u8364?\\u8364\\'80x}", u"€€x\n"_s},
        {"{\\rtf1\\uc2 \\u8364ab\\uc0\\u8364c}", u"€€c\n"_s},
        {"{\\rtf1 {\\uc3\\u8364abcd}\\u8364ab}", u"€d€b\n"_s},
        {"{\\rtf1 \\u-10179?\\u-9174?}", u"🐪\n"_s},
        {"{\\rtf1 \\u8364{}x}", u"€x\n"_s},
        {"{\\rtf1 \\lquote a\\rquote\\~b\\endash c\\{\\}\\\\}", u"‘a’\u00a0b–c{}\\\n"_s},
        {"{\\rtf1{\\fonttbl{\\f0 Arial;}}{\\stylesheet{\\s1 Normal;}}{\\info{\\author Me}}x}", u"x\n"_s},
        {"{\\rtf1{\\*\\generator Some {nested} thing;}{\\*\\unheard x}{\\unheard y}z}", u"yz\n"_s},
        {"{\\rtf1{\\field{\\*\\fldinst HYPERLINK x}{\\fldrslt here}}}", u"here\n"_s},
        {"{\\rtf1{\\header top}{\\footnote aside}a{\\v secret}\\v0 b}", u"ab\n"_s},
        {"{\\rtf1\\trowd a\\cell b\\cell\\row c}", u"a\tb\t\nc\n"_s},
        {"{\\rtf1 a\\page b}", u"a\nb\n"_s},
        {"{\\rtf1 a{\\pict\\wmetafile8 0102}b}", u"ab\n"_s},
        {"{\\rtf1\\bin3 {}\\x}", u"x\n"_s},
        {"{\\rtf1 {\\colortbl;\\red1;}a{\\pict}}", u"a\n"_s},
    };
    for (const auto& [rtf, text] : files)
        EXPECT_EQ(read_text(rtf), text) << rtf;
}

TEST(LetterFile, KeepsLooksToTheGroupThatTheyAreSetIn)
{
    const auto read = output::read_letter("{\\rtf1\\deff1{\\fonttbl{\\f0\\froman Times;}{\\f1 Helvetica;}}"
                                          "{\\colortbl;\\red255\\green0\\blue0;}"
                                          "a{\\b\\i b{\\fs40\\cf1\\ul c}\\plain\\f0 d}\\b0 e\\b f\\b0\\par}");

    const auto text = usual.sized(12);
    auto plain = text;
    plain.family = u"Helvetica"_s;
    auto times = text;
    times.family = u"Times"_s;
    const auto strong = plain.bolder().slanted();
    auto loud = strong.sized(20).coloured(0xffff0000);
    loud.underline = true;
    ASSERT_EQ(read.letter.paragraphs.size(), 1);
    EXPECT_EQ(read.letter.paragraphs[0].runs, (std::vector<LetterRun>{{u"a"_s, plain},
                                                                      {u"b"_s, strong},
                                                                      {u"c"_s, loud},
                                                                      {u"d"_s, times},
                                                                      {u"e"_s, plain},
                                                                      {u"f"_s, plain.bolder()}}));
}

TEST(LetterFile, BringsMeasuresThatNoPageHasIntoReach)
{
    const auto read = output::read_letter("{\\rtf1\\li-500\\fi-99999999\\sb99999999\\tx700\\tx-5\\tx300\\tx700"
                                          "\\fs99999 a\\par\\pard\\fs0 b\\f7 c\\cf99 d}");

    ASSERT_EQ(read.letter.paragraphs.size(), 2);
    const auto& first = read.letter.paragraphs[0];
    EXPECT_EQ(first.shape, (output::LetterShape{.before = 1440, .tabs = {15, 35}}));
    EXPECT_EQ(first.runs.front().style.size, 400);
    EXPECT_EQ(read.letter.paragraphs[1].runs, (std::vector<LetterRun>{{u"bcd"_s, usual.sized(1)}}));
}

TEST(LetterFile, ReadsPicturesInHexAndInBytes)
{
    const auto png = picture_bytes("PNG");
    const auto hex = "{\\pict{\\*\\picprop{\\sp 12}}\\pngblip\\picscalex50\\picscaley200\\picwgoal2000\\pichgoal400 " +
                     png.toHex() + "}";
    const auto raw = "{\\*\\shppict{\\pict\\pngblip\\bin" + QByteArray::number(png.size()) + " " + png + "}}";

    const auto read = output::read_letter("{\\rtf1 " + hex + raw + "{\\nonshppict " + hex + "}}");

    ASSERT_EQ(read.fault, QString());
    ASSERT_EQ(read.letter.paragraphs[0].runs.size(), 2);
    EXPECT_EQ(read.letter.paragraphs[0].runs[0].picture, (output::LetterPicture{png, {50, 40}}));
    EXPECT_EQ(read.letter.paragraphs[0].runs[1].picture, (output::LetterPicture{png, {9, 6}}));
}

TEST(LetterFile, RefusesWhatIsNoLetterInPlainWords)
{
    const auto deep = [](int depth) {
        return "{\\rtf1" + QByteArray(depth, '{') + QByteArray(depth, '}') + '}';
    };
    const struct
    {
        QByteArray bytes;
        QString fault;
    } files[]{
        {{}, u"It does not begin as a letter does."_s},
        {"Dear all", u"It does not begin as a letter does."_s},
        {"PK\3\4", u"It does not begin as a letter does."_s},
        {"{\\rtf1 Dear", u"It is damaged: its end is missing."_s},
        {"{\\rtf1 {Dear}", u"It is damaged: its end is missing."_s},
        {"{\\rtf1 Dear}}", u"It is damaged: it goes on behind its end."_s},
        {"{\\rtf1 Dear}{\\rtf1}", u"It is damaged: it goes on behind its end."_s},
        {"{\\rtf1 \\'g1}", u"It is damaged."_s},
        {"{\\rtf1 \\'e", u"It is damaged."_s},
        {"{\\rtf1 \\fs99999999999 a}", u"It is damaged."_s},
        {"{\\rtf1 \\bin500 a}", u"It is damaged."_s},
        {"{\\rtf1 \\bin-5 a}", u"It is damaged."_s},
        {"{\\rtf1 a\\", u"It is damaged."_s},
        {deep(200), u"It is damaged: its parts lie too deeply inside each other."_s},
        {deep(5'000'000), u"It is damaged: its parts lie too deeply inside each other."_s},
        {"{\\rtf1{\\pict\\pngblip 00ff}}", u"A picture in it is damaged."_s},
        {"{\\rtf1{\\pict\\pngblip " + picture_bytes("BMP").toHex() + "}}", u"A picture in it is damaged."_s},
        {"{\\rtf1{\\pict\\pngblip " + picture_bytes("PNG").first(40).toHex() + "}}", u"A picture in it is damaged."_s},
        {"{\\rtf1" + ("{\\pict\\pngblip " + picture_bytes("PNG").toHex() + "}").repeated(101) + "}",
         u"It holds more than 100 pictures, the most that a letter can have."_s},
    };
    for (const auto& [bytes, fault] : files)
        EXPECT_EQ(output::read_letter(bytes), (output::ReadLetter{{}, fault})) << bytes.left(60).constData();
    EXPECT_EQ(output::read_letter(deep(199)).fault, QString());
}

TEST(LetterFile, HoldsThirtyTwoThousandCharactersAndNoMore)
{
    const QByteArray half(16 * 1024 - 1, 'x');
    const auto file = [&](const QByteArray& more) {
        return output::read_letter("{\\rtf1 " + half + "\\par " + half + more + "}");
    };

    EXPECT_EQ(output::length_of(file("\\par").letter), 32 * 1024 - 1);
    EXPECT_EQ(output::length_of(file("y").letter), 32 * 1024);
    EXPECT_EQ(file("yy").fault, u"It holds more than 32K characters of text, the most that a letter can have."_s);
    EXPECT_EQ(file("y\\par\\par").fault, file("yy").fault);
    EXPECT_EQ(output::read_letter("{\\rtf1" + QByteArray("\\par").repeated(1'000'000) + "}").fault, file("yy").fault);
}

TEST(LetterFile, IsSavedWholeOrNotAtAll)
{
    const QTemporaryDir folder;
    const auto file = folder.filePath(u"Welcome.ltr"_s);
    output::save_letter(file, full_letter());

    EXPECT_EQ(output::load_letter(file).letter, full_letter());
    EXPECT_EQ(output::load_letter(folder.filePath(u"Other.ltr"_s)).fault, u"It is not there any more."_s);
    const auto too_long = letter_of({{{{QString(32 * 1024 + 1, u'x'), usual}}}});
    EXPECT_THROW(output::save_letter(file, too_long), core::FileError);
    const auto too_large = letter_of({{{{{}, usual, {QByteArray(9 << 20, 'x'), {9, 9}}}}}});
    EXPECT_THROW(output::save_letter(file, too_large), core::FileError);
    EXPECT_EQ(output::load_letter(file).letter, full_letter());

    QFile huge(file);
    ASSERT_TRUE(huge.resize((16 << 20) + 1));
    EXPECT_EQ(output::load_letter(file).fault, u"It is larger than 16 MB, the most that a letter can have."_s);
}

/// Bytes changed, dropped, doubled and moved about, some towards what means something in a letter file.
QByteArray damaged(QByteArray bytes, std::mt19937& chance)
{
    static const QByteArray words[]{"{",      "}",      "\\",        "\\'",  "\\u",    "-1",        "999999999",
                                    "\\bin",  "\\pict", "\\par",     "\\*",  ";",      "\\fonttbl", "\\colortbl",
                                    "\\page", "\\uc9",  "\\pngblip", "\\tx", "\\plain"};
    const auto below = [&](qsizetype end) {
        return qsizetype(chance() % std::size_t(std::max<qsizetype>(end, 1)));
    };
    for (int times = 1 + int(below(6)); times > 0; --times) {
        const auto at = below(bytes.size());
        switch (below(5)) {
        case 0:
            bytes.replace(at, 1, QByteArray(1, char(below(256))));
            break;
        case 1:
            bytes.remove(at, below(40));
            break;
        case 2:
            bytes.insert(at, bytes.mid(below(bytes.size()), below(60)));
            break;
        case 3:
            bytes.insert(at, words[below(std::size(words))]);
            break;
        default:
            bytes.truncate(std::max<qsizetype>(at, 6));
            bytes += QByteArray(below(4), '}');
        }
    }
    return bytes;
}

TEST(LetterFile, ReadsOrRefusesDamageAndNeverChangesWhatItReads)
{
    std::mt19937 chance(2026);
    const QByteArray beginnings[]{
        output::letter_bytes(full_letter()), output::letter_bytes(letter_of({{{{u"Dear [Surname]"_s, usual}}}})),
        "{\\rtf1{\\fonttbl{\\f0 Arial;}{\\f1{\\*\\panose 02}Symbol;}}{\\colortbl;\\red9;\\blue77;}\\cf2 a\\'e9"
        "{\\field{\\*\\fldinst X}{\\fldrslt b}}\\trowd a\\cell\\row\\uc1\\u8364?{\\pict\\pngblip 00}}"};
    int usable = 0;
    for (int i = 0; i < 6000; ++i) {
        const auto bytes = damaged(beginnings[i % 3], chance);
        const auto read = output::read_letter(bytes);
        if (!read.fault.isEmpty())
            continue;
        ++usable;
        ASSERT_FALSE(read.letter.paragraphs.empty());
        ASSERT_EQ(output::read_letter(output::letter_bytes(read.letter)), read) << bytes.constData();
    }
    EXPECT_GT(usable, 600);
}

} // namespace

} // namespace kindrel::test

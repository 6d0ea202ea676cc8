#include "output/letters/letter_text.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

pages::TextStyle letter_style()
{
    constexpr qreal usual_size = 12;
    return {.family = u"Arial"_s, .size = usual_size};
}

qsizetype length_of(const LetterText& letter)
{
    auto length = qsizetype(letter.paragraphs.size()) - 1;
    for (const auto& paragraph : letter.paragraphs) {
        for (const auto& run : paragraph.runs)
            length += run.text.size();
    }
    return length;
}

QString plain_text(const LetterText& letter)
{
    QString text;
    for (const auto& paragraph : letter.paragraphs) {
        for (const auto& run : paragraph.runs)
            text += run.text;
        text += u'\n';
    }
    return text;
}

void add_text(LetterParagraph& paragraph, const QString& text, const pages::TextStyle& style)
{
    if (text.isEmpty())
        return;
    auto& runs = paragraph.runs;
    if (!runs.empty() && runs.back().picture.empty() && runs.back().style == style)
        runs.back().text += text;
    else
        runs.push_back({text, style});
}

void close(LetterParagraph& paragraph, const pages::TextStyle& style)
{
    if (paragraph.runs.empty())
        paragraph.runs.push_back({{}, style});
}

} // namespace kindrel::output

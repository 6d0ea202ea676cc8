#include "people/sort_key.h"

#include <algorithm>
#include <array>
#include <utility>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// Letters that Unicode does not take apart into a base letter and a mark.
constexpr std::array<std::pair<char16_t, QStringView>, 12> letters{{
    {u'Ø', u"O"},
    {u'Ł', u"L"},
    {u'Đ', u"D"},
    {u'Ð', u"D"},
    {u'Þ', u"TH"},
    {u'Æ', u"AE"},
    {u'Œ', u"OE"},
    {u'Ħ', u"H"},
    {u'Ŧ', u"T"},
    {u'ı', u"I"},
    {u'’', u"'"},
    {u'‘', u"'"},
}};

void append_base(QString& key, QChar c)
{
    const auto* found = std::ranges::find(letters, c.unicode(), &std::pair<char16_t, QStringView>::first);
    if (found != letters.end())
        key += found->second;
    else if (c.category() != QChar::Mark_NonSpacing)
        key += c;
}

} // namespace

QString sort_key(const QString& text)
{
    const QString upper = text.trimmed().toUpper();
    if (std::ranges::all_of(upper, [](QChar c) { return c.unicode() < 0x80; }))
        return upper;
    QString key;
    key.reserve(upper.size() + 4);
    for (const QChar c : upper.normalized(QString::NormalizationForm_KD))
        append_base(key, c);
    return key;
}

} // namespace kindrel::people

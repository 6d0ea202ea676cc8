#include "people/search_words.h"

#include "people/sort_key.h"

#include <algorithm>
#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array apostrophes{u'\'', u'\u2019'};

/// With hyphens and stops as blanks, and each apostrophe as `apostrophe`.
QString parted(QString folded, const QString& apostrophe)
{
    for (const QChar mark : {u'-', u',', u'.', u'(', u')'})
        folded.replace(mark, u' ');
    for (const QChar mark : apostrophes)
        folded.replace(QString(mark), apostrophe);
    return folded;
}

} // namespace

QString search_words(const QString& text)
{
    const QString folded = sort_key(text);
    const QString words = u' ' + parted(folded, u" "_s);
    const QString joined = u' ' + parted(folded, {});
    return words.size() == joined.size() ? words : words + joined;
}

QStringList wanted_words(const QString& typed)
{
    QStringList words = parted(sort_key(typed), {}).split(u' ', Qt::SkipEmptyParts);
    for (QString& word : words)
        word.prepend(u' ');
    return words;
}

bool has_all(const QString& search_words, const QStringList& wanted)
{
    return std::all_of(wanted.begin(), wanted.end(),
                       [&search_words](const QString& word) { return search_words.contains(word); });
}

bool narrows(const QStringList& before, const QStringList& after)
{
    return std::all_of(before.begin(), before.end(), [&after](const QString& old) {
        return std::any_of(after.begin(), after.end(), [&old](const QString& word) { return word.startsWith(old); });
    });
}

} // namespace kindrel::people

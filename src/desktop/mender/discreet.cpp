#include "desktop/mender/discreet.h"

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

/// Findings whose words are the program's own, with counts and names of tables and settings files. What is not listed
/// is told by its kind alone.
constexpr std::array impersonal{
    u"companions", u"orphans", u"positions", u"counters",       u"version", u"schema",     u"indexes", u"markers",
    u"side_files", u"names",   u"damaged",   u"orphaned_files", u"closed",  u"unreadable", u"in_use",
};

/// What stands before the first of these.
QString before(const QString& words, const QString& sign)
{
    return words.section(sign, 0, 0).trimmed();
}

} // namespace

QString discreet(const core::Finding& finding)
{
    const auto is_kind = [&](const char16_t* kind) {
        return finding.kind == QStringView(kind);
    };
    if (std::ranges::any_of(impersonal, is_kind))
        return finding.words;
    if (is_kind(u"locks"))
        return discreet_lock(finding.words);
    if (is_kind(u"doubles"))
        return before(finding.words, u"(the first"_s) + u'.';
    if (is_kind(u"leftovers") || is_kind(u"server"))
        return before(finding.words, u":"_s) + u'.';
    return u"%1: %2"_s.arg(finding.kind, core::counted(finding.count, u"entry"_s, u"entries"_s));
}

QString discreet_lock(const QString& line)
{
    if (line.startsWith(u"The marker "_s))
        return line;
    const QString what = before(before(line, u"'"_s), u" is held"_s);
    return u"A lock: "_s + (what.isEmpty() ? u"of an unknown kind"_s : what);
}

} // namespace kindrel::desktop

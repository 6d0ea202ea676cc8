#include "desktop/people/fusion_words.h"

#include "people/filter_items.h"
#include "people/filter_words.h"

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FusionMode;

namespace {

QString entry_words(const people::FusionEntry& entry)
{
    auto item = entry.item;
    item.exclude = entry.mode == FusionMode::or_minus;
    const QString words = people::carried_words(std::array{item});
    return entry.mode == FusionMode::and_minus ? u"not "_s + words : words;
}

} // namespace

QString fusion_sentence(const people::Fusion& fusion)
{
    QStringList all{people::words_of(fusion.states)}, any;
    for (const auto& entry : fusion.entries) {
        if (entry.lost)
            continue;
        const bool alternative = entry.mode == FusionMode::or_plus || entry.mode == FusionMode::or_minus;
        (alternative ? any : all) += entry_words(entry);
    }
    if (!any.isEmpty())
        all.insert(1, people::alternatives(any));
    if (all.size() == 1 && !fusion.entries.empty())
        all += u"nobody, as the items of all its entries are gone"_s;
    QString sentence = all.join(u"; "_s);
    sentence[0] = sentence[0].toUpper();
    return sentence + u'.';
}

} // namespace kindrel::desktop

#include "apps/mender_commands.h"

#include "core/mender_words.h"
#include "people/mender_people.h"

#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

namespace words = core::mender_words;
using core::Cure;
using core::Finding;
using core::Findings;

QString word_of(Cure cure)
{
    switch (cure) {
    case Cure::mend:
        return u"mend"_s;
    case Cure::unlock:
        return u"unlock"_s;
    case Cure::recover:
        return u"recover"_s;
    case Cure::by_hand:
        return u"by hand"_s;
    }
    return {};
}

void print_json(QTextStream& out, const Findings& findings)
{
    QJsonArray list;
    for (const auto& finding : findings)
        list.append(QJsonObject{{u"kind"_s, finding.kind},
                                {u"words"_s, finding.words},
                                {u"count"_s, finding.count},
                                {u"cure"_s, word_of(finding.cure)},
                                {u"remedy"_s, finding.remedy}});
    out << QJsonDocument(list).toJson();
}

void print(QTextStream& out, const Findings& findings)
{
    for (const auto& finding : findings)
        out << "- " << finding.words << "\n  " << word_of(finding.cure) << ": " << finding.remedy << '\n';
}

QString church_in_words(const core::MenderPlace& place)
{
    return u"Church %1 (%2)"_s.arg(QString::number(place.church), place.paths.folder(core::Folder::church));
}

bool agreed(const MenderContext& context, const QString& question)
{
    return !context.order.ask || context.dialogue.confirm({question}, core::Answer::no);
}

bool refuse(const MenderContext& context, const QString& why)
{
    context.dialogue.show({why});
    return false;
}

bool check(const MenderContext& context)
{
    const auto findings = core::examine_church(context.place, people::mender_checks());
    if (context.order.json) {
        print_json(context.out, findings);
    } else if (findings.empty()) {
        context.out << church_in_words(context.place) << " is sound.\n";
    } else {
        context.out << church_in_words(context.place) << ": "
                    << core::counted(static_cast<int>(findings.size()), u"finding"_s, u"findings"_s) << "\n\n";
        print(context.out, findings);
    }
    return findings.empty();
}

/// Nobody may be at work on this workstation while its church is mended.
bool free_to_work(const MenderContext& context)
{
    return context.place.workstation.claim_single_instance(context.place.paths.folder(core::Folder::local_settings));
}

/// The number of locks and markers.
qsizetype unlock_and_tell(const MenderContext& context)
{
    const auto removed = core::unlock_church(context.place);
    for (const auto& line : removed)
        context.out << "Removed: " << line << '\n';
    return removed.size();
}

QString mending_question(const MenderContext& context)
{
    const QString question = words::mending_question(context.place.church);
    return context.order.remove_locks
               ? question + u" Every lock and marker is removed first: nobody may be inside or at work on it."_s
               : question;
}

bool tell(const MenderContext& context, const core::Mending& mending)
{
    if (!mending.refusal.isEmpty())
        return refuse(context, mending.refusal);
    if (!mending.copy.isEmpty())
        context.out << "The database as it was before: " << mending.copy << "\n";
    if (!mending.mended.empty()) {
        context.out << "Mended:\n";
        print(context.out, mending.mended);
    }
    if (mending.left.empty()) {
        context.out << church_in_words(context.place) << " is sound.\n";
    } else {
        context.out << "Left:\n";
        print(context.out, mending.left);
    }
    return mending.left.empty();
}

bool mend(const MenderContext& context)
{
    if (!free_to_work(context))
        return refuse(context, words::running_here());
    if (!agreed(context, mending_question(context)))
        return refuse(context, words::nothing_changed());
    if (context.order.remove_locks)
        unlock_and_tell(context);
    return tell(context, core::mend_church(context.place, people::mender_checks()));
}

bool unlock(const MenderContext& context)
{
    if (!free_to_work(context))
        return refuse(context, words::running_here());
    if (!agreed(context, words::unlocking_question(context.place.church)))
        return refuse(context, words::nothing_changed());
    if (unlock_and_tell(context) == 0)
        context.out << church_in_words(context.place) << " was not locked.\n";
    return true;
}

/// How to go on with the new church file, where that may come in the place of the church's own.
void tell_way_into_place(const MenderContext& context, bool gives_way)
{
    const QFileInfo own(context.place.paths.database());
    const bool stands_there = own.exists() && own == QFileInfo(context.order.target);
    if (gives_way && !stands_there)
        context.out << words::after_recovering() << '\n';
}

bool recover(const MenderContext& context)
{
    const auto& order = context.order;
    const QString damaged = order.damaged.isEmpty() ? context.place.paths.database() : order.damaged;
    if (!agreed(context, words::recovering_question(damaged, order.target)))
        return refuse(context, u"Nothing was written."_s);
    const bool gives_way = core::gives_way(context.place, core::file_damaged(core::examine_church(context.place, {})));
    context.place.session.reset();
    const auto tables = core::recover_church(damaged, order.target);
    bool whole = true;
    for (const auto& table : tables) {
        whole = whole && words::came_whole(table);
        if (table.rows > 0 || !words::came_whole(table))
            context.out << table.table << ": " << words::came_of(table) << '\n';
    }
    context.out << words::where_recovered(damaged, order.target) << '\n';
    tell_way_into_place(context, gives_way);
    return whole;
}

bool set_aside(const MenderContext& context)
{
    if (!free_to_work(context))
        return refuse(context, words::running_here());
    if (!agreed(context, words::setting_aside_question(context.place.church)))
        return refuse(context, words::nothing_changed());
    context.out << words::where_set_aside(core::set_database_aside(context.place)) << '\n'
                << words::after_setting_aside() << '\n';
    return true;
}

bool put_in_place(const MenderContext& context)
{
    const QString& recovered = context.order.target;
    if (!free_to_work(context))
        return refuse(context, words::running_here());
    if (!agreed(context, words::placing_question(context.place.church, recovered)))
        return refuse(context, words::nothing_changed());
    const auto placement = core::put_in_place(context.place, recovered, people::mender_checks());
    for (const auto& line : words::where_put(placement, context.place.paths.database()))
        context.out << line << '\n';
    return tell(context, placement.mending);
}

struct Named
{
    const char16_t* word;
    MenderCommand command;
};
constexpr std::array commands{Named{u"check", check},         Named{u"mend", mend},
                              Named{u"unlock", unlock},       Named{u"recover", recover},
                              Named{u"set-aside", set_aside}, Named{u"put-in-place", put_in_place}};

} // namespace

MenderCommand mender_command(const QString& word)
{
    const auto found =
        std::ranges::find_if(commands, [&](const Named& named) { return QStringView(named.word) == word; });
    return found == commands.end() ? nullptr : found->command;
}

bool takes_file(MenderCommand command)
{
    return command == recover || command == put_in_place;
}

} // namespace kindrel::apps

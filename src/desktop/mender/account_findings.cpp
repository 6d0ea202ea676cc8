#include "desktop/mender/account_findings.h"

#include "desktop/mender/discreet.h"

#include <QRegularExpression>

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Cure;
using core::Findings;

namespace {

/// Findings with one cure, and what to do about them; in the order in which that is done.
struct CureGroup
{
    Cure cure;
    MenderAct act;
    const char16_t *heading, *explanation;
};
constexpr std::array cure_groups{
    CureGroup{
        Cure::recover, MenderAct::recover, u"The database itself is damaged",
        u"Where there is a backup, press 'Set damaged file aside', start Kindrel and put the backup back. Otherwise "
        u"press 'Recover what can be read', which writes a new church file, and then 'Put recovered file in place'."},
    CureGroup{Cure::unlock, MenderAct::unlock, u"Locks and markers that keep people out",
              u"Ask whether anybody is at work in the church. When nobody is, press 'Remove locks and markers'."},
    CureGroup{Cure::mend, MenderAct::mend, u"What mending puts right",
              u"Press 'Mend': it lays down a copy of the database as it is now, then does what stands here."},
    CureGroup{Cure::by_hand, MenderAct::none, u"What a person must decide",
              u"This is left as it is; what to do is said with each."},
};

constexpr std::array damaged_kinds{u"closed", u"damaged"};

bool has(const Findings& findings, Cure cure)
{
    return std::ranges::find(findings, cure, &core::Finding::cure) != findings.end();
}

/// The file cannot be mended in its place.
bool is_damaged(const Findings& findings)
{
    return std::ranges::any_of(findings, [](const core::Finding& finding) {
        return std::ranges::find(damaged_kinds, QStringView(finding.kind),
                                 [](const char16_t* kind) { return QStringView(kind); }) != damaged_kinds.end();
    });
}

void add_findings(Account& account, const Findings& findings)
{
    for (const auto& group : cure_groups) {
        Findings of_group;
        std::ranges::copy_if(findings, std::back_inserter(of_group),
                             [&](const core::Finding& finding) { return finding.cure == group.cure; });
        if (of_group.empty())
            continue;
        const QString heading = u"%1: %2"_s.arg(QStringView(group.heading), findings_in_words(of_group.size()));
        account.groups.push_back({heading, QString::fromUtf16(group.explanation), lines_of(of_group), group.act});
    }
}

MenderAct next_act(const Findings& findings)
{
    if (core::out_of_sight(findings))
        return MenderAct::check;
    if (is_damaged(findings))
        return MenderAct::recover;
    if (has(findings, Cure::unlock))
        return MenderAct::unlock;
    if (has(findings, Cure::mend))
        return MenderAct::mend;
    return has(findings, Cure::recover) ? MenderAct::recover : MenderAct::none;
}

} // namespace

QString findings_in_words(std::size_t count)
{
    return core::counted(static_cast<int>(count), u"finding"_s, u"findings"_s);
}

QString without_commands(QString remedy)
{
    static const QRegularExpression command(u" \\(kindrel-mender [a-z-]+\\)"_s);
    return remedy.remove(command);
}

AccountLine plain(const QString& sentence)
{
    return {.words = sentence, .in_report = sentence};
}

std::vector<AccountLine> lines_of(const Findings& findings)
{
    std::vector<AccountLine> lines;
    for (const auto& finding : findings)
        lines.push_back({finding.words, without_commands(finding.remedy), discreet(finding)});
    return lines;
}

void judge(Account& account, const Findings& findings)
{
    account.looked = true;
    account.mendable = has(findings, Cure::mend);
    account.damaged = core::file_damaged(findings);
    account.next = next_act(findings);
    const bool sound = findings.empty();
    account.state = sound ? State::contact : is_damaged(findings) ? State::error : State::altered;
    account.chip = sound ? u"Sound"_s : findings_in_words(findings.size());
    add_findings(account, findings);
}

} // namespace kindrel::desktop

#include "core/upgrade.h"

#include "core/schema_text.h"
#include "core/settings.h"
#include "core/verified_copy.h"

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const Upgrade* step_to(std::span<const Upgrade> chain, int version)
{
    const auto found = std::ranges::find(chain, version, &Upgrade::to);
    return found == chain.end() ? nullptr : &*found;
}

} // namespace

std::span<const Upgrade> upgrades()
{
    return upgrade_scripts();
}

bool leads(std::span<const Upgrade> chain, int from, int to)
{
    bool whole = from < to;
    for (int version = from + 1; whole && version <= to; ++version)
        whole = step_to(chain, version) != nullptr;
    return whole;
}

void upgrade_church(Session& session, const Paths& paths, std::span<const Upgrade> chain, int from, int to)
{
    Q_ASSERT(leads(chain, from, to));
    verified_copy(session, paths.file(Folder::church, u"KR10_records_version_%1.kdl"_s.arg(from)));
    Transaction transaction(session);
    for (int version = from + 1; version <= to; ++version)
        session.run_script(QString::fromUtf8(step_to(chain, version)->script));
    write_setting(session, u"Version"_s, to);
    transaction.commit();
}

} // namespace kindrel::core

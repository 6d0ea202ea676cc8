#include "mender_place.h"

#include "support/processes.h"

#include <QElapsedTimer>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class MenderKillTest : public MenderPlaceTest
{
protected:
    static void damage(Session& session)
    {
        Transaction transaction(session);
        for (const auto& statement :
             {u"DELETE FROM [tbl_address];"_s, u"UPDATE [tbl_people] SET [position]=1;"_s,
              u"DELETE FROM [tbl_id_person];"_s, u"UPDATE [tbl_group_setup] SET [position]=4;"_s})
            session.execute(statement);
        transaction.commit();
    }
};
KINDREL_ON_BOTH_ENGINES(MenderKillTest);

TEST_P(MenderKillTest, AKillWhileMendingLeavesAllOrNothingMended)
{
    damage(session());
    const auto damaged = told(examine());
    QElapsedTimer timer;
    timer.start();
    ASSERT_TRUE(mend_church(*place, {}).left.empty());
    const std::chrono::microseconds whole(timer.nsecsElapsed() / 1000);
    place->session.reset();
    const auto mend_for_ever = [&](const Ready& ready) {
        place->session = church->another();
        ready();
        while (true) {
            damage(*place->session);
            (void)mend_church(*place, {});
        }
    };
    constexpr int kills = 25;
    int left_damaged = 0;
    for (int kill = 0; kill < kills; ++kill) {
        run_and_kill(mend_for_ever, whole * 2 * kill / kills);
        QFile::remove(in_church(u"lock.dat"_s));
        place->session = church->another();
        auto found = examine();
        std::erase_if(found, [](const Finding& finding) { return finding.kind == u"leftovers"; });
        EXPECT_TRUE(found.empty() || told(found) == damaged) << told(found);
        left_damaged += found.empty() ? 0 : 1;
        for (const auto& copy : mended_files())
            EXPECT_TRUE(copy.endsWith(u".kdl") || copy.contains(u"unfinished")) << copy.toStdString();
        place->session.reset();
    }
    EXPECT_GT(left_damaged, 0);
}

} // namespace kindrel::test

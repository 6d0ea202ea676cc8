#include "copy_place.h"
#include "core/verified_copy.h"
#include "support/processes.h"

#include <QElapsedTimer>

#include <unistd.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;
using std::chrono::microseconds;

namespace {

constexpr int kills = 30;

} // namespace

class CopyKillTest : public CopyTest
{
protected:
    void make_older() const { place->open_target()->execute(u"UPDATE [tbl_surname] SET [surname]='older';"_s); }
    /// Copies for ever: into nothing, or over an older copy.
    void copy_for_ever(bool replace, const Ready& ready) const
    {
        StartedOffice started(place->paths());
        const auto prepare = [&] {
            if (replace)
                make_older();
            else
                place->remove_target();
        };
        prepare();
        ready();
        for (;; prepare())
            (void)copy_church(started.office, {.to = place->target(), .replace = replace}, started.silent);
    }
    [[nodiscard]] microseconds duration_of_copy()
    {
        auto& started = place->started();
        QElapsedTimer timer;
        timer.start();
        EXPECT_TRUE(copy_church(started.office, {.to = place->target()}, started.silent))
            << started.dialogue.told.join(u'\n').toStdString();
        return microseconds(timer.nsecsElapsed() / 1000);
    }
};
KINDREL_COPIED_FROM_BOTH_ENGINES(CopyKillTest);

TEST_P(CopyKillTest, AKillLeavesTheChurchWholeAndTheCopyWholeOrNotThere)
{
    const auto source = place->source_sums();
    const auto whole = duration_of_copy();
    ASSERT_EQ(place->target_sums(), source);
    make_older();
    const auto older = place->target_sums();
    int finished = 0;
    for (int kill = 0; kill < kills; ++kill) {
        const bool replace = kill % 2 == 1;
        if (replace && !place->target_present()) {
            place->leave();
            (void)duration_of_copy();
        }
        place->leave();
        run_and_kill([&](const Ready& ready) { copy_for_ever(replace, ready); }, whole * kill * 3 / (kills * 2));
        place->leave();
        QFile::remove(place->folder() + u"lock.dat"_s);

        EXPECT_EQ(place->source_sums(), source) << "kill " << kill;
        if (!place->target_present()) {
            EXPECT_FALSE(replace) << "kill " << kill;
            continue;
        }
        const auto found = place->target_sums();
        EXPECT_TRUE(found == source || (replace && found == older)) << "kill " << kill;
        finished += !replace && found == source ? 1 : 0;
        if (!place->target().file.isEmpty())
            check_church_file(place->target().file);
    }
    EXPECT_LT(finished, kills / 2) << "No kill came in the middle.";
    place->leave();
    place->remove_target();
    place->leave();
    (void)duration_of_copy();
    EXPECT_EQ(place->target_sums(), source) << "The next copy must not stumble over what is left.";
    EXPECT_TRUE(place->tidy());
}

TEST_P(CopyKillTest, AKillRightAfterTheEndLeavesTheNewCopy)
{
    const auto source = place->source_sums();
    for (const bool replace : {false, true}) {
        if (replace)
            make_older();
        place->leave();
        const auto copy_once = [&](const Ready& ready) {
            StartedOffice started(place->paths());
            if (!copy_church(started.office, {.to = place->target(), .replace = replace}, started.silent))
                throw std::runtime_error(started.dialogue.told.join(u'\n').toStdString());
            ready();
            pause();
        };
        run_and_kill(copy_once, microseconds(0));
        place->leave();

        EXPECT_EQ(place->target_sums(), source) << (replace ? "over an older copy" : "where nothing was");
        EXPECT_TRUE(place->tidy());
    }
}

} // namespace kindrel::test

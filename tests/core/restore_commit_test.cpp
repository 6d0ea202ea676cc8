#include "backup_place.h"

#include "core/restore_swap.h"

#include <dlfcn.h>
#include <sys/socket.h>

namespace {

/// What the server says to the next commit is lost.
bool cut_commit = false; // NOLINT: set by one test.
/// From that commit on the server is out of reach.
bool cut_for_good = false; // NOLINT: set by one test.
bool out_of_reach = false; // NOLINT

} // namespace

/// Both stand in front of the system's own.
extern "C" int connect(int socket, const sockaddr* address, socklen_t size)
{
    if (out_of_reach) {
        errno = ECONNREFUSED;
        return -1;
    }
    static const auto own = reinterpret_cast<int (*)(int, const sockaddr*, socklen_t)>(dlsym(RTLD_NEXT, "connect"));
    return own(socket, address, size);
}

extern "C" ssize_t send(int socket, const void* bytes, size_t size, int flags)
{
    if (cut_commit &&
        QByteArrayView(static_cast<const char*>(bytes), static_cast<qsizetype>(size)).contains("COMMIT")) {
        cut_commit = false;
        out_of_reach = cut_for_good;
        shutdown(socket, SHUT_RD);
    }
    static const auto own = reinterpret_cast<ssize_t (*)(int, const void*, size_t, int)>(dlsym(RTLD_NEXT, "send"));
    return own(socket, bytes, size, flags);
}

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

/// Once nothing can be stopped any more, the connection breaks at the commit.
class CuttingProgress : public SilentProgress
{
public:
    bool step(const QString& what) override
    {
        cut_commit = !what.isEmpty();
        return true;
    }
};

class RestoreCommitTest : public testing::Test
{
protected:
    void SetUp() override
    {
        if (!TestChurch::available(EngineKind::postgres))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
        place.emplace(EngineKind::postgres);
        old_state = place->state();
        backup = place->back_up();
        place->write_church(u"second"_s);
    }
    void expect_the_backup()
    {
        EXPECT_EQ(place->state(), old_state);
        EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
    }

    std::optional<BackupPlace> place;
    decltype(place->state()) old_state;
    QString backup;
    CuttingProgress progress;
};

} // namespace

TEST_F(RestoreCommitTest, ARestoreThatWasStoredIsDoneThoughTheServersAnswerIsLost)
{
    const auto report = restore_backup(place->office(), {.file = backup}, progress);

    EXPECT_FALSE(cut_commit) << "The connection was not cut.";
    EXPECT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    expect_the_backup();
}

TEST_F(RestoreCommitTest, WhereTheServerIsGoneAtTheCommitTheNextStartSettlesTheRestore)
{
    cut_for_good = true;
    try {
        (void)restore_backup(place->office(), {.file = backup}, progress);
        ADD_FAILURE() << "It was told how the restore ended: " << place->dialogue().told.join(u'\n').toStdString();
    } catch (const RestoreUnsettled& unsettled) {
        EXPECT_EQ(unsettled.text(),
                  u"It cannot be told yet whether the backup is in place. Start Kindrel again: it settles it."_s);
    }
    EXPECT_TRUE(out_of_reach) << "The connection was not cut.";
    cut_for_good = out_of_reach = false;

    EXPECT_TRUE(settle_interrupted_restore(place->office().paths, *place->office().session));
    expect_the_backup();
}

} // namespace kindrel::test

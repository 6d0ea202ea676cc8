#include "backup_place.h"

#include <dlfcn.h>
#include <sys/socket.h>

namespace {

/// What the server says to the next commit is lost.
bool cut_commit = false; // NOLINT: set by one test.

} // namespace

/// Stands in front of the system's own.
extern "C" ssize_t send(int socket, const void* bytes, size_t size, int flags)
{
    if (cut_commit &&
        QByteArrayView(static_cast<const char*>(bytes), static_cast<qsizetype>(size)).contains("COMMIT")) {
        cut_commit = false;
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

} // namespace

TEST(RestoreCommitTest, ARestoreThatWasStoredIsDoneThoughTheServersAnswerIsLost)
{
    if (!TestChurch::available(EngineKind::postgres))
        GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
    BackupPlace place(EngineKind::postgres);
    const auto old_state = place.state();
    const QString backup = place.back_up();
    place.write_church(u"second"_s);
    CuttingProgress progress;

    const auto report = restore_backup(place.office(), {.file = backup}, progress);

    EXPECT_FALSE(cut_commit) << "The connection was not cut.";
    EXPECT_TRUE(report) << place.dialogue().told.join(u'\n').toStdString();
    EXPECT_EQ(place.state(), old_state);
    EXPECT_TRUE(place.leftovers().isEmpty()) << place.leftovers().join(u' ').toStdString();
}

} // namespace kindrel::test

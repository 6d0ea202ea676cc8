#include "backup_place.h"

#include "core/side_files.h"

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

constexpr int rounds = 150;

/// Any content of the right length, or of any length.
QByteArray nonsense(qsizetype length, std::mt19937& chance)
{
    if (chance() % 2 == 0)
        length = static_cast<qsizetype>(chance() % 900);
    QByteArray bytes(length, Qt::Uninitialized);
    std::ranges::generate(bytes, [&] { return static_cast<char>(chance()); });
    return bytes;
}

} // namespace

/// Whatever the side files hold, the program starts, or says why it does not; it writes no nonsense back.
TEST(SideFileFuzzTest, NoContentOfTheSideFilesBringsStartUpDown)
{
    TestStart start;
    ASSERT_TRUE(start.start());
    const SideFile* files[]{&side_files::church_names, &side_files::sounds,     &side_files::common,
                            &side_files::labels,       &side_files::backup,     &side_files::viewer,
                            &side_files::email_delay,  &side_files::tracking,   &side_files::workstation_logo,
                            &side_files::map_land,     &side_files::map_layers, &side_files::map_specification};
    std::mt19937 chance(20261123);
    int started = 0;
    int damaged = 0;
    for (int round = 0; round < rounds; ++round) {
        const SideFile& file = *files[chance() % std::size(files)];
        const QString path = start.data.paths().file(file.folder, QString::fromLatin1(file.name));
        const auto before = QFile::exists(path) ? std::optional(DataFolder::read(path)) : std::nullopt;
        const auto content = nonsense(SideRecord(file).bytes().size(), chance);
        DataFolder::write(path, content);
        YesDialogue dialogue;
        const auto office = start_up({Purpose::command_line, 1, start.data.drive()}, start.workstation, dialogue,
                                     start.clock, start.progress);
        started += office ? 1 : 0;
        EXPECT_TRUE(office || !dialogue.told.isEmpty()) << file.name;
        if (content.size() != SideRecord(file).bytes().size()) {
            ++damaged;
            EXPECT_EQ(DataFolder::read(path), content) << file.name << ": kept for the Mender.";
        }
        if (before)
            DataFolder::write(path, *before);
        else
            QFile::remove(path);
    }
    EXPECT_GT(started, rounds / 2);
    EXPECT_GT(damaged, 0);
}

} // namespace kindrel::test

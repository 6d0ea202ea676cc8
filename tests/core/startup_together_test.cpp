#include "backup_place.h"

#include "core/side_files.h"
#include "core/verified_copy.h"
#include "support/processes.h"

#include <deque>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

constexpr int workstations = 4;
constexpr int starts = 5;

} // namespace

/// Workstations with drives of their own that share the data on a network drive.
class StartupTogetherTest : public testing::Test
{
protected:
    void SetUp() override
    {
        network = drives.emplace_back().make_network();
        for (int number = 1; number < workstations; ++number)
            drives.emplace_back();
        for (const auto& drive : drives) {
            SideRecord record(side_files::network);
            record.set_flag("network", true);
            record.set_text("path", network);
            write_side_file(drive.paths(), record);
        }
        ASSERT_TRUE(started(0)) << dialogue.told.join(u'\n').toStdString();
    }
    /// Compaction comes after so many starts; 0: never.
    void compact_after(int count)
    {
        SideRecord common(side_files::common);
        common.set_number("starts_between_compactions", count);
        write_side_file(network_paths(), common);
    }
    [[nodiscard]] Paths network_paths() const
    {
        return {drives.front().program(), drives.front().drive(), network, Mode::network, 1};
    }
    [[nodiscard]] std::unique_ptr<Office> started(std::size_t drive)
    {
        workstation.program = drives[drive].program();
        workstation.drive = drives[drive].drive();
        workstation.machine = u"office-%1"_s.arg(drive);
        dialogue.told.clear();
        return start_up({Purpose::desktop, 1, {}}, workstation, dialogue, clock, progress);
    }
    /// A letter for each start: "s" where it came in and stored a family, "k" where it was kept out and told why.
    [[nodiscard]] QByteArray work(std::size_t drive)
    {
        QByteArray deeds;
        for (int start = 0; start < starts; ++start) {
            const auto office = started(drive);
            if (!office && dialogue.told.isEmpty())
                throw std::runtime_error("Kept out without a word.");
            deeds += office ? 's' : 'k';
            if (office)
                office->session->execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (?,'Holm');"_s,
                                         office->session->allocate(Entity::surname, 1));
        }
        return deeds;
    }

    std::deque<DataFolder> drives;
    QString network;
    FakeWorkstation workstation;
    YesDialogue dialogue;
    SystemClock clock; ///< Who waits for a turn waits in truth.
    SilentProgress progress;
};

TEST_F(StartupTogetherTest, NoStartIsForgottenAndNobodysWorkIsLostWhileOthersCompact)
{
    for (const int interval : {0, 3}) {
        compact_after(interval);
        auto before = started(0);
        const int counted = read_settings(*before->session).compact_count;
        const auto families = number_of(*before->session, u"SELECT COUNT(*) FROM [tbl_surname];"_s);
        before.reset();

        std::vector<std::function<QByteArray()>> works;
        for (std::size_t drive = 0; drive < drives.size(); ++drive)
            works.emplace_back([this, drive] { return work(drive); });
        qint64 entered = 0;
        for (const auto& deeds : run_together(works))
            entered += deeds.count('s');

        const auto after = connect_church(network_paths());
        EXPECT_EQ(number_of(*after, u"SELECT COUNT(*) FROM [tbl_surname];"_s), families + entered);
        EXPECT_GE(entered, starts);
        if (interval == 0) {
            EXPECT_EQ(read_settings(*after).compact_count, counted + entered);
        }
        check_church_file(network_paths().database());
        EXPECT_FALSE(QFile::exists(network + u"church1/lock.dat"_s));
        EXPECT_FALSE(QFile::exists(network + u"church1/security.dat"_s));
    }
}

} // namespace kindrel::test

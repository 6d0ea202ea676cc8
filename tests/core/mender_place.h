#pragma once

#include "core/mender.h"
#include "support/data_folder.h"
#include "support/test_church.h"

#include <QDir>

namespace kindrel::test {

/// A church with a little of everything, as the mender finds it.
class MenderPlaceTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        paths.emplace(drive, drive, drive + QStringLiteral("Kindrel_10_Data/"), core::Mode::normal, 1);
        core::make_folder(paths->folder(core::Folder::church));
        core::make_folder(paths->folder(core::Folder::global));
        fill();
        place.emplace(core::MenderPlace{
            .paths = *paths, .workstation = workstation, .clock = clock, .session = church->another()});
    }
    void run(const QStringList& statements)
    {
        for (const auto& statement : statements)
            session().execute(statement);
    }
    [[nodiscard]] core::Findings examine() { return core::examine_church(*place, {}); }
    [[nodiscard]] QString in_church(const QString& name) const { return paths->folder(core::Folder::church) + name; }
    [[nodiscard]] QStringList mended_files() const
    {
        return QDir(in_church(QStringLiteral("mended"))).entryList(QDir::Files);
    }
    /// One line for each finding, for the message of a failed test.
    [[nodiscard]] static std::string told(const core::Findings& findings)
    {
        QStringList lines;
        for (const auto& finding : findings)
            lines += finding.kind + QStringLiteral(": ") + finding.words;
        return lines.join(u'\n').toStdString();
    }

    QTemporaryDir folder;
    QString drive = folder.path() + u'/';
    FakeWorkstation workstation;
    FixedClock clock;
    std::optional<core::Paths> paths;
    std::optional<core::MenderPlace> place;

private:
    /// Family 1 with Ann and Bob, family 2 with Cid; a gift of person 900, who is long gone.
    void fill()
    {
        run({
            QStringLiteral("INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (1,'Able'),(2,'Baker');"),
            QStringLiteral("INSERT INTO [tbl_address] ([surname_id]) VALUES (1),(2);"),
            QStringLiteral("INSERT INTO [tbl_people] ([person_id],[Surname_ID],[Name],[position]) "
                           "VALUES (10,1,'Ann',1),(11,1,'Bob',2),(20,2,'Cid',1);"),
            QStringLiteral("INSERT INTO [tbl_personal_details] ([person_id]) VALUES (10),(11),(20);"),
            QStringLiteral("INSERT INTO [tbl_group_setup] ([group_id],[group],[position]) "
                           "VALUES (5,'Choir',1),(6,'Youth',2);"),
            QStringLiteral("INSERT INTO [tbl_group] ([person_id],[group_id]) VALUES (10,5),(11,5),(20,6);"),
            QStringLiteral("INSERT INTO [tbl_roll_project] ([roll_project_id],[roll_project],[position]) "
                           "VALUES (3,'Morning',1);"),
            QStringLiteral("INSERT INTO [tbl_roll_setup] ([roll_project_id]) VALUES (3);"),
            QStringLiteral("INSERT INTO [tbl_roll_date] ([roll_date_id],[roll_date],[roll_project_id]) "
                           "VALUES (7,'2024-05-12',3);"),
            QStringLiteral("INSERT INTO [tbl_roll_attendance] ([roll_date_id],[person_id],[Attendance]) "
                           "VALUES (7,10,192);"),
            QStringLiteral("INSERT INTO [tbl_finance_project] ([finance_project_id],[finance_project],[position]) "
                           "VALUES (4,'Giving',1);"),
            QStringLiteral("INSERT INTO [tbl_finance_date] ([finance_date_id],[finance_date],[finance_project_id]) "
                           "VALUES (8,'2024-05-12',4);"),
            QStringLiteral("INSERT INTO [tbl_finance_data] ([finance_date_id],[person_id],[Data]) "
                           "VALUES (8,900,50000);"),
        });
        for (const auto& [counter, key] : {std::pair{u"surname", 2},
                                           {u"person", 900},
                                           {u"group", 6},
                                           {u"roll_project", 3},
                                           {u"roll_date", 7},
                                           {u"finance_project", 4},
                                           {u"finance_date", 8}})
            session().execute(QStringLiteral("INSERT INTO [tbl_id_%1] ([id_found]) VALUES (?);").arg(counter), key);
    }
};

} // namespace kindrel::test

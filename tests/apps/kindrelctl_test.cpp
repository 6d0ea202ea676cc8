#include "apps/kindrelctl_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

TEST_F(KindrelctlTest, AMadeChurchIsCountedListedAndShown)
{
    make_church(30);

    const auto totals = list({u"totals"_s});
    EXPECT_EQ(totals.first()[u"total"_s].toString(), u"Family File Total ="_s);
    EXPECT_EQ(totals.first()[u"count"_s].toInt(), 30);

    const auto families = list({u"families"_s});
    ASSERT_EQ(families.size(), 30);
    const auto first = families.first().toObject();
    const auto shown = run({u"family"_s, QString::number(first[u"surname_id"_s].toInt())});
    EXPECT_EQ(shown.status, 0) << shown;
    EXPECT_TRUE(shown.out.contains(first[u"surname"_s].toString().toUtf8())) << shown;
}

TEST_F(KindrelctlTest, EachFamilyListHoldsTheFamiliesOfItsStatus)
{
    make_church(60);
    const std::vector<std::pair<QString, QSet<QString>>> lists{
        {u"active"_s, {u"active"_s}},
        {u"privacy"_s, {u"privacy"_s}},
        {u"active-privacy"_s, {u"active"_s, u"privacy"_s}},
        {u"prospect"_s, {u"prospect"_s}},
        {u"archive"_s, {u"archive"_s}},
    };
    for (const auto& [status, expected] : lists) {
        QSet<QString> found;
        for (const auto& family : list({u"families"_s, u"--status"_s, status}))
            found += family[u"condition"_s].toString();
        EXPECT_EQ(found, expected) << status.toStdString();
    }
    const auto all = list({u"families"_s});
    const auto booked = list({u"families"_s, u"--status"_s, u"booked-out"_s});
    EXPECT_EQ(booked.size(), std::ranges::count_if(all, [](auto family) { return family[u"booked_out"_s].toBool(); }));
}

TEST_F(KindrelctlTest, WhatIsUnlistedIsNotShown)
{
    make_church(60);
    const std::vector<std::pair<QString, QString>> twins{{u"phone_hidden"_s, u"phone"_s},
                                                         {u"res_hidden"_s, u"res_street"_s},
                                                         {u"mobile_hidden"_s, u"mobile_phone"_s},
                                                         {u"birthdate_hidden"_s, u"birthdate"_s}};
    QSet<QString> met;
    for (const auto& entry : list({u"families"_s})) {
        const auto shown = run({u"family"_s, QString::number(entry[u"surname_id"_s].toInt()), u"--json"_s});
        const auto family = QJsonDocument::fromJson(shown.out).object();
        auto records = family[u"people"_s].toArray();
        records.append(family[u"address"_s]);
        for (const auto& record : records) {
            for (const auto& [hidden, value] : twins) {
                if (!record[hidden].toBool())
                    continue;
                met += hidden;
                EXPECT_TRUE(record[value].isNull() || record[value].toString().isEmpty()) << shown;
            }
        }
    }
    EXPECT_EQ(met.size(), qsizetype(twins.size())) << "the church made for the test hides too little";
}

TEST_F(KindrelctlTest, AFullChurchIsNotFilledAgain)
{
    make_church(5);

    const auto again = run({u"make-church"_s, u"--families"_s, u"5"_s});

    EXPECT_EQ(again.status, 1) << again;
    EXPECT_TRUE(again.err.contains("holds 5 families already")) << again;
    EXPECT_EQ(list({u"families"_s}).size(), 5);
}

TEST_F(KindrelctlTest, ChurchesAreApart)
{
    make_church(5);

    ASSERT_EQ(run({u"--church"_s, u"2"_s, u"make-church"_s, u"--families"_s, u"3"_s}).status, 0);

    EXPECT_EQ(list({u"families"_s}).size(), 5);
    EXPECT_EQ(list({u"families"_s, u"--church"_s, u"2"_s}).size(), 3);
}

TEST_F(KindrelctlTest, TheReportOfTheActiveFamiliesIsWrittenAsAPdf)
{
    make_church(20);

    for (const auto& name : {u"k10"_s, u"Directory 1"_s}) {
        const auto written = run({u"report"_s, name, u"--pdf"_s, pdf(), u"--paper"_s, u"letter"_s});
        EXPECT_EQ(written.status, 0) << written;
        EXPECT_TRUE(content(pdf()).startsWith("%PDF-"));
        ASSERT_TRUE(QFile::remove(pdf()));
    }
}

TEST_F(KindrelctlTest, EachReportOfWeeklyStatisticsIsWrittenOverThePeriodThatItTakes)
{
    make_church(3);
    const auto year = QDate::currentDate().year();
    const auto last = QString::number(year - 1), now = QString::number(year);
    const std::vector<QStringList> cases{
        {u"Weekly Totals"_s, u"--year"_s, last, u"--category"_s, u"Offering envelopes"_s},
        {u"weekly_total_report_landscape"_s, u"--financial-year"_s, last, u"--category"_s, u"OFFERING ENVELOPES"_s},
        {u"weekly_analysis_report"_s, u"--from"_s, u"01/01/"_s + last, u"--to"_s, u"31/12/"_s + now, u"--category"_s,
         u"Offering envelopes"_s},
        {u"Monthly Totals"_s, u"--project"_s, u"Sunday Figures"_s, u"--year"_s, last, u"--paper"_s, u"letter"_s},
        {u"Yearly Comparison"_s, u"--from"_s, last, u"--to"_s, now, u"--chart"_s, u"2D Line"_s},
    };
    for (const auto& words : cases) {
        const auto written = run(QStringList{u"weekly-report"_s, u"--pdf"_s, pdf()} + words);
        EXPECT_EQ(written.status, 0) << words.join(u' ').toStdString() << "\n" << written;
        EXPECT_TRUE(content(pdf()).startsWith("%PDF-"));
        QFile::remove(pdf());
    }
}

TEST_F(KindrelctlTest, AReportThatCannotBeWrittenLeavesTheOldFile)
{
    make_church(3);
    QFile old(pdf());
    ASSERT_TRUE(old.open(QFile::WriteOnly) && old.write("the old report") > 0);
    old.close();
    const auto files_before = QDir(drive.path()).entryList(QDir::Files | QDir::Hidden);

    const auto ended = run({u"report"_s, u"k10"_s, u"--pdf"_s, pdf()}, refuse_large_files);

    EXPECT_EQ(ended.status, 1) << ended;
    EXPECT_TRUE(ended.err.contains("report.pdf could not be written")) << ended;
    EXPECT_EQ(content(pdf()), "the old report");
    EXPECT_EQ(QDir(drive.path()).entryList(QDir::Files | QDir::Hidden), files_before);
}

TEST_F(KindrelctlTest, AReportIntoAFolderThatIsNotThereIsRefused)
{
    make_church(3);

    const auto ended = run({u"report"_s, u"k10"_s, u"--pdf"_s, drive.filePath(u"nowhere/report.pdf"_s)});

    EXPECT_EQ(ended.status, 1) << ended;
    EXPECT_TRUE(ended.err.contains("nowhere/report.pdf could not be written")) << ended;
}

TEST_F(KindrelctlTest, WhatCannotBeFoundIsRefusedWithAMessageOnStandardError)
{
    make_church(3);
    const std::vector<std::pair<QStringList, QByteArray>> cases{
        {{u"family"_s, u"4711"_s}, "There is no family with the key 4711."},
        {{u"report"_s, u"k9999"_s, u"--pdf"_s, pdf()}, "There is no report \"k9999\""},
        {{u"weekly-report"_s, u"Hourly Totals"_s, u"--pdf"_s, pdf()}, "weekly_table_report (Monthly Totals)"},
        {{u"weekly-report"_s, u"Monthly Totals"_s, u"--pdf"_s, pdf()}, "Please enter an analysis year"},
        {{u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--project"_s, u"Fliers"_s},
         "There is no weekly project \"Fliers\"."},
        {{u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--project"_s, u"Fliers"_s, u"--category"_s,
          u"Offering envelopes"_s},
         "There is no weekly project \"Fliers\"."},
        {{u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--from"_s, u"05/03"_s},
         "Please enter the year too."},
        {{u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--from"_s, u"31/02/2024"_s},
         "Incorrect format."},
        {{u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--category"_s, u"Fliers"_s},
         "The project has no category \"Fliers\"."},
        {{u"weekly-report"_s, u"Monthly Totals"_s, u"--pdf"_s, pdf(), u"--chart"_s, u"4D Bar"_s},
         "There is no chart style \"4D Bar\"."},
        {{u"people"_s, u"--group"_s, u"Fliers"_s}, "There is no group \"Fliers\"."},
        {{u"people"_s, u"--sort"_s, u"height"_s}, "There is no order and no date \"height\"."},
    };
    for (const auto& [words, message] : cases) {
        const auto ended = run(words);
        EXPECT_EQ(ended.status, 1) << ended;
        EXPECT_TRUE(ended.err.contains(message)) << ended;
        EXPECT_TRUE(ended.out.isEmpty()) << ended;
    }
    EXPECT_FALSE(QFile::exists(pdf()));
}

TEST_F(KindrelctlTest, AChurchWithSecurityShowsNothingWithoutItsPassword)
{
    make_church(2);
    switch_security_on();

    for (const auto& words : {QStringList{u"totals"_s}, {u"families"_s}, {u"report"_s, u"k10"_s, u"--pdf"_s, pdf()}}) {
        const auto ended = run(words);
        EXPECT_EQ(ended.status, 1) << ended;
        EXPECT_TRUE(ended.err.contains("This church asks for a password")) << ended;
        EXPECT_TRUE(ended.out.isEmpty()) << ended;
    }
}

TEST_F(KindrelctlTest, APasswordOpensItsOwnAreasAlone)
{
    make_church(2);
    switch_security_on();
    const auto file = password_file("finder");

    const auto totals = run({u"totals"_s, u"--password-file"_s, file});
    EXPECT_EQ(totals.status, 0) << totals;
    for (const QByteArray typed : {"finder\n", "finder\r\n", "finder"}) {
        const auto given = run({u"totals"_s}, nullptr, typed);
        EXPECT_EQ(given.status, 0) << given;
    }
    const auto report = run({u"report"_s, u"k10"_s, u"--pdf"_s, pdf(), u"--password-file"_s, file});
    EXPECT_EQ(report.status, 1) << report;
    EXPECT_TRUE(report.err.contains("\"Report Outputs\"")) << report;
    EXPECT_FALSE(QFile::exists(pdf()));
}

TEST_F(KindrelctlTest, EveryCommandOnAChurchAsksForItsRight)
{
    make_church(2);
    switch_security_on();
    const auto file = password_file("keeper");
    const std::vector<std::pair<QStringList, QByteArray>> cases{
        {{u"make-church"_s, u"--families"_s, u"1"_s}, "\"Add Family\""},
        {{u"totals"_s}, "\"Search for Family\""},
        {{u"families"_s}, "\"Search for Family\""},
        {{u"family"_s, u"1"_s}, "\"Search for Family\""},
        {{u"people"_s}, "\"Export\""},
        {{u"reports"_s}, "\"Report Outputs\""},
        {{u"report"_s, u"k10"_s, u"--pdf"_s, pdf()}, "\"Report Outputs\""},
        {{u"weekly-report"_s, u"Monthly Totals"_s, u"--pdf"_s, pdf()}, "\"Weekly Statistics\""},
        {{u"backup"_s, u"--to"_s, drive.path()}, "\"Backup Data\""},
        {{u"backups"_s}, "\"Backup Data\""},
        {{u"show-backup"_s, u"backup.zip"_s}, "\"Restore Data\""},
        {{u"restore"_s, u"backup.zip"_s, u"--yes"_s}, "\"Restore Data\""},
        {{u"copy-church"_s, u"--to"_s, drive.filePath(u"copy.kdl"_s)}, "\"Backup Data\""},
    };
    QStringList asked{u"install"_s}; // It opens no church.
    for (const auto& [words, area] : cases) {
        const auto ended = run(words + QStringList{u"--password-file"_s, file});
        EXPECT_EQ(ended.status, 1) << ended;
        EXPECT_TRUE(ended.err.contains("Your password does not give access to " + area)) << ended;
        EXPECT_TRUE(ended.out.isEmpty()) << ended;
        asked += words.first();
    }
    const auto all = commands();
    EXPECT_EQ(QSet<QString>(asked.begin(), asked.end()), QSet<QString>(all.begin(), all.end()));
    EXPECT_FALSE(QFile::exists(pdf()));
}

TEST_F(KindrelctlTest, WithoutADataFolderEveryCommandThatNeedsOneIsRefused)
{
    for (const auto& word : {u"totals"_s, u"families"_s}) {
        const auto ended = run({word});
        EXPECT_EQ(ended.status, 1) << ended;
        EXPECT_TRUE(ended.err.contains("unable to establish connection to its data folder")) << ended;
    }
}

TEST_F(KindrelctlTest, WrongUsageIsToldApartFromRefusal)
{
    make_church(1);
    const std::vector<QStringList> cases{
        {},
        {u"fly"_s},
        {u"--fly"_s},
        {u"totals"_s, u"extra"_s},
        {u"totals"_s, u"--pdf"_s, u"x"_s},
        {u"family"_s},
        {u"family"_s, u"Naismith"_s},
        {u"families"_s, u"--status"_s, u"sleeping"_s},
        {u"--church"_s, u"10"_s, u"totals"_s},
        {u"totals"_s, u"--church"_s, u"one"_s},
        {u"make-church"_s},
        {u"make-church"_s, u"--families"_s, u"0"_s},
        {u"report"_s, u"k10"_s},
        {u"report"_s, u"k10"_s, u"--pdf"_s, pdf(), u"--paper"_s, u"a5"_s},
        {u"weekly-report"_s, u"Monthly Totals"_s},
        {u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--year"_s, u"2025"_s, u"--from"_s,
         u"01/01/2020"_s, u"--to"_s, u"31/12/2020"_s},
        {u"weekly-report"_s, u"Monthly Totals"_s, u"--pdf"_s, pdf(), u"--year"_s, u"2024"_s, u"--financial-year"_s,
         u"2023"_s},
        {u"weekly-report"_s, u"Monthly Totals"_s, u"--pdf"_s, pdf(), u"--from"_s, u"2023"_s},
        {u"weekly-report"_s, u"Yearly Totals"_s, u"--pdf"_s, pdf(), u"--year"_s, u"2023"_s},
        {u"weekly-report"_s, u"Weekly Totals"_s, u"--pdf"_s, pdf(), u"--chart"_s, u"2D Bar"_s},
        {u"people"_s, u"--list"_s, u"Sleeping Families"_s},
        {u"people"_s, u"--people"_s, u"active,asleep"_s},
        {u"people"_s, u"--age"_s, u"old"_s},
        {u"people"_s, u"--born"_s, u"31/2-1/3"_s},
        {u"people"_s, u"--surname"_s, u"A-B-C"_s},
        {u"people"_s, u"--fields"_s, u"name,shoe"_s},
        {u"people"_s, u"--format"_s, u"xml"_s},
        {u"backup"_s, u"--encrypt"_s},
        {u"backup"_s, u"--backup-password-file"_s, pdf()},
        {u"backup"_s, u"--without"_s, u"pictures,people"_s},
        {u"backup"_s, u"--to="_s},
        {u"restore"_s},
    };
    for (const auto& words : cases) {
        const auto ended = run(words);
        EXPECT_EQ(ended.status, 2) << words.join(u' ').toStdString() << "\n" << ended;
        EXPECT_TRUE(ended.err.contains("--help")) << ended;
        EXPECT_TRUE(ended.out.isEmpty()) << ended;
    }
}

TEST_F(KindrelctlTest, TheHelpNamesEveryCommandAndEachExplainsItself)
{
    const auto words = commands();
    EXPECT_GE(words.size(), 7);
    for (const auto& word : words) {
        const auto own = run({word, u"--help"_s});
        EXPECT_EQ(own.status, 0) << own;
        EXPECT_TRUE(own.out.startsWith("Usage: kindrelctl [OPTIONS] " + word.toUtf8())) << own;
    }
}

TEST_F(KindrelctlTest, TheMakerOfDataTellsItsUsageAndMakesNothing)
{
    for (const auto& [words, status] : {std::pair{QStringList{u"--help"_s}, 0}, {{}, 2}, {{u"--fly"_s}, 1}}) {
        QProcess program;
        program.setWorkingDirectory(drive.path());
        program.start(qEnvironmentVariable("KINDREL_BIN") + u"/kindrel-make-data"_s, words);
        ASSERT_TRUE(program.waitForFinished());
        EXPECT_EQ(program.exitCode(), status) << program.readAllStandardError().toStdString();
        EXPECT_TRUE(QDir(drive.path()).isEmpty());
    }
}

TEST_F(KindrelctlTest, AResultThatCannotBeWrittenIsAFailure)
{
    QProcess program;
    program.setStandardOutputFile(u"/dev/full"_s);
    program.start(qEnvironmentVariable("KINDREL_BIN") + u"/kindrelctl"_s, {u"--help"_s});
    ASSERT_TRUE(program.waitForFinished());

    EXPECT_EQ(program.exitCode(), 1);
}

} // namespace kindrel::test

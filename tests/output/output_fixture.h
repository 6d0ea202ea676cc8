#pragma once

#include "output/catalogue.h"
#include "support/data_folder.h"
#include "support/families.h"
#include "support/test_church.h"

namespace kindrel::test {

/// Cancels at the given step, or never; remembers what it was begun with.
class ScriptedProgress : public core::Progress
{
public:
    int cancel_at = 0; ///< Counted from 1; 0 is never.
    int taken = 0;
    int ends = 0;
    QString question;

    void begin(const QString&, int, const QString& cancel_question) override { question = cancel_question; }
    [[nodiscard]] bool step(const QString&) override { return ++taken != cancel_at; }
    void end() override { ++ends; }
};

/// An office with a church of its own, without start-up, whose reports are read back.
class ReportTest : public testing::Test
{
protected:
    ReportTest();

    /// Stores the families and puts all their people on the working list.
    void add(const std::vector<people::FamilyFile>& families);
    /// Runs the report, which is Directory 1, over the working list.
    [[nodiscard]] bool run(pages::PageSpool& spool, pages::Paper paper = pages::Paper::a4);
    /// The texts of each page of the report: header and footer, then the entries. Texts that follow each other closely
    /// on a line are one.
    [[nodiscard]] std::vector<QStringList> pages();
    /// The texts of all its pages.
    [[nodiscard]] QStringList texts();
    /// What a reader of the PDF finds in it, in one text with single blanks.
    [[nodiscard]] QString pdf_text(pages::Paper paper = pages::Paper::a4);
    [[nodiscard]] QString pdf_file() const { return church.folder() + QStringLiteral("/report.pdf"); }

    TestChurch church{core::EngineKind::sqlite};
    FakeWorkstation workstation;
    ScriptedDialogue dialogue;
    FixedClock clock;
    core::Office office;
    people::WorkingList list;
    output::RunOptions options;
    ScriptedProgress progress;
    output::ReportDefinition report = *output::find_report(u"k10");
};

/// Every value of the family that a hidden switch covers, as full_family() fills it.
[[nodiscard]] QStringList hidden_words(const people::FamilyFile& family);

/// What a program of the PDF tools prints.
[[nodiscard]] QString output_of(const QString& program, const QStringList& arguments);

} // namespace kindrel::test

#pragma once

#include "core/backup.h"
#include "desktop/desktop_fixture.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QTableWidget>

namespace kindrel::test {

/// Gives up at its first step.
class GivingUp : public core::Progress
{
public:
    void begin(const QString&, int, const QString&) override {}
    bool step(const QString&) override { return false; }
    void end() override {}
};

/// The screens of backup and restore in a church of two families and three people.
class BackupScreenTest : public DesktopTest
{
protected:
    void SetUp() override
    {
        begin({family(QStringLiteral("Naismith"), {QStringLiteral("Ann"), QStringLiteral("Ben")}),
               family(QStringLiteral("Nash"), {QStringLiteral("Carl")})});
    }
    /// Starts the program again with a progress of its own.
    void begin_with(core::Progress& progress)
    {
        running.reset();
        running = std::make_unique<desktop::Running>(desktop::Surroundings{.workstation = place.workstation,
                                                                           .dialogue = place.dialogue,
                                                                           .clock = place.clock,
                                                                           .progress = progress,
                                                                           .printing = printing,
                                                                           .look = look,
                                                                           .data_drive = {}});
        ASSERT_TRUE(running->start(1));
    }
    void open(const QString& area)
    {
        running->open_area(area);
        settle();
    }
    [[nodiscard]] desktop::Page& page() { return *window().page(); }
    void push(const QString& name)
    {
        tab_to(name);
        press(window(), Qt::Key_Space);
    }
    void write(const QString& field, const QString& text)
    {
        tab_to(field);
        press(window(), Qt::Key_A, Qt::ControlModifier);
        type(window(), text);
    }
    /// The words of one column of a list.
    [[nodiscard]] QStringList column(const QString& list, int number)
    {
        QStringList words;
        const auto& table = child<QTableWidget>(page(), list);
        for (int row = 0; row < table.rowCount(); ++row)
            words += table.item(row, number)->text();
        return words;
    }
    [[nodiscard]] QStringList texts() { return visible_texts(page()); }
    /// Made by the engine alone.
    [[nodiscard]] QString back_up(const core::BackupRequest& request = {})
    {
        const auto report = core::make_backup(desk().office, request, place.progress);
        if (!report)
            throw std::runtime_error("The backup is not made");
        return report->contents.file;
    }
    [[nodiscard]] qint64 families() { return core::present_state(desk().office).rows[QStringLiteral("tbl_surname")]; }

    QTemporaryDir stick;
};

} // namespace kindrel::test

#pragma once

#include "core/office.h"
#include "core/side_file.h"
#include "core/startup.h"
#include "support/fixed_clock.h"
#include "support/scripted_dialogue.h"

#include <QTemporaryDir>

namespace kindrel::test {

/// A machine whose facts a test sets.
class FakeWorkstation : public core::Workstation
{
public:
    QString program;
    QString drive;
    QString pattern = QStringLiteral("d/MM/yyyy");
    QSize size{1920, 1080};
    int depth = 24;
    bool first_copy = true;
    qint64 free = 1'000'000'000'000;
    QString machine = QStringLiteral("office-1");
    QList<qint64> ended; ///< Processes that run no more.

    [[nodiscard]] QString program_folder() const override { return program; }
    [[nodiscard]] QString default_data_drive() const override { return drive; }
    [[nodiscard]] QString short_date_pattern() const override { return pattern; }
    [[nodiscard]] bool claim_single_instance(const QString&) override { return first_copy; }
    [[nodiscard]] QSize display_size() const override { return size; }
    [[nodiscard]] int display_depth() const override { return depth; }
    [[nodiscard]] qint64 free_bytes(const QString&) const override { return free; }
    [[nodiscard]] QString name() const override { return machine; }
    [[nodiscard]] bool process_runs(qint64 process) const override { return !ended.contains(process); }
};

/// A data drive and a program folder with a master database, as an installation leaves them.
class DataFolder
{
public:
    DataFolder();

    /// `Kindrel_10_Data`, ending in "/".
    [[nodiscard]] QString root() const { return drive() + QStringLiteral("Kindrel_10_Data/"); }
    [[nodiscard]] QString drive() const { return m_folder.path() + QStringLiteral("/drive/"); }
    [[nodiscard]] QString program() const { return m_folder.path() + QStringLiteral("/program/"); }
    /// A second data root, as a network drive holds it, with its `Global` settings.
    [[nodiscard]] QString make_network();
    [[nodiscard]] core::Paths paths(core::Mode mode = core::Mode::normal, int church = 1) const;

    /// Files by their whole path; folders are made as needed.
    static void write(const QString& file, const QByteArray& content);
    [[nodiscard]] static QByteArray read(const QString& file);
    /// The master database's content laid into `folder`.
    static void make_church(const QString& folder);

private:
    QTemporaryDir m_folder;
};

/// Starts the program on a data folder of its own.
class TestStart
{
public:
    TestStart();

    [[nodiscard]] std::unique_ptr<core::Office> start(const core::StartRequest& request = {});
    /// Changes the church file of church 1 as if another program had written to it.
    void in_database(const QString& statement, int church = 1);
    /// Makes the workstation one of a network and returns the network's data root.
    QString join_network();

    DataFolder data;
    FakeWorkstation workstation;
    ScriptedDialogue dialogue;
    FixedClock clock;
    core::SilentProgress progress;
};

} // namespace kindrel::test

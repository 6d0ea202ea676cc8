#pragma once

#include "core/session.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <memory>
#include <optional>

namespace kindrel::test {

/// An empty church of its own on one engine: a file in a temporary folder, or a database on the private server.
class TestChurch
{
public:
    explicit TestChurch(core::EngineKind engine);
    TestChurch(const TestChurch&) = delete;
    TestChurch& operator=(const TestChurch&) = delete;
    ~TestChurch();

    /// False where the engine's server is not at hand.
    [[nodiscard]] static bool available(core::EngineKind engine);
    [[nodiscard]] core::Session& session() { return *m_session; }
    /// One more session on the same church, as another workstation has it.
    [[nodiscard]] std::unique_ptr<core::Session> another() const;
    [[nodiscard]] QString folder() const { return m_folder.path(); }
    /// The church file; empty on a server.
    [[nodiscard]] QString file() const { return m_file; }
    /// The server's keywords; empty for a file.
    [[nodiscard]] QString connection() const { return m_connection; }
    void close() { m_session.reset(); }
    void reopen() { m_session = another(); }

private:
    QTemporaryDir m_folder;
    QString m_file;
    QString m_connection;
    QString m_database;
    std::unique_ptr<core::Session> m_session;
};

/// A test that runs on both engines.
class EngineTest : public testing::TestWithParam<core::EngineKind>
{
protected:
    void SetUp() override
    {
        if (!TestChurch::available(GetParam()))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
        church.emplace(GetParam());
    }
    [[nodiscard]] core::Session& session() { return church->session(); }

    std::optional<TestChurch> church;
};

[[nodiscard]] std::string engine_name(const testing::TestParamInfo<core::EngineKind>& info);
[[nodiscard]] qint64 number_of(core::Session& session, const QString& statement);

} // namespace kindrel::test

#define KINDREL_ON_BOTH_ENGINES(suite)                                                                                 \
    INSTANTIATE_TEST_SUITE_P(Engines, suite,                                                                           \
                             testing::Values(kindrel::core::EngineKind::sqlite, kindrel::core::EngineKind::postgres),  \
                             kindrel::test::engine_name)

#pragma once

#include "core/dialogue.h"

#include <QByteArray>
#include <QTextStream>

namespace kindrel::apps {

/// Whether the person said yes beforehand: to questions, not to cautions.
enum class Questions { asked, answered_yes };

/// Speaks on standard error and listens on standard input. Where nobody sits at it, every question gets the answer
/// that loses nothing, but for a password: that is read from the given file, else as a line of standard input. In a
/// terminal only what is typed after a question answers it.
class TerminalDialogue final : public core::Dialogue
{
public:
    /// No password file: empty.
    explicit TerminalDialogue(QString password_file = {}, Questions questions = Questions::asked);
    void show(const core::Message& message) override;
    [[nodiscard]] bool confirm(const core::Message& message, core::Answer safe) override;
    [[nodiscard]] std::optional<bool> confirm_or_cancel(const core::Message& message) override;
    [[nodiscard]] std::optional<QString> ask_text(const core::Message& message, bool secret) override;
    [[nodiscard]] std::optional<int> choose(const core::Message& message, const QStringList& from) override;
    [[nodiscard]] std::optional<QString> choose_file(const core::FileQuestion& question) override;
    void play(const QString& sound) override;

private:
    [[nodiscard]] std::optional<QString> password();
    /// Nullopt at the end of the input and where nobody sits at it.
    [[nodiscard]] std::optional<QString> ask(const QString& prompt);
    /// Nullopt at the end of the input, and when a request to end came first.
    [[nodiscard]] std::optional<QString> read_line();
    /// What was typed before a question was shown is no answer to it.
    void forget_typed();

    QByteArray m_read; ///< Of standard input, and handed out to nobody yet.
    QTextStream m_err;
    bool m_attended;
    QString m_password_file;
    Questions m_questions;
};

} // namespace kindrel::apps

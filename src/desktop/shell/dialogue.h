#pragma once

#include "core/dialogue.h"
#include "desktop/shell/input_guard.h"

class QMessageBox;
class QWidget;

namespace kindrel::desktop {

/// Answers with boxes over the window in front.
class QtDialogue : public core::Dialogue
{
public:
    explicit QtDialogue(Stopwatch now = since_start) : m_now(std::move(now)) {}

    void show(const core::Message& message) override;
    [[nodiscard]] bool confirm(const core::Message& message, core::Answer safe) override;
    [[nodiscard]] std::optional<bool> confirm_or_cancel(const core::Message& message) override;
    [[nodiscard]] std::optional<QString> ask_text(const core::Message& message, bool secret) override;
    [[nodiscard]] std::optional<int> choose(const core::Message& message, const QStringList& from) override;
    [[nodiscard]] std::optional<QString> choose_file(const core::FileQuestion& question) override;
    void play(const QString& sound) override;

    /// Where sounds lie; known once an office is open.
    void set_audio_folder(const QString& folder) { m_audio_folder = folder; }

private:
    Stopwatch m_now;
    QString m_audio_folder;
};

} // namespace kindrel::desktop

#pragma once

#include "desktop/running.h"

namespace kindrel::apps {

/// Nobody sits at the screen: says on the terminal what a box would say and gives the answer that loses nothing.
class UnattendedDialogue : public core::Dialogue
{
public:
    void show(const core::Message& message) override;
    [[nodiscard]] bool confirm(const core::Message& message, core::Answer safe) override;
    [[nodiscard]] std::optional<bool> confirm_or_cancel(const core::Message& message) override;
    [[nodiscard]] std::optional<QString> ask_text(const core::Message& message, bool secret) override;
    [[nodiscard]] std::optional<int> choose(const core::Message& message, const QStringList& from) override;
    [[nodiscard]] std::optional<QString> choose_file(const core::FileQuestion&) override { return std::nullopt; }
    void play(const QString&) override {}
};

/// Writes a picture of each screen in both shades into a folder. 0, or 1 when one could not be written.
[[nodiscard]] int take_pictures(desktop::Running& running, desktop::Look& look, const QString& folder);

} // namespace kindrel::apps

#pragma once

#include "core/dialogue.h"

#include <stdexcept>

namespace kindrel::bench {

/// Hears what is told; a question is an error of the benchmark.
class QuietDialogue : public core::Dialogue
{
public:
    void show(const core::Message&) override {}
    bool confirm(const core::Message& message, core::Answer) override { return fail(message); }
    std::optional<bool> confirm_or_cancel(const core::Message& message) override { return fail(message); }
    std::optional<QString> ask_text(const core::Message& message, bool) override { return fail(message), QString(); }
    std::optional<int> choose(const core::Message& message, const QStringList&) override { return fail(message); }
    std::optional<QString> choose_file(const core::FileQuestion&) override { return std::nullopt; }
    void play(const QString&) override {}

private:
    static bool fail(const core::Message& message) { throw std::runtime_error(message.text.toStdString()); }
};

} // namespace kindrel::bench

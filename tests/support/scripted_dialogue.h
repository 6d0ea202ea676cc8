#pragma once

#include "core/dialogue.h"

#include <deque>

namespace kindrel::test {

/// Answers the questions of a rule from a script and compares every text as a whole. A box or question that the script
/// does not list next fails the test, and so does what is left of the script at the end.
class ScriptedDialogue : public core::Dialogue
{
public:
    ~ScriptedDialogue() override { verify(); }

    /// What is not given about a box is not compared.
    void expect_box(const QString& text, std::optional<QString> more = {}, std::optional<QString> caption = {});
    /// `safe` is compared with the answer that Escape stands for.
    void expect_confirm(const QString& text, core::Answer answer, std::optional<core::Answer> safe = {});
    void expect_confirm_or_cancel(const QString& text, std::optional<bool> answer);
    void expect_text(const QString& text, std::optional<QString> answer);
    /// `from` is compared when it is given.
    void expect_choice(const QString& text, std::optional<int> answer, std::optional<QStringList> from = {});
    /// `title` is that of the file question.
    void expect_file(const QString& title, std::optional<QString> answer);

    /// Fails the test when a part of the script was not used, and forgets it.
    void verify();
    /// Every box and question that was shown, in order.
    [[nodiscard]] const std::vector<core::Message>& seen() const { return m_seen; }
    [[nodiscard]] const QStringList& played() const { return m_played; }

    void show(const core::Message& message) override;
    [[nodiscard]] bool confirm(const core::Message& message, core::Answer safe) override;
    [[nodiscard]] std::optional<bool> confirm_or_cancel(const core::Message& message) override;
    [[nodiscard]] std::optional<QString> ask_text(const core::Message& message, bool secret) override;
    [[nodiscard]] std::optional<int> choose(const core::Message& message, const QStringList& from) override;
    [[nodiscard]] std::optional<QString> choose_file(const core::FileQuestion& question) override;
    void play(const QString& sound) override { m_played += sound; }

private:
    enum class Kind { box, confirm, confirm_or_cancel, text, choice, file };
    struct Line
    {
        Kind kind;
        QString text;
        std::optional<QString> more = {};
        std::optional<QString> caption = {};
        std::optional<core::Answer> safe = {};
        std::optional<QStringList> from = {};
        std::optional<bool> yes = {};
        std::optional<int> place = {};
        std::optional<QString> typed = {};
    };

    /// The next line of the script; an empty one after failing the test.
    Line next(Kind kind, const core::Message& message);

    std::deque<Line> m_script;
    std::vector<core::Message> m_seen;
    QStringList m_played;
};

} // namespace kindrel::test

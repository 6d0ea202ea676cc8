#include "support/scripted_dialogue.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

void ScriptedDialogue::expect_box(const QString& text, std::optional<QString> more, std::optional<QString> caption)
{
    m_script.push_back({.kind = Kind::box, .text = text, .more = std::move(more), .caption = std::move(caption)});
}

void ScriptedDialogue::expect_confirm(const QString& text, Answer answer, std::optional<Answer> safe)
{
    m_script.push_back({.kind = Kind::confirm, .text = text, .safe = safe, .yes = answer == Answer::yes});
}

void ScriptedDialogue::expect_confirm_or_cancel(const QString& text, std::optional<bool> answer)
{
    m_script.push_back({.kind = Kind::confirm_or_cancel, .text = text, .yes = answer});
}

void ScriptedDialogue::expect_text(const QString& text, std::optional<QString> answer)
{
    m_script.push_back({.kind = Kind::text, .text = text, .typed = std::move(answer)});
}

void ScriptedDialogue::expect_choice(const QString& text, std::optional<int> answer, std::optional<QStringList> from)
{
    m_script.push_back({.kind = Kind::choice, .text = text, .from = std::move(from), .place = answer});
}

void ScriptedDialogue::expect_file(const QString& title, std::optional<QString> answer)
{
    m_script.push_back({.kind = Kind::file, .text = title, .typed = std::move(answer)});
}

void ScriptedDialogue::verify()
{
    for (const auto& line : m_script)
        ADD_FAILURE() << "Never shown: " << line.text.toStdString();
    m_script.clear();
}

ScriptedDialogue::Line ScriptedDialogue::next(Kind kind, const Message& message)
{
    m_seen.push_back(message);
    if (m_script.empty() || m_script.front().kind != kind || m_script.front().text != message.text) {
        ADD_FAILURE() << "Shown: " << message.text.toStdString()
                      << "\nExpected: " << (m_script.empty() ? "nothing" : m_script.front().text.toStdString());
        return {.kind = kind, .text = {}};
    }
    const Line line = m_script.front();
    m_script.pop_front();
    EXPECT_EQ(line.more.value_or(message.more).toStdString(), message.more.toStdString());
    EXPECT_EQ(line.caption.value_or(message.caption).toStdString(), message.caption.toStdString());
    return line;
}

void ScriptedDialogue::show(const Message& message)
{
    next(Kind::box, message);
}

bool ScriptedDialogue::confirm(const Message& message, Answer safe)
{
    const Line line = next(Kind::confirm, message);
    EXPECT_EQ(line.safe.value_or(safe), safe) << message.text.toStdString();
    return line.yes.value_or(false);
}

std::optional<bool> ScriptedDialogue::confirm_or_cancel(const Message& message)
{
    return next(Kind::confirm_or_cancel, message).yes;
}

std::optional<QString> ScriptedDialogue::ask_text(const Message& message, bool)
{
    return next(Kind::text, message).typed;
}

std::optional<int> ScriptedDialogue::choose(const Message& message, const QStringList& from)
{
    const Line line = next(Kind::choice, message);
    EXPECT_EQ(line.from.value_or(from), from) << message.text.toStdString();
    return line.place;
}

std::optional<QString> ScriptedDialogue::choose_file(const FileQuestion& question)
{
    return next(Kind::file, {.text = question.title}).typed;
}

} // namespace kindrel::test

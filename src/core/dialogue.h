#pragma once

#include <QString>
#include <QStringList>

#include <optional>

namespace kindrel::core {

enum class Icon { caution, information, question };
enum class Answer { yes, no };

/// What a box says. `more` stands beneath the sentence.
struct Message
{
    QString text;
    QString more = {};
    QString caption = QStringLiteral("Caution");
    Icon icon = Icon::caution;

    friend bool operator==(const Message&, const Message&) = default;
};

/// A box that tells something without a caution.
[[nodiscard]] inline Message information(const QString& text, const QString& more = {})
{
    return {.text = text, .more = more, .icon = Icon::information};
}

/// A question for a file: `filter` is a list of name and pattern as "Text (*.txt)".
struct FileQuestion
{
    enum class Kind { open, save, folder };
    QString title;
    QString filter;
    QString suggested;
    Kind kind = Kind::open;
};

/// How rules speak to the person; the desktop answers with boxes, the command line on the terminal, tests with a
/// script. Never called while a transaction or a `Rows` is open.
class Dialogue
{
public:
    virtual ~Dialogue() = default;
    virtual void show(const Message&) = 0;
    /// `safe` is what Escape, Enter and a closed box choose.
    [[nodiscard]] virtual bool confirm(const Message&, Answer safe) = 0;
    /// Nullopt: stay.
    [[nodiscard]] virtual std::optional<bool> confirm_or_cancel(const Message&) = 0;
    [[nodiscard]] virtual std::optional<QString> ask_text(const Message&, bool secret = false) = 0;
    /// The place in `from`, counted from 0.
    [[nodiscard]] virtual std::optional<int> choose(const Message&, const QStringList& from) = 0;
    [[nodiscard]] virtual std::optional<QString> choose_file(const FileQuestion&) = 0;
    /// A file name in the `Audio` folder, or empty for a plain beep.
    virtual void play(const QString& sound) = 0;
};

} // namespace kindrel::core

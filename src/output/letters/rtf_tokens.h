#pragma once

#include <QByteArray>

namespace kindrel::output {

/// The next thing in a rich text file.
struct RtfToken
{
    enum class Kind {
        open,   ///< "{"
        close,  ///< "}"
        word,   ///< A control word without its backslash, and its number.
        symbol, ///< The character behind a backslash.
        hex,    ///< The byte that \'xx stands for.
        text,   ///< Bytes that stand for themselves.
        binary, ///< The raw bytes behind \bin.
        end,
        fault ///< Nothing sensible follows.
    };
    Kind kind = Kind::end;
    QByteArrayView bytes = {};
    int number = 0;
    bool numbered = false;
};

/// Cuts a file into tokens. What it hands out points into the file's bytes, which must outlive it.
class RtfTokens
{
public:
    explicit RtfTokens(QByteArrayView bytes) : m_bytes(bytes) {}
    [[nodiscard]] RtfToken next();

private:
    [[nodiscard]] bool at_end() const { return m_at >= m_bytes.size(); }
    [[nodiscard]] RtfToken control();
    [[nodiscard]] RtfToken control_word();
    [[nodiscard]] RtfToken hex();
    [[nodiscard]] RtfToken text();
    /// False for a number of more digits than any file needs.
    [[nodiscard]] bool take_number(RtfToken& token);

    QByteArrayView m_bytes;
    qsizetype m_at = 0;
};

} // namespace kindrel::output

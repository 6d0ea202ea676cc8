#pragma once

#include "output/letters/letter_text.h"

#include <QByteArray>

namespace kindrel::output {

/// A letter, or in plain words why there is none.
struct ReadLetter
{
    LetterText letter;
    QString fault = {}; ///< Empty when the letter can be used.

    friend bool operator==(const ReadLetter&, const ReadLetter&) = default;
};

/// The most bytes of a letter file, which its pictures may fill.
inline constexpr qint64 largest_letter_file = 16 << 20;

/// Reads rich text as other programs write it too; what letters do not have (tables, notes, drawings) is passed over,
/// as far as possible leaving its text.
[[nodiscard]] ReadLetter read_letter(QByteArrayView bytes);
/// A file that reads back as the same letter.
[[nodiscard]] QByteArray letter_bytes(const LetterText& letter);

/// Throws core::FileError when the disk refuses.
[[nodiscard]] ReadLetter load_letter(const QString& file);
/// All or nothing. Throws core::FileError, also for a letter too long to be read again.
void save_letter(const QString& file, const LetterText& letter);

} // namespace kindrel::output

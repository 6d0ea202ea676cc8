#include "output/letters/letter_file.h"

#include "core/files.h"

#include <QDir>
#include <QFileInfo>

namespace kindrel::output {

using namespace Qt::StringLiterals;

ReadLetter load_letter(const QString& file)
{
    if (QFileInfo(file).size() > largest_letter_file)
        return {{}, u"It is larger than 16 MB, the most that a letter can have."_s};
    const auto bytes = core::read_file(file);
    return bytes ? read_letter(*bytes) : ReadLetter{{}, u"It is not there any more."_s};
}

void save_letter(const QString& file, const LetterText& letter)
{
    const auto refused = [&](const QString& why) {
        return core::FileError(u"Unable to write '%1': %2"_s.arg(QDir::toNativeSeparators(file), why));
    };
    if (length_of(letter) > most_letter_text)
        throw refused(u"it holds more than 32K characters."_s);
    const auto bytes = letter_bytes(letter);
    if (bytes.size() > largest_letter_file)
        throw refused(u"its pictures are too large."_s);
    core::write_file(file, bytes);
}

} // namespace kindrel::output

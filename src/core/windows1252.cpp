#include "core/windows1252.h"

#include <algorithm>
#include <array>

namespace kindrel::core {

namespace {

constexpr int first_differing = 0x80;

/// Where the code page departs from Latin-1: bytes 0x80 to 0x9F. The five bytes without a character stand for
/// themselves, so that what is read is written back unchanged.
constexpr std::array<char16_t, 32> differing{0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
                                             0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0x008D, 0x017D, 0x008F,
                                             0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
                                             0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

std::optional<char> byte_of(char16_t character)
{
    const auto* const place = std::find(differing.begin(), differing.end(), character);
    if (place != differing.end())
        return static_cast<char>(first_differing + (place - differing.begin()));
    if (character < first_differing || (character >= 0xA0 && character <= 0xFF))
        return static_cast<char>(character);
    return std::nullopt;
}

} // namespace

std::optional<QByteArray> to_windows1252(const QString& text)
{
    QByteArray bytes;
    for (const QChar character : text.normalized(QString::NormalizationForm_C)) {
        const std::optional<char> byte = byte_of(character.unicode());
        if (!byte)
            return std::nullopt;
        bytes.append(*byte);
    }
    return bytes;
}

QString from_windows1252(QByteArrayView bytes)
{
    QString text;
    text.reserve(bytes.size());
    for (const char byte : bytes) {
        const auto code = static_cast<unsigned char>(byte);
        const bool differs = code >= first_differing && code < first_differing + differing.size();
        text.append(QChar(differs ? differing[code - first_differing] : char16_t{code}));
    }
    return text;
}

} // namespace kindrel::core

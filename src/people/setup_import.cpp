#include "people/setup_import.h"

#include "core/files.h"
#include "core/windows1252.h"

#include <QFileInfo>
#include <QHash>
#include <QStringDecoder>

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// Far above any list, and far below what would be slow to look at.
constexpr qint64 largest_file = 16 * 1024 * 1024;

/// Nullopt after saying that the file cannot be read as text.
std::optional<QString> read_text(core::Dialogue& dialogue, const QString& file)
{
    try {
        const bool small = QFileInfo(file).size() <= largest_file;
        const auto bytes = small ? core::read_file(file) : QByteArray(1, '\0');
        if (!bytes) {
            dialogue.show({u"Unable to find the file '%1'"_s.arg(file)});
            return std::nullopt;
        }
        if (bytes->contains('\0')) {
            dialogue.show({u"Unable to import this file as it is not a text file"_s, file});
            return std::nullopt;
        }
        QStringDecoder decoder(QStringDecoder::Utf8);
        const QString text = decoder(*bytes);
        return decoder.hasError() ? core::from_windows1252(*bytes) : text;
    } catch (const core::FileError& error) {
        dialogue.show({u"Unable to read the file '%1'"_s.arg(file), error.text()});
        return std::nullopt;
    }
}

QStringList lines_of(QString text)
{
    text.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n');
    return text.split(u'\n');
}

/// Lines with their numbers; a fault is said of the line: "has no postcode".
class LineReader
{
public:
    explicit LineReader(SetupKind kind) : m_kind(kind) {}

    /// What is wrong with the line; empty when it was taken or is blank.
    [[nodiscard]] QString take(const QString& line, int number)
    {
        if (line.trimmed().isEmpty())
            return {};
        SetupItem item;
        if (const auto fault = split(line, item); !fault.isEmpty())
            return fault;
        if (const auto fault = check(item); !fault.isEmpty())
            return fault;
        const auto same = sameness(item);
        if (const int first = m_lines.value(same))
            return u"repeats line %1"_s.arg(first);
        m_lines.insert(same, number);
        m_items.push_back(std::move(item));
        return {};
    }
    [[nodiscard]] std::vector<SetupItem> take_items() { return std::move(m_items); }

private:
    QString split(const QString& line, SetupItem& item) const
    {
        if (m_kind != SetupKind::suburbs) {
            item.text = tidy(line);
            return {};
        }
        QString even = line;
        const auto parts = even.replace(u';', u',').replace(u'\t', u',').split(u',');
        if (parts.size() > 2)
            return u"holds more than a suburb and a postcode"_s;
        item.text = tidy(parts.front());
        item.postcode = parts.size() == 2 ? tidy(parts.back()) : QString();
        if (item.text.isEmpty())
            return u"has no suburb"_s;
        return item.postcode.isEmpty() ? u"has no postcode"_s : QString();
    }
    static QString check(const SetupItem& item)
    {
        const QString all = item.text + item.postcode;
        if (std::ranges::any_of(all, [](QChar c) { return c.category() == QChar::Other_Control; }))
            return u"holds a tab or another character that cannot be shown"_s;
        if (std::max(item.text.size(), item.postcode.size()) > longest_setup_text)
            return u"is longer than %1 characters"_s.arg(longest_setup_text);
        return {};
    }

    SetupKind m_kind;
    std::vector<SetupItem> m_items;
    QHash<QString, int> m_lines;
};

QString how_a_file_looks(SetupKind kind)
{
    return kind == SetupKind::suburbs
               ? u"Each line holds a suburb and its postcode with a comma, a semicolon or a tab between them."_s
               : u"Each line holds one item."_s;
}

} // namespace

std::optional<std::vector<SetupItem>> read_setup_file(core::Dialogue& dialogue, SetupKind kind, const QString& file)
{
    const auto text = read_text(dialogue, file);
    if (!text)
        return std::nullopt;
    LineReader reader(kind);
    for (int number = 0; const auto& line : lines_of(*text)) {
        const auto fault = reader.take(line, ++number);
        if (!fault.isEmpty()) {
            dialogue.show({u"Unable to import this file as line %1 %2"_s.arg(number).arg(fault),
                           u"Nothing was imported. "_s + how_a_file_looks(kind)});
            return std::nullopt;
        }
    }
    auto items = reader.take_items();
    if (items.empty()) {
        dialogue.show({u"Unable to import this file as it holds no items"_s, how_a_file_looks(kind)});
        return std::nullopt;
    }
    return items;
}

} // namespace kindrel::people

#pragma once

#include "core/files.h"
#include "core/paths.h"

#include <array>
#include <span>
#include <string_view>

namespace kindrel::core {

/// `number` is 16 bits wide, low byte first; `yes_no` the same with -1 and 0; `spare` bytes stay as they are found, and
/// are zero in a new record.
enum class SideType { text, number, yes_no, spare };

struct SideField
{
    const char* name;
    int length;
    SideType type;
    const char* fallback; ///< What a record holds that no file was read for; of a number in decimal digits.
    int offset = 0;
};

/// A settings file that holds exactly one record.
struct SideFile
{
    const char* name;
    Folder folder;
    int length;
    std::span<const SideField> fields;
};

/// The fields laid one behind the other.
template <std::size_t N>
consteval std::array<SideField, N> consecutive(std::array<SideField, N> fields)
{
    int offset = 0;
    for (auto& field : fields) {
        field.offset = offset;
        offset += field.length;
    }
    return fields;
}

/// Does not compile when the fields do not make up the whole record.
consteval SideFile side_file(const char* name, Folder folder, int length, std::span<const SideField> fields)
{
    if (fields.back().offset + fields.back().length != length)
        throw "the fields do not fill the record";
    return {name, folder, length, fields};
}

/// The content of a side file. Fields are asked for by the names that its layout declares.
class SideRecord
{
public:
    /// Holds the fallbacks. `file` must live as long as the record.
    explicit SideRecord(const SideFile& file);
    SideRecord(const SideFile& file, QByteArray bytes);

    [[nodiscard]] const SideFile& file() const { return *m_file; }
    [[nodiscard]] QByteArray bytes() const { return m_bytes; }

    [[nodiscard]] QString text(std::string_view field) const;
    [[nodiscard]] int number(std::string_view field) const;
    [[nodiscard]] bool flag(std::string_view field) const { return number(field) != 0; }

    /// Throws FileError when the text is too long or holds a character that the file cannot.
    void set_text(std::string_view field, const QString& text);
    /// Throws FileError beyond 16 bits.
    void set_number(std::string_view field, int number);
    void set_flag(std::string_view field, bool flag) { set_number(field, flag ? -1 : 0); }
    /// Gives every blank text its fallback.
    void fill_blanks();

private:
    [[nodiscard]] const SideField& field(std::string_view name) const;

    const SideFile* m_file;
    QByteArray m_bytes;
};

/// Nullopt when the file is missing; throws FileError on a wrong length.
[[nodiscard]] std::optional<SideRecord> read_side_file(const Paths& paths, const SideFile& file);
/// All or nothing; throws FileError.
void write_side_file(const Paths& paths, const SideRecord& record);

} // namespace kindrel::core

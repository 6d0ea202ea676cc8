#include "core/side_file.h"

#include "core/windows1252.h"

#include <QtEndian>

#include <algorithm>
#include <limits>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr char blank = ' ';

QByteArray padded(const SideFile& file, const SideField& field, const QString& text)
{
    const std::optional<QByteArray> bytes = to_windows1252(text);
    if (!bytes)
        throw FileError(u"'%1' holds a character that '%2' cannot hold."_s.arg(text, QLatin1String(file.name)));
    if (bytes->size() > field.length) {
        throw FileError(u"'%1' is too long for '%2': there is room for %3 characters."_s.arg(
            text, QLatin1String(file.name), QString::number(field.length)));
    }
    return bytes->leftJustified(field.length, blank);
}

bool is_number(const SideField& field)
{
    return field.type == SideType::number || field.type == SideType::yes_no;
}

} // namespace

SideRecord::SideRecord(const SideFile& file) : m_file(&file), m_bytes(file.length, '\0')
{
    for (const auto& field : file.fields) {
        if (is_number(field))
            set_number(field.name, QByteArray(field.fallback).toInt());
        else if (field.type == SideType::text)
            set_text(field.name, QString::fromUtf8(field.fallback));
    }
}

SideRecord::SideRecord(const SideFile& file, QByteArray bytes) : m_file(&file), m_bytes(std::move(bytes))
{
    if (m_bytes.size() != file.length) {
        throw FileError(u"The settings file '%1' is damaged: it holds %2 bytes instead of %3."_s.arg(
            QLatin1String(file.name), QString::number(m_bytes.size()), QString::number(file.length)));
    }
}

QString SideRecord::text(std::string_view field) const
{
    const SideField& place = this->field(field);
    QByteArray bytes = m_bytes.mid(place.offset, place.length);
    while (bytes.endsWith(blank) || bytes.endsWith('\0')) // Records of other programs are filled up with either.
        bytes.chop(1);
    return from_windows1252(bytes);
}

int SideRecord::number(std::string_view field) const
{
    return qFromLittleEndian<qint16>(m_bytes.constData() + this->field(field).offset);
}

void SideRecord::set_text(std::string_view field, const QString& text)
{
    const SideField& place = this->field(field);
    m_bytes.replace(place.offset, place.length, padded(*m_file, place, text));
}

void SideRecord::set_number(std::string_view field, int number)
{
    using Limits = std::numeric_limits<qint16>;
    if (number < Limits::min() || number > Limits::max())
        throw FileError(u"%1 is too large for '%2'."_s.arg(QString::number(number), QLatin1String(m_file->name)));
    qToLittleEndian(static_cast<qint16>(number), m_bytes.data() + this->field(field).offset);
}

void SideRecord::fill_blanks()
{
    for (const auto& field : m_file->fields) {
        if (field.type == SideType::text && text(field.name).isEmpty())
            set_text(field.name, QString::fromUtf8(field.fallback));
    }
}

const SideField& SideRecord::field(std::string_view name) const
{
    const auto found =
        std::ranges::find(m_file->fields, name, [](const SideField& field) { return std::string_view(field.name); });
    Q_ASSERT(found != m_file->fields.end());
    return *found;
}

std::optional<SideRecord> read_side_file(const Paths& paths, const SideFile& file)
{
    const std::optional<QByteArray> bytes = read_file(paths.file(file.folder, QLatin1String(file.name)));
    if (!bytes)
        return std::nullopt;
    return SideRecord(file, *bytes);
}

void write_side_file(const Paths& paths, const SideRecord& record)
{
    write_file(paths.file(record.file().folder, QLatin1String(record.file().name)), record.bytes());
}

} // namespace kindrel::core

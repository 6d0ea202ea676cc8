#include "core/backup_archive.h"

#include "core/backup_error.h"
#include "core/backup_files.h"
#include "core/files.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStringDecoder>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>

#include <zip.h>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 most_entries = 2'000'000;
constexpr qint64 most_bytes = qint64{1} << 40;
constexpr std::size_t read_at_once = 1 << 18;
constexpr quint32 quick_deflate = 3;
constexpr quint32 file_for_church = 0100660U << 16;
constexpr quint32 file_type = 0170000;
constexpr quint32 ordinary_file = 0100000;

const QStringList packed_already{u".jpg"_s, u".jpeg"_s, u".png"_s, u".zip"_s, u".docx"_s, u".xlsx"_s, u".odt"_s};

BackupError damaged()
{
    return {BackupFault::damaged, u"The backup is damaged, or was cut off while it was copied."_s};
}

BackupError hostile(const QString& what)
{
    return {BackupFault::hostile, u"This file was not made by Kindrel's backup: %1."_s.arg(what)};
}

BackupError wrong_password()
{
    return {BackupFault::wrong_password, u"The password of the backup is wrong."_s};
}

BackupError reading_failed(int code)
{
    switch (code) {
    case ZIP_ER_NOPASSWD:
        return {BackupFault::password_needed, u"This backup can only be read with its password."_s};
    case ZIP_ER_WRONGPASSWD:
        return wrong_password();
    case ZIP_ER_NOENT:
        return {BackupFault::missing, u"There is no such backup."_s};
    case ZIP_ER_NOZIP:
        return {BackupFault::foreign, u"This file is not a Kindrel backup, or only a part of one."_s};
    case ZIP_ER_OPEN:
        return {BackupFault::missing, u"The backup cannot be opened: the folder or the file does not allow it."_s};
    default:
        return damaged();
    }
}

FileError writing_failed(const QString& file, zip_error_t* error)
{
    return FileError(u"Unable to write '%1': %2"_s.arg(QDir::toNativeSeparators(file),
                                                       QString::fromLocal8Bit(zip_error_strerror(error))));
}

/// A file that goes into an archive. The archive asks for it piece by piece, and frees it.
class MeteredFile
{
public:
    MeteredFile(const QString& path, ByteMeter& meter) : m_file(path), m_meter(meter) { zip_error_init(&m_error); }
    MeteredFile(const MeteredFile&) = delete;
    MeteredFile& operator=(const MeteredFile&) = delete;
    ~MeteredFile() { zip_error_fini(&m_error); }

    static zip_int64_t answer(void* file, void* data, zip_uint64_t size, zip_source_cmd_t question)
    {
        if (question == ZIP_SOURCE_FREE) {
            delete static_cast<MeteredFile*>(file);
            return 0;
        }
        return static_cast<MeteredFile*>(file)->answer(data, size, question);
    }

private:
    zip_int64_t answer(void* data, zip_uint64_t size, zip_source_cmd_t question)
    {
        switch (question) {
        case ZIP_SOURCE_OPEN:
            return m_file.open(QIODevice::ReadOnly) ? 0 : fail(ZIP_ER_OPEN);
        case ZIP_SOURCE_READ:
            return read(static_cast<char*>(data), static_cast<qint64>(size));
        case ZIP_SOURCE_CLOSE:
            m_file.close();
            return 0;
        case ZIP_SOURCE_STAT:
            return describe(static_cast<zip_stat_t*>(data));
        case ZIP_SOURCE_ERROR:
            return zip_error_to_data(&m_error, data, size);
        case ZIP_SOURCE_SUPPORTS:
            return zip_source_make_command_bitmap(ZIP_SOURCE_OPEN, ZIP_SOURCE_READ, ZIP_SOURCE_CLOSE, ZIP_SOURCE_STAT,
                                                  ZIP_SOURCE_ERROR, ZIP_SOURCE_FREE, ZIP_SOURCE_SUPPORTS, -1);
        default:
            return fail(ZIP_ER_OPNOTSUPP);
        }
    }
    zip_int64_t read(char* piece, qint64 size)
    {
        const qint64 got = m_file.read(piece, size);
        if (got < 0)
            return fail(ZIP_ER_READ);
        return m_meter.advance(got) ? got : fail(ZIP_ER_CANCELLED);
    }
    zip_int64_t describe(zip_stat_t* stat)
    {
        const QFileInfo file(m_file);
        stat->size = static_cast<zip_uint64_t>(file.size());
        stat->mtime = file.lastModified().toSecsSinceEpoch();
        stat->valid |= ZIP_STAT_SIZE | ZIP_STAT_MTIME;
        return sizeof(*stat);
    }
    zip_int64_t fail(int code)
    {
        zip_error_set(&m_error, code, errno);
        return -1;
    }

    QFile m_file;
    ByteMeter& m_meter;
    zip_error_t m_error;
};

} // namespace

ArchiveWriter::ArchiveWriter(const QString& file, const QString& password, ByteMeter& meter)
    : m_file(file), m_password(password.toUtf8()), m_meter(meter)
{
    int code = 0;
    m_zip = zip_open(QFile::encodeName(file).constData(), ZIP_CREATE | ZIP_TRUNCATE, &code);
    if (!m_zip) {
        zip_error_t error;
        zip_error_init_with_code(&error, code);
        const FileError failure = writing_failed(file, &error);
        zip_error_fini(&error);
        throw failure;
    }
}

ArchiveWriter::~ArchiveWriter()
{
    if (m_zip)
        zip_discard(m_zip);
}

void ArchiveWriter::add_file(const QString& name, const QString& source)
{
    auto file = std::make_unique<MeteredFile>(source, m_meter);
    zip_source_t* content = zip_source_function(m_zip, MeteredFile::answer, file.get());
    if (content)
        (void)file.release(); // NOLINT: the archive frees it.
    add(name, content);
}

void ArchiveWriter::add_content(const QString& name, const QByteArray& content)
{
    const auto size = static_cast<std::size_t>(content.size());
    void* copy = std::malloc(std::max<std::size_t>(size, 1)); // The archive frees it.
    if (!copy)
        throw std::bad_alloc();
    std::memcpy(copy, content.constData(), size);
    zip_source_t* source = zip_source_buffer(m_zip, copy, size, 1);
    if (!source)
        std::free(copy);
    add(name, source);
}

void ArchiveWriter::add(const QString& name, zip_source* content)
{
    const auto place = content ? zip_file_add(m_zip, name.toUtf8().constData(), content, ZIP_FL_ENC_UTF_8) : -1;
    if (content && place < 0)
        zip_source_free(content);
    const auto index = static_cast<zip_uint64_t>(place);
    const bool packed = std::ranges::any_of(
        packed_already, [&](const QString& ending) { return name.endsWith(ending, Qt::CaseInsensitive); });
    const bool described =
        place >= 0 &&
        zip_set_file_compression(m_zip, index, packed ? ZIP_CM_STORE : ZIP_CM_DEFLATE, quick_deflate) == 0 &&
        zip_file_set_external_attributes(m_zip, index, 0, ZIP_OPSYS_UNIX, file_for_church) == 0 &&
        (m_password.isEmpty() || zip_file_set_encryption(m_zip, index, ZIP_EM_AES_256, m_password.constData()) == 0);
    if (!described)
        throw writing_failed(m_file, zip_get_error(m_zip));
}

void ArchiveWriter::finish()
{
    if (zip_close(m_zip) != 0) {
        if (!m_meter.advance(0))
            throw Cancelled();
        throw writing_failed(m_file, zip_get_error(m_zip));
    }
    m_zip = nullptr;
}

void ArchiveReader::Discard::operator()(zip* archive) const
{
    zip_discard(archive);
}

ArchiveReader::ArchiveReader(const QString& file, const QString& password) : m_has_password(!password.isEmpty())
{
    if (!QFileInfo(file).isFile())
        throw reading_failed(ZIP_ER_NOENT);
    int code = 0;
    m_zip.reset(zip_open(QFile::encodeName(file).constData(), ZIP_RDONLY | ZIP_CHECKCONS, &code));
    if (!m_zip)
        throw reading_failed(code);
    if (m_has_password && zip_set_default_password(m_zip.get(), password.toUtf8().constData()) != 0)
        throw wrong_password();
    read_directory();
}

void ArchiveReader::read_directory()
{
    const auto count = zip_get_num_entries(m_zip.get(), 0);
    if (count > most_entries)
        throw hostile(u"it holds too many files"_s);
    qint64 bytes = 0;
    for (zip_int64_t place = 0; place < count; ++place) {
        m_entries.push_back(entry_at(static_cast<quint64>(place)));
        bytes += m_entries.back().size;
        if (bytes > most_bytes)
            throw hostile(u"its files would fill any disk"_s);
    }
    std::ranges::sort(m_entries, {}, &ArchiveEntry::name);
    if (std::ranges::adjacent_find(m_entries, {}, &ArchiveEntry::name) != m_entries.end())
        throw hostile(u"it holds a file twice"_s);
}

ArchiveEntry ArchiveReader::entry_at(quint64 place) const
{
    zip_stat_t stat;
    zip_uint8_t system = 0;
    zip_uint32_t attributes = 0;
    constexpr auto needed = ZIP_STAT_SIZE | ZIP_STAT_NAME | ZIP_STAT_ENCRYPTION_METHOD;
    const char* raw = zip_get_name(m_zip.get(), place, ZIP_FL_ENC_RAW);
    if (!raw || zip_stat_index(m_zip.get(), place, 0, &stat) != 0 || (stat.valid & needed) != needed ||
        zip_file_get_external_attributes(m_zip.get(), place, 0, &system, &attributes) != 0)
        throw damaged();
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString name = decoder(raw);
    const quint32 type = (attributes >> 16) & file_type;
    if (decoder.hasError() || !stays_inside(name))
        throw hostile(u"the name of a file in it leads out of the church's folders"_s);
    if (system == ZIP_OPSYS_UNIX && type != 0 && type != ordinary_file)
        throw hostile(u"it holds a link or a device"_s);
    if (stat.size > static_cast<zip_uint64_t>(most_bytes))
        throw hostile(u"its files would fill any disk"_s);
    return {name, static_cast<qint64>(stat.size), place, stat.encryption_method != ZIP_EM_NONE};
}

const ArchiveEntry* ArchiveReader::find(QStringView name) const
{
    const auto found = std::ranges::lower_bound(m_entries, name, {},
                                                [](const ArchiveEntry& entry) { return QStringView(entry.name); });
    return found == m_entries.end() || found->name != name ? nullptr : &*found;
}

void ArchiveReader::read(const ArchiveEntry& entry, const Taker& take) const
{
    if (entry.encrypted && !m_has_password)
        throw reading_failed(ZIP_ER_NOPASSWD);
    struct Close
    {
        void operator()(zip_file_t* file) const { zip_fclose(file); }
    };
    const std::unique_ptr<zip_file_t, Close> file(zip_fopen_index(m_zip.get(), entry.place, 0));
    if (!file)
        throw reading_failed(zip_error_code_zip(zip_get_error(m_zip.get())));
    std::vector<char> piece(read_at_once);
    qint64 done = 0;
    for (;;) { // The read behind the last byte checks the archive's own checksum.
        const auto got = zip_fread(file.get(), piece.data(), piece.size());
        if (got == 0 && done == entry.size)
            return;
        done += got;
        if (got <= 0 || done > entry.size)
            throw damaged();
        take({piece.data(), static_cast<qsizetype>(got)});
    }
}

} // namespace kindrel::core

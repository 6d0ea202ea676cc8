#pragma once

#include "core/backup_meter.h"

#include <QByteArrayView>
#include <QString>

#include <functional>
#include <memory>
#include <vector>

struct zip;
struct zip_source;

namespace kindrel::core {

/// A ZIP archive being written, with AES-256 when there is a password.
class ArchiveWriter
{
public:
    /// Writes in place of `file`, which must be there already: the archive takes its permissions. Throws FileError.
    ArchiveWriter(const QString& file, const QString& password, ByteMeter& meter);
    /// Nothing is left but the file as it was.
    ~ArchiveWriter();
    ArchiveWriter(const ArchiveWriter&) = delete;
    ArchiveWriter& operator=(const ArchiveWriter&) = delete;

    /// The source is read by finish(), and metered.
    void add_file(const QString& name, const QString& source);
    void add_content(const QString& name, const QByteArray& content);
    /// Writes it all. Throws FileError, or Cancelled.
    void finish();

private:
    void add(const QString& name, zip_source* content);

    QString m_file;
    QByteArray m_password;
    ByteMeter& m_meter;
    zip* m_zip = nullptr;
};

/// A file in an archive.
struct ArchiveEntry
{
    QString name;
    qint64 size = 0;
    quint64 place = 0;
    bool encrypted = false;
};

/// A ZIP archive being read. Refuses what no backup holds: links, folders, duplicates, names that climb out, sizes
/// beyond all measure. Everything throws BackupError.
class ArchiveReader
{
public:
    using Taker = std::function<void(QByteArrayView)>;

    ArchiveReader(const QString& file, const QString& password);

    [[nodiscard]] const std::vector<ArchiveEntry>& entries() const { return m_entries; }
    [[nodiscard]] const ArchiveEntry* find(QStringView name) const;
    /// Hands on the content piece by piece; what is handed on counts for nothing when this throws.
    void read(const ArchiveEntry& entry, const Taker& take) const;

private:
    struct Discard
    {
        void operator()(zip* archive) const;
    };
    void read_directory();
    [[nodiscard]] ArchiveEntry entry_at(quint64 place) const;

    bool m_has_password;
    std::unique_ptr<zip, Discard> m_zip;
    std::vector<ArchiveEntry> m_entries;
};

} // namespace kindrel::core

#pragma once

#include <QByteArray>
#include <QString>

#include <optional>
#include <stdexcept>

namespace kindrel::core {

/// A file or folder could not be read or written; the text names it.
class FileError : public std::runtime_error
{
public:
    explicit FileError(const QString& what) : std::runtime_error(what.toStdString()) {}
    [[nodiscard]] QString text() const { return QString::fromUtf8(what()); }
};

/// The path in native form, ending in the separator.
[[nodiscard]] QString as_folder(const QString& path);
/// Makes the folder and those above it; nothing happens when it is there.
void make_folder(const QString& folder);
/// Nullopt when the file is missing.
[[nodiscard]] std::optional<QByteArray> read_file(const QString& file);
/// All or nothing: a reader sees the old content or the new one.
void write_file(const QString& file, const QByteArray& content);
/// A copy that appears whole under `to`, for owner and group alone. `to` must not exist; `from` must not be a live
/// database.
void copy_file(const QString& from, const QString& to);
/// Takes the place of what stood at `to`.
void move_file(const QString& from, const QString& to);
void remove_file(const QString& file);

} // namespace kindrel::core

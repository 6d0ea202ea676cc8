#include "core/files.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSaveFile>

#include <filesystem>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// For the church's people: not for everyone who can log in to the machine.
constexpr QFileDevice::Permissions church_only =
    QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ReadGroup | QFileDevice::WriteGroup;

constexpr qint64 copied_at_once = 1 << 20;

FileError failed(const QString& act, const QString& file, const QString& why)
{
    return FileError(u"Unable to %1 '%2': %3"_s.arg(act, QDir::toNativeSeparators(file), why));
}

} // namespace

QString as_folder(const QString& path)
{
    const QString native = QDir::toNativeSeparators(path);
    return native.endsWith(QDir::separator()) ? native : native + QDir::separator();
}

void make_folder(const QString& folder)
{
    if (!QDir().mkpath(folder))
        throw failed(u"make the folder"_s, folder, u"the folder above it does not allow it"_s);
}

std::optional<QByteArray> read_file(const QString& file)
{
    QFile source(file);
    if (!source.exists())
        return std::nullopt;
    if (!source.open(QIODevice::ReadOnly))
        throw failed(u"read"_s, file, source.errorString());
    const QByteArray content = source.readAll();
    if (source.error() != QFileDevice::NoError)
        throw failed(u"read"_s, file, source.errorString());
    return content;
}

void write_file(const QString& file, const QByteArray& content)
{
    QSaveFile target(file);
    if (!target.open(QIODevice::WriteOnly) || target.write(content) != content.size() || !target.commit())
        throw failed(u"write"_s, file, target.errorString());
}

void copy_file(const QString& from, const QString& to)
{
    QFile source(from);
    if (!source.open(QIODevice::ReadOnly))
        throw failed(u"read"_s, from, source.errorString());
    const QString unfinished = to + u".unfinished"_s;
    QSaveFile target(unfinished);
    bool written = target.open(QIODevice::WriteOnly);
    while (written && !source.atEnd()) {
        const QByteArray part = source.read(copied_at_once);
        written = !part.isEmpty() && target.write(part) == part.size();
    }
    if (!written || !target.commit())
        throw failed(u"write"_s, unfinished, target.errorString());
    QFile copy(unfinished);
    if (!copy.setPermissions(church_only) || !copy.rename(to)) {
        const QString why = copy.errorString();
        copy.remove();
        throw failed(u"write"_s, to, why);
    }
}

void move_file(const QString& from, const QString& to)
{
    std::error_code error;
    std::filesystem::rename(QFileInfo(from).filesystemFilePath(), QFileInfo(to).filesystemFilePath(), error);
    if (error)
        throw failed(u"rename"_s, from, QString::fromStdString(error.message()));
}

void remove_file(const QString& file)
{
    QFile target(file);
    if (target.exists() && !target.remove())
        throw failed(u"remove"_s, file, target.errorString());
}

} // namespace kindrel::core

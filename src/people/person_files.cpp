#include "people/person_files.h"

#include "core/files.h"
#include "core/windows1252.h"

#include <QFileInfo>
#include <QStringDecoder>
#include <QStringList>

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;
using core::Folder;

namespace {

QString path_of(const core::Paths& paths, const OwnFile& file)
{
    return paths.file(file.folder, file.name);
}

/// Pages are UTF-8; one that was written by another program in the older character set loses nothing.
QString text_of(const QByteArray& page)
{
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString text = decoder(page);
    return decoder.hasError() ? core::from_windows1252(page) : text;
}

QString with_plain_line_ends(QString text)
{
    return text.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n');
}

} // namespace

OwnFile portrait_of_person(int person_id)
{
    return {Folder::portrait, u"%1.jpg"_s.arg(person_id)};
}

OwnFile portrait_of_family(int surname_id)
{
    return {Folder::portrait, u"F%1.jpg"_s.arg(surname_id)};
}

OwnFile notebook_of_person(int person_id)
{
    return {Folder::notebook, u"%1.fll"_s.arg(person_id)};
}

OwnFile notebook_of_family(int surname_id)
{
    return {Folder::notebook, u"F%1.fll"_s.arg(surname_id)};
}

std::vector<OwnFile> files_of_person(int person_id)
{
    return {portrait_of_person(person_id), notebook_of_person(person_id)};
}

std::vector<OwnFile> files_of_family(int surname_id)
{
    return {portrait_of_family(surname_id), notebook_of_family(surname_id)};
}

void remove_files(const core::Paths& paths, const std::vector<OwnFile>& files)
{
    std::exception_ptr failure;
    for (const auto& [folder, wanted] : files) {
        for (const auto& name : core::spellings(wanted)) {
            try {
                core::remove_file(paths.folder(folder) + name);
            } catch (const core::FileError&) {
                failure = failure ? failure : std::current_exception();
            }
        }
    }
    if (failure)
        std::rethrow_exception(failure);
}

void set_portrait(const core::Paths& paths, const OwnFile& portrait, const std::optional<QByteArray>& jpeg)
{
    if (!jpeg)
        return remove_files(paths, {portrait});
    core::make_folder(paths.folder(portrait.folder));
    core::write_file(path_of(paths, portrait), *jpeg);
}

QString attach_sound(const core::Paths& paths, const QString& file)
{
    const QFileInfo chosen(file);
    const auto folder = paths.folder(Folder::audio);
    if (QFileInfo(folder) == QFileInfo(chosen.absolutePath() + u'/'))
        return chosen.fileName();
    core::make_folder(folder);
    QString name = chosen.fileName();
    for (int copy = 2; QFileInfo::exists(folder + name); ++copy)
        name = u"%1 (%2).%3"_s.arg(chosen.completeBaseName()).arg(copy).arg(chosen.suffix());
    core::copy_file(file, folder + name);
    return name;
}

QString read_notebook(const core::Paths& paths, const OwnFile& page)
{
    const auto content = core::read_file(path_of(paths, page));
    return content ? with_plain_line_ends(text_of(*content)) : QString();
}

void write_notebook(const core::Paths& paths, const OwnFile& page, const QString& text)
{
    if (text.isEmpty())
        return remove_files(paths, {page});
    core::make_folder(paths.folder(page.folder));
    const auto lines = with_plain_line_ends(text).replace(u'\n', u"\r\n"_s);
    core::write_file(path_of(paths, page), lines.toUtf8());
}

} // namespace kindrel::people

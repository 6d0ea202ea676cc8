#pragma once

#include "core/paths.h"
#include "people/records.h"

namespace kindrel::people {

/// Photographs are `Portrait/<person_id>.jpg`, of a family `F<surname_id>.jpg`; notebook pages are
/// `NBook/<person_id>.fll` and `F<surname_id>.fll`.
struct OwnFile
{
    core::Folder folder;
    QString name;
};

[[nodiscard]] OwnFile portrait_of_person(int person_id);
[[nodiscard]] OwnFile portrait_of_family(int surname_id);
[[nodiscard]] OwnFile notebook_of_person(int person_id);
[[nodiscard]] OwnFile notebook_of_family(int surname_id);
/// Those of a person, and of a family without its people, whether they are there or not.
[[nodiscard]] std::vector<OwnFile> files_of_person(int person_id);
[[nodiscard]] std::vector<OwnFile> files_of_family(int surname_id);

/// Deletes those that are there. Throws core::FileError at the first that cannot be deleted, after trying all.
void remove_files(const core::Paths& paths, const std::vector<OwnFile>& files);

/// Puts a photograph in place of an earlier one; null removes it. `jpeg` is the file's content. Throws core::FileError.
void set_portrait(const core::Paths& paths, const OwnFile& portrait, const std::optional<QByteArray>& jpeg);

/// Copies a sound into the church's `Audio` folder under a name that is free there, which comes back: what a family's
/// `audio_note` keeps. A sound that lies there already stays as it is. Throws core::FileError.
[[nodiscard]] QString attach_sound(const core::Paths& paths, const QString& file);

/// The page's text; empty when there is none yet.
[[nodiscard]] QString read_notebook(const core::Paths& paths, const OwnFile& page);
/// An empty text removes the page. Throws core::FileError.
void write_notebook(const core::Paths& paths, const OwnFile& page, const QString& text);

} // namespace kindrel::people

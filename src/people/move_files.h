#pragma once

#include "core/paths.h"
#include "core/session.h"
#include "people/move_keys.h"

namespace kindrel::people {

/// A church as a move sees it: its folders and its database.
struct Place
{
    const core::Paths& paths;
    core::Session& session;
};

/// Lays copies of the photographs and notebook pages under the new keys in the other church's folders, in place of what
/// an earlier try left there. Throws core::FileError.
void copy_own_files(const core::Paths& here, const core::Paths& there, const Passage& passage);
/// Removes the files of these keys whose family or person the church does not have. Throws core::FileError.
void remove_left_files(const Place& place, int surname_id, const QList<int>& person_ids);

} // namespace kindrel::people

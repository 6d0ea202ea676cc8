#pragma once

#include "pages/page.h"

#include <QByteArray>

#include <functional>

namespace kindrel::pages {

/// A page as bytes, each text style once; pictures go as their keys. Only for the run that wrote it: the layout follows
/// the machine's.
[[nodiscard]] QByteArray packed(const Page& page);
/// `picture` finds the content of a key.
[[nodiscard]] Page unpacked(const QByteArray& bytes, const std::function<Picture(const QByteArray& key)>& picture);

} // namespace kindrel::pages

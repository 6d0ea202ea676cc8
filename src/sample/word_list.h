#pragma once

#include <QByteArray>
#include <QStringList>

#include <vector>

namespace kindrel::sample {

/// A file of the `sample` folder, all of which are compiled in.
[[nodiscard]] QByteArray read_sample(const QString& name);
/// The lines of one of the lists that are compiled in, each cut at its bars; remarks and empty lines are left out.
[[nodiscard]] std::vector<QStringList> read_list(const QString& name);
/// The first column alone.
[[nodiscard]] QStringList read_words(const QString& name);

} // namespace kindrel::sample

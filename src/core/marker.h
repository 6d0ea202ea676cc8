#pragma once

#include "core/side_file.h"

#include <utility>

namespace kindrel::core {

/// A marker file, there for as long as this object lives: `side_files::busy` around every operation on the whole
/// database, `side_files::opening` while a workstation opens it.
class Marker
{
public:
    /// Nullopt when the file is there already. Of several workstations only one gets it. Throws FileError when it
    /// cannot be written.
    [[nodiscard]] static std::optional<Marker> take(const Paths& paths, const SideFile& file);
    Marker(Marker&& other) noexcept : m_file(std::exchange(other.m_file, {})) {}
    Marker& operator=(Marker&&) = delete;
    ~Marker();

private:
    explicit Marker(QString file) : m_file(std::move(file)) {}

    QString m_file;
};

} // namespace kindrel::core

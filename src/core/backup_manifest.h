#pragma once

#include "core/session.h"

#include <QDateTime>
#include <QMap>

#include <optional>

namespace kindrel::core {

/// A church at one moment, in figures.
struct ChurchSummary
{
    int church = 1;
    QString church_name;
    QString church_code; ///< Empty until the church is first backed up.
    int schema = 0;
    std::optional<Date> last_change;
    QMap<QString, qint64> rows; ///< By the names of tables, in small letters.
};

/// Reads church_code, schema and the rows of `tables`, and with `tbl_surname` the last change. Throws DatabaseError.
[[nodiscard]] ChurchSummary summary_of(Session& session, const QStringList& tables);
/// The tables that there are, sorted by their names.
[[nodiscard]] QStringList tables_of(Session& session);

struct ManifestEntry
{
    QString name;
    qint64 size = 0;
    QByteArray sha256; ///< In hexadecimal digits.
    friend bool operator==(const ManifestEntry&, const ManifestEntry&) = default;
};

/// What an archive says of itself.
struct Manifest
{
    ChurchSummary church;
    QDateTime made;
    int edition = 0;
    QStringList parts; ///< Folders that were taken in, empty ones too.
    std::vector<ManifestEntry> entries;

    [[nodiscard]] QByteArray to_json() const;
    /// Throws BackupError.
    [[nodiscard]] static Manifest from_json(const QByteArray& json);
    [[nodiscard]] qint64 bytes() const;
};

/// Gives a church without a code one, drawn at random, and tells the code.
QString provide_church_code(Session& session);

} // namespace kindrel::core

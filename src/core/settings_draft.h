#pragma once

#include "core/session.h"
#include "core/settings.h"

#include <span>
#include <variant>

namespace kindrel::core {

/// A field of `tbl_startup` that a setup page alters.
struct SettingField
{
    const char16_t* name;
    std::variant<int Settings::*, bool Settings::*, QString Settings::*> member;
    bool from_next_start = false; ///< What is open would mix the old value with the new one.
};

/// Some of the church's settings while they are being altered. Lines of a text end in a line feed here, and in the
/// database as other programs write them.
class SettingsDraft
{
public:
    /// Reads what is stored now; another workstation may have changed it since start-up. `fields` must outlive the
    /// draft.
    SettingsDraft(Session& session, std::span<const SettingField> fields);

    Settings edited;
    [[nodiscard]] const Settings& stored() const { return m_stored; }
    [[nodiscard]] bool altered() const;
    /// By the field's stored name.
    [[nodiscard]] bool altered(QStringView field) const;

    /// Writes what was altered and nothing else, to be called in a transaction. Throws DatabaseError.
    void write(Session& session) const;
    /// After the commit: the draft holds what the church has now, others' changes among it, and so does `used` but for
    /// what waits for the next start.
    void follow(Session& session, Settings& used);

private:
    [[nodiscard]] bool differs(const SettingField& field) const;

    std::span<const SettingField> m_fields;
    Settings m_stored;
};

} // namespace kindrel::core

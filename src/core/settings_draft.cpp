#include "core/settings_draft.h"

#include <algorithm>
#include <type_traits>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

QString with_line_feeds(QString text)
{
    return text.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n');
}

void set_line_ends(Settings& settings, std::span<const SettingField> fields)
{
    for (const auto& field : fields)
        if (const auto* text = std::get_if<QString Settings::*>(&field.member))
            settings.** text = with_line_feeds(settings.**text);
}

Settings read_for_editing(Session& session, std::span<const SettingField> fields)
{
    Settings settings = read_settings(session);
    set_line_ends(settings, fields);
    return settings;
}

template <class V>
void write_value(Session& session, const QString& field, const V& value)
{
    if constexpr (std::is_same_v<V, QString>)
        write_setting(session, field, QString(value).replace(u"\n"_s, u"\r\n"_s));
    else
        write_setting(session, field, value);
}

} // namespace

SettingsDraft::SettingsDraft(Session& session, std::span<const SettingField> fields)
    : edited(read_for_editing(session, fields)), m_fields(fields), m_stored(edited)
{
}

bool SettingsDraft::differs(const SettingField& field) const
{
    return std::visit([&](auto member) { return edited.*member != m_stored.*member; }, field.member);
}

bool SettingsDraft::altered() const
{
    return std::ranges::any_of(m_fields, [this](const SettingField& field) { return differs(field); });
}

bool SettingsDraft::altered(QStringView name) const
{
    return std::ranges::any_of(m_fields,
                               [&](const SettingField& field) { return name == field.name && differs(field); });
}

void SettingsDraft::write(Session& session) const
{
    for (const auto& field : m_fields) {
        if (!differs(field))
            continue;
        const auto name = QString::fromUtf16(field.name);
        std::visit([&](auto member) { write_value(session, name, edited.*member); }, field.member);
    }
}

void SettingsDraft::follow(Session& session, Settings& used)
{
    edited = m_stored = read_for_editing(session, m_fields);
    for (const auto& field : m_fields)
        if (!field.from_next_start)
            std::visit([&](auto member) { used.*member = m_stored.*member; }, field.member);
}

} // namespace kindrel::core

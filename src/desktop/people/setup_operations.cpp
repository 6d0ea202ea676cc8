#include "desktop/people/setup_operations.h"

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SetupKind;

namespace {

/// What one item of each list is called, in the order of the lists.
constexpr std::array<QStringView, people::setup_list_count> item_names{
    u"Status",       u"Group",       u"Ministry", u"Personal Date", u"Flexi Field",
    u"Family Group", u"Family Date", u"Title",    u"Occupation",    u"Suburb"};

} // namespace

QStringList setup_fields(SetupKind kind)
{
    QStringList fields{item_names[static_cast<std::size_t>(kind)].toString()};
    if (kind == SetupKind::suburbs)
        fields += u"Postcode"_s;
    return fields;
}

std::vector<int> setup_shares(SetupKind kind)
{
    const bool further = kind == SetupKind::suburbs || kind == SetupKind::groups;
    return further ? std::vector{58, 26, 16} : std::vector{84, 16};
}

ListCaptions SetupOperations::captions() const
{
    return {.fields = setup_fields(m_kind),
            .remark = m_kind == SetupKind::groups ? u"State"_s : QString(),
            .users = people::setup_list(m_kind).of_families() ? u"Families"_s : u"People"_s};
}

ListRow SetupOperations::row(int index) const
{
    const people::SetupItem& item = m_editor->list(m_kind)[index];
    ListRow row{.texts = {item.text}, .remark = item.not_active ? u"no longer meets"_s : QString()};
    if (m_kind == SetupKind::suburbs)
        row.texts += item.postcode;
    if (item.key != 0)
        row.users = item.users;
    return row;
}

bool SetupOperations::add(const QStringList& texts)
{
    return m_editor->add(m_kind, texts.value(0), texts.value(1));
}

int SetupOperations::faulty_field(const QStringList& texts) const
{
    return people::faulty_field(m_kind, texts.value(0), texts.value(1));
}

bool SetupOperations::rename(int index, const QStringList& texts)
{
    return m_editor->rename(m_kind, index, texts.value(0), texts.value(1));
}

std::optional<QString> SetupOperations::import()
{
    const auto count = m_editor->import(m_kind);
    return count ? std::optional(count->words()) : std::nullopt;
}

} // namespace kindrel::desktop

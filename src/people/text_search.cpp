#include "people/text_search.h"

#include "core/entry.h"
#include "people/field_labels.h"

#include <QSet>

#include <algorithm>
#include <array>
#include <span>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// In the order in which they are looked at.
constexpr std::array name_fields{"Name", "surname", "other_surname", "middle_name", "preferred_name"};
constexpr std::array all_fields{
    "Name",         "surname",        "other_surname",  "middle_name",  "phone",          "family_fax", "family_email",
    "mobile_phone", "Personal_email", "business_phone", "business_fax", "business_email", "res_street", "res_street2",
    "res_state",    "res_country",    "res_map",        "post_street",  "post_street2",   "post_state", "post_country"};

struct Walk
{
    QStringView query;
    std::span<const char* const> fields;
};

Walk walk_of(SearchFields fields)
{
    if (fields == SearchFields::names)
        return {u"qry_search_names", name_fields};
    return {u"qry_search_all", all_fields};
}

QString statement_of(const Walk& walk)
{
    QStringList columns{u"[Surname_ID]"_s, u"[person_id]"_s};
    for (const char* field : walk.fields)
        columns += u"[%1]"_s.arg(QLatin1StringView(field));
    return u"SELECT %1 FROM [%2] ORDER BY [sort_key],[Primary_name],[Surname_ID],[position];"_s.arg(columns.join(u','),
                                                                                                    walk.query);
}

/// The first field of the row that holds the text; null when none does. Blanks around a value make no difference, for
/// the text neither begins nor ends with one.
const char* field_with(const QString& upper_text, const core::Row& row, std::span<const char* const> fields)
{
    int column = 2;
    const auto found = std::ranges::find_if(
        fields, [&](const char*) { return row.text(core::Column{column++}).toUpper().contains(upper_text); });
    return found == fields.end() ? nullptr : *found;
}

std::vector<TextMatch> matches_of(core::Session& session, const QString& upper_text, const Walk& walk,
                                  const std::vector<int>& listed)
{
    QSet<int> still_wanted(listed.begin(), listed.end());
    std::vector<TextMatch> matches;
    auto rows = session.select(statement_of(walk));
    for (const core::Row& row : rows) {
        const int surname_id = row.integer(core::Column{0});
        if (!still_wanted.contains(surname_id))
            continue;
        if (const char* field = field_with(upper_text, row, walk.fields)) {
            matches.push_back({surname_id, row.integer(core::Column{1}), label_of(field)});
            still_wanted.remove(surname_id);
        }
    }
    return matches;
}

bool may_search(const core::Office& office, const QString& trimmed, const std::vector<int>& listed)
{
    if (!core::permitted(office, core::Area::search_for_family))
        return false;
    if (!listed.empty() && !trimmed.isEmpty())
        return true;
    office.dialogue.show({listed.empty() ? u"Unable to do a search as no families exist"_s
                                         : u"Please enter what you would like to search for first"_s});
    return false;
}

} // namespace

std::optional<TextMatch> TextSearch::next(const QString& text, SearchFields fields, const std::vector<int>& listed)
{
    Question question{text.trimmed().toUpper(), fields, listed};
    if (!may_search(m_office, question.text, listed)) {
        start_anew();
        return std::nullopt;
    }
    if (!under_way() || question != m_question) {
        m_question = std::move(question);
        m_matches = matches_of(*m_office.session, m_question.text, walk_of(fields), listed);
        m_next = 0;
    }
    if (m_next < m_matches.size())
        return m_matches[m_next++];
    start_anew();
    m_office.dialogue.show({u"Unable to find any families matching the search criteria entered"_s});
    return std::nullopt;
}

void TextSearch::start_anew()
{
    m_matches.clear();
    m_next = 0;
}

QString search_caption(bool under_way)
{
    return under_way ? u"&Search Next"_s : u"&Search"_s;
}

bool can_open(const core::Office& office, std::size_t listed)
{
    if (listed == 0)
        office.dialogue.show({u"No families exist for opening"_s});
    return listed > 0;
}

} // namespace kindrel::people

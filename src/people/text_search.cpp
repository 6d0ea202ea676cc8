#include "people/text_search.h"

#include "core/entry.h"

#include <QSet>

#include <algorithm>
#include <array>
#include <span>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

enum class Owner { person, family };

struct Field
{
    const char* column;
    QStringView words;
    Owner owner;
};

constexpr Field given{"Name", u"given name", Owner::person};
constexpr Field surname{"surname", u"surname", Owner::family};
constexpr Field other_surname{"other_surname", u"other surname", Owner::person};
constexpr Field middle{"middle_name", u"middle name", Owner::person};

/// In the order in which they are looked at.
constexpr std::array name_fields{given, surname, other_surname, middle,
                                 Field{"preferred_name", u"preferred name", Owner::person}};
constexpr std::array all_fields{given,
                                surname,
                                other_surname,
                                middle,
                                Field{"phone", u"phone", Owner::family},
                                Field{"family_fax", u"fax", Owner::family},
                                Field{"family_email", u"e-mail", Owner::family},
                                Field{"mobile_phone", u"mobile phone", Owner::person},
                                Field{"Personal_email", u"e-mail", Owner::person},
                                Field{"business_phone", u"business phone", Owner::person},
                                Field{"business_fax", u"business fax", Owner::person},
                                Field{"business_email", u"business e-mail", Owner::person},
                                Field{"res_street", u"street", Owner::family},
                                Field{"res_street2", u"second line of the street", Owner::family},
                                Field{"res_state", u"state", Owner::family},
                                Field{"res_country", u"country", Owner::family},
                                Field{"res_map", u"map", Owner::family},
                                Field{"post_street", u"postal street", Owner::family},
                                Field{"post_street2", u"second line of the postal street", Owner::family},
                                Field{"post_state", u"postal state", Owner::family},
                                Field{"post_country", u"postal country", Owner::family}};

struct Walk
{
    QStringView query;
    std::span<const Field> fields;
};

/// What stands before a walk's own fields, of which the given name is the first.
enum Fixed { key_of_family, key_of_person, first_field };

Walk walk_of(SearchFields fields)
{
    if (fields == SearchFields::names)
        return {u"qry_search_names", name_fields};
    return {u"qry_search_all", all_fields};
}

QString statement_of(const Walk& walk)
{
    QStringList columns{u"[Surname_ID]"_s, u"[person_id]"_s};
    for (const auto& field : walk.fields)
        columns += u"[%1]"_s.arg(QLatin1StringView(field.column));
    return u"SELECT %1 FROM [%2] ORDER BY [sort_key],[Primary_name],[Surname_ID],[position];"_s.arg(columns.join(u','),
                                                                                                    walk.query);
}

/// The first field of the row that holds the text; null when none does. Blanks around a value make no difference, for
/// the text neither begins nor ends with one.
const Field* field_with(const QString& upper_text, const core::Row& row, std::span<const Field> fields)
{
    int column = first_field;
    const auto found = std::ranges::find_if(
        fields, [&](const Field&) { return row.text(core::Column{column++}).toUpper().contains(upper_text); });
    return found == fields.end() ? nullptr : &*found;
}

std::vector<TextMatch> matches_of(core::Session& session, const QString& upper_text, const Walk& walk,
                                  const std::vector<int>& listed)
{
    QSet<int> still_wanted(listed.begin(), listed.end());
    std::vector<TextMatch> matches;
    auto rows = session.select(statement_of(walk));
    for (const core::Row& row : rows) {
        const int surname_id = row.integer(core::Column{key_of_family});
        if (!still_wanted.contains(surname_id))
            continue;
        if (const Field* field = field_with(upper_text, row, walk.fields)) {
            matches.push_back({surname_id, row.integer(core::Column{key_of_person}), field->words,
                               field->owner == Owner::person ? row.text(core::Column{first_field}) : QString()});
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
    std::ranges::sort(question.listed);
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

QString found_words(const TextMatch& match)
{
    const QString whose = match.person.isEmpty() ? u"the family"_s : match.person;
    return u"Found in the %1 of %2"_s.arg(match.field, whose);
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

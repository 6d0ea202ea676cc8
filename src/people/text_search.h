#pragma once

#include "core/office.h"

#include <optional>
#include <vector>

namespace kindrel::people {

/// Names alone, or names, phones, e-mail and addresses. Preferred names are looked at among the names alone.
enum class SearchFields { all, names };

/// A family in which the text was found, by the first of its people and the first of the fields that hold it.
struct TextMatch
{
    int surname_id = 0;
    int person_id = 0;
    QStringView field;   ///< In a sentence: "given name".
    QString person = {}; ///< The given name; empty where the field is the family's.

    friend bool operator==(const TextMatch&, const TextMatch&) = default;
};

/// Finds a text anywhere in the fields of families and people, one family after another in order of surname.
class TextSearch
{
public:
    explicit TextSearch(core::Office& office) : m_office(office) {}

    /// The next family among `listed`, whose order makes no difference; each is found once. Starts anew when anything
    /// asked for differs from before.
    /// Nullopt after saying why there is none; what follows the last match is the first again. One statement for all
    /// matches of a text.
    [[nodiscard]] std::optional<TextMatch> next(const QString& text, SearchFields fields,
                                                const std::vector<int>& listed);
    /// A match was found, and next() goes on from it.
    [[nodiscard]] bool under_way() const { return m_next > 0; }
    /// Forgets where the search stands.
    void start_anew();

private:
    struct Question
    {
        QString text;
        SearchFields fields = SearchFields::all;
        std::vector<int> listed;

        friend bool operator==(const Question&, const Question&) = default;
    };

    core::Office& m_office;
    Question m_question;
    std::vector<TextMatch> m_matches;
    std::size_t m_next = 0;
};

/// "Found in the given name of Jasmine".
[[nodiscard]] QString found_words(const TextMatch& match);
/// The caption of the button that calls TextSearch::next().
[[nodiscard]] QString search_caption(bool under_way);
/// Whether a list has a family to be opened; otherwise says so.
[[nodiscard]] bool can_open(const core::Office& office, std::size_t listed);

} // namespace kindrel::people

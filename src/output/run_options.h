#pragma once

#include "core/settings.h"
#include "pages/page_setup.h"
#include "people/disclosed.h"

#include <optional>

namespace kindrel::output {

/// What stands in the head of every page beside the title.
struct HeadParts
{
    bool date = false;
    bool filters = false;
    bool church = false;
    bool logo = false;

    [[nodiscard]] static HeadParts of(const core::Settings& settings)
    {
        return {settings.title_date, settings.title_filters, settings.title_church, settings.title_logo};
    }
    friend bool operator==(const HeadParts&, const HeadParts&) = default;
};

/// Which address a run puts into its letters. `mailing` is the postal one, or the residential one where a family has
/// no postal one.
enum class LetterAddress { residential, postal, mailing };

/// How one run of a report differs from what the report and the church have set.
struct RunOptions
{
    pages::Paper paper = pages::Paper::a4;
    int text_percent = 100;             ///< Of the layout's own text size.
    QString title = {};                 ///< Empty: the report's own.
    std::optional<HeadParts> head = {}; ///< Unset: as the church has it.
    people::Details withheld = {};      ///< Left out beyond what is hidden anyway.
    LetterAddress address = LetterAddress::mailing;

    friend bool operator==(const RunOptions&, const RunOptions&) = default;
};

} // namespace kindrel::output

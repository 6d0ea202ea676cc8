#pragma once

#include "core/locks.h"
#include "output/catalogue.h"
#include "output/letters/letter_file.h"
#include "output/letters/letter_merge.h"

namespace kindrel::output {

/// A letter of the church's own or one that came as a plug-in.
struct CustomLetter
{
    QString file; ///< Its whole path.
    QString title;
    bool plugin = false;

    friend bool operator==(const CustomLetter&, const CustomLetter&) = default;
};

/// The "*.ltr" of the letter folder in the order of their names, then the plug-ins in that of their titles.
[[nodiscard]] std::vector<CustomLetter> custom_letters(const core::Office& office);

/// Said when all copies are printed.
[[nodiscard]] inline QString letters_printed()
{
    return QStringLiteral("Letter Printing is now completed");
}

/// Keeps a letter to this user in a church that several share, for as long as it lives. Elsewhere it holds nothing.
class LetterLock
{
public:
    /// Nullopt after telling that somebody has the letter.
    [[nodiscard]] static std::optional<LetterLock> take(core::Office& office, const QString& file);
    LetterLock(LetterLock&&) = default;
    LetterLock& operator=(LetterLock&&) = delete;
    ~LetterLock();

private:
    explicit LetterLock(const QString& name) : m_name(name) {}

    std::unique_ptr<core::Locks> m_locks; ///< Null while nothing is held.
    QString m_name;
};

/// The letter of the file, taken to pieces; nullopt after telling why it cannot be used.
[[nodiscard]] std::optional<LetterForm> usable_letter(core::Dialogue& dialogue, const QString& file);

/// One copy for each family of the input's list, each beginning on a new page. Asks nothing and checks nothing. False
/// when cancelled; the spool then stays open.
[[nodiscard]] bool write_letter(const LetterForm& letter, const ReportInput& input, core::Progress& progress,
                                pages::PageSpool& spool);

/// As run_report(). The letter is locked meanwhile; a letter with faults is refused before the first page.
[[nodiscard]] bool run_letter(const QString& file, const ReportInput& input, core::Progress& progress,
                              pages::PageSpool& spool);

} // namespace kindrel::output

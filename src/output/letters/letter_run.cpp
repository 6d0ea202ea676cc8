#include "output/letters/letter_run.h"

#include "core/entry.h"
#include "output/letters/letter_pages.h"
#include "output/list_reader.h"

#include <QDir>
#include <QFileInfo>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr QMarginsF letter_margins{72, 60, 72, 60};

constexpr auto in_use = u"Unable to do anything with this letter as another user is using it.";
constexpr auto one_user = u"To protect the integrity of your data, %1 only allows each custom letter to be used by one "
                          "user at a time. If no user is on the system then you will need to enter the 'Network "
                          "Setup' area to unlock the Custom Letter.";

core::Message held_elsewhere(core::Office& office, const QString& name)
{
    QStringList lines{QString::fromUtf16(one_user).replace(u"%1"_s, core::product.toString())};
    for (const auto& held : core::Locks(office).held({core::LockKind::custom_letter, core::LockKey(name)}))
        lines += core::held_line(held, office.day_order());
    return {QString::fromUtf16(in_use), lines.join(u'\n')};
}

/// Everything that can be refused before the letter itself is looked at.
bool may_run(const ReportInput& input)
{
    if (!core::permitted(input.office, core::Area::report_outputs))
        return false;
    if (input.list.members.empty())
        input.office.dialogue.show({u"No people found for creating a report"_s});
    return !input.list.members.empty();
}

} // namespace

std::vector<CustomLetter> custom_letters(const core::Office& office)
{
    std::vector<CustomLetter> letters;
    const QDir folder(office.paths.folder(core::Folder::letter));
    for (const auto& file : folder.entryInfoList({u"*.ltr"_s}, QDir::Files, QDir::Name | QDir::IgnoreCase))
        letters.push_back({file.filePath(), file.completeBaseName()});
    for (const auto& letter : office.plugins.letters)
        letters.push_back({office.paths.file(core::Folder::plugin_letters, letter.file), letter.title, true});
    return letters;
}

std::optional<LetterLock> LetterLock::take(core::Office& office, const QString& file)
{
    LetterLock lock(QFileInfo(file).completeBaseName());
    if (!office.shared())
        return lock;
    auto locks = std::make_unique<core::Locks>(office);
    if (!locks->take(core::LockKind::custom_letter, lock.m_name)) {
        office.dialogue.show(held_elsewhere(office, lock.m_name));
        return std::nullopt;
    }
    lock.m_locks = std::move(locks);
    return lock;
}

LetterLock::~LetterLock()
{
    if (m_locks)
        m_locks->release(core::LockKind::custom_letter, m_name);
}

std::optional<LetterForm> usable_letter(core::Dialogue& dialogue, const QString& file)
{
    const auto read = load_letter(file);
    if (!read.fault.isEmpty()) {
        dialogue.show({u"The letter \"%1\" cannot be used."_s.arg(QFileInfo(file).fileName()), read.fault});
        return std::nullopt;
    }
    LetterForm form(read.letter);
    if (const auto fault = form.fault()) {
        dialogue.show(*fault);
        return std::nullopt;
    }
    return form;
}

bool write_letter(const LetterForm& letter, const ReportInput& input, core::Progress& progress, pages::PageSpool& spool)
{
    const pages::PageSetup setup{.paper = input.options.paper, .margins = letter_margins};
    pages::Flow flow(spool, setup);
    LetterPages pages(letter, flow, input.options.text_percent);
    const auto today = input.office.clock.today();
    const auto write = [&](const ListedFamily& listed) {
        pages.write(letter.values(LetterFamily::of(listed.family, input.options.address, today)));
    };
    if (!for_each_family(input, progress, write, letter.extent()))
        return false;
    flow.finish();
    return true;
}

bool run_letter(const QString& file, const ReportInput& input, core::Progress& progress, pages::PageSpool& spool)
{
    if (!may_run(input))
        return false;
    const auto lock = LetterLock::take(input.office, file);
    if (!lock)
        return false;
    const auto letter = usable_letter(input.office.dialogue, file);
    return letter && write_letter(*letter, input, progress, spool);
}

} // namespace kindrel::output

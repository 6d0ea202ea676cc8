#include "desktop/mender/mender_questions.h"

#include "core/mender_words.h"

#include <QFileInfo>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::FileQuestion;

namespace {

namespace words = core::mender_words;

const QString church_files = u"Church files (*.kdl)"_s;

bool agreed(core::Dialogue& dialogue, const QString& question)
{
    return dialogue.confirm({.text = question, .icon = core::Icon::question}, core::Answer::no);
}

} // namespace

std::optional<RecoveryFiles> ask_for_recovery(core::Dialogue& dialogue, const Account& account,
                                              const QString& data_drive)
{
    const auto damaged = account.database.isEmpty()
                             ? dialogue.choose_file({u"The damaged church file"_s, church_files, data_drive})
                             : account.database;
    if (!damaged)
        return std::nullopt;
    const auto fresh = dialogue.choose_file({.title = u"A new church file for what can be read"_s,
                                             .filter = church_files,
                                             .suggested = QFileInfo(*damaged).path() + u"/KR10_records recovered.kdl"_s,
                                             .kind = FileQuestion::Kind::save});
    if (!fresh || !agreed(dialogue, words::recovering_question(*damaged, *fresh)))
        return std::nullopt;
    return RecoveryFiles{*damaged, *fresh};
}

std::optional<QString> ask_for_placing(core::Dialogue& dialogue, const Account& account, const MenderJob& job)
{
    const auto recovered =
        account.recovered.isEmpty()
            ? dialogue.choose_file({u"The recovered church file"_s, church_files, job.request.data_drive})
            : account.recovered;
    if (!recovered || !agreed(dialogue, words::placing_question(job.request.church, *recovered)))
        return std::nullopt;
    return recovered;
}

} // namespace kindrel::desktop

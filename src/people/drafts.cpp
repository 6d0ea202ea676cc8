#include "people/drafts.h"

#include "core/files.h"
#include "people/family_json.h"

#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QJsonDocument>

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

constexpr int draft_format = 1;

/// The church's number; on a network also which network, as a workstation may have a church of its own under the same
/// number.
QString church_name(const core::Office& office)
{
    const auto name = u"church%1"_s.arg(office.church);
    if (office.mode != core::Mode::network)
        return name;
    const auto place = office.paths.folder(core::Folder::church).toUtf8();
    const auto digest = QCryptographicHash::hash(place, QCryptographicHash::Sha256).toHex().left(8);
    return name + u'-' + QString::fromLatin1(digest);
}

QString file_of(const QString& folder, int surname_id)
{
    return folder + u"%1.draft"_s.arg(surname_id);
}

/// Closes the file to everyone else before anything is in it: what is written takes its place with its permissions.
/// A disk that knows no owners keeps the draft all the same.
void close_to_others(const QString& name)
{
    constexpr auto owner = QFileDevice::ReadOwner | QFileDevice::WriteOwner;
    QFile file(name);
    if (file.exists())
        file.setPermissions(owner);
    else
        (void)file.open(QIODevice::WriteOnly | QIODevice::NewOnly, owner);
}

QByteArray content_of(const Draft& draft)
{
    return QJsonDocument(QJsonObject{{u"format"_s, draft_format},
                                     {u"kept"_s, draft.kept.toMSecsSinceEpoch()},
                                     {u"stored"_s, to_json(draft.stored)},
                                     {u"typed"_s, to_json(draft.typed)}})
        .toJson(QJsonDocument::Compact);
}

std::optional<Draft> draft_of(const QByteArray& content)
{
    const auto object = QJsonDocument::fromJson(content).object();
    if (object.value(u"format"_s).toInt() != draft_format)
        return std::nullopt;
    auto stored = family_from_json(object.value(u"stored"_s).toObject());
    auto typed = family_from_json(object.value(u"typed"_s).toObject());
    if (!stored || !typed)
        return std::nullopt;
    return Draft{std::move(*stored), std::move(*typed),
                 QDateTime::fromMSecsSinceEpoch(object.value(u"kept"_s).toInteger())};
}

std::optional<Draft> read_draft(const QString& file)
{
    try {
        return draft_of(core::read_file(file).value_or(QByteArray()));
    } catch (const core::FileError&) {
        return std::nullopt;
    }
}

} // namespace

Drafts::Drafts(const core::Office& office)
    : m_folder(core::as_folder(office.paths.folder(core::Folder::local_settings) + u"Drafts/"_s + church_name(office)))
{
}

void Drafts::keep(const Draft& draft) const
{
    core::make_folder(m_folder);
    const auto file = file_of(m_folder, draft.stored.family.Surname_ID);
    close_to_others(file);
    core::write_file(file, content_of(draft));
}

void Drafts::forget(int surname_id) const
{
    core::remove_file(file_of(m_folder, surname_id));
}

std::vector<Draft> Drafts::all() const
{
    std::vector<Draft> found;
    for (const auto& name : QDir(m_folder).entryList({u"*.draft"_s}, QDir::Files, QDir::Name)) {
        if (auto draft = read_draft(m_folder + name))
            found.push_back(std::move(*draft));
    }
    std::ranges::stable_sort(found, std::greater{}, &Draft::kept);
    return found;
}

} // namespace kindrel::people

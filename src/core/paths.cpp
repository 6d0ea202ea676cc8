#include "core/paths.h"

#include "core/files.h"

#include <QDir>
#include <QFileInfo>
#include <QStringList>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// What a folder's name is added to. `moved` is the data root of the mode: a folder of its own for the training data
/// and for the booked-out data, the data root itself otherwise.
enum class Base { program, local, root, moved, church };

struct Place
{
    Folder folder;
    const char16_t* name;
    Base normal;
    Base training;
    Base booked_out;
};

constexpr std::array places{
    Place{Folder::program, u"", Base::program, Base::program, Base::program},
    Place{Folder::data_root, u"", Base::moved, Base::moved, Base::moved},
    Place{Folder::local_settings, u"Local_settings", Base::local, Base::local, Base::local},
    Place{Folder::church, u"", Base::church, Base::church, Base::church},
    Place{Folder::roster_history, u"Roster_history", Base::church, Base::church, Base::church},
    Place{Folder::notebook, u"NBook", Base::church, Base::church, Base::church},
    Place{Folder::portrait, u"Portrait", Base::church, Base::church, Base::church},
    Place{Folder::global, u"Global", Base::root, Base::moved, Base::moved},
    Place{Folder::audio, u"Audio", Base::root, Base::root, Base::root},
    Place{Folder::wardline, u"Wardline", Base::root, Base::moved, Base::root},
    Place{Folder::images, u"images", Base::root, Base::moved, Base::moved},
    Place{Folder::letter, u"letter", Base::root, Base::moved, Base::moved},
    Place{Folder::reports, u"Reports", Base::root, Base::moved, Base::moved},
    Place{Folder::custom, u"custom", Base::root, Base::moved, Base::moved},
    Place{Folder::plugin_reports, u"plugin reports", Base::root, Base::root, Base::root},
    Place{Folder::plugin_letters, u"plugin letters", Base::root, Base::root, Base::root},
    Place{Folder::export_text, u"export", Base::root, Base::moved, Base::moved},
    Place{Folder::directory_setup, u"Directory Setup", Base::root, Base::root, Base::moved},
};
static_assert(places.size() == folder_count);

QString inside(const QString& folder, const QString& name)
{
    return as_folder(folder + existing_name(folder, name));
}

Base base_of(const Place& place, Mode mode)
{
    switch (mode) {
    case Mode::training:
        return place.training;
    case Mode::booked_out:
        return place.booked_out;
    case Mode::normal:
    case Mode::network:
        break;
    }
    return place.normal;
}

QString moved_root(const QString& root, Mode mode)
{
    if (mode == Mode::training)
        return inside(root, u"Training"_s);
    return mode == Mode::booked_out ? inside(root, u"booked out"_s) : root;
}

constexpr int most_letters = 7;

/// A name of few letters is looked up in each spelling: listing a folder of 60,000 photographs for one that is not
/// there would take a tenth of a second.
QString existing_part(const QString& folder, const QString& name)
{
    if (QFileInfo::exists(folder + name))
        return name;
    const auto letters = std::ranges::count_if(name, [](QChar c) { return c.toLower() != c.toUpper(); });
    const bool few = letters <= most_letters;
    const auto names = few ? spellings(name)
                           : QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name);
    const auto is_it = [&](const QString& each) {
        return few ? QFileInfo::exists(folder + each) : each.compare(name, Qt::CaseInsensitive) == 0;
    };
    const auto found = std::ranges::find_if(names, is_it);
    return found == names.end() ? name : *found;
}

} // namespace

Paths::Paths(const QString& program_folder, const QString& data_drive, const QString& root, Mode mode, int church)
    : m_data_drive(as_folder(data_drive))
{
    const QString own_root = as_folder(root);
    const QString moved = moved_root(own_root, mode);
    const std::array bases{
        as_folder(program_folder),
        inside(m_data_drive, data_folder.toString()),
        own_root,
        moved,
        moved == own_root ? inside(own_root, u"church%1"_s.arg(church)) : moved,
    };
    for (const auto& place : places) {
        const auto& base = bases[static_cast<std::size_t>(base_of(place, mode))];
        const auto name = QString::fromUtf16(place.name);
        m_folders[static_cast<std::size_t>(place.folder)] = name.isEmpty() ? base : inside(base, name);
    }
}

QString Paths::file(Folder folder, const QString& name) const
{
    return this->folder(folder) + existing_name(this->folder(folder), name);
}

bool Paths::exists(Folder folder, const QString& name) const
{
    return QFileInfo::exists(file(folder, name));
}

QString Paths::database() const
{
    return file(Folder::church, u"KR10_records.kdl"_s);
}

QStringList spellings(const QString& name)
{
    QStringList found{QString()};
    for (const QChar c : name) {
        const QChar other = c.isUpper() ? c.toLower() : c.toUpper();
        const auto begun = found.size();
        for (qsizetype i = 0; other != c && i < begun; ++i)
            found += found[i] + other;
        for (qsizetype i = 0; i < begun; ++i)
            found[i] += c;
    }
    return found;
}

QString existing_name(const QString& folder, const QString& name)
{
    QString found;
    for (const auto& part : name.split(u'/')) {
        const QString start = found.isEmpty() ? found : as_folder(found);
        found = start + existing_part(as_folder(folder) + start, part);
    }
    return found;
}

} // namespace kindrel::core

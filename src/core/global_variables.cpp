#include "core/global_variables.h"

#include "core/entry.h"
#include "core/logo.h"
#include "core/open_church.h"
#include "core/windows1252.h"

#include <QFileInfo>

#include <algorithm>
#include <vector>

namespace kindrel::core {

using namespace Qt::StringLiterals;

/// Files that belong together: unless kept, they are put back as they were.
class WrittenFiles
{
public:
    WrittenFiles() = default;
    WrittenFiles(const WrittenFiles&) = delete;
    WrittenFiles& operator=(const WrittenFiles&) = delete;
    ~WrittenFiles()
    {
        for (const auto& [file, content] : m_before)
            put_back(file, content);
    }

    /// Throws FileError.
    void write(const QString& file, const QByteArray& content)
    {
        auto before = read_file(file);
        write_file(file, content);
        m_before.emplace_back(file, std::move(before));
    }
    void write(const Paths& paths, const SideRecord& record)
    {
        write(paths.file(record.file().folder, QLatin1String(record.file().name)), record.bytes());
    }
    void keep() { m_before.clear(); }

private:
    static void put_back(const QString& file, const std::optional<QByteArray>& content)
    {
        try {
            content ? write_file(file, *content) : remove_file(file);
        } catch (const FileError&) { // The failure that led here is told already.
        }
    }

    std::vector<std::pair<QString, std::optional<QByteArray>>> m_before;
};

namespace {

constexpr std::array fields{
    SettingField{u"American_date", &Settings::American_date, true}, // A date typed before must not be read anew.
    SettingField{u"use_preferred_names", &Settings::use_preferred_names},
    SettingField{u"pin_auto_number_start", &Settings::pin_auto_number_start},
    SettingField{u"title_date", &Settings::title_date},
    SettingField{u"title_filters", &Settings::title_filters},
    SettingField{u"title_church", &Settings::title_church},
    SettingField{u"title_logo", &Settings::title_logo},
};

constexpr int longest_name = 20; ///< In either of the files that hold a logo's name.
constexpr int longest_suffix = 5;

const QString pin_refused = u"The next P.I.N. Number must be from 1 to %1."_s;
const QString starts_refused =
    u"The number of starts between compactions must be from 0 to %1, where 0 means never by itself."_s;
const QString no_picture = u"'%1' is not a picture that can be read."_s;
const QString no_picture_advice = u"A logo is a JPEG, PNG, BMP or GIF file."_s;

SideRecord read_now(const Paths& paths, const SideFile& file)
{
    return read_side_file(paths, file).value_or(SideRecord(file));
}

/// Without what a side file, or a file name on any system, cannot hold.
QString storable(const QString& text)
{
    QString kept;
    for (const QChar c : text.normalized(QString::NormalizationForm_C)) {
        const bool forbidden = c < u' ' || QStringView(u"\\/:*?\"<>|").contains(c) || !to_windows1252(QString(c));
        kept += forbidden ? QChar(u'_') : c;
    }
    return kept.trimmed();
}

/// Of at most `longest_name` characters; `copy` tells apart what would otherwise bear one name.
QString shortened(const QFileInfo& file, int copy)
{
    const QString ending = u'.' + storable(file.suffix()).left(longest_suffix);
    const QString mark = copy > 1 ? u" %1"_s.arg(copy) : QString();
    QString base = storable(file.completeBaseName());
    if (base.isEmpty())
        base = u"logo"_s;
    return base.left(longest_name - ending.size() - mark.size()).trimmed() + mark + ending;
}

/// Puts the picture among the church's pictures, beside those of other content, and tells its name there.
QString store_picture(const Paths& paths, const QString& chosen_file, const QByteArray& content, WrittenFiles& files)
{
    make_folder(paths.folder(Folder::images));
    for (int copy = 1;; ++copy) {
        const QString name = shortened(QFileInfo(chosen_file), copy);
        const QString path = paths.file(Folder::images, name);
        const auto there = read_file(path);
        if (there && *there != content)
            continue;
        if (!there)
            files.write(path, content);
        return QFileInfo(path).fileName();
    }
}

} // namespace

GlobalVariables::GlobalVariables(Office& office) : m_office(&office), m_draft(*office.session, fields)
{
    const SideRecord common = read_now(office.paths, side_files::common);
    m_starts = m_stored_starts = common.number("starts_between_compactions");
    const QString of_all = common.text("logo");
    const QString own = read_now(office.paths, side_files::workstation_logo).text("logo");
    logo(LogoOf::all_churches) = {.name = of_all, .stored_name = of_all};
    logo(LogoOf::workstation) = {.name = own, .stored_name = own};
}

std::optional<GlobalVariables> GlobalVariables::open(Office& office)
{
    if (!permitted(office, Area::global_data_setup))
        return std::nullopt;
    try {
        return GlobalVariables(office);
    } catch (const FileError& error) {
        office.dialogue.show({error.text()});
        return std::nullopt;
    }
}

QString GlobalVariables::logo_name(LogoOf whose) const
{
    return logo(whose).name;
}

bool GlobalVariables::choose_logo(LogoOf whose, const QString& file, const PictureTest& is_picture)
{
    const QString name = QFileInfo(file).fileName();
    try {
        const auto content = read_file(file);
        if (!content || !is_picture(*content)) {
            m_office->dialogue.show({no_picture.arg(name), no_picture_advice});
            return false;
        }
        logo(whose).name = name;
        logo(whose).chosen_file = file;
        logo(whose).content = *content;
        return true;
    } catch (const FileError& error) {
        m_office->dialogue.show({no_picture.arg(name), error.text()});
        return false;
    }
}

void GlobalVariables::remove_logo(LogoOf whose)
{
    logo(whose) = {.name = {}, .stored_name = logo(whose).stored_name};
}

QString GlobalVariables::path_of(LogoOf whose) const
{
    const Logo& wanted = logo(whose);
    if (!wanted.chosen_file.isEmpty())
        return wanted.chosen_file;
    return whose == LogoOf::workstation ? workstation_logo_path(m_office->paths, wanted.name)
                                        : logo_path(m_office->paths, wanted.name);
}

bool GlobalVariables::logo_missing(LogoOf whose) const
{
    return !logo(whose).name.isEmpty() && path_of(whose).isEmpty();
}

QString GlobalVariables::logo_in_use() const
{
    const QString own = path_of(LogoOf::workstation);
    return own.isEmpty() ? path_of(LogoOf::all_churches) : own;
}

bool GlobalVariables::waits_for_next_start() const
{
    return m_draft.stored().American_date != m_office->settings.American_date;
}

bool GlobalVariables::altered() const
{
    return m_draft.altered() || m_starts != m_stored_starts || std::ranges::any_of(m_logos, &Logo::altered);
}

bool GlobalVariables::accepted()
{
    const auto refuse = [this](const QString& field, const QString& refusal) {
        m_faulty = field;
        m_office->dialogue.show({refusal});
        return false;
    };
    const int pin = m_draft.edited.pin_auto_number_start;
    if (m_draft.altered(u"pin_auto_number_start") && (pin < 1 || pin > largest_pin_start))
        return refuse(u"pin_auto_number_start"_s, pin_refused.arg(largest_pin_start));
    if (m_starts != m_stored_starts && (m_starts < 0 || m_starts > most_starts_between_compactions))
        return refuse(u"starts_between_compactions"_s, starts_refused.arg(most_starts_between_compactions));
    m_faulty.clear();
    return true;
}

/// What others wrote into the files meanwhile stays, but for the fields that were altered here. Gives the options of
/// all churches as they are now.
SideRecord GlobalVariables::write_side_files(const std::array<Logo, 2>& logos, WrittenFiles& files) const
{
    const auto& [of_all, of_workstation] = logos;
    const Paths& paths = m_office->paths;
    SideRecord common = read_now(paths, side_files::common);
    if (m_starts != m_stored_starts)
        common.set_number("starts_between_compactions", m_starts);
    if (of_all.altered())
        common.set_text("logo", of_all.name);
    if (m_starts != m_stored_starts || of_all.altered())
        files.write(paths, common);
    if (of_workstation.altered()) {
        SideRecord own = read_now(paths, side_files::workstation_logo);
        own.set_text("logo", of_workstation.name);
        files.write(paths, own);
    }
    return common;
}

void GlobalVariables::write()
{
    WrittenFiles files;
    auto logos = m_logos;
    for (Logo& chosen : logos)
        if (!chosen.chosen_file.isEmpty())
            chosen.name = store_picture(m_office->paths, chosen.chosen_file, chosen.content, files);
    const SideRecord common = write_side_files(logos, files);
    Transaction transaction(*m_office->session);
    m_draft.write(*m_office->session);
    transaction.commit();
    files.keep();
    m_office->side.common = common;
    m_logos = logos;
}

bool GlobalVariables::save()
{
    if (!accepted() || !network_guard(*m_office))
        return false;
    try {
        write();
    } catch (const FileError& error) {
        m_office->dialogue.show({error.text()});
        return false;
    }
    m_starts = m_stored_starts = m_office->side.common.number("starts_between_compactions");
    logo(LogoOf::all_churches).name = m_office->side.common.text("logo");
    for (Logo& saved : m_logos)
        saved = {.name = saved.name, .stored_name = saved.name};
    m_office->logo = logo_in_use();
    m_draft.follow(*m_office->session, m_office->settings);
    return true;
}

} // namespace kindrel::core

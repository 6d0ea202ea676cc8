#pragma once

#include "core/office.h"
#include "core/settings_draft.h"

#include <array>
#include <functional>

namespace kindrel::core {

class WrittenFiles;

enum class LogoOf { all_churches, workstation };

inline constexpr int largest_pin_start = 999'999'999;
inline constexpr int most_starts_between_compactions = 999;

/// The options that hold everywhere in the program, and the logo on reports. Whatever refuses has said why.
class GlobalVariables
{
public:
    /// Whether a file's content is a picture that reports can show.
    using PictureTest = std::function<bool(const QByteArray& content)>;

    /// Nullopt without the right, or when the files of options cannot be read.
    [[nodiscard]] static std::optional<GlobalVariables> open(Office& office);

    /// All settings of the church as they would be saved now. Only the options of this area are ever written.
    [[nodiscard]] Settings& settings() { return m_draft.edited; }
    /// Starts of the program between two compactions; 0: never by itself.
    [[nodiscard]] int starts_between_compactions() const { return m_starts; }
    void set_starts_between_compactions(int starts) { m_starts = starts; }

    /// Empty when there is none.
    [[nodiscard]] QString logo_name(LogoOf whose) const;
    /// A logo is named whose picture is not where logos lie.
    [[nodiscard]] bool logo_missing(LogoOf whose) const;
    /// Takes up the file's content as it is now; it is stored by save().
    bool choose_logo(LogoOf whose, const QString& file, const PictureTest& is_picture);
    void remove_logo(LogoOf whose);
    /// Whole path of the picture that reports of this workstation will bear; empty for none.
    [[nodiscard]] QString logo_in_use() const;

    [[nodiscard]] bool altered() const;
    /// Writes what was altered and gives it to the office. When any of it is refused or cannot be written, files and
    /// database are as they were. Throws DatabaseError; where it says that a change may have been stored, the files are
    /// as they were and the database alone may have it.
    [[nodiscard]] bool save();
    /// The stored order of day and month is not the one in use: it changes when the program is started again.
    [[nodiscard]] bool waits_for_next_start() const;
    /// The stored name of the field that save() refused last.
    [[nodiscard]] QString faulty() const { return m_faulty; }

private:
    /// As it will be: the file `name` with the church's pictures, or one to be copied there.
    struct Logo
    {
        QString name;
        QString stored_name = {};
        QString chosen_file = {}; ///< Empty when none was chosen.
        QByteArray content = {};

        [[nodiscard]] bool altered() const { return !chosen_file.isEmpty() || name != stored_name; }
    };

    explicit GlobalVariables(Office& office);
    [[nodiscard]] const Logo& logo(LogoOf whose) const { return m_logos[static_cast<std::size_t>(whose)]; }
    [[nodiscard]] Logo& logo(LogoOf whose) { return m_logos[static_cast<std::size_t>(whose)]; }
    [[nodiscard]] QString path_of(LogoOf whose) const;
    [[nodiscard]] bool accepted();
    [[nodiscard]] SideRecord write_side_files(const std::array<Logo, 2>& logos, WrittenFiles& files) const;
    void write();

    Office* m_office;
    SettingsDraft m_draft;
    int m_starts = 0;
    int m_stored_starts = 0;
    std::array<Logo, 2> m_logos;
    QString m_faulty;
};

} // namespace kindrel::core

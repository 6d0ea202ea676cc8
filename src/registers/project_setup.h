#pragma once

#include "core/office.h"
#include "core/ordered_list.h"
#include "registers/figures.h"
#include "registers/register_kind.h"

#include <QStringList>

#include <array>
#include <functional>
#include <optional>

namespace kindrel::registers {

inline constexpr int service_count = 7;
inline constexpr int absence_count = 4;
inline constexpr int most_categories = 200;

/// A category as it is set up.
struct CategoryItem
{
    int key = 0; ///< 0 until it is saved.
    QString name;

    friend bool operator==(const CategoryItem&, const CategoryItem&) = default;
};
using CategoryList = core::OrderedList<CategoryItem>;

/// A project as it is set up. Marks are stored by the number of their service, so services and absences keep their
/// places; one without a name does not exist.
struct ProjectItem
{
    int key = 0; ///< 0 until it is saved.
    QString name;
    std::array<QString, service_count> services;   ///< Of a roll project.
    std::array<QString, absence_count> absences;   ///< Of a roll project.
    std::array<bool, absence_count> include{};     ///< Whether the absence counts as an attendance in analyses.
    std::vector<CategoryItem> attendance, finance; ///< The categories of a weekly project, each kind in its order.

    [[nodiscard]] std::vector<CategoryItem>& categories(FigureKind kind)
    {
        return kind == FigureKind::attendance ? attendance : finance;
    }
    [[nodiscard]] const std::vector<CategoryItem>& categories(FigureKind kind) const
    {
        return kind == FigureKind::attendance ? attendance : finance;
    }

    friend bool operator==(const ProjectItem&, const ProjectItem&) = default;
};
using ProjectList = core::OrderedList<ProjectItem>;

/// The projects of the three registers in memory: nothing is written before save(), and destroying it drops every
/// change. Operations say what stands in their way, then return false and change nothing. Indices count from 0, and -1
/// means that nothing is chosen. Throws core::DatabaseError.
class ProjectSetup
{
public:
    explicit ProjectSetup(core::Office& office);

    [[nodiscard]] const ProjectList& list(Kind kind) const { return m_lists[static_cast<std::size_t>(kind)]; }

    /// At the end of the list.
    [[nodiscard]] bool add(Kind kind, const QString& name);
    [[nodiscard]] bool rename(Kind kind, int index, const QString& name);
    /// Asks first. The records go when it is saved.
    [[nodiscard]] bool remove(Kind kind, int index);
    [[nodiscard]] bool move_up(Kind kind, int index);
    [[nodiscard]] bool move_down(Kind kind, int index);

    // Of a roll project. An empty name takes the service or absence away; asks first where it has marks.
    [[nodiscard]] bool set_service(int project, int place, const QString& name);
    [[nodiscard]] bool set_absence(int project, int place, const QString& name);
    [[nodiscard]] bool set_include(int project, int place, bool include);

    // Of a weekly project.
    [[nodiscard]] const std::vector<CategoryItem>& categories(int project, FigureKind kind) const;
    [[nodiscard]] bool add_category(int project, FigureKind kind, const QString& name);
    [[nodiscard]] bool rename_category(int project, FigureKind kind, int index, const QString& name);
    /// Asks first. The figures go when it is saved.
    [[nodiscard]] bool remove_category(int project, FigureKind kind, int index);
    [[nodiscard]] bool move_category_up(int project, FigureKind kind, int index);
    [[nodiscard]] bool move_category_down(int project, FigureKind kind, int index);

    /// The project that the last check() found incomplete.
    struct Faulty
    {
        Kind kind;
        int project;
    };
    /// Whether every project is complete, so that the screen may be left; otherwise says what is missing.
    [[nodiscard]] bool check();
    [[nodiscard]] const std::optional<Faulty>& faulty() const { return m_faulty; }

    [[nodiscard]] bool altered() const;
    /// Back to what was read; nothing is read anew.
    void drop();
    /// All lists in one transaction, once check() agrees. Refused, and nothing is written, when others have changed the
    /// projects since they were read.
    [[nodiscard]] bool save();

private:
    [[nodiscard]] bool refuse(const QString& text, const QString& more = {}) const;
    [[nodiscard]] bool fits(const QString& name, const QStringList& others) const;
    [[nodiscard]] bool roll_chosen(int project) const;
    /// What the services and the absences differ in.
    template <std::size_t Count>
    struct RollPart
    {
        QStringView what;
        std::array<QString, Count> ProjectItem::*names;
        QString (*told)(core::Session& session, int project, int number);
    };
    template <std::size_t Count>
    [[nodiscard]] bool set_name(int project, int place, const QString& name, const RollPart<Count>& part);
    /// Asks where there is something to be told.
    [[nodiscard]] bool may_empty(QStringView what, const QString& name, const QString& told) const;
    [[nodiscard]] bool weekly_chosen(int project) const;
    /// Moves within a copy of the categories and puts it back.
    [[nodiscard]] bool move_category(int project, FigureKind kind, int index, bool up);
    void change(Kind kind, int project, const std::function<void(ProjectItem&)>& make);
    using AllItems = std::array<std::vector<ProjectItem>, kinds.size()>;
    /// What is altered, in one transaction; false when others have changed it since it was read.
    [[nodiscard]] bool write(const AllItems& items);
    [[nodiscard]] ProjectList& at(Kind kind) { return m_lists[static_cast<std::size_t>(kind)]; }

    core::Office& m_office;
    std::array<ProjectList, kinds.size()> m_lists;
    std::optional<Faulty> m_faulty;
};

} // namespace kindrel::registers

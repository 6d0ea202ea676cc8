#pragma once

#include "core/office.h"
#include "registers/projects.h"

#include <optional>

namespace kindrel::registers {

/// A date of a project.
struct RegisterDate
{
    int key = 0;
    core::Date date;

    friend bool operator==(const RegisterDate&, const RegisterDate&) = default;
};

/// A project's dates with their rows, one of them open at a time. The project's lock is held from opening a date until
/// leaving it, so that one workstation at a time writes to a project. Operations say what stands in their way, then
/// return false and change nothing. Throws core::DatabaseError. A register left open is released by the destructor, and
/// what was not saved is lost.
class DatedRegister
{
public:
    DatedRegister(core::Office& office, const RegisterKind& kind);
    DatedRegister(const DatedRegister&) = delete;
    DatedRegister& operator=(const DatedRegister&) = delete;
    virtual ~DatedRegister();

    [[nodiscard]] const RegisterKind& kind() const { return m_kind; }

    /// Reads the projects and chooses the one last worked in. Comes before everything else.
    [[nodiscard]] virtual bool enter();
    /// Whether the last enter() found that no project is set up, rather than that it could not read them.
    [[nodiscard]] bool none_set_up() const { return m_none_set_up; }
    [[nodiscard]] const std::vector<Project>& projects() const { return m_projects; }
    /// The key of the chosen project; 0 before entering.
    [[nodiscard]] int project() const { return m_project; }
    /// Leaves the open date first.
    [[nodiscard]] bool choose_project(int key);

    /// Of the chosen project, newest first.
    [[nodiscard]] const std::vector<RegisterDate>& dates() const { return m_dates; }
    /// Reads the dates again, as another workstation may have added some.
    void refresh_dates();
    /// What to tell beside a date that is about to be added: that it lies in the future, or not on the weekday of most
    /// of the last twelve dates. Empty when nothing is odd.
    [[nodiscard]] QString date_note(const core::Date& date) const;

    [[nodiscard]] const std::optional<RegisterDate>& open_date() const { return m_open; }
    /// 0: none was chosen. Unsaved work on the date before is offered for saving first.
    [[nodiscard]] bool open(int date_key);
    /// Adds the date to the project and opens it.
    [[nodiscard]] bool add(const core::Date& date);
    /// Gives the open date, with everything on it, another day.
    [[nodiscard]] bool change_date(const core::Date& date);
    /// Asks first; the date goes with its rows and its note. 0: none was chosen.
    [[nodiscard]] bool remove(int date_key);

    /// Whether the open date bears work that is not stored.
    [[nodiscard]] virtual bool altered() const = 0;
    /// All of it or nothing. Refused when the date was removed or, after the lock was taken away, changed elsewhere.
    [[nodiscard]] bool save();
    /// Closes the date and gives the lock back. Unsaved work is offered for saving first; false when the person stays.
    [[nodiscard]] bool leave();

protected:
    /// Of the open date, outside of any transaction.
    virtual void load_rows() = 0;
    /// Of the open date, inside the transaction. What is in memory must not change.
    virtual void save_rows() = 0;
    /// What stands in memory is stored now. Neither this nor dropping reads anything.
    virtual void keep_rows() = 0;
    /// What was typed since the rows were loaded or kept is forgotten.
    virtual void drop_rows() = 0;
    /// No date is open any more.
    virtual void clear_rows() = 0;
    /// The open date has got another day; what was typed stays.
    virtual void date_moved() {}
    /// Whether what the rows stand on (services, categories) is as it was loaded. Asked before each save.
    [[nodiscard]] virtual bool setup_unchanged() { return true; }

    [[nodiscard]] bool refuse(const QString& text, const QString& more = {}) const;
    [[nodiscard]] core::Office& office() const { return m_office; }
    [[nodiscard]] core::Session& session() const { return *m_office.session; }

private:
    enum class Standing { good, removed, lost, changed };

    [[nodiscard]] bool may_work() const;
    /// Offers unsaved work for saving; false when the person stays.
    [[nodiscard]] bool settle();
    /// Takes the project's lock unless it is held here already.
    [[nodiscard]] bool hold(const HeldWords& words);
    /// Shows what is left after the project was removed elsewhere; always false.
    [[nodiscard]] bool lose_project();
    /// Whether the lock that was taken is still this program's.
    [[nodiscard]] bool has_lock();
    void release() noexcept;
    void close();
    void show_date(const RegisterDate& date);
    /// Gives the lock back unless a date is open.
    void release_unused() noexcept;
    [[nodiscard]] bool project_exists();
    [[nodiscard]] bool date_exists(int date_key);
    [[nodiscard]] bool usable(const core::Date& date) const;
    /// False when the project has the day already, which its unique index tells.
    [[nodiscard]] bool insert_date(const RegisterDate& date);
    /// The same for the open date's new day.
    [[nodiscard]] bool update_date(const core::Date& date, Standing& standing);
    /// How the open date stands, inside the transaction that is to write it. A lock that was taken away is taken again
    /// where nobody has used the gap.
    [[nodiscard]] Standing standing();
    [[nodiscard]] bool refuse_standing(Standing standing);
    [[nodiscard]] QByteArray stored_mark();
    /// Takes the mark of what was written before anybody else can write.
    void commit_marked(core::Transaction& transaction);
    [[nodiscard]] QString holders(const HeldWords& words) const;

    core::Office& m_office;
    const RegisterKind& m_kind;
    std::vector<Project> m_projects;
    bool m_none_set_up = false;
    int m_project = 0;
    std::vector<RegisterDate> m_dates;
    std::optional<RegisterDate> m_open;
    QByteArray m_mark; ///< Of the open date's stored rows as they were loaded.
    int m_held = 0;    ///< The project under this register's lock.
};

} // namespace kindrel::registers

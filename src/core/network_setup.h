#pragma once

#include "core/locks.h"

namespace kindrel::core {

/// The workstation's place on the network, and what is locked in the church. Whatever refuses has said why.
class NetworkSetup
{
public:
    /// Nullopt without the right, or when the network settings cannot be read.
    [[nodiscard]] static std::optional<NetworkSetup> open(Office& office);

    [[nodiscard]] bool switched_on() const { return m_switched_on; }
    void switch_on(bool on) { m_switched_on = on; }
    [[nodiscard]] QString path() const { return m_path; }
    void set_path(const QString& path) { m_path = path.trimmed(); }
    [[nodiscard]] bool altered() const;

    /// Looks for the data files under the path and writes a test file there. Tells what failed, and nothing else.
    [[nodiscard]] bool test() const;
    /// Tests first when the network is switched on; writes `network.dat` only when that went well.
    [[nodiscard]] bool save();
    /// What stands on the page once it is saved: the program must be started again.
    [[nodiscard]] static QString saved_note();

    /// As they were at the last refresh().
    [[nodiscard]] const std::vector<HeldLock>& locks() const { return m_locks; }
    void refresh();
    /// Deletes every row of the chosen lock; nullopt stands for nothing chosen.
    bool unlock(std::optional<int> place);

private:
    explicit NetworkSetup(Office& office);

    Office* m_office;
    bool m_switched_on = false;
    QString m_path;
    bool m_stored_switch = false;
    QString m_stored_path;
    std::vector<HeldLock> m_locks;
};

} // namespace kindrel::core

#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QTabWidget;

namespace kindrel::desktop {

/// What a page of tabs asks of one of them.
struct SetupTab
{
    std::function<void()> focus_list;
    std::function<void()> show; ///< After the lists were saved or read again.
    std::function<bool()> typing;
    std::function<bool()> finish_typing;
    std::function<void()> drop_typing;
};

/// A page's own words.
struct SetupWords
{
    QString save_tip, cancel_tip;
    QString unable_to_save, unable_to_read;
    QString cancel_question, leave_question;
};

/// Lists in memory, a tab each. Nothing is stored before the page is saved as a whole; for as long as it is open nobody
/// else is in its area.
class SetupTabsPage : public Page
{
    Q_OBJECT

public:
    void entered() override { find(); }
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override;
    [[nodiscard]] bool holds_lock() const override { return m_desk.office.shared(); }
    [[nodiscard]] bool leave() override;

protected:
    /// The tab in front is remembered under `tab_key`.
    SetupTabsPage(Desk& desk, core::AreaEntry entry, const QString& title, SetupWords words, const QString& tab_key);

    [[nodiscard]] Desk& desk() const { return m_desk; }
    [[nodiscard]] QTabWidget& tabs() const { return *m_tabs; }
    void add_tab(QWidget* widget, const QString& title, SetupTab tab);
    /// Once every tab stands.
    void start();
    /// After the lists, or what is being typed, changed.
    void show_state();

    [[nodiscard]] virtual bool list_altered() const = 0;
    /// False, after saying why, when the lists may not be stored as they are. Throws core::DatabaseError.
    [[nodiscard]] virtual bool store() = 0;
    /// Replaces the lists by what is stored. Throws core::DatabaseError.
    virtual void reread() = 0;
    /// Whether the lists may be left as they are; otherwise says why.
    [[nodiscard]] virtual bool complete() { return true; }
    /// To what store() or complete() objected to.
    virtual void go_to_fault() {}

private:
    void add_actions();
    /// What was typed and not entered yet goes into its list.
    [[nodiscard]] bool finish_typing();
    void show_lists();
    void cancel();
    void drop();

    Desk& m_desk;
    core::AreaEntry m_entry;
    SetupWords m_words;
    QString m_tab_key;
    QTabWidget* m_tabs;
    std::vector<SetupTab> m_lists; ///< In the order of the tabs.
    bool m_saved = false;
};

} // namespace kindrel::desktop

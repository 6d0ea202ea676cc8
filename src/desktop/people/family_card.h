#pragma once

#include "desktop/people/card_sections.h"
#include "desktop/shell/desk.h"

#include <QWidget>

class QListWidget;
class QTabWidget;

namespace kindrel::desktop {

class CardHeader;
class NoteBar;
class Portrait;

/// Everything that is stored about a family, to be read and copied. It holds no lock and knows the list that it was
/// opened from, to turn to the next family of it.
class FamilyCard : public QWidget
{
    Q_OBJECT

public:
    FamilyCard(Desk& desk, std::vector<int> surname_ids);

    /// Shows the family at a place of the list. False when it is gone, which has been told.
    [[nodiscard]] bool show_place(int place);
    [[nodiscard]] int surname_id() const { return m_file.family.Surname_ID; }

protected:
    void changeEvent(QEvent* event) override;

private:
    [[nodiscard]] QTabWidget* make_tabs();
    [[nodiscard]] QWidget* make_family_tab();
    [[nodiscard]] QWidget* make_person_tab();
    void add_keys();
    void turn(int by);
    void show_family();
    void show_people();
    void colour_people();
    void show_person();
    [[nodiscard]] CardReader reader() const;

    Desk& m_desk;
    std::vector<int> m_surname_ids;
    int m_place = 0;
    people::FamilyFile m_file;
    std::vector<people::HistoryEntry> m_history;
    CardSections<people::FamilyFile> m_family;
    CardSections<people::Person> m_person;
    CardHeader* m_header;
    NoteBar* m_note;
    QListWidget* m_people;
    Portrait* m_portrait;
};

/// Opens the card of the family at `place`, or brings it forward where it is open already.
void open_family_card(Desk& desk, const std::vector<int>& surname_ids, int place);

} // namespace kindrel::desktop

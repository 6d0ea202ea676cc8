#pragma once

#include "desktop/shell/desk.h"
#include "desktop/shell/palette.h"
#include "people/working_list.h"

#include <QAbstractTableModel>

namespace kindrel::desktop {

/// One person of a list as far as it is shown.
struct FoundPerson
{
    int surname_id = 0;
    QString name = {}; ///< As of people::listed_name().
    QString family = {};
    QString suburb = {};
    State state = State::plain;
};

/// The people of the list in its order, hidden suburbs left out; one who is gone is passed over. Nullopt when the
/// reading was cancelled.
[[nodiscard]] std::optional<std::vector<FoundPerson>> read_people(Desk& desk, const people::WorkingList& list);

/// People with their families and suburbs, narrowed by typed words.
class FoundPeopleModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column { name, family, suburb, column_count };

    using QAbstractTableModel::QAbstractTableModel;

    void set_people(std::vector<FoundPerson> people);
    /// Keeps the people in whose columns every word begins some word; accents and case do not count.
    void narrow(const QString& typed);

    [[nodiscard]] int total() const { return int(m_people.size()); }
    [[nodiscard]] const FoundPerson& person(int row) const { return m_people[m_shown[std::size_t(row)]]; }
    /// Of the shown people, each family once.
    [[nodiscard]] std::vector<int> surname_ids() const;

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    void find_shown(const QStringList& words);

    std::vector<FoundPerson> m_people;
    std::vector<QString> m_search; ///< Beside `m_people`: the folded words, each after a blank.
    std::vector<std::size_t> m_shown;
};

} // namespace kindrel::desktop

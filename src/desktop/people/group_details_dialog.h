#pragma once

#include "people/group_details.h"

#include <QDialog>

#include <span>
#include <vector>

class QGridLayout;
class QLineEdit;
class QPlainTextEdit;

namespace kindrel::desktop {

/// Where and when a group meets and who leads it. Saves at once, apart from the setup lists.
class GroupDetailsDialog : public QDialog
{
    Q_OBJECT

public:
    GroupDetailsDialog(core::Office& office, int group_id, const QString& group, QWidget* parent = nullptr);

    void accept() override;
    /// Asks when something was changed.
    void reject() override;

private:
    [[nodiscard]] QGridLayout* make_fields();
    [[nodiscard]] people::GroupDetails typed() const;

    core::Office& m_office;
    people::GroupDetails m_stored;
    std::vector<QLineEdit*> m_lines; ///< In the order of the table of lines.
    QPlainTextEdit* m_comments;
};

} // namespace kindrel::desktop

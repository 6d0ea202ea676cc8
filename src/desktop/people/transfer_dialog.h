#pragma once

#include "desktop/shell/desk.h"

#include <QDialog>

#include <optional>

class QLabel;

namespace kindrel::desktop {

class FamilyListWidget;

/// Chooses the family that a person is transferred into: type, Down, Enter.
class TransferDialog : public QDialog
{
    Q_OBJECT

public:
    /// `except` is the family that the person is in.
    TransferDialog(Desk& desk, int except, QWidget* parent = nullptr);

    /// Nothing before accept().
    [[nodiscard]] std::optional<int> family() const { return m_family; }

private:
    void take(int row);

    int m_except;
    FamilyListWidget* m_list;
    QLabel* m_words;
    std::optional<int> m_family;
};

/// Nullopt when the person turned away.
[[nodiscard]] std::optional<int> choose_family(Desk& desk, int except);

} // namespace kindrel::desktop

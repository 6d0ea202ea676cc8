#pragma once

#include <QWidget>

#include <functional>

class QAbstractItemModel;

namespace kindrel::desktop {

/// One of the ways to search, with the list of what it found.
class SearchTab : public QWidget
{
public:
    using QWidget::QWidget;

    /// The tab comes to the front: what was stored elsewhere is read, and the cursor goes to where one types.
    virtual void entered() = 0;
    /// Opens the family of the chosen row in the editor.
    virtual void open() = 0;
    /// Shows its card.
    virtual void look() = 0;
    /// Lends the list as it may go to paper and to files, with its title.
    virtual void lend_list(const std::function<void(const QString& title, const QAbstractItemModel&)>& use) const = 0;
    /// How much is listed.
    [[nodiscard]] virtual QString count_words() const = 0;
};

} // namespace kindrel::desktop

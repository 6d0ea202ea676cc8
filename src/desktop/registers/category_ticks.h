#pragma once

#include "registers/weekly_register.h"

#include <QWidget>

class QLabel;
class QListWidget;

namespace kindrel::desktop {

/// The categories of one kind with a tick each: Space turns it over.
class CategoryTicks : public QWidget
{
    Q_OBJECT

public:
    /// The captions bear their letters.
    struct Captions
    {
        QString heading, all, none;
    };

    CategoryTicks(const Captions& captions, const QString& name, QWidget* parent = nullptr);

    /// Those in `left_out` are not ticked.
    void show_categories(const std::vector<registers::Category>& categories, const QList<int>& left_out);
    /// The keys of those that are ticked, and of those that are not.
    [[nodiscard]] std::vector<int> ticked() const;
    [[nodiscard]] QList<int> left_out() const;
    void focus_list();

Q_SIGNALS:
    void changed();

private:
    void tick_all(bool on);
    void show_count();

    QListWidget* m_list;
    QLabel* m_count;
};

} // namespace kindrel::desktop

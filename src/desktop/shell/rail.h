#pragma once

#include "desktop/shell/rail_button.h"

#include <vector>

class QScrollArea;
class QToolButton;
class QVBoxLayout;

namespace kindrel::desktop {

/// The areas at the left of the window, one of them chosen, and the program's own menus at the foot. In a low window
/// the areas come closer together and scroll, with arrows where there are more.
class Rail : public QWidget
{
    Q_OBJECT

public:
    static constexpr int wide = RailButton::wide;
    static constexpr int narrow = RailButton::narrow;

    explicit Rail(QWidget* parent = nullptr);

    RailButton* add_area(const QString& icon_name, const QString& text);
    RailButton* add_foot(const QString& icon_name, const QString& text);
    void set_narrow(bool narrow);
    void choose(int area);
    void mark(int area, const RailMarks& marks);

Q_SIGNALS:
    void chosen(int area);

protected:
    void paintEvent(QPaintEvent* event) override;
    bool event(QEvent* event) override;
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    [[nodiscard]] QToolButton* make_arrow(const QString& icon_name, const QString& words, int step);
    /// Full or low buttons, by the height there is.
    void fit();
    void bring_into_view(QWidget& button);
    /// The next area that is open in this direction gets the focus; nothing is opened.
    void go(const QObject* from, int step);
    void place_arrows();

    QVBoxLayout* m_column;
    QVBoxLayout* m_foot_column;
    QScrollArea* m_scroll;
    QToolButton* m_earlier;
    QToolButton* m_further;
    std::vector<RailButton*> m_areas, m_foot;
};

} // namespace kindrel::desktop

#pragma once

#include <QAbstractButton>
#include <QWidget>

#include <vector>

class QVBoxLayout;

namespace kindrel::desktop {

/// One area of the rail: icon and name, or the icon alone when space is short.
class RailButton : public QAbstractButton
{
    Q_OBJECT

public:
    RailButton(const QString& icon_name, const QString& text);

    void set_narrow(bool narrow);
    [[nodiscard]] QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    bool m_narrow = false;
};

/// The areas at the left of the window, one of them chosen, and the program's own menus at the foot.
class Rail : public QWidget
{
    Q_OBJECT

public:
    static constexpr int wide = 168;
    static constexpr int narrow = 48;

    explicit Rail(QWidget* parent = nullptr);

    RailButton* add_area(const QString& icon_name, const QString& text);
    RailButton* add_foot(const QString& icon_name, const QString& text);
    void set_narrow(bool narrow);
    void choose(int area);

Q_SIGNALS:
    void chosen(int area);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QVBoxLayout* m_column;
    std::vector<RailButton*> m_areas, m_foot;
};

}

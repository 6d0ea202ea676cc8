#pragma once

#include <QAbstractButton>

namespace kindrel::desktop {

/// What the rail shows of a page beside its name.
struct RailMarks
{
    bool altered = false; ///< A dot.
    bool locked = false;  ///< A padlock.
    bool idle = false;    ///< A reminder that others still wait for the lock.

    friend bool operator==(const RailMarks&, const RailMarks&) = default;
};

/// One area of the rail: icon and name, or the icon alone when space is short.
class RailButton : public QAbstractButton
{
    Q_OBJECT

public:
    static constexpr int wide = 168;
    static constexpr int narrow = 48;
    static constexpr int low_height = 28;

    RailButton(const QString& icon_name, const QString& text);

    void set_narrow(bool shortened);
    /// Lower, so that more areas are seen at once. A reminder keeps its full height.
    void set_low(bool low);
    void set_tip(const QString& tip);
    void set_marks(const RailMarks& marks);
    [[nodiscard]] const RailMarks& marks() const { return m_marks; }
    /// The marks in words, a line each.
    [[nodiscard]] QString mark_words() const;
    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] int full_height() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void paint_ground(QPainter& painter) const;
    void paint_words(QPainter& painter, QRect place) const;
    void paint_marks(QPainter& painter) const;
    /// Chosen or pressed: on the ground of a selection.
    [[nodiscard]] bool stands_out() const { return isChecked() || isDown(); }

    QString m_tip;
    RailMarks m_marks;
    bool m_narrow = false;
    bool m_low = false;
};

} // namespace kindrel::desktop

#include "desktop/shell/remembered.h"

#include <QAbstractScrollArea>
#include <QEvent>
#include <QGuiApplication>
#include <QHeaderView>
#include <QSplitter>

#include <vector>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

class WindowKeeper : public QObject
{
public:
    WindowKeeper(Remembered& remembered, QWidget& window) : QObject(&window), m_remembered(remembered), m_window(window)
    {
        window.installEventFilter(this);
    }

protected:
    bool eventFilter(QObject* target, QEvent* event) override
    {
        if (target == &m_window && (event->type() == QEvent::Hide || event->type() == QEvent::Close))
            m_remembered.keep(u"window/"_s + m_window.objectName(), m_window.saveGeometry());
        return QObject::eventFilter(target, event);
    }

private:
    Remembered& m_remembered;
    QWidget& m_window;
};

class ColumnKeeper : public QObject
{
public:
    ColumnKeeper(Remembered& remembered, QHeaderView& header, std::span<const int> shares)
        : QObject(&header), m_remembered(remembered), m_header(header), m_shares(shares.begin(), shares.end()),
          m_key(u"columns/"_s + header.objectName()),
          m_placed(header.restoreState(remembered.value(m_key).toByteArray()))
    {
        header.installEventFilter(this);
        connect(&header, &QHeaderView::sectionResized, this, &ColumnKeeper::moved_by_hand);
        connect(&header, &QHeaderView::sectionMoved, this, &ColumnKeeper::moved_by_hand);
        show_scroll_bar();
    }

protected:
    bool eventFilter(QObject* target, QEvent* event) override
    {
        if (event->type() == QEvent::Resize && !m_placed)
            share_width();
        return QObject::eventFilter(target, event);
    }

private:
    void share_width()
    {
        const int last = int(m_shares.size()) - 1;
        for (int column = 0; column < last; ++column)
            m_header.resizeSection(column, m_header.width() * m_shares[std::size_t(column)] / 100);
        // The header itself stretches the last column but does not shrink it below the size it began with.
        m_header.resizeSection(last, m_header.width() - m_header.sectionPosition(last));
    }

    /// Columns that share the width never need one.
    void show_scroll_bar()
    {
        if (auto* view = qobject_cast<QAbstractScrollArea*>(m_header.parentWidget()))
            view->setHorizontalScrollBarPolicy(m_placed ? Qt::ScrollBarAsNeeded : Qt::ScrollBarAlwaysOff);
    }

    void moved_by_hand()
    {
        if (!(QGuiApplication::mouseButtons() & Qt::LeftButton))
            return;
        m_placed = true;
        show_scroll_bar();
        m_remembered.keep(m_key, m_header.saveState());
    }

    Remembered& m_remembered;
    QHeaderView& m_header;
    std::vector<int> m_shares;
    QString m_key;
    bool m_placed;
};

} // namespace

Remembered::Remembered(const QString& local_settings, int church)
    : m_file(local_settings + u"desktop.ini"_s, QSettings::IniFormat), m_church(u"church%1/"_s.arg(church))
{
}

QVariant Remembered::value(const QString& key, const QVariant& fallback) const
{
    return m_file.value(m_church + key, fallback);
}

void Remembered::keep(const QString& key, const QVariant& value)
{
    m_file.setValue(m_church + key, value);
}

QVariant Remembered::common_value(const QString& key, const QVariant& fallback) const
{
    return m_file.value(u"workstation/"_s + key, fallback);
}

void Remembered::keep_common(const QString& key, const QVariant& value)
{
    m_file.setValue(u"workstation/"_s + key, value);
}

void follow(Remembered& remembered, QSplitter& splitter)
{
    const QString key = u"splitter/"_s + splitter.objectName();
    splitter.restoreState(remembered.value(key).toByteArray());
    QObject::connect(&splitter, &QSplitter::splitterMoved, &splitter,
                     [&remembered, &splitter, key] { remembered.keep(key, splitter.saveState()); });
}

void follow(Remembered& remembered, QHeaderView& header, std::span<const int> shares)
{
    new ColumnKeeper(remembered, header, shares);
}

void follow_window(Remembered& remembered, QWidget& window, QSize first_size)
{
    window.resize(first_size);
    window.restoreGeometry(remembered.value(u"window/"_s + window.objectName()).toByteArray());
    new WindowKeeper(remembered, window);
}

} // namespace kindrel::desktop

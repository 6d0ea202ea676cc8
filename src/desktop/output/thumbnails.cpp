#include "desktop/output/thumbnails.h"

#include "desktop/shell/look.h"

#include <QPainter>
#include <QStyledItemDelegate>

#include <algorithm>

namespace kindrel::desktop {

namespace {

constexpr QSize most_pixels{92, 92};
constexpr int strip_width = 124;
constexpr int pictures_kept = 300;

/// The picture in the middle with its number beneath; the page in sight has a frame.
class ThumbnailPainter : public QStyledItemDelegate
{
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override
    {
        const auto picture = index.data(Qt::DecorationRole).value<QPixmap>();
        const int number_height = option.fontMetrics.height();
        QRect place(QPoint(), picture.size());
        place.moveCenter(option.rect.center() - QPoint(0, number_height / 2));
        painter->drawPixmap(place, picture);
        if (option.state & QStyle::State_Selected) {
            painter->setPen(QPen(option.palette.color(QPalette::Highlight), 3));
            painter->drawRect(place.adjusted(-3, -3, 3, 3));
        }
        painter->setPen(option.palette.color(QPalette::Text));
        painter->drawText(option.rect.adjusted(0, 0, 0, -2), Qt::AlignHCenter | Qt::AlignBottom,
                          index.data().toString());
    }

    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex&) const override
    {
        return {most_pixels.width(), most_pixels.height() + option.fontMetrics.height() + space::group};
    }
};

} // namespace

ThumbnailModel::ThumbnailModel(const pages::PageSpool& spool, QObject* parent)
    : QAbstractListModel(parent), m_spool(spool), m_pictures(pictures_kept)
{
}

void ThumbnailModel::grow()
{
    if (m_known == m_spool.page_count())
        return;
    beginInsertRows({}, m_known, m_spool.page_count() - 1);
    m_known = m_spool.page_count();
    endInsertRows();
}

int ThumbnailModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_known;
}

QPixmap ThumbnailModel::picture(int number) const
{
    if (const QPixmap* kept = m_pictures.object(number))
        return *kept;
    const pages::Page page = m_spool.page(number);
    const qreal factor = std::min(most_pixels.width() / page.size.width(), most_pixels.height() / page.size.height());
    QPixmap drawn((page.size * factor).toSize());
    drawn.fill(Qt::white);
    QPainter painter(&drawn);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.save();
    painter.scale(factor, factor);
    m_painter.paint(painter, page, m_spool.page_count());
    painter.restore();
    painter.setPen(line_colour(Shade::light));
    painter.drawRect(drawn.rect().adjusted(0, 0, -1, -1));
    painter.end();
    m_pictures.insert(number, new QPixmap(drawn));
    return drawn;
}

QVariant ThumbnailModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    if (role == Qt::DisplayRole)
        return QString::number(index.row() + 1);
    if (role == Qt::DecorationRole)
        return picture(index.row() + 1);
    return {};
}

Thumbnails::Thumbnails(const pages::PageSpool& spool, QWidget* parent)
    : QListView(parent), m_model(new ThumbnailModel(spool, this))
{
    setModel(m_model);
    setAccessibleName(QStringLiteral("Pages"));
    setItemDelegate(new ThumbnailPainter(this));
    setUniformItemSizes(true);
    setFixedWidth(strip_width);
    setFrameShape(NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollMode(ScrollPerPixel);
    connect(selectionModel(), &QItemSelectionModel::currentChanged, this,
            [this](const QModelIndex& index) { Q_EMIT chosen(index.row() + 1); });
}

void Thumbnails::grow()
{
    m_model->grow();
}

void Thumbnails::show_page(int number)
{
    const QModelIndex index = m_model->index(number - 1);
    if (index.isValid() && index != currentIndex())
        setCurrentIndex(index);
}

} // namespace kindrel::desktop

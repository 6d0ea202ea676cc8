#include "desktop/output/head_picture.h"

#include "desktop/shell/look.h"
#include "output/decoration.h"
#include "pages/flow.h"

#include <QFileInfo>
#include <QPainter>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

// Points.
constexpr qreal edge = 14; ///< Of the paper that is shown around the print.
constexpr qreal between_strips = 10;
constexpr qreal most_scale = 1.25;
constexpr qreal smallest_strip = 40;

const QString sample_title = u"Directory"_s;
const QString sample_criteria = u"Active Families"_s;

/// The page with nothing between head and foot.
pages::Page decorated_page(core::Office& office, const core::Settings& settings, const QString& logo,
                           const pages::Picture& picture)
{
    core::Office sample{.paths = office.paths,
                        .church_name = office.church_name,
                        .logo = logo,
                        .settings = settings,
                        .workstation = office.workstation,
                        .dialogue = office.dialogue,
                        .clock = office.clock};
    people::WorkingList list;
    list.criteria = sample_criteria;
    pages::PageSpool spool;
    pages::Flow flow(spool, {});
    output::decorate(flow, sample_title, {sample, list}, {.header = {}, .footer = {}, .logo = picture});
    flow.finish();
    return spool.page(1);
}

struct Extent
{
    qreal top, bottom;
};

Extent extent_of(const pages::TextItem& item)
{
    return {item.at.y() - item.style.size, item.at.y() + item.style.size / 3};
}

Extent extent_of(const pages::LineItem& item)
{
    return {item.from.y() - item.thickness, item.to.y() + item.thickness};
}

Extent extent_of(const pages::PictureItem& item)
{
    return {item.where.top(), item.where.bottom()};
}

/// No other item stands in heads and feet.
template <class Other>
Extent extent_of(const Other&)
{
    return {0, 0};
}

} // namespace

const pages::Picture& PictureFile::read(const QString& file)
{
    const QFileInfo now(file);
    const auto state = std::tuple(file, now.size(), now.lastModified());
    if (state != m_state) {
        m_state = state;
        m_picture = file.isEmpty() ? pages::Picture() : pages::Picture::from_file(file, m_within);
    }
    return m_picture;
}

HeadPicture::HeadPicture(core::Office& office, QWidget* parent)
    : QWidget(parent), m_office(office), m_logo(output::logo_room)
{
    setObjectName(u"head_picture"_s);
    setAccessibleName(u"Head and foot of a report"_s);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    show_settings(office.settings, office.logo);
}

void HeadPicture::show_settings(const core::Settings& settings, const QString& logo)
{
    m_page = decorated_page(m_office, settings, logo, settings.title_logo ? m_logo.read(logo) : pages::Picture());
    const qreal middle = m_page.size.height() / 2;
    qreal head_bottom = 0, foot_top = m_page.size.height();
    for (const auto& item : m_page.items) {
        const Extent extent = std::visit([](const auto& kind) { return extent_of(kind); }, item);
        if (extent.top < middle)
            head_bottom = std::max(head_bottom, extent.bottom);
        else
            foot_top = std::min(foot_top, extent.top);
    }
    const pages::PageSetup setup;
    m_head = strip(setup.margins.top() - edge, std::max(head_bottom + edge, smallest_strip));
    m_foot = strip(foot_top - edge, m_page.size.height() - setup.margins.bottom() + edge);
    update();
}

QRectF HeadPicture::strip(qreal top, qreal bottom) const
{
    const auto margins = pages::PageSetup().margins;
    return {margins.left() - edge, top, m_page.size.width() - margins.left() - margins.right() + 2 * edge,
            bottom - top};
}

QSize HeadPicture::sizeHint() const
{
    return minimumSizeHint(); // It takes what room the fields leave, and draws itself as small as it must.
}

QSize HeadPicture::minimumSizeHint() const
{
    return {320, 120};
}

void HeadPicture::paintEvent(QPaintEvent*)
{
    const qreal high = m_head.height() + between_strips + m_foot.height();
    const qreal scale = std::min({most_scale, (width() - 2) / m_head.width(), (height() - 2) / high});
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    paint_strip(painter, m_head, {0, 0}, scale);
    paint_strip(painter, m_foot, {0, (m_head.height() + between_strips) * scale}, scale);
}

void HeadPicture::paint_strip(QPainter& painter, const QRectF& of_page, QPointF at, qreal scale)
{
    const QRectF paper(at, of_page.size() * scale);
    painter.save();
    painter.fillRect(paper.translated(2, 2), QColor(0, 0, 0, 50));
    painter.fillRect(paper, Qt::white);
    painter.setClipRect(paper);
    painter.translate(paper.topLeft());
    painter.scale(scale, scale);
    painter.translate(-of_page.topLeft());
    m_painter.paint(painter, m_page, 1);
    painter.restore();
}

} // namespace kindrel::desktop

#pragma once

#include "pages/painter.h"
#include "pages/spool.h"

#include <QAbstractListModel>
#include <QCache>
#include <QListView>
#include <QPixmap>

namespace kindrel::desktop {

/// The pages of a document as small pictures, drawn when they come into sight.
class ThumbnailModel : public QAbstractListModel
{
    Q_OBJECT

public:
    explicit ThumbnailModel(const pages::PageSpool& spool, QObject* parent = nullptr);

    /// Takes in the pages that have come since.
    void grow();
    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;

private:
    [[nodiscard]] QPixmap picture(int number) const;

    const pages::PageSpool& m_spool;
    int m_known = 0;
    mutable pages::PagePainter m_painter;
    mutable QCache<int, QPixmap> m_pictures;
};

class Thumbnails : public QListView
{
    Q_OBJECT

public:
    explicit Thumbnails(const pages::PageSpool& spool, QWidget* parent = nullptr);

    void grow();
    void show_page(int number);

Q_SIGNALS:
    void chosen(int number);

private:
    ThumbnailModel* m_model;
};

} // namespace kindrel::desktop

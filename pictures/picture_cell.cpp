#include "pictures/picture_cell.h"

#include "catalog/picture_item.h"
#include "catalog/text_util.h"
#include "pictures/picture_fit.h"
#include "pictures/thumbnail_service.h"

#include <QFile>
#include <QFileInfo>
#include <QFontMetrics>
#include <QPaintDevice>
#include <QPainter>

#include <algorithm>

namespace {

constexpr int kCaptionGap = 5;
constexpr int kFitMarginX = 7;
constexpr int kFitMarginY = 5;

} // namespace

QString PictureCellCaption(const CPictureItem& picture, bool screen)
{
    if (!picture.GetDisplayCaption())
        return QString();
    QString caption;
    if (screen && picture.GetSequenceNumber() != 0)
        caption = QStringLiteral("#%1 ").arg(picture.GetSequenceNumber());
    return caption + QString::fromStdString(DisplayUtf8(picture.GetLabel()));
}

QRect PictureCellArea(const QRect& cell, int captionHeight, bool fitToFrame)
{
    int left = cell.left();
    int top = cell.top();
    int right = left + cell.width();
    int bottom = top + cell.height();
    if (captionHeight > 0) {
        bottom -= captionHeight + kCaptionGap;
        if (fitToFrame)
            top += kCaptionGap;
    }
    if (fitToFrame) {
        left += kFitMarginX;
        right -= kFitMarginX;
        top += kFitMarginY;
        bottom -= kFitMarginY;
    }
    return QRect(QPoint(left, top), QSize(right - left, bottom - top));
}

int DrawPictureCell(QPainter& painter, const QRect& cell, CPictureItem& picture,
                    const CPictureCellOptions& options)
{
    const QString caption = PictureCellCaption(picture, options.screen);
    int captionHeight = 0;
    if (picture.GetDisplayCaption()) {
        captionHeight = painter.fontMetrics().height();
        const QRect line(cell.left(), cell.top() + cell.height() - captionHeight, cell.width(),
                         captionHeight);
        painter.save();
        painter.setClipRect(cell, Qt::IntersectClip);
        painter.drawText(line, Qt::AlignHCenter | Qt::AlignBottom | Qt::TextSingleLine, caption);
        painter.restore();
    }
    const QString path = QFile::decodeName(QByteArray::fromStdString(picture.GetPathname()));
    if (!QFileInfo::exists(path))
        return 0;
    const bool fit = picture.GetFitToFrame() != 0;
    const QRect area = PictureCellArea(cell, captionHeight, fit);

    const qreal ratio = painter.device() ? painter.device()->devicePixelRatioF() : 1.0;
    const int edge = int(std::max(area.width(), area.height()) * ratio);
    CThumbnailCache::Flavor flavor;
    // Natural size, or larger than any thumbnail: only the picture itself will do.
    if (!options.thumbnails || !fit || edge <= 0 || !CThumbnailCache::FlavorFor(edge, flavor))
        return picture.Draw(painter, area);

    const CThumbnail thumbnail = options.thumbnails->Request(path, edge);
    if (thumbnail.status != CThumbnail::Ready)
        return 0;
    return DrawFittedPicture(painter, thumbnail.image, thumbnail.pictureSize, area, fit,
                             picture.GetWhiteBorder() != 0)
               ? 1
               : 0;
}

#include "pictures/picture_fit.h"

#include <QPaintDevice>
#include <QPainter>

#include <algorithm>

namespace {

constexpr int kFrameWidthLoss = 14;
constexpr int kFrameHeightLoss = 10;
constexpr int kMatWidth = 8;

// Integer rectangle from edges, the right and bottom edges outside it.
QRect FromEdges(int left, int top, int right, int bottom)
{
    return QRect(QPoint(left, top), QSize(right - left, bottom - top));
}

// A reduction by more than half is worth doing by area averaging once,
// rather than sampling the full picture at every paint.
QImage ImageForSize(const QImage& image, const QSize& size, CScaledImageCache* cache)
{
    if (size.width() * 2 > image.width() && size.height() * 2 > image.height())
        return image;
    if (cache && cache->sourceKey == image.cacheKey() && cache->image.size() == size)
        return cache->image;
    QImage scaled = image.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    if (cache) {
        cache->sourceKey = image.cacheKey();
        cache->image = scaled;
    }
    return scaled;
}

} // namespace

QRect FitPictureRect(const QSize& picture, const QRect& target, bool fitToFrame)
{
    const int left = target.left();
    const int top = target.top();
    const int right = left + target.width();
    const int bottom = top + target.height();
    const int cx = left + (right - left) / 2;
    const int cy = top + (bottom - top) / 2;
    int w = picture.width();
    int h = picture.height();
    if (fitToFrame && w > 0 && h > 0) {
        const float aw = float((right - left) - kFrameWidthLoss);
        const float ah = float((bottom - top) - kFrameHeightLoss);
        const float scale = std::min(aw / float(w), ah / float(h));
        w = int(scale * float(w));
        h = int(scale * float(h));
    }
    int l = cx - w / 2, r = cx + w / 2;
    int t = cy - h / 2, b = cy + h / 2;
    if (r <= l) {
        l = cx - 1;
        r = cx + 1;
    }
    if (b <= t) {
        t = cy - 1;
        b = cy + 1;
    }
    return FromEdges(l, t, r, b);
}

bool DrawFittedPicture(QPainter& painter, const QImage& image, const QSize& pictureSize,
                       const QRect& target, bool fitToFrame, bool whiteBorder,
                       CScaledImageCache* cache)
{
    if (image.isNull() || pictureSize.width() <= 0 || pictureSize.height() <= 0)
        return false;
    QRect rect = FitPictureRect(pictureSize, target, fitToFrame);
    if (whiteBorder) {
        painter.fillRect(rect, Qt::white);
        rect.adjust(kMatWidth, kMatWidth, -kMatWidth, -kMatWidth);
    }
    if (rect.width() <= 0 || rect.height() <= 0)
        return true;
    const qreal ratio = painter.device() ? painter.device()->devicePixelRatioF() : 1.0;
    const QSize deviceSize = (QSizeF(rect.size()) * ratio).toSize().expandedTo(QSize(1, 1));
    const QImage drawn = ImageForSize(image, deviceSize, cache);
    painter.save();
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.drawImage(rect, drawn);
    painter.restore();
    return true;
}

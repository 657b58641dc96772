#pragma once
// Where a picture goes inside a rectangle (the fit rule), and drawing it
// there, on a white mat when asked.

#include <QImage>
#include <QRect>
#include <QSize>

class QPainter;

// The picture's rectangle inside target, centred. With fitToFrame the picture
// is shrunk or enlarged into the target less 14 pixels across and 10 down;
// without it keeps its own size. A side that comes out empty is 2 pixels wide
// around the centre.
QRect FitPictureRect(const QSize& picture, const QRect& target, bool fitToFrame);

// The last smooth reduction of an image for drawing, kept between paints.
struct CScaledImageCache
{
    qint64 sourceKey = 0;
    QImage image;
};

// Draws image (a picture of pictureSize pixels, possibly reduced) fitted into
// target; with whiteBorder the fitted rectangle is filled white and the
// picture drawn 8 pixels inside it. False when there is nothing to draw.
bool DrawFittedPicture(QPainter& painter, const QImage& image, const QSize& pictureSize,
                       const QRect& target, bool fitToFrame, bool whiteBorder,
                       CScaledImageCache* cache = nullptr);

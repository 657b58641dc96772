#pragma once
// Making one thumbnail: from the disk cache when it holds a valid one, else
// by decoding the picture at reduced size and storing the result.

#include <QImage>
#include <QSize>
#include <QString>

class CThumbnailCache;

struct CThumbnail
{
    enum Status
    {
        Ready,
        Failed,
        Missing
    };
    Status status = Missing;
    QImage image;      // at most the requested flavor's size; null unless Ready
    QSize pictureSize; // the whole picture's size, upright (the fit rule's input)
};

// A thumbnail whose longer side is at most the size of the smallest cache
// flavor of at least size pixels (or size itself above the largest flavor,
// which is not cached on disk). Without a cache nothing is read or written.
CThumbnail MakeThumbnail(const QString& path, int size, const CThumbnailCache* cache);

// The thumbnail reduced to fit a size x size box (never enlarged).
QImage ThumbnailForBox(const CThumbnail& thumbnail, int size);

#include "pictures/thumbnail_maker.h"

#include "pictures/image_decode.h"
#include "pictures/thumbnail_cache.h"

#include <QFileInfo>

CThumbnail MakeThumbnail(const QString& path, int size, const CThumbnailCache* cache)
{
    CThumbnail result;
    CThumbnailKey key;
    if (size <= 0 || !CThumbnailCache::KeyFor(path, key))
        return result;
    CThumbnailCache::Flavor flavor = CThumbnailCache::Flavor::Normal;
    const bool cached = CThumbnailCache::FlavorFor(size, flavor);
    const bool useCache = cache && cached && !cache->Holds(key.path);
    if (useCache) {
        result.image = cache->Read(flavor, key, &result.pictureSize);
        if (!result.image.isNull()) {
            // A record written by a program that kept the stored orientation.
            const QSize s = result.image.size();
            if (result.pictureSize.isValid() &&
                (s.width() > s.height()) !=
                    (result.pictureSize.width() > result.pictureSize.height()) &&
                s.width() != s.height())
                result.pictureSize.transpose();
            if (!result.pictureSize.isValid())
                result.pictureSize = s;
            result.status = CThumbnail::Ready;
            return result;
        }
        if (cache->HasFailure(key)) {
            result.status = CThumbnail::Failed;
            return result;
        }
    }

    const int edge = cached ? CThumbnailCache::FlavorSize(flavor) : size;
    const CDecodedPicture decoded = DecodePicture(key.path, QSize(edge, edge));
    if (decoded.image.isNull()) {
        result.status = CThumbnail::Failed;
        // A file we may not read is not a failed picture: no lasting record.
        if (useCache && QFileInfo(key.path).isReadable())
            cache->WriteFailure(key);
        return result;
    }
    result.status = CThumbnail::Ready;
    result.image = decoded.image;
    result.pictureSize = decoded.pictureSize.isValid() ? decoded.pictureSize : decoded.image.size();
    if (useCache)
        cache->Write(flavor, key, result.image, result.pictureSize);
    return result;
}

QImage ThumbnailForBox(const CThumbnail& thumbnail, int size)
{
    const QImage& image = thumbnail.image;
    if (image.isNull() || (image.width() <= size && image.height() <= size))
        return image;
    return image.scaled(size, size, Qt::KeepAspectRatio, Qt::SmoothTransformation);
}

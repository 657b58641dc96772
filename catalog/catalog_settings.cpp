#include "catalog/catalog_settings.h"

#include "catalog/archive.h"

namespace {
void Color(CArchive& ar, uint32_t& color)
{
    int32_t value = static_cast<int32_t>(color);
    ar.Int(value);
    color = static_cast<uint32_t>(value);
}
} // namespace

void CCatalogSettings::Serialize(CArchive& ar, int version)
{
    Color(ar, albumBackgroundColor);
    ar.Int(albumPicturesPerPage);
    ar.Int(albumDisplayCaption);
    ar.Int(albumThumbnailSize);
    ar.Int(albumThumbnailColumns);
    ar.Int(archiveOnFixedDisks);
    ar.Int(archiveOnRemovableMedia);
    ar.Int(compareFileCreateDate);
    ar.Int(compareFileModifyDate);
    ar.Int(compareFileName);
    ar.Int(compareFileSize);
    ar.Int(uniqueEntryCheckDefault);
    ar.Int(previewWindow);
    if (version > 2) {
        Color(ar, accentColor);
        Color(ar, backgroundColor);
        ar.Int(colorScheme);
    }
}

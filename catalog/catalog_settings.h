#pragma once
// The user's document and photo album preferences, saved with the catalog.

#include <cstdint>

class CArchive;

struct CCatalogSettings
{
    int32_t archiveOnFixedDisks = 0;
    int32_t archiveOnRemovableMedia = 1;
    int32_t compareFileCreateDate = 0;
    int32_t compareFileModifyDate = 0;
    int32_t compareFileName = 1;
    int32_t compareFileSize = 1;
    int32_t uniqueEntryCheckDefault = 0;
    int32_t previewWindow = 0;
    uint32_t accentColor = 0xF0C080;     // 0x00BBGGRR
    uint32_t backgroundColor = 0xD0C0C0; // 0x00BBGGRR
    int32_t colorScheme = 0;             // 0 standard, 1 basic colours
    uint32_t albumBackgroundColor = 0xD0C0C0;
    int32_t albumPicturesPerPage = 6;
    int32_t albumThumbnailColumns = 6;
    int32_t albumDisplayCaption = 1;
    int32_t albumThumbnailSize = 1; // 0 small, 1 medium, 2 large

    void Serialize(CArchive& ar, int version);
};

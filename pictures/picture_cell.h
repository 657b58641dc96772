#pragma once
// The picture cell: one picture with its caption in a rectangle, as every
// thumbnail, preview, picture window and slide show draws it.

#include <QRect>
#include <QString>

class CPictureItem;
class CThumbnailService;
class QPainter;

struct CPictureCellOptions
{
    // A raster display: numbered pictures show "#<number> " before the label.
    bool screen = true;
    // Draw from thumbnails (never decoding while painting) instead of the picture.
    CThumbnailService* thumbnails = nullptr;
};

// The caption line, or an empty text when the picture shows none.
QString PictureCellCaption(const CPictureItem& picture, bool screen);

// Where the picture goes in the cell, below nothing and above the caption
// line of captionHeight pixels (0 for none).
QRect PictureCellArea(const QRect& cell, int captionHeight, bool fitToFrame);

// Draws the caption and the picture fitted into the cell with the item's
// fit-to-frame and white-border flags. 1 when the picture was drawn; 0 when
// its file is gone, it cannot be decoded or its thumbnail is still being made.
int DrawPictureCell(QPainter& painter, const QRect& cell, CPictureItem& picture,
                    const CPictureCellOptions& options = CPictureCellOptions());

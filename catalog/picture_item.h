#pragma once
// A document that is a picture file, with its run-time picture state.

#include "catalog/document_item.h"

#include <memory>

class CExifInfo;
class CPictureImage;
class QPainter;
class QRect;

// A document that is a picture file. It stores exactly what a document
// stores; everything else it holds (the decoded picture, camera data) is
// rebuilt at run time and made only when first needed, so an item that was
// never shown stays small: a catalog holds 100,000 of them.
class CPictureItem : public CDocumentItem
{
public:
    CPictureItem();
    // Takes the file, caption, categories, dates, keywords and sequence number
    // of a document; the update date is now and the document number stays 0.
    explicit CPictureItem(const CDocumentItem& document);
    // Every stored field and the drawing flags; the decoded picture is not
    // copied (the copy decodes its file when first used).
    CPictureItem(const CPictureItem& other);
    ~CPictureItem() override;

    bool IsPicture() const override { return true; }

    int32_t GetDisplayCaption() const { return m_displayCaption; }
    void SetDisplayCaption(int32_t flag) { m_displayCaption = flag; }
    int32_t GetFitToFrame() const { return m_fitToFrame; }
    void SetFitToFrame(int32_t flag) { m_fitToFrame = flag != 0; }
    int32_t GetWhiteBorder() const { return m_whiteBorder; }
    void SetWhiteBorder(int32_t flag) { m_whiteBorder = flag != 0; }

    // Picture forms: 0 display (drawing only), 1 editable. The editable form,
    // once loaded, stays for the item's life; LoadImage then returns 1 at once.
    enum ImageMode
    {
        kDisplayForm = 0,
        kEditableForm = 1
    };
    // 1 when loaded (and the EXIF block read again); 0 after a failed load.
    int LoadImage(int mode);
    int EnsureLoaded();
    // Drops the decoded images; the next use decodes the file again.
    void ReleaseImage();
    int GetImageMode() const;
    // The current picture's size; 0 when it cannot be loaded.
    int GetImageWidth();
    int GetImageHeight();
    // The size as last decoded from the file.
    int GetLoadedWidth() const;
    int GetLoadedHeight() const;
    // The working image is no longer the loaded picture.
    bool IsImageEdited() const;

    // Draws the picture fitted into rect (see FitPictureRect); 0 when nothing was drawn.
    int Draw(QPainter& painter, const QRect& rect);

    // Edits of the editable form: 1 done, 0 refused or failed (nothing changed).
    int RotateImage();
    // Always from the loaded picture, so steps do not add up.
    int AdjustBrightness(bool darken, int amount);
    int AdjustContrast(bool more, int amount);
    int ScaleImage(int width, int height);
    int CropImage(int width, int height, int x, int y);
    int RevertImage();
    // Writes the working image in the format the path's extension names.
    int SaveImageAs(const std::string& path);
    // Writes the working image over the picture's file; 1 with nothing to write.
    int CommitImage();

    CExifInfo& GetExifInfo();
    int32_t GetExifRead() const;

private:
    CPictureImage& Image();

    int32_t m_displayCaption = 1;
    bool m_fitToFrame = true;
    bool m_whiteBorder = false;
    std::unique_ptr<CPictureImage> m_image;
};

#pragma once
// The decoded picture of one picture item, in its display form or its
// editable form, with the edits made on it and its camera information.

#include "pictures/exif_info.h"
#include "pictures/picture_fit.h"

#include <QImage>
#include <QString>

class QPainter;

class CPictureImage
{
public:
    enum Mode
    {
        DisplayForm = 0,
        EditableForm = 1
    };

    // 1 when loaded (the EXIF block is then read again); 0 after a failed load,
    // which leaves the display form. In the editable form it returns 1 at once.
    int LoadImage(const QString& path, int mode);
    // Loads in the current form when nothing is loaded; 0 when that fails.
    int EnsureLoaded(const QString& path);
    void Release();

    int GetMode() const { return m_mode; }
    // The working image's size in the editable form, the display image's otherwise.
    QSize GetSize(const QString& path);
    QSize GetLoadedSize() const { return m_loadedSize; }
    QSize GetCurrentSize() const { return m_currentSize; }
    bool IsEdited() const { return m_edited; }
    const QImage& GetWorkingImage() const { return m_working; }

    int Draw(QPainter& painter, const QRect& target, const QString& path, bool fitToFrame,
             bool whiteBorder);

    int Rotate(const QString& path);
    int AdjustBrightness(const QString& path, bool darken, int amount);
    int AdjustContrast(const QString& path, bool more, int amount);
    int Scale(const QString& path, int width, int height);
    int Crop(const QString& path, int width, int height, int x, int y);
    int Revert();
    int SaveAs(const QString& path, const QString& target);
    int Commit(const QString& path);

    CExifInfo& GetExifInfo() { return m_exif; }

private:
    bool LoadCurrentForm(const QString& path);
    bool IsLoaded() const;
    // Makes the edited image the working image; 0 when it could not be made.
    int Replace(const QImage& edited);

    int m_mode = DisplayForm;
    QImage m_display;
    bool m_displayFailed = false; // a failed decode is not retried at every paint
    QImage m_source;
    QImage m_working;
    bool m_edited = false; // the working image is no longer the source image
    QSize m_loadedSize;
    QSize m_currentSize;
    CScaledImageCache m_scaled;
    CExifInfo m_exif;
};

#include "pictures/picture_image.h"

#include "pictures/image_decode.h"
#include "pictures/image_edits.h"
#include "pictures/image_writer.h"

#include <QColorSpace>
#include <QFile>

namespace {

// The display form is shown in sRGB, as a colour-managed viewer would.
QImage InDisplayColors(QImage image)
{
    const QColorSpace colorSpace = image.colorSpace();
    if (colorSpace.isValid() && colorSpace != QColorSpace(QColorSpace::SRgb))
        image.convertToColorSpace(QColorSpace::SRgb);
    return image;
}

} // namespace

int CPictureImage::LoadImage(const QString& path, int mode)
{
    if (m_mode != DisplayForm)
        return 1;
    Release();
    m_mode = mode == EditableForm ? EditableForm : DisplayForm;
    if (!LoadCurrentForm(path)) {
        m_mode = DisplayForm;
        return 0;
    }
    m_exif.ReadExif(QFile::encodeName(path).toStdString());
    return 1;
}

int CPictureImage::EnsureLoaded(const QString& path)
{
    if (IsLoaded())
        return 1;
    if (m_mode == DisplayForm && m_displayFailed)
        return 0;
    return LoadCurrentForm(path) ? 1 : 0;
}

void CPictureImage::Release()
{
    m_display = QImage();
    m_displayFailed = false;
    m_source = QImage();
    m_working = QImage();
    m_edited = false;
    m_scaled = CScaledImageCache();
}

bool CPictureImage::IsLoaded() const
{
    return m_mode == EditableForm ? !m_source.isNull() : !m_display.isNull();
}

bool CPictureImage::LoadCurrentForm(const QString& path)
{
    const CDecodedPicture decoded = DecodePicture(path);
    if (m_mode == DisplayForm) {
        m_display = InDisplayColors(decoded.image);
        m_displayFailed = m_display.isNull();
        if (m_displayFailed)
            return false;
        m_loadedSize = m_currentSize = m_display.size();
        return true;
    }
    m_source = ToEditableFormat(decoded.image);
    if (m_source.isNull())
        return false;
    m_working = m_source;
    m_edited = false;
    m_loadedSize = m_currentSize = m_source.size();
    return true;
}

QSize CPictureImage::GetSize(const QString& path)
{
    if (!EnsureLoaded(path))
        return QSize(0, 0);
    return m_mode == EditableForm ? m_working.size() : m_display.size();
}

int CPictureImage::Draw(QPainter& painter, const QRect& target, const QString& path,
                        bool fitToFrame, bool whiteBorder)
{
    if (!EnsureLoaded(path))
        return 0;
    const QImage& image = m_mode == EditableForm ? m_working : m_display;
    return DrawFittedPicture(painter, image, image.size(), target, fitToFrame, whiteBorder,
                             &m_scaled)
               ? 1
               : 0;
}

int CPictureImage::Replace(const QImage& edited)
{
    if (edited.isNull())
        return 0;
    m_working = edited;
    m_edited = true;
    m_currentSize = edited.size();
    return 1;
}

int CPictureImage::Rotate(const QString& path)
{
    if (m_mode != EditableForm || !EnsureLoaded(path))
        return 0;
    return Replace(RotateQuarterClockwise(m_working));
}

int CPictureImage::AdjustBrightness(const QString& path, bool darken, int amount)
{
    if (m_mode != EditableForm || !EnsureLoaded(path))
        return 0;
    // From the source image, so that brightness steps do not add up.
    return Replace(::AdjustBrightness(m_source, darken, amount));
}

int CPictureImage::AdjustContrast(const QString& path, bool more, int amount)
{
    if (m_mode != EditableForm || !EnsureLoaded(path))
        return 0;
    return Replace(::AdjustContrast(m_working, more, amount));
}

int CPictureImage::Scale(const QString& path, int width, int height)
{
    if (m_mode != EditableForm || !EnsureLoaded(path))
        return 0;
    return Replace(ScaleSmooth(m_working, width, height));
}

int CPictureImage::Crop(const QString& path, int width, int height, int x, int y)
{
    if (m_mode != EditableForm || !EnsureLoaded(path))
        return 0;
    return Replace(CropBlock(m_working, width, height, x, y));
}

int CPictureImage::Revert()
{
    if (m_mode != EditableForm)
        return 0;
    m_working = m_source;
    m_edited = false;
    return 1;
}

int CPictureImage::SaveAs(const QString& path, const QString& target)
{
    if (m_mode != EditableForm || !EnsureLoaded(path))
        return 0;
    return SaveImageByExtension(m_working, target) ? 1 : 0;
}

int CPictureImage::Commit(const QString& path)
{
    if (m_mode != EditableForm)
        return 0;
    if (!m_edited)
        return 1;
    // A failed save keeps the edits (the file itself is left whole).
    if (!SaveImageByExtension(m_working, path))
        return 0;
    m_source = QImage();
    m_working = QImage();
    m_edited = false;
    m_scaled = CScaledImageCache();
    return 1;
}

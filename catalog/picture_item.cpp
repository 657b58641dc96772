#include "catalog/picture_item.h"

#include "pictures/picture_image.h"

#include <QFile>

namespace {

QString PathOf(const std::string& path)
{
    return QFile::decodeName(QByteArray::fromStdString(path));
}

} // namespace

CPictureItem::CPictureItem() = default;

CPictureItem::CPictureItem(const CDocumentItem& document)
{
    m_label = document.GetLabel();
    m_pathname = document.GetPathname();
    m_documentCategoryPath = document.GetDocumentCategoryPath();
    m_categoryPath = document.GetCategoryPath();
    m_originalPathname = document.GetOriginalPathname();
    m_fileSize = document.GetFileSize();
    m_fileCreateDate = document.GetFileCreateDate();
    m_fileModifyDate = document.GetFileModifyDate();
    m_createDate = document.GetCreateDate();
    SetSequenceNumber(document.GetSequenceNumber());
    m_keyword1 = document.GetKeyword1();
    m_keyword2 = document.GetKeyword2();
    m_managedFlag = document.GetManagedFlag();
    m_updateDate = CTime::GetCurrentTime();
}

CPictureItem::CPictureItem(const CPictureItem& other)
    : CDocumentItem(other), m_displayCaption(other.m_displayCaption),
      m_fitToFrame(other.m_fitToFrame), m_whiteBorder(other.m_whiteBorder)
{}

CPictureItem::~CPictureItem() = default;

CPictureImage& CPictureItem::Image()
{
    if (!m_image)
        m_image = std::make_unique<CPictureImage>();
    return *m_image;
}

int CPictureItem::LoadImage(int mode)
{
    return Image().LoadImage(PathOf(m_pathname), mode);
}

int CPictureItem::EnsureLoaded()
{
    return Image().EnsureLoaded(PathOf(m_pathname));
}

void CPictureItem::ReleaseImage()
{
    if (m_image)
        m_image->Release();
}

int CPictureItem::GetImageMode() const
{
    return m_image ? m_image->GetMode() : kDisplayForm;
}

int CPictureItem::GetImageWidth()
{
    return Image().GetSize(PathOf(m_pathname)).width();
}

int CPictureItem::GetImageHeight()
{
    return Image().GetSize(PathOf(m_pathname)).height();
}

int CPictureItem::GetLoadedWidth() const
{
    return m_image ? m_image->GetLoadedSize().width() : 0;
}

int CPictureItem::GetLoadedHeight() const
{
    return m_image ? m_image->GetLoadedSize().height() : 0;
}

bool CPictureItem::IsImageEdited() const
{
    return m_image && m_image->IsEdited();
}

int CPictureItem::Draw(QPainter& painter, const QRect& rect)
{
    return Image().Draw(painter, rect, PathOf(m_pathname), m_fitToFrame, m_whiteBorder);
}

int CPictureItem::RotateImage()
{
    return Image().Rotate(PathOf(m_pathname));
}

int CPictureItem::AdjustBrightness(bool darken, int amount)
{
    return Image().AdjustBrightness(PathOf(m_pathname), darken, amount);
}

int CPictureItem::AdjustContrast(bool more, int amount)
{
    return Image().AdjustContrast(PathOf(m_pathname), more, amount);
}

int CPictureItem::ScaleImage(int width, int height)
{
    return Image().Scale(PathOf(m_pathname), width, height);
}

int CPictureItem::CropImage(int width, int height, int x, int y)
{
    return Image().Crop(PathOf(m_pathname), width, height, x, y);
}

int CPictureItem::RevertImage()
{
    return Image().Revert();
}

int CPictureItem::SaveImageAs(const std::string& path)
{
    return Image().SaveAs(PathOf(m_pathname), PathOf(path));
}

int CPictureItem::CommitImage()
{
    return Image().Commit(PathOf(m_pathname));
}

CExifInfo& CPictureItem::GetExifInfo()
{
    return Image().GetExifInfo();
}

int32_t CPictureItem::GetExifRead() const
{
    return m_image ? m_image->GetExifInfo().exifRead : 0;
}

#include "catalog/picture_item.h"

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

CPictureItem::~CPictureItem() = default;

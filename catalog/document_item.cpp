#include "catalog/document_item.h"

#include "catalog/archive.h"
#include "catalog/text_util.h"

CDocumentItem::CDocumentItem()
{
    m_updateDate = CTime::GetCurrentTime();
}

CDocumentItem::CDocumentItem(const std::string& path, const CFileStatus& status)
    : m_originalPathname(OneLine(path)), m_fileCreateDate(status.createTime),
      m_fileModifyDate(status.modifyTime), m_fileSize(status.size), m_pathname(OneLine(path)),
      m_label(LabelFromPath(OneLine(path)))
{
    m_updateDate = CTime::GetCurrentTime();
}

CDocumentItem::CDocumentItem(const CDocumentItem& other)
    : CCatalogItem(), m_documentCategoryPath(other.m_documentCategoryPath),
      m_originalPathname(other.m_originalPathname), m_fileCreateDate(other.m_fileCreateDate),
      m_fileModifyDate(other.m_fileModifyDate), m_runtimeFlag(other.m_runtimeFlag),
      m_managedFlag(other.m_managedFlag), m_intC(other.m_intC), m_intD(other.m_intD),
      m_intE(other.m_intE), m_fileSize(other.m_fileSize), m_pathname(other.m_pathname),
      m_label(other.m_label)
{
    CopyBaseFrom(other);
}

std::string CDocumentItem::LabelFromPath(const std::string& path)
{
    if (path.size() <= 4)
        return std::string();
    std::string label = path.substr(0, path.size() - 4);
    const size_t slash = label.rfind('/');
    if (slash != std::string::npos)
        label = label.substr(slash + 1);
    return label;
}

void CDocumentItem::SerializeVersioned(CArchive& ar, int version)
{
    ar.Line(m_pathname);
    ar.Line(m_originalPathname);
    ar.Line(m_label);
    ar.Line(m_documentCategoryPath);
    ar.Time(m_createDate); // written twice; the common record's copy wins on reading
    ar.Time(m_fileCreateDate);
    ar.Time(m_fileModifyDate);
    ar.UInt64(m_fileSize);
    if (version >= 6) {
        ar.Int(m_intD);
        ar.Int(m_intE);
        ar.Int(m_intC);
    }
    CCatalogItem::Serialize(ar);
}

void CDocumentItem::SetDocumentCategoryPath(const std::string& path)
{
    m_documentCategoryPath = OneLine(path);
}

void CDocumentItem::SetOriginalPathname(const std::string& path)
{
    m_originalPathname = OneLine(path);
}

void CDocumentItem::SetPathname(const std::string& path)
{
    m_pathname = OneLine(path);
}

void CDocumentItem::SetLabel(const std::string& label)
{
    m_label = OneLine(label);
}

#include "catalog/catalog_item.h"

#include "catalog/archive.h"
#include "catalog/text_util.h"

void CCatalogRecord::SetCategoryPath(const std::string& path)
{
    m_categoryPath = OneLine(path);
}

void CCatalogRecord::SetKeyword1(const std::string& keyword)
{
    m_keyword1 = OneLine(keyword);
}

void CCatalogRecord::SetKeyword2(const std::string& keyword)
{
    m_keyword2 = OneLine(keyword);
}

CCatalogItem::CCatalogItem(const std::string& kindTag) : m_kindTag(OneLine(kindTag)) {}

CCatalogItem::~CCatalogItem() = default;

void CCatalogItem::Serialize(CArchive& ar)
{
    ar.Line(m_name);
    ar.Line(m_kindTag);
    ar.Line(m_categoryPath);
    ar.Line(m_keyword1);
    ar.Line(m_keyword2);
    ar.Int(m_flagB);
    ar.Time(m_createDate);
    ar.Time(m_updateDate);
    ar.Int(m_flagA);
    ar.Int64(m_documentNumber);
}

void CCatalogItem::AppendTextLines(std::vector<std::string>&) const {}

std::string CCatalogItem::GetMailText() const
{
    return std::string();
}

int CCatalogItem::GetPrintLineCount() const
{
    return 0;
}

void CCatalogItem::Mail(CAppContext&) {}

bool CCatalogItem::Edit(CAppContext&)
{
    return true;
}

bool CCatalogItem::ViewAsWebPage(CAppContext&)
{
    return true;
}

void CCatalogItem::WriteWebPages(CAppContext&) {}

void CCatalogItem::CopyBaseFrom(const CCatalogItem& other)
{
    m_name = other.m_name;
    m_kindTag = other.m_kindTag;
    m_categoryPath = other.m_categoryPath;
    m_keyword1 = other.m_keyword1;
    m_keyword2 = other.m_keyword2;
    m_createDate = other.m_createDate;
    m_updateDate = other.m_updateDate;
    m_flagA = other.m_flagA;
    m_documentNumber = other.m_documentNumber;
    m_sequenceNumber = other.m_sequenceNumber;
    m_flagB = other.m_flagB;
}

void CCatalogItem::SetName(const std::string& name)
{
    m_name = OneLine(name);
}

void CCatalogItem::SetKindTag(const std::string& tag)
{
    m_kindTag = OneLine(tag);
}

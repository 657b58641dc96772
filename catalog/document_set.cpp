#include "catalog/document_set.h"

#include "catalog/archive.h"
#include "catalog/text_util.h"

CDocumentSetBase::CDocumentSetBase() : CCatalogItem(kKindDocumentSets)
{
    m_categoryPath = kKindDocumentSets;
}

void CDocumentSetBase::SetLabel(const std::string& label)
{
    m_label = OneLine(label);
}

void CDocumentSetBase::SerializeVersioned(CArchive& ar, int version)
{
    SerializeSetRecord(ar, version);
}

void CDocumentSetBase::SerializeSetRecord(CArchive& ar, int version)
{
    if (ar.IsStoring()) {
        // A one-character description would be dropped by every reader (they
        // skip lengths below 2), so it goes out with a blank appended.
        if (m_description.size() == 1) {
            ar.WriteCountedText(m_description + " ");
        } else if (m_description.size() > 1) {
            ar.WriteCountedText(m_description);
        } else {
            ar.WriteInt(0);
        }
        ar.WriteLine(m_label);
        ar.WriteInt(static_cast<int32_t>(m_members.size()));
        for (const auto& member : m_members)
            member->SerializeVersioned(ar, version);
        // Only an album writes its attributes, so only an album may say it has them.
        ar.WriteInt(IsAlbum() ? m_albumFlag : 0);
    } else {
        const int32_t n = ar.ReadInt();
        if (n < 0 || n > ar.BytesLeft())
            ar.Fail(CArchiveException::BadLength,
                    StrFormat("a description length of %d does not fit in the %lld bytes left", n,
                              static_cast<long long>(ar.BytesLeft())));
        m_description.clear();
        if (n > 1) {
            m_description.assign(static_cast<size_t>(n), '\0');
            ar.ReadBytes(m_description.data(), m_description.size());
        }
        m_label = ar.ReadLine();
        m_members.RemoveAll();
        const int32_t count = ar.ReadCount(CDocumentItem::kMinRecordBytes, "set member");
        for (int32_t i = 0; i < count; ++i) {
            auto member = std::make_shared<CDocumentItem>();
            member->SerializeVersioned(ar, version);
            member->SetSequenceNumber(i + 1);
            m_members.Append(std::move(member));
        }
        if (version > 3)
            m_albumFlag = ar.ReadInt();
    }
    CCatalogItem::Serialize(ar);
}

void CDocumentSetBase::AppendTextLines(std::vector<std::string>& lines) const
{
    for (std::string& line : SplitCrLfLines(m_description))
        lines.push_back(std::move(line));
}

std::string CDocumentSetBase::GetMailText() const
{
    return m_description;
}

CDocumentSet::CDocumentSet(const CDocumentSet& other) : CDocumentSetBase()
{
    m_description = other.m_description;
    m_label = other.m_label;
    m_keyword1 = other.m_keyword1;
    m_keyword2 = other.m_keyword2;
    SetKindTag(other.GetKindTag());
    m_categoryPath = other.m_categoryPath;
    SetDocumentNumber(other.GetDocumentNumber());
    SetSequenceNumber(other.GetSequenceNumber());
    SetName(other.m_label);
}

void CDocumentSet::AssignFrom(const CDocumentSet& other)
{
    CopyBaseFrom(other);
    m_description = other.m_description;
    m_label = other.m_label;
    m_albumFlag = other.m_albumFlag;
    for (const auto& member : other.m_members)
        m_members.Append(member);
}

CPhotoAlbum::CPhotoAlbum()
{
    m_albumFlag = 1;
    m_categoryPath = kKindDocumentSets;
}

CPhotoAlbum::CPhotoAlbum(const CDocumentSet& set) : CDocumentSet(set)
{
    m_thumbnailSize = 1;
}

void CPhotoAlbum::SerializeVersioned(CArchive& ar, int version)
{
    SerializeSetRecord(ar, version);
    if (m_albumFlag == 0 || (ar.IsLoading() && version <= 3))
        return;
    int32_t background = static_cast<int32_t>(m_backgroundColor);
    ar.Int(background);
    m_backgroundColor = static_cast<uint32_t>(background);
    ar.Int(m_picturesPerPage);
    ar.Int(m_columns);
    ar.Int(m_displayCaption);
    ar.Int(m_thumbnailSize);
    ar.Int(m_displayType);
    ar.CString(m_title);
}

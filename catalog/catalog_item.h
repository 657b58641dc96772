#pragma once
// The base of everything filed in the catalog: the fields every item shares
// and the virtual operations that printing, mail, editing and web pages call
// without knowing an item's kind.

#include "catalog/ctime.h"

#include <cstdint>
#include <string>
#include <vector>

class CArchive;
class CAppContext;

// Kind tags by which the views choose an item's list; documents and pictures have none.
inline constexpr const char* kKindEvent = "EVENT";
inline constexpr const char* kKindRecipe = "RECIPE";
inline constexpr const char* kKindDocumentSets = "DOCUMENT SETS";

// The part every item has: its category, keywords and dates.
class CCatalogRecord
{
public:
    virtual ~CCatalogRecord() = default;

    const std::string& GetCategoryPath() const { return m_categoryPath; }
    void SetCategoryPath(const std::string& path);
    CTime GetCreateDate() const { return m_createDate; }
    void SetCreateDate(CTime date) { m_createDate = date; }
    const std::string& GetKeyword1() const { return m_keyword1; }
    void SetKeyword1(const std::string& keyword);
    const std::string& GetKeyword2() const { return m_keyword2; }
    void SetKeyword2(const std::string& keyword);
    CTime GetUpdateDate() const { return m_updateDate; }
    void SetUpdateDate(CTime date) { m_updateDate = date; }

protected:
    CCatalogRecord() = default;
    CCatalogRecord(const CCatalogRecord&) = default;
    CCatalogRecord& operator=(const CCatalogRecord&) = default;

    std::string m_categoryPath;
    CTime m_createDate = CTime::GetCurrentTime();
    std::string m_keyword1;
    std::string m_keyword2;
    CTime m_updateDate;
};

class CCatalogItem : public CCatalogRecord
{
public:
    explicit CCatalogItem(const std::string& kindTag = std::string());
    ~CCatalogItem() override;

    // The common item record, written last by every item.
    virtual void Serialize(CArchive& ar);
    // Fewest bytes the common record takes: five lines, two ints, two times, an int64.
    static constexpr int64_t kMinCommonRecordBytes = 5 + 4 + 2 * 4 + 4 + 8;
    // Lines for printing and text export.
    virtual void AppendTextLines(std::vector<std::string>& lines) const;
    virtual std::string GetMailText() const;
    // Lines the item takes on a printed page (pagination adds 4 per item).
    virtual int GetPrintLineCount() const;
    virtual void Mail(CAppContext& context);
    // Shows the item's dialog on a working copy; true when confirmed and taken back.
    virtual bool Edit(CAppContext& context);
    virtual bool ViewAsWebPage(CAppContext& context);
    virtual void WriteWebPages(CAppContext& context);

    // Copies name, kind tag, category path, keywords, dates, flag A, document
    // number, sequence number and flag B; not the reference or print counts.
    void CopyBaseFrom(const CCatalogItem& other);

    const std::string& GetName() const { return m_name; }
    void SetName(const std::string& name);
    const std::string& GetKindTag() const { return m_kindTag; }
    void SetKindTag(const std::string& tag);
    int32_t GetFlagA() const { return m_flagA; }
    void SetFlagA(int32_t flag) { m_flagA = flag; }
    int32_t GetFlagB() const { return m_flagB; }
    void SetFlagB(int32_t flag) { m_flagB = flag; }
    int32_t GetSequenceNumber() const { return m_sequenceNumber; }
    void SetSequenceNumber(int32_t number) { m_sequenceNumber = number; }
    int32_t GetPrintPage() const { return m_printPage; }
    void SetPrintPage(int32_t page) { m_printPage = page; }
    int64_t GetDocumentNumber() const { return m_documentNumber; }
    void SetDocumentNumber(int64_t number) { m_documentNumber = number; }
    // Number of item lists that hold the item.
    int32_t GetRefCount() const { return m_refCount; }

protected:
    CCatalogItem(const CCatalogItem&) = delete;
    CCatalogItem& operator=(const CCatalogItem&) = delete;

private:
    friend class CItemList;

    std::string m_name;
    std::string m_kindTag;
    int32_t m_flagA = 0;
    int32_t m_sequenceNumber = 0;
    int32_t m_printPage = 0;
    int32_t m_flagB = 1;
    int32_t m_refCount = 0;
    int64_t m_documentNumber = 0;
};

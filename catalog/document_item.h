#pragma once
// A document (any disk file) and a picture (a picture file) in the catalog.

#include "catalog/catalog_item.h"
#include "catalog/file_status.h"

#include <memory>

class CDocumentItem : public CCatalogItem
{
public:
    CDocumentItem();
    // A document for the file at path, as the file system describes it.
    CDocumentItem(const std::string& path, const CFileStatus& status);
    // The base copy and every stored document field.
    CDocumentItem(const CDocumentItem& other);

    // The document record, then the common item record.
    virtual void SerializeVersioned(CArchive& ar, int version);

    virtual bool IsPicture() const { return false; }

    // Fewest bytes a document record can take in the file (four lines, four
    // times, the size and the common record); counts are checked against it.
    static constexpr int64_t kMinRecordBytes = 4 + 3 * 4 + 8 + kMinCommonRecordBytes;

    // The caption a file gets: the path without its last four characters,
    // then only what follows its last '/'.
    static std::string LabelFromPath(const std::string& path);

    const std::string& GetDocumentCategoryPath() const { return m_documentCategoryPath; }
    void SetDocumentCategoryPath(const std::string& path);
    const std::string& GetOriginalPathname() const { return m_originalPathname; }
    void SetOriginalPathname(const std::string& path);
    CTime GetFileCreateDate() const { return m_fileCreateDate; }
    void SetFileCreateDate(CTime date) { m_fileCreateDate = date; }
    CTime GetFileModifyDate() const { return m_fileModifyDate; }
    void SetFileModifyDate(CTime date) { m_fileModifyDate = date; }
    int32_t GetRuntimeFlag() const { return m_runtimeFlag; }
    void SetRuntimeFlag(int32_t flag) { m_runtimeFlag = flag; }
    int32_t GetManagedFlag() const { return m_managedFlag; }
    void SetManagedFlag(int32_t flag) { m_managedFlag = flag; }
    int32_t GetIntC() const { return m_intC; }
    void SetIntC(int32_t value) { m_intC = value; }
    int32_t GetIntD() const { return m_intD; }
    void SetIntD(int32_t value) { m_intD = value; }
    int32_t GetIntE() const { return m_intE; }
    void SetIntE(int32_t value) { m_intE = value; }
    uint64_t GetFileSize() const { return m_fileSize; }
    void SetFileSize(uint64_t size) { m_fileSize = size; }
    const std::string& GetPathname() const { return m_pathname; }
    void SetPathname(const std::string& path);
    const std::string& GetLabel() const { return m_label; }
    void SetLabel(const std::string& label);

protected:
    std::string m_documentCategoryPath;
    std::string m_originalPathname;
    CTime m_fileCreateDate;
    CTime m_fileModifyDate;
    int32_t m_runtimeFlag = 1;
    int32_t m_managedFlag = 1;
    int32_t m_intC = 0;
    int32_t m_intD = -1;
    int32_t m_intE = -1;
    uint64_t m_fileSize = 0;
    std::string m_pathname;
    std::string m_label;
};

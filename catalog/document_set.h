#pragma once
// Document sets (named groups of documents) and photo albums (sets of
// pictures with web-page attributes).

#include "catalog/item_list.h"

class CWebSite;

class CDocumentSetBase : public CCatalogItem
{
public:
    CDocumentSetBase();

    // The set record, then the common item record.
    virtual void SerializeVersioned(CArchive& ar, int version);
    void AppendTextLines(std::vector<std::string>& lines) const override;
    std::string GetMailText() const override;
    // Offers the description with every member's file attached.
    void Mail(CAppContext& context) override;

    virtual bool IsAlbum() const { return false; }

    int32_t GetAlbumFlag() const { return m_albumFlag; }
    void SetAlbumFlag(int32_t flag) { m_albumFlag = flag; }
    CItemList& GetMembers() { return m_members; }
    const CItemList& GetMembers() const { return m_members; }
    const std::string& GetDescription() const { return m_description; }
    void SetDescription(const std::string& text) { m_description = text; }
    const std::string& GetLabel() const { return m_label; }
    void SetLabel(const std::string& label);

protected:
    void SerializeSetRecord(CArchive& ar, int version);

    int32_t m_albumFlag = 0;
    CItemList m_members;
    std::string m_description;
    std::string m_label;
};

class CDocumentSet : public CDocumentSetBase
{
public:
    CDocumentSet() = default;
    // Takes description, label, keywords, kind tag, category path, document and
    // sequence numbers; the name becomes the other set's label. No members.
    explicit CDocumentSet(const CDocumentSet& other);

    // The "Document Sets" dialog; a set without a label is not taken.
    bool Edit(CAppContext& context) override;

    // The base copy, description, label and album flag; the other set's members
    // are shared into this set's list.
    void AssignFrom(const CDocumentSet& other);
};

class CPhotoAlbum : public CDocumentSet
{
public:
    CPhotoAlbum();
    // An album made from another set: the set copy with the album defaults
    // (thumbnail size 1); the album flag stays 0 as the copy gives it.
    explicit CPhotoAlbum(const CDocumentSet& set);

    // The set record, then the album attributes when the album flag is set.
    void SerializeVersioned(CArchive& ar, int version) override;
    bool IsAlbum() const override { return true; }
    // Generates the pages into the temporary folder and opens the index.
    bool ViewAsWebPage(CAppContext& context) override;
    // Mails the album's pages and pictures, resized or converted if asked.
    void Mail(CAppContext& context) override;

    // Writes the index (the site's master page), one page per picturesPerPage
    // pictures and a numbered copy of every picture into folder. False when
    // the folder cannot be made or the index cannot be written; pictures
    // that could not be copied are counted in failedCopies.
    bool CreateWebPages(CWebSite& site, const std::string& folder, int* failedCopies = nullptr);

    int32_t GetPicturesPerPage() const { return m_picturesPerPage; }
    void SetPicturesPerPage(int32_t n) { m_picturesPerPage = n; }
    int32_t GetColumns() const { return m_columns; }
    void SetColumns(int32_t n) { m_columns = n; }
    int32_t GetDisplayCaption() const { return m_displayCaption; }
    void SetDisplayCaption(int32_t flag) { m_displayCaption = flag; }
    int32_t GetThumbnailSize() const { return m_thumbnailSize; }
    void SetThumbnailSize(int32_t size) { m_thumbnailSize = size; }
    int32_t GetDisplayType() const { return m_displayType; }
    void SetDisplayType(int32_t type) { m_displayType = type; }
    const std::string& GetTitle() const { return m_title; }
    void SetTitle(const std::string& title) { m_title = title; }
    const std::string& GetIndexPath() const { return m_indexPath; }
    void SetIndexPath(const std::string& path) { m_indexPath = path; }
    // 0x00BBGGRR
    uint32_t GetBackgroundColor() const { return m_backgroundColor; }
    void SetBackgroundColor(uint32_t color) { m_backgroundColor = color; }
    // The files the last web-page generation wrote: copies, pages, the index last.
    CItemList& GetGeneratedFiles() { return m_generatedFiles; }
    const CItemList& GetGeneratedFiles() const { return m_generatedFiles; }
    const std::string& GetIndexFileName() const { return m_indexFileName; }
    void SetIndexFileName(const std::string& name) { m_indexFileName = name; }
    int32_t GetPageFlag() const { return m_pageFlag; }
    void SetPageFlag(int32_t flag) { m_pageFlag = flag; }

private:
    int32_t m_picturesPerPage = 6;
    int32_t m_columns = 2;
    int32_t m_displayCaption = 1;
    int32_t m_thumbnailSize = 2;
    int32_t m_displayType = 1;
    std::string m_title;
    std::string m_indexPath;
    uint32_t m_backgroundColor = 0xFFFFFF;
    CItemList m_generatedFiles;
    std::string m_indexFileName;
    int32_t m_pageFlag = 1;
};

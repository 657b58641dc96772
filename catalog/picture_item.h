#pragma once
// A document that is a picture file, with its run-time picture state.

#include "catalog/document_item.h"

// A document that is a picture file. It stores exactly what a document
// stores; everything else it holds (the decoded picture, camera data) is
// rebuilt at run time, so keep it small: a catalog holds 100,000 of them.
class CPictureItem : public CDocumentItem
{
public:
    CPictureItem();
    // Takes the file, caption, categories, dates, keywords and sequence number
    // of a document; the update date is now and the document number stays 0.
    explicit CPictureItem(const CDocumentItem& document);
    ~CPictureItem() override;

    bool IsPicture() const override { return true; }

    int32_t GetDisplayCaption() const { return m_displayCaption; }
    void SetDisplayCaption(int32_t flag) { m_displayCaption = flag; }

private:
    int32_t m_displayCaption = 1;
};

#pragma once
// The services the commands hand work to: the user's mail program and the
// text export and printing of data items. The output subsystem implements
// them; the commands only need these calls.

#include <string>
#include <vector>

class CCatalogItem;

struct CMailAttachment
{
    std::string path;
    std::string name; // the file name shown in the message
};

class CMailService
{
public:
    virtual ~CMailService() = default;
    virtual bool IsAvailable() const = 0;
    // Opens the mail program's compose window with the files attached.
    virtual bool SendDocuments(const std::vector<CMailAttachment>& attachments) = 0;
};

class CDataItemOutput
{
public:
    virtual ~CDataItemOutput() = default;
    // The items' mail texts back to back in one text file the user names.
    virtual void SaveDataItemsToFile(const std::vector<CCatalogItem*>& items) = 0;
    virtual void PrintDataItems(const std::vector<CCatalogItem*>& items) = 0;
};

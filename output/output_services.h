#pragma once
// The mail program and data item printing and export, as the command layer
// reaches them.

#include "views/services.h"

class CCommandEnv;
class CPrompt;

class CMailProgram : public CMailService
{
public:
    explicit CMailProgram(CPrompt& prompt) : m_prompt(prompt) {}
    bool IsAvailable() const override;
    bool SendDocuments(const std::vector<CMailAttachment>& attachments) override;

private:
    CPrompt& m_prompt;
};

class CDataItemPrinter : public CDataItemOutput
{
public:
    explicit CDataItemPrinter(CPrompt& prompt) : m_prompt(prompt) {}
    void SaveDataItemsToFile(const std::vector<CCatalogItem*>& items) override;
    void PrintDataItems(const std::vector<CCatalogItem*>& items) override;

private:
    CPrompt& m_prompt;
};

// Both services, for a command environment to use while this lives.
class COutputServices
{
public:
    explicit COutputServices(CPrompt& prompt) : m_mail(prompt), m_output(prompt) {}
    void InstallInto(CCommandEnv& env);

private:
    CMailProgram m_mail;
    CDataItemPrinter m_output;
};

#include "output/output_services.h"

#include "output/data_item_print.h"
#include "output/mapi_mail.h"
#include "views/command_env.h"

namespace {
std::vector<const CCatalogItem*> AsConst(const std::vector<CCatalogItem*>& items)
{
    return std::vector<const CCatalogItem*>(items.begin(), items.end());
}
} // namespace

bool CMailProgram::IsAvailable() const
{
    return CMapiMail(m_prompt).IsLoaded();
}

bool CMailProgram::SendDocuments(const std::vector<CMailAttachment>& attachments)
{
    CMapiMail mail(m_prompt);
    for (const CMailAttachment& attachment : attachments)
        mail.AddAttachment(attachment.path, attachment.name);
    return mail.Send();
}

void CDataItemPrinter::SaveDataItemsToFile(const std::vector<CCatalogItem*>& items)
{
    ::SaveDataItemsToFile(m_prompt, AsConst(items));
}

void CDataItemPrinter::PrintDataItems(const std::vector<CCatalogItem*>& items)
{
    ::PrintDataItems(m_prompt, AsConst(items));
}

void COutputServices::InstallInto(CCommandEnv& env)
{
    env.SetMail(&m_mail);
    env.SetOutput(&m_output);
}

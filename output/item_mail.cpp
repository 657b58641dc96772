// The mail operations of events, recipes and document sets, and the support mail.

#include "output/item_mail.h"

#include "catalog/app_context.h"
#include "catalog/catalog_items.h"
#include "catalog/prompt.h"
#include "output/mapi_mail.h"

namespace {

void ShowNotAvailable(CPrompt& prompt)
{
    prompt.MessageBox(CMapiMail::NotAvailableText(), "Send Mail", CPrompt::Icon::Stop);
}

} // namespace

bool MailSupport(CPrompt& prompt)
{
    CMapiMail mail(prompt);
    if (!mail.IsLoaded()) {
        ShowNotAvailable(prompt);
        return false;
    }
    mail.AddRecipient(kSupportAddress);
    mail.SetSubject("Hearthbook support issue");
    return mail.Send();
}

void CEventItem::Mail(CAppContext& context)
{
    CMapiMail mail(context.GetPrompt());
    if (!mail.IsLoaded()) {
        ShowNotAvailable(context.GetPrompt());
        return;
    }
    mail.SetBody(GetMailText());
    mail.Send();
}

void CRecipeItem::Mail(CAppContext& context)
{
    CMapiMail mail(context.GetPrompt());
    mail.SetBody(GetMailText());
    mail.Send();
}

void CDocumentSetBase::Mail(CAppContext& context)
{
    CMapiMail mail(context.GetPrompt());
    mail.SetBody(m_description);
    for (const auto& member : m_members)
        mail.AddAttachment(member->GetPathname(), CMapiMail::DisplayName(member->GetPathname()));
    mail.Send();
}

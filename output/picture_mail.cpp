// The photo album mail and the picture mail.

#include "output/picture_mail.h"

#include "catalog/app_context.h"
#include "catalog/app_folders.h"
#include "catalog/dialog_fields.h"
#include "catalog/document_set.h"
#include "catalog/picture_item.h"
#include "catalog/prompt.h"
#include "output/html_page.h"
#include "output/mapi_mail.h"
#include "output/picture_resize.h"

namespace {

// The convert question, then the resize dialog; true when pictures are to be changed.
bool AskToConvert(CPrompt& prompt, CPicResizeFields& fields)
{
    const CPrompt::Answer answer = prompt.MessageBox(
        "Would you like to convert or resize your pictures?\n\nHint 1: Decreasing picture sizes "
        "facilitate the mailing process.\nHint 2: Occasionally, the recipient of the pictures "
        "requires a specific format.",
        "Mail Photo Album", CPrompt::Icon::Question, CPrompt::Buttons::YesNo);
    return answer == CPrompt::Answer::Yes && prompt.ResizePictures(fields);
}

// Resizes (and converts) the picture into the work folder; the path of the
// file to attach: the unchanged file when it cannot be changed.
std::string ConvertedCopy(CPictureItem& picture, const CPicResizeFields& fields,
                          const std::string& folder)
{
    const std::string path =
        folder + "/" + ConvertedName(CMapiMail::DisplayName(picture.GetPathname()), fields);
    if (!ApplyResizeMode(picture, fields) || !picture.SaveImageAs(path))
        return picture.GetPathname();
    return path;
}

} // namespace

std::string MailWorkFolder()
{
    const std::string temp = CAppFolders::GetTempFolder();
    if (temp.empty())
        return temp;
    const std::string folder = temp + "/Hearthbook";
    return CAppFolders::CreateFolderPath(folder) ? folder : std::string();
}

bool MailPictures(CPrompt& prompt, const std::vector<CPictureItem*>& pictures)
{
    CMapiMail mail(prompt);
    if (!mail.IsLoaded()) {
        prompt.MessageBox(CMapiMail::NotAvailableText(), "Send Mail", CPrompt::Icon::Stop);
        return false;
    }
    CPicResizeFields fields;
    std::string folder;
    const bool converting = AskToConvert(prompt, fields);
    if (converting && (folder = MailWorkFolder()).empty())
        return false;
    for (CPictureItem* picture : pictures) {
        std::string path = picture->GetPathname();
        std::string name = CMapiMail::DisplayName(path);
        if (converting) {
            // A copy, so the picture shown in the program stays as it is.
            CPictureItem copy(*picture);
            path = ConvertedCopy(copy, fields, folder);
            name = CMapiMail::DisplayName(path);
        }
        mail.AddAttachment(path, name);
    }
    return mail.Send();
}

void CPhotoAlbum::Mail(CAppContext& context)
{
    CPrompt& prompt = context.GetPrompt();
    CMapiMail mail(prompt);
    const std::string folder = MailWorkFolder();
    if (!mail.IsLoaded() || folder.empty())
        return;
    CWebSite site(folder);
    CreateWebPages(site, folder);
    mail.SetBody(m_description + "\n\n\n\n" + "Hint for saving Photo Album attachments:\n" +
                 "\n1. Open this mail item." +
                 "\n2. Select all of the attachments, by holding down <Shift>click all "
                 "attachment." +
                 "\n3. On File menu, select the Save Attachments command." +
                 "\n4. To run, double<click> on file" + " " + m_indexFileName);
    CPicResizeFields fields;
    const bool converting = AskToConvert(prompt, fields);
    for (const auto& file : m_generatedFiles) {
        std::string path = file->GetPathname();
        if (converting && CAppFolders::IsPictureFile(path) == 1) {
            CPictureItem picture(*file);
            path = ConvertedCopy(picture, fields, folder);
        }
        mail.AddAttachment(path, CMapiMail::DisplayName(path));
    }
    mail.Send();
}

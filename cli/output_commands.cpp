// text, print, recipe-html and mail: items as text, printed pages, web pages and mail.

#include "catalog/tallowmere_doc.h"
#include "cli/cli_command.h"
#include "cli/console_prompt.h"
#include "output/album_pages.h"
#include "output/data_item_print.h"
#include "output/mapi_mail.h"
#include "output/output_services.h"
#include "output/picture_mail.h"
#include "output/picture_pages.h"

#include <QCommandLineOption>

#include <cstdio>

namespace {

// Opens the catalog and finds the items the arguments name by sequence
// number. Returns kExitOk, or the exit code after telling why not.
int OpenWithItems(const CliContext& c, std::unique_ptr<CTallowmereDoc>& doc,
                  std::vector<CCatalogItem*>& items)
{
    if (c.arguments.isEmpty())
        return c.Usage(QStringLiteral("name at least one item by its sequence number"));
    doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    for (const QString& argument : c.arguments) {
        bool ok = false;
        const int sequence = argument.toInt(&ok);
        CCatalogItem* item = ok ? doc->FindItemBySequence(sequence) : nullptr;
        if (!item)
            return c.Failure(QStringLiteral("no item has the sequence number '%1'").arg(argument));
        items.push_back(item);
    }
    return kExitOk;
}

// The one item of a command that writes pages into --folder.
int OpenWithPageItem(const CliContext& c, const QString& what, std::unique_ptr<CTallowmereDoc>& doc,
                     CCatalogItem*& item, std::string& folder)
{
    if (c.arguments.size() != 1 || !c.parser.isSet(QStringLiteral("folder")))
        return c.Usage(QStringLiteral("%1 takes one item and --folder DIR").arg(what));
    std::vector<CCatalogItem*> items;
    if (const int exit = OpenWithItems(c, doc, items))
        return exit;
    item = items.front();
    folder = c.parser.value(QStringLiteral("folder")).toStdString();
    return kExitOk;
}

std::vector<const CCatalogItem*> AsConst(const std::vector<CCatalogItem*>& items)
{
    return std::vector<const CCatalogItem*>(items.begin(), items.end());
}

int RunText(CliContext& c)
{
    std::unique_ptr<CTallowmereDoc> doc;
    std::vector<CCatalogItem*> items;
    if (const int exit = OpenWithItems(c, doc, items))
        return exit;
    const std::string text = DataItemsText(AsConst(items));
    if (!c.parser.isSet(QStringLiteral("out"))) {
        std::fwrite(text.data(), 1, text.size(), stdout);
        return kExitOk;
    }
    c.prompt.SetSaveFile(c.parser.value(QStringLiteral("out")).toStdString());
    return CTextFileSaver(text).SaveToFile(c.prompt) ? kExitOk : kExitFailure;
}

int RunPrint(CliContext& c)
{
    const bool pdf = c.parser.isSet(QStringLiteral("pdf"));
    const bool printer = c.parser.isSet(QStringLiteral("printer"));
    if (pdf == printer)
        return c.Usage(QStringLiteral("print needs either --pdf FILE or --printer QUEUE"));
    std::unique_ptr<CTallowmereDoc> doc;
    std::vector<CCatalogItem*> items;
    if (const int exit = OpenWithItems(c, doc, items))
        return exit;
    if (pdf)
        c.prompt.SetPdfFile(c.parser.value(QStringLiteral("pdf")).toStdString());
    else
        c.prompt.SetPrinter(c.parser.value(QStringLiteral("printer")).toStdString());
    return PrintDataItems(c.prompt, AsConst(items)) ? kExitOk : kExitFailure;
}

int RunRecipeHtml(CliContext& c)
{
    std::unique_ptr<CTallowmereDoc> doc;
    CCatalogItem* item = nullptr;
    std::string folder;
    if (const int exit = OpenWithPageItem(c, QStringLiteral("recipe-html"), doc, item, folder))
        return exit;
    auto* recipe = dynamic_cast<CRecipeItem*>(item);
    if (!recipe)
        return c.Failure(QStringLiteral("item %1 is not a recipe").arg(c.arguments.front()));
    CAppFolders::CreateFolderPath(folder);
    if (!recipe->WriteRecipePage(folder))
        return c.Failure(QStringLiteral("cannot write %1")
                             .arg(QString::fromStdString(recipe->GetWebPagePath())));
    std::printf("%s\n", recipe->GetWebPagePath().c_str());
    return kExitOk;
}

int RunAlbumHtml(CliContext& c)
{
    std::unique_ptr<CTallowmereDoc> doc;
    CCatalogItem* item = nullptr;
    std::string folder;
    if (const int exit = OpenWithPageItem(c, QStringLiteral("album-html"), doc, item, folder))
        return exit;
    auto* set = dynamic_cast<CDocumentSet*>(item);
    if (!set || !set->IsAlbum())
        return c.Failure(QStringLiteral("item %1 is not a photo album").arg(c.arguments.front()));
    auto& album = static_cast<CPhotoAlbum&>(*set);
    return SaveAlbumWebPages(c.prompt, album, folder) ? kExitOk : kExitFailure;
}

// --resize small | very-small | WIDTHxHEIGHT and --convert TYPE for mailed pictures.
bool ResizeFromOptions(const CliContext& c, CPicResizeFields& fields, bool& wanted)
{
    const QString resize = c.parser.value(QStringLiteral("resize"));
    const QString convert = c.parser.value(QStringLiteral("convert"));
    wanted = !resize.isEmpty() || !convert.isEmpty();
    fields.mode = 0; // unchanged unless --resize says otherwise
    if (resize == QLatin1String("small")) {
        fields.mode = CPicResizeFields::Small;
    } else if (resize == QLatin1String("very-small")) {
        fields.mode = CPicResizeFields::VerySmall;
    } else if (!resize.isEmpty()) {
        const QStringList size = resize.split(QLatin1Char('x'));
        bool okWidth = false;
        bool okHeight = false;
        fields.mode = CPicResizeFields::Scale;
        fields.width = size.value(0).toInt(&okWidth);
        fields.height = size.value(1).toInt(&okHeight);
        if (size.size() != 2 || !okWidth || !okHeight || fields.width <= 0 || fields.height <= 0)
            return false;
    }
    if (!convert.isEmpty()) {
        if (!QStringList{"jpg", "bmp", "png", "gif"}.contains(convert))
            return false;
        fields.convert = true;
        fields.pictureType = convert.toStdString();
    }
    return true;
}

int RunMail(CliContext& c)
{
    CPicResizeFields resize;
    bool resizing = false;
    if (!ResizeFromOptions(c, resize, resizing))
        return c.Usage(QStringLiteral("--resize takes small, very-small or WIDTHxHEIGHT; "
                                      "--convert takes jpg, bmp, png or gif"));
    if (resizing)
        c.prompt.SetResize(resize);
    std::unique_ptr<CTallowmereDoc> doc;
    std::vector<CCatalogItem*> items;
    if (const int exit = OpenWithItems(c, doc, items))
        return exit;
    const int errorsBefore = c.prompt.ErrorCount();
    std::vector<CPictureItem*> pictures;
    std::vector<CMailAttachment> documents;
    for (CCatalogItem* item : items) {
        auto* document = dynamic_cast<CDocumentItem*>(item);
        if (document && document->IsPicture())
            pictures.push_back(static_cast<CPictureItem*>(document));
        else if (document)
            documents.push_back(
                {document->GetPathname(), CMapiMail::DisplayName(document->GetPathname())});
        else
            item->Mail(doc->GetContext());
    }
    if (!pictures.empty())
        MailPictures(c.prompt, pictures);
    if (!documents.empty())
        CMailProgram(c.prompt).SendDocuments(documents);
    return c.prompt.ErrorCount() == errorsBefore ? kExitOk : kExitFailure;
}

int RunPrintPictures(CliContext& c)
{
    if (!c.parser.isSet(QStringLiteral("pdf")) == !c.parser.isSet(QStringLiteral("printer")))
        return c.Usage(QStringLiteral("print-pictures needs either --pdf FILE or --printer QUEUE"));
    std::unique_ptr<CTallowmereDoc> doc;
    std::vector<CCatalogItem*> items;
    if (const int exit = OpenWithItems(c, doc, items))
        return exit;
    std::vector<CPictureItem*> pictures;
    for (CCatalogItem* item : items) {
        auto* document = dynamic_cast<CDocumentItem*>(item);
        if (!document || !document->IsPicture())
            return c.Failure(
                QStringLiteral("item %1 is not a picture").arg(item->GetSequenceNumber()));
        pictures.push_back(static_cast<CPictureItem*>(document));
    }
    c.prompt.SetPdfFile(c.parser.value(QStringLiteral("pdf")).toStdString());
    c.prompt.SetPrinter(c.parser.value(QStringLiteral("printer")).toStdString());
    return PrintPictures(c.prompt, pictures) ? kExitOk : kExitFailure;
}

void MailOptions(QCommandLineParser& parser)
{
    parser.addOption(QCommandLineOption(
        QStringLiteral("resize"),
        QStringLiteral("Mail pictures smaller: small, very-small or WIDTHxHEIGHT."),
        QStringLiteral("SIZE")));
    parser.addOption(QCommandLineOption(QStringLiteral("convert"),
                                        QStringLiteral("Mail pictures as jpg, bmp, png or gif."),
                                        QStringLiteral("TYPE")));
}

void TextOptions(QCommandLineParser& parser)
{
    parser.addOption(QCommandLineOption(QStringLiteral("out"),
                                        QStringLiteral("Write into FILE instead of stdout."),
                                        QStringLiteral("FILE")));
}

void PrintOptions(QCommandLineParser& parser)
{
    parser.addOption(QCommandLineOption(
        QStringLiteral("pdf"), QStringLiteral("Print into a PDF file."), QStringLiteral("FILE")));
    parser.addOption(QCommandLineOption(QStringLiteral("printer"),
                                        QStringLiteral("Print on a CUPS queue."),
                                        QStringLiteral("QUEUE")));
}

void FolderOption(QCommandLineParser& parser)
{
    parser.addOption(QCommandLineOption(QStringLiteral("folder"),
                                        QStringLiteral("The folder to write into."),
                                        QStringLiteral("DIR")));
}

const CliRegistration kText{
    {QStringLiteral("text"), QStringLiteral("SEQ... [--out FILE]"),
     QStringLiteral("The items' texts back to back, as \"Save Data Item(s)\" writes them."),
     TextOptions, RunText}};
const CliRegistration kPrint{
    {QStringLiteral("print"), QStringLiteral("SEQ... --pdf FILE | --printer QUEUE"),
     QStringLiteral("Print data items, 80 lines a page."), PrintOptions, RunPrint, true}};
const CliRegistration kRecipeHtml{
    {QStringLiteral("recipe-html"), QStringLiteral("SEQ --folder DIR"),
     QStringLiteral("Write a recipe's web page into a folder."), FolderOption, RunRecipeHtml}};
const CliRegistration kAlbumHtml{
    {QStringLiteral("album-html"), QStringLiteral("SETSEQ --folder DIR"),
     QStringLiteral("Write a photo album's index, pages and picture copies into a folder."),
     FolderOption, RunAlbumHtml}};
const CliRegistration kMail{
    {QStringLiteral("mail"), QStringLiteral("SEQ... [--resize SIZE] [--convert TYPE]"),
     QStringLiteral("Hand items to the mail program (xdg-email); pictures go in one message."),
     MailOptions, RunMail, true}};
const CliRegistration kPrintPictures{
    {QStringLiteral("print-pictures"), QStringLiteral("SEQ... --pdf FILE | --printer QUEUE"),
     QStringLiteral("Print pictures, one to a page."), PrintOptions, RunPrintPictures, true}};

} // namespace

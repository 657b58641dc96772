// text, print, recipe-html and mail: items as text, printed pages, web pages and mail.

#include "catalog/tallowmere_doc.h"
#include "cli/cli_command.h"
#include "cli/console_prompt.h"
#include "output/album_pages.h"
#include "output/data_item_print.h"

#include <QCommandLineOption>

#include <cstdio>

namespace {

// The catalog's items named by sequence numbers; false after telling why.
bool ItemsFromArguments(const CliContext& c, const CTallowmereDoc& doc,
                        std::vector<CCatalogItem*>& items)
{
    if (c.arguments.isEmpty()) {
        c.Usage(QStringLiteral("name at least one item by its sequence number"));
        return false;
    }
    for (const QString& argument : c.arguments) {
        bool ok = false;
        const int sequence = argument.toInt(&ok);
        CCatalogItem* item = ok ? doc.FindItemBySequence(sequence) : nullptr;
        if (!item) {
            c.Failure(QStringLiteral("no item has the sequence number '%1'").arg(argument));
            return false;
        }
        items.push_back(item);
    }
    return true;
}

std::vector<const CCatalogItem*> AsConst(const std::vector<CCatalogItem*>& items)
{
    return std::vector<const CCatalogItem*>(items.begin(), items.end());
}

int RunText(CliContext& c)
{
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    std::vector<CCatalogItem*> items;
    if (!ItemsFromArguments(c, *doc, items))
        return c.arguments.isEmpty() ? kExitUsage : kExitFailure;
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
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    std::vector<CCatalogItem*> items;
    if (!ItemsFromArguments(c, *doc, items))
        return c.arguments.isEmpty() ? kExitUsage : kExitFailure;
    if (pdf)
        c.prompt.SetPdfFile(c.parser.value(QStringLiteral("pdf")).toStdString());
    else
        c.prompt.SetPrinter(c.parser.value(QStringLiteral("printer")).toStdString());
    return PrintDataItems(c.prompt, AsConst(items)) ? kExitOk : kExitFailure;
}

int RunRecipeHtml(CliContext& c)
{
    if (c.arguments.size() != 1 || !c.parser.isSet(QStringLiteral("folder")))
        return c.Usage(QStringLiteral("recipe-html takes one recipe and --folder DIR"));
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    std::vector<CCatalogItem*> items;
    if (!ItemsFromArguments(c, *doc, items))
        return kExitFailure;
    auto* recipe = dynamic_cast<CRecipeItem*>(items.front());
    if (!recipe)
        return c.Failure(QStringLiteral("item %1 is not a recipe").arg(c.arguments.front()));
    const std::string folder = c.parser.value(QStringLiteral("folder")).toStdString();
    CAppFolders::CreateFolderPath(folder);
    if (!recipe->WriteRecipePage(folder))
        return c.Failure(QStringLiteral("cannot write %1")
                             .arg(QString::fromStdString(recipe->GetWebPagePath())));
    std::printf("%s\n", recipe->GetWebPagePath().c_str());
    return kExitOk;
}

int RunAlbumHtml(CliContext& c)
{
    if (c.arguments.size() != 1 || !c.parser.isSet(QStringLiteral("folder")))
        return c.Usage(QStringLiteral("album-html takes one photo album and --folder DIR"));
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    std::vector<CCatalogItem*> items;
    if (!ItemsFromArguments(c, *doc, items))
        return kExitFailure;
    auto* set = dynamic_cast<CDocumentSet*>(items.front());
    if (!set || !set->IsAlbum())
        return c.Failure(QStringLiteral("item %1 is not a photo album").arg(c.arguments.front()));
    auto& album = static_cast<CPhotoAlbum&>(*set);
    const std::string folder = c.parser.value(QStringLiteral("folder")).toStdString();
    return SaveAlbumWebPages(c.prompt, album, folder) ? kExitOk : kExitFailure;
}

int RunMail(CliContext& c)
{
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    std::vector<CCatalogItem*> items;
    if (!ItemsFromArguments(c, *doc, items))
        return c.arguments.isEmpty() ? kExitUsage : kExitFailure;
    const int errorsBefore = c.prompt.ErrorCount();
    for (CCatalogItem* item : items)
        item->Mail(doc->GetContext());
    return c.prompt.ErrorCount() == errorsBefore ? kExitOk : kExitFailure;
}

void TextOptions(QCommandLineParser& parser)
{
    parser.addOption(QCommandLineOption(QStringLiteral("out"),
                                        QStringLiteral("Write into FILE instead of stdout."),
                                        QStringLiteral("FILE")));
}

void PrintOptions(QCommandLineParser& parser)
{
    parser.addOption(QCommandLineOption(QStringLiteral("pdf"),
                                        QStringLiteral("Print into a PDF file."),
                                        QStringLiteral("FILE")));
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
const CliRegistration kMail{{QStringLiteral("mail"), QStringLiteral("SEQ..."),
                             QStringLiteral("Hand items to the mail program (xdg-email)."),
                             nullptr, RunMail}};

} // namespace

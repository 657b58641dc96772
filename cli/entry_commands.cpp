// remove, move, category and set: changing entries, categories and document sets.

#include "cli/document_cli.h"
#include "views/category_commands.h"
#include "views/data_item_ops.h"
#include "views/data_list_state.h"
#include "views/entry_ops.h"

#include <cstdio>

namespace {

// Row copies of the entries with the given sequence numbers; false after the
// message when one has none.
bool EntriesOf(CliContext& c, const CDocumentCli& cli, const std::vector<int32_t>& sequences,
               std::vector<std::unique_ptr<CDocumentItem>>& entries, int& exitCode)
{
    for (const int32_t sequence : sequences) {
        const auto entry = cli.FindEntry(sequence);
        if (!entry) {
            exitCode = c.Failure(QStringLiteral("no document or picture has the sequence number "
                                                "%1 (see 'list managed')")
                                     .arg(sequence));
            return false;
        }
        entries.push_back(std::make_unique<CDocumentItem>(*entry));
    }
    return true;
}

std::vector<const CDocumentItem*> Pointers(const std::vector<std::unique_ptr<CDocumentItem>>& items)
{
    std::vector<const CDocumentItem*> pointers;
    for (const auto& item : items)
        pointers.push_back(item.get());
    return pointers;
}

int RunRemove(CliContext& c)
{
    CDocumentCli cli(c);
    std::vector<int32_t> sequences;
    int exitCode = kExitOk;
    if (!cli.ParseSequences(0, sequences, exitCode))
        return exitCode;
    if (!cli.Open())
        return kExitCatalog;
    std::vector<std::unique_ptr<CDocumentItem>> entries;
    if (!EntriesOf(c, cli, sequences, entries, exitCode))
        return exitCode;
    CEntryOps ops(cli.Env());
    for (const auto& entry : entries) {
        if (ops.RemoveEntry(*entry))
            std::printf("Removed %d %s\n", entry->GetSequenceNumber(),
                        entry->GetPathname().c_str());
    }
    return cli.Finish();
}

int RunMove(CliContext& c)
{
    CDocumentCli cli(c);
    std::vector<int32_t> sequences;
    int exitCode = kExitOk;
    if (!cli.ParseSequences(0, sequences, exitCode))
        return exitCode;
    if (!c.parser.isSet(QStringLiteral("category")))
        return c.Usage(QStringLiteral("move needs --category PATH"));
    if (!cli.Open())
        return kExitCatalog;
    const std::string category = c.parser.value(QStringLiteral("category")).toStdString();
    if (!cli.CategoryExists(category))
        return c.Failure(
            QStringLiteral("there is no category %1").arg(QString::fromStdString(category)));
    std::vector<std::unique_ptr<CDocumentItem>> entries;
    if (!EntriesOf(c, cli, sequences, entries, exitCode))
        return exitCode;
    CEntryOps ops(cli.Env());
    for (const auto& entry : entries) {
        entry->SetCategoryPath(category);
        entry->SetDocumentCategoryPath(category);
        if (ops.MoveEntry(*entry))
            PrintRow(DocumentRow(*entry));
    }
    return cli.Finish();
}

int RunCategory(CliContext& c)
{
    const QString action = c.arguments.value(0);
    const bool add = action == QLatin1String("add") && c.arguments.size() == 3;
    const bool remove = action == QLatin1String("remove") && c.arguments.size() == 2;
    if (!add && !remove)
        return c.Usage(QStringLiteral("use 'category add PARENT_PATH NAME' or "
                                      "'category remove PATH'"));
    CDocumentCli cli(c, CPrompt::Answer::Yes);
    const std::string path = c.arguments.at(1).toStdString();
    if (add) {
        const QString name = c.arguments.at(2);
        if (name.isEmpty() || name.contains(QLatin1Char('\\')))
            return c.Usage(QStringLiteral("a category name is not empty and holds no backslash"));
        cli.Answers().newCategoryName = name.toStdString();
    }
    if (!cli.Open())
        return kExitCatalog;
    if (!cli.CategoryExists(path))
        return c.Failure(QStringLiteral("there is no category %1").arg(c.arguments.at(1)));
    CDataListState state(cli.Doc());
    state.SelectCategory(path);
    CCategoryCommands commands(state, cli.Env());
    if (add) {
        commands.NewCategory();
        std::printf("Added category %s\n", state.GetSelectedCategory().c_str());
    } else {
        commands.RemoveSelectedCategory();
    }
    return cli.Finish();
}

int RunSet(CliContext& c)
{
    const QString action = c.arguments.value(0);
    const bool create = action == QLatin1String("create") && c.arguments.size() >= 3;
    const bool add = action == QLatin1String("add") && c.arguments.size() >= 3;
    if (!create && !add)
        return c.Usage(QStringLiteral("use 'set create LABEL SEQ...' or 'set add SETSEQ SEQ...'"));
    CDocumentCli cli(c);
    std::vector<int32_t> sequences;
    int exitCode = kExitOk;
    if (!cli.ParseSequences(add ? 1 : 2, sequences, exitCode))
        return exitCode;
    if (!cli.Open())
        return kExitCatalog;
    CDataItemOps ops(cli.Env());
    if (add) {
        bool ok = false;
        const int32_t set = c.arguments.at(1).toInt(&ok);
        if (!ok || !ops.FindDataItem(kKindDocumentSets, set))
            return c.Failure(QStringLiteral("no document set has the sequence number %1 (see "
                                            "'list sets')")
                                 .arg(c.arguments.at(1)));
        sequences.erase(sequences.begin());
        cli.Answers().setSequence = set;
    } else {
        cli.Answers().setLabel = c.arguments.at(1).toStdString();
    }
    std::vector<std::unique_ptr<CDocumentItem>> entries;
    if (!EntriesOf(c, cli, sequences, entries, exitCode))
        return exitCode;
    if (create) {
        if (ops.CreateDocumentSet(Pointers(entries))) {
            const auto& set = cli.Doc().GetDocumentSets().back();
            std::printf("Created document set %d %s with %zu documents\n", set->GetSequenceNumber(),
                        set->GetLabel().c_str(), set->GetMembers().size());
        }
    } else if (ops.AddToDocumentSet(Pointers(entries))) {
        std::printf("Added %zu documents to document set %d\n", entries.size(),
                    cli.Answers().setSequence);
    }
    return cli.Finish();
}

const CliRegistration kRemove{{QStringLiteral("remove"), QStringLiteral("SEQ..."),
                               QStringLiteral("Remove documents or pictures from the catalog "
                                              "(the files stay)."),
                               nullptr, RunRemove}};

const CliRegistration kMove{
    {QStringLiteral("move"), QStringLiteral("SEQ... --category PATH"),
     QStringLiteral("File documents or pictures under another category; archived files move "
                    "along."),
     [](QCommandLineParser& p) {
         p.addOption(QCommandLineOption(QStringLiteral("category"),
                                        QStringLiteral("The new category."),
                                        QStringLiteral("PATH")));
     },
     RunMove}};

const CliRegistration kCategory{{QStringLiteral("category"),
                                 QStringLiteral("add PARENT_PATH NAME | remove PATH"),
                                 QStringLiteral("Add a category below another, or remove one "
                                                "(never a root)."),
                                 nullptr, RunCategory}};

const CliRegistration kSet{{QStringLiteral("set"),
                            QStringLiteral("create LABEL SEQ... | add SETSEQ SEQ..."),
                            QStringLiteral("Group documents into a new document set, or add "
                                           "them to one."),
                            nullptr, RunSet}};

} // namespace

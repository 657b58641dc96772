// load, add and list: filing files into the catalog and listing what a tab shows.

#include "cli/document_cli.h"
#include "cli/terminal_progress.h"
#include "views/data_list_state.h"
#include "views/document_loader.h"
#include "views/list_fill.h"

#include <QDateTime>
#include <QFileInfo>

#include <cstdio>

namespace {

QCommandLineOption Option(const char* name, const char* description, const char* value = nullptr)
{
    return value ? QCommandLineOption(QString::fromLatin1(name), QString::fromLatin1(description),
                                      QString::fromLatin1(value))
                 : QCommandLineOption(QString::fromLatin1(name), QString::fromLatin1(description));
}

std::string Value(const CliContext& c, const char* name)
{
    return c.parser.value(QString::fromLatin1(name)).toStdString();
}

bool IsSet(const CliContext& c, const char* name)
{
    return c.parser.isSet(QString::fromLatin1(name));
}

// The category the command files under: --category, else "DOCUMENTS".
bool TargetCategory(CliContext& c, CDocumentCli& cli, int& exitCode)
{
    const std::string category = IsSet(c, "category") ? Value(c, "category") : kRootDocuments;
    if (!cli.CategoryExists(category)) {
        exitCode = c.Failure(QStringLiteral("there is no category %1; add it with 'category add' "
                                            "or load with --new-category")
                                 .arg(QString::fromStdString(category)));
        return false;
    }
    cli.Doc().SetCurrentCategoryPath(category);
    return true;
}

void AddLoadOptions(QCommandLineParser& p)
{
    p.addOptions({Option("category", "Category to file under (default DOCUMENTS).", "PATH"),
                  Option("new-category", "A new sub-category of it to file under.", "NAME"),
                  Option("keyword1", "Keyword 1 of every entry.", "K"),
                  Option("keyword2", "Keyword 2 of every entry.", "K"),
                  Option("unique", "Skip files already in the catalog."),
                  Option("no-unique", "Do not look for duplicates."),
                  Option("archive", "Copy the files into the archive."),
                  Option("no-archive", "Do not copy the files."),
                  Option("no-subcategories", "File everything under the one category."),
                  Option("pictures-only", "Load only the pictures.")});
}

int RunLoad(CliContext& c)
{
    if (c.arguments.size() != 1)
        return c.Usage(QStringLiteral("load takes one folder"));
    if (!QFileInfo(c.arguments.at(0)).isDir())
        return c.Failure(QStringLiteral("%1 is not a folder").arg(c.arguments.at(0)));
    CDocumentCli cli(c);
    if (!cli.Open())
        return kExitCatalog;
    int exitCode = kExitOk;
    if (!TargetCategory(c, cli, exitCode))
        return exitCode;
    CDialogAnswers::Load load;
    load.folder = AbsolutePath(c.arguments.at(0));
    if (IsSet(c, "new-category"))
        load.newCategory = Value(c, "new-category");
    if (IsSet(c, "keyword1"))
        load.keyword1 = Value(c, "keyword1");
    if (IsSet(c, "keyword2"))
        load.keyword2 = Value(c, "keyword2");
    if (IsSet(c, "unique") || IsSet(c, "no-unique"))
        load.unique = IsSet(c, "unique");
    if (IsSet(c, "archive") || IsSet(c, "no-archive"))
        load.archive = IsSet(c, "archive");
    load.subCategories = !IsSet(c, "no-subcategories");
    cli.Answers().load = load;
    CTerminalProgress progress;
    cli.Env().SetProgress(&progress);
    CEntryList loaded;
    CDocumentLoader(cli.Env()).LoadDocuments(loaded, IsSet(c, "pictures-only"));
    return cli.Finish();
}

int RunAdd(CliContext& c)
{
    if (c.arguments.isEmpty())
        return c.Usage(QStringLiteral("add takes one or more files"));
    CDocumentCli cli(c);
    if (!cli.Open())
        return kExitCatalog;
    int exitCode = kExitOk;
    if (!TargetCategory(c, cli, exitCode))
        return exitCode;
    CDialogAnswers::Add add;
    for (const QString& file : c.arguments) {
        if (!QFileInfo(file).isFile())
            return c.Failure(QStringLiteral("%1 is not a file").arg(file));
        add.files.push_back(AbsolutePath(file));
    }
    add.caption = Value(c, "caption");
    add.archive = IsSet(c, "archive");
    cli.Answers().add = add;
    CEntryList added;
    CDocumentLoader(cli.Env()).AddDocuments(added);
    for (const auto& entry : added)
        PrintRow(DocumentRow(*entry));
    return cli.Finish();
}

// Seconds since 1970, or an ISO date or date and time in local time.
bool ParseTime(const QString& text, CTime& time)
{
    bool ok = false;
    const qlonglong seconds = text.toLongLong(&ok);
    if (ok) {
        time = CTime(seconds);
        return true;
    }
    QDateTime when = QDateTime::fromString(text, Qt::ISODate);
    if (!when.isValid())
        when = QDateTime(QDate::fromString(text, Qt::ISODate), QTime(0, 0));
    if (!when.isValid())
        return false;
    time = CTime(when.toSecsSinceEpoch());
    return true;
}

TabKind TabOf(const QString& name, bool& ok)
{
    ok = true;
    if (name == QLatin1String("documents"))
        return TabKind::Documents;
    if (name == QLatin1String("managed"))
        return TabKind::ManagedDocuments;
    if (name == QLatin1String("sets"))
        return TabKind::DocumentSets;
    if (name == QLatin1String("events"))
        return TabKind::Events;
    if (name == QLatin1String("recipes"))
        return TabKind::Recipes;
    ok = false;
    return TabKind::PersonalInformation;
}

int RunList(CliContext& c)
{
    if (c.arguments.size() != 1)
        return c.Usage(QStringLiteral("list takes one tab: documents, managed, sets, events or "
                                      "recipes"));
    bool ok = false;
    const TabKind tab = TabOf(c.arguments.at(0), ok);
    if (!ok)
        return c.Usage(QStringLiteral("unknown tab '%1'").arg(c.arguments.at(0)));
    if (tab == TabKind::Documents && !IsSet(c, "folder"))
        return c.Usage(QStringLiteral("list documents needs --folder DIR"));
    CDocumentCli cli(c);
    if (!cli.Open())
        return kExitCatalog;
    CDataListState state(cli.Doc());
    CFilterControls& filter = state.Filter();
    filter.includeSubCategories = IsSet(c, "subcategories");
    filter.keyword1 = Value(c, "keyword1");
    filter.keyword2 = Value(c, "keyword2");
    for (const char* bound : {"from", "to"}) {
        if (!IsSet(c, bound))
            continue;
        CTime& time = bound[0] == 'f' ? filter.fromDate : filter.toDate;
        if (!ParseTime(c.parser.value(QString::fromLatin1(bound)), time))
            return c.Usage(QStringLiteral("--%1 takes seconds since 1970 or an ISO date")
                               .arg(QString::fromLatin1(bound)));
    }
    filter.filterOn =
        IsSet(c, "keyword1") || IsSet(c, "keyword2") || IsSet(c, "from") || IsSet(c, "to");
    if (tab == TabKind::Documents)
        state.SetCurrentFolder(AbsolutePath(c.parser.value(QStringLiteral("folder"))));
    state.SetTab(tab);
    if (IsSet(c, "category") && tab != TabKind::Documents)
        state.SelectCategory(Value(c, "category"));
    for (const CListRow& row : state.Rows(tab))
        PrintRow(row);
    return kExitOk;
}

const CliRegistration kLoad{{QStringLiteral("load"), QStringLiteral("FOLDER"),
                             QStringLiteral("Load every file below a folder into the catalog."),
                             AddLoadOptions, RunLoad}};

const CliRegistration kAdd{
    {QStringLiteral("add"), QStringLiteral("FILE..."),
     QStringLiteral("Add files to the catalog; prints their rows."),
     [](QCommandLineParser& p) {
         p.addOptions({Option("category", "Category to file under (default DOCUMENTS).", "PATH"),
                       Option("caption", "Caption of the new entries (23 bytes at most).", "TEXT"),
                       Option("archive", "Copy the files into the archive.")});
     },
     RunAdd}};

const CliRegistration kList{
    {QStringLiteral("list"), QStringLiteral("documents|managed|sets|events|recipes"),
     QStringLiteral("The rows a tab shows, tab-separated, in the list's order."),
     [](QCommandLineParser& p) {
         p.addOptions({Option("folder", "The folder the documents tab shows.", "DIR"),
                       Option("category", "Category to show (default the tab's root).", "PATH"),
                       Option("subcategories", "Managed documents of sub-categories too."),
                       Option("keyword1", "Only items with this keyword.", "K"),
                       Option("keyword2", "Only items with this keyword too.", "K"),
                       Option("from", "Updated at or after (seconds or ISO date).", "T"),
                       Option("to", "Updated at or before (seconds or ISO date).", "T")});
     },
     RunList}};

} // namespace

// init, info, dump and import-json: creating, inspecting and rebuilding catalogs.

#include "catalog/catalog_json.h"
#include "catalog/tallowmere_doc.h"
#include "cli/cli_command.h"
#include "cli/console_prompt.h"

#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>

#include <cstdio>

namespace {

std::string FolderOf(const std::string& path)
{
    const size_t slash = path.rfind('/');
    return slash == std::string::npos ? std::string(".") : path.substr(0, slash + 1);
}

int RunInit(CliContext& c)
{
    if (!c.arguments.isEmpty())
        return c.Usage(QStringLiteral("init takes no arguments"));
    c.folders.CreateFolders();
    if (QFileInfo::exists(QString::fromStdString(c.catalogPath)))
        return c.Failure(QStringLiteral("%1 already exists; init leaves an existing catalog alone")
                             .arg(QString::fromStdString(c.catalogPath)));
    CTallowmereDoc doc(c.prompt, c.folders, c.catalogPath);
    if (!doc.CreateCatalog())
        return kExitCatalog;
    std::printf("Created catalog %s\n", c.catalogPath.c_str());
    return kExitOk;
}

int RunInfo(CliContext& c)
{
    if (!c.arguments.isEmpty())
        return c.Usage(QStringLiteral("info takes no arguments"));
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    int albums = 0;
    for (const auto& set : doc->GetDocumentSets()) {
        if (set->IsAlbum())
            ++albums;
    }
    const qint64 size = QFileInfo(QString::fromStdString(c.catalogPath)).size();
    std::printf("Catalog: %s\n", c.catalogPath.c_str());
    std::printf("Format version: %d\n", doc->GetFormatVersion());
    std::printf("File size: %lld bytes\n", static_cast<long long>(size));
    std::printf("Created: %s\n", doc->GetCreationDate().Format("%b %d, %Y %H:%M:%S").c_str());
    std::printf("Pictures: %zu\n", doc->GetPictures().size());
    std::printf("Documents: %zu\n", doc->GetDocuments().size());
    std::printf("Document sets: %zu\n", doc->GetDocumentSets().size() - albums);
    std::printf("Photo albums: %d\n", albums);
    std::printf("Events: %zu\n", doc->GetEvents().size());
    std::printf("Recipes: %zu\n", doc->GetRecipes().size());
    std::printf("Categories: %zu\n", doc->GetCategories().size());
    std::printf("Document number counter: %lld\n",
                static_cast<long long>(doc->GetDocumentNumberCounter()));
    return kExitOk;
}

int RunDump(CliContext& c)
{
    if (!c.arguments.isEmpty())
        return c.Usage(QStringLiteral("dump takes no arguments"));
    const auto doc = c.OpenCatalog();
    if (!doc)
        return kExitCatalog;
    const QByteArray json = QJsonDocument(DumpCatalog(*doc)).toJson(QJsonDocument::Indented);
    std::fwrite(json.constData(), 1, static_cast<size_t>(json.size()), stdout);
    return std::fflush(stdout) == 0 ? kExitOk : kExitFailure;
}

int RunImportJson(CliContext& c)
{
    if (c.arguments.size() != 1)
        return c.Usage(QStringLiteral("import-json takes one JSON file"));
    QFile file(c.arguments.at(0));
    if (!file.open(QIODevice::ReadOnly))
        return c.Failure(
            QStringLiteral("cannot read %1: %2").arg(file.fileName(), file.errorString()));
    QJsonParseError parseError;
    const QJsonDocument json = QJsonDocument::fromJson(file.readAll(), &parseError);
    if (json.isNull())
        return c.Failure(QStringLiteral("%1 is not valid JSON: %2 (at offset %3)")
                             .arg(file.fileName(), parseError.errorString())
                             .arg(parseError.offset));
    if (!json.isObject())
        return c.Failure(QStringLiteral("%1 must hold one JSON object").arg(file.fileName()));
    CTallowmereDoc doc(c.prompt, c.folders, c.catalogPath);
    std::string error;
    if (!ImportCatalog(json.object(), doc, error))
        return c.Failure(
            QStringLiteral("%1: %2").arg(file.fileName(), QString::fromStdString(error)));
    CAppFolders::CreateFolderPath(FolderOf(c.catalogPath));
    if (!doc.SaveCatalog(false))
        return kExitFailure;
    std::printf("Imported %zu pictures, %zu documents, %zu document sets, %zu events, %zu "
                "recipes and %zu categories into %s\n",
                doc.GetPictures().size(), doc.GetDocuments().size(), doc.GetDocumentSets().size(),
                doc.GetEvents().size(), doc.GetRecipes().size(), doc.GetCategories().size(),
                c.catalogPath.c_str());
    return kExitOk;
}

const CliRegistration kInit{{QStringLiteral("init"), QString(),
                             QStringLiteral("Make the folders and create a new catalog."), nullptr,
                             RunInit}};
const CliRegistration kInfo{{QStringLiteral("info"), QString(),
                             QStringLiteral("Counts of each kind, categories, format version, "
                                            "file size."),
                             nullptr, RunInfo}};
const CliRegistration kDump{{QStringLiteral("dump"), QString(),
                             QStringLiteral("The whole catalog as one JSON object on stdout."),
                             nullptr, RunDump}};
const CliRegistration kImport{{QStringLiteral("import-json"), QStringLiteral("FILE"),
                               QStringLiteral("Build a catalog from a JSON object (as dump "
                                              "writes it) and save it; the old catalog is kept "
                                              "as .bak."),
                               nullptr, RunImportJson}};

} // namespace

// Loads a folder tree into an empty catalog twice with the unique check on
// (the second pass finds only duplicates) and prints each pass in ms.
// Usage: document_load FOLDER

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "views/command_env.h"
#include "views/document_loader.h"

#include <QTemporaryDir>

#include <chrono>
#include <cstdio>

namespace {

class LoadPrompt : public CPrompt
{
public:
    explicit LoadPrompt(std::string folder) : m_folder(std::move(folder)) {}
    Answer MessageBox(const std::string& text, const std::string&, Icon, Buttons) override
    {
        last = text;
        return Answer::Ok;
    }
    bool SelectFolder(CSelectFolderFields& fields) override
    {
        fields.selectedFolder = m_folder;
        fields.uniqueEntries = true;
        fields.archiveMode = false;
        return true;
    }
    std::string last;

private:
    std::string m_folder;
};

} // namespace

int main(int argc, char** argv)
{
    if (argc != 2) {
        std::fprintf(stderr, "usage: document_load FOLDER\n");
        return 1;
    }
    QTemporaryDir home;
    LoadPrompt prompt(argv[1]);
    CTallowmereDoc doc(prompt, CAppFolders(home.path().toStdString()));
    doc.SetCurrentCategoryPath("DOCUMENTS");
    CCommandEnv env(doc);
    CDocumentLoader loader(env);
    for (int pass = 1; pass <= 2; ++pass) {
        CEntryList out;
        const auto start = std::chrono::steady_clock::now();
        loader.LoadDocuments(out, false);
        const std::chrono::duration<double, std::milli> took =
            std::chrono::steady_clock::now() - start;
        std::printf("pass%d_ms %.2f %s\n", pass, took.count(), prompt.last.c_str());
    }
    return 0;
}

// Times OpenCatalog and SaveCatalog on a large generated catalog.
//   catalog_bench generate FILE   writes a catalog of 100,000 pictures, 20,000
//                                 documents and 1,000 of each other kind
//   catalog_bench open FILE       opens it, saves it over itself, prints
//                                 the times (best of 3) and the peak memory

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"

#include <chrono>
#include <cstdio>
#include <cstring>
#include <string>
#include <sys/resource.h>

namespace {

class QuietPrompt : public CPrompt
{
public:
    Answer MessageBox(const std::string& text, const std::string& caption, Icon, Buttons) override
    {
        std::fprintf(stderr, "%s: %s\n", caption.c_str(), text.c_str());
        return Answer::No;
    }
};

std::shared_ptr<CDocumentItem> MakeDocument(bool picture, int i)
{
    std::shared_ptr<CDocumentItem> d;
    if (picture)
        d = std::make_shared<CPictureItem>();
    else
        d = std::make_shared<CDocumentItem>();
    const std::string folder = "/home/ann/" + std::string(picture ? "Pictures/" : "Documents/") +
                               std::to_string(2000 + i % 20) + "/Trip " + std::to_string(i % 97);
    const std::string name =
        (picture ? "IMG_" : "Letter ") + std::to_string(100000 + i) + (picture ? ".jpg" : ".pdf");
    d->SetPathname(folder + "/" + name);
    d->SetOriginalPathname(folder + "/" + name);
    d->SetLabel(name.substr(0, name.size() - 4));
    d->SetName(name.substr(0, name.size() - 4));
    d->SetDocumentCategoryPath("DOCUMENTS\\Trips\\" + std::to_string(2000 + i % 20));
    d->SetCategoryPath("DOCUMENTS\\Trips\\" + std::to_string(2000 + i % 20));
    d->SetKeyword1(i % 3 ? "family" : "");
    d->SetFileCreateDate(CTime(1000000000 + i));
    d->SetFileModifyDate(CTime(1000000000 + i));
    d->SetFileSize(2000000 + static_cast<uint64_t>(i));
    return d;
}

double Milliseconds(std::chrono::steady_clock::duration d)
{
    return std::chrono::duration<double, std::milli>(d).count();
}

int Generate(const std::string& file)
{
    QuietPrompt prompt;
    CTallowmereDoc doc(prompt, CAppFolders("/nonexistent"), file);
    doc.GetCategories().AddDefaultCategories();
    for (int i = 0; i < 100000; ++i)
        doc.AddPicture(std::static_pointer_cast<CPictureItem>(MakeDocument(true, i)));
    for (int i = 0; i < 20000; ++i)
        doc.AddDocument(MakeDocument(false, i));
    for (int i = 0; i < 1000; ++i) {
        std::unique_ptr<CDocumentSet> set;
        if (i % 2) {
            auto album = std::make_unique<CPhotoAlbum>();
            album->SetTitle("Album " + std::to_string(i));
            set = std::move(album);
        } else {
            set = std::make_unique<CDocumentSet>();
        }
        set->SetLabel("Set " + std::to_string(i));
        set->SetDescription("A set of five\r\nwith two lines");
        for (int k = 0; k < 5; ++k)
            set->GetMembers().Append(doc.GetPictures().at(static_cast<size_t>(i * 5 + k)));
        doc.RegisterItem(*set);
        doc.AddDocumentSet(std::move(set));

        auto event = std::make_unique<CEventItem>();
        event->SetEventName("Event " + std::to_string(i));
        event->SetComments("We met at noon.\r\nIt rained.");
        event->GetAttendees().emplace_back("Ann");
        event->GetAttendees().emplace_back("Bob");
        doc.RegisterItem(*event);
        doc.AddEvent(std::move(event));

        auto recipe = std::make_unique<CRecipeItem>();
        recipe->SetDish("Dish " + std::to_string(i));
        recipe->SetDirections("Mix everything.\r\nBake for an hour.");
        for (int k = 0; k < 6; ++k)
            recipe->GetIngredients().emplace_back("2", "cups", "flour");
        doc.RegisterItem(*recipe);
        doc.AddRecipe(std::move(recipe));
    }
    return doc.SaveCatalog(false) ? 0 : 1;
}

int OpenAndSave(const std::string& file)
{
    QuietPrompt prompt;
    double bestOpen = 1e18;
    double bestSave = 1e18;
    size_t items = 0;
    for (int run = 0; run < 3; ++run) {
        CTallowmereDoc doc(prompt, CAppFolders("/nonexistent"), file);
        auto start = std::chrono::steady_clock::now();
        if (!doc.OpenCatalog(false))
            return 1;
        bestOpen = std::min(bestOpen, Milliseconds(std::chrono::steady_clock::now() - start));
        items = doc.GetPictures().size() + doc.GetDocuments().size();
        // The save replaces the file it was read from, as the user's save does.
        start = std::chrono::steady_clock::now();
        if (!doc.SaveCatalog(false))
            return 1;
        bestSave = std::min(bestSave, Milliseconds(std::chrono::steady_clock::now() - start));
    }
    struct rusage usage;
    getrusage(RUSAGE_SELF, &usage);
    std::printf("open_ms %.1f\nsave_ms %.1f\npeak_mb %.1f\nitems %zu\n", bestOpen, bestSave,
                usage.ru_maxrss / 1024.0, items);
    return 0;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc == 3 && std::strcmp(argv[1], "generate") == 0)
        return Generate(argv[2]);
    if (argc == 3 && std::strcmp(argv[1], "open") == 0)
        return OpenAndSave(argv[2]);
    std::fprintf(stderr, "usage: catalog_bench generate|open FILE\n");
    return 2;
}

#include "output/album_pages.h"

#include "catalog/app_context.h"
#include "catalog/app_folders.h"
#include "catalog/document_set.h"
#include "catalog/file_copy.h"
#include "catalog/prompt.h"
#include "catalog/text_util.h"
#include "output/html_page.h"
#include "output/safe_file_name.h"

#include <QBuffer>
#include <QImageReader>

#include <filesystem>

namespace {

std::string ExtensionOf(const std::string& path)
{
    const size_t dot = path.rfind('.');
    const size_t slash = path.rfind('/');
    if (dot == std::string::npos || (slash != std::string::npos && dot < slash))
        return std::string();
    const std::string extension = path.substr(dot + 1);
    return extension.size() == 3 ? extension : std::string();
}

// The picture's stored size, from the start of the file when that holds
// the header (it nearly always does), else from the file.
CThumbnailBox PictureSize(const std::string& head, const std::string& path)
{
    QByteArray bytes = QByteArray::fromRawData(head.data(), static_cast<qsizetype>(head.size()));
    QBuffer buffer(&bytes);
    QImageReader fromHead(&buffer);
    fromHead.setAutoTransform(false);
    QSize size = fromHead.size();
    if (!size.isValid()) {
        QImageReader fromFile(QString::fromStdString(path));
        fromFile.setAutoTransform(false);
        size = fromFile.size();
    }
    return {size.width(), size.height()};
}

std::shared_ptr<CDocumentItem> GeneratedFile(const std::string& path)
{
    auto item = std::make_shared<CDocumentItem>();
    item->SetPathname(path);
    item->SetOriginalPathname(path);
    return item;
}

} // namespace

CThumbnailBox AlbumThumbnailBox(int thumbnailSize)
{
    switch (thumbnailSize) {
    case 0:
        return {150, 150};
    case 2:
        return {250, 200};
    default:
        return {200, 200};
    }
}

CThumbnailBox AlbumThumbnailSize(int W, int H, CThumbnailBox box)
{
    const int BW = box.width;
    const int BH = box.height;
    if (W <= 0 || H <= 0)
        return box;
    int w = BW;
    int h = BH;
    const double fitHeight = static_cast<double>(BH) / H;
    const double fitWidth = static_cast<double>(BW) / W;
    if (W > BW && H > BH) {
        const double s = fitHeight < fitWidth ? fitHeight : fitWidth;
        w = static_cast<int>(s * W);
        h = static_cast<int>(s * H);
    } else {
        if (W > BW) {
            w = BW;
            h = static_cast<int>(fitWidth * H);
        }
        if (H > BH) {
            h = BH;
            w = static_cast<int>(fitHeight * W);
        }
        // Both compared with the box width, as the pages always have been.
        if (W < BW && H < BW) {
            const double s = fitWidth <= fitHeight ? fitWidth : fitHeight;
            w = static_cast<int>(s * W);
            h = static_cast<int>(s * H);
        }
    }
    return {w, BH - 2 * ((BH - h) / 2)};
}

std::string AlbumIndexBaseName(const std::string& title)
{
    const size_t blank = title.find(' ');
    if (title.empty() || blank == std::string::npos || blank == 0)
        return "Title";
    return SafeFileName(title.substr(0, blank), "Title");
}

bool CPhotoAlbum::CreateWebPages(CWebSite& site, const std::string& folder, int* failedCopies)
{
    if (failedCopies)
        *failedCopies = 0;
    if (!CAppFolders::CreateFolderPath(folder))
        return false;
    const unsigned perPage = m_picturesPerPage < 1 ? 1u : static_cast<unsigned>(m_picturesPerPage);
    const size_t pictureCount = m_members.size();
    const size_t pageCount = pictureCount / perPage + (pictureCount % perPage ? 1 : 0);
    m_generatedFiles.RemoveAll();
    const CThumbnailBox box = AlbumThumbnailBox(m_thumbnailSize);
    m_columns = perPage == 1 ? 1 : 2;
    const uint32_t rgb = ((m_backgroundColor & 0xFF) << 16) | (m_backgroundColor & 0xFF00) |
                         ((m_backgroundColor >> 16) & 0xFF);
    const std::string colour = StrFormat("#%.6x", rgb);
    m_indexFileName = AlbumIndexBaseName(m_title) + ".html";
    const std::string indexPath = folder + "/" + m_indexFileName;

    CHtmlPage& index = site.Master();
    index.path = indexPath;
    index.bgColor = colour;
    index.frameSrc = "Page_000.html";
    index.name = "Page_000.html";
    index.isFrameset = true;

    int k = 1;
    size_t next = 0;
    std::vector<std::string> pendingCaptions;
    for (size_t i = 0; i < pageCount; ++i) {
        const std::string pagePath = StrFormat("%s/Page_%.3d.html", folder.c_str(), int(i));
        CHtmlPage* page = site.AddPage(new CHtmlPage);
        page->path = pagePath;
        page->title = HtmlEscape(m_title);
        page->bgColor = colour;
        CHtmlTable* table = page->AddTable(new CHtmlTable);
        table->cellSpacing = 10;
        table->cellPadding = 5;
        table->border = 5;

        unsigned n = 0;
        CHtmlRow* row = nullptr;
        for (unsigned taken = 0; taken < perPage && next < pictureCount; ++taken, ++next) {
            const CDocumentItem& picture = *m_members.at(next);
            pendingCaptions.push_back(picture.GetLabel());
            const std::string picName =
                StrFormat("Pic_%.4d.%s", k, ExtensionOf(picture.GetOriginalPathname()).c_str());
            ++k;
            // The catalog's current path is where the file is; the path it was
            // found at may be a card that is long gone.
            const std::string source = std::filesystem::exists(picture.GetPathname())
                                           ? picture.GetPathname()
                                           : picture.GetOriginalPathname();
            const std::string copyPath = folder + "/" + picName;
            std::string head;
            CCopyOptions copy;
            copy.overwrite = true;
            copy.keepFileTimes = false; // a page's picture is a new file
            copy.head = &head;
            copy.headBytes = 16 * 1024; // the frame header of most pictures
            if (CopyFileTo(source, copyPath, copy) != 0 && failedCopies)
                ++*failedCopies;
            m_generatedFiles.Append(GeneratedFile(copyPath));
            if (n == 0)
                row = table->AddRow(new CHtmlRow);
            ++n;
            const CThumbnailBox pictureSize = PictureSize(head, source);
            const CThumbnailBox fitted =
                AlbumThumbnailSize(pictureSize.width, pictureSize.height, box);
            CHtmlCell* cell = row->AddCell(new CHtmlCell);
            cell->kind = CHtmlCell::CellImage;
            cell->bgColor = "white";
            cell->imageBgColor = "white";
            cell->imageSrc = picName;
            cell->text = picName;
            cell->imageWidth = fitted.width;
            cell->imageHeight = fitted.height;
            if (n == static_cast<unsigned>(m_columns)) {
                if (m_displayCaption) {
                    row = table->AddRow(new CHtmlRow);
                    for (const std::string& caption : pendingCaptions) {
                        CHtmlCell* text = row->AddCell(new CHtmlCell);
                        text->text = HtmlEscape(caption);
                        text->bgColor = colour;
                    }
                    pendingCaptions.clear();
                }
                n = 0;
            }
        }
        row = table->AddRow(new CHtmlRow);
        CHtmlCell* previous = row->AddCell(new CHtmlCell);
        previous->bgColor = colour;
        if (i > 0) {
            previous->kind = CHtmlCell::CellLink;
            previous->text = "Previous";
            previous->href = StrFormat("Page_%.3d.html", int(i) - 1);
        }
        CHtmlCell* following = row->AddCell(new CHtmlCell);
        following->bgColor = colour;
        if (i + 1 < pageCount) {
            following->kind = CHtmlCell::CellLink;
            following->text = "Next";
            following->href = StrFormat("Page_%.3d.html", int(i) + 1);
        }
        m_generatedFiles.Append(GeneratedFile(pagePath));
    }
    m_generatedFiles.Append(GeneratedFile(indexPath));
    m_indexPath = indexPath;
    return site.WriteAll();
}

bool CPhotoAlbum::ViewAsWebPage(CAppContext& context)
{
    const std::string temp = CAppFolders::GetTempFolder();
    if (temp.empty())
        return true;
    CWebSite site(temp + "/WebSite");
    if (CreateWebPages(site, site.GetFolder()))
        context.GetPrompt().OpenWithShell(m_indexPath);
    return true;
}

bool SaveAlbumWebPages(CPrompt& prompt, CPhotoAlbum& album, const std::string& folder)
{
    std::string target = folder;
    int failed = 0;
    bool saved = !target.empty() || prompt.ChooseFolder(target);
    if (saved) {
        CWebSite site(target);
        saved = album.CreateWebPages(site, target, &failed);
    }
    if (!saved) {
        prompt.MessageBox("Unable to save Photo Album Web Pages!", "Save Photo Album",
                          CPrompt::Icon::Stop);
        return false;
    }
    std::string text = "Successfully saved Photo Album Web Pages!";
    if (failed > 0)
        text += StrFormat("\n%d picture(s) could not be copied.", failed);
    prompt.MessageBox(text, "Save Photo Album",
                      failed > 0 ? CPrompt::Icon::Exclamation : CPrompt::Icon::Information);
    return true;
}

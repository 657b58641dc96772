#include "output/data_item_print.h"

#include "catalog/catalog_item.h"
#include "catalog/prompt.h"
#include "catalog/text_util.h"
#include "output/print_job.h"

#include <QFontDatabase>
#include <QGuiApplication>
#include <QPagedPaintDevice>
#include <QPainter>

#include <cstdio>

namespace {

constexpr int kLinesPerPage = 80;
constexpr int kLeft = 20;
constexpr int kTop = 50;

} // namespace

std::vector<CPrintPage> LayOutDataItemPages(const std::vector<const CCatalogItem*>& items)
{
    std::vector<CPrintPage> pages(1);
    std::vector<std::string> lines;
    for (const CCatalogItem* item : items) {
        lines.clear();
        item->AppendTextLines(lines);
        for (std::string& line : lines) {
            if (pages.back().size() >= static_cast<size_t>(kLinesPerPage))
                pages.emplace_back();
            pages.back().push_back(std::move(line));
        }
    }
    return pages;
}

bool DrawTextPages(QPagedPaintDevice& device, const std::vector<CPrintPage>& pages)
{
    // Fonts need the GUI application object (the command line makes an offscreen one).
    if (!qobject_cast<QGuiApplication*>(QCoreApplication::instance()))
        return false;
    QPainter painter;
    if (!painter.begin(&device))
        return false;
    // 80 lines must fit below the top margin: pick the largest font that allows it.
    const int available = painter.viewport().height() - kTop;
    QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    int pixelSize = std::max(1, available / kLinesPerPage);
    for (;;) {
        font.setPixelSize(pixelSize);
        if (pixelSize == 1 || QFontMetrics(font, &device).height() * kLinesPerPage <= available)
            break;
        --pixelSize;
    }
    painter.setFont(font);
    const QFontMetrics metrics = painter.fontMetrics();
    for (size_t p = 0; p < pages.size(); ++p) {
        if (p > 0)
            device.newPage();
        int y = kTop;
        for (const std::string& line : pages[p]) {
            const QString text = QString::fromStdString(DisplayUtf8(line));
            painter.drawText(kLeft, y + metrics.ascent(), text);
            y += metrics.height();
        }
    }
    return painter.end();
}

bool PrintDataItems(CPrompt& prompt, const std::vector<const CCatalogItem*>& items)
{
    const std::vector<CPrintPage> pages = LayOutDataItemPages(items);
    return RunPrintJob(prompt, "Quillery", [&pages](QPagedPaintDevice& device) {
        return DrawTextPages(device, pages);
    });
}

int AssignPrintPages(const std::vector<CCatalogItem*>& items)
{
    int page = 1;
    int running = 0;
    for (CCatalogItem* item : items) {
        const int n = item->GetPrintLineCount();
        running += n + 4;
        if (running > kLinesPerPage) {
            ++page;
            item->SetPrintPage(page);
            if (n < kLinesPerPage) {
                running = n;
            } else {
                running = n % kLinesPerPage;
                page += n / kLinesPerPage;
            }
        } else {
            item->SetPrintPage(page);
        }
    }
    return page;
}

std::string DataItemsText(const std::vector<const CCatalogItem*>& items)
{
    std::string text;
    for (const CCatalogItem* item : items)
        text += item->GetMailText();
    return text;
}

bool SaveDataItemsToFile(CPrompt& prompt, const std::vector<const CCatalogItem*>& items)
{
    return CTextFileSaver(DataItemsText(items)).SaveToFile(prompt);
}

bool CTextFileSaver::WriteTextFile(const std::string& path, const std::string& text)
{
    std::FILE* file = std::fopen(path.c_str(), "w");
    if (!file)
        return false;
    const bool written = std::fwrite(text.data(), 1, text.size(), file) == text.size();
    return std::fclose(file) == 0 && written;
}

bool CTextFileSaver::SaveToFile(CPrompt& prompt) const
{
    std::string path;
    if (!prompt.GetSaveFileName("txt", "Files(*.txt;)|*.txt;|", path))
        return false;
    if (WriteTextFile(path, m_text))
        return true;
    prompt.MessageBox(StrFormat("Unable to write %s!", path.c_str()), "Save Data Item(s)",
                      CPrompt::Icon::Stop);
    return false;
}

#pragma once
// Printing and text export of data items: their text lines laid out 80 to a
// page (items back to back), the print preview's page count, and the text
// file of their mail texts.

#include <string>
#include <vector>

class CCatalogItem;
class CPrompt;
class QPagedPaintDevice;

using CPrintPage = std::vector<std::string>;

// Every item's AppendTextLines, in order, cut into pages of 80 lines.
std::vector<CPrintPage> LayOutDataItemPages(const std::vector<const CCatalogItem*>& items);

// Draws text pages at x = 20 from y = 50 in a monospaced font small enough
// for 80 lines to fit the page. False when painting cannot start.
bool DrawTextPages(QPagedPaintDevice& device, const std::vector<CPrintPage>& pages);

// The "Print Data Item(s)" command: print dialog, then a PDF file or a CUPS job.
bool PrintDataItems(CPrompt& prompt, const std::vector<const CCatalogItem*>& items);

// Gives every item its print page by its print line count (plus 4 each,
// a new page past 80 lines); returns the page count.
int AssignPrintPages(const std::vector<CCatalogItem*>& items);

// The concatenated mail texts, as "Save Data Item(s)" writes them.
std::string DataItemsText(const std::vector<const CCatalogItem*>& items);
bool SaveDataItemsToFile(CPrompt& prompt, const std::vector<const CCatalogItem*>& items);

// Asks for a .txt file name and writes the text into it.
class CTextFileSaver
{
public:
    explicit CTextFileSaver(std::string text = {}) : m_text(std::move(text)) {}
    // False when cancelled or when the file cannot be written (the user is told).
    bool SaveToFile(CPrompt& prompt) const;
    static bool WriteTextFile(const std::string& path, const std::string& text);

private:
    std::string m_text;
};

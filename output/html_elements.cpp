#include "output/html_elements.h"

#include "catalog/text_util.h"

std::string HtmlEscape(const std::string& text)
{
    std::string out;
    out.reserve(text.size());
    for (char c : text) {
        switch (c) {
        case '&':
            out += "&amp;";
            break;
        case '<':
            out += "&lt;";
            break;
        case '>':
            out += "&gt;";
            break;
        case '"':
            out += "&quot;";
            break;
        default:
            out += c;
        }
    }
    return out;
}

void CHtmlCell::SetFont(const std::string& color, const std::string& face, int size)
{
    fontEnabled = true;
    fontColor = color;
    fontFace = face;
    fontSize = size;
}

std::string CHtmlCell::Render() const
{
    std::string fontOpen;
    std::string fontClose;
    if (fontEnabled) {
        fontOpen = StrFormat("\n<Font color=\"%s\", face=\"%s\" size=%d>", fontColor.c_str(),
                             fontFace.c_str(), fontSize);
        fontClose = "\n</font>";
    }
    const std::string bgAttr = bgColor.empty() ? std::string() : "bgcolor=" + bgColor;
    std::string content;
    switch (kind) {
    case CellText:
        content = text;
        break;
    case CellImage: {
        const std::string widthAttr =
            imageWidth > 0 ? StrFormat("width = %d", imageWidth) : std::string();
        const std::string heightAttr =
            imageHeight > 0 ? StrFormat("height = %d", imageHeight) : std::string();
        content = "<image " + widthAttr + " " + heightAttr + " name=" + text + " src=" + imageSrc +
                  " bgcolor=" + imageBgColor + ">";
        break;
    }
    case CellLink:
        content = "<a href=" + href + ">" + text;
        break;
    default:
        break;
    }
    return "\n<td align=" + align + " " + bgAttr + ">" + fontOpen + content + "\n" + fontClose +
           "</td>";
}

CHtmlCell* CHtmlRow::AddCell(CHtmlCell* cell)
{
    m_cells.emplace_back(cell);
    return cell;
}

std::string CHtmlRow::Render() const
{
    std::string out = "\n<tr>";
    for (const auto& cell : m_cells)
        out += cell->Render();
    out += "\n</tr>";
    return out;
}

CHtmlRow* CHtmlTable::AddRow(CHtmlRow* row)
{
    m_rows.emplace_back(row);
    return row;
}

std::string CHtmlTable::Render() const
{
    const std::string heightAttr = height.empty() ? std::string() : "height=" + height;
    const std::string widthAttr = width.empty() ? std::string() : "width=" + width;
    std::string out =
        StrFormat("\n<table align=center %s %s cellspacing=%d border=%d cellpadding=%d>",
                  widthAttr.c_str(), heightAttr.c_str(), cellSpacing, border, cellPadding);
    for (const auto& row : m_rows)
        out += row->Render();
    out += "\n</table>";
    return out;
}

#pragma once
// Cells, rows and tables of the program's HTML pages; each renders itself to
// text in the program's own dialect (mixed-case tags, unquoted attributes, an
// `image` tag, links without a closing tag). Nothing is escaped here: callers
// escape the user's text with HtmlEscape before handing it over.

#include <memory>
#include <string>
#include <vector>

std::string HtmlEscape(const std::string& text);

class CHtmlCell
{
public:
    enum Kind
    {
        CellText = 1,
        CellLink = 2,
        CellImage = 3
    };

    void SetFont(const std::string& color, const std::string& face, int size);
    std::string Render() const;

    int kind = CellText;
    bool fontEnabled = false;
    std::string fontFace;
    int fontSize = 0;
    std::string fontColor;
    std::string text;
    std::string imageSrc;
    std::string imageBgColor = "white";
    int imageWidth = 0;
    int imageHeight = 0;
    std::string href;
    std::string align = "center";
    std::string bgColor;
};

class CHtmlRow
{
public:
    // Takes ownership; returns the cell for the caller to fill in.
    CHtmlCell* AddCell(CHtmlCell* cell);
    std::string Render() const;
    const std::vector<std::unique_ptr<CHtmlCell>>& Cells() const { return m_cells; }

private:
    std::vector<std::unique_ptr<CHtmlCell>> m_cells;
};

class CHtmlTable
{
public:
    CHtmlRow* AddRow(CHtmlRow* row);
    std::string Render() const;
    const std::vector<std::unique_ptr<CHtmlRow>>& Rows() const { return m_rows; }

    int cellSpacing = 0;
    int cellPadding = 0;
    int border = 0;
    std::string height;
    std::string width;

private:
    std::vector<std::unique_ptr<CHtmlRow>> m_rows;
};

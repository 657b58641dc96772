#pragma once
// Pages of pictures, as the picture window shows them and the printer prints
// them: a grid of cells by pictures per page, each slot a picture cell.

#include <QRect>

#include <vector>

class CPictureItem;
class CPrompt;
class QPainter;

// The cells of a page whose content area (inside the window's frame, above
// its buttons) is content.size(), measured from client's top-left corner:
// 1 a page is 1 x 1, 2 is 1 x 2, 4 is 2 x 2, 6 is 2 x 3, 8 is 2 x 4, any other
// number 2 x 3 (columns x rows). Each cell is shrunk by 10 on every side and
// 30 more at its bottom.
std::vector<QRect> PicturePageCells(const QRect& client, const QSize& content, int picturesPerPage);

// Draws the pictures of one page into the cells, with their captions in
// Arial 10 pt, dark red. A picture without a path leaves its slot empty.
void DrawPicturePage(QPainter& painter, const std::vector<QRect>& cells,
                     const std::vector<CPictureItem*>& pictures, bool screen);

// Prints the pictures one to a page (job "Hearthbook"), each fitted on a
// white mat. False when the print dialog was cancelled or printing failed.
bool PrintPictures(CPrompt& prompt, const std::vector<CPictureItem*>& pictures);

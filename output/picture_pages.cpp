#include "output/picture_pages.h"

#include "catalog/picture_item.h"
#include "output/print_job.h"
#include "pictures/picture_cell.h"

#include <QCoreApplication>
#include <QFont>
#include <QGuiApplication>
#include <QPagedPaintDevice>
#include <QPainter>

#include <memory>

namespace {

constexpr int kFrameWidth = 7;
constexpr int kButtonStrip = 20;

void Grid(int picturesPerPage, int& columns, int& rows)
{
    switch (picturesPerPage) {
    case 1:
        columns = 1;
        rows = 1;
        break;
    case 2:
        columns = 1;
        rows = 2;
        break;
    case 4:
        columns = 2;
        rows = 2;
        break;
    case 8:
        columns = 2;
        rows = 4;
        break;
    default:
        columns = 2;
        rows = 3;
    }
}

} // namespace

std::vector<QRect> PicturePageCells(const QRect& client, const QSize& content, int picturesPerPage)
{
    int columns;
    int rows;
    Grid(picturesPerPage, columns, rows);
    const int slotWidth = content.width() / columns;
    const int slotHeight = content.height() / rows;
    std::vector<QRect> cells;
    for (int i = 0; i < columns * rows; ++i) {
        const int left = client.left() + (i % columns) * slotWidth;
        const int top = client.top() + (i / columns) * slotHeight;
        cells.emplace_back(QPoint(left + 10, top + 10),
                           QPoint(left + slotWidth - 10 - 1, top + slotHeight - 10 - 30 - 1));
    }
    return cells;
}

void DrawPicturePage(QPainter& painter, const std::vector<QRect>& cells,
                     const std::vector<CPictureItem*>& pictures, bool screen)
{
    painter.save();
    QFont font(QStringLiteral("Arial"));
    font.setPointSize(10);
    painter.setFont(font);
    painter.setPen(QColor(0x80, 0x00, 0x00));
    painter.setBackgroundMode(Qt::TransparentMode);
    CPictureCellOptions options;
    options.screen = screen;
    for (size_t i = 0; i < pictures.size() && i < cells.size(); ++i) {
        if (!pictures[i]->GetPathname().empty())
            DrawPictureCell(painter, cells[i], *pictures[i], options);
    }
    painter.restore();
}

bool PrintPictures(CPrompt& prompt, const std::vector<CPictureItem*>& pictures)
{
    // Copies with the window's drawing flags, so the catalog's pictures keep theirs.
    std::vector<std::unique_ptr<CPictureItem>> copies;
    for (const CPictureItem* picture : pictures) {
        copies.push_back(std::make_unique<CPictureItem>(*picture));
        copies.back()->SetFitToFrame(1);
        copies.back()->SetWhiteBorder(1);
    }
    return RunPrintJob(prompt, "Hearthbook", [&copies](QPagedPaintDevice& device) {
        if (!qobject_cast<QGuiApplication*>(QCoreApplication::instance()))
            return false;
        QPainter painter;
        if (!painter.begin(&device))
            return false;
        const QRect client = painter.viewport();
        const QSize content(client.width() - 2 * kFrameWidth,
                            client.height() - 2 * kFrameWidth - kButtonStrip);
        const std::vector<QRect> cells = PicturePageCells(client, content, 1);
        for (size_t i = 0; i < copies.size(); ++i) {
            if (i > 0)
                device.newPage();
            DrawPicturePage(painter, cells, {copies[i].get()}, false);
        }
        return painter.end();
    });
}

#include "pictures/gif_writer.h"

#include <QHash>
#include <QIODevice>

#include <algorithm>
#include <vector>

#ifdef HB_HAVE_GIFLIB
#include <gif_lib.h>

namespace {

struct Palette
{
    std::vector<GifColorType> colors;
    int transparent = -1; // index of the transparent colour, or -1
};

bool IsTransparent(QRgb pixel)
{
    return qAlpha(pixel) < 128;
}

// The picture's own colours, when they fit in the palette.
bool ExactIndexes(const QImage& image, Palette& palette, std::vector<GifByteType>& indexes)
{
    const int room = palette.transparent >= 0 ? 255 : 256;
    QHash<QRgb, int> index;
    auto* out = indexes.data();
    for (int y = 0; y < image.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        for (int x = 0; x < image.width(); ++x) {
            if (IsTransparent(line[x])) {
                *out++ = GifByteType(palette.transparent);
                continue;
            }
            const QRgb rgb = line[x] & 0xFFFFFF;
            auto it = index.constFind(rgb);
            if (it == index.constEnd()) {
                if (index.size() == room)
                    return false;
                it = index.insert(rgb, int(palette.colors.size()));
                palette.colors.push_back(
                    {GifByteType(qRed(rgb)), GifByteType(qGreen(rgb)), GifByteType(qBlue(rgb))});
            }
            *out++ = GifByteType(*it);
        }
    }
    return true;
}

// Nearest palette colour, cached per 6-bit-per-channel cell.
class NearestColor
{
public:
    explicit NearestColor(const std::vector<GifColorType>& colors)
        : m_colors(colors), m_cache(1 << 18, -1)
    {}

    int Find(int r, int g, int b)
    {
        const int key = (r >> 2) << 12 | (g >> 2) << 6 | (b >> 2);
        if (m_cache[key] < 0)
            m_cache[key] = Search((r & ~3) + 2, (g & ~3) + 2, (b & ~3) + 2);
        return m_cache[key];
    }

    int Search(int r, int g, int b) const
    {
        int best = 0;
        int bestDistance = INT32_MAX;
        for (size_t i = 0; i < m_colors.size(); ++i) {
            const int dr = r - m_colors[i].Red, dg = g - m_colors[i].Green,
                      db = b - m_colors[i].Blue;
            const int distance = dr * dr + dg * dg + db * db;
            if (distance < bestDistance) {
                bestDistance = distance;
                best = int(i);
            }
        }
        return best;
    }

private:
    const std::vector<GifColorType>& m_colors;
    std::vector<int> m_cache;
};

// Moves each palette colour to the mean of the colours nearest to it (a few
// k-means rounds over a 5-bit histogram), which evens out median-cut boxes.
void RefinePalette(const QImage& image, std::vector<GifColorType>& colors)
{
    struct Cell
    {
        qint64 count = 0, r = 0, g = 0, b = 0;
    };
    std::vector<Cell> cells(32768);
    for (int y = 0; y < image.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        for (int x = 0; x < image.width(); ++x) {
            if (IsTransparent(line[x]))
                continue;
            const int r = qRed(line[x]), g = qGreen(line[x]), b = qBlue(line[x]);
            Cell& c = cells[size_t((r >> 3) << 10 | (g >> 3) << 5 | (b >> 3))];
            ++c.count;
            c.r += r;
            c.g += g;
            c.b += b;
        }
    }
    std::vector<Cell> used;
    for (const Cell& c : cells) {
        if (c.count)
            used.push_back(c);
    }
    for (int round = 0; round < 6; ++round) {
        NearestColor nearest(colors);
        std::vector<Cell> sums(colors.size());
        for (const Cell& c : used) {
            Cell& s = sums[size_t(
                nearest.Search(int(c.r / c.count), int(c.g / c.count), int(c.b / c.count)))];
            s.count += c.count;
            s.r += c.r;
            s.g += c.g;
            s.b += c.b;
        }
        for (size_t i = 0; i < colors.size(); ++i) {
            if (sums[i].count)
                colors[i] = {GifByteType(sums[i].r / sums[i].count),
                             GifByteType(sums[i].g / sums[i].count),
                             GifByteType(sums[i].b / sums[i].count)};
        }
    }
}

// Median-cut palette (giflib's) refined, then Floyd-Steinberg error diffusion.
bool QuantizedIndexes(const QImage& image, Palette& palette, std::vector<GifByteType>& indexes)
{
    const size_t count = size_t(image.width()) * size_t(image.height());
    std::vector<GifByteType> red(count), green(count), blue(count);
    size_t i = 0;
    for (int y = 0; y < image.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        for (int x = 0; x < image.width(); ++x, ++i) {
            red[i] = GifByteType(qRed(line[x]));
            green[i] = GifByteType(qGreen(line[x]));
            blue[i] = GifByteType(qBlue(line[x]));
        }
    }
    int size = palette.transparent >= 0 ? 255 : 256;
    std::vector<GifColorType> colors(256);
    if (GifQuantizeBuffer(unsigned(image.width()), unsigned(image.height()), &size, red.data(),
                          green.data(), blue.data(), indexes.data(), colors.data()) != GIF_OK)
        return false;
    colors.resize(size_t(size));
    RefinePalette(image, colors);
    palette.colors = colors;

    NearestColor nearest(palette.colors);
    const int w = image.width();
    // Errors carried to this row and the next, per channel, with a border pixel each side.
    std::vector<int> current((w + 2) * 3, 0), next((w + 2) * 3, 0);
    GifByteType* out = indexes.data();
    for (int y = 0; y < image.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        std::fill(next.begin(), next.end(), 0);
        for (int x = 0; x < w; ++x) {
            if (IsTransparent(line[x])) {
                out[x] = GifByteType(palette.transparent);
                continue;
            }
            int want[3] = {qRed(line[x]), qGreen(line[x]), qBlue(line[x])};
            for (int c = 0; c < 3; ++c)
                want[c] = std::clamp(want[c] + current[(x + 1) * 3 + c] / 16, 0, 255);
            const int index = nearest.Find(want[0], want[1], want[2]);
            out[x] = GifByteType(index);
            const GifColorType& got = palette.colors[size_t(index)];
            const int error[3] = {want[0] - got.Red, want[1] - got.Green, want[2] - got.Blue};
            for (int c = 0; c < 3; ++c) {
                current[(x + 2) * 3 + c] += error[c] * 7;
                next[x * 3 + c] += error[c] * 3;
                next[(x + 1) * 3 + c] += error[c] * 5;
                next[(x + 2) * 3 + c] += error[c];
            }
        }
        current.swap(next);
        out += w;
    }
    return true;
}

int WriteToDevice(GifFileType* gif, const GifByteType* data, int length)
{
    auto* device = static_cast<QIODevice*>(gif->UserData);
    return int(device->write(reinterpret_cast<const char*>(data), length));
}

bool Encode(GifFileType* gif, const QImage& image, const Palette& palette,
            const std::vector<GifByteType>& indexes)
{
    // The colour table's size must be a power of two.
    int tableSize = 2;
    while (tableSize < int(palette.colors.size()) + (palette.transparent >= 0 ? 1 : 0))
        tableSize *= 2;
    std::vector<GifColorType> table(size_t(tableSize), GifColorType{0, 0, 0});
    std::copy(palette.colors.begin(), palette.colors.end(), table.begin());
    ColorMapObject* map = GifMakeMapObject(tableSize, table.data());
    if (!map)
        return false;
    EGifSetGifVersion(gif, palette.transparent >= 0);
    bool ok = EGifPutScreenDesc(gif, image.width(), image.height(), 8, 0, map) == GIF_OK;
    if (ok && palette.transparent >= 0) {
        const GifByteType control[4] = {0x01, 0, 0, GifByteType(palette.transparent)};
        ok = EGifPutExtension(gif, GRAPHICS_EXT_FUNC_CODE, 4, control) == GIF_OK;
    }
    ok = ok && EGifPutImageDesc(gif, 0, 0, image.width(), image.height(), false, nullptr) == GIF_OK;
    for (int y = 0; ok && y < image.height(); ++y) {
        auto* line = const_cast<GifByteType*>(indexes.data() + size_t(y) * image.width());
        ok = EGifPutLine(gif, line, image.width()) == GIF_OK;
    }
    GifFreeMapObject(map);
    return ok;
}

} // namespace

bool WriteGif(const QImage& source, QIODevice& device)
{
    if (source.isNull() || source.width() > 65535 || source.height() > 65535)
        return false;
    const QImage image = source.convertToFormat(QImage::Format_ARGB32);
    if (image.isNull())
        return false;
    Palette palette;
    for (int y = 0; y < image.height() && palette.transparent < 0; ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        if (std::any_of(line, line + image.width(), IsTransparent))
            palette.transparent = 255;
    }
    std::vector<GifByteType> indexes(size_t(image.width()) * size_t(image.height()));
    if (!ExactIndexes(image, palette, indexes)) {
        palette.colors.clear();
        if (!QuantizedIndexes(image, palette, indexes))
            return false;
    }
    if (palette.transparent >= 0)
        palette.transparent = int(palette.colors.size());
    // The transparent pixels were written with the placeholder 255.
    if (palette.transparent >= 0 && palette.transparent != 255)
        std::replace(indexes.begin(), indexes.end(), GifByteType(255),
                     GifByteType(palette.transparent));

    int error = 0;
    GifFileType* gif = EGifOpen(&device, WriteToDevice, &error);
    if (!gif)
        return false;
    const bool ok = Encode(gif, image, palette, indexes);
    const bool closed = EGifCloseFile(gif, &error) == GIF_OK;
    return ok && closed;
}

#else

bool WriteGif(const QImage&, QIODevice&)
{
    return false;
}

#endif

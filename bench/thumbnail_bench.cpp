// Thumbnail throughput on 12-megapixel JPEGs.
//   thumbnail_bench generate DIR COUNT   makes COUNT 4000 x 3000 JPEGs in DIR (kept)
//   thumbnail_bench run DIR SIZE         thumbnails of every JPEG in DIR: one thread,
//                                        then the service's pool (each with an empty cache)

#include "pictures/thumbnail_service.h"

#include <QDir>
#include <QElapsedTimer>
#include <QGuiApplication>
#include <QPainter>
#include <QRandomGenerator>
#include <QTemporaryDir>

#include <cstdio>

namespace {

// A picture with a camera photo's amount of detail: gradients, shapes, grain.
QImage PhotoLike(int seed)
{
    QImage image(4000, 3000, QImage::Format_RGB32);
    QRandomGenerator random(quint32(seed) + 1);
    QPainter painter(&image);
    QLinearGradient sky(0, 0, 4000, 3000);
    sky.setColorAt(0, QColor::fromHsv(random.bounded(360), 120, 230));
    sky.setColorAt(1, QColor::fromHsv(random.bounded(360), 200, 90));
    painter.fillRect(image.rect(), sky);
    painter.setRenderHint(QPainter::Antialiasing);
    for (int k = 0; k < 300; ++k) {
        painter.setBrush(
            QColor::fromHsv(random.bounded(360), random.bounded(256), 60 + random.bounded(196)));
        painter.setPen(Qt::NoPen);
        painter.drawEllipse(QPoint(random.bounded(4000), random.bounded(3000)),
                            20 + random.bounded(300), 20 + random.bounded(300));
    }
    painter.end();
    for (int y = 0; y < image.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
        for (int x = 0; x < image.width(); ++x) {
            const int grain = int(random.bounded(25)) - 12;
            const QRgb p = line[x];
            line[x] = qRgb(qBound(0, qRed(p) + grain, 255), qBound(0, qGreen(p) + grain, 255),
                           qBound(0, qBlue(p) + grain, 255));
        }
    }
    return image;
}

int Generate(const QString& dir, int count)
{
    QDir().mkpath(dir);
    for (int i = 0; i < count; ++i) {
        const QString path =
            QStringLiteral("%1/photo-%2.jpg").arg(dir).arg(i, 3, 10, QLatin1Char('0'));
        if (QFileInfo::exists(path))
            continue;
        const QString partial = path + QStringLiteral(".part");
        if (!PhotoLike(i).save(partial, "JPEG", 90) || !QFile::rename(partial, path)) {
            std::fprintf(stderr, "cannot write %s\n", qPrintable(path));
            return 1;
        }
    }
    return 0;
}

int Run(const QString& dir, int size)
{
    QStringList files;
    for (const QString& name : QDir(dir).entryList({QStringLiteral("*.jpg")}, QDir::Files))
        files << dir + QLatin1Char('/') + name;
    if (files.isEmpty())
        return 1;

    QTemporaryDir singleCache;
    const CThumbnailCache cache(singleCache.filePath(QStringLiteral("thumbnails")));
    QElapsedTimer timer;
    timer.start();
    int failed = 0;
    for (const QString& file : files)
        failed += MakeThumbnail(file, size, &cache).status != CThumbnail::Ready;
    const double single = timer.nsecsElapsed() / 1e9;

    QTemporaryDir poolCache;
    CThumbnailService service(poolCache.filePath(QStringLiteral("thumbnails")));
    timer.restart();
    for (const QString& file : files)
        service.Request(file, size);
    service.WaitForDone();
    const double pool = timer.nsecsElapsed() / 1e9;
    for (const QString& file : files)
        failed += service.Request(file, size).status != CThumbnail::Ready;

    std::printf("files %lld\nsingle_seconds %.3f\npool_seconds %.3f\npool_threads %d\nfailed %d\n",
                static_cast<long long>(files.size()), single, pool, QThread::idealThreadCount(),
                failed);
    return failed ? 1 : 0;
}

} // namespace

int main(int argc, char** argv)
{
    QGuiApplication::setAttribute(Qt::AA_PluginApplication);
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    if (args.size() == 4 && args.at(1) == QLatin1String("generate"))
        return Generate(args.at(2), args.at(3).toInt());
    if (args.size() == 4 && args.at(1) == QLatin1String("run"))
        return Run(args.at(2), args.at(3).toInt());
    std::fprintf(stderr, "usage: thumbnail_bench generate DIR COUNT | run DIR SIZE\n");
    return 1;
}

// Makes the material of the album benchmark.
//   album_bench pictures DIR N   writes N 1024 x 768 JPEG pictures into DIR
//   album_bench json DIR FILE    writes a catalog (JSON) with one photo album of DIR's pictures

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QImage>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRandomGenerator>

#include <cstdio>

int main(int argc, char** argv)
{
    QCoreApplication app(argc, argv);
    const QStringList args = app.arguments();
    if (args.size() == 4 && args[1] == "pictures") {
        QDir().mkpath(args[2]);
        QImage image(1024, 768, QImage::Format_RGB32);
        QRandomGenerator random(7);
        for (int i = 0; i < args[3].toInt(); ++i) {
            for (int y = 0; y < image.height(); ++y) {
                auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
                for (int x = 0; x < image.width(); ++x)
                    line[x] = qRgb((x + i) & 255, (y * 2) & 255, random.bounded(64));
            }
            image.save(QString("%1/IMG_%2.jpg").arg(args[2]).arg(i, 5, 10, QChar('0')), "JPEG", 85);
        }
        return 0;
    }
    if (args.size() == 4 && args[1] == "json") {
        QJsonArray members;
        const QDir dir(args[2]);
        for (const QString& name : dir.entryList({"*.jpg"}, QDir::Files, QDir::Name)) {
            QJsonObject m;
            m["pathname"] = dir.filePath(name);
            m["originalPathname"] = dir.filePath(name);
            m["label"] = name.left(name.size() - 4);
            members.append(m);
        }
        QJsonObject album;
        album["albumFlag"] = 1;
        album["title"] = "Benchmark album";
        album["picturesPerPage"] = 6;
        album["members"] = members;
        QJsonObject root;
        root["documentSets"] = QJsonArray{album};
        QFile out(args[3]);
        if (!out.open(QIODevice::WriteOnly))
            return 1;
        out.write(QJsonDocument(root).toJson());
        return 0;
    }
    std::fprintf(stderr, "usage: album_bench pictures DIR N | json DIR FILE\n");
    return 2;
}

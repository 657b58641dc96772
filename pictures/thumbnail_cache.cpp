#include "pictures/thumbnail_cache.h"

#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QImageReader>
#include <QImageWriter>
#include <QTemporaryFile>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <sys/stat.h>

namespace {

constexpr int kPngQuality = 80; // Qt maps it to zlib level 1
const char* const kFlavorFolders[] = {"normal", "large", "x-large", "xx-large"};
const int kFlavorSizes[] = {128, 256, 512, 1024};

bool IsUriSafe(unsigned char c)
{
    // What GLib leaves unescaped in a file URI's path, so that the hash
    // matches other desktop programs'.
    static const char kSafe[] = "!$&'()*+,-./:=@_~";
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') ||
           (c != 0 && std::strchr(kSafe, c) != nullptr);
}

// An integer recorded as text; a fractional part (some programs write one) is dropped.
bool RecordedNumber(const QString& text, qint64& value)
{
    bool ok = false;
    value = text.section(QLatin1Char('.'), 0, 0).toLongLong(&ok);
    return ok;
}

bool Matches(const QImage& image, const CThumbnailKey& key)
{
    qint64 mtime = 0;
    if (image.text(QStringLiteral("Thumb::URI")).toUtf8() != key.uri ||
        !RecordedNumber(image.text(QStringLiteral("Thumb::MTime")), mtime) || mtime != key.mtime)
        return false;
    qint64 size = 0;
    const QString sizeText = image.text(QStringLiteral("Thumb::Size"));
    return sizeText.isEmpty() || (RecordedNumber(sizeText, size) && size == key.size);
}

QImage ReadPng(const QString& path)
{
    QImageReader reader(path, "png");
    return reader.read();
}

} // namespace

CThumbnailCache::CThumbnailCache(const QString& root)
    : m_root(root.isEmpty() ? DefaultRoot() : root)
{}

QString CThumbnailCache::DefaultRoot()
{
    QString base = qEnvironmentVariable("XDG_CACHE_HOME");
    if (base.isEmpty() || QDir::isRelativePath(base))
        base = QDir::homePath() + QStringLiteral("/.cache");
    return base + QStringLiteral("/thumbnails");
}

QByteArray CThumbnailCache::FileUri(const QString& absolutePath)
{
    QByteArray uri("file://");
    static const char kHex[] = "0123456789ABCDEF";
    for (const char ch : QFile::encodeName(absolutePath)) {
        const auto c = static_cast<unsigned char>(ch);
        if (IsUriSafe(c)) {
            uri += char(c);
        } else {
            uri += '%';
            uri += kHex[c >> 4];
            uri += kHex[c & 15];
        }
    }
    return uri;
}

QString CThumbnailCache::HashName(const QByteArray& uri)
{
    return QString::fromLatin1(QCryptographicHash::hash(uri, QCryptographicHash::Md5).toHex()) +
           QStringLiteral(".png");
}

int CThumbnailCache::FlavorSize(Flavor flavor)
{
    return kFlavorSizes[int(flavor)];
}

bool CThumbnailCache::FlavorFor(int size, Flavor& flavor)
{
    for (int i = 0; i < 4; ++i) {
        if (size <= kFlavorSizes[i]) {
            flavor = Flavor(i);
            return true;
        }
    }
    return false;
}

bool CThumbnailCache::KeyFor(const QString& path, CThumbnailKey& key)
{
    key.path = QFileInfo(path).absoluteFilePath();
    struct stat st;
    if (::stat(QFile::encodeName(key.path).constData(), &st) != 0 || !S_ISREG(st.st_mode))
        return false;
    key.uri = FileUri(key.path);
    key.mtime = st.st_mtime;
    key.size = st.st_size;
    return true;
}

QString CThumbnailCache::ThumbnailPath(Flavor flavor, const QByteArray& uri) const
{
    return m_root + QLatin1Char('/') + QLatin1String(kFlavorFolders[int(flavor)]) +
           QLatin1Char('/') + HashName(uri);
}

QString CThumbnailCache::FailurePath(const QByteArray& uri) const
{
    return m_root + QStringLiteral("/fail/") + QLatin1String(kFailureFolder) + QLatin1Char('/') +
           HashName(uri);
}

bool CThumbnailCache::Holds(const QString& path) const
{
    return path.startsWith(m_root + QLatin1Char('/'));
}

QImage CThumbnailCache::Read(Flavor flavor, const CThumbnailKey& key, QSize* originalSize) const
{
    const QImage image = ReadPng(ThumbnailPath(flavor, key.uri));
    if (image.isNull() || !Matches(image, key))
        return QImage();
    if (originalSize) {
        const int w = image.text(QStringLiteral("Thumb::Image::Width")).toInt();
        const int h = image.text(QStringLiteral("Thumb::Image::Height")).toInt();
        *originalSize = w > 0 && h > 0 ? QSize(w, h) : QSize();
    }
    return image;
}

bool CThumbnailCache::HasFailure(const CThumbnailKey& key) const
{
    const QImage record = ReadPng(FailurePath(key.uri));
    return !record.isNull() && Matches(record, key);
}

bool CThumbnailCache::Write(Flavor flavor, const CThumbnailKey& key, const QImage& thumbnail,
                            const QSize& originalSize) const
{
    QImage image = thumbnail;
    image.setText(QStringLiteral("Thumb::URI"), QString::fromUtf8(key.uri));
    image.setText(QStringLiteral("Thumb::MTime"), QString::number(key.mtime));
    image.setText(QStringLiteral("Thumb::Size"), QString::number(key.size));
    if (originalSize.isValid()) {
        image.setText(QStringLiteral("Thumb::Image::Width"), QString::number(originalSize.width()));
        image.setText(QStringLiteral("Thumb::Image::Height"),
                      QString::number(originalSize.height()));
    }
    image.setText(QStringLiteral("Software"), QStringLiteral("Hearthbook"));
    return WriteAtomically(ThumbnailPath(flavor, key.uri), image);
}

bool CThumbnailCache::WriteFailure(const CThumbnailKey& key) const
{
    QImage record(1, 1, QImage::Format_ARGB32);
    record.fill(Qt::transparent);
    record.setText(QStringLiteral("Thumb::URI"), QString::fromUtf8(key.uri));
    record.setText(QStringLiteral("Thumb::MTime"), QString::number(key.mtime));
    record.setText(QStringLiteral("Thumb::Size"), QString::number(key.size));
    return WriteAtomically(FailurePath(key.uri), record);
}

void CThumbnailCache::Remove(const QByteArray& uri) const
{
    for (int i = 0; i < 4; ++i)
        QFile::remove(ThumbnailPath(Flavor(i), uri));
    QFile::remove(FailurePath(uri));
}

bool CThumbnailCache::MakeFolder(const QString& path) const
{
    // The cache and its folders are the user's alone (0700).
    QDir().mkpath(QFileInfo(m_root).path());
    QString folder = m_root;
    const QStringList parts = path.mid(m_root.size() + 1).split(QLatin1Char('/'));
    for (int i = -1; i < parts.size(); ++i) {
        if (i >= 0)
            folder += QLatin1Char('/') + parts.at(i);
        if (::mkdir(QFile::encodeName(folder).constData(), 0700) != 0 && errno != EEXIST)
            return false;
    }
    return QFileInfo(path).isDir();
}

bool CThumbnailCache::WriteAtomically(const QString& path, const QImage& image) const
{
    const QString folder = QFileInfo(path).path();
    if (!MakeFolder(folder))
        return false;
    // A temporary file (made 0600) in the same folder, renamed over the name:
    // a reader never sees half a thumbnail.
    QTemporaryFile file(folder + QStringLiteral("/.hearthbook-XXXXXX.png"));
    if (!file.open())
        return false;
    QImageWriter writer(&file, "png");
    // The fastest zlib level: a third of the default's time, a tenth more bytes.
    writer.setQuality(kPngQuality);
    if (!writer.write(image) || !file.flush())
        return false;
    file.close();
    if (std::rename(QFile::encodeName(file.fileName()).constData(),
                    QFile::encodeName(path).constData()) != 0)
        return false;
    file.setAutoRemove(false);
    return true;
}

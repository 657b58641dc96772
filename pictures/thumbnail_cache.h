#pragma once
// The freedesktop.org thumbnail cache on disk, shared with other desktop
// programs: PNG thumbnails named by the MD5 of the picture's file URI, valid
// while their recorded modification time matches the file's, and failure
// records for files that cannot be decoded.

#include <QImage>
#include <QSize>
#include <QString>

struct CThumbnailKey
{
    QString path;     // absolute
    QByteArray uri;   // file:// URI, percent-encoded
    qint64 mtime = 0; // seconds
    qint64 size = 0;  // bytes
};

class CThumbnailCache
{
public:
    // The sizes of the cache: the longer side of a thumbnail, at most.
    enum class Flavor
    {
        Normal,
        Large,
        XLarge,
        XXLarge
    };

    // root is the "thumbnails" folder; DefaultRoot() when empty.
    explicit CThumbnailCache(const QString& root = QString());

    // $XDG_CACHE_HOME/thumbnails, else ~/.cache/thumbnails.
    static QString DefaultRoot();
    static QByteArray FileUri(const QString& absolutePath);
    static QString HashName(const QByteArray& uri);
    static int FlavorSize(Flavor flavor);
    // The smallest flavor whose thumbnails are at least size; false above the largest.
    static bool FlavorFor(int size, Flavor& flavor);

    // The key of the file as it is now; false when it is not a readable file.
    static bool KeyFor(const QString& path, CThumbnailKey& key);

    const QString& GetRoot() const { return m_root; }
    QString ThumbnailPath(Flavor flavor, const QByteArray& uri) const;
    QString FailurePath(const QByteArray& uri) const;
    // Files inside the cache itself are never given thumbnails of their own.
    bool Holds(const QString& path) const;

    // The stored thumbnail when it still belongs to the file; null otherwise.
    // originalSize is the picture's size recorded with it (invalid when none).
    QImage Read(Flavor flavor, const CThumbnailKey& key, QSize* originalSize) const;
    bool HasFailure(const CThumbnailKey& key) const;
    bool Write(Flavor flavor, const CThumbnailKey& key, const QImage& thumbnail,
               const QSize& originalSize) const;
    bool WriteFailure(const CThumbnailKey& key) const;
    // Removes every thumbnail and failure record of the URI.
    void Remove(const QByteArray& uri) const;

    static constexpr const char* kFailureFolder = "hearthbook-1.3";

private:
    bool MakeFolder(const QString& path) const;
    bool WriteAtomically(const QString& path, const QImage& image) const;

    QString m_root;
};

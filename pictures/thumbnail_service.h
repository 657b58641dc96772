#pragma once
// Thumbnails for the views: asked for while painting, never decoded there.
// Missing thumbnails are made on a thread pool and announced when ready; the
// made ones stay in a memory cache and in the freedesktop cache on disk.

#include "pictures/thumbnail_cache.h"
#include "pictures/thumbnail_maker.h"

#include <QCache>
#include <QHash>
#include <QObject>
#include <QThreadPool>

class CThumbnailService : public QObject
{
    Q_OBJECT

public:
    // cacheRoot is the disk cache's "thumbnails" folder; empty for the user's own.
    explicit CThumbnailService(const QString& cacheRoot = QString(), QObject* parent = nullptr);
    ~CThumbnailService() override;

    // Returns at once: the thumbnail when it is in memory (Ready or Failed);
    // otherwise asks for it (ThumbnailReady follows) and returns Missing.
    CThumbnail Request(const QString& path, int size);
    // Makes the thumbnail in the calling thread, through both caches.
    CThumbnail Make(const QString& path, int size);
    // Forgets the file's thumbnails (memory and disk), after the file was rewritten.
    void Invalidate(const QString& path);
    // Drops the requests that have not started.
    void CancelPending();
    // Waits until every started request has been made and announced.
    void WaitForDone();

    int PendingCount() const { return int(m_pending.size()); }
    void SetMaxThreads(int count) { m_pool.setMaxThreadCount(count); }
    void SetMemoryLimit(int kilobytes) { m_memory.setMaxCost(kilobytes); }
    const CThumbnailCache& GetDiskCache() const { return m_disk; }

signals:
    // The thumbnail of path is now in memory (Ready or Failed).
    void ThumbnailReady(const QString& path);

private:
    // The thumbnail arrives from the pool, on this object's thread.
    void Deliver(const QString& key, quint64 request, const CThumbnail& thumbnail);
    static QString KeyOf(const QString& path, int size);
    void Remember(const QString& key, const CThumbnail& thumbnail);

    CThumbnailCache m_disk;
    QThreadPool m_pool;
    QCache<QString, CThumbnail> m_memory;
    QHash<QString, quint64> m_pending; // key -> request number
    quint64 m_nextRequest = 1;
};

#include "pictures/thumbnail_service.h"

#include <QCoreApplication>
#include <QFileInfo>

namespace {

constexpr int kDefaultMemoryKilobytes = 128 * 1024;

// Keys are "<thumbnail edge>|<absolute path>".
QString PathOfKey(const QString& key)
{
    return key.mid(key.indexOf(QLatin1Char('|')) + 1);
}

} // namespace

CThumbnailService::CThumbnailService(const QString& cacheRoot, QObject* parent)
    : QObject(parent), m_disk(cacheRoot)
{
    m_memory.setMaxCost(kDefaultMemoryKilobytes);
}

CThumbnailService::~CThumbnailService()
{
    m_pool.clear();
    m_pool.waitForDone();
}

QString CThumbnailService::KeyOf(const QString& path, int size)
{
    // One entry per disk flavor, so that cells of nearby sizes share it.
    CThumbnailCache::Flavor flavor;
    const int edge =
        CThumbnailCache::FlavorFor(size, flavor) ? CThumbnailCache::FlavorSize(flavor) : size;
    return QString::number(edge) + QLatin1Char('|') + QFileInfo(path).absoluteFilePath();
}

void CThumbnailService::Remember(const QString& key, const CThumbnail& thumbnail)
{
    const qint64 bytes = thumbnail.image.sizeInBytes();
    m_memory.insert(key, new CThumbnail(thumbnail), int(1 + bytes / 1024));
}

CThumbnail CThumbnailService::Request(const QString& path, int size)
{
    const QString key = KeyOf(path, size);
    if (const CThumbnail* known = m_memory.object(key))
        return *known;
    if (!m_pending.contains(key)) {
        const quint64 request = m_nextRequest++;
        m_pending.insert(key, request);
        // The destructor waits for the pool, so the job may post to this
        // object; a posted call to a deleted object is dropped by Qt.
        // The latest request goes first: it is what the user is looking at.
        m_pool.start(
            [this, key, request, path, size] {
                const CThumbnail made = MakeThumbnail(path, size, &m_disk);
                QMetaObject::invokeMethod(
                    this, [this, key, request, made] { Deliver(key, request, made); },
                    Qt::QueuedConnection);
            },
            int(request & 0x7FFFFFFF));
    }
    return CThumbnail();
}

CThumbnail CThumbnailService::Make(const QString& path, int size)
{
    const QString key = KeyOf(path, size);
    if (const CThumbnail* known = m_memory.object(key))
        return *known;
    const CThumbnail made = MakeThumbnail(path, size, &m_disk);
    if (made.status != CThumbnail::Missing)
        Remember(key, made);
    return made;
}

void CThumbnailService::Deliver(const QString& key, quint64 request, const CThumbnail& thumbnail)
{
    // A request invalidated or cancelled meanwhile is dropped.
    if (m_pending.value(key) != request)
        return;
    m_pending.remove(key);
    if (thumbnail.status != CThumbnail::Missing)
        Remember(key, thumbnail);
    emit ThumbnailReady(PathOfKey(key));
}

void CThumbnailService::Invalidate(const QString& path)
{
    const QString absolute = QFileInfo(path).absoluteFilePath();
    const QList<QString> keys = m_memory.keys();
    for (const QString& key : keys) {
        if (PathOfKey(key) == absolute)
            m_memory.remove(key);
    }
    for (auto it = m_pending.begin(); it != m_pending.end();) {
        if (PathOfKey(it.key()) == absolute)
            it = m_pending.erase(it);
        else
            ++it;
    }
    m_disk.Remove(CThumbnailCache::FileUri(absolute));
}

void CThumbnailService::CancelPending()
{
    m_pool.clear();
    m_pending.clear();
}

void CThumbnailService::WaitForDone()
{
    m_pool.waitForDone();
    QCoreApplication::sendPostedEvents(this, QEvent::MetaCall);
}

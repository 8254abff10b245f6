#include "platform/SingleInstance.h"

#include "app/Trace.h"

#include <QDir>

SingleInstance::SingleInstance(const QString &key, const QString &folder)
{
    const QString dir = folder.isEmpty() ? QDir::tempPath() : folder;
    m_path = QDir(dir).filePath(key + QStringLiteral(".lock"));
    m_lock = std::make_unique<QLockFile>(m_path);
    // Only a dead holder makes a lock stale, however long the first instance has run.
    m_lock->setStaleLockTime(0);
    m_first = m_lock->tryLock(0);
    if (!m_first && m_lock->error() != QLockFile::LockFailedError) {
        // An unwritable temporary folder must not keep the program from starting.
        logTrace(3, QStringLiteral("SingleInstance: can't create %s (error %d), starting unguarded"), lockFilePath(),
                 static_cast<int>(m_lock->error()));
        m_first = true;
    }
}

SingleInstance::~SingleInstance()
{
    release();
}

void SingleInstance::release()
{
    if (m_lock && m_lock->isLocked())
        m_lock->unlock();
    m_lock.reset();
}

#pragma once

#include <QLockFile>
#include <QString>

#include <memory>

// Keeps a second copy of the program from starting: the first process to take the
// lock holds it until it ends. The lock is a file in the temporary folder named after
// the key; the system releases it when its holder dies, so a crashed run never
// blocks the next start.
class SingleInstance
{
public:
    // The key of the program; a test may pass a key and folder of its own.
    static constexpr const char *ProgramKey = "QZkGeo-A58284A5-BD9E-43BA-ABD5-AC6F87AAB89F";

    explicit SingleInstance(const QString &key = QLatin1String(ProgramKey), const QString &folder = QString());
    ~SingleInstance();

    SingleInstance(const SingleInstance &) = delete;
    SingleInstance &operator=(const SingleInstance &) = delete;

    // True when another live process holds the lock.
    bool isSecondInstance() const { return !m_first; }
    // Lets the next instance start while this one is still tearing down.
    void release();

    QString lockFilePath() const { return m_path; }

private:
    QString m_path;
    std::unique_ptr<QLockFile> m_lock;
    bool m_first = false;
};

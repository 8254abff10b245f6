#include "ReplacingFile.h"

#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstring>
#include <fcntl.h>
#include <random>
#include <sys/stat.h>
#include <unistd.h>

namespace {

// The file a chain of symbolic links ends at, which need not exist.
std::string followLinks(std::string path)
{
    for (int depth = 0; depth < 40; ++depth) {
        struct stat info;
        if (::lstat(path.c_str(), &info) != 0 || !S_ISLNK(info.st_mode))
            break;
        char link[PATH_MAX];
        const ssize_t length = ::readlink(path.c_str(), link, sizeof link);
        if (length <= 0 || size_t(length) >= sizeof link)
            break;
        std::string next(link, size_t(length));
        if (next[0] != '/') {
            const size_t slash = path.rfind('/');
            next = (slash == std::string::npos ? std::string() : path.substr(0, slash + 1)) + next;
        }
        path = next;
    }
    return path;
}

bool syncPath(const std::string &path, int flags)
{
    const int fd = ::open(path.c_str(), flags);
    if (fd < 0)
        return false;
    const bool synced = ::fsync(fd) == 0;
    const int error = errno;
    ::close(fd);
    errno = error;
    return synced;
}

} // namespace

bool ReplacingFile::failed(const char *reason)
{
    m_error = reason ? reason : std::strerror(errno);
    return false;
}

bool ReplacingFile::create(const std::string &target)
{
    discard();
    m_error.clear();
    if (target.empty())
        return failed("no file name");
    m_target = followLinks(target);
    struct stat info;
    const bool exists = ::stat(m_target.c_str(), &info) == 0;
    if (exists && !S_ISREG(info.st_mode))
        return failed(S_ISDIR(info.st_mode) ? "a folder of that name is in the way" : "not a regular file");
    // A file that nobody may write stays, even for a user whose rights would allow it.
    if (exists && ((info.st_mode & (S_IWUSR | S_IWGRP | S_IWOTH)) == 0 || ::access(m_target.c_str(), W_OK) != 0))
        return failed("the file is read-only");

    std::random_device entropy;
    static const char letters[] = "abcdefghijklmnopqrstuvwxyz0123456789";
    for (int attempt = 0; attempt < 100; ++attempt) {
        std::string name = m_target + '.';
        for (int i = 0; i < 6; ++i)
            name += letters[entropy() % (sizeof letters - 1)];
        const int fd = ::open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
        if (fd < 0) {
            if (errno == EEXIST)
                continue;
            return failed(nullptr);
        }
        if (exists)
            ::fchmod(fd, info.st_mode & 07777);
        ::close(fd);
        m_path = name;
        return true;
    }
    return failed("no free name for a new file");
}

bool ReplacingFile::commit()
{
    if (m_path.empty())
        return failed("nothing to put in place");
    if (!syncPath(m_path, O_RDONLY) || std::rename(m_path.c_str(), m_target.c_str()) != 0)
        return failed(nullptr);
    m_path.clear();
    const size_t slash = m_target.rfind('/');
    syncPath(slash == std::string::npos ? std::string(".") : m_target.substr(0, slash + 1), O_RDONLY | O_DIRECTORY);
    return true;
}

void ReplacingFile::discard()
{
    if (!m_path.empty())
        ::unlink(m_path.c_str());
    m_path.clear();
}

#pragma once

#include <string>

#include <sys/types.h>

// A new file beside a target, which takes the target's place in one rename once it
// is complete. Symbolic links are followed to the file they name. Until commit()
// nothing at the target changes, and discard() removes only the file made here.
class ReplacingFile
{
public:
    ReplacingFile() = default;
    ~ReplacingFile() { discard(); }
    ReplacingFile(const ReplacingFile &) = delete;
    ReplacingFile &operator=(const ReplacingFile &) = delete;

    // Makes the new, empty file. False when the target is no regular file, is
    // read-only, or its folder takes no new file.
    bool create(const std::string &target);
    // Where the content goes; empty when nothing was made.
    const std::string &path() const { return m_path; }

    // Syncs the content to disk and renames it over the target.
    bool commit();
    void discard();

    // Why create() or commit() failed.
    const std::string &errorText() const { return m_error; }

private:
    bool failed(const char *reason);

    std::string m_target;
    std::string m_path;
    std::string m_error;
};

#pragma once

#include <QString>

// How a project load ended. `NotAProject` is the container's refusal (missing file,
// wrong identifier, newer version): the caller may try the file as a track.
// `Damaged` means a number in the file could not be read: the document has been
// reset to a new project.
struct ProjectLoadResult
{
    enum class Status { Loaded, NotAProject, Damaged };

    Status status = Status::NotAProject;
    QString reason;

    explicit operator bool() const { return status == Status::Loaded; }
};

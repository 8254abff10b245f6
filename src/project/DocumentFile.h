#pragma once

#include <QString>

class PainterPathRenderer_Controller;

// How opening a file by name ended.
struct DocumentOpenResult
{
    enum class Status { Project, Track, Unreadable, DamagedProject };

    Status status = Status::Unreadable;
    QString reason;

    bool ok() const { return status == Status::Project || status == Status::Track; }
};

// Opens a file the way the program does: a new project first, then the file as a
// project; a file that is no project is taken as a track. A loaded project comes
// back unlocked, with its curve rebuilt and the altitude theme it holds (a project
// without one keeps the default theme). A damaged project leaves a new project.
DocumentOpenResult openDocumentFile(PainterPathRenderer_Controller &document, const QString &fileName);

// Saves the document and its altitude theme (prefix "altprs.") into one project
// file. False when the file could not be written whole; the previous file then
// stays as it was, and the container's lastWriteError() tells why.
bool saveDocumentFile(PainterPathRenderer_Controller &document, const QString &fileName);

#pragma once

#include <QFunctionPointer>
#include <QString>

// The process-wide handle of the encoder library "vidcore", which lives in the
// program's folder. Touched by one thread at a time: the export thread during an
// export, the main thread otherwise.
namespace EncoderLibrary {

// The folder searched; the program's folder unless set (tests point it elsewhere).
QString folder();
void setFolder(const QString &folder);
// The file that load() opens, for messages.
QString filePath();

bool isLoaded();
// Loads the library unless it is loaded; false and a trace line when it can't be.
bool load();
// Calls "DestroyExport" when present and unloads the library.
void release();
// An entry point of the loaded library, or null.
QFunctionPointer resolve(const char *name);

// The object whose encoder the library holds, null when none.
const void *owner();
void setOwner(const void *owner);

} // namespace EncoderLibrary

#pragma once

#include <QString>

// Moves a stored path of bundled content onto this installation: everything
// before the "imgsrc" folder is replaced by the program folder, so projects
// survive a move of the program. A leading "file:///" stays a file URL; text
// without "imgsrc", a file that opens as stored, or no program folder set
// leaves the path as stored.
QString rebaseContentPath(const QString &stored);

// The local file behind a stored path that may be a "file:" URL.
QString localFilePath(const QString &stored);

#pragma once

#include <QString>

// The folder the program runs from; its "imgsrc" subfolder holds the bundled
// content. Set once at start by the window; empty until then.
QString programFolder();

// Stores the folder without a trailing separator.
void setProgramFolder(const QString &path);

#pragma once

class QUrl;

// Hands a file or link to the desktop's default program for it (the "open" verb).
// False when no program took it; a missing file is that program's to report.
bool openWithDesktop(const QUrl &url);

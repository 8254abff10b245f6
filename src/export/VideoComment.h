#pragma once

#include <QString>

// The comment that marks films of this program, kept in the container's comment tag.
namespace VideoComment {

// "ZkTourlet|Frame=%1" filled with the animation frame source.
QString text(const QString &frameSource);

// Rewrites the finished film with the comment, through the encoder library, which it
// loads and keeps loaded. Not for use while an export runs. False and a trace line if
// the library is missing or the file can't be rewritten; the film is then unchanged.
bool write(const QString &fileName, const QString &comment);

} // namespace VideoComment

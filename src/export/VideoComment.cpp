#include "export/VideoComment.h"

#include "app/Trace.h"
#include "export/EncoderLibrary.h"
#include "export/VidcoreInterface.h"

#include <string>

namespace VideoComment {

QString text(const QString &frameSource)
{
    return QStringLiteral("ZkTourlet|Frame=%1").arg(frameSource);
}

bool write(const QString &fileName, const QString &comment)
{
    if (!EncoderLibrary::load())
        return false;
    auto setComment = reinterpret_cast<VidcoreSetFileComment>(EncoderLibrary::resolve("SetFileComment"));
    if (!setComment) {
        logTrace(3, "VideoComment::write: no entry SetFileComment in %s", EncoderLibrary::filePath());
        return false;
    }
    const std::wstring name = fileName.toStdWString();
    const std::wstring value = comment.toStdWString();
    if (setComment(name.c_str(), value.c_str()))
        return true;
    logTrace(3, "VideoComment::write: can't write the comment into %s", fileName);
    return false;
}

} // namespace VideoComment

// Entry points of the encoder library.

#include "CommentRewriter.h"
#include "VideoEncoder.h"
#include "WideText.h"

extern "C" {
#include <libavutil/log.h>
}

#include <cstdlib>
#include <memory>
#include <type_traits>

#define VIDCORE_EXPORT extern "C" __attribute__((visibility("default")))

namespace {

struct ExportObject : VidcoreExport
{
    explicit ExportObject(int32_t format);
    VideoEncoder encoder;
};

VideoEncoder &encoderOf(VidcoreExport *self)
{
    return static_cast<ExportObject *>(self)->encoder;
}

bool opOpen(VidcoreExport *self, const wchar_t *fileName, VidcoreParameters *parameters)
{
    return parameters && encoderOf(self).open(utf8FromWide(fileName), *parameters);
}

bool opWriteFrame(VidcoreExport *self, const uint8_t *pixels, uint32_t byteCount, uint32_t timestamp)
{
    return encoderOf(self).writeFrame(pixels, byteCount, timestamp);
}

bool opFinish(VidcoreExport *self)
{
    return encoderOf(self).finish();
}

void opClose(VidcoreExport *self)
{
    encoderOf(self).close();
}

void opGetParameters(VidcoreExport *self, VidcoreParameters *parameters)
{
    if (parameters)
        *parameters = encoderOf(self).parameters();
}

const char *opErrorText(VidcoreExport *self)
{
    return encoderOf(self).errorText().c_str();
}

const VidcoreOperations operationTable = {opOpen, opWriteFrame, opFinish, opClose, opGetParameters, opErrorText};

ExportObject::ExportObject(int32_t format)
    : VidcoreExport{&operationTable}
    , encoder(format)
{
}

// The library makes one encoder at a time.
std::unique_ptr<ExportObject> theExport;

// FFmpeg talks on stderr only when asked to.
void quietenLog()
{
    if (!std::getenv("VIDCORE_LOG"))
        av_log_set_level(AV_LOG_QUIET);
}

} // namespace

VIDCORE_EXPORT VidcoreExport *CreateExport(int32_t format)
{
    theExport.reset();
    if (!VideoEncoder::isKnownFormat(format))
        return nullptr;
    quietenLog();
    theExport = std::make_unique<ExportObject>(format);
    return theExport.get();
}

VIDCORE_EXPORT void DestroyExport()
{
    theExport.reset();
}

VIDCORE_EXPORT const wchar_t *DefaultExtension(int32_t format)
{
    switch (format) {
    case VidcoreFormatMp4: return L"mp4";
    case VidcoreFormatWmv: return L"wmv";
    default: return L"";
    }
}

VIDCORE_EXPORT bool SetFileComment(const wchar_t *fileName, const wchar_t *comment)
{
    quietenLog();
    return rewriteWithComment(utf8FromWide(fileName), utf8FromWide(comment));
}

static_assert(std::is_same<decltype(&CreateExport), VidcoreCreateExport>::value, "entry signature");
static_assert(std::is_same<decltype(&DestroyExport), VidcoreDestroyExport>::value, "entry signature");
static_assert(std::is_same<decltype(&DefaultExtension), VidcoreDefaultExtension>::value, "entry signature");
static_assert(std::is_same<decltype(&SetFileComment), VidcoreSetFileComment>::value, "entry signature");

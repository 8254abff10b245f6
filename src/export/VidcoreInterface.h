#pragma once

// Binary interface of the encoder library "vidcore", shared by the library and the
// program that loads it. Plain C types only: the library is built without Qt.

#include <cstddef>
#include <cstdint>

extern "C" {

enum VidcoreFormat : int32_t {
    VidcoreFormatWmv = 1,
    VidcoreFormatMp4 = 2,
};

// Means "the frame after the previous one" when passed as the timestamp of a frame.
constexpr uint32_t VidcoreNextFrame = 0xFFFFFFFFu;

// The encoder's parameter record, 80 bytes. Frames handed to writeFrame are 32-bit
// pixels in memory order B, G, R, X (QImage::Format_RGB32 on little-endian) with
// rows packed without padding.
struct VidcoreParameters
{
    uint32_t sourceWidth;       // 0
    uint32_t sourceHeight;      // 4
    double sourceFrameRate;     // 8
    uint32_t keyFrameInterval;  // 16: frames between key frames, 0 picks two seconds
    uint32_t threadCount;       // 20: encoder threads, 0 picks one per core
    uint8_t reserved1[8];       // 24
    uint32_t targetWidth;       // 32
    uint32_t targetHeight;      // 36
    double targetFrameRate;     // 40
    uint8_t reserved2[16];      // 48
    int32_t bitRate;            // 64: bits per second
    uint8_t reserved3[12];      // 68
};

struct VidcoreExport;

// The operations of an encoder object, in this order. The film grows in a file of
// its own and takes the place of the file named at open only when finish() has
// completed it; whatever fails, nothing else on disk is touched.
struct VidcoreOperations
{
    bool (*open)(VidcoreExport *self, const wchar_t *fileName, VidcoreParameters *parameters);
    // False once anything of the film could not be written (a full disk, a size limit).
    bool (*writeFrame)(VidcoreExport *self, const uint8_t *pixels, uint32_t byteCount, uint32_t timestamp);
    // True when the film is complete and in place.
    bool (*finish)(VidcoreExport *self);
    void (*close)(VidcoreExport *self);
    void (*getParameters)(VidcoreExport *self, VidcoreParameters *parameters);
    // UTF-8 text of the first failure, empty while all went well; valid until the next call.
    const char *(*errorText)(VidcoreExport *self);
};

struct VidcoreExport
{
    const VidcoreOperations *operations;
};

// Entry points, looked up by name.
typedef VidcoreExport *(*VidcoreCreateExport)(int32_t format);
typedef void (*VidcoreDestroyExport)();
typedef const wchar_t *(*VidcoreDefaultExtension)(int32_t format);
// Rewrites a finished film with the given text in its comment tag; true on success.
typedef bool (*VidcoreSetFileComment)(const wchar_t *fileName, const wchar_t *comment);

} // extern "C"

static_assert(sizeof(VidcoreParameters) == 80, "the parameter record is 80 bytes");
static_assert(offsetof(VidcoreParameters, sourceFrameRate) == 8, "record layout");
static_assert(offsetof(VidcoreParameters, targetWidth) == 32, "record layout");
static_assert(offsetof(VidcoreParameters, targetFrameRate) == 40, "record layout");
static_assert(offsetof(VidcoreParameters, bitRate) == 64, "record layout");

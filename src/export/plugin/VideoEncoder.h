#pragma once

#include "ReplacingFile.h"
#include "VidcoreInterface.h"

#include <cstdint>
#include <string>

struct AVCodecContext;
struct AVFormatContext;
struct AVFrame;
struct AVPacket;
struct AVStream;
struct SwsContext;

// One film: BGRX frames in, H.264 in MP4 or WMV 8 in ASF out, at a constant frame rate.
class VideoEncoder
{
public:
    explicit VideoEncoder(int32_t format);
    ~VideoEncoder();
    VideoEncoder(const VideoEncoder &) = delete;
    VideoEncoder &operator=(const VideoEncoder &) = delete;

    static bool isKnownFormat(int32_t format);

    // Starts the film in a new file beside the target and writes its header. On
    // failure nothing is left on disk.
    bool open(const std::string &fileName, const VidcoreParameters &parameters);
    // A frame of sourceWidth x sourceHeight pixels; short or missing buffers are
    // dropped. False once anything of the film could not be written.
    bool writeFrame(const uint8_t *pixels, uint32_t byteCount, uint32_t timestamp);
    // Flushes the encoder, completes the file and puts it in the target's place.
    // False when any part of the film could not be written; the target is then
    // untouched and the new file gone.
    bool finish();
    // Releases everything; a film that wasn't finished is dropped.
    void close();

    const VidcoreParameters &parameters() const { return m_parameters; }
    // The system's word on the first thing that failed; empty while all went well.
    const std::string &errorText() const { return m_errorText; }

private:
    bool setUp();
    bool configureCodec();
    void writePackets();
    bool check(int result);

    int32_t m_format;
    VidcoreParameters m_parameters;
    ReplacingFile m_output;
    std::string m_url;
    std::string m_errorText;
    AVFormatContext *m_container = nullptr;
    AVStream *m_stream = nullptr;
    AVCodecContext *m_codec = nullptr;
    SwsContext *m_scaler = nullptr;
    AVFrame *m_frame = nullptr;
    AVPacket *m_packet = nullptr;
    int64_t m_nextPts = 0;
    bool m_finished = false;
    bool m_failed = false;
};

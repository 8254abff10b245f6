#pragma once

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

    // Creates the file and writes its header. On failure nothing is left on disk.
    bool open(const std::string &fileName, const VidcoreParameters &parameters);
    // A frame of sourceWidth x sourceHeight pixels; short or missing buffers are dropped.
    void writeFrame(const uint8_t *pixels, uint32_t byteCount, uint32_t timestamp);
    // Flushes the encoder and completes the file.
    void finish();
    // Releases everything; a film that wasn't finished stays incomplete.
    void close();

    const VidcoreParameters &parameters() const { return m_parameters; }

private:
    bool setUp();
    bool configureCodec();
    void writePackets();
    void discardFile();

    int32_t m_format;
    VidcoreParameters m_parameters;
    std::string m_fileName;
    AVFormatContext *m_container = nullptr;
    AVStream *m_stream = nullptr;
    AVCodecContext *m_codec = nullptr;
    SwsContext *m_scaler = nullptr;
    AVFrame *m_frame = nullptr;
    AVPacket *m_packet = nullptr;
    int64_t m_nextPts = 0;
    bool m_fileCreated = false;
    bool m_finished = false;
};

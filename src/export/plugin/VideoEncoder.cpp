#include "VideoEncoder.h"

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libavutil/imgutils.h>
#include <libavutil/opt.h>
#include <libswscale/swscale.h>
}

#include <algorithm>
#include <cerrno>
#include <cmath>
#include <cstring>

namespace {

constexpr int32_t DefaultBitRate = 40000000;
constexpr double DefaultFrameRate = 30.0;
constexpr uint32_t MaxDimension = 16384;

// Chosen so that 1080p encodes well above real time on two cores at 40 Mbit/s.
constexpr const char *X264Preset = "veryfast";

} // namespace

VideoEncoder::VideoEncoder(int32_t format)
    : m_format(format)
{
    std::memset(&m_parameters, 0, sizeof m_parameters);
    m_parameters.sourceFrameRate = DefaultFrameRate;
    m_parameters.targetFrameRate = DefaultFrameRate;
    m_parameters.bitRate = DefaultBitRate;
}

VideoEncoder::~VideoEncoder()
{
    close();
}

bool VideoEncoder::isKnownFormat(int32_t format)
{
    return format == VidcoreFormatMp4 || format == VidcoreFormatWmv;
}

bool VideoEncoder::open(const std::string &fileName, const VidcoreParameters &parameters)
{
    if (m_container || fileName.empty())
        return false;
    const VidcoreParameters &p = parameters;
    const bool sizeOk = p.targetWidth > 0 && p.targetHeight > 0 && p.targetWidth % 2 == 0
        && p.targetHeight % 2 == 0 && p.targetWidth <= MaxDimension && p.targetHeight <= MaxDimension
        && p.sourceWidth <= MaxDimension && p.sourceHeight <= MaxDimension;
    const bool rateOk = std::isfinite(p.targetFrameRate) && p.targetFrameRate > 0.0 && p.targetFrameRate <= 1000.0;
    if (!sizeOk || !rateOk || p.bitRate <= 0)
        return false;

    m_parameters = p;
    if (m_parameters.sourceWidth == 0 || m_parameters.sourceHeight == 0) {
        m_parameters.sourceWidth = p.targetWidth;
        m_parameters.sourceHeight = p.targetHeight;
    }
    m_nextPts = 0;
    m_finished = false;
    m_failed = false;
    m_errorText.clear();
    // The film grows beside the target and replaces it only when complete.
    if (!m_output.create(fileName)) {
        m_errorText = m_output.errorText();
        return false;
    }
    // The protocol named, so that a colon in a file name is no protocol of its own.
    m_url = "file:" + m_output.path();
    if (setUp())
        return true;
    close();
    return false;
}

bool VideoEncoder::check(int result)
{
    if (result >= 0)
        return true;
    if (!m_failed) {
        m_failed = true;
        char text[AV_ERROR_MAX_STRING_SIZE] = {};
        av_strerror(result, text, sizeof text);
        m_errorText = text;
    }
    return false;
}

bool VideoEncoder::setUp()
{
    const bool mp4 = m_format == VidcoreFormatMp4;
    if (!check(avformat_alloc_output_context2(&m_container, nullptr, mp4 ? "mp4" : "asf", m_url.c_str())))
        return false;
    m_stream = avformat_new_stream(m_container, nullptr);
    if (!m_stream || !configureCodec())
        return false;
    if (avcodec_parameters_from_context(m_stream->codecpar, m_codec) < 0)
        return false;
    m_stream->time_base = m_codec->time_base;
    m_stream->avg_frame_rate = m_codec->framerate;
    m_stream->r_frame_rate = m_codec->framerate;

    if (!check(avio_open(&m_container->pb, m_url.c_str(), AVIO_FLAG_WRITE)))
        return false;
    AVDictionary *options = nullptr;
    if (mp4)
        av_dict_set(&options, "movflags", "+faststart", 0); // index first: plays while loading
    const int header = avformat_write_header(m_container, &options);
    av_dict_free(&options);
    if (!check(header))
        return false;

    const VidcoreParameters &p = m_parameters;
    m_scaler = sws_getContext(int(p.sourceWidth), int(p.sourceHeight), AV_PIX_FMT_BGRA, int(p.targetWidth),
                              int(p.targetHeight), AV_PIX_FMT_YUV420P, SWS_BICUBIC, nullptr, nullptr, nullptr);
    if (!m_scaler)
        return false;
    // Full-range RGB in, limited range out: BT.709 for H.264, which is tagged so;
    // WMV can't carry the tag and is read as BT.601, the matrix it gets.
    const int matrix = m_format == VidcoreFormatMp4 ? SWS_CS_ITU709 : SWS_CS_ITU601;
    sws_setColorspaceDetails(m_scaler, sws_getCoefficients(SWS_CS_DEFAULT), 1, sws_getCoefficients(matrix), 0, 0,
                             1 << 16, 1 << 16);

    m_frame = av_frame_alloc();
    m_packet = av_packet_alloc();
    if (!m_frame || !m_packet)
        return false;
    m_frame->format = AV_PIX_FMT_YUV420P;
    m_frame->width = int(p.targetWidth);
    m_frame->height = int(p.targetHeight);
    return av_frame_get_buffer(m_frame, 0) >= 0;
}

bool VideoEncoder::configureCodec()
{
    const bool mp4 = m_format == VidcoreFormatMp4;
    const AVCodec *codec = mp4 ? avcodec_find_encoder_by_name("libx264") : avcodec_find_encoder(AV_CODEC_ID_WMV2);
    if (!codec && mp4)
        codec = avcodec_find_encoder(AV_CODEC_ID_H264);
    if (!codec)
        return false;
    m_codec = avcodec_alloc_context3(codec);
    if (!m_codec)
        return false;

    const VidcoreParameters &p = m_parameters;
    const AVRational rate = av_d2q(p.targetFrameRate, 1001000);
    m_codec->width = int(p.targetWidth);
    m_codec->height = int(p.targetHeight);
    m_codec->sample_aspect_ratio = AVRational{1, 1};
    m_codec->pix_fmt = AV_PIX_FMT_YUV420P;
    m_codec->framerate = rate;
    m_codec->time_base = av_inv_q(rate);
    m_codec->bit_rate = p.bitRate;
    m_codec->gop_size = p.keyFrameInterval > 0 ? int(p.keyFrameInterval)
                                               : std::max(1, int(std::lround(2.0 * p.targetFrameRate)));
    m_codec->thread_count = int(p.threadCount); // 0: the codec picks by core count
    m_codec->color_range = AVCOL_RANGE_MPEG;
    if (mp4) {
        m_codec->colorspace = AVCOL_SPC_BT709;
        m_codec->color_primaries = AVCOL_PRI_BT709;
        m_codec->color_trc = AVCOL_TRC_BT709;
    }
    if (mp4 && m_codec->priv_data)
        av_opt_set(m_codec->priv_data, "preset", X264Preset, 0);
    if (m_container->oformat->flags & AVFMT_GLOBALHEADER)
        m_codec->flags |= AV_CODEC_FLAG_GLOBAL_HEADER;
    return avcodec_open2(m_codec, codec, nullptr) >= 0;
}

bool VideoEncoder::writeFrame(const uint8_t *pixels, uint32_t byteCount, uint32_t timestamp)
{
    if (m_failed)
        return false;
    if (!m_scaler || m_finished || !pixels)
        return true;
    const VidcoreParameters &p = m_parameters;
    const int stride = int(p.sourceWidth) * 4;
    if (uint64_t(byteCount) < uint64_t(stride) * p.sourceHeight)
        return true;
    if (!check(av_frame_make_writable(m_frame)))
        return false;
    const uint8_t *planes[1] = {pixels};
    const int strides[1] = {stride};
    sws_scale(m_scaler, planes, strides, 0, int(p.sourceHeight), m_frame->data, m_frame->linesize);

    // An explicit timestamp is a frame index; one that isn't ahead of the stream means "next".
    int64_t pts = m_nextPts;
    if (timestamp != VidcoreNextFrame)
        pts = std::max<int64_t>(pts, timestamp);
    m_frame->pts = pts;
    m_nextPts = pts + 1;
    if (check(avcodec_send_frame(m_codec, m_frame)))
        writePackets();
    return !m_failed;
}

void VideoEncoder::writePackets()
{
    int received;
    while ((received = avcodec_receive_packet(m_codec, m_packet)) >= 0) {
        av_packet_rescale_ts(m_packet, m_codec->time_base, m_stream->time_base);
        m_packet->stream_index = m_stream->index;
        if (!check(av_interleaved_write_frame(m_container, m_packet)))
            return;
    }
    if (received != AVERROR(EAGAIN) && received != AVERROR_EOF)
        check(received);
}

bool VideoEncoder::finish()
{
    if (!m_scaler)
        return false;
    if (m_finished)
        return !m_failed;
    m_finished = true;
    if (!m_failed && check(avcodec_send_frame(m_codec, nullptr)))
        writePackets();
    if (!m_failed)
        check(av_write_trailer(m_container));
    // What is still buffered, and what the file system says at the close, count too.
    if (m_container->pb) {
        avio_flush(m_container->pb);
        check(m_container->pb->error);
        check(avio_closep(&m_container->pb));
    }
    if (!m_failed && !m_output.commit()) {
        m_failed = true;
        m_errorText = m_output.errorText();
    }
    if (m_failed)
        m_output.discard();
    return !m_failed;
}

void VideoEncoder::close()
{
    av_packet_free(&m_packet);
    av_frame_free(&m_frame);
    sws_freeContext(m_scaler);
    m_scaler = nullptr;
    avcodec_free_context(&m_codec);
    if (m_container) {
        if (m_container->pb)
            avio_closep(&m_container->pb);
        avformat_free_context(m_container);
        m_container = nullptr;
    }
    m_stream = nullptr;
    m_output.discard();
}

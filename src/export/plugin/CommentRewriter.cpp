#include "CommentRewriter.h"

#include "ReplacingFile.h"

extern "C" {
#include <libavformat/avformat.h>
}

#include <cstring>

namespace {

struct Remux
{
    AVFormatContext *in = nullptr;
    AVFormatContext *out = nullptr;
    AVPacket *packet = nullptr;

    ~Remux()
    {
        av_packet_free(&packet);
        if (out) {
            if (out->pb)
                avio_closep(&out->pb);
            avformat_free_context(out);
        }
        avformat_close_input(&in);
    }
};

// Only the two containers the encoder writes.
const char *muxerFor(const AVInputFormat *format)
{
    if (std::strstr(format->name, "mp4"))
        return "mp4";
    if (std::strcmp(format->name, "asf") == 0)
        return "asf";
    return nullptr;
}

bool copyWithComment(Remux &r, const std::string &from, const std::string &to, const std::string &comment)
{
    if (avformat_open_input(&r.in, from.c_str(), nullptr, nullptr) < 0)
        return false;
    if (avformat_find_stream_info(r.in, nullptr) < 0)
        return false;
    const char *muxer = muxerFor(r.in->iformat);
    if (!muxer || avformat_alloc_output_context2(&r.out, nullptr, muxer, to.c_str()) < 0)
        return false;

    for (unsigned i = 0; i < r.in->nb_streams; ++i) {
        const AVStream *source = r.in->streams[i];
        AVStream *target = avformat_new_stream(r.out, nullptr);
        if (!target || avcodec_parameters_copy(target->codecpar, source->codecpar) < 0)
            return false;
        target->codecpar->codec_tag = 0;
        target->time_base = source->time_base;
        target->avg_frame_rate = source->avg_frame_rate;
        target->r_frame_rate = source->r_frame_rate;
        target->disposition = source->disposition;
        av_dict_copy(&target->metadata, source->metadata, 0);
    }
    av_dict_copy(&r.out->metadata, r.in->metadata, 0);
    av_dict_set(&r.out->metadata, "comment", comment.c_str(), 0);

    if (avio_open(&r.out->pb, to.c_str(), AVIO_FLAG_WRITE) < 0)
        return false;
    AVDictionary *options = nullptr;
    if (std::strcmp(muxer, "mp4") == 0)
        av_dict_set(&options, "movflags", "+faststart", 0);
    const int header = avformat_write_header(r.out, &options);
    av_dict_free(&options);
    if (header < 0)
        return false;

    r.packet = av_packet_alloc();
    if (!r.packet)
        return false;
    int read;
    while ((read = av_read_frame(r.in, r.packet)) >= 0) {
        const int index = r.packet->stream_index;
        av_packet_rescale_ts(r.packet, r.in->streams[index]->time_base, r.out->streams[index]->time_base);
        r.packet->pos = -1;
        if (av_interleaved_write_frame(r.out, r.packet) < 0)
            return false;
    }
    if (read != AVERROR_EOF || av_write_trailer(r.out) < 0)
        return false;
    avio_flush(r.out->pb);
    const int error = r.out->pb->error;
    return avio_closep(&r.out->pb) >= 0 && error >= 0;
}

} // namespace

bool rewriteWithComment(const std::string &fileName, const std::string &comment)
{
    ReplacingFile copy;
    if (!copy.create(fileName))
        return false;
    bool ok;
    {
        Remux r;
        ok = copyWithComment(r, "file:" + fileName, "file:" + copy.path(), comment);
    }
    return ok && copy.commit();
}

#include "GifWriter.h"

#include "app/Trace.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <gif_lib.h>

namespace {

constexpr int transparentIndex = 0;

int writeToFile(GifFileType *gif, const GifByteType *data, int length)
{
    auto *file = static_cast<QFile *>(gif->UserData);
    return int(file->write(reinterpret_cast<const char *>(data), length));
}

} // namespace

bool writeGif(const QString &path, const std::vector<QImage> &frames, int delayMs)
{
    if (frames.empty())
        return false;
    const int w = frames.front().width();
    const int h = frames.front().height();

    // One palette for all frames: quantise the opaque pixels of every frame together.
    std::vector<GifByteType> red, green, blue;
    std::vector<QImage> straight;
    for (const QImage &frame : frames) {
        straight.push_back(frame.convertToFormat(QImage::Format_ARGB32).scaled(w, h));
        const QImage &img = straight.back();
        for (int y = 0; y < h; ++y) {
            const auto *row = reinterpret_cast<const QRgb *>(img.constScanLine(y));
            for (int x = 0; x < w; ++x) {
                if (qAlpha(row[x]) >= 128) {
                    red.push_back(GifByteType(qRed(row[x])));
                    green.push_back(GifByteType(qGreen(row[x])));
                    blue.push_back(GifByteType(qBlue(row[x])));
                }
            }
        }
    }
    if (red.empty()) {
        red.push_back(0);
        green.push_back(0);
        blue.push_back(0);
    }
    int paletteSize = 255;
    std::vector<GifByteType> indices(red.size());
    GifColorType quantised[256];
    if (GifQuantizeBuffer(unsigned(red.size()), 1, &paletteSize, red.data(), green.data(), blue.data(),
                          indices.data(), quantised) == GIF_ERROR) {
        logTrace(3, QStringLiteral("contentgen: can't make a palette for %s"), path);
        return false;
    }

    ColorMapObject *palette = GifMakeMapObject(256, nullptr);
    palette->Colors[transparentIndex] = GifColorType{0, 0, 0};
    for (int i = 0; i < 255; ++i)
        palette->Colors[i + 1] = i < paletteSize ? quantised[i] : GifColorType{0, 0, 0};

    QDir().mkpath(QFileInfo(path).path());
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate)) {
        GifFreeMapObject(palette);
        logTrace(3, QStringLiteral("contentgen: can't write %s"), path);
        return false;
    }
    int error = 0;
    GifFileType *gif = EGifOpen(&file, writeToFile, &error);
    bool ok = gif != nullptr;
    if (ok) {
        EGifSetGifVersion(gif, true);
        ok = EGifPutScreenDesc(gif, w, h, 8, 0, palette) != GIF_ERROR;
    }
    if (ok) {
        // Loop for ever.
        const GifByteType app[] = {'N', 'E', 'T', 'S', 'C', 'A', 'P', 'E', '2', '.', '0'};
        const GifByteType loop[] = {1, 0, 0};
        ok = EGifPutExtensionLeader(gif, APPLICATION_EXT_FUNC_CODE) != GIF_ERROR
             && EGifPutExtensionBlock(gif, sizeof app, app) != GIF_ERROR
             && EGifPutExtensionBlock(gif, sizeof loop, loop) != GIF_ERROR
             && EGifPutExtensionTrailer(gif) != GIF_ERROR;
    }
    size_t next = 0;
    std::vector<GifPixelType> line(static_cast<size_t>(w));
    for (size_t f = 0; ok && f < straight.size(); ++f) {
        GraphicsControlBlock control{};
        control.DisposalMode = DISPOSE_BACKGROUND;
        control.DelayTime = delayMs / 10;
        control.TransparentColor = transparentIndex;
        GifByteType extension[4];
        const size_t length = EGifGCBToExtension(&control, extension);
        ok = EGifPutExtension(gif, GRAPHICS_EXT_FUNC_CODE, int(length), extension) != GIF_ERROR
             && EGifPutImageDesc(gif, 0, 0, w, h, false, nullptr) != GIF_ERROR;
        for (int y = 0; ok && y < h; ++y) {
            const auto *row = reinterpret_cast<const QRgb *>(straight[f].constScanLine(y));
            for (int x = 0; x < w; ++x)
                line[size_t(x)] = qAlpha(row[x]) >= 128 ? GifPixelType(indices[next++] + 1) : transparentIndex;
            ok = EGifPutLine(gif, line.data(), w) != GIF_ERROR;
        }
    }
    if (gif && EGifCloseFile(gif, &error) == GIF_ERROR)
        ok = false;
    GifFreeMapObject(palette);
    if (!ok)
        logTrace(3, QStringLiteral("contentgen: can't write %s"), path);
    return ok;
}

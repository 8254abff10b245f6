#include "Raster.h"

#include "app/Trace.h"

#include <QDir>
#include <QFileInfo>
#include <QPainter>
#include <QSvgRenderer>

#include <vector>

namespace raster {

QImage renderSvg(const QByteArray &svg, const QSize &size)
{
    QSvgRenderer renderer(svg);
    if (!renderer.isValid())
        return QImage();
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    const QSizeF view = renderer.viewBoxF().size();
    const double scale = std::min(size.width() / view.width(), size.height() / view.height());
    const QSizeF drawn = view * scale;
    QPainter painter(&image);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    renderer.render(&painter, QRectF(QPointF((size.width() - drawn.width()) / 2, (size.height() - drawn.height()) / 2), drawn));
    painter.end();
    return image;
}

namespace {

// One horizontal box pass over a single channel held as floats.
void boxPass(std::vector<float> &values, int width, int height, int radius, bool horizontal)
{
    const int length = horizontal ? width : height;
    const int lines = horizontal ? height : width;
    std::vector<float> line(static_cast<size_t>(length));
    const float norm = 1.0f / float(2 * radius + 1);
    for (int l = 0; l < lines; ++l) {
        auto at = [&](int i) -> float & {
            return horizontal ? values[size_t(l) * size_t(width) + size_t(i)]
                              : values[size_t(i) * size_t(width) + size_t(l)];
        };
        for (int i = 0; i < length; ++i)
            line[size_t(i)] = at(i);
        float sum = 0.0f;
        for (int i = -radius; i <= radius; ++i)
            sum += line[size_t(std::clamp(i, 0, length - 1))];
        for (int i = 0; i < length; ++i) {
            at(i) = sum * norm;
            sum += line[size_t(std::min(i + radius + 1, length - 1))] - line[size_t(std::max(i - radius, 0))];
        }
    }
}

} // namespace

void blurChannel(std::vector<float> &values, int width, int height, int radius, int passes)
{
    for (int p = 0; p < passes && radius > 0; ++p) {
        boxPass(values, width, height, radius, true);
        boxPass(values, width, height, radius, false);
    }
}

void boxBlur(QImage &image, int radius, int passes)
{
    if (radius <= 0)
        return;
    image = image.convertToFormat(QImage::Format_ARGB32_Premultiplied);
    const int w = image.width();
    const int h = image.height();
    // Premultiplied channels blur correctly one by one.
    for (int channel = 0; channel < 4; ++channel) {
        std::vector<float> values(size_t(w) * size_t(h));
        for (int y = 0; y < h; ++y) {
            const auto *row = reinterpret_cast<const QRgb *>(image.constScanLine(y));
            for (int x = 0; x < w; ++x)
                values[size_t(y) * size_t(w) + size_t(x)] = float((row[x] >> (channel * 8)) & 0xFF);
        }
        blurChannel(values, w, h, radius, passes);
        for (int y = 0; y < h; ++y) {
            auto *row = reinterpret_cast<QRgb *>(image.scanLine(y));
            for (int x = 0; x < w; ++x) {
                const uint v = uint(std::clamp(values[size_t(y) * size_t(w) + size_t(x)] + 0.5f, 0.0f, 255.0f));
                row[x] = (row[x] & ~(0xFFu << (channel * 8))) | (v << (channel * 8));
            }
        }
    }
}

QImage withDropShadow(const QImage &picture, QPointF offset, int blur, double opacity)
{
    QImage shadow(picture.size(), QImage::Format_ARGB32_Premultiplied);
    shadow.fill(Qt::transparent);
    {
        QPainter p(&shadow);
        p.drawImage(offset, picture);
        p.setCompositionMode(QPainter::CompositionMode_SourceIn);
        p.fillRect(shadow.rect(), QColor(0, 0, 0, int(255 * opacity)));
    }
    boxBlur(shadow, std::max(1, blur / 3));
    QPainter p(&shadow);
    p.drawImage(0, 0, picture);
    p.end();
    return shadow;
}

QImage fitted(const QImage &picture, const QSize &size)
{
    QImage scaled = picture.scaled(size, Qt::KeepAspectRatio, Qt::SmoothTransformation);
    QImage canvas(size, QImage::Format_ARGB32_Premultiplied);
    canvas.fill(Qt::transparent);
    QPainter p(&canvas);
    p.drawImage((size.width() - scaled.width()) / 2, (size.height() - scaled.height()) / 2, scaled);
    p.end();
    return canvas;
}

bool save(const QImage &image, const QString &path, int quality)
{
    QDir().mkpath(QFileInfo(path).path());
    if (image.isNull() || !image.save(path, nullptr, quality)) {
        logTrace(3, QStringLiteral("contentgen: can't write %s"), path);
        return false;
    }
    return true;
}

} // namespace raster

#pragma once

#include <QByteArray>
#include <QColor>
#include <QImage>
#include <QSize>
#include <QString>

#include <vector>

// Picture helpers shared by every kind of content.
namespace raster {

// Renders SVG text into a transparent picture of the given size, keeping the
// drawing's aspect ratio and centring it. A null picture when the SVG is invalid.
QImage renderSvg(const QByteArray &svg, const QSize &size);

// Blurs every channel by repeated box passes (close to a Gaussian).
void boxBlur(QImage &image, int radius, int passes = 3);

// The same for one channel of w x h values.
void blurChannel(std::vector<float> &values, int width, int height, int radius, int passes);

// Puts a soft shadow of the picture's own shape below it; offset and blur in pixels.
QImage withDropShadow(const QImage &picture, QPointF offset, int blur, double opacity);

// Scales to fit within size with smooth filtering, centred on a transparent canvas.
QImage fitted(const QImage &picture, const QSize &size);

// Saves and reports failure in the trace; makes the folder if needed.
bool save(const QImage &image, const QString &path, int quality = -1);

} // namespace raster

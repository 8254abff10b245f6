#include "PresetIcon.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QSettings>

#include <cmath>

namespace {

const QSize iconSize(160, 100);

// A made-up profile of a day in the hills, 0..1 high over 0..1 of the way.
double profile(double t)
{
    return 0.18 + 0.22 * std::sin(t * 5.1 + 0.3) * std::sin(t * 1.7) + 0.5 * std::exp(-std::pow((t - 0.62) / 0.16, 2))
           + 0.08 * std::sin(t * 17.0);
}

QColor colour(const QSettings &s, const char *key, const QColor &fallback)
{
    const QColor c(s.value(QLatin1String(key)).toString());
    return c.isValid() ? c : fallback;
}

QLinearGradient threeStops(QPointF from, QPointF to, const QColor &a, const QColor &b, const QColor &c)
{
    QLinearGradient g(from, to);
    g.setColorAt(0, a);
    g.setColorAt(0.5, b);
    g.setColorAt(1, c);
    return g;
}

void drawBoard(QPainter &p, const QColor &board, double opacity, int border, const QColor &borderColour, double radius)
{
    const QRectF frame = QRectF(QPointF(0, 0), iconSize).adjusted(3, 3, -3, -3);
    p.setOpacity(opacity);
    p.setPen(border > 0 ? QPen(borderColour, border) : Qt::NoPen);
    p.setBrush(board);
    p.drawRoundedRect(frame, radius, radius);
    p.setOpacity(1.0);
}

} // namespace

QImage presetIcon(const QString &presetFile)
{
    QSettings s(presetFile, QSettings::IniFormat);
    if (s.value(QStringLiteral("Header/version")).toString().isEmpty())
        return QImage();
    QImage image(iconSize, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing);

    s.beginGroup(QStringLiteral("base"));
    drawBoard(p, colour(s, "boardColor", QColor(13, 13, 13)), s.value(QStringLiteral("opacity"), 1.0).toDouble(),
              std::min(3, s.value(QStringLiteral("borderWidth")).toInt()), colour(s, "borderColor", Qt::transparent),
              std::min(14.0, s.value(QStringLiteral("radius")).toDouble() / 2));
    s.endGroup();

    const QRectF graph(18, 14, iconSize.width() - 30, iconSize.height() - 30);
    s.beginGroup(QStringLiteral("scale"));
    const bool heightScale = s.value(QStringLiteral("heightScale")).toInt() != 0;
    const bool distanceScale = s.value(QStringLiteral("distanceScale")).toInt() != 0;
    s.endGroup();

    s.beginGroup(QStringLiteral("graph"));
    QColor scale = colour(s, "scaleColor", Qt::white);
    scale.setAlphaF(std::clamp(s.value(QStringLiteral("scaleOpacity"), 0.5).toDouble(), 0.15, 1.0));
    p.setPen(QPen(scale, 1));
    if (heightScale)
        for (int i = 0; i <= 3; ++i)
            p.drawLine(QPointF(graph.left() - 6, graph.bottom() - i * graph.height() / 3), QPointF(graph.right(), graph.bottom() - i * graph.height() / 3));
    if (distanceScale)
        for (int i = 0; i <= 5; ++i)
            p.drawLine(QPointF(graph.left() + i * graph.width() / 5, graph.bottom()), QPointF(graph.left() + i * graph.width() / 5, graph.bottom() + 5));

    QPainterPath line;
    QPointF peak;
    const int samples = 60;
    for (int i = 0; i <= samples; ++i) {
        const double t = double(i) / samples;
        const QPointF at(graph.left() + t * graph.width(), graph.bottom() - profile(t) * graph.height());
        if (i == 0)
            line.moveTo(at);
        else
            line.lineTo(at);
        if (i == 0 || at.y() < peak.y())
            peak = at;
    }
    QPainterPath area = line;
    area.lineTo(graph.bottomRight());
    area.lineTo(graph.bottomLeft());
    area.closeSubpath();
    const QColor increase = colour(s, "increaseColor", QColor(120, 200, 120));
    if (s.value(QStringLiteral("graphUseGradient")).toInt() != 0)
        p.fillPath(area, threeStops(graph.topLeft(), graph.bottomLeft(), colour(s, "graphGradientStartColor", increase),
                                    colour(s, "graphGradientMiddleColor", increase), colour(s, "graphGradientEndColor", increase)));
    else {
        QColor fill = increase;
        fill.setAlphaF(0.5);
        p.fillPath(area, fill);
    }
    const double width = std::clamp(s.value(QStringLiteral("lineWidth"), 2).toDouble(), 1.0, 4.0);
    p.setOpacity(std::clamp(s.value(QStringLiteral("lineOpacity"), 1.0).toDouble(), 0.2, 1.0));
    if (s.value(QStringLiteral("graphUseLineGradient")).toInt() != 0)
        p.strokePath(line, QPen(QBrush(threeStops(graph.topLeft(), graph.topRight(), colour(s, "graphLineGradientStartColor", Qt::white),
                                                  colour(s, "graphLineGradientMiddleColor", Qt::white),
                                                  colour(s, "graphLineGradientEndColor", Qt::white))),
                                width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    else
        p.strokePath(line, QPen(colour(s, "graphLineColor", Qt::white), width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.setOpacity(1.0);
    s.endGroup();

    s.beginGroup(QStringLiteral("peak"));
    QColor peakBackground = colour(s, "peakBackgroundColor", Qt::white);
    peakBackground.setAlphaF(1.0 - std::clamp(s.value(QStringLiteral("peakTransparency")).toDouble(), 0.0, 0.8));
    p.setPen(QPen(colour(s, "peakColor", Qt::red), 2));
    p.setBrush(peakBackground);
    p.drawEllipse(peak, 5, 5);
    s.endGroup();
    p.end();
    return image;
}

QImage noPresetIcon()
{
    QImage image(iconSize, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing);
    const QRectF frame = QRectF(QPointF(0, 0), iconSize).adjusted(4, 4, -4, -4);
    p.setPen(QPen(QColor(120, 130, 140), 3, Qt::DashLine));
    p.setBrush(Qt::NoBrush);
    p.drawRoundedRect(frame, 10, 10);
    p.setPen(QPen(QColor(120, 130, 140), 5, Qt::SolidLine, Qt::RoundCap));
    const QPointF c = frame.center();
    p.drawEllipse(c, 24, 24);
    p.drawLine(c + QPointF(-17, 17), c + QPointF(17, -17));
    p.end();
    return image;
}

#include "ContactSheet.h"

#include "Raster.h"
#include "app/Trace.h"

#include <QDir>
#include <QFileInfo>
#include <QFont>
#include <QFontMetrics>
#include <QPainter>

#include <gif_lib.h>

#include <cstring>
#include <vector>

namespace {

constexpr int sheetWidth = 1200;
constexpr int margin = 24;
const QColor paper(248, 248, 246);
const QColor cellColour(233, 229, 218); // a quiet map tone, as symbols are seen
const QColor ink(48, 54, 60);

struct Tile
{
    QImage picture;
    QString label;
};

QStringList files(const QString &folder, const QStringList &patterns)
{
    QStringList out;
    for (const QFileInfo &info : QDir(folder).entryInfoList(patterns, QDir::Files, QDir::Name | QDir::IgnoreCase))
        out << info.filePath();
    return out;
}

std::vector<Tile> tilesOf(const QStringList &paths)
{
    std::vector<Tile> tiles;
    for (const QString &path : paths)
        tiles.push_back({QImage(path), QFileInfo(path).completeBaseName()});
    return tiles;
}

class Sheet
{
public:
    Sheet() : m_image(sheetWidth, 4000, QImage::Format_RGB32), m_painter(&m_image)
    {
        m_image.fill(paper);
        m_painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform | QPainter::TextAntialiasing);
        m_y = margin;
        QFont title(QStringLiteral("DejaVu Sans"));
        title.setPixelSize(26);
        title.setBold(true);
        m_painter.setFont(title);
        m_painter.setPen(ink);
        m_painter.drawText(QRect(margin, m_y, sheetWidth - 2 * margin, 34), Qt::AlignLeft | Qt::AlignVCenter,
                           QStringLiteral("Tourlet content"));
        m_y += 44;
    }

    void section(const QString &heading, const std::vector<Tile> &tiles, QSize cell, bool keepBackground = false)
    {
        QFont font(QStringLiteral("DejaVu Sans"));
        font.setPixelSize(17);
        font.setBold(true);
        m_painter.setFont(font);
        m_painter.setPen(ink);
        m_painter.drawText(QRect(margin, m_y, sheetWidth - 2 * margin, 24), Qt::AlignLeft | Qt::AlignVCenter,
                           QStringLiteral("%1 (%2)").arg(heading).arg(tiles.size()));
        m_y += 30;
        QFont labelFont(QStringLiteral("DejaVu Sans"));
        labelFont.setPixelSize(10);
        const QFontMetrics metrics(labelFont);
        const int gap = 10;
        const int labelHeight = 16;
        const int columns = std::max(1, (sheetWidth - 2 * margin + gap) / (cell.width() + gap));
        int column = 0;
        for (const Tile &tile : tiles) {
            const QRect box(margin + column * (cell.width() + gap), m_y, cell.width(), cell.height());
            m_painter.setPen(Qt::NoPen);
            m_painter.setBrush(keepBackground ? QColor(60, 64, 70) : cellColour);
            m_painter.drawRoundedRect(box, 6, 6);
            const QImage fit = raster::fitted(tile.picture, box.size() - QSize(8, 8));
            m_painter.drawImage(box.topLeft() + QPoint(4, 4), fit);
            m_painter.setFont(labelFont);
            m_painter.setPen(ink);
            m_painter.drawText(QRect(box.left(), box.bottom() + 2, box.width(), labelHeight), Qt::AlignHCenter | Qt::AlignTop,
                               metrics.elidedText(tile.label, Qt::ElideMiddle, box.width()));
            if (++column == columns) {
                column = 0;
                m_y += cell.height() + labelHeight + gap;
            }
        }
        if (column != 0)
            m_y += cell.height() + labelHeight + gap;
        m_y += 12;
    }

    QImage finish()
    {
        m_painter.end();
        return m_image.copy(0, 0, sheetWidth, m_y + margin - 12);
    }

private:
    QImage m_image;
    QPainter m_painter;
    int m_y = 0;
};

// Down to 256 colours with the GIF library's quantiser; PNG keeps the palette.
QImage quantised(const QImage &image)
{
    const QImage rgb = image.convertToFormat(QImage::Format_RGB32);
    const unsigned count = unsigned(rgb.width()) * unsigned(rgb.height());
    std::vector<GifByteType> r(count), g(count), b(count), indices(count);
    for (int y = 0; y < rgb.height(); ++y) {
        const auto *row = reinterpret_cast<const QRgb *>(rgb.constScanLine(y));
        for (int x = 0; x < rgb.width(); ++x) {
            const size_t i = size_t(y) * size_t(rgb.width()) + size_t(x);
            r[i] = GifByteType(qRed(row[x]));
            g[i] = GifByteType(qGreen(row[x]));
            b[i] = GifByteType(qBlue(row[x]));
        }
    }
    int size = 256;
    GifColorType palette[256];
    if (GifQuantizeBuffer(unsigned(rgb.width()), unsigned(rgb.height()), &size, r.data(), g.data(), b.data(),
                          indices.data(), palette) == GIF_ERROR)
        return image;
    QImage out(rgb.size(), QImage::Format_Indexed8);
    QVector<QRgb> table;
    for (int i = 0; i < size; ++i)
        table << qRgb(palette[i].Red, palette[i].Green, palette[i].Blue);
    out.setColorTable(table);
    for (int y = 0; y < rgb.height(); ++y)
        std::memcpy(out.scanLine(y), indices.data() + size_t(y) * size_t(rgb.width()), size_t(rgb.width()));
    return out;
}

} // namespace

bool writeContactSheet(const QString &imageRoot, const QString &pngPath)
{
    const QString root = imageRoot.endsWith(QLatin1Char('/')) ? imageRoot : imageRoot + QLatin1Char('/');
    Sheet sheet;
    std::vector<Tile> avatars = tilesOf(files(root + QStringLiteral("avatars/Icons"), {QStringLiteral("*.png"), QStringLiteral("*.gif")}));
    sheet.section(QStringLiteral("Avatars"), avatars, QSize(96, 96));

    std::vector<Tile> turns;
    for (const QFileInfo &model : QDir(root + QStringLiteral("avatars/ZK3D")).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name)) {
        const int frames = int(QDir(model.filePath()).entryList({QStringLiteral("*.png")}, QDir::Files).size());
        for (int k = 0; k < 12 && frames > 0; ++k) {
            const int frame = 1 + k * frames / 12;
            const QString path = QStringLiteral("%1/%2_%3.png").arg(model.filePath(), model.fileName()).arg(frame);
            turns.push_back({QImage(path), QStringLiteral("%1_%2").arg(model.fileName()).arg(frame)});
        }
    }
    sheet.section(QStringLiteral("Perspective avatar, one frame in six"), turns, QSize(88, 88));
    sheet.section(QStringLiteral("Waypoint symbols"), tilesOf(files(root + QStringLiteral("waypoints"), {QStringLiteral("*.png")})), QSize(80, 80));
    sheet.section(QStringLiteral("Masks"), tilesOf(files(root + QStringLiteral("masks/Icons"), {QStringLiteral("*.png")})), QSize(112, 63));
    sheet.section(QStringLiteral("Maps"), tilesOf(files(root + QStringLiteral("maps/Icons"), {QStringLiteral("*.jpg"), QStringLiteral("*.png")})), QSize(256, 128));
    sheet.section(QStringLiteral("Altitude themes"), tilesOf(files(root + QStringLiteral("altitudepresets/Icons"), {QStringLiteral("*.png")})), QSize(128, 80), true);
    sheet.section(QStringLiteral("Splash"), tilesOf({root + QStringLiteral("splash/splash.png")}), QSize(320, 200));

    QImage image = sheet.finish();
    if (!raster::save(image, pngPath))
        return false;
    if (QFileInfo(pngPath).size() > 280 * 1024)
        return raster::save(quantised(image), pngPath);
    return true;
}

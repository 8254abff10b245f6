#include "ContactSheet.h"

#include "Raster.h"
#include "app/Trace.h"

#include <QDir>
#include <QFileInfo>
#include <QFont>
#include <QFontMetrics>
#include <QPainter>

#include <algorithm>
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
        if (tiles.empty())
            return;
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

// Six bits a channel: no visible change on these pictures, and a third smaller as PNG.
QImage posterised(const QImage &image)
{
    QImage out = image.convertToFormat(QImage::Format_RGB888);
    for (int y = 0; y < out.height(); ++y) {
        uchar *row = out.scanLine(y);
        for (int x = 0; x < out.width() * 3; ++x)
            row[x] = uchar((row[x] & 0xFC) | (row[x] >> 6));
    }
    return out;
}

} // namespace

bool writeContactSheet(const QString &imageRoot, const QString &pngPath)
{
    const QString root = imageRoot.endsWith(QLatin1Char('/')) ? imageRoot : imageRoot + QLatin1Char('/');
    Sheet sheet;
    // Flat avatars by their thumbnails, perspective ones by their first frame, as the lists show them.
    const QStringList models = QDir(root + QStringLiteral("avatars/ZK3D")).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    QStringList avatarFiles = files(root + QStringLiteral("avatars/Icons"), {QStringLiteral("*.png"), QStringLiteral("*.gif")});
    for (const QString &model : models)
        avatarFiles << QStringLiteral("%1avatars/ZK3D/%2/%2_1.png").arg(root, model);
    std::vector<Tile> avatars = tilesOf(avatarFiles);
    for (size_t i = avatars.size() - size_t(models.size()); i < avatars.size(); ++i)
        avatars[i].label.chop(2);
    std::sort(avatars.begin(), avatars.end(), [](const Tile &a, const Tile &b) { return a.label.compare(b.label, Qt::CaseInsensitive) < 0; });
    sheet.section(QStringLiteral("Avatars"), avatars, QSize(96, 96));

    std::vector<Tile> turns;
    for (const QString &model : models) {
        const QString folder = root + QStringLiteral("avatars/ZK3D/") + model;
        const int frames = int(QDir(folder).entryList({QStringLiteral("*.png")}, QDir::Files).size());
        for (int k = 0; k < 12 && frames > 0; ++k) {
            const int frame = 1 + k * frames / 12;
            const QString path = QStringLiteral("%1/%2_%3.png").arg(folder, model).arg(frame);
            turns.push_back({QImage(path), QStringLiteral("%1_%2").arg(model).arg(frame)});
        }
    }
    sheet.section(QStringLiteral("Perspective avatar, every sixth frame"), turns, QSize(86, 86));
    sheet.section(QStringLiteral("Waypoint symbols"), tilesOf(files(root + QStringLiteral("waypoints"), {QStringLiteral("*.png")})), QSize(80, 80));
    sheet.section(QStringLiteral("Masks"), tilesOf(files(root + QStringLiteral("masks/Icons"), {QStringLiteral("*.png")})), QSize(112, 63));
    sheet.section(QStringLiteral("Maps"), tilesOf(files(root + QStringLiteral("maps/Icons"), {QStringLiteral("*.jpg"), QStringLiteral("*.png")})), QSize(200, 100));
    sheet.section(QStringLiteral("Altitude themes"), tilesOf(files(root + QStringLiteral("altitudepresets/Icons"), {QStringLiteral("*.png")})), QSize(128, 80), true);
    sheet.section(QStringLiteral("Splash"), tilesOf({root + QStringLiteral("splash/splash.png")}), QSize(256, 160));

    return raster::save(posterised(sheet.finish()), pngPath);
}

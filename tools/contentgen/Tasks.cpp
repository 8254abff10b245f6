#include "Tasks.h"

#include "CabrioModel.h"
#include "Drawings.h"
#include "GifWriter.h"
#include "PresetIcon.h"
#include "Raster.h"
#include "SoftRenderer.h"
#include "WorldMaps.h"
#include "app/Trace.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QPainter>
#include <QSettings>
#include <QSvgRenderer>

namespace tasks {

namespace {

constexpr int avatarSize = 512;
constexpr int avatarThumbSize = 128;
constexpr int symbolSize = 256;
constexpr int symbolThumbSize = 96;

bool fail(const QString &format, const QString &what)
{
    logTrace(3, QStringLiteral("contentgen: ") + format, what);
    return false;
}

// Empties the output folder, so that removed sources leave nothing behind.
bool resetFolder(const QString &out)
{
    QDir dir(out);
    if (dir.exists() && !dir.removeRecursively())
        return fail(QStringLiteral("can't clear %s"), out);
    if (!QDir().mkpath(out + QStringLiteral("/Icons")))
        return fail(QStringLiteral("can't make %s"), out);
    return true;
}

bool copyFile(const QString &from, const QString &to)
{
    QDir().mkpath(QFileInfo(to).path());
    QFile::remove(to);
    if (!QFile::copy(from, to))
        return fail(QStringLiteral("can't copy %s"), from);
    return true;
}

// The ini texts of a folder itself (groups, translations), not the drawing recipes.
bool copyFolderTexts(const QString &source, const QString &out)
{
    const QStringList names = QDir(source).entryList({QStringLiteral("*.ini")}, QDir::Files, QDir::Name);
    for (const QString &name : names)
        if (name != QLatin1String("drawings.ini") && !copyFile(source + QLatin1Char('/') + name, out + QLatin1Char('/') + name))
            return false;
    return true;
}

QStringList itemStems(const QString &source)
{
    QStringList stems;
    for (const QFileInfo &info : QDir(source + QStringLiteral("/informations")).entryInfoList({QStringLiteral("*.ini")}, QDir::Files, QDir::Name))
        stems << info.completeBaseName();
    return stems;
}

QString itemIni(const QString &folder, const QString &stem)
{
    return folder + QStringLiteral("/informations/") + stem + QStringLiteral(".ini");
}

QString mainValue(const QString &ini, const QString &key)
{
    QSettings settings(ini, QSettings::IniFormat);
    return settings.value(QStringLiteral("main/") + key).toString();
}

QImage symbolPicture(const QByteArray &svg, int size, double shadowScale)
{
    const QImage picture = raster::renderSvg(svg, QSize(size, size));
    if (picture.isNull())
        return picture;
    return raster::withDropShadow(picture, QPointF(3, 5) * shadowScale, int(9 * shadowScale), 0.38);
}

// A picture that turns with the road gets its shadow straight below, so that
// the shadow doesn't swing round with the heading.
QImage avatarPicture(const QByteArray &svg, int size, bool turns)
{
    const QImage picture = raster::renderSvg(svg, QSize(size, size));
    if (picture.isNull())
        return picture;
    const double s = size / double(avatarSize);
    return raster::withDropShadow(picture, turns ? QPointF(0, 0) : QPointF(6, 10) * s, int(16 * s), 0.32);
}

// The body with a turning part drawn over it, slightly smeared to look fast.
std::vector<QImage> spinFrames(const QByteArray &body, const QByteArray &spinner, QPointF centre, int frames,
                               double turnPerCycle, int size)
{
    std::vector<QImage> out;
    const QImage base = raster::renderSvg(body, QSize(size, size));
    const QImage blade = raster::renderSvg(spinner, QSize(size, size));
    const double scale = size / double(avatarSize);
    for (int f = 0; f < frames; ++f) {
        QImage frame = base;
        QPainter p(&frame);
        p.setRenderHint(QPainter::SmoothPixmapTransform);
        for (int trail = 2; trail >= 0; --trail) {
            p.save();
            p.setOpacity(trail == 0 ? 1.0 : 0.28 / trail);
            p.translate(centre * scale);
            p.rotate(turnPerCycle * f / frames - trail * 7.0);
            p.translate(-centre * scale);
            p.drawImage(0, 0, blade);
            p.restore();
        }
        p.end();
        out.push_back(frame);
    }
    return out;
}

bool perspectiveAvatar(const Drawings &drawings, const QString &stem, const QString &out)
{
    if (drawings.value(stem, QStringLiteral("model")) != QLatin1String("cabrio"))
        return fail(QStringLiteral("perspective avatar %s names no known model"), stem);
    const int frames = drawings.value(stem, QStringLiteral("frames"), QStringLiteral("72")).toInt();
    const int size = drawings.value(stem, QStringLiteral("size"), QStringLiteral("320")).toInt();
    const QColor paint(drawings.value(stem, QStringLiteral("paint"), QStringLiteral("#C62828")));
    if (frames < 1 || size < 16 || !paint.isValid())
        return fail(QStringLiteral("bad frames, size or paint for %s"), stem);
    const Model model = cabrioModel(paint);
    const SoftRenderer renderer(size, 5.6, 38.0);
    const QString folder = out + QStringLiteral("/ZK3D/") + stem + QLatin1Char('/');
    for (int k = 0; k < frames; ++k) {
        // Frame k+1 shows the car heading k steps clockwise from north.
        const QImage frame = renderer.render(model, 360.0 * k / frames);
        if (!raster::save(frame, folder + stem + QLatin1Char('_') + QString::number(k + 1) + QStringLiteral(".png")))
            return false;
    }
    return true;
}

bool animatedAvatar(const Drawings &drawings, const QString &stem, const QString &out)
{
    const QByteArray body = drawings.svg(stem);
    const QByteArray spinner = drawings.svg(stem, QStringLiteral("spin"));
    const QStringList centre = drawings.value(stem, QStringLiteral("spinCentre")).split(QLatin1Char(' '));
    const int frames = drawings.value(stem, QStringLiteral("frames"), QStringLiteral("8")).toInt();
    const double cycle = drawings.value(stem, QStringLiteral("spinPerCycle"), QStringLiteral("90")).toDouble();
    if (body.isEmpty() || spinner.isEmpty() || centre.size() != 2 || frames < 2)
        return fail(QStringLiteral("animated avatar %s needs svg, spin, spinCentre and frames"), stem);
    const QPointF at(centre.at(0).toDouble(), centre.at(1).toDouble());
    const int delay = drawings.value(stem, QStringLiteral("delay"), QStringLiteral("40")).toInt();
    return writeGif(out + QLatin1Char('/') + stem + QStringLiteral(".gif"),
                    spinFrames(body, spinner, at, frames, cycle, avatarSize), delay)
           && writeGif(out + QStringLiteral("/Icons/") + stem + QStringLiteral(".gif"),
                       spinFrames(body, spinner, at, frames, cycle, avatarThumbSize), delay);
}

bool flatAvatar(const Drawings &drawings, const QString &stem, const QString &out, bool turns)
{
    QImage picture;
    if (drawings.value(stem, QStringLiteral("svg")) == QLatin1String("none")) {
        picture = QImage(avatarSize, avatarSize, QImage::Format_ARGB32_Premultiplied);
        picture.fill(Qt::transparent);
    } else {
        picture = avatarPicture(drawings.svg(stem), avatarSize, turns);
    }
    const bool ownThumb = drawings.has(stem, QStringLiteral("thumb"));
    const QImage thumb = avatarPicture(drawings.svg(stem, ownThumb ? QStringLiteral("thumb") : QStringLiteral("svg")),
                                       avatarThumbSize, turns);
    if (picture.isNull() || thumb.isNull())
        return fail(QStringLiteral("no drawing for avatar %s"), stem);
    return raster::save(picture, out + QLatin1Char('/') + stem + QStringLiteral(".png"))
           && raster::save(thumb, out + QStringLiteral("/Icons/") + stem + QStringLiteral(".png"));
}

// The photo area of a template, from the element "photo" of its drawing: centre
// offset from the middle of the picture and size, in pixels of the picture.
bool photoArea(const QByteArray &svg, int size, QPointF &offset, QSizeF &area)
{
    QSvgRenderer renderer(svg);
    if (!renderer.elementExists(QStringLiteral("photo")))
        return false;
    const QRectF view = renderer.viewBoxF();
    const double scale = size / std::max(view.width(), view.height());
    const QRectF photo = renderer.transformForElement(QStringLiteral("photo")).mapRect(renderer.boundsOnElement(QStringLiteral("photo")));
    offset = (photo.center() - view.center()) * scale;
    area = photo.size() * scale;
    return true;
}

} // namespace

bool avatars(const QString &source, const QString &out)
{
    if (!resetFolder(out) || !copyFolderTexts(source, out))
        return false;
    const Drawings drawings(source);
    const QStringList stems = itemStems(source);
    for (const QString &stem : stems) {
        const QString ini = itemIni(source, stem);
        if (!copyFile(ini, itemIni(out, stem)))
            return false;
        bool ok;
        if (mainValue(ini, QStringLiteral("displayFormat")) == QLatin1String("perspective"))
            ok = perspectiveAvatar(drawings, stem, out);
        else if (mainValue(ini, QStringLiteral("type")) == QLatin1String("gif"))
            ok = animatedAvatar(drawings, stem, out);
        else
            ok = flatAvatar(drawings, stem, out, mainValue(ini, QStringLiteral("allowRotation")) == QLatin1String("true"));
        if (!ok)
            return false;
    }
    logTrace(0, QStringLiteral("contentgen: %d avatars"), int(stems.size()));
    return true;
}

bool waypoints(const QString &source, const QString &out)
{
    if (!resetFolder(out) || !copyFolderTexts(source, out))
        return false;
    const Drawings drawings(source);
    const QStringList stems = itemStems(source);
    for (const QString &stem : stems) {
        const QString ini = itemIni(source, stem);
        const QByteArray svg = drawings.svg(stem);
        const QImage picture = symbolPicture(svg, symbolSize, 1.0);
        const QImage thumb = symbolPicture(svg, symbolThumbSize, symbolThumbSize / double(symbolSize));
        if (picture.isNull() || thumb.isNull())
            return fail(QStringLiteral("no drawing for symbol %s"), stem);
        if (!raster::save(picture, out + QLatin1Char('/') + stem + QStringLiteral(".png"))
            || !raster::save(thumb, out + QStringLiteral("/Icons/") + stem + QStringLiteral(".png"))
            || !copyFile(ini, itemIni(out, stem)))
            return false;
        if (mainValue(ini, QStringLiteral("media")) == QLatin1String("true")) {
            QPointF offset;
            QSizeF area;
            if (!photoArea(svg, symbolSize, offset, area))
                return fail(QStringLiteral("photo template %s has no element \"photo\""), stem);
            QSettings settings(itemIni(out, stem), QSettings::IniFormat);
            settings.setValue(QStringLiteral("main/mediaCPOx"), QString::number(offset.x(), 'f', 1));
            settings.setValue(QStringLiteral("main/mediaCPOy"), QString::number(offset.y(), 'f', 1));
            settings.setValue(QStringLiteral("main/mediaW"), QString::number(area.width(), 'f', 1));
            settings.setValue(QStringLiteral("main/mediaH"), QString::number(area.height(), 'f', 1));
            settings.sync();
            if (settings.status() != QSettings::NoError)
                return fail(QStringLiteral("can't write %s"), itemIni(out, stem));
        }
    }
    logTrace(0, QStringLiteral("contentgen: %d waypoint symbols"), int(stems.size()));
    return true;
}

bool masks(const QString &source, const QString &out)
{
    if (!resetFolder(out) || !copyFolderTexts(source, out))
        return false;
    const Drawings drawings(source);
    for (const QString &stem : itemStems(source)) {
        const QByteArray svg = drawings.svg(stem);
        const QImage mask = raster::renderSvg(svg, QSize(1280, 720));
        if (mask.isNull())
            return fail(QStringLiteral("no drawing for mask %s"), stem);
        // The thumbnail shows the shape in grey, so that it reads on light and dark lists.
        QImage thumb = raster::renderSvg(svg, QSize(160, 90));
        QPainter p(&thumb);
        p.setCompositionMode(QPainter::CompositionMode_SourceIn);
        p.fillRect(thumb.rect(), QColor(84, 110, 122));
        p.end();
        if (!raster::save(mask, out + QLatin1Char('/') + stem + QStringLiteral(".png"))
            || !raster::save(thumb, out + QStringLiteral("/Icons/") + stem + QStringLiteral(".png"))
            || !copyFile(itemIni(source, stem), itemIni(out, stem)))
            return false;
    }
    return true;
}

bool maps(const QString &source, const QString &out, const QString &geoPackage)
{
    if (!resetFolder(out) || !copyFolderTexts(source, out))
        return false;
    WorldMaps world;
    if (!world.load(geoPackage, source + QStringLiteral("/cities.csv"), source + QStringLiteral("/drylands.csv")))
        return false;
    const Drawings drawings(source);
    for (const QString &stem : itemStems(source)) {
        const QString ini = itemIni(source, stem);
        // Every map is the whole world; "origins" says so after the "@".
        if (!mainValue(ini, QStringLiteral("origins")).endsWith(QLatin1String("@-180:90:180:-90")))
            return fail(QStringLiteral("map %s must have origins ending in @-180:90:180:-90"), stem);
        const QString style = drawings.value(stem, QStringLiteral("style"));
        const int width = drawings.value(stem, QStringLiteral("width"), QStringLiteral("4096")).toInt();
        QImage picture;
        if (style == QLatin1String("physical"))
            picture = world.physical(width);
        else if (style == QLatin1String("paper"))
            picture = world.oldPaper(width);
        else if (style == QLatin1String("night"))
            picture = world.night(width);
        else
            return fail(QStringLiteral("map %s has no style physical, paper or night"), stem);
        const QString type = mainValue(ini, QStringLiteral("type"));
        const QImage thumb = picture.scaled(256, 128, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
        if (!raster::save(picture, out + QLatin1Char('/') + stem + QLatin1Char('.') + type, 88)
            || !raster::save(thumb, out + QStringLiteral("/Icons/") + stem + QLatin1Char('.') + type, 90)
            || !copyFile(ini, itemIni(out, stem)))
            return false;
    }
    return true;
}

bool altitudePresets(const QString &source, const QString &out)
{
    if (!resetFolder(out))
        return false;
    const QStringList presets = QDir(source).entryList({QStringLiteral("*.tmprs")}, QDir::Files, QDir::Name);
    for (const QString &name : presets) {
        const QString from = source + QLatin1Char('/') + name;
        const QImage icon = presetIcon(from);
        if (icon.isNull())
            return fail(QStringLiteral("can't draw the icon of %s"), from);
        if (!copyFile(from, out + QLatin1Char('/') + name)
            || !raster::save(icon, out + QStringLiteral("/Icons/") + QFileInfo(name).completeBaseName() + QStringLiteral(".png")))
            return false;
    }
    return raster::save(noPresetIcon(), out + QStringLiteral("/Icons/no_preset.png"));
}

bool splash(const QString &source, const QString &out)
{
    QDir(out).removeRecursively();
    QFile file(source + QStringLiteral("/splash.svg"));
    if (!file.open(QIODevice::ReadOnly))
        return fail(QStringLiteral("can't read %s"), file.fileName());
    const QByteArray svg = file.readAll();
    return copyFolderTexts(source, out) && raster::save(raster::renderSvg(svg, QSize(640, 400)), out + QStringLiteral("/splash.png"))
           && raster::save(raster::renderSvg(svg, QSize(1280, 800)), out + QStringLiteral("/splash_4k.png"));
}

bool icons(const QString &source, const QString &out)
{
    auto read = [&](const QString &name) {
        QFile file(source + QLatin1Char('/') + name);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    };
    const QByteArray large = read(QStringLiteral("tourlet.svg"));
    QByteArray small = read(QStringLiteral("tourlet_small.svg"));
    if (large.isEmpty())
        return fail(QStringLiteral("no %s"), source + QStringLiteral("/tourlet.svg"));
    if (small.isEmpty())
        small = large;
    if (!raster::save(raster::renderSvg(large, QSize(256, 256)), out + QStringLiteral("/Qml/images/QZkGeo.png")))
        return false;
    for (int size : {16, 24, 32, 48, 64, 128, 256, 512}) {
        const QString path = QStringLiteral("%1/icons/hicolor/%2x%2/apps/tourlet.png").arg(out).arg(size);
        if (!raster::save(raster::renderSvg(size <= 32 ? small : large, QSize(size, size)), path))
            return false;
    }
    return true;
}

} // namespace tasks

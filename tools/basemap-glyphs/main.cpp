#include "SignedDistance.h"

#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QImage>
#include <QPainter>
#include <QPainterPath>
#include <QRawFont>
#include <QTextStream>

#include <cmath>

// Makes the glyph files that the offline world map draws its labels with: for each
// range of 256 code points, "<folder>/<fontstack>/<first>-<last>.pbf", the signed
// distance fields of the font's glyphs at 24 pixels with a border of 3, in the
// protocol-buffer form that map renderers read.
//
//   basemap-glyphs FONT_FILE FONTSTACK OUTPUT_FOLDER FIRST_RANGE LAST_RANGE

namespace {

constexpr int glyphSize = 24;
constexpr int border = 3;

// Protocol buffers, as much of them as the glyph files use.
class Message
{
public:
    void varint(int field, uint64_t value)
    {
        key(field, 0);
        raw(value);
    }
    void sint(int field, int64_t value) { varint(field, uint64_t((value << 1) ^ (value >> 63))); }
    void bytes(int field, const QByteArray &data)
    {
        key(field, 2);
        raw(uint64_t(data.size()));
        m_data.append(data);
    }
    const QByteArray &data() const { return m_data; }

private:
    void key(int field, int type) { raw(uint64_t(field) << 3 | uint64_t(type)); }
    void raw(uint64_t value)
    {
        do {
            char byte = char(value & 0x7F);
            value >>= 7;
            if (value)
                byte = char(byte | 0x80);
            m_data.append(byte);
        } while (value);
    }
    QByteArray m_data;
};

// One glyph, or nothing when the font has none for this code point.
bool encodeGlyph(const QRawFont &font, uint codePoint, Message &stack)
{
    const QVector<quint32> indexes = font.glyphIndexesForString(QString::fromUcs4(&codePoint, 1));
    if (indexes.size() != 1 || indexes[0] == 0)
        return false;
    const quint32 index = indexes[0];
    const QPainterPath outline = font.pathForGlyph(index);
    const QRectF box = outline.boundingRect();
    const int left = int(std::floor(box.left()));
    const int top = int(std::floor(box.top())); // y grows downwards from the baseline
    const int width = box.isEmpty() ? 0 : int(std::ceil(box.right())) - left;
    const int height = box.isEmpty() ? 0 : int(std::ceil(box.bottom())) - top;

    Message glyph;
    glyph.varint(1, codePoint);
    if (width > 0 && height > 0) {
        QImage coverage(width + 2 * border, height + 2 * border, QImage::Format_Alpha8);
        coverage.fill(Qt::transparent);
        QPainter painter(&coverage);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.translate(border - left, border - top);
        painter.fillPath(outline, Qt::black);
        painter.end();
        std::vector<uint8_t> alpha;
        alpha.reserve(size_t(coverage.width() * coverage.height()));
        for (int y = 0; y < coverage.height(); ++y) {
            const uchar *line = coverage.constScanLine(y);
            alpha.insert(alpha.end(), line, line + coverage.width());
        }
        const std::vector<uint8_t> field = signedDistanceField(alpha, coverage.width(), coverage.height());
        glyph.bytes(2, QByteArray(reinterpret_cast<const char *>(field.data()), int(field.size())));
    }
    glyph.varint(3, uint64_t(width));
    glyph.varint(4, uint64_t(height));
    glyph.sint(5, left);
    // The top of the glyph above the baseline, less the font's ascent.
    glyph.sint(6, -top - int(std::round(font.ascent())));
    const QVector<QPointF> advances = font.advancesForGlyphIndexes(QVector<quint32>{index});
    glyph.varint(7, uint64_t(std::max(0.0, std::round(advances.value(0).x()))));
    stack.bytes(3, glyph.data());
    return true;
}

}

int main(int argc, char *argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication app(argc, argv);
    QTextStream err(stderr);
    const QStringList args = QCoreApplication::arguments();
    if (args.size() != 6) {
        err << "usage: basemap-glyphs FONT_FILE FONTSTACK OUTPUT_FOLDER FIRST_RANGE LAST_RANGE\n";
        return 2;
    }
    const QRawFont font(args[1], glyphSize, QFont::PreferFullHinting);
    if (!font.isValid()) {
        err << "basemap-glyphs: no font in " << args[1] << "\n";
        return 1;
    }
    const QString fontstack = args[2];
    const QDir folder(QDir(args[3]).filePath(fontstack));
    if (!QDir().mkpath(folder.path())) {
        err << "basemap-glyphs: cannot make " << folder.path() << "\n";
        return 1;
    }
    for (int range = args[4].toInt(); range <= args[5].toInt(); ++range) {
        const uint first = uint(range) * 256;
        const QString name = QStringLiteral("%1-%2").arg(first).arg(first + 255);
        Message stack;
        stack.bytes(1, fontstack.toUtf8());
        stack.bytes(2, name.toUtf8());
        for (uint c = first; c <= first + 255; ++c)
            encodeGlyph(font, c, stack);
        Message glyphs;
        glyphs.bytes(1, stack.data());
        QFile file(folder.filePath(name + QStringLiteral(".pbf")));
        if (!file.open(QIODevice::WriteOnly) || file.write(glyphs.data()) != glyphs.data().size()) {
            err << "basemap-glyphs: cannot write " << file.fileName() << "\n";
            return 1;
        }
    }
    return 0;
}

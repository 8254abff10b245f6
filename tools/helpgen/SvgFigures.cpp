#include "SvgFigures.h"

#include "app/Trace.h"

#include <QAbstractTextDocumentLayout>
#include <QDir>
#include <QFileInfo>
#include <QPaintDevice>
#include <QPainter>
#include <QSvgRenderer>
#include <QTextBlock>
#include <QTextDocument>

namespace {

// SVG user units are CSS pixels.
constexpr qreal SvgUnitsPerInch = 96.0;

QStringList imageNames(const QTextDocument &document)
{
    QStringList names;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        for (auto it = block.begin(); !it.atEnd(); ++it) {
            const QTextCharFormat format = it.fragment().charFormat();
            if (format.isImageFormat() && !names.contains(format.toImageFormat().name()))
                names.append(format.toImageFormat().name());
        }
    }
    return names;
}

} // namespace

SvgFigures::SvgFigures(const QString &folder, qreal maxWidth, QObject *parent)
    : QObject(parent), m_folder(folder), m_maxWidth(maxWidth)
{
}

SvgFigures::~SvgFigures() = default;

bool SvgFigures::attach(QTextDocument &document, QString *error)
{
    for (const QString &name : imageNames(document)) {
        const QString path = QDir(m_folder).filePath(name);
        if (!QFileInfo(path).isFile()) {
            *error = QStringLiteral("figure '%1' not found in %2").arg(name, m_folder);
            return false;
        }
        auto renderer = std::make_shared<QSvgRenderer>(path);
        if (!renderer->isValid() || renderer->defaultSize().isEmpty()) {
            *error = QStringLiteral("figure '%1' is no valid SVG").arg(path);
            return false;
        }
        logTrace(0, QStringLiteral("SvgFigures::attach: %s, %d x %d"), name,
                 renderer->defaultSize().width(), renderer->defaultSize().height());
        m_figures.insert(name, renderer);
    }
    document.documentLayout()->registerHandler(QTextFormat::ImageObject, this);
    return true;
}

QSizeF SvgFigures::intrinsicSize(QTextDocument *document, int, const QTextFormat &format)
{
    const auto figure = m_figures.value(format.toImageFormat().name());
    if (!figure)
        return {};
    const QPaintDevice *device = document->documentLayout()->paintDevice();
    const qreal dpi = device ? device->logicalDpiX() : SvgUnitsPerInch;
    QSizeF size = QSizeF(figure->defaultSize()) * (dpi / SvgUnitsPerInch);
    if (size.width() > m_maxWidth)
        size *= m_maxWidth / size.width();
    return size;
}

void SvgFigures::drawObject(QPainter *painter, const QRectF &rect, QTextDocument *, int,
                            const QTextFormat &format)
{
    if (const auto figure = m_figures.value(format.toImageFormat().name()))
        figure->render(painter, rect);
}

#pragma once

#include <QHash>
#include <QObject>
#include <QSizeF>
#include <QTextObjectInterface>

#include <memory>

class QSvgRenderer;
class QTextDocument;

// Draws the SVG figures that the guide's images name, as vector graphics, in place of
// Qt's own image handler: the PDF keeps them sharp at any zoom and small on disk.
class SvgFigures : public QObject, public QTextObjectInterface
{
    Q_OBJECT
    Q_INTERFACES(QTextObjectInterface)

public:
    // folder holds the files the images name; maxWidth is the widest a figure may be,
    // in the layout units of the document's paint device.
    SvgFigures(const QString &folder, qreal maxWidth, QObject *parent = nullptr);
    ~SvgFigures() override;

    // Reads every figure the document names and takes over its image objects.
    // False, with the reason, when one is missing or no valid SVG.
    bool attach(QTextDocument &document, QString *error);

    QSizeF intrinsicSize(QTextDocument *document, int position, const QTextFormat &format) override;
    void drawObject(QPainter *painter, const QRectF &rect, QTextDocument *document, int position,
                    const QTextFormat &format) override;

private:
    QString m_folder;
    qreal m_maxWidth;
    QHash<QString, std::shared_ptr<QSvgRenderer>> m_figures;
};

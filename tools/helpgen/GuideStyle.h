#pragma once

#include <QFont>

class QTextBlock;
class QTextDocument;

// The typography of the guide, applied to a document that Markdown has filled: heading
// sizes and colours, paragraph spacing, tables with rules, centred figures and captions.
class GuideStyle
{
public:
    explicit GuideStyle(const QFont &bodyFont);

    void apply(QTextDocument &document) const;

    // A paragraph that holds nothing but an image.
    static bool isFigure(const QTextBlock &block);
    static bool isHeading(const QTextBlock &block);
    // A short paragraph ending in a colon, which introduces what follows it.
    static bool isLeadIn(const QTextBlock &block);

private:
    void styleHeading(const QTextBlock &block) const;
    void styleParagraph(const QTextBlock &block) const;
    void styleFigure(const QTextBlock &block) const;
    void styleCaption(const QTextBlock &block) const;
    void styleTables(QTextDocument &document) const;
    // Qt reads margins, borders and paddings as pixels at 96 dpi and scales them to the
    // paint device itself; the style is written in points.
    static qreal unit(qreal points) { return points * 96.0 / 72.0; }

    QFont m_body;
};

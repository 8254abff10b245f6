#include "GuideStyle.h"

#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextFrame>
#include <QTextTable>
#include <QVector>

namespace {

const QColor HeadingColour(0x1d, 0x4e, 0x6b);
const QColor CaptionColour(0x55, 0x5f, 0x66);
const QColor RuleColour(0xa8, 0xb4, 0xbc);
const QColor HeaderCellColour(0xe4, 0xec, 0xf1);

// Size factor against the body text, space above and below in points, per heading level.
struct HeadingLook
{
    qreal scale;
    qreal above;
    qreal below;
};

HeadingLook headingLook(int level)
{
    switch (level) {
    case 1: return {2.2, 0, 4};
    case 2: return {1.5, 16, 5};
    default: return {1.15, 10, 3};
    }
}

void mergeWholeBlock(const QTextBlock &block, const QTextCharFormat &format)
{
    QTextCursor cursor(block);
    cursor.movePosition(QTextCursor::EndOfBlock, QTextCursor::KeepAnchor);
    cursor.mergeCharFormat(format);
    cursor.mergeBlockCharFormat(format);
}

// The importer sizes headings by a relative adjustment, which wins over any point size.
// Fragments are collected first: changing a format may merge them under an iterator.
void dropSizeAdjustment(const QTextBlock &block)
{
    QVector<QTextFragment> fragments;
    for (auto it = block.begin(); !it.atEnd(); ++it)
        fragments.append(it.fragment());
    QTextCursor cursor(block);
    for (const QTextFragment &fragment : fragments) {
        QTextCharFormat format = fragment.charFormat();
        format.clearProperty(QTextFormat::FontSizeAdjustment);
        cursor.setPosition(fragment.position());
        cursor.setPosition(fragment.position() + fragment.length(), QTextCursor::KeepAnchor);
        cursor.setCharFormat(format);
    }
}

bool isWhollyItalic(const QTextBlock &block)
{
    bool any = false;
    for (auto it = block.begin(); !it.atEnd(); ++it) {
        const QTextFragment fragment = it.fragment();
        if (fragment.text().trimmed().isEmpty())
            continue;
        if (!fragment.charFormat().fontItalic())
            return false;
        any = true;
    }
    return any;
}

void collectTables(QTextFrame *frame, QList<QTextTable *> &tables)
{
    for (QTextFrame *child : frame->childFrames()) {
        if (auto *table = qobject_cast<QTextTable *>(child))
            tables.append(table);
        collectTables(child, tables);
    }
}

} // namespace

GuideStyle::GuideStyle(const QFont &bodyFont) : m_body(bodyFont) {}

bool GuideStyle::isFigure(const QTextBlock &block)
{
    const QString text = block.text().trimmed();
    return text.size() == 1 && text.at(0) == QChar::ObjectReplacementCharacter;
}

bool GuideStyle::isHeading(const QTextBlock &block)
{
    return block.blockFormat().headingLevel() > 0;
}

bool GuideStyle::isLeadIn(const QTextBlock &block)
{
    const QString text = block.text().trimmed();
    return !block.textList() && text.size() < 80 && (text.endsWith(QLatin1Char(':')) || text.endsWith(QChar(0xFF1A)));
}

void GuideStyle::apply(QTextDocument &document) const
{
    document.setDefaultFont(m_body);
    document.setDocumentMargin(0);
    bool afterFigure = false;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        if (isHeading(block))
            styleHeading(block);
        else if (isFigure(block))
            styleFigure(block);
        else if (afterFigure && isWhollyItalic(block))
            styleCaption(block);
        else
            styleParagraph(block);
        afterFigure = isFigure(block);
    }
    styleTables(document);
}

void GuideStyle::styleHeading(const QTextBlock &block) const
{
    const HeadingLook look = headingLook(block.blockFormat().headingLevel());
    dropSizeAdjustment(block);
    QTextCharFormat chars;
    chars.setFontPointSize(m_body.pointSizeF() * look.scale);
    chars.setFontWeight(QFont::Bold);
    chars.setForeground(HeadingColour);
    mergeWholeBlock(block, chars);

    QTextBlockFormat format = block.blockFormat();
    format.setTopMargin(unit(look.above));
    format.setBottomMargin(unit(look.below));
    QTextCursor(block).setBlockFormat(format);
}

void GuideStyle::styleParagraph(const QTextBlock &block) const
{
    QTextBlockFormat format = block.blockFormat();
    format.setLineHeight(118, QTextBlockFormat::ProportionalHeight);
    format.setBottomMargin(unit(block.textList() ? 2 : 5));
    QTextCursor(block).setBlockFormat(format);
}

void GuideStyle::styleFigure(const QTextBlock &block) const
{
    QTextBlockFormat format = block.blockFormat();
    format.setAlignment(Qt::AlignHCenter);
    format.setTopMargin(unit(6));
    format.setBottomMargin(unit(3));
    QTextCursor(block).setBlockFormat(format);
}

void GuideStyle::styleCaption(const QTextBlock &block) const
{
    QTextCharFormat chars;
    chars.setFontPointSize(m_body.pointSizeF() * 0.9);
    chars.setForeground(CaptionColour);
    mergeWholeBlock(block, chars);

    QTextBlockFormat format = block.blockFormat();
    format.setAlignment(Qt::AlignHCenter);
    format.setBottomMargin(unit(8));
    QTextCursor(block).setBlockFormat(format);
}

void GuideStyle::styleTables(QTextDocument &document) const
{
    QList<QTextTable *> tables;
    collectTables(document.rootFrame(), tables);
    for (QTextTable *table : tables) {
        QTextTableFormat format = table->format();
        format.setBorderCollapse(true);
        format.setBorder(0);
        format.setCellSpacing(0);
        format.setCellPadding(unit(3.5));
        format.setWidth(QTextLength(QTextLength::PercentageLength, 100));
        format.setTopMargin(unit(4));
        format.setBottomMargin(unit(8));
        format.setHeaderRowCount(1);
        table->setFormat(format);

        // Rules between the rows only, and a shaded, bold header row.
        for (int row = 0; row < table->rows(); ++row) {
            for (int column = 0; column < table->columns(); ++column) {
                QTextTableCell cell = table->cellAt(row, column);
                QTextTableCellFormat cellFormat = cell.format().toTableCellFormat();
                cellFormat.setBorder(0);
                cellFormat.setBottomBorder(unit(0.6));
                cellFormat.setBottomBorderStyle(QTextFrameFormat::BorderStyle_Solid);
                cellFormat.setBottomBorderBrush(RuleColour);
                if (row == 0)
                    cellFormat.setBackground(HeaderCellColour);
                cell.setFormat(cellFormat);

                QTextCursor text = cell.firstCursorPosition();
                text.setPosition(cell.lastCursorPosition().position(), QTextCursor::KeepAnchor);
                if (row == 0) {
                    QTextCharFormat bold;
                    bold.setFontWeight(QFont::Bold);
                    text.mergeCharFormat(bold);
                }
                QTextBlockFormat blockFormat;
                blockFormat.setBottomMargin(0);
                blockFormat.setLineHeight(110, QTextBlockFormat::ProportionalHeight);
                text.mergeBlockFormat(blockFormat);
            }
        }
    }
}

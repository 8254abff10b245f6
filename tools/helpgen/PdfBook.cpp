#include "PdfBook.h"

#include "GuideStyle.h"

#include "app/Trace.h"

#include <QAbstractTextDocumentLayout>
#include <QPainter>
#include <QPdfWriter>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QTextTable>

namespace {

constexpr qreal FooterHeightPt = 24.0;
constexpr qreal FooterFontPt = 8.0;
// A heading or lead-in keeps at least this many lines of what follows it on its page,
// or the whole of a table up to half a page; a figure keeps its caption whole.
constexpr int LinesKeptWithLeadIn = 3;

const QColor FooterColour(0x6b, 0x76, 0x7d);

} // namespace

PdfBook::PdfBook(QPdfWriter &writer, const QString &footerText)
    : m_writer(writer), m_footerText(footerText)
{
    const QRect paintRect = writer.pageLayout().paintRectPixels(writer.resolution());
    const qreal footerHeight = FooterHeightPt * unitsPerPoint();
    m_body = QRectF(0, 0, paintRect.width(), paintRect.height() - footerHeight);
    m_footer = QRectF(0, m_body.bottom(), paintRect.width(), footerHeight);
}

qreal PdfBook::unitsPerPoint() const
{
    return m_writer.logicalDpiY() / 72.0;
}

void PdfBook::paginate(QTextDocument &document) const
{
    document.documentLayout()->setPaintDevice(&m_writer);
    document.setPageSize(m_body.size());
    keepWithNext(document);
}

void PdfBook::keepWithNext(QTextDocument &document) const
{
    // The layout works lazily and leaves blocks unplaced when a format changes under it:
    // asking for the document size finishes it, before the loop and after each change.
    QAbstractTextDocumentLayout *layout = document.documentLayout();
    const qreal pageHeight = m_body.height();
    layout->documentSize();
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        const bool introduces = GuideStyle::isHeading(block) || GuideStyle::isLeadIn(block);
        if (!introduces && !GuideStyle::isFigure(block))
            continue;
        const QTextBlock next = block.next();
        if (!next.isValid() || block.blockFormat().pageBreakPolicy() & QTextFormat::PageBreak_AlwaysBefore)
            continue;
        const QRectF own = layout->blockBoundingRect(block);
        const QRectF following = layout->blockBoundingRect(next);
        qreal needed = following.height();
        const QTextLayout *lines = next.layout();
        QTextTable *table = QTextCursor(next).currentTable();
        if (introduces && table && layout->frameBoundingRect(table).height() < pageHeight / 2)
            needed = layout->frameBoundingRect(table).height();
        else if (introduces && lines && lines->lineCount() > LinesKeptWithLeadIn)
            needed = lines->lineAt(LinesKeptWithLeadIn - 1).rect().bottom();
        const int ownPage = int(own.top() / pageHeight);
        const int followingPage = int((following.top() + needed) / pageHeight);
        if (ownPage == followingPage)
            continue;
        logTrace(0, QStringLiteral("PdfBook::keepWithNext: '%s' moves to page %d"),
                 block.text().left(40), followingPage + 1);
        QTextBlockFormat format = block.blockFormat();
        format.setPageBreakPolicy(QTextFormat::PageBreak_AlwaysBefore);
        QTextCursor(block).setBlockFormat(format);
        layout->documentSize();
    }
}

int PdfBook::print(QTextDocument &document) const
{
    QPainter painter(&m_writer);
    if (!painter.isActive())
        return 0;
    const int pages = document.pageCount();
    const qreal pageHeight = m_body.height();
    QFont footerFont = document.defaultFont();
    footerFont.setPointSizeF(FooterFontPt);

    for (int page = 0; page < pages; ++page) {
        if (page > 0)
            m_writer.newPage();

        painter.save();
        painter.setClipRect(m_body);
        painter.translate(0, -page * pageHeight);
        QAbstractTextDocumentLayout::PaintContext context;
        context.clip = QRectF(0, page * pageHeight, m_body.width(), pageHeight);
        context.palette.setColor(QPalette::Text, Qt::black);
        document.documentLayout()->draw(&painter, context);
        painter.restore();

        painter.save();
        painter.setPen(QPen(FooterColour, 0.5 * unitsPerPoint()));
        const qreal ruleY = m_footer.top() + m_footer.height() * 0.35;
        painter.drawLine(QPointF(m_footer.left(), ruleY), QPointF(m_footer.right(), ruleY));
        painter.setFont(footerFont);
        const QRectF textRect(m_footer.left(), ruleY, m_footer.width(), m_footer.bottom() - ruleY);
        painter.drawText(textRect, Qt::AlignLeft | Qt::AlignVCenter, m_footerText);
        painter.drawText(textRect, Qt::AlignRight | Qt::AlignVCenter,
                         QStringLiteral("%1 / %2").arg(page + 1).arg(pages));
        painter.restore();
    }
    return painter.end() ? pages : 0;
}

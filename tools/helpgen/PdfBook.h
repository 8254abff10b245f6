#pragma once

#include <QRectF>
#include <QString>

class QPdfWriter;
class QTextDocument;

// Lays a document out on the pages of a PDF writer (A4 with margins) and prints it page
// by page, with a footer line: the given text on the left, "page / pages" on the right.
class PdfBook
{
public:
    PdfBook(QPdfWriter &writer, const QString &footerText);

    qreal bodyWidth() const { return m_body.width(); }

    // Makes the writer the document's paint device and pages it; headings and figures
    // move to the next page rather than stay alone at the foot of one.
    void paginate(QTextDocument &document) const;

    // Writes all pages; returns the page count.
    int print(QTextDocument &document) const;

private:
    qreal unitsPerPoint() const;
    void keepWithNext(QTextDocument &document) const;

    QPdfWriter &m_writer;
    QString m_footerText;
    QRectF m_body;   // text area in painter coordinates
    QRectF m_footer; // footer line below it
};

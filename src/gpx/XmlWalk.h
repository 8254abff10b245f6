#pragma once

#include <QString>
#include <QXmlStreamReader>

// Small helpers for the recursive-descent walks over QXmlStreamReader.
namespace xmlwalk {

inline bool isNamed(const QXmlStreamReader &xml, QLatin1String name) { return xml.name() == name; }

// Reads the text of the current element into buffer, reusing its storage, with the
// rules of QXmlStreamReader::readElementText: comments and processing instructions
// are ignored and a child element is an error that ends the document.
void readText(QXmlStreamReader &xml, QString &buffer);

// The text of the current element as a number; 0 when it isn't one.
double readNumber(QXmlStreamReader &xml, QString &buffer);

} // namespace xmlwalk

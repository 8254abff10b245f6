#pragma once

#include <QString>
#include <QStringList>
#include <QVariant>

// What the settings store's ini format makes of the unescaped text of a value: a
// leading '@' marks a typed value ("@ByteArray(...)", "@Variant(...)",
// "@Invalid()", ...) and "@@" a literal '@'; any other text stays text.
QVariant settingsValue(const QString &text);
// The same for a value that was written as a list.
QVariant settingsValue(const QStringList &items);

// The text the project container reads for a valid value: lists joined with ','.
// (An invalid value, as "@Invalid()" gives, reads as a missing key.)
QString settingsValueText(const QVariant &value);

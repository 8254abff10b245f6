#pragma once

#include <QString>

#include <cstdint>

// The title that new key points and media points start with: the translated
// "default key point" text, handed over by the interface. Empty at start.
QString defaultPointTitle();
void setDefaultPointTitle(const QString &title);

// Running number of the default titles of added key points, first value 1,
// stored in the project and reset by a new document.
uint32_t defaultKeyPointTitleCounter();
void setDefaultKeyPointTitleCounter(uint32_t value);
void resetDefaultKeyPointTitleCounter();

#pragma once

#include <QImage>
#include <QString>

// A small picture of the altitude board in the colours of one ".tmprs" theme;
// null if the file has no theme.
QImage presetIcon(const QString &presetFile);

// The icon of the list entry that stands for no theme.
QImage noPresetIcon();

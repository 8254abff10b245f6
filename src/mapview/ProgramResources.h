#pragma once

#include <QString>

// The resource files of the program folder: the interface ("resource.rcc", which the
// window can't do without) and the offline world map ("basemap.rcc", without which the
// map shows its ground colour and grid only). False when the interface is missing.
// With the world map, windows made afterwards render on the main thread, as the map
// needs. Installs, once, a message handler in front of the present one that passes
// the map renderer's notes on as debug messages.
bool registerProgramResources(const QString &programFolder);

// The style of the offline world map when it is registered, else empty.
QString offlineWorldMapStyle();

#pragma once

#include <QString>

// One generation step each: reads a source folder under content/ and makes the
// matching folder of the program folder anew. Each returns true on success and
// leaves a trace line naming the first problem otherwise.
namespace tasks {

bool avatars(const QString &source, const QString &out);
bool waypoints(const QString &source, const QString &out);
bool masks(const QString &source, const QString &out);
bool maps(const QString &source, const QString &out, const QString &geoPackage);
bool altitudePresets(const QString &source, const QString &out);
bool splash(const QString &source, const QString &out);
// The window icon as "Qml/images/QZkGeo.png" and the program icon in the
// freedesktop sizes under "icons/hicolor/".
bool icons(const QString &source, const QString &out);

} // namespace tasks

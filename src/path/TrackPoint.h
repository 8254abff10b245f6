#pragma once

#include "path/KeyPoint.h"

#include <QString>
#include <QVector>

// One position of a recorded track as read from a file: geography, elevation
// and the point's name. Far lighter than a key point, so that long tracks are
// converted without making a key point of every position.
struct TrackPoint
{
    double longitude = 0.0;
    double latitude = 0.0;
    double altitude = 0.0;    // 0 unless the file gave an elevation
    bool hasAltitude = false; // the file gave an elevation (which may itself be 0)
    QString name;             // also the point's title; empty for plain track points
};
Q_DECLARE_TYPEINFO(TrackPoint, Q_MOVABLE_TYPE);

using TrackPoints = QVector<TrackPoint>;

// The key point that a track point becomes: position and altitude also as base
// values, the name also as title.
KeyPoint keyPointFromTrack(const TrackPoint &p);

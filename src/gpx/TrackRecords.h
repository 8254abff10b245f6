#pragma once

#include <QRectF>
#include <QString>
#include <QVector>

#include <cstdint>

// One position of a track file as read: geography, elevation and the point's name.
struct TrackPoint
{
    double longitude = 0.0;
    double latitude = 0.0;
    double altitude = 0.0;    // 0 unless the file gave an elevation
    bool hasAltitude = false; // the file gave an elevation (which may itself be 0)
    QString name;             // also the point's title; empty for plain track points
};
Q_DECLARE_TYPEINFO(TrackPoint, Q_MOVABLE_TYPE);

// The extent of an item's points. A side of exactly 0 counts as unset and is taken
// by the next point, so an all-zero value means nothing has been seen.
struct TrackBounds
{
    double left = 0.0;   // smallest longitude
    double top = 0.0;    // smallest latitude
    double right = 0.0;  // largest longitude
    double bottom = 0.0; // largest latitude

    void include(double longitude, double latitude)
    {
        if (left == 0.0 || longitude < left)
            left = longitude;
        if (right == 0.0 || longitude > right)
            right = longitude;
        if (top == 0.0 || latitude < top)
            top = latitude;
        if (bottom == 0.0 || latitude > bottom)
            bottom = latitude;
    }
    bool isNull() const { return left == 0.0 && top == 0.0 && right == 0.0 && bottom == 0.0; }
    // x is longitude, y is latitude.
    QRectF toRect() const { return QRectF(QPointF(left, top), QPointF(right, bottom)); }
};

// One track, route or group of waypoints of a file, in file order.
struct TrackItem
{
    enum Type : int32_t { Track = 1, Route = 2, Waypoints = 3 };

    explicit TrackItem(int32_t itemType = Track) : type(itemType), fixedGpxPath(itemType == Track) {}

    int32_t type;
    // The item becomes a fixed GPX path rather than an ordinary one: all tracks do,
    // and a long list of waypoints once it is chosen.
    bool fixedGpxPath;
    TrackBounds bounds;
    QVector<TrackPoint> points;
};

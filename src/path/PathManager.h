#pragma once

#include "path/Path.h"

#include <memory>
#include <vector>

// Owns the paths of a document and names the active one. In normal work it holds
// a single path; its lists are handed out as copies with the path's scale applied.
class PathManager
{
public:
    PathManager();

    std::vector<Path> paths;
    int32_t activePath = -1;
    int32_t spare = 0;

    // Returns the first path's identifier.
    uint32_t addPath(const QString &name);
    uint32_t addPath(const Path &path, const QString &name);

    Path *active();
    const Path *active() const;
    Path &activeChecked();

    int getPathIndexByIdentifier(const QString &name) const;
    bool setActivePath(const QString &name);

    double scale(const QString &name = QString()) const;
    void setScale(double value, const QString &name = QString());

    std::vector<KeyPoint> keyPoints() const;
    std::vector<MediaPoint> mediaPoints() const;
    std::vector<CurvePoint> curvePoints() const;
    std::shared_ptr<const std::vector<CurvePoint>> curvePointsVector() const;
    // The samples of the whole route, positions 0.0 to 1.0 in order, as they stand in
    // the path: what the GPX export writes. Empty without a path or samples.
    std::vector<CurvePoint> routeSamples() const;
    bool lastKeyPoint(KeyPoint &out) const;

    MediaPoint *mediaPointById(uint32_t id);
    KeyPoint *keyPointById(uint32_t id);
    CurvePoint *curvePointById(uint32_t id);
    PathSegment *nextSegment(uint32_t &segmentId);
    PathSegment *segmentForKeyPoint(uint32_t keyPointId);
    PathSegment *segmentById(uint32_t segmentId);

    template <typename Point>
    Point addScale(Point point) const
    {
        const double s = scale();
        point.x *= s;
        point.y *= s;
        return point;
    }
    KeyPoint removeScale(const KeyPoint &point) const;

private:
    template <typename Point>
    std::vector<Point> scaled(const std::vector<Point> &points) const;
};

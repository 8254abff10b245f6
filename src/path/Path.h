#pragma once

#include "path/CurvePoint.h"
#include "path/KeyPoint.h"
#include "path/MediaPoint.h"
#include "path/PathSegment.h"
#include "path/TrackPoint.h"

#include <QString>

#include <cstdint>
#include <vector>

class ProjectController;
struct FixedKeyPoint;

namespace PathType {
constexpr int32_t Ordinary = 1;
constexpr int32_t GPX = 2;
}

namespace CurveMode {
constexpr int32_t Straight = 1;
constexpr int32_t Smooth = 2;
constexpr int32_t Arc = 3;
}

// One journey: key points, the curve generated between them (or read from a
// track), media points attached to curve samples and one segment per key point.
class Path
{
public:
    Path();

    std::vector<CurvePoint> curvePoints;
    std::vector<KeyPoint> keyPoints;
    std::vector<MediaPoint> mediaPoints;
    std::vector<PathSegment> pathSegments;
    QString name;
    uint32_t identifier;
    KeyPoint boundaryMin;
    KeyPoint boundaryMax;
    int32_t curveMode = CurveMode::Smooth;
    int32_t pathType = PathType::Ordinary;
    bool fixedCurve = true;
    double scale = 1.0;

    bool isFixedTrack() const { return pathType == PathType::GPX && fixedCurve; }

    void addCurvePoint(double x, double y, double z);
    void addKeyPoint(double x, double y, double z, const QString &pointName, bool update);
    void addKeyPoint(const KeyPoint &point, bool update);
    void addMediaPoint(const MediaPoint &point, uint32_t keyPointId, bool useIndex);
    void insertKeyPoint(uint32_t afterId, const KeyPoint &point, bool update);
    // `update` off leaves the curve as it is, for deleting many points at once.
    bool deleteKeyPoint(uint32_t id, bool update = true);
    bool deleteMediaPoint(uint32_t id);
    // Also frees the sample that carries it; false when no sample names it.
    bool deleteMediaPointAndSample(uint32_t id);
    bool changeKeyPointPosition(uint32_t id, double &x, double &y);
    bool changeMediaPointPosition(double x, double y, uint32_t id);
    void setPathMode(int32_t mode);
    void setPathType(int32_t type);
    void update(bool force = false);
    void setBoundaries(const KeyPoint &min, const KeyPoint &max);
    KeyPoint centerPosition() const;
    // The extent in degrees: the stored boundaries, or, where none are set (all
    // corners 0), that of the samples, or of the key points of a path without
    // samples. All 0 for an empty path.
    struct Extent
    {
        double west, south, east, north;
    };
    Extent extent() const;
    void setGeoMetry(double width, double height);

    int percentToCurveIndex(double percent) const;
    int curvePointCountBetween(double percent1, double percent2) const;
    // Nearest key point within `tolerance` metres, else (with alsoCurve) the nearest
    // curve point; `smallest` gets the smallest distance seen. Null when none.
    const BasePoint *hitTest(double x, double y, double tolerance, double &smallest, bool alsoCurve) const;
    BasePoint *findPoint(uint32_t id);
    const BasePoint *findPoint(uint32_t id) const;
    int keyPointIndex(uint32_t id) const;
    int mediaPointIndex(uint32_t id) const;
    int curvePointIndexNaming(uint32_t keyPointId) const;
    // The sample in [from, to) nearest to (x, y); the first of equally near ones. -1 when none.
    int nearestCurvePoint(double x, double y, size_t from, size_t to) const;
    PathSegment *segmentForKeyPoint(uint32_t keyPointId);
    PathSegment *segmentById(uint32_t segmentId);
    PathSegment *nextSegment(uint32_t &segmentId);
    void reduceToEnds();
    void initCorrespondingObjectIds();
    bool LoadCurvePoints(ProjectController &store, const QString &section);

    // Turns a path whose key points are the points of a track into a fixed track
    // path: the thinned track becomes the curve, and only the first and last key
    // point (and, for files of our own, the titled ones) stay.
    bool convertFromGPX(uint32_t aliasing, bool ownFile, int32_t fixedDuration);
    // The same from the points of a file, without making a key point of each.
    bool convertFromGPX(TrackPoints points, uint32_t aliasing, bool ownFile, int32_t fixedDuration);

private:
    struct MediaAnchor
    {
        bool found = false;
        uint32_t keyPointId = 0;
        uint32_t mediaPointId = 0;
        uint32_t sameSampleKeyPoint = 0;
        int offset = 0;
        uint32_t nextKeyPoint = 0;
        bool keepPosition = false;
        double x = 0.0;
        double y = 0.0;
    };

    template<typename Points>
    bool convertTrack(Points &points, uint32_t aliasing, bool ownFile, int32_t fixedDuration);
    void setFixedKeyPoints(std::vector<FixedKeyPoint> &fixed, bool ownFile);

    void updateCurvePoints();
    std::vector<MediaAnchor> collectMediaAnchors(bool keepPosition) const;
    void restoreMediaAnchors(const std::vector<MediaAnchor> &anchors);
    void regenerate(bool keepMediaPositions);
    // Puts a copy of a track sample, naming nothing, behind it.
    void insertSampleCopy(size_t index);
    void renewIdsFrom(size_t index);
    void rebuildSegmentSamples(int segmentIndex);
    MediaPoint *mediaPointById(uint32_t id);
};

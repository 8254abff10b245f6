#include "path/PathManager.h"

#include "app/Trace.h"

PathManager::PathManager()
{
    addPath(QStringLiteral("numberOne"));
}

uint32_t PathManager::addPath(const QString &name)
{
    Path path;
    path.curveMode = CurveMode::Smooth;
    path.pathType = PathType::Ordinary;
    path.fixedCurve = true;
    return addPath(path, name);
}

uint32_t PathManager::addPath(const Path &path, const QString &name)
{
    if (paths.empty()) {
        paths.push_back(path);
        paths.back().name = name;
    } else {
        // One path in normal work: the new content goes into the first path,
        // which keeps its name, identifier and scale.
        Path &first = paths.front();
        first.curvePoints = path.curvePoints;
        first.keyPoints = path.keyPoints;
        first.mediaPoints = path.mediaPoints;
        first.pathSegments = path.pathSegments;
        first.boundaryMin = path.boundaryMin;
        first.boundaryMax = path.boundaryMax;
        first.curveMode = path.curveMode;
        first.pathType = path.pathType;
        first.fixedCurve = path.fixedCurve;
    }
    if (activePath == -1)
        activePath = 0;
    return paths.front().identifier;
}

Path *PathManager::active()
{
    return activePath >= 0 && size_t(activePath) < paths.size() ? &paths[size_t(activePath)] : nullptr;
}

const Path *PathManager::active() const
{
    return activePath >= 0 && size_t(activePath) < paths.size() ? &paths[size_t(activePath)] : nullptr;
}

Path &PathManager::activeChecked()
{
    return paths.at(size_t(activePath));
}

int PathManager::getPathIndexByIdentifier(const QString &name) const
{
    logTrace(0, QStringLiteral("PathManager::getPathIndexByIdentifier <- %s"), name);
    for (size_t i = 0; i < paths.size(); ++i) {
        logTrace(0, QStringLiteral("\t%s == %s"), paths[i].name, name);
        if (paths[i].name == name)
            return int(i);
    }
    return int(paths.size());
}

bool PathManager::setActivePath(const QString &name)
{
    logTrace(0, QStringLiteral("PathManager::setActivePath <- %d"), activePath);
    const int index = getPathIndexByIdentifier(name);
    if (index >= int(paths.size()))
        return false;
    activePath = index;
    logTrace(0, QStringLiteral("PathManager::setActivePath -> %d"), activePath);
    return true;
}

double PathManager::scale(const QString &name) const
{
    const Path *path = active();
    if (!name.isEmpty() || !path)
        return 1.0;
    return path->scale;
}

void PathManager::setScale(double value, const QString &name)
{
    Path *path = active();
    if (name.isEmpty() && path)
        path->scale = value;
}

template <typename Point>
std::vector<Point> PathManager::scaled(const std::vector<Point> &points) const
{
    std::vector<Point> out;
    out.reserve(points.size());
    for (const Point &p : points)
        out.push_back(addScale(p));
    return out;
}

std::vector<KeyPoint> PathManager::keyPoints() const
{
    const Path *path = active();
    return path ? scaled(path->keyPoints) : std::vector<KeyPoint>();
}

std::vector<MediaPoint> PathManager::mediaPoints() const
{
    const Path *path = active();
    return path ? scaled(path->mediaPoints) : std::vector<MediaPoint>();
}

std::vector<CurvePoint> PathManager::curvePoints() const
{
    const Path *path = active();
    return path ? scaled(path->curvePoints) : std::vector<CurvePoint>();
}

std::shared_ptr<const std::vector<CurvePoint>> PathManager::curvePointsVector() const
{
    return std::make_shared<const std::vector<CurvePoint>>(curvePoints());
}

std::vector<CurvePoint> PathManager::routeSamples() const
{
    std::vector<CurvePoint> samples;
    const Path *path = active();
    const int count = path ? path->curvePointCountBetween(0.0, 1.0) : -1;
    if (count <= 0)
        return samples;
    samples.reserve(size_t(count));
    for (int i = 0; i < count; ++i)
        samples.push_back(path->curvePoints[size_t(i)]);
    return samples;
}

bool PathManager::lastKeyPoint(KeyPoint &out) const
{
    const Path *path = active();
    if (!path)
        return false;
    if (!path->keyPoints.empty())
        out = path->keyPoints.back();
    return true;
}

KeyPoint PathManager::removeScale(const KeyPoint &point) const
{
    const double s = scale();
    if (s == 0.0) {
        logTrace(3, QStringLiteral("PathManager::removeScale: scale = 0 - have to prevent divby0 for kp %d (%s)"), point.id,
                 point.title());
        return point;
    }
    KeyPoint copy = point;
    copy.x /= s;
    copy.y /= s;
    return copy;
}

MediaPoint *PathManager::mediaPointById(uint32_t id)
{
    Path *path = active();
    return path ? dynamic_cast<MediaPoint *>(path->findPoint(id)) : nullptr;
}

KeyPoint *PathManager::keyPointById(uint32_t id)
{
    Path *path = active();
    return path ? dynamic_cast<KeyPoint *>(path->findPoint(id)) : nullptr;
}

CurvePoint *PathManager::curvePointById(uint32_t id)
{
    Path *path = active();
    return path ? dynamic_cast<CurvePoint *>(path->findPoint(id)) : nullptr;
}

PathSegment *PathManager::nextSegment(uint32_t &segmentId)
{
    Path *path = active();
    return path ? path->nextSegment(segmentId) : nullptr;
}

PathSegment *PathManager::segmentForKeyPoint(uint32_t keyPointId)
{
    Path *path = active();
    return path ? path->segmentForKeyPoint(keyPointId) : nullptr;
}

PathSegment *PathManager::segmentById(uint32_t segmentId)
{
    Path *path = active();
    return path ? path->segmentById(segmentId) : nullptr;
}

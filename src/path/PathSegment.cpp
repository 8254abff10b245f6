#include "path/PathSegment.h"

#include "app/Trace.h"
#include "path/ContentPath.h"
#include "path/IdCounter.h"
#include "project/ProjectController.h"
#include "project/ValueParsers.h"


namespace {

uint32_t nextSegmentId()
{
    static IdCounter counter;
    return counter.draw();
}

PilotProperties &defaultPilotRecord()
{
    static PilotProperties record;
    return record;
}

QString key(const char *name)
{
    return QString::fromLatin1(name);
}

} // namespace

const PilotProperties &defaultPilot()
{
    return defaultPilotRecord();
}

void setDefaultPilot(const PilotProperties &pilot)
{
    defaultPilotRecord() = pilot;
}

void PilotProperties::Save(ProjectController &store, const QString &section) const
{
    store.writeProperty(section, key("pilot_isAnimated"), formatBool(hasFlag(isAnimated)));
    store.writeProperty(section, key("pilot_rotation"), formatBool(hasFlag(rotation)));
    store.writeProperty(section, key("pilot_symmetric"), formatBool(hasFlag(symmetric)));
    store.writeProperty(section, key("pilot_source"), source);
    store.writeProperty(section, key("pilot_thumb"), thumb);
    store.writeProperty(section, key("pilot_displayFormat"), displayFormat);
    store.writeProperty(section, key("pilot_width"), formatDouble(width));
}

void PilotProperties::Load(ProjectController &store, const QString &section)
{
    bool on = false;
    if (initBool(store.readProperty(section, key("pilot_isAnimated"), QString()), on))
        setFlag(isAnimated, on);
    if (initBool(store.readProperty(section, key("pilot_rotation"), QString()), on))
        setFlag(rotation, on);
    if (initBool(store.readProperty(section, key("pilot_symmetric"), QString()), on))
        setFlag(symmetric, on);
    // Avatars of the catalogue live in the installation the project was saved with.
    if (initString(store.readProperty(section, key("pilot_source"), QString()), source))
        source = rebaseContentPath(source);
    if (initString(store.readProperty(section, key("pilot_thumb"), QString()), thumb))
        thumb = rebaseContentPath(thumb);
    initString(store.readProperty(section, key("pilot_displayFormat"), QString()), displayFormat);
    initDouble(store.readProperty(section, key("pilot_width"), QString()), width);
}

PathSegment::PathSegment(uint32_t keyPointId_)
    : id(nextSegmentId()), keyPointId(keyPointId_), pilot(defaultPilot())
{
}

void PathSegment::setCurvePoints(std::vector<CurvePoint> &&points)
{
    bool same = points.size() == curvePoints.size();
    for (size_t i = 0; same && i < points.size(); ++i) {
        // NaN never equals itself, so it always counts as a change.
        same = points[i].x == curvePoints[i].x && points[i].y == curvePoints[i].y;
    }
    if (same)
        return;
    curvePoints = std::move(points);
    changed = true;
}

void PathSegment::resize(size_t n)
{
    if (n >= curvePoints.size())
        return;
    curvePoints.resize(n);
    // A track's leg cut short would otherwise keep the room of all the track behind it.
    curvePoints.shrink_to_fit();
}

void PathSegment::assign(const PathSegment &other, bool copyId)
{
    if (copyId)
        id = other.id;
    keyPointId = other.keyPointId;
    curvePoints = other.curvePoints;
    pilot = other.pilot;
    changed = false;
}

void PathSegment::setPilot(const PilotProperties &record, bool withWidth)
{
    pilot.source = record.source;
    pilot.thumb = record.thumb;
    pilot.displayFormat = record.displayFormat;
    pilot.flags = record.flags;
    if (withWidth)
        pilot.width = record.width;
}

void PathSegment::remapCorrespondingIds(const std::vector<KeyPoint> &keyPoints, const std::vector<MediaPoint> &mediaPoints)
{
    for (CurvePoint &p : curvePoints) {
        p.correspondingKeyPoint = p.correspondingKeyPoint < keyPoints.size() ? keyPoints[p.correspondingKeyPoint].id : 0;
        p.correspondingMediaPoint =
            p.correspondingMediaPoint < mediaPoints.size() ? mediaPoints[p.correspondingMediaPoint].id : 0;
    }
}

QString PathSegment::sampleStem(const QString &section)
{
    return section + QLatin1String("curvepoint");
}

QString PathSegment::sampleSection(const QString &section, int index)
{
    return sampleStem(section) + QString::number(index);
}

void PathSegment::saveHeader(ProjectController &store, const QString &section) const
{
    pilot.Save(store, section);
    store.writeProperty(section, key("curvepoints"), formatInt(int64_t(curvePoints.size())));
}

bool PathSegment::Load(ProjectController &store, const QString &section)
{
    pilot.Load(store, section);
    int32_t count = 0;
    initInt(store.readProperty(section, key("curvepoints"), QString()), count);
    curvePoints.clear();
    const std::vector<int32_t> present = store.numberedSections(sampleStem(section), count);
    if (present.size() != size_t(std::max(count, 0)))
        logTrace(3, QStringLiteral("PathSegment::Load[%s] -> %d of %d samples present"), section, int(present.size()), count);
    curvePoints.reserve(present.size());
    for (const int32_t i : present) {
        CurvePoint p;
        p.Load(store, sampleSection(section, i));
        curvePoints.push_back(std::move(p));
    }
    return true;
}

#pragma once

#include "path/CurvePoint.h"
#include "path/KeyPoint.h"
#include "path/MediaPoint.h"

#include <QString>

#include <cstdint>
#include <vector>

class ProjectController;

// The avatar that travels a segment.
struct PilotProperties
{
    enum Flag : uint32_t { isAnimated = 1, rotation = 2, symmetric = 4 };

    QString source;
    QString thumb;
    QString displayFormat;
    double width = 120.0;
    uint32_t flags = rotation;

    bool hasFlag(Flag flag) const { return (flags & flag) != 0; }
    void setFlag(Flag flag, bool on) { flags = on ? (flags | flag) : (flags & ~uint32_t(flag)); }

    // The seven keys of a pilot record, as segments and old single-avatar files store them.
    void Save(ProjectController &store, const QString &section) const;
    void Load(ProjectController &store, const QString &section);
};

// The record every new segment starts from.
const PilotProperties &defaultPilot();
void setDefaultPilot(const PilotProperties &pilot);

// The part of a route from one key point to the next, with its avatar.
class PathSegment
{
public:
    explicit PathSegment(uint32_t keyPointId = 0);
    virtual ~PathSegment() = default;
    PathSegment(const PathSegment &) = default;
    PathSegment &operator=(const PathSegment &) = default;
    PathSegment(PathSegment &&) = default;
    PathSegment &operator=(PathSegment &&) = default;

    uint32_t id = 0;
    uint32_t keyPointId = 0;
    std::vector<CurvePoint> curvePoints;
    bool changed = false;
    PilotProperties pilot;

    // Stores the samples unless they lie where the old ones lie; `changed` tells.
    void setCurvePoints(std::vector<CurvePoint> &&points);
    void resize(size_t n);
    void assign(const PathSegment &other, bool copyId);
    void setPilot(const PilotProperties &record, bool withWidth);
    void setPilotRotation(bool on) { pilot.setFlag(PilotProperties::rotation, on); }
    void setPilotWidth(double width) { pilot.width = width; }
    // Turns the file's indices in the samples back into ids.
    void remapCorrespondingIds(const std::vector<KeyPoint> &keyPoints, const std::vector<MediaPoint> &mediaPoints);

    // `keyPointIndexOf`/`mediaPointIndexOf` give a sample's references as indices for the file.
    template <typename KeyIndex, typename MediaIndex>
    bool Save(ProjectController &store, const QString &section, KeyIndex keyPointIndexOf, MediaIndex mediaPointIndexOf) const;
    bool Load(ProjectController &store, const QString &section);

private:
    void saveHeader(ProjectController &store, const QString &section) const;
    static QString sampleStem(const QString &section);
    static QString sampleSection(const QString &section, int index);
};

template <typename KeyIndex, typename MediaIndex>
bool PathSegment::Save(ProjectController &store, const QString &section, KeyIndex keyPointIndexOf,
                       MediaIndex mediaPointIndexOf) const
{
    saveHeader(store, section);
    for (size_t i = 0; i < curvePoints.size(); ++i) {
        CurvePoint copy = curvePoints[i];
        copy.correspondingKeyPoint = keyPointIndexOf(copy.correspondingKeyPoint);
        copy.correspondingMediaPoint = mediaPointIndexOf(copy.correspondingMediaPoint);
        copy.Save(store, sampleSection(section, int(i)));
    }
    return true;
}

#pragma once

#include <QString>

#include <cstdint>

class ProjectController;

// Common part of key points, curve points and media points: x = longitude,
// y = latitude, z = altitude, a free tag and the run-time identity.
//
// Every constructor that makes a new point draws the next id of one process-wide
// counter (first value 1). Copies keep the id; a moved-from point is left empty
// with id 0. The id is never stored: files refer to points by index.
class BasePoint
{
public:
    BasePoint();
    BasePoint(double x, double y, double z);
    BasePoint(const BasePoint &other) = default;
    BasePoint(BasePoint &&other) noexcept;
    BasePoint &operator=(const BasePoint &other) = default;
    BasePoint &operator=(BasePoint &&other) noexcept;
    virtual ~BasePoint();

    // Both return true; a missing key leaves the field as it is.
    virtual bool Save(ProjectController &store, QString section) const;
    virtual bool Load(ProjectController &store, QString section);

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
    int32_t tt = 0;
    uint32_t id = 0;

protected:
    void makeEmpty();
};

// The next id of the counter that all point kinds share; first value 1, never 0.
uint32_t drawPointId();

// Index written to the file for a reference that names nothing.
constexpr uint32_t noPointIndex = 0xFFFFFFFFu;

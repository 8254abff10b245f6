#include "path/BasePoint.h"

#include "path/IdCounter.h"
#include "path/PointRecord.h"

uint32_t drawPointId()
{
    static IdCounter counter;
    return counter.draw();
}

BasePoint::BasePoint() : id(drawPointId()) {}

BasePoint::BasePoint(double x_, double y_, double z_) : x(x_), y(y_), z(z_), id(drawPointId()) {}

BasePoint::BasePoint(BasePoint &&other) noexcept : BasePoint(static_cast<const BasePoint &>(other))
{
    other.makeEmpty();
}

BasePoint &BasePoint::operator=(BasePoint &&other) noexcept
{
    if (this != &other) {
        *this = static_cast<const BasePoint &>(other);
        other.makeEmpty();
    }
    return *this;
}

BasePoint::~BasePoint() = default;

void BasePoint::makeEmpty()
{
    x = y = z = 0.0;
    tt = 0;
    id = 0;
}

bool BasePoint::Save(ProjectController &store, QString section) const
{
    const PointRecordWriter out(store, section);
    out.writeCoordinate(QStringLiteral("x"), x);
    out.writeCoordinate(QStringLiteral("y"), y);
    out.writeCoordinate(QStringLiteral("z"), z);
    out.write(QStringLiteral("tt"), tt);
    return true;
}

bool BasePoint::Load(ProjectController &store, QString section)
{
    const PointRecordReader in(store, section);
    in.readCoordinate(QStringLiteral("x"), x);
    in.readCoordinate(QStringLiteral("y"), y);
    in.readCoordinate(QStringLiteral("z"), z);
    in.read(QStringLiteral("tt"), tt);
    return true;
}

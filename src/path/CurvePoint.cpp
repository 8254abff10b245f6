#include "path/CurvePoint.h"

#include "path/PointRecord.h"

CurvePoint::CurvePoint(CurvePoint &&other) noexcept : CurvePoint(static_cast<const CurvePoint &>(other))
{
    other.makeEmpty();
    other.correspondingKeyPoint = 0;
    other.correspondingMediaPoint = 0;
}

CurvePoint &CurvePoint::operator=(CurvePoint &&other) noexcept
{
    if (this != &other) {
        *this = static_cast<const CurvePoint &>(other);
        other.makeEmpty();
        other.correspondingKeyPoint = 0;
        other.correspondingMediaPoint = 0;
    }
    return *this;
}

CurvePoint::~CurvePoint() = default;

bool CurvePoint::Save(ProjectController &store, QString section) const
{
    BasePoint::Save(store, section);
    const PointRecordWriter out(store, section);
    out.write(QStringLiteral("correspondingKeyPoint"), correspondingKeyPoint);
    out.write(QStringLiteral("correspondingMediaPoint"), correspondingMediaPoint);
    return true;
}

bool CurvePoint::Load(ProjectController &store, QString section)
{
    BasePoint::Load(store, section);
    const PointRecordReader in(store, section);
    in.read(QStringLiteral("correspondingKeyPoint"), correspondingKeyPoint);
    in.read(QStringLiteral("correspondingMediaPoint"), correspondingMediaPoint);
    return true;
}

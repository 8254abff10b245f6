#pragma once

#include "path/BasePoint.h"

// A generated sample of the drawn route. In memory the two references are point
// ids (0 = none); in the file they are indices into the key point and media
// point lists, which the path turns back into ids after a load.
class CurvePoint : public BasePoint
{
public:
    CurvePoint() = default;
    CurvePoint(double x, double y, double z) : BasePoint(x, y, z) {}
    CurvePoint(const CurvePoint &other) = default;
    CurvePoint(CurvePoint &&other) noexcept;
    CurvePoint &operator=(const CurvePoint &other) = default;
    CurvePoint &operator=(CurvePoint &&other) noexcept;
    ~CurvePoint() override;

    bool Save(ProjectController &store, QString section) const override;
    bool Load(ProjectController &store, QString section) override;

    uint32_t correspondingKeyPoint = 0;
    uint32_t correspondingMediaPoint = 0;
};

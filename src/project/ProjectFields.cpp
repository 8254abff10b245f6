#include "project/ProjectFields.h"

namespace {
KeyPoint geoPoint(double latitude, double longitude)
{
    return KeyPoint(longitude, latitude, 0.0);
}
}

KeyPoint defaultCenterPosition()
{
    return geoPoint(51.0541733, 13.7164023);
}

ProjectFields::ProjectFields()
    : centerPosition(defaultCenterPosition())
    , visibleBoundariesTL(geoPoint(51.504864763, 12.572630832))
    , visibleBoundariesBR(geoPoint(50.64115576, 15.015715549))
    , pseudoBoundariesTL(geoPoint(0.0, 0.0))
    , pseudoBoundariesBR(geoPoint(0.0, 0.0))
    , pseudoMapCenter(centerPosition)
{
}

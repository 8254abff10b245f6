#include "animation/PlainAnimationSource.h"

PlainAnimationSource::PlainAnimationSource()
{
    // The project defaults of a new document.
    camera.zoom = 10.0;
    camera.centre.setLatitude(51.0541733, true);
    camera.centre.setLongitude(13.7164023, true);
    boundaries.left = 12.572630832;
    boundaries.top = 51.504864763;
    boundaries.right = 15.015715549;
    boundaries.bottom = 50.64115576;
}

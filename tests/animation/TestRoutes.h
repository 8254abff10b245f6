#pragma once

#include "animation/PlainAnimationSource.h"

#include <QStringList>

// A track-like path whose samples are laid by hand along the equator, so that
// every leg has exactly `samplesPerLeg` samples: key point i is named by sample
// i * samplesPerLeg, the last one by the very last sample.
inline void layRoute(PlainAnimationSource &source, const std::vector<double> &keyLongitudes, int samplesPerLeg)
{
    Path &path = source.paths.activeChecked();
    path.pathType = PathType::GPX;
    path.fixedCurve = true;
    for (double lon : keyLongitudes)
        path.addKeyPoint(KeyPoint(lon, 0.0, 0.0), false);
    for (size_t i = 0; i + 1 < keyLongitudes.size(); ++i) {
        for (int j = 0; j < samplesPerLeg; ++j) {
            const double x = keyLongitudes[i] + (keyLongitudes[i + 1] - keyLongitudes[i]) * j / samplesPerLeg;
            CurvePoint sample(x, 0.0, 0.0);
            if (j == 0)
                sample.correspondingKeyPoint = path.keyPoints[i].id;
            path.curvePoints.push_back(sample);
        }
    }
    if (!keyLongitudes.empty()) {
        CurvePoint last(keyLongitudes.back(), 0.0, 0.0);
        last.correspondingKeyPoint = path.keyPoints.back().id;
        path.curvePoints.push_back(last);
    }
}

// Puts a media point with these photographs on a sample.
inline void placeMedia(PlainAnimationSource &source, size_t sample, const QStringList &files, const QList<int> &orientations = {})
{
    Path &path = source.paths.activeChecked();
    MediaPoint media(path.curvePoints[sample].x, path.curvePoints[sample].y, 0.0);
    for (int i = 0; i < files.size(); ++i)
        media.properties.imageSources.push_back({files[i], orientations.value(i)});
    path.curvePoints[sample].correspondingMediaPoint = media.id;
    path.mediaPoints.push_back(media);
}

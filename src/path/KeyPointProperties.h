#pragma once

#include <QString>

#include <cstdint>

class PointRecordReader;
class PointRecordWriter;

// The font of a key point's title.
struct KeyPointFont
{
    KeyPointFont() { reset(); }
    void reset();

    // Keys "family", "color", "pointSize", "hasShadow", "hasFrame", "style".
    void save(const PointRecordWriter &out) const;
    void load(const PointRecordReader &in);

    QString family;
    QString color; // "#RRGGBB"
    double pointSize = 18.0;
    bool hasShadow = false;
    bool hasFrame = true;
    uint32_t style = 0;
};

// What the key point list of the interface edits.
struct KeyPointProperties
{
    KeyPointProperties() { reset(); }
    // Defaults; the title is the shared default title at the time of the call.
    void reset();

    QString title;
    bool enabled = true;
    bool isMediaTemplate = false;
    double mediaCenterOffsetX = 0.0;
    double mediaCenterOffsetY = 0.0;
    double mediaSizeW = 0.0;
    double mediaSizeH = 0.0;
    int32_t durationToNextKP = 3000; // ms
    double size = 1.0;
    int32_t durationPause = 500; // ms
    int32_t indexPosition = 0;
    QString imageSource;
    QString mediaSource;
    int32_t mediaRotation = 0; // degrees, from the picture, never stored
    KeyPointFont font;
};

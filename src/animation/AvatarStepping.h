#pragma once

#include "path/PathSegment.h"

#include <QHash>
#include <QString>

// How often an avatar's next animation image is due, from its picture. Each
// picture is opened once per instance.
class AvatarStepping
{
public:
    // Every event steps the avatar.
    static constexpr int32_t everyEvent = -1;

    // The delay of the picture's first image, used as a count of events, when the
    // avatar is marked animated and its picture holds more than one image;
    // otherwise everyEvent.
    int32_t interval(const PilotProperties &pilot);

    // Whether an event appended to a list of `listSize` events steps the avatar.
    static bool steps(size_t listSize, int32_t interval);

private:
    QHash<QString, int32_t> m_delays;
};

#pragma once

#include <QString>
#include <QVariantMap>

#include <cstdint>

// The keys and texts of an event as the interface and the export read it.
namespace EventKey {
extern const QString index;
extern const QString type;
extern const QString cKpId;
extern const QString pathPosition;
extern const QString stepAnimatedPilot;
extern const QString zoom;
extern const QString bearing;
extern const QString tilt;
extern const QString transition;
extern const QString file;
extern const QString fileUrl;
extern const QString opacity;
extern const QString orientation;
extern const QString mpePosition;
extern const QString width;
extern const QString height;
}

// One photograph as its events show it.
struct PhotoFrame
{
    QString file;
    QString fileUrl;
    int32_t orientation = 0;
    int32_t width = 0; // already swapped for pictures turned by 90 or 270 degrees
    int32_t height = 0;
};

// One frame of output. Kept compact: a film of an hour has more than 100,000 of
// them; the variant map that the interface reads is made per fetched event.
struct AnimationEvent
{
    enum class Type : uint8_t { Start, FlyIn, Pause, Step, MediaPoint, End };
    enum class Transition : uint8_t { FadeIn, CrossFade, FadeOut };
    enum class MpePosition : uint8_t { Default, FirstEvent, LastEvent };

    uint32_t index = 0;
    Type type = Type::Start;
    bool stepAnimatedPilot = false;
    Transition transition = Transition::FadeIn;
    MpePosition mpePosition = MpePosition::Default;
    uint32_t cKpId = 0;
    uint32_t pathPosition = 0;
    uint32_t photo = 0; // mediaPoint: index into the list's photo table
    double zoom = 0.0;
    double bearing = 0.0;
    double tilt = 0.0;
    double opacity = 0.0;

    static QString typeName(Type type);
    static QString transitionName(Transition transition);
    static QString mpePositionName(MpePosition position);

    // The keys each type carries; `photo` is the entry that `photo` names, used by mediaPoint events only.
    QVariantMap toVariantMap(const PhotoFrame &photo) const;
};

#include "animation/AnimationEventList.h"
#include "animation/EventListBuilder.h"
#include "animation/PlainAnimationSource.h"

#include <QFile>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>

#include <map>

namespace {

using Type = AnimationEvent::Type;

// A track-like path whose samples are laid by hand along the equator, so that
// every leg has exactly `samplesPerLeg` samples: key point i is named by sample
// i * samplesPerLeg, the last one by the very last sample.
void layRoute(PlainAnimationSource &source, const std::vector<double> &keyLongitudes, int samplesPerLeg)
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
uint32_t placeMedia(PlainAnimationSource &source, size_t sample, const QStringList &files, const QList<int> &orientations = {})
{
    Path &path = source.paths.activeChecked();
    MediaPoint media(path.curvePoints[sample].x, path.curvePoints[sample].y, 0.0);
    for (int i = 0; i < files.size(); ++i)
        media.properties.imageSources.push_back({files[i], i < orientations.size() ? orientations[i] : 0});
    path.curvePoints[sample].correspondingMediaPoint = media.id;
    path.mediaPoints.push_back(media);
    return media.id;
}

// Timeline computed, then the stretch pinned to 1 so that a 3000 ms leg is 90 frames.
void pinStretch(PlainAnimationSource &source, AnimationEventList &list)
{
    list.updateDuration();
    source.animationTiming.stretch = 1.0;
}

std::map<Type, int> countByType(const AnimationEventList &list)
{
    std::map<Type, int> counts;
    for (const AnimationEvent &e : list.events())
        ++counts[e.type];
    return counts;
}

QStringList keysOf(const AnimationEventList &list, int index)
{
    QVariantMap map;
    if (!list.event(uint32_t(index), map))
        return {};
    QStringList keys = map.keys();
    keys.sort();
    return keys;
}

QStringList sorted(QStringList keys)
{
    keys.sort();
    return keys;
}

// A 1x1 GIF of two images, each shown for `hundredths` of a second.
QByteArray animatedGif(int hundredths)
{
    const unsigned char header[] = {1, 0, 1, 0, 0x80, 0, 0, 0, 0, 0, 0xFF, 0xFF, 0xFF};
    const unsigned char image[] = {0x21, 0xF9, 0x04, 0x00, uchar(hundredths), uchar(hundredths >> 8), 0x00, 0x00,
                                   0x2C, 0,    0,    0,    0,    1,    0,    1,    0,    0,
                                   0x02, 0x02, 0x44, 0x01, 0x00};
    QByteArray gif("GIF89a");
    gif.append(reinterpret_cast<const char *>(header), sizeof header);
    gif.append(reinterpret_cast<const char *>(image), sizeof image);
    gif.append(reinterpret_cast<const char *>(image), sizeof image);
    gif.append(char(0x3B));
    return gif;
}

} // namespace

class TestEvents : public QObject
{
    Q_OBJECT

private slots:
    void oneKeyPoint()
    {
        PlainAnimationSource source;
        layRoute(source, {5.0}, 10);
        AnimationEventList list(source);
        QVERIFY(list.build(false, false, 10.0));
        // start, the last key point's pauses (at least the pop-up animation), end
        QCOMPARE(list.count(), 1 + 30 + 1);
        QCOMPARE(list.events().front().type, Type::Start);
        QCOMPARE(list.events().back().type, Type::End);
        const auto counts = countByType(list);
        QCOMPARE(counts.at(Type::Pause), 30);
        QCOMPARE(counts.count(Type::Step), size_t(0));
        QCOMPARE(source.eventCount, 32);
        for (const AnimationEvent &e : list.events())
            QCOMPARE(e.cKpId, 0u);

        // A longer pause of the last point wins over the pop-up frames.
        source.paths.activeChecked().keyPoints[0].properties.durationPause = 2000;
        QVERIFY(list.build(false, false, 10.0));
        QCOMPARE(countByType(list).at(Type::Pause), 60);

        // No key points: just the start, and nothing told to the timeline.
        PlainAnimationSource empty;
        AnimationEventList none(empty);
        QVERIFY(none.build(false, false, 10.0));
        QCOMPARE(none.count(), 1);
        QCOMPARE(empty.eventCount, 0);
    }

    void legsPausesAndKeys()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0, 2.0}, 180);
        Path &path = source.paths.activeChecked();
        const uint32_t first = path.keyPoints[0].id;
        const uint32_t second = path.keyPoints[1].id;
        const uint32_t last = path.keyPoints[2].id;
        path.keyPoints[1].properties.enabled = false; // no pause, but its leg counts
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(list.build(false, false, 10.0));

        // 180 samples in 90 frames: a step of exactly 2 samples, then the one at the next key point.
        const auto counts = countByType(list);
        QCOMPARE(counts.at(Type::Step), 2 * 91);
        QCOMPARE(counts.at(Type::Pause), 15 + 30);
        QCOMPARE(list.count(), 1 + 15 + 91 + 91 + 30 + 1);
        QCOMPARE(source.eventCount, list.count());

        uint32_t lastPosition = 0;
        QSet<uint32_t> seenKeys;
        for (int i = 0; i < list.count(); ++i) {
            const AnimationEvent &e = list.events()[size_t(i)];
            QCOMPARE(e.index, uint32_t(i));
            QVERIFY(e.pathPosition >= lastPosition);
            lastPosition = e.pathPosition;
            seenKeys.insert(e.cKpId);
        }
        QVERIFY(seenKeys.contains(first));
        QVERIFY(seenKeys.contains(second));
        QVERIFY(!seenKeys.contains(last)); // the last key point never shows as the current one
        const AnimationEvent &firstStep = list.events()[16];
        QCOMPARE(firstStep.type, Type::Step);
        QCOMPARE(firstStep.cKpId, first);
        QCOMPARE(firstStep.pathPosition, 0u);
        QCOMPARE(list.events()[17].pathPosition, 2u);
        QCOMPARE(list.events()[16 + 90].pathPosition, 180u); // the step at the next key point
        QCOMPARE(list.events()[16 + 91].cKpId, second);
        QCOMPARE(list.events().back().pathPosition, 360u);
        QCOMPARE(list.pilotSteps(), 15 + 2 * 91 + 30); // every event steps a still avatar

        // The keys each type carries, spelt as the interface reads them.
        const QStringList placed = sorted({"index", "type", "cKpId", "pathPosition", "stepAnimatedPilot"});
        QCOMPARE(keysOf(list, 0), placed);
        QCOMPARE(keysOf(list, 1), placed);
        QCOMPARE(keysOf(list, 16), placed);
        QCOMPARE(keysOf(list, list.count() - 1), placed);
        QVariantMap map;
        QVERIFY(list.event(16, map));
        QCOMPARE(map.value("type").toString(), QStringLiteral("step"));
        QCOMPARE(map.value("cKpId").toUInt(), first);
        QCOMPARE(map.value("stepAnimatedPilot").toBool(), true);
        QVERIFY(list.event(0, map));
        QCOMPARE(map.value("type").toString(), QStringLiteral("start"));
        QCOMPARE(map.value("stepAnimatedPilot").toBool(), false);
        QVERIFY(list.event(uint32_t(list.count() - 1), map));
        QCOMPARE(map.value("type").toString(), QStringLiteral("end"));
    }

    void zeroFrameLegAndStretch()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 75);
        Path &path = source.paths.activeChecked();
        path.keyPoints[0].properties.durationToNextKP = 0;
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(list.build(false, false, 10.0));
        // An endless step: one "step" where the leg starts and the one at its end.
        QCOMPARE(countByType(list).at(Type::Step), 2);
        QCOMPARE(list.events()[16].pathPosition, 0u);
        QCOMPARE(list.events()[17].pathPosition, 75u);

        // A leg longer than its samples repeats positions.
        path.keyPoints[0].properties.durationToNextKP = 10000; // 300 frames over 75 samples
        QVERIFY(list.build(false, false, 10.0));
        QCOMPARE(countByType(list).at(Type::Step), 301);
        QCOMPARE(list.events()[16 + 3].pathPosition, 0u);
        QCOMPARE(list.events()[16 + 4].pathPosition, 1u);

        // The stretch of the timing lengthens legs but never pauses.
        source.animationTiming.stretch = 0.5;
        QVERIFY(list.build(false, false, 10.0));
        QCOMPARE(countByType(list).at(Type::Step), 151);
        QCOMPARE(countByType(list).at(Type::Pause), 15 + 30);

        // Damaged durations end in an empty list, not in exhausted memory.
        path.keyPoints[0].properties.durationPause = 2000000000;
        QVERIFY(!list.build(false, false, 10.0));
        QCOMPARE(list.count(), 0);
        path.keyPoints[0].properties.durationPause = -500;
        QVERIFY(list.build(false, false, 10.0));
        QCOMPARE(countByType(list).at(Type::Pause), 30);
    }

    void missingNextKeyPoint()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0, 2.0}, 20);
        Path &path = source.paths.activeChecked();
        AnimationEventList list(source);
        QVERIFY(list.build(false, false, 10.0));
        const int goodCount = source.eventCount;
        QVERIFY(goodCount > 0);

        // The third key point is named by no sample.
        path.curvePoints.back().correspondingKeyPoint = 0;
        QTest::ignoreMessage(QtDebugMsg, "can't find next keypoint");
        QVERIFY(!list.build(false, true, 10.0));
        QCOMPARE(list.count(), 0);
        QCOMPARE(list.pilotSteps(), 0);
        QVariantMap map;
        QVERIFY(!list.event(0, map));
        QCOMPARE(source.eventCount, goodCount); // the timeline keeps what it had

        // The next key point lies behind the current position.
        path.curvePoints[5].correspondingKeyPoint = path.keyPoints[2].id;
        QTest::ignoreMessage(QtDebugMsg, "can't find next keypoint");
        QVERIFY(!list.build(false, false, 10.0));
        QCOMPARE(list.count(), 0);
    }

    void linearShares()
    {
        // The jump from 0.9 to 5 leads into a key point's sample and is not
        // counted, so both legs are 0.9 degrees long.
        PlainAnimationSource source;
        Path &path = source.paths.activeChecked();
        path.pathType = PathType::GPX;
        for (double lon : {0.0, 5.0, 6.0})
            path.addKeyPoint(KeyPoint(lon, 0.0, 0.0), false);
        for (int leg = 0; leg < 2; ++leg) {
            const double start = leg == 0 ? 0.0 : 5.0;
            for (int j = 0; j < 10; ++j) {
                CurvePoint sample(start + 0.1 * j, 0.0, 0.0);
                if (j == 0)
                    sample.correspondingKeyPoint = path.keyPoints[size_t(leg)].id;
                path.curvePoints.push_back(sample);
            }
        }
        CurvePoint end(6.0, 0.0, 0.0);
        end.correspondingKeyPoint = path.keyPoints[2].id;
        path.curvePoints.push_back(end);
        path.keyPoints[0].properties.durationToNextKP = 1000;
        path.keyPoints[1].properties.durationToNextKP = 9000;

        AnimationEventList list(source);
        QVERIFY(list.build(true, false, 10.0)); // computes the timeline itself
        QCOMPARE(list.totalFrames(), 300);
        QCOMPARE(list.durationPercents().size(), size_t(2));
        QCOMPARE(list.durationPercents()[0], 0.5);
        QCOMPARE(list.durationPercents()[1], 0.5);
        // Each leg gets its share of the timeline whatever its own duration.
        const int steps = countByType(list).at(Type::Step);
        QVERIFY2(steps >= 2 * 151 && steps <= 2 * 152, qPrintable(QString::number(steps)));

        // Unequal legs: the shares still make the whole.
        PlainAnimationSource unequal;
        layRoute(unequal, {0.0, 1.0, 4.0, 4.5}, 40);
        AnimationEventList unequalList(unequal);
        QVERIFY(unequalList.build(true, false, 10.0));
        const std::vector<double> &shares = unequalList.durationPercents();
        QCOMPARE(shares.size(), size_t(3));
        QCOMPARE(shares[0] + shares[1] + shares[2], 1.0);
        QVERIFY(qAbs(shares[0] - 1.0 / 4.5) < 1e-9);
        QVERIFY(qAbs(shares[1] - 3.0 / 4.5) < 1e-9);

        // Two key points: the only leg takes the whole timeline.
        PlainAnimationSource two;
        layRoute(two, {10.0, 10.5}, 30);
        AnimationEventList twoList(two);
        QVERIFY(twoList.build(true, false, 10.0));
        QCOMPARE(twoList.durationPercents(), std::vector<double>{1.0});
        QCOMPARE(countByType(twoList).at(Type::Step), twoList.totalFrames() + 1);

        // Outside linear mode no shares are made.
        QVERIFY(twoList.build(false, false, 10.0));
        QVERIFY(twoList.durationPercents().empty());
    }

    void photographs()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 90);
        const QString a = QStringLiteral("/photos/a.jpg");
        const QString b = QStringLiteral("file:///photos/b%20c.jpg");
        const uint32_t media = placeMedia(source, 45, {a, b}, {270, 180});
        source.photoPool.insert(a, QSize(400, 300));
        source.photoPool.insert(b, QSize(640, 480));
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(media != 0);
        QVERIFY(list.build(false, false, 10.0));

        // 15 fade frames and 120 held frames per photo, then 15 to fade out.
        const auto counts = countByType(list);
        QCOMPARE(counts.at(Type::MediaPoint), 45);
        QCOMPARE(counts.at(Type::Pause), 15 + 240 + 30);
        int first = -1;
        for (int i = 0; i < list.count() && first < 0; ++i)
            first = list.events()[size_t(i)].type == Type::MediaPoint ? i : -1;
        // Shown once the leg's position has passed the sample, at the last step's position.
        const AnimationEvent &before = list.events()[size_t(first - 1)];
        QCOMPARE(before.type, Type::Step);
        QCOMPARE(before.pathPosition, 45u);
        QCOMPARE(list.events()[size_t(first - 2)].pathPosition, 44u);

        const std::vector<AnimationEvent> &events = list.events();
        for (int k = 0; k < 15; ++k) {
            const AnimationEvent &in = events[size_t(first + k)];
            QCOMPARE(in.transition, AnimationEvent::Transition::FadeIn);
            QCOMPARE(in.opacity, (k + 1) * (1.0 / 15));
            QCOMPARE(in.pathPosition, 45u);
            QVERIFY(!in.stepAnimatedPilot);
            const AnimationEvent &cross = events[size_t(first + 135 + k)];
            QCOMPARE(cross.transition, AnimationEvent::Transition::CrossFade);
            QCOMPARE(cross.opacity, (k + 1) * (1.0 / 15));
            const AnimationEvent &out = events[size_t(first + 270 + k)];
            QCOMPARE(out.transition, AnimationEvent::Transition::FadeOut);
            QCOMPARE(out.opacity, (14 - k) * (1.0 / 15));
        }
        QCOMPARE(events[size_t(first)].opacity, 1.0 / 15);
        QCOMPARE(events[size_t(first + 14)].opacity, 1.0);
        QCOMPARE(events[size_t(first + 284)].opacity, 0.0);
        QCOMPARE(events[size_t(first + 15)].type, Type::Pause);
        QCOMPARE(events[size_t(first + 15)].cKpId, 0u);
        QCOMPARE(events[size_t(first + 285)].type, Type::Step);

        QVariantMap map;
        QVERIFY(list.event(uint32_t(first), map));
        QCOMPARE(map.keys().size(), 12);
        QCOMPARE(map.value("type").toString(), QStringLiteral("mediaPoint"));
        QCOMPARE(map.value("transition").toString(), QStringLiteral("fadein"));
        QCOMPARE(map.value("mpePosition").toString(), QStringLiteral("firstEvent"));
        QCOMPARE(map.value("file").toString(), a);
        QCOMPARE(map.value("fileUrl").toString(), QStringLiteral("image://fullFrameImageProvider//photos/a.jpg"));
        QCOMPARE(map.value("orientation").toInt(), 270);
        QCOMPARE(map.value("width").toInt(), 300); // turned by 270 degrees: swapped
        QCOMPARE(map.value("height").toInt(), 400);
        QVERIFY(!map.contains("cKpId"));
        QVERIFY(list.event(uint32_t(first + 1), map));
        QCOMPARE(map.value("mpePosition").toString(), QStringLiteral("default"));
        QVERIFY(list.event(uint32_t(first + 140), map));
        QCOMPARE(map.value("transition").toString(), QStringLiteral("crossfade"));
        QCOMPARE(map.value("file").toString(), b);
        QCOMPARE(map.value("fileUrl").toString(), QStringLiteral("image://fullFrameImageProvider//photos/b c.jpg"));
        QCOMPARE(map.value("width").toInt(), 640); // 180 degrees: not swapped
        QCOMPARE(map.value("height").toInt(), 480);
        QVERIFY(list.event(uint32_t(first + 284), map));
        QCOMPARE(map.value("transition").toString(), QStringLiteral("fadeout"));
        QCOMPARE(map.value("file").toString(), b);
        QCOMPARE(map.value("mpePosition").toString(), QStringLiteral("lastEvent"));
        QCOMPARE(map.value("opacity").toDouble(), 0.0);

        // Each photo frame counts as an avatar step.
        QCOMPARE(list.pilotSteps(), list.count() - 2);
    }

    void photographsAtTheEndsAndOddValues()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 30);
        placeMedia(source, 30, {QStringLiteral("/p/last.jpg")}); // on the last key point's sample
        source.paths.activeChecked().curvePoints[10].correspondingMediaPoint = 987654321; // gone: skipped
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(list.build(false, false, 10.0));
        const std::vector<AnimationEvent> &events = list.events();
        QCOMPARE(countByType(list).at(Type::MediaPoint), 30);
        // After the last key point's pauses, right before "end".
        QCOMPARE(events[events.size() - 2].type, Type::MediaPoint);
        QCOMPARE(events[events.size() - 2].mpePosition, AnimationEvent::MpePosition::LastEvent);
        QCOMPARE(events[events.size() - 1 - 150 - 30].type, Type::Pause);
        QVariantMap map;
        QVERIFY(list.event(uint32_t(events.size() - 2), map));
        QCOMPARE(map.value("width").toInt(), 0); // not in the photo pool

        // Without fades only the held frames stand.
        source.fullFrame.fadeDuration = 0;
        source.fullFrame.duration = 1000;
        QVERIFY(list.build(false, false, 10.0));
        QCOMPARE(countByType(list).count(Type::MediaPoint), size_t(0));
        QCOMPARE(countByType(list).at(Type::Pause), 15 + 30 + 30);
    }

    void photographsWithinOneStepAndOnRepeatedPositions()
    {
        // 300 samples in 30 frames: each step jumps 10 samples, so the media points on
        // samples 41 and 47 are both passed by the same step and must both show, in
        // route order, each once.
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 300);
        source.paths.activeChecked().keyPoints[0].properties.durationToNextKP = 1000;
        placeMedia(source, 47, {QStringLiteral("/p/second.jpg")});
        placeMedia(source, 41, {QStringLiteral("/p/first.jpg")});
        placeMedia(source, 60, {}); // a media point without photographs shows nothing
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(list.build(false, false, 10.0));
        QStringList shown;
        uint32_t position = 0;
        for (const AnimationEvent &e : list.events()) {
            if (e.type == Type::MediaPoint && e.mpePosition == AnimationEvent::MpePosition::FirstEvent) {
                shown << list.photo(e).file;
                position = e.pathPosition;
            }
        }
        QCOMPARE(shown, (QStringList{"/p/first.jpg", "/p/second.jpg"}));
        QCOMPARE(position, 40u); // where the avatar stood when the step passed them
        QCOMPARE(countByType(list).at(Type::MediaPoint), 2 * 30);
        QCOMPARE(countByType(list).at(Type::Step), 31);

        // 30 samples in 300 frames: the avatar stands on each sample ten times, and
        // the photograph on sample 12 still shows once.
        PlainAnimationSource slow;
        layRoute(slow, {0.0, 1.0}, 30);
        slow.paths.activeChecked().keyPoints[0].properties.durationToNextKP = 10000;
        placeMedia(slow, 12, {QStringLiteral("/p/once.jpg")});
        AnimationEventList slowList(slow);
        pinStretch(slow, slowList);
        QVERIFY(slowList.build(false, false, 10.0));
        const auto counts = countByType(slowList);
        QCOMPARE(counts.at(Type::MediaPoint), 30);
        QCOMPARE(counts.at(Type::Step), 301);
        // Shown where the step that passed sample 12 started.
        const std::vector<AnimationEvent> &events = slowList.events();
        size_t first = 0;
        while (events[first].type != Type::MediaPoint)
            ++first;
        const uint32_t at = events[first - 1].pathPosition;
        QVERIFY2(at == 11 || at == 12, qPrintable(QString::number(at)));
        for (const AnimationEvent &e : events) {
            if (e.type == Type::MediaPoint)
                QCOMPARE(e.pathPosition, at);
        }
    }

    void scaledRoute()
    {
        // A scaled path is read through its scaled copy; on the equator halving the
        // longitudes keeps every leg's share, and the walk finds the same samples.
        PlainAnimationSource plain;
        layRoute(plain, {0.0, 1.0, 4.0, 4.5}, 40);
        AnimationEventList plainList(plain);
        QVERIFY(plainList.build(true, false, 10.0));

        PlainAnimationSource scaled;
        layRoute(scaled, {0.0, 1.0, 4.0, 4.5}, 40);
        scaled.paths.setScale(0.5);
        QCOMPARE(scaled.paths.scale(), 0.5);
        AnimationEventList scaledList(scaled);
        QVERIFY(scaledList.build(true, false, 10.0));
        QCOMPARE(scaledList.durationPercents().size(), size_t(3));
        for (size_t i = 0; i < 3; ++i)
            QVERIFY(qAbs(scaledList.durationPercents()[i] - plainList.durationPercents()[i]) < 1e-9);
        QCOMPARE(scaledList.count(), plainList.count());
        QCOMPARE(scaledList.events().back().pathPosition, 120u);
    }

    void animatedAvatarStepping()
    {
        QTemporaryDir dir;
        const QString gif = dir.filePath(QStringLiteral("walker.gif"));
        QFile file(gif);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(animatedGif(10)); // 100 ms, taken as every 100th event
        file.close();

        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 600);
        Path &path = source.paths.activeChecked();
        path.keyPoints[0].properties.durationToNextKP = 10000;
        PilotProperties walker;
        walker.source = gif;
        walker.setFlag(PilotProperties::isAnimated, true);
        path.pathSegments[0].setPilot(walker, true);
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(list.build(false, false, 10.0));

        int steps = 0;
        for (const AnimationEvent &e : list.events()) {
            if (e.type != Type::Pause && e.type != Type::Step)
                continue;
            if (e.cKpId == path.keyPoints[0].id)
                QCOMPARE(e.stepAnimatedPilot, e.index % 100 == 0);
            else
                QVERIFY(e.stepAnimatedPilot); // the last key point's avatar is still
            steps += e.stepAnimatedPilot ? 1 : 0;
        }
        QCOMPARE(list.pilotSteps(), steps);
        QVERIFY(steps > 30 && steps < 40);

        // The interval straight from the picture; an interval of 0 never steps.
        AvatarStepping stepping;
        QCOMPARE(stepping.interval(walker), 100);
        PilotProperties still = walker;
        still.setFlag(PilotProperties::isAnimated, false);
        QCOMPARE(stepping.interval(still), AvatarStepping::everyEvent);
        QVERIFY(!AvatarStepping::steps(0, 0));
        QVERIFY(!AvatarStepping::steps(300, 0));
        QVERIFY(AvatarStepping::steps(7, AvatarStepping::everyEvent));
        QVERIFY(AvatarStepping::steps(200, 100));
        QVERIFY(!AvatarStepping::steps(201, 100));

        // A picture that can't be read steps every event.
        walker.source = dir.filePath(QStringLiteral("missing.gif"));
        path.pathSegments[0].setPilot(walker, true);
        QVERIFY(list.build(false, false, 10.0));
        QCOMPARE(list.pilotSteps(), list.count() - 2);
    }

    void eventLookup()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 90);
        placeMedia(source, 60, {QStringLiteral("/p/x.jpg")});
        AnimationEventList list(source);
        pinStretch(source, list);
        QVERIFY(list.build(false, false, 10.0));
        int firstMedia = 0;
        while (list.events()[size_t(firstMedia)].type != Type::MediaPoint)
            ++firstMedia;

        QVariantMap out;
        // A late tick never skips the start or a photograph's first frame.
        QVERIFY(list.eventInRange(0, 20, out));
        QCOMPARE(out.value("index").toInt(), 0);
        QVERIFY(list.eventInRange(5, uint32_t(firstMedia + 40), out));
        QCOMPARE(out.value("index").toInt(), firstMedia);
        QVERIFY(list.eventInRange(uint32_t(firstMedia + 1), uint32_t(firstMedia + 40), out));
        QCOMPARE(out.value("index").toInt(), firstMedia + 1);
        QVERIFY(list.eventInRange(5, 30, out));
        QCOMPARE(out.value("index").toInt(), 30);
        QVERIFY(list.eventInRange(30, 30, out));
        QCOMPARE(out.value("index").toInt(), 30);
        QVERIFY(list.eventInRange(40, 30, out));
        QCOMPARE(out.value("index").toInt(), 30);

        out.clear();
        out.insert(QStringLiteral("kept"), true);
        QVERIFY(!list.eventInRange(0, uint32_t(list.count()), out));
        QVERIFY(!list.event(uint32_t(list.count()), out));
        QCOMPARE(out.value("kept").toBool(), true);
    }

    void transitionKinds()
    {
        PlainAnimationSource source;
        AnimationEventList list(source);
        QStringList reported;
        list.setTransitionKindReporter([&](const QString &name) { reported << name; });
        QCOMPARE(list.transitionKind(), 1u);
        QVERIFY(list.setTransitionKind(2));
        QCOMPARE(list.transitionKind(), 2u);
        QVERIFY(!list.setTransitionKind(4));
        QCOMPARE(list.transitionKind(), 2u);
        QVERIFY(list.setTransitionKind(0));
        QCOMPARE(reported, (QStringList{"zoom", "unkown", "cut"}));
        QCOMPARE(AnimationEventList::transitionKinds().value("rotate"), 3);
    }
};

QTEST_GUILESS_MAIN(TestEvents)
#include "tst_events.moc"

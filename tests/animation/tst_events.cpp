#include "animation/AnimationEventList.h"
#include "animation/EventListBuilder.h"
#include "animation/PlainAnimationSource.h"
#include "TestRoutes.h"

#include <QFile>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>

#include <map>

namespace {

using Type = AnimationEvent::Type;

// Timeline computed, then the stretch pinned to 1 so that a 3000 ms leg is 90 frames.
bool buildPinned(PlainAnimationSource &source, AnimationEventList &list)
{
    list.updateDuration();
    source.animationTiming.stretch = 1.0;
    return list.build(false, false, 10.0);
}

std::map<Type, int> countByType(const AnimationEventList &list)
{
    std::map<Type, int> counts;
    for (const AnimationEvent &e : list.events())
        ++counts[e.type];
    return counts;
}

int firstOfType(const AnimationEventList &list, Type type)
{
    int i = 0;
    while (i < list.count() && list.events()[size_t(i)].type != type)
        ++i;
    return i;
}

QVariantMap eventMap(const AnimationEventList &list, int index)
{
    QVariantMap map;
    list.event(uint32_t(index), map);
    return map;
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
        QCOMPARE(list.events().back().type, Type::End);
        QCOMPARE(source.eventCount, 32);

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
        path.keyPoints[1].properties.enabled = false; // no pause, but its leg counts
        AnimationEventList list(source);
        QVERIFY(buildPinned(source, list));

        // 180 samples in 90 frames: a step of exactly 2 samples, then the one at the next key point.
        const auto counts = countByType(list);
        QCOMPARE(counts.at(Type::Step), 2 * 91);
        QCOMPARE(counts.at(Type::Pause), 15 + 30);
        QCOMPARE(source.eventCount, list.count());
        QCOMPARE(list.pilotSteps(), list.count() - 2); // every event but start and end steps a still avatar

        uint32_t lastPosition = 0;
        QSet<uint32_t> seenKeys;
        for (int i = 0; i < list.count(); ++i) {
            const AnimationEvent &e = list.events()[size_t(i)];
            QCOMPARE(e.index, uint32_t(i));
            QVERIFY(e.pathPosition >= lastPosition);
            lastPosition = e.pathPosition;
            seenKeys.insert(e.cKpId);
        }
        // The last key point never shows as the current one.
        QCOMPARE(seenKeys, (QSet<uint32_t>{0, first, second}));
        QCOMPARE(list.events()[16].cKpId, first); // after the start and 15 pauses
        QCOMPARE(list.events()[16].pathPosition, 0u);
        QCOMPARE(list.events()[17].pathPosition, 2u);
        QCOMPARE(list.events()[16 + 90].pathPosition, 180u); // the step at the next key point
        QCOMPARE(list.events()[16 + 91].cKpId, second);
        QCOMPARE(list.events().back().pathPosition, 360u);
    }

    void zeroFrameLegAndStretch()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 75);
        Path &path = source.paths.activeChecked();
        path.keyPoints[0].properties.durationToNextKP = 0;
        AnimationEventList list(source);
        QVERIFY(buildPinned(source, list));
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

        // The third key point is named by no sample.
        path.curvePoints.back().correspondingKeyPoint = 0;
        QTest::ignoreMessage(QtDebugMsg, "can't find next keypoint");
        QVERIFY(!list.build(false, true, 10.0));
        QCOMPARE(list.count(), 0);
        QCOMPARE(list.pilotSteps(), 0);
        QCOMPARE(source.eventCount, goodCount); // the timeline keeps what it had

        // The next key point lies behind the current position.
        path.curvePoints[5].correspondingKeyPoint = path.keyPoints[2].id;
        QTest::ignoreMessage(QtDebugMsg, "can't find next keypoint");
        QVERIFY(!list.build(false, false, 10.0));
        QCOMPARE(list.count(), 0);
    }

    void linearSharesSkipJumpsToAKeyPoint()
    {
        // The jump from 0.9 to 5 leads into a key point's sample and is not
        // counted, so both legs are 0.9 degrees long.
        PlainAnimationSource source;
        Path &path = source.paths.activeChecked();
        path.pathType = PathType::GPX;
        for (double lon : {0.0, 5.0, 6.0})
            path.addKeyPoint(KeyPoint(lon, 0.0, 0.0), false);
        for (int leg = 0; leg < 2; ++leg) {
            for (int j = 0; j < 10; ++j) {
                CurvePoint sample((leg == 0 ? 0.0 : 5.0) + 0.1 * j, 0.0, 0.0);
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
        // Each leg gets its share of the timeline whatever its own duration.
        const int steps = countByType(list).at(Type::Step);
        QVERIFY2(steps >= 2 * 151 && steps <= 2 * 152, qPrintable(QString::number(steps)));

        // Outside linear mode no shares are made.
        QVERIFY(list.build(false, false, 10.0));
        QVERIFY(list.durationPercents().empty());

        // Two key points: the only leg takes the whole timeline.
        PlainAnimationSource two;
        layRoute(two, {10.0, 10.5}, 30);
        AnimationEventList twoList(two);
        QVERIFY(twoList.build(true, false, 10.0));
        QCOMPARE(twoList.durationPercents(), std::vector<double>{1.0});
        QCOMPARE(countByType(twoList).at(Type::Step), twoList.totalFrames() + 1);
    }

    // Legs share the timeline by length; a scaled path is read through its scaled
    // copy, where halving the longitudes on the equator keeps every share.
    void linearSharesFollowLength_data()
    {
        QTest::addColumn<double>("scale");
        QTest::newRow("plain") << 1.0;
        QTest::newRow("scaled") << 0.5;
    }

    void linearSharesFollowLength()
    {
        QFETCH(double, scale);
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0, 4.0, 4.5}, 40);
        source.paths.setScale(scale);
        AnimationEventList list(source);
        QVERIFY(list.build(true, false, 10.0));
        const std::vector<double> &shares = list.durationPercents();
        QCOMPARE(shares.size(), size_t(3));
        QVERIFY(qAbs(shares[0] - 1.0 / 4.5) < 1e-9);
        QVERIFY(qAbs(shares[1] - 3.0 / 4.5) < 1e-9);
        QCOMPARE(list.events().back().pathPosition, 120u);
    }

    void photographs()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 90);
        const QString a = QStringLiteral("/photos/a.jpg");
        const QString b = QStringLiteral("file:///photos/b%20c.jpg");
        placeMedia(source, 45, {a, b}, {270, 180});
        source.photoPool.insert(a, QSize(400, 300));
        source.photoPool.insert(b, QSize(640, 480));
        AnimationEventList list(source);
        QVERIFY(buildPinned(source, list));

        // 15 fade frames and 120 held frames per photo, then 15 to fade out.
        const auto counts = countByType(list);
        QCOMPARE(counts.at(Type::MediaPoint), 45);
        QCOMPARE(counts.at(Type::Pause), 15 + 240 + 30);
        QCOMPARE(list.pilotSteps(), list.count() - 2); // each photo frame counts as an avatar step
        const int first = firstOfType(list, Type::MediaPoint);
        // Shown once the leg's position has passed the sample, at the last step's position.
        const std::vector<AnimationEvent> &events = list.events();
        QCOMPARE(events[size_t(first - 1)].type, Type::Step);
        QCOMPARE(events[size_t(first - 1)].pathPosition, 45u);
        QCOMPARE(events[size_t(first - 2)].pathPosition, 44u);

        const auto at = [&](int k) -> const AnimationEvent & { return events[size_t(first + k)]; };
        QCOMPARE(at(0).opacity, 1.0 / 15);
        QCOMPARE(at(14).opacity, 1.0);
        QCOMPARE(at(14).pathPosition, 45u);
        QCOMPARE(at(135).transition, AnimationEvent::Transition::CrossFade);
        QCOMPARE(at(135).opacity, 1.0 / 15);
        QCOMPARE(at(270).transition, AnimationEvent::Transition::FadeOut);
        QCOMPARE(at(270).opacity, 14.0 / 15);
        QCOMPARE(at(284).opacity, 0.0);
        QCOMPARE(events[size_t(first + 15)].type, Type::Pause);
        QCOMPARE(events[size_t(first + 15)].cKpId, 0u);
        QCOMPARE(events[size_t(first + 285)].type, Type::Step);

        QVariantMap map = eventMap(list, first);
        QCOMPARE(map.keys().size(), 12);
        QCOMPARE(map.value("type").toString(), QStringLiteral("mediaPoint"));
        QCOMPARE(map.value("transition").toString(), QStringLiteral("fadein"));
        QCOMPARE(map.value("mpePosition").toString(), QStringLiteral("firstEvent"));
        QCOMPARE(map.value("file").toString(), a);
        QCOMPARE(map.value("fileUrl").toString(), QStringLiteral("image://fullFrameImageProvider//photos/a.jpg"));
        QCOMPARE(map.value("width").toInt(), 300); // turned by 270 degrees: swapped
        QCOMPARE(map.value("height").toInt(), 400);
        map = eventMap(list, first + 284);
        QCOMPARE(map.value("fileUrl").toString(), QStringLiteral("image://fullFrameImageProvider//photos/b c.jpg"));
        QCOMPARE(map.value("width").toInt(), 640); // 180 degrees: not swapped
        QCOMPARE(map.value("mpePosition").toString(), QStringLiteral("lastEvent"));
    }

    void photographsAtTheEndsAndOddValues()
    {
        PlainAnimationSource source;
        layRoute(source, {0.0, 1.0}, 30);
        placeMedia(source, 30, {QStringLiteral("/p/last.jpg")}); // on the last key point's sample
        source.paths.activeChecked().curvePoints[10].correspondingMediaPoint = 987654321; // gone: skipped
        AnimationEventList list(source);
        QVERIFY(buildPinned(source, list));
        const std::vector<AnimationEvent> &events = list.events();
        QCOMPARE(countByType(list).at(Type::MediaPoint), 30);
        // After the last key point's pauses, right before "end".
        QCOMPARE(events[events.size() - 2].mpePosition, AnimationEvent::MpePosition::LastEvent);
        QCOMPARE(events[events.size() - 1 - 150 - 30].type, Type::Pause);
        QCOMPARE(eventMap(list, int(events.size()) - 2).value("width").toInt(), 0); // not in the photo pool

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
        QVERIFY(buildPinned(source, list));
        QStringList shown;
        for (const AnimationEvent &e : list.events()) {
            if (e.mpePosition == AnimationEvent::MpePosition::FirstEvent) {
                shown << list.photo(e).file;
                QCOMPARE(e.pathPosition, 40u); // where the avatar stood when the step passed them
            }
        }
        QCOMPARE(shown, (QStringList{"/p/first.jpg", "/p/second.jpg"}));
        QCOMPARE(countByType(list).at(Type::MediaPoint), 2 * 30);

        // 30 samples in 300 frames: the avatar stands on each sample ten times, and
        // the photograph on sample 12 still shows once, where the step that passed it started.
        PlainAnimationSource slow;
        layRoute(slow, {0.0, 1.0}, 30);
        slow.paths.activeChecked().keyPoints[0].properties.durationToNextKP = 10000;
        placeMedia(slow, 12, {QStringLiteral("/p/once.jpg")});
        AnimationEventList slowList(slow);
        QVERIFY(buildPinned(slow, slowList));
        QCOMPARE(countByType(slowList).at(Type::MediaPoint), 30);
        QCOMPARE(countByType(slowList).at(Type::Step), 301);
        const std::vector<AnimationEvent> &events = slowList.events();
        const uint32_t at = events[size_t(firstOfType(slowList, Type::MediaPoint) - 1)].pathPosition;
        QVERIFY2(at == 11 || at == 12, qPrintable(QString::number(at)));
        for (const AnimationEvent &e : events) {
            if (e.type == Type::MediaPoint)
                QCOMPARE(e.pathPosition, at);
        }
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
        QVERIFY(buildPinned(source, list));

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

        QVERIFY(!AvatarStepping::steps(300, 0)); // an interval of 0 never steps

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
        QVERIFY(buildPinned(source, list));
        const int firstMedia = firstOfType(list, Type::MediaPoint);

        // A late tick never skips the start or a photograph's first frame.
        QVariantMap out;
        QVERIFY(list.eventInRange(0, 20, out));
        QCOMPARE(out.value("index").toInt(), 0);
        QVERIFY(list.eventInRange(5, uint32_t(firstMedia + 40), out));
        QCOMPARE(out.value("index").toInt(), firstMedia);
        QVERIFY(list.eventInRange(uint32_t(firstMedia + 1), uint32_t(firstMedia + 40), out));
        QCOMPARE(out.value("index").toInt(), firstMedia + 1);
        QVERIFY(list.eventInRange(40, 30, out));
        QCOMPARE(out.value("index").toInt(), 30);

        out = {{QStringLiteral("kept"), true}};
        QVERIFY(!list.eventInRange(0, uint32_t(list.count()), out));
        QVERIFY(!list.event(uint32_t(list.count()), out));
        QCOMPARE(out, (QVariantMap{{QStringLiteral("kept"), true}}));
    }

    void transitionKinds()
    {
        PlainAnimationSource source;
        AnimationEventList list(source);
        QStringList reported;
        list.setTransitionKindReporter([&](const QString &name) { reported << name; });
        QVERIFY(list.setTransitionKind(2));
        QVERIFY(!list.setTransitionKind(4));
        QCOMPARE(list.transitionKind(), 2u);
        QCOMPARE(reported, (QStringList{"zoom", "unkown"}));
    }
};

QTEST_GUILESS_MAIN(TestEvents)
#include "tst_events.moc"

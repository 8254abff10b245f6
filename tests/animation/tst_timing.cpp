#include "animation/AnimationEventList.h"
#include "animation/AnimationTiming.h"
#include "animation/FrameRate.h"
#include "animation/PlainAnimationSource.h"

#include <QTest>

class TestTiming : public QObject
{
    Q_OBJECT

private slots:
    void framesFromMilliseconds()
    {
        // Whole multiples of a frame must come out whole; dividing by the frame
        // duration would give 14 for 500 ms.
        for (int frames = 0; frames <= 200000; frames += 7) {
            const int ms = frames * 100 / 3;
            if (ms * 3 == frames * 100 && FrameRate::framesFromMs(ms) != frames)
                QFAIL(qPrintable(QStringLiteral("%1 ms gave %2").arg(ms).arg(FrameRate::framesFromMs(ms))));
        }
        QCOMPARE(FrameRate::framesFromMs(33), 0);
        QCOMPARE(FrameRate::framesFromMs(-500), -15);

        AnimationTiming timing;
        timing.stretch = 2.5;
        QCOMPARE(timing.legFrames(3000), 225);
        QCOMPARE(timing.pauseFrames(3000), 90); // pauses are never stretched
        QCOMPARE(timing.scaledFrames(7), 17);
    }

    // The timeline is 15 times the natural frames, at least two minutes unless the
    // limit is one minute, and at most the limit.
    void limitFrames_data()
    {
        QTest::addColumn<uint>("index");
        QTest::addColumn<int>("frames");
        QTest::addColumn<int>("total");
        QTest::newRow("below the floor") << 1u << 0 << 3600;
        QTest::newRow("at the floor") << 1u << 240 << 3600;
        QTest::newRow("above the floor") << 1u << 241 << 3615;
        QTest::newRow("capped at 5 min") << 1u << 601 << 9000;
        QTest::newRow("1 min is below the floor") << 0u << 10 << 1800;
        QTest::newRow("60 min") << 4u << 100000 << 108000;
        QTest::newRow("unknown index is 5 min") << 9u << 100000 << 9000;
    }

    void limitFrames()
    {
        QFETCH(uint, index);
        QFETCH(int, frames);
        QFETCH(int, total);
        AnimationTiming timing;
        timing.maxDurationIndex = index;
        QCOMPARE(timing.limitFrames(frames), total);
        QCOMPARE(timing.totalFrames, total);
    }

    void stretchFromTheDurationFactor()
    {
        // At the default factor the film keeps its natural length while
        // natural * 15 lies between the floor and the limit.
        for (int natural : {240, 599}) {
            AnimationTiming timing;
            timing.setFrames(natural);
            QCOMPARE(timing.durationFactor, 1.0 / 15.0);
            QCOMPARE(timing.scaledFrames(natural), natural);
        }
        AnimationTiming timing;
        timing.setFrames(120); // below the floor: lengthened to 1/15 of two minutes
        QCOMPARE(timing.stretch, 2.0);
        QCOMPARE(timing.durationText, QStringLiteral("00m08s"));
        timing.setFrames(1200); // above the limit: shortened
        QCOMPARE(timing.stretch, 0.5);

        // A chosen factor stays.
        timing.setDurationFactor(0.5);
        QCOMPARE(timing.durationText, QStringLiteral("02m30s"));
        timing.setFrames(600);
        QCOMPARE(timing.stretch, 7.5);
        timing.setFrames(0); // no legs: no stretch
        QCOMPARE(timing.stretch, 0.0);
    }

    void fixedSecondsAndOldFiles()
    {
        AnimationTiming timing;
        timing.setFramesFixed(600, 30);
        QCOMPARE(timing.durationFactor, 0.1);
        QCOMPARE(timing.stretch, 1.5);
        QCOMPARE(timing.durationText, QStringLiteral("00m30s"));
        timing.setFramesFixed(0, 30);
        QCOMPARE(timing.stretch, 0.0);

        timing.setFromOldPercent(50, 600);
        QCOMPARE(timing.durationFactor, 5.5 / 15.0);
        timing.setFromOldPercent(-2, 600);
        QCOMPARE(timing.durationFactor, 0.5 / 15.0);
        timing.setFromOldPercent(0, 600);
        QCOMPARE(timing.durationFactor, 1.0 / 15.0);
    }

    void durationTexts()
    {
        // Under a minute a film shows at least one second.
        QCOMPARE(AnimationTiming::formatDuration(0), QStringLiteral("00m01s"));
        QCOMPARE(AnimationTiming::formatDuration(1), QStringLiteral("00m01s"));
        QCOMPARE(AnimationTiming::formatDuration(60), QStringLiteral("00m02s"));
        QCOMPARE(AnimationTiming::formatDuration(1799), QStringLiteral("00m59s"));
        QCOMPARE(AnimationTiming::formatDuration(1829), QStringLiteral("01m00s"));
        QCOMPARE(AnimationTiming::formatDuration(3 * 60 * 60 * 30), QStringLiteral("180m00s"));

        PlainAnimationSource source;
        Path &path = source.paths.activeChecked();
        for (int i = 0; i < 3; ++i)
            path.addKeyPoint(KeyPoint(i, 0, 0), false);
        path.keyPoints[0].properties.durationToNextKP = 3000;
        path.keyPoints[1].properties.durationToNextKP = 1001;
        path.keyPoints[2].properties.durationToNextKP = 99999; // the last leads nowhere
        QCOMPARE(source.naturalFrames(), 120);

        AnimationEventList list(source);
        QCOMPARE(list.totalFrames(), -1);
        // The timeline is computed on first use; 0.0 reads differently from an empty film.
        QCOMPARE(list.durationAt(0.0), QStringLiteral("00m00s"));
        QCOMPARE(list.totalFrames(), 240);
        QCOMPARE(list.durationAt(0.5), QStringLiteral("00m04s"));
        source.animationTiming.setDurationFactor(1.0);
        QCOMPARE(list.updateDuration(), 3600);
        QCOMPARE(list.durationAt(0.999), QStringLiteral("01m59s"));
        list.fixedSeconds = 45;
        QCOMPARE(list.updateDurationFixed(), 1350);
    }
};

QTEST_GUILESS_MAIN(TestTiming)
#include "tst_timing.moc"

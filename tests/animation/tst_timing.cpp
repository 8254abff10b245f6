#include "animation/AnimationEventList.h"
#include "animation/AnimationTiming.h"
#include "animation/FrameRate.h"
#include "animation/PlainAnimationSource.h"

#include <QTest>

#include <cmath>

class TestTiming : public QObject
{
    Q_OBJECT

private slots:
    void framesFromMilliseconds()
    {
        // Whole multiples of a frame must come out whole; dividing by the frame
        // duration would give 14 for 500 ms.
        QCOMPARE(FrameRate::framesFromMs(500), 15);
        QCOMPARE(FrameRate::framesFromMs(3000), 90);
        QCOMPARE(FrameRate::framesFromMs(5000), 150);
        for (int frames = 0; frames <= 200000; frames += 7) {
            const int ms = frames * 100 / 3;
            if (ms * 3 == frames * 100 && FrameRate::framesFromMs(ms) != frames)
                QFAIL(qPrintable(QStringLiteral("%1 ms gave %2").arg(ms).arg(FrameRate::framesFromMs(ms))));
        }
        QCOMPARE(FrameRate::framesFromMs(33), 0);
        QCOMPARE(FrameRate::framesFromMs(34), 1);
        QCOMPARE(FrameRate::framesFromMs(-500), -15);
        QCOMPARE(FrameRate::framesFromMs(1000, 1.5), 45);

        AnimationTiming timing;
        QCOMPARE(timing.totalFrames, 900);
        QCOMPARE(timing.keyPointAnimationFrames, 30);
        QCOMPARE(timing.pauseFrames(500), 15);
        timing.stretch = 2.5;
        QCOMPARE(timing.legFrames(3000), 225);
        QCOMPARE(timing.pauseFrames(3000), 90); // pauses are never stretched
        QCOMPARE(timing.scaledFrames(7), 17);

        QVERIFY(timing.setKeyPointAnimationDuration(3));
        QCOMPARE(timing.keyPointAnimationFrames, 45);
        QVERIFY(!timing.setKeyPointAnimationDuration(3));
    }

    void limitTable()
    {
        AnimationTiming timing;
        const int seconds[] = {60, 300, 600, 1800, 3600, 300, 300};
        for (uint32_t index = 0; index < 7; ++index)
            QCOMPARE(AnimationTiming::limitSeconds(index), seconds[index]);
        QCOMPARE(AnimationTiming::limitSeconds(0xFFFFFFFFu), 300);

        // The 2-minute floor, unless the limit is one minute.
        timing.maxDurationIndex = 1;
        QCOMPARE(timing.limitFrames(120), 3600);
        QCOMPARE(timing.totalFrames, 3600);
        QCOMPARE(timing.limitFrames(0), 3600);
        QCOMPARE(timing.limitFrames(240), 3600);
        QCOMPARE(timing.limitFrames(241), 3615);
        QCOMPARE(timing.limitFrames(600), 9000);
        QCOMPARE(timing.limitFrames(601), 9000); // capped at the limit
        timing.maxDurationIndex = 0;
        QCOMPARE(timing.limitFrames(10), 1800);
        timing.maxDurationIndex = 2;
        QCOMPARE(timing.limitFrames(1000), 15000);
        QCOMPARE(timing.limitFrames(5000), 18000);
        timing.maxDurationIndex = 4;
        QCOMPARE(timing.limitFrames(100000), 108000);
        timing.maxDurationIndex = 9;
        QCOMPARE(timing.limitFrames(100000), 9000);
    }

    void stretchFromTheDurationFactor()
    {
        // At the default factor the film keeps its natural length while
        // natural * 15 lies between the floor and the limit.
        for (int natural : {240, 300, 450, 599, 600}) {
            AnimationTiming timing;
            timing.setFrames(natural);
            QCOMPARE(timing.durationFactor, 1.0 / 15.0);
            QCOMPARE(timing.stretch, 1.0);
            QCOMPARE(timing.scaledFrames(natural), natural);
        }
        AnimationTiming timing;
        timing.setFrames(600);
        QCOMPARE(timing.durationText, QStringLiteral("00m20s"));

        // Below the floor the film is lengthened to 1/15 of two minutes.
        timing.setFrames(120);
        QCOMPARE(timing.totalFrames, 3600);
        QCOMPARE(timing.stretch, 2.0);
        QCOMPARE(timing.durationText, QStringLiteral("00m08s"));

        // Above the limit it is shortened.
        timing.setFrames(1200);
        QCOMPARE(timing.totalFrames, 9000);
        QCOMPARE(timing.stretch, 0.5);

        // A chosen factor stays.
        timing.setDurationFactor(0.5);
        QCOMPARE(timing.durationText, QStringLiteral("02m30s"));
        timing.setFrames(600);
        QCOMPARE(timing.durationFactor, 0.5);
        QCOMPARE(timing.stretch, 7.5);

        // No legs: no stretch.
        timing.setFrames(0);
        QCOMPARE(timing.stretch, 0.0);
    }

    void fixedSecondsAndOldFiles()
    {
        AnimationTiming timing;
        timing.setFramesFixed(600, 30);
        QCOMPARE(timing.totalFrames, 9000);
        QCOMPARE(timing.durationFactor, 0.1);
        QCOMPARE(timing.stretch, 1.5);
        QCOMPARE(timing.durationText, QStringLiteral("00m30s"));
        timing.setFramesFixed(0, 30);
        QCOMPARE(timing.durationFactor, 0.25);
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
        QCOMPARE(AnimationTiming::formatDuration(0), QStringLiteral("00m01s"));
        QCOMPARE(AnimationTiming::formatDuration(1), QStringLiteral("00m01s"));
        QCOMPARE(AnimationTiming::formatDuration(59), QStringLiteral("00m01s"));
        QCOMPARE(AnimationTiming::formatDuration(60), QStringLiteral("00m02s"));
        QCOMPARE(AnimationTiming::formatDuration(1799), QStringLiteral("00m59s"));
        QCOMPARE(AnimationTiming::formatDuration(1800), QStringLiteral("01m00s"));
        QCOMPARE(AnimationTiming::formatDuration(1829), QStringLiteral("01m00s"));
        QCOMPARE(AnimationTiming::formatDuration(108000), QStringLiteral("60m00s"));
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
        QCOMPARE(source.animationTiming.stretch, 2.0);
        QCOMPARE(list.durationAt(0.5), QStringLiteral("00m04s"));
        QCOMPARE(list.durationAt(1.0), QStringLiteral("00m08s"));
        source.animationTiming.setDurationFactor(1.0);
        QCOMPARE(list.updateDuration(), 3600);
        QCOMPARE(list.durationAt(0.25), QStringLiteral("00m30s"));
        QCOMPARE(list.durationAt(0.999), QStringLiteral("01m59s"));
        list.fixedSeconds = 45;
        QCOMPARE(list.updateDurationFixed(), 1350);
    }
};

QTEST_GUILESS_MAIN(TestTiming)
#include "tst_timing.moc"

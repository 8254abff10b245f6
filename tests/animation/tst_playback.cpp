#include "TestRoutes.h"

#include "animation/AnimationEventList.h"
#include "animation/PlaybackCamera.h"
#include "animation/PlaybackLoop.h"
#include "animation/RoutePose.h"

#include <QSignalSpy>
#include <QTest>

namespace {

using Type = AnimationEvent::Type;

// A loop over a list built from `source`, on a clock the test moves by hand. The
// timers of the chain are real: their delays are milliseconds.
struct Player
{
    PlainAnimationSource source;
    AnimationEventList list{source};
    PlaybackLoop loop{list, source};
    qint64 now = 0;

    Player() { loop.setClock([this] { return now; }); }

    // The chain is running from event 0 on.
    bool start()
    {
        QSignalSpy first(&loop, &PlaybackLoop::activeKeyPointReached);
        loop.start();
        return first.wait(1000);
    }
    // Lets a few ticks pass at the present clock.
    void tick() { QTest::qWait(20); }
    QString type() const { return loop.animationEvent().value(QStringLiteral("type")).toString(); }
};

// A single waypoint that stands for `pauseMs`: start, its pauses, end.
void standStill(Player &player, int pauseMs)
{
    layRoute(player.source, {5.0}, 10);
    player.source.paths.activeChecked().keyPoints[0].properties.durationPause = pauseMs;
}

} // namespace

class TestPlayback : public QObject
{
    Q_OBJECT

private slots:
    // Idle, running and its loop, stopping, idle again.
    void loopsUntilStopped()
    {
        Player player;
        layRoute(player.source, {0.0, 0.1, 0.2}, 50);
        QVERIFY(player.list.build(false, false, 10.0));
        const int count = player.list.count();
        QVERIFY(count > 10);

        QSignalSpy ends(&player.loop, &PlaybackLoop::endShown);
        QSignalSpy events(&player.loop, &PlaybackLoop::animationEventChanged);
        QVERIFY(player.start());
        QVERIFY(player.loop.manualAnimationActive());

        // Half the time: half the list.
        player.now = count * 30 / 2;
        QTRY_COMPARE(player.loop.position(), uint32_t(count / 2));
        QVERIFY(ends.isEmpty());

        // The end shows the last event, and a second later the list plays again.
        player.now = count * 30;
        QTRY_COMPARE(ends.count(), 1);
        QCOMPARE(player.loop.position(), uint32_t(count - 1));
        QCOMPARE(player.type(), QStringLiteral("end"));
        QSignalSpy again(&player.loop, &PlaybackLoop::activeKeyPointReached);
        QTest::qWait(800);
        QVERIFY(again.isEmpty());
        QVERIFY(again.wait(1000));
        QTRY_COMPARE(player.type(), QStringLiteral("start"));

        // Stopping: the next tick shows the end, then nothing more happens.
        player.loop.stop();
        QTRY_COMPARE(ends.count(), 2);
        events.clear();
        player.now += 5000;
        QTest::qWait(100);
        QVERIFY(events.isEmpty());
        QCOMPARE(ends.count(), 2);
    }

    // The preview takes 30 ms an event: 900 events are 27 seconds.
    void lengthIsThirtyMillisecondsAnEvent()
    {
        Player player;
        // One frame is 33.3 ms: 898 frames of pause, with the start and the end 900.
        standStill(player, 29934);
        QVERIFY(player.list.build(false, false, 10.0));
        QCOMPARE(player.list.count(), 900);

        QSignalSpy ends(&player.loop, &PlaybackLoop::endShown);
        QVERIFY(player.start());
        player.now = 26999;
        QTRY_COMPARE(player.loop.position(), uint32_t(899));
        player.tick();
        QVERIFY(ends.isEmpty());
        player.now = 27000;
        QTRY_COMPARE(ends.count(), 1);
        player.loop.stop();
    }

    // A late tick delivers the start or a photograph's first frame it would jump over,
    // and photographs then go on one event a tick, however far the clock has run.
    void lateTicksKeepStartAndPhotographs()
    {
        Player player;
        layRoute(player.source, {0.0, 0.1}, 100);
        placeMedia(player.source, 50, {QStringLiteral("/nowhere/a.jpg")});
        QVERIFY(player.list.build(false, false, 10.0));
        int firstMedia = 0;
        while (player.list.events()[size_t(firstMedia)].type != Type::MediaPoint)
            ++firstMedia;

        QVERIFY(player.start());
        player.now = 30 * 3;
        QTRY_VERIFY(player.loop.position() >= 3);
        QCOMPARE(player.type(), QStringLiteral("start"));

        // Past the photograph's opening: its first event is shown.
        player.now = 30 * (firstMedia + 5);
        QTRY_COMPARE(player.type(), QStringLiteral("mediaPoint"));
        QCOMPARE(player.loop.animationEvent().value(QStringLiteral("index")).toInt(), firstMedia);

        // While photographs show, one event a tick, however far the clock runs ahead.
        QList<int> shown;
        connect(&player.loop, &PlaybackLoop::animationEventChanged, this, [&] {
            shown << player.loop.animationEvent().value(QStringLiteral("index")).toInt();
        });
        player.now = 30 * (firstMedia + 100);
        QTRY_VERIFY(shown.size() >= 4);
        for (int i = 1; i < 4; ++i)
            QCOMPARE(shown[i], shown[i - 1] + 1);
        QVERIFY(shown[3] < firstMedia + 15);
        player.loop.stop();
    }

    // The export steps event by event, wraps at the end, and tells each new key point.
    void exportStepsEveryEvent()
    {
        Player player;
        layRoute(player.source, {0.0, 0.1, 0.2}, 20);
        QVERIFY(player.list.build(false, false, 10.0));
        QSignalSpy keyPoints(&player.loop, &PlaybackLoop::activeKeyPointReached);
        QSignalSpy events(&player.loop, &PlaybackLoop::animationEventChanged);
        for (int i = 0; i < player.list.count(); ++i) {
            player.loop.stepAnimation();
            QCOMPARE(player.loop.animationEvent().value(QStringLiteral("index")).toInt(), i);
        }
        QCOMPARE(events.count(), player.list.count());
        QCOMPARE(player.loop.position(), uint32_t(0));
        // The first two key points start a leg; the last has no id in the events.
        QCOMPARE(keyPoints.count(), 2);
    }

    // Seeking moves the position and the clock together.
    void seekGoesOnFromThere()
    {
        Player player;
        layRoute(player.source, {0.0, 0.1}, 200);
        QVERIFY(player.list.build(false, false, 10.0));
        const int count = player.list.count();
        QVERIFY(player.start());
        player.tick();
        player.loop.seek(0.5);
        QCOMPARE(player.loop.position(), uint32_t((count - 1) / 2));
        player.now += 300; // ten events on
        QTRY_VERIFY(player.loop.position() >= uint32_t((count - 1) / 2 + 9));
        QVERIFY(player.loop.position() <= uint32_t((count - 1) / 2 + 11));
        player.loop.stop();
    }

    void headingAlongTheRoute_data()
    {
        QTest::addColumn<QVector<QPointF>>("route"); // (longitude, latitude)
        QTest::addColumn<int>("at");
        QTest::addColumn<double>("heading");

        QVector<QPointF> north, east, west, zigzag;
        for (int i = 0; i < 50; ++i) {
            north << QPointF(8.0, 47.0 + i * 0.001);
            east << QPointF(8.0 + i * 0.001, 0.0);
            west << QPointF(8.0 - i * 0.001, 0.0);
            // A track that jitters sideways while it heads east
            zigzag << QPointF(8.0 + i * 0.001, (i % 2) * 0.0003);
        }
        QTest::newRow("north") << north << 10 << 0.0;
        QTest::newRow("east") << east << 10 << 90.0;
        QTest::newRow("west, at the very end") << west << 49 << 270.0;
        QTest::newRow("east, at the very start") << east << 0 << 90.0;
        QTest::newRow("jitter is smoothed out") << zigzag << 25 << 90.0;
        QTest::newRow("past the end: the last sample") << east << 500 << 90.0;
    }

    void headingAlongTheRoute()
    {
        QFETCH(QVector<QPointF>, route);
        QFETCH(int, at);
        QFETCH(double, heading);
        std::vector<CurvePoint> curve;
        for (const QPointF &p : route)
            curve.emplace_back(p.x(), p.y(), 0.0);
        const RoutePose pose = routePoseAt(curve, uint32_t(at), headingSpanFor(curve) * 20);
        QVERIFY(pose.valid);
        QCOMPARE(pose.longitude, route[std::min(at, int(route.size()) - 1)].x());
        QVERIFY2(std::abs(pose.heading - heading) < 5.0, qPrintable(QString::number(pose.heading)));

        QVERIFY(!routePoseAt({}, 0, 10.0).valid);
    }

    // The fly-in glides from the route's middle to where the film begins; after it
    // the camera has the user's zoom and the fly-in's last bearing and tilt.
    void cameraFollowsTheFilm()
    {
        Player player;
        layRoute(player.source, {0.0, 1.0}, 100);
        player.source.flyIn.enabled = true;
        player.source.camera.zoom = 9.0;
        player.source.camera.centre = KeyPoint(0.2, 0.1, 0.0);
        player.source.animationTiming.flyInDuration = 1;
        player.source.camera.zoom = 5.0; // zoomed out for the fly-in
        QVERIFY(player.list.build(false, true, 9.0));

        CameraView user;
        user.zoom = 9.0;
        user.centre = KeyPoint(0.2, 0.1, 0.0);
        PlaybackCamera camera;
        camera.prepare(user, player.list, 0.5, 0.0);

        std::vector<CurvePoint> curve = player.source.paths.curvePoints();
        const auto viewAt = [&](int index, CameraMode mode) {
            QVariantMap event;
            player.list.event(uint32_t(index), event);
            return camera.viewFor(event, routePoseAt(curve, event.value(QStringLiteral("pathPosition")).toUInt(), 100.0),
                                  mode);
        };
        const auto lon = [](const QVariantMap &view) { return view.value(QStringLiteral("centerLongitude")).toDouble(); };
        // Events: start, 30 fly-in frames, 30 pauses, then the route.
        const QVariantMap firstFlyIn = viewAt(1, CameraMode::KeepCentered);
        QVERIFY(std::abs(lon(firstFlyIn) - 0.5) < 0.02);
        QCOMPARE(firstFlyIn.value(QStringLiteral("zoomLevel")).toDouble(), 5.0);
        const QVariantMap lastFlyIn = viewAt(30, CameraMode::KeepCentered);
        QCOMPARE(lon(lastFlyIn), 0.0);
        QCOMPARE(lastFlyIn.value(QStringLiteral("zoomLevel")).toDouble(), 9.0);

        const int late = player.list.count() - 20;
        const QVariantMap centred = viewAt(late, CameraMode::KeepCentered);
        QVERIFY(lon(centred) > 0.5);
        QCOMPARE(centred.value(QStringLiteral("zoomLevel")).toDouble(), 9.0);
        QCOMPARE(centred.value(QStringLiteral("tilt")).toDouble(), lastFlyIn.value(QStringLiteral("tilt")).toDouble());
        QCOMPARE(lon(viewAt(late, CameraMode::Static)), 0.2);
        QCOMPARE(lon(viewAt(30, CameraMode::Static)), 0.2);
    }
};

QTEST_GUILESS_MAIN(TestPlayback)
#include "tst_playback.moc"

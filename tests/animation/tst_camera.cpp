#include "animation/AnimationEventList.h"
#include "animation/FlyInCamera.h"
#include "animation/PlainAnimationSource.h"
#include "animation/VisibleRegionProvider.h"
#include "path/PathManager.h"
#include "project/DocumentAnimationSource.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QTest>

#include <limits>
#include <vector>

namespace {

using Type = AnimationEvent::Type;

class FixedMap : public VisibleRegionProvider
{
public:
    bool known = true;
    GeoRect region;
    bool visibleRegion(GeoRect &out) const override
    {
        if (known)
            out = region;
        return known;
    }
};

GeoRect rect(double left, double top, double right, double bottom)
{
    GeoRect r;
    r.left = left;
    r.top = top;
    r.right = right;
    r.bottom = bottom;
    return r;
}

void twoPointRoute(PlainAnimationSource &source, double lon1, double lat1, double lon2, double lat2)
{
    Path &path = source.paths.activeChecked();
    path.addKeyPoint(KeyPoint(lon1, lat1, 0.0), false);
    path.addKeyPoint(KeyPoint(lon2, lat2, 0.0), true);
}

std::vector<AnimationEvent> flyInFramesOf(const AnimationEventList &list)
{
    std::vector<AnimationEvent> out;
    for (const AnimationEvent &e : list.events()) {
        if (e.type == Type::FlyIn)
            out.push_back(e);
    }
    return out;
}

} // namespace

class TestCamera : public QObject
{
    Q_OBJECT

private slots:
    void flyInFrames()
    {
        PlainAnimationSource source;
        twoPointRoute(source, 13.0, 51.0, 14.0, 51.5);
        source.camera.zoom = 6.0; // where the fly-in starts
        source.camera.bearing = 10.0;
        AnimationEventList list(source);
        QVERIFY(list.build(false, true, 12.0));

        // Five seconds of flying right after the start, then one of standing still.
        const std::vector<AnimationEvent> frames = flyInFramesOf(list);
        QCOMPARE(frames.size(), size_t(150));
        QCOMPARE(list.events()[1].type, Type::FlyIn);
        for (size_t i = 151; i < 181; ++i) {
            const AnimationEvent &e = list.events()[i];
            QVERIFY(e.type == Type::Pause && e.cKpId == 0 && e.pathPosition == 0 && !e.stepAnimatedPilot);
        }
        QCOMPARE(frames.front().zoom, 6.0);
        QVERIFY(qAbs(frames[75].zoom - 9.0) < 1e-9);
        QCOMPARE(frames.back().zoom, 12.0); // exactly where the user left the camera
        QCOMPARE(frames.front().bearing, 70.0);
        QVERIFY(qAbs(frames.back().bearing - (10.0 + 60.0 / 150)) < 1e-9);
        QCOMPARE(frames.front().tilt, 0.0);
        QVERIFY(qAbs(frames.back().tilt - 54.0 * 149 / 150) < 1e-9);

        // Without rotation the bearing stands still.
        source.flyIn.enableRotation = false;
        QVERIFY(list.build(false, true, 12.0));
        QCOMPARE(flyInFramesOf(list).back().bearing, 10.0);

        // The user's own tilt is the target when there is one.
        source.camera.tilt = 20.0;
        QVERIFY(list.build(false, true, 12.0));
        QVERIFY(qAbs(flyInFramesOf(list).back().tilt - 20.0 * 149 / 150) < 1e-9);

        // Tilting off: the camera keeps the tilt it has, a flat map stays flat.
        source.flyIn.enableTilt = false;
        QVERIFY(list.build(false, true, 12.0));
        QCOMPARE(flyInFramesOf(list).front().tilt, 20.0);
        source.camera.tilt = 0.0;
        QVERIFY(list.build(false, true, 12.0));
        QCOMPARE(flyInFramesOf(list).front().tilt, 0.0);

        // A fly-in of no length leaves only its second of standing still.
        source.animationTiming.flyInDuration = 0;
        QVERIFY(list.build(false, true, 12.0));
        QVERIFY(flyInFramesOf(list).empty());
        QCOMPARE(list.events()[30].type, Type::Pause);

        // A fly-in asked for on a route without key points still flies.
        PlainAnimationSource empty;
        AnimationEventList emptyList(empty);
        QVERIFY(emptyList.build(false, true, 10.0));
        QCOMPARE(emptyList.count(), 1 + 150 + 30);
        QCOMPARE(empty.eventCount, 0);
    }

    void zoomForExtent()
    {
        PlainAnimationSource source;
        FixedMap map;
        map.known = false; // the stored boundary serves: 2.443 x 0.864 degrees
        FlyInCamera camera(source, &map);

        source.camera.zoom = 10.7;
        camera.setZoomForExtent(0.5, 0.2);
        // 0.5 x 0.2 doubles twice to fit the view (z 8), then once more down.
        QCOMPARE(source.camera.zoom, 7.0);
        // A single point: no extent, the zoom is only truncated.
        source.camera.zoom = 10.7;
        camera.setZoomForExtent(0.0, 0.0);
        QCOMPARE(source.camera.zoom, 10.0);

        // A route much larger than what the map shows.
        map.known = true;
        map.region = rect(0.0, 10.0, 10.0, 0.0);
        source.camera.zoom = 5.2;
        camera.setZoomForExtent(40.0, 40.0);
        QCOMPARE(source.camera.zoom, 6.0); // 34 halves once to 17, then 8.5 fits
        // Narrower than the view in one direction: one step out, no halving.
        source.camera.zoom = 5.0;
        camera.setZoomForExtent(40.0, 5.0);
        QCOMPARE(source.camera.zoom, 4.0);

        // An empty view can't be fitted against; nothing runs away.
        map.region = rect(3.0, 3.0, 3.0, 3.0);
        source.camera.zoom = 8.0;
        camera.setZoomForExtent(1.0, 1.0);
        QCOMPARE(source.camera.zoom, 8.0);
        map.region = rect(0.0, 10.0, 10.0, 0.0);
        camera.setZoomForExtent(std::numeric_limits<double>::infinity(), 1.0);
        QCOMPARE(source.camera.zoom, 8.0);
    }

    void prepareAndRestore()
    {
        // A playback through the document's own fields: camera, stored view boundary, switches.
        PainterPathRenderer_Controller document;
        document.newProject();
        Path &path = document.pathManager().activeChecked();
        path.addKeyPoint(10.0, 45.0, 0.0, QStringLiteral("A"), false);
        path.addKeyPoint(10.1, 45.05, 0.0, QStringLiteral("B"), true);
        ProjectFields &f = document.fields();
        f.currentZoomLevel = 12.25;
        f.currentBearing = 5.0;
        f.currentTilt = 0.0;
        f.visibleBoundariesTL.setLongitude(9.0, true);
        f.visibleBoundariesTL.setLatitude(46.0, true);
        f.visibleBoundariesBR.setLongitude(11.0, true);
        f.visibleBoundariesBR.setLatitude(44.0, true);
        f.flyInRotation = false;
        DocumentAnimationSource source(document);
        FlyInCamera camera(source);

        // Without a fly-in the camera stays.
        QCOMPARE(camera.prepareFlyIn(), 12.25);
        QCOMPARE(f.currentZoomLevel, 12.25);

        // With it, the zoom moves out to the route's extent: 0.1 x 0.05 degrees in a
        // 2 x 2 view, doubled until twice the height no longer fits (five times, z 7),
        // then once more out. The fly-in ends at the user's zoom.
        f.flyInEnabled = true;
        QCOMPARE(camera.prepareFlyIn(), 12.25);
        QCOMPARE(f.currentZoomLevel, 6.0);
        AnimationEventList list(source);
        QVERIFY(list.build(false, true, 12.25));
        QCOMPARE(list.events()[1].zoom, 6.0);
        QCOMPARE(list.events()[150].zoom, 12.25);
        QCOMPARE(list.events()[1].bearing, 5.0);
        QCOMPARE(source.animationEventCount(), list.count());

        // Playback moved the camera; restoring brings back the saved view. The
        // centre gets its geographic values back, its x and y stay.
        f.centerPosition.setLongitude(0.5, true);
        f.currentBearing = 90.0;
        f.currentTilt = 30.0;
        camera.restoreView();
        QCOMPARE(f.currentZoomLevel, 12.25);
        QCOMPARE(f.currentBearing, 5.0);
        QCOMPARE(f.currentTilt, 0.0);
        QCOMPARE(f.centerPosition.longitude, FlyInCamera::savedView().centre.longitude);
        QVERIFY(f.centerPosition.longitude != 0.5);
        QCOMPARE(f.centerPosition.x, 0.5);

        // A picture of the photo pool lends its size to the photograph's events.
        document.photoPool().add(QStringLiteral("/nowhere/p.jpg"), 800, 600);
        QCOMPARE(source.photoPoolSize(QStringLiteral("/nowhere/p.jpg")), QSize(800, 600));
        QVERIFY(!source.photoPoolSize(QStringLiteral("/nowhere/q.jpg")).isValid());
    }

    void routeWithoutCurvePointsKeepsTheZoom()
    {
        PlainAnimationSource bare;
        bare.flyIn.enabled = true;
        bare.camera.zoom = 9.3;
        QCOMPARE(FlyInCamera(bare).prepareFlyIn(), 9.3);
        QCOMPARE(bare.camera.zoom, 9.3);
    }
};

QTEST_GUILESS_MAIN(TestCamera)
#include "tst_camera.moc"

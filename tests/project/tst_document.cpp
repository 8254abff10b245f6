#include "TestFiles.h"
#include "gpx/GpxWriter.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"
#include "project/ValueParsers.h"
#include "app/ProgramFolder.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QTest>

#include <algorithm>
#include <csignal>
#include <functional>
#include <grp.h>
#include <pwd.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

void writeText(const QString &file, const QByteArray &text)
{
    QFile f(file);
    QVERIFY(f.open(QIODevice::WriteOnly));
    f.write(text);
}

QByteArray readBytes(const QString &file)
{
    QFile f(file);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
}

// A document with every field away from its default and an ordinary route of three legs,
// with a picture in the folder.
void fillDocument(PainterPathRenderer_Controller &doc, const QTemporaryDir &folder)
{
    QImage image(8, 8, QImage::Format_RGB32);
    image.fill(Qt::blue);
    const QString picture = folder.filePath(QStringLiteral("photo.png"));
    QVERIFY(image.save(picture));
    ProjectFields &f = doc.fields();
    f.sceneMode = 2;
    f.projectTitle = QStringLiteral("Über die Alpen = 1, 2");
    f.projectWidth = 3840;
    f.projectHeight = 2160;
    f.hostWidth = 800;
    f.hostHeight = 600;
    f.sceneWidth = 1024;
    f.sceneHeight = 768;
    f.pathMode = 3;
    f.animationMode = 1;
    f.animationFrame = 77;
    f.animationFrameSource = QStringLiteral("frame.png");
    f.backgroundMap = QStringLiteral("osm:layer:2");
    f.backgroundMapColor = QStringLiteral("#123456");
    f.ignorePauseOnKeyPoint = true;
    f.showKeyPointsOnAnimationPosition = false;
    f.animateKeyPoints = false;
    f.keyPointsLocked = true;
    f.currentZoomLevel = 1.23456789;
    f.currentBearing = -45.5;
    f.currentTilt = 30.0000004;
    f.centerPosition = KeyPoint(11.123456789012345, 47.98765432109876, 0);
    f.visibleBoundariesTL = KeyPoint(10.5, 48.5, 0);
    f.visibleBoundariesBR = KeyPoint(12.5, 47.5, 0);
    f.pseudoBoundariesTL = KeyPoint(-1.25, 2.5, 0);
    f.pseudoBoundariesBR = KeyPoint(3.75, -4.5, 0);
    f.showCompass = true;
    f.sendExportToHost = false;
    f.flyInEnabled = true;
    f.flyInRotation = false;
    f.flyInTilt = false;
    f.linearAnimationDurations = false;
    f.pathSettings.color = QStringLiteral("#00FF00");
    f.pathSettings.opacity = 0.5;
    f.pathSettings.width = 9;
    f.pathSettings.shadowEnabled = true;
    f.pathSettings.shadowDistance = 4.5;
    f.pathSettings.shadowWidth = 2;
    f.pathSettings.shadowOpacity = 0.3;
    f.pad = 33;
    f.fullFrameDuration = 7000;
    f.fullFrameFadeDuration = 250;
    f.fullFrameFullscreen = false;
    f.fullFrameTransitionMode = 3;
    f.altitudePresetIndex = 4;
    f.altitudeBoardX = 10;
    f.altitudeBoardY = 20;
    f.altitudeBoardWidth = 300;
    f.altitudeBoardHeight = 100;
    f.fullFrameX = 1;
    f.fullFrameY = 2;
    f.fullFrameWidth = 3;
    f.fullFrameHeight = 4;
    f.pseudoMapCropMode = true;
    f.pseudoMapInitialZoom = 7.5;
    f.pseudoMapCenter = KeyPoint(5.5, 6.5, 0);
    f.fileNameChangedByUser = true;

    AnimationTiming &t = doc.timing();
    t.flyInDuration = 9;
    t.flyInRotation = 33.3;
    t.flyInTilt = 44.4;
    t.setDurationFactor(0.4);
    t.setKeyPointAnimationDuration(4);

    Path &path = doc.pathManager().activeChecked();
    path.curveMode = CurveMode::Straight;
    const double coords[][2] = {{11.1, 47.1}, {11.7, 47.3}, {12.2, 47.05}, {12.9, 47.6}};
    for (int i = 0; i < 4; ++i) {
        KeyPoint k(coords[i][0] + 1e-13, coords[i][1], 100.0 * i);
        k.properties.title = QStringLiteral("Stop %1").arg(i);
        k.properties.durationToNextKP = 1000 * (i + 1);
        k.properties.durationPause = 250 * i;
        k.properties.font.family = QStringLiteral("Serif %1").arg(i);
        path.addKeyPoint(k, i == 3);
    }
    path.pathSegments[1].pilot.source = QStringLiteral("/avatars/bike.png");
    path.pathSegments[1].pilot.width = 80.25;
    path.pathSegments[1].pilot.flags = PilotProperties::isAnimated | PilotProperties::symmetric;

    MediaPoint onKey(path.keyPoints[2].x, path.keyPoints[2].y, 0);
    onKey.properties.imageSources.append(MediaFile{picture, 0});
    path.addMediaPoint(onKey, path.keyPoints[2].id, false);

    doc.photoPool().add(picture, 32, 16);
    doc.photoPool().fullFrameCropping = true;
    doc.altitudePreset().radius = 17;
    doc.altitudePreset().peakColor = QStringLiteral("#ABCDEF");
}

// The fields that come back from a file exactly as they were saved.
auto exactFields(const ProjectFields &f)
{
    return std::make_tuple(f.sceneMode, f.projectTitle, f.projectWidth, f.projectHeight, f.hostWidth, f.hostHeight,
                           f.sceneWidth, f.sceneHeight, f.pathMode, f.animationMode, f.animationFrameSource,
                           f.backgroundMap, f.backgroundMapColor, f.ignorePauseOnKeyPoint,
                           f.showKeyPointsOnAnimationPosition, f.animateKeyPoints, f.currentBearing,
                           f.centerPosition.longitude, f.centerPosition.y, f.visibleBoundariesTL.latitude,
                           f.visibleBoundariesBR.longitude, f.pseudoBoundariesTL.x, f.pseudoBoundariesBR.latitude,
                           f.showCompass, f.sendExportToHost, f.flyInEnabled, f.flyInRotation, f.flyInTilt,
                           f.linearAnimationDurations, f.pathSettings.toMap(), f.pad, f.fullFrameDuration,
                           f.fullFrameFadeDuration, f.fullFrameFullscreen, f.fullFrameTransitionMode,
                           f.altitudePresetIndex, f.altitudeBoardX, f.altitudeBoardY, f.altitudeBoardWidth,
                           f.altitudeBoardHeight, f.fullFrameX, f.fullFrameY, f.fullFrameWidth, f.fullFrameHeight,
                           f.pseudoMapCropMode, f.pseudoMapInitialZoom, f.pseudoMapCenter.longitude,
                           f.fileNameChangedByUser);
}

enum class Hindrance { None, FileSizeLimit, ReadOnlyFolder, ReadOnlyFile, FolderInTheWay };
enum class Writer { Project, Gpx, ThemeFile, ThemeIntoProject };

uid_t nobody()
{
    const passwd *entry = getpwnam("nobody");
    return entry ? entry->pw_uid : 65534;
}

// Runs `write` in a child process, under a small file size limit or, for a read-only
// folder, without the rights of root, which ignore folder permissions. The exit
// code: 0 written, 1 refused, anything else a broken run.
int writeInChild(const std::function<bool()> &write, Hindrance hindrance)
{
    const pid_t child = fork();
    if (child < 0)
        return -1;
    if (child == 0) {
        if (hindrance == Hindrance::FileSizeLimit) {
            std::signal(SIGXFSZ, SIG_IGN);
            const rlimit small{200, 200};
            if (setrlimit(RLIMIT_FSIZE, &small) != 0)
                _exit(3);
        }
        if (hindrance == Hindrance::ReadOnlyFolder && geteuid() == 0
            && (setgroups(0, nullptr) != 0 || setgid(nobody()) != 0 || setuid(nobody()) != 0))
            _exit(3);
        _exit(write() ? 0 : 1);
    }
    int status = 0;
    if (waitpid(child, &status, 0) != child || !WIFEXITED(status))
        return -1;
    return WEXITSTATUS(status);
}

} // namespace

class TestDocument : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }
    QString projectHeader(int version = 2) const
    {
        return QStringLiteral("[Header]\nprojecttype=ZKGEO\nprojectversion=%1\n").arg(version);
    }

private slots:
    void initTestCase()
    {
        // Silence the expected "missing key" lines.
        qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    }

    void newProjectKeepsOnlyTheHost()
    {
        PainterPathRenderer_Controller doc;
        doc.fields().projectTitle = QStringLiteral("x");
        doc.fields().hostName = QStringLiteral("Host");
        doc.timing().setDurationFactor(0.5);
        doc.setMaxAnimationDuration(3);
        doc.photoPool().add(QStringLiteral("/a.jpg"), 1, 1);
        doc.pathManager().activeChecked().addKeyPoint(1, 2, 0, QString(), true);
        doc.newProject();

        QVERIFY(doc.fields().projectTitle.isEmpty());
        QCOMPARE(doc.fields().hostName, QStringLiteral("Host"));
        QCOMPARE(doc.timing().durationFactor, -1.0);
        QCOMPARE(doc.timing().maxDurationIndex, 3u);
        QVERIFY(doc.photoPool().photos.empty());
        QVERIFY(doc.pathManager().active()->keyPoints.empty());
    }

    void saveThenLoadReproducesTheDocument()
    {

        PainterPathRenderer_Controller doc;
        fillDocument(doc, m_dir);
        const QString file = path(QStringLiteral("round trip.zkgeo"));
        QVERIFY(saveDocumentFile(doc, file));

        PainterPathRenderer_Controller back;
        const DocumentOpenResult result = openDocumentFile(back, file);
        QCOMPARE(int(result.status), int(DocumentOpenResult::Status::Project));

        const ProjectFields &a = doc.fields();
        const ProjectFields &b = back.fields();
        QVERIFY(exactFields(b) == exactFields(a));
        QCOMPARE(b.animationFrame, 0); // written as "animationFrame", read as "m_animationFrame"
        QCOMPARE(b.keyPointsLocked, false); // a loaded project is always unlocked
        QCOMPARE(b.currentZoomLevel, 1.234568);
        QCOMPARE(b.currentTilt, 30.0);

        const AnimationTiming &t = back.timing();
        QCOMPARE(t.flyInDuration, 9);
        QCOMPARE(t.flyInRotation, 33.3);
        QCOMPARE(t.flyInTilt, 44.4);
        QCOMPARE(t.durationFactor, 0.4);
        QCOMPARE(t.keyPointAnimationDuration, 4);

        const Path &p = doc.pathManager().activeChecked();
        const Path &q = back.pathManager().activeChecked();
        QCOMPARE(q.pathType, PathType::Ordinary);
        QCOMPARE(q.curveMode, CurveMode::Straight);
        QCOMPARE(q.keyPoints.size(), p.keyPoints.size());
        for (size_t i = 0; i < p.keyPoints.size(); ++i) {
            QCOMPARE(q.keyPoints[i].x, p.keyPoints[i].x);
            QCOMPARE(q.pathSegments[i].keyPointId, q.keyPoints[i].id);
            QCOMPARE(q.keyPoints[i].correspondingPathSegmentId, q.pathSegments[i].id);
        }
        QCOMPARE(q.pathSegments.size(), size_t(4));
        QCOMPARE(q.pathSegments[1].pilot.source, QStringLiteral("/avatars/bike.png"));
        QCOMPARE(q.pathSegments[1].pilot.flags, uint32_t(PilotProperties::isAnimated | PilotProperties::symmetric));
        QCOMPARE(q.pathSegments[0].pilot.flags, uint32_t(PilotProperties::rotation));
        QCOMPARE(q.curvePoints.size(), p.curvePoints.size()); // rebuilt after the load
        QCOMPARE(q.mediaPoints.size(), size_t(1));
        QCOMPARE(q.mediaPoints[0].longitude, p.keyPoints[2].x);
        QCOMPARE(back.naturalFrames(), 30 + 60 + 90);

        QCOMPARE(back.photoPool().photos.size(), size_t(1));
        QCOMPARE(back.photoPool().photos[0].sizeH, 16);
        QVERIFY(back.photoPool().fullFrameCropping);
        QCOMPARE(back.altitudePreset().peakColor, QStringLiteral("#ABCDEF"));

        // A second save of the loaded document gives the same bytes, apart from the
        // fields that do not come back by design.
        back.fields().animationFrame = a.animationFrame;
        back.fields().keyPointsLocked = a.keyPointsLocked;
        back.photoPool().photos[0].id = doc.photoPool().photos[0].id;
        const QString again = path(QStringLiteral("again.zkgeo"));
        QVERIFY(saveDocumentFile(back, again));
        QCOMPARE(readBytes(again), readBytes(file));
    }

    void trackPathKeepsItsCurve()
    {
        PainterPathRenderer_Controller doc;
        Path &route = doc.pathManager().activeChecked();
        route.pathType = PathType::GPX;
        route.curveMode = CurveMode::Straight;
        for (int i = 0; i < 50; ++i)
            route.addCurvePoint(8.0 + i * 0.001234567891234, 50.0 + std::sin(i) * 0.01, 100 + i);
        KeyPoint first(route.curvePoints.front().x, route.curvePoints.front().y, 100);
        KeyPoint last(route.curvePoints.back().x, route.curvePoints.back().y, 149);
        route.addKeyPoint(first, false);
        route.addKeyPoint(last, false);
        route.curvePoints.front().correspondingKeyPoint = route.keyPoints[0].id;
        route.curvePoints.back().correspondingKeyPoint = route.keyPoints[1].id;
        route.pathSegments[0].curvePoints = route.curvePoints;
        MediaPoint media(route.curvePoints[10].x, route.curvePoints[10].y, 0);
        route.addMediaPoint(media, 0, false);
        QCOMPARE(route.curvePoints[10].correspondingMediaPoint, route.mediaPoints[0].id);

        const QString file = path(QStringLiteral("track.zkgeo"));
        QVERIFY(saveDocumentFile(doc, file));
        PainterPathRenderer_Controller back;
        QCOMPARE(int(openDocumentFile(back, file).status), int(DocumentOpenResult::Status::Project));
        const Path &q = back.pathManager().activeChecked();
        QCOMPARE(q.pathType, PathType::GPX);
        QVERIFY(q.isFixedTrack());
        QCOMPARE(q.curvePoints.size(), size_t(50));
        for (size_t i = 0; i < 50; ++i)
            QVERIFY(q.curvePoints[i].x == route.curvePoints[i].x && q.curvePoints[i].y == route.curvePoints[i].y
                    && q.curvePoints[i].z == route.curvePoints[i].z);
        // References come back as ids of the loaded points.
        QCOMPARE(q.curvePoints.front().correspondingKeyPoint, q.keyPoints[0].id);
        QCOMPARE(q.curvePoints.back().correspondingKeyPoint, q.keyPoints[1].id);
        QCOMPARE(q.curvePoints[5].correspondingKeyPoint, 0u);
        QCOMPARE(q.curvePoints[10].correspondingMediaPoint, q.mediaPoints[0].id);
        QCOMPARE(q.pathSegments[0].curvePoints.size(), size_t(50));
        QCOMPARE(q.pathSegments[0].curvePoints.back().correspondingKeyPoint, q.keyPoints[1].id);

        // An ordinary path stores no curve.
        PainterPathRenderer_Controller plain;
        plain.pathManager().activeChecked().addKeyPoint(1, 2, 0, QString(), false);
        plain.pathManager().activeChecked().addKeyPoint(3, 4, 0, QString(), true);
        QVERIFY(!plain.pathManager().activeChecked().curvePoints.empty());
        const QString plainFile = path(QStringLiteral("plain.zkgeo"));
        QVERIFY(saveDocumentFile(plain, plainFile));
        QVERIFY(!readBytes(plainFile).contains("[curvepoint"));
        QVERIFY(readBytes(file).contains("[curvepoint49]"));
    }

    void photosKeepTheirPlacesOnAnOrdinaryRoute()
    {
        PainterPathRenderer_Controller doc;
        Path &route = doc.pathManager().activeChecked();
        route.curveMode = CurveMode::Smooth;
        const double coords[][2] = {{2.35, 48.85}, {4.83, 45.76}, {5.37, 43.30}};
        for (int i = 0; i < 3; ++i)
            route.addKeyPoint(coords[i][0], coords[i][1], 0, QString(), i == 2);
        MediaPoint onKey(route.keyPoints[1].x, route.keyPoints[1].y, 0);
        route.addMediaPoint(onKey, route.keyPoints[1].id, false);
        MediaPoint midLeg(route.curvePoints[100].x, route.curvePoints[100].y, 0);
        route.addMediaPoint(midLeg, 0, false);
        auto placeOf = [](const Path &p, size_t media) {
            for (size_t i = 0; i < p.curvePoints.size(); ++i)
                if (p.curvePoints[i].correspondingMediaPoint == p.mediaPoints[media].id)
                    return int(i);
            return -1;
        };
        const int keyPlace = placeOf(route, 0);
        QVERIFY(keyPlace > 100);
        QCOMPARE(placeOf(route, 1), 100);

        const QString file = path(QStringLiteral("photos.zkgeo"));
        QVERIFY(saveDocumentFile(doc, file));
        PainterPathRenderer_Controller back;
        QCOMPARE(int(openDocumentFile(back, file).status), int(DocumentOpenResult::Status::Project));
        const Path &q = back.pathManager().activeChecked();
        QCOMPARE(q.curvePoints.size(), route.curvePoints.size());
        QCOMPARE(q.mediaPoints.size(), size_t(2));
        QCOMPARE(placeOf(q, 0), keyPlace);
        QCOMPARE(placeOf(q, 1), 100);
    }

    void handWrittenOldProjects()
    {
        // Version 1: one font and size for all key points, one avatar for all segments,
        // no fly-in keys and the old route duration.
        const QString v1 = path(QStringLiteral("v1.zkgeo"));
        writeText(v1, (projectHeader(1) + QStringLiteral(
            "[animator]\ncurvemode=1\npathtype=1\n"
            "[kp_font]\nfamily=Courier\ncolor=#FF00FF\npointSize=30.5\nhasShadow=1\nhasFrame=0\n"
            "[keypoints]\nelements=3\nsize=2.5\n"
            "[keypoint0]\nx=1\ny=2\nkppDurationToNextKP=1000\n"
            "[keypoint1]\nx=3\ny=4\nkppDurationToNextKP=2000\nfamily=Own\n"
            "[keypoint2]\nx=5\ny=6\n"
            "[pilot]\npilot_source=/old/car.png\npilot_width=55.5\npilot_rotation=0\npilot_isAnimated=1\n"
            "[route]\nanimationDuration=50\n")).toUtf8());
        PainterPathRenderer_Controller doc;
        QCOMPARE(int(openDocumentFile(doc, v1).status), int(DocumentOpenResult::Status::Project));
        const Path &p = doc.pathManager().activeChecked();
        QCOMPARE(p.keyPoints.size(), size_t(3));
        QCOMPARE(p.keyPoints[0].properties.font.family, QStringLiteral("Courier"));
        QCOMPARE(p.keyPoints[0].properties.font.color, QStringLiteral("#FF00FF"));
        QCOMPARE(p.keyPoints[2].properties.font.pointSize, 30.5);
        QCOMPARE(p.keyPoints[2].properties.font.hasFrame, false);
        QCOMPARE(p.keyPoints[2].properties.size, 2.5);
        QCOMPARE(p.keyPoints[1].properties.font.family, QStringLiteral("Own"));
        for (const PathSegment &s : p.pathSegments) {
            QCOMPARE(s.pilot.source, QStringLiteral("/old/car.png"));
            QCOMPARE(s.pilot.width, 55.5);
            QCOMPARE(s.pilot.flags, uint32_t(PilotProperties::isAnimated));
        }
        QCOMPARE(doc.fields().flyInEnabled, false);
        QCOMPARE(doc.fields().flyInRotation, true);
        QCOMPARE(doc.timing().flyInDuration, 5);
        QCOMPARE(doc.timing().flyInRotation, 60.0);
        // 30 + 60 natural frames; the old 50 % becomes (0.5 * 9 + 1) of the base 1/15.
        QCOMPARE(doc.naturalFrames(), 90);
        QCOMPARE(doc.timing().durationFactor, 5.5 / 15.0);
        QCOMPARE(doc.timing().totalFrames, 3600);

        // Version 2 with fewer segments than key points, fly-in flags without values,
        // and neither route key: the segments stay as made, the factor as reset.
        const QString v2 = path(QStringLiteral("v2.zkgeo"));
        writeText(v2, (projectHeader() + QStringLiteral(
            "[animator]\ncurvemode=2\npathtype=1\n"
            "[flyIn]\nenabled=1\nenableRotation=0\nenableTilt=1\n"
            "[keypoints]\nelements=3\n[keypoint0]\nx=1\ny=2\n[keypoint1]\nx=3\ny=4\n[keypoint2]\nx=5\ny=6\n"
            "[pathSegments]\nelements=2\n"
            "[pathsegment0]\npilot_source=/seg0.png\n[pathsegment1]\npilot_source=/seg1.png\n"
            "[mediapoints]\nelements=2\n"
            "[mediapoint0]\nx=3\ny=4\nlongitude=3\nlatitude=4\n"
            "[mediapoint1]\nx=9\ny=9\nlongitude=9\nlatitude=9\n")).toUtf8());
        QCOMPARE(int(openDocumentFile(doc, v2).status), int(DocumentOpenResult::Status::Project));
        const Path &q = doc.pathManager().activeChecked();
        QCOMPARE(q.keyPoints.size(), size_t(3));
        QCOMPARE(q.pathSegments.size(), size_t(3));
        for (const PathSegment &s : q.pathSegments)
            QVERIFY(s.pilot.source.isEmpty());
        QCOMPARE(doc.fields().flyInEnabled, true);
        QCOMPARE(doc.fields().flyInRotation, false);
        QCOMPARE(doc.timing().flyInTilt, 54.0);
        QCOMPARE(doc.timing().durationFactor, -1.0);
        QCOMPARE(q.mediaPoints.size(), size_t(2));
    }

    void listsKeepTheEntriesAfterAGap_data()
    {
        QTest::addColumn<QString>("dropped");
        QTest::addColumn<QString>("list");
        QTest::addColumn<QStringList>("expected");
        QTest::newRow("key point") << "keypoint1" << "keyPoints" << QStringList{"k0", "k2"};
        QTest::newRow("media point") << "mediapoint1" << "mediaPoints" << QStringList{"m0", "m2"};
        QTest::newRow("photo") << "photopool_item1" << "photos" << QStringList{"/gone/p0.jpg", "/gone/p2.jpg"};
        QTest::newRow("curve point") << "curvepoint5" << "curve" << QStringList{"1", "2", "3", "4", "5", "7"};
        QTest::newRow("segment sample") << "pathsegment0curvepoint1" << "segment0" << QStringList{"1", "3", "4"};
    }

    // A track of samples x = 1..7 with key points on 1, 4 and 7 and photos on 2, 3 and 5.
    void listsKeepTheEntriesAfterAGap()
    {
        QFETCH(QString, dropped);
        QFETCH(QString, list);
        QFETCH(QStringList, expected);
        const uint32_t none = noPointIndex;
        const int keyAt[] = {0, 3, 6}, mediaAt[] = {1, 2, 4};
        auto sample = [&](const QString &section, int i) {
            const int key = int(std::find(std::begin(keyAt), std::end(keyAt), i) - std::begin(keyAt));
            const int media = int(std::find(std::begin(mediaAt), std::end(mediaAt), i) - std::begin(mediaAt));
            return QStringLiteral("[%1]\nx=%2\ny=1\ncorrespondingKeyPoint=%3\ncorrespondingMediaPoint=%4\n")
                .arg(section).arg(i + 1).arg(key < 3 ? uint32_t(key) : none).arg(media < 3 ? uint32_t(media) : none);
        };
        QString text = projectHeader() + QStringLiteral("[animator]\ncurvemode=1\npathtype=2\n[curvepoints]\nelements=7\n");
        for (int i = 0; i < 7; ++i)
            text += sample(QStringLiteral("curvepoint%1").arg(i), i);
        text += QStringLiteral("[keypoints]\nelements=3\n[pathSegments]\nelements=3\n"
                               "[mediapoints]\nelements=3\n[photopool]\nsize=3\n");
        for (int i = 0; i < 3; ++i) {
            text += QStringLiteral("[keypoint%1]\nx=%2\ny=1\nkppTitle=k%1\n").arg(i).arg(keyAt[i] + 1);
            text += QStringLiteral("[mediapoint%1]\nx=%2\ny=1\nlongitude=%2\nlatitude=1\nmppTitle=m%1\n").arg(i).arg(mediaAt[i] + 1);
            text += QStringLiteral("[photopool_item%1]\npath=/gone/p%1.jpg\n").arg(i);
            const int first = keyAt[i], last = i < 2 ? keyAt[i + 1] : 6;
            text += QStringLiteral("[pathsegment%1]\ncurvepoints=%2\n").arg(i).arg(last - first + 1);
            for (int j = first; j <= last; ++j)
                text += sample(QStringLiteral("pathsegment%1curvepoint%2").arg(i).arg(j - first), j);
        }
        const int at = text.indexOf(QLatin1Char('[') + dropped + QLatin1Char(']'));
        QVERIFY(at > 0);
        text.remove(at, text.indexOf(QLatin1Char('['), at + 1) - at);
        const QString file = path(QStringLiteral("gap.zkgeo"));
        writeText(file, text.toUtf8());

        PainterPathRenderer_Controller doc;
        QCOMPARE(int(openDocumentFile(doc, file).status), int(DocumentOpenResult::Status::Project));
        const Path &p = doc.pathManager().activeChecked();
        QStringList found;
        if (list == QLatin1String("keyPoints")) {
            for (const KeyPoint &k : p.keyPoints)
                found << k.properties.title;
        } else if (list == QLatin1String("mediaPoints")) {
            for (const MediaPoint &m : p.mediaPoints)
                found << m.properties.title;
        } else if (list == QLatin1String("photos")) {
            for (const PoolPhoto &photo : doc.photoPool().photos)
                found << photo.path;
        } else {
            for (const CurvePoint &c : list == QLatin1String("curve") ? p.curvePoints : p.pathSegments.at(0).curvePoints)
                found << QString::number(c.x);
        }
        QCOMPARE(found, expected);

        // The samples still name the points that stand on them.
        for (const CurvePoint &c : p.curvePoints) {
            if (const BasePoint *k = p.findPoint(c.correspondingKeyPoint))
                QCOMPARE(k->x, c.x);
            if (const BasePoint *m = p.findPoint(c.correspondingMediaPoint))
                QCOMPARE(m->x, c.x);
        }
        QCOMPARE(p.curvePoints.back().correspondingKeyPoint, p.keyPoints.back().id);
        QCOMPARE(p.curvePoints[4].correspondingMediaPoint, p.mediaPoints.back().id);
    }

    void avatarsMoveToThisInstallation_data()
    {
        QTest::addColumn<QString>("sections");
        const QString keyPoints = QStringLiteral(
            "[keypoints]\nelements=2\n[keypoint0]\nx=1\ny=2\n[keypoint1]\nx=3\ny=4\n");
        const QString avatar = QStringLiteral("pilot_source=C:/Program Files/Old/imgsrc/pilots/car.png\n"
                                              "pilot_thumb=file:///D:/Old/imgsrc/pilots/car_t.png\n");
        QTest::newRow("segments") << keyPoints + QStringLiteral("[pathSegments]\nelements=2\n[pathsegment0]\n") + avatar +
                                         QStringLiteral("[pathsegment1]\n") + avatar;
        QTest::newRow("one avatar of version 1") << keyPoints + QStringLiteral("[pilot]\n") + avatar;
    }

    void avatarsMoveToThisInstallation()
    {
        QFETCH(QString, sections);
        const QString file = path(QStringLiteral("moved.zkgeo"));
        writeText(file, (projectHeader() + QStringLiteral("[animator]\ncurvemode=1\npathtype=1\n") + sections).toUtf8());
        setProgramFolder(QStringLiteral("/opt/tourlet"));
        PainterPathRenderer_Controller doc;
        const DocumentOpenResult result = openDocumentFile(doc, file);
        setProgramFolder(QString());
        QCOMPARE(int(result.status), int(DocumentOpenResult::Status::Project));
        const Path &p = doc.pathManager().activeChecked();
        QCOMPARE(p.pathSegments.size(), size_t(2));
        for (const PathSegment &s : p.pathSegments) {
            QCOMPARE(s.pilot.source, QStringLiteral("/opt/tourlet/imgsrc/pilots/car.png"));
            QCOMPARE(s.pilot.thumb, QStringLiteral("file:///opt/tourlet/imgsrc/pilots/car_t.png"));
        }
    }

    void themeInTheSameWritingGivesTheSameBytes()
    {
        PainterPathRenderer_Controller doc;
        fillDocument(doc, m_dir);
        doc.altitudePreset().background = QStringLiteral("C:\\boards\\one, two.png");

        const QString twoSteps = path(QStringLiteral("two steps.zkgeo"));
        QVERIFY(doc.SaveProject(twoSteps));
        QVERIFY(doc.saveAltitudePreset(twoSteps, altitudePresetPrefix(), doc.altitudePreset()));
        const QString oneStep = path(QStringLiteral("one step.zkgeo"));
        QVERIFY(doc.SaveProjectWithTheme(oneStep));
        QVERIFY(readBytes(oneStep).contains("[altprs.graph]"));
        QCOMPARE(readBytes(oneStep), readBytes(twoSteps));
    }

    void keyOrderDoesNotMatter()
    {
        PainterPathRenderer_Controller doc;
        fillDocument(doc, m_dir);
        const QString file = path(QStringLiteral("ordered.zkgeo"));
        QVERIFY(saveDocumentFile(doc, file));

        // Rewrite the file by hand: sections and the lines inside them shuffled.
        QList<QStringList> sections;
        for (const QString &line : QString::fromUtf8(readBytes(file)).split(QLatin1Char('\n'), Qt::SkipEmptyParts)) {
            if (line.startsWith(QLatin1Char('[')))
                sections.append(QStringList{line});
            else
                sections.last().append(line);
        }
        QRandomGenerator random(20240601);
        QByteArray shuffled;
        while (!sections.isEmpty()) {
            QStringList section = sections.takeAt(int(random.bounded(sections.size())));
            const QString heading = section.takeFirst();
            shuffled += heading.toUtf8() + '\n';
            while (!section.isEmpty())
                shuffled += section.takeAt(int(random.bounded(section.size()))).toUtf8() + '\n';
        }
        const QString mixed = path(QStringLiteral("mixed.zkgeo"));
        writeText(mixed, shuffled);
        QVERIFY(readBytes(mixed) != readBytes(file));

        PainterPathRenderer_Controller fromOrdered, fromMixed;
        QVERIFY(openDocumentFile(fromOrdered, file).ok());
        QVERIFY(openDocumentFile(fromMixed, mixed).ok());
        const QString a = path(QStringLiteral("a.zkgeo")), b = path(QStringLiteral("b.zkgeo"));
        fromMixed.photoPool().photos[0].id = fromOrdered.photoPool().photos[0].id;
        QVERIFY(saveDocumentFile(fromOrdered, a));
        QVERIFY(saveDocumentFile(fromMixed, b));
        QCOMPARE(readBytes(b), readBytes(a));
    }

    // Projects found by fuzzing: each opens, and what it saves opens again.
    void fuzzFindsOpenAfterSaving_data()
    {
        QTest::addColumn<QString>("file");
        for (const QFileInfo &found : QDir(QStringLiteral(TOURLET_TEST_DATA)).entryInfoList({QStringLiteral("*.zkgeo")}))
            QTest::newRow(qPrintable(found.fileName())) << found.filePath();
    }

    void fuzzFindsOpenAfterSaving()
    {
        QFETCH(QString, file);
        PainterPathRenderer_Controller doc;
        QCOMPARE(int(openDocumentFile(doc, file).status), int(DocumentOpenResult::Status::Project));
        const QString saved = path(QStringLiteral("fuzz find.zkgeo"));
        QVERIFY(saveDocumentFile(doc, saved));
        PainterPathRenderer_Controller again;
        QCOMPARE(int(openDocumentFile(again, saved).status), int(DocumentOpenResult::Status::Project));
        QCOMPARE(again.pathManager().activeChecked().curvePoints.size(), doc.pathManager().activeChecked().curvePoints.size());
    }

    void damagedAndForeignFiles()
    {
        PainterPathRenderer_Controller doc;
        const QString damaged = path(QStringLiteral("damaged.zkgeo"));
        writeText(damaged, (projectHeader() + QStringLiteral(
            "[animator]\nprojectTitle=Half read\n"
            "[keypoints]\nelements=1\n[keypoint0]\nx=1\ny=north\n")).toUtf8());
        doc.pathManager().activeChecked().addKeyPoint(1, 2, 0, QString(), true);
        DocumentOpenResult result = openDocumentFile(doc, damaged);
        QCOMPARE(int(result.status), int(DocumentOpenResult::Status::DamagedProject));
        QVERIFY(!result.reason.isEmpty());
        QVERIFY(doc.fields().projectTitle.isEmpty()); // back to a new project
        QVERIFY(doc.pathManager().activeChecked().keyPoints.empty());
        QVERIFY(doc.projectController().isIdle());

        // A coordinate that is no finite number is damage too, wherever a point stands.
        for (const char *point : {"[keypoints]\nelements=1\n[keypoint0]\nx=nan\n",
                                  "[keypoints]\nelements=1\n[keypoint0]\nx=1\nlatitude=-inf\n",
                                  "[centerPosition]\naltitude=infinity\n"}) {
            writeText(damaged, projectHeader().toUtf8() + point);
            QCOMPARE(int(openDocumentFile(doc, damaged).status), int(DocumentOpenResult::Status::DamagedProject));
        }

        writeText(damaged, (projectHeader() + QStringLiteral("[animator]\nprojectWidth=99999999999\n")).toUtf8());
        QCOMPARE(int(openDocumentFile(doc, damaged).status), int(DocumentOpenResult::Status::DamagedProject));
        QCOMPARE(doc.fields().projectWidth, 1920);

        // A path type that is no number is taken as 0, not as damage.
        writeText(damaged, (projectHeader() + QStringLiteral("[animator]\npathtype=gpx\nprojectTitle=t\n")).toUtf8());
        QVERIFY(openDocumentFile(doc, damaged).ok());
        QCOMPARE(doc.fields().projectTitle, QStringLiteral("t"));

        const QString garbage = path(QStringLiteral("garbage.zkgeo"));
        QByteArray noise(4096, '\0');
        QRandomGenerator random(7);
        for (char &c : noise)
            c = char(random.bounded(256));
        writeText(garbage, noise);
        result = openDocumentFile(doc, garbage);
        QCOMPARE(int(result.status), int(DocumentOpenResult::Status::Unreadable));
        QVERIFY(!result.reason.isEmpty());
        QCOMPARE(int(openDocumentFile(doc, path(QStringLiteral("absent.zkgeo"))).status),
                 int(DocumentOpenResult::Status::Unreadable));
        QVERIFY(doc.projectController().isIdle());

        // Every cut of a real project loads or fails cleanly, never crashes.
        PainterPathRenderer_Controller full;
        fillDocument(full, m_dir);
        const QString whole = path(QStringLiteral("whole.zkgeo"));
        QVERIFY(saveDocumentFile(full, whole));
        const QByteArray bytes = readBytes(whole);
        int loaded = 0;
        for (int cut = 0; cut < bytes.size(); cut += 97) {
            const QString truncated = path(QStringLiteral("cut.zkgeo"));
            writeText(truncated, bytes.left(cut));
            const DocumentOpenResult r = openDocumentFile(doc, truncated);
            loaded += r.ok() ? 1 : 0;
            QVERIFY(doc.projectController().isIdle());
        }
        QVERIFY(loaded > 0);
    }

    // A write that can't be completed leaves everything in the folder as it was: the
    // previous file byte for byte, a ".bak" beside it, and no file of its own.
    void failedWriteLeavesThePreviousFile_data()
    {
        QTest::addColumn<int>("writer");
        QTest::addColumn<int>("hindrance");
        QTest::addColumn<bool>("withBackup");
        QTest::addColumn<bool>("written");
        const std::pair<Writer, const char *> writers[] = {{Writer::Project, "project"},
                                                            {Writer::Gpx, "gpx"},
                                                            {Writer::ThemeFile, "theme file"},
                                                            {Writer::ThemeIntoProject, "theme into project"}};
        for (const auto &w : writers) {
            const auto row = [&](const char *what, Hindrance h, bool backup, bool written) {
                QTest::addRow("%s, %s", w.second, what) << int(w.first) << int(h) << backup << written;
            };
            row("written", Hindrance::None, true, true);
            row("file size limit", Hindrance::FileSizeLimit, false, false);
            row("file size limit, .bak", Hindrance::FileSizeLimit, true, false);
            row("read-only folder, .bak", Hindrance::ReadOnlyFolder, true, false);
            row("read-only file", Hindrance::ReadOnlyFile, false, false);
            row("folder in the way", Hindrance::FolderInTheWay, false, false);
        }
    }

    void failedWriteLeavesThePreviousFile()
    {
        QFETCH(int, writer);
        QFETCH(int, hindrance);
        QFETCH(bool, withBackup);
        QFETCH(bool, written);
        const Hindrance hinder = Hindrance(hindrance);

        PainterPathRenderer_Controller doc;
        fillDocument(doc, m_dir);
        Path &route = doc.pathManager().activeChecked();

        const char *names[] = {"tour.zkgeo", "route.gpx", "board.tmprs", "tour.zkgeo"};
        const QString folder = path(QString::fromLatin1(QTest::currentDataTag()));
        QVERIFY(QDir().mkpath(folder));
        const QString target = folder + QLatin1Char('/') + QLatin1String(names[writer]);
        if (hinder == Hindrance::FolderInTheWay) {
            QVERIFY(QDir().mkpath(target));
            writeText(target + QStringLiteral("/inside"), "not to be moved");
        } else {
            writeText(target, (projectHeader() + QStringLiteral("[keep]\nme=yes\n")).toUtf8());
        }
        if (withBackup)
            writeText(target + QStringLiteral(".bak"), "the user's own copy");
        if (hinder == Hindrance::ReadOnlyFile)
            QVERIFY(QFile::setPermissions(target, QFileDevice::ReadOwner | QFileDevice::ReadGroup));
        if (hinder == Hindrance::ReadOnlyFolder) {
            QVERIFY(QFile::setPermissions(m_dir.path(), QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner
                                                             | QFileDevice::ReadOther | QFileDevice::ExeOther));
            // The file itself stays writable for the writer: only the folder stops it.
            if (geteuid() == 0)
                QCOMPARE(chown(QFile::encodeName(target).constData(), nobody(), gid_t(-1)), 0);
            QVERIFY(QFile::setPermissions(folder, QFileDevice::ReadOwner | QFileDevice::ExeOwner | QFileDevice::ReadOther
                                                      | QFileDevice::ExeOther));
        }

        const std::function<bool()> write = [&] {
            switch (Writer(writer)) {
            case Writer::Project:
                return saveDocumentFile(doc, target);
            case Writer::Gpx:
                return GpxWriter::write(target, route.curvePoints, route);
            case Writer::ThemeFile:
                return saveAltitudePreset(doc.projectController(), target, QString(), doc.altitudePreset());
            case Writer::ThemeIntoProject:
                return saveAltitudePreset(doc.projectController(), target, altitudePresetPrefix(), doc.altitudePreset());
            }
            return false;
        };
        const QMap<QString, QByteArray> before = folderSnapshot(folder);
        const int result = writeInChild(write, hinder);
        const QMap<QString, QByteArray> after = folderSnapshot(folder);
        QFile::setPermissions(folder, QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);

        QCOMPARE(result, written ? 0 : 1);
        QCOMPARE(after.keys(), before.keys());
        for (const QString &name : before.keys()) {
            if (written && folder + QLatin1Char('/') + name == target)
                QVERIFY(after.value(name) != before.value(name));
            else
                QCOMPARE(after.value(name), before.value(name));
        }
    }
};

QTEST_GUILESS_MAIN(TestDocument)
#include "tst_document.moc"

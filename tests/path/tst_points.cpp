#include "app/ProgramFolder.h"
#include "path/ContentPath.h"
#include "path/CurvePoint.h"
#include "path/DefaultTitle.h"
#include "path/IdCounter.h"
#include "path/KeyPoints.h"
#include "path/MediaPoint.h"
#include "project/NumberedSections.h"
#include "project/QProjectController.h"
#include "project/ValueParsers.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QMap>
#include <QTemporaryDir>
#include <QTest>
#include <QUrl>

#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
#include <exiv2/exiv2.hpp>
#pragma GCC diagnostic pop

#include <limits>

namespace {

// Keeps what is written in order and answers reads from the same store, so
// tests can look at the key order and feed hand-made sections.
class MemoryStore : public ProjectController
{
public:
    struct Entry
    {
        QString section, key, value;
    };

    bool writeProperty(QString section, QString key, QString value) override
    {
        written.append({section, key, value});
        values.insert(section + QLatin1Char('/') + key, value);
        return true;
    }
    QString readProperty(QString section, QString key, QString defaultValue) override
    {
        return values.value(section + QLatin1Char('/') + key, defaultValue);
    }
    std::vector<int32_t> numberedSections(QString stem, int32_t count) override
    {
        NumberedSections sections;
        for (auto it = values.cbegin(); it != values.cend(); ++it)
            sections.add(it.key().section(QLatin1Char('/'), 0, 0));
        return sections.below(stem, count);
    }

    void set(const QString &section, const QString &key, const QString &value)
    {
        values.insert(section + QLatin1Char('/') + key, value);
    }
    QStringList keysOf(const QString &section) const
    {
        QStringList keys;
        for (const Entry &e : written)
            if (e.section == section)
                keys << e.key;
        return keys;
    }
    QString value(const QString &section, const QString &key) const
    {
        return values.value(section + QLatin1Char('/') + key);
    }

    QVector<Entry> written;
    QMap<QString, QString> values;
};

const QStringList fontKeys = {"family", "color", "pointSize", "hasShadow", "hasFrame", "style"};

void writeJpeg(const QString &file, int orientation)
{
    QImage image(8, 6, QImage::Format_RGB32);
    image.fill(Qt::darkGreen);
    QVERIFY(image.save(file, "JPG"));
    if (orientation < 0)
        return;
    auto picture = Exiv2::ImageFactory::open(QFile::encodeName(file).toStdString());
    picture->readMetadata();
    picture->exifData()["Exif.Image.Orientation"] = uint16_t(orientation);
    picture->writeMetadata();
}

} // namespace

class TestPoints : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }

private slots:
    void init()
    {
        setDefaultPointTitle(QString());
        setProgramFolder(QString());
        resetDefaultKeyPointTitleCounter();
    }

    void idsAreDrawnByConstructorsOnly()
    {
        KeyPoint a;
        CurvePoint b(1, 2, 3);
        MediaPoint c;
        KeyPoint d(4, 5, 6, QStringLiteral("d"));
        QVERIFY(a.id != 0);
        // One counter for all kinds of point.
        QCOMPARE(b.id, a.id + 1);
        QCOMPARE(c.id, a.id + 2);
        QCOMPARE(d.id, a.id + 3);

        KeyPoint copy(d);
        QCOMPARE(copy.id, d.id);
        QCOMPARE(copy.name, QStringLiteral("d"));
        KeyPoint assigned;
        QVERIFY(assigned.id != d.id);
        assigned = d;
        QCOMPARE(assigned.id, d.id);

        KeyPoint moved(std::move(copy));
        QCOMPARE(moved.id, d.id);
        QCOMPARE(moved.name, QStringLiteral("d"));
        QCOMPARE(moved.x, 4.0);
        QCOMPARE(copy.id, 0u);
        QVERIFY(copy.name.isEmpty());
        QCOMPARE(copy.x, 0.0);

        MediaPoint m(7, 8, 9);
        m.properties.imageSources.append({QStringLiteral("/a.jpg"), 90});
        const uint32_t mid = m.id;
        MediaPoint target;
        target = std::move(m);
        QCOMPARE(target.id, mid);
        QCOMPARE(target.properties.imageSources.size(), 1);
        QCOMPARE(m.id, 0u);
        QVERIFY(m.properties.imageSources.isEmpty());

        // Copies inside a container keep the ids; the vector's own moves do too.
        QVector<KeyPoint> list;
        list.append(a);
        list.append(d);
        list.insert(0, KeyPoint());
        QCOMPARE(list.at(1).id, a.id);
        QCOMPARE(list.at(2).id, d.id);
        QVERIFY(list.at(0).id > d.id);

        // A counter that runs over starts at 1 again: 0 means no point.
        IdCounter nearTheEnd(0xFFFFFFFEu);
        QCOMPARE(nearTheEnd.draw(), 0xFFFFFFFEu);
        QCOMPARE(nearTheEnd.draw(), 0xFFFFFFFFu);
        QCOMPARE(nearTheEnd.draw(), 1u);
    }

    void constructorsAndSetters()
    {
        setDefaultPointTitle(QStringLiteral("Waypoint"));
        KeyPoint k(8.5, 47.3, 410.0);
        QCOMPARE(k.longitude, 8.5);
        QCOMPARE(k.latitude, 47.3);
        QCOMPARE(k.altitude, 410.0);
        QCOMPARE(k.type, 1);
        QCOMPARE(k.title(), QStringLiteral("Waypoint"));
        QCOMPARE(k.properties.font.family, QStringLiteral("Arial"));
        QCOMPARE(k.properties.font.color, QStringLiteral("#000000"));
        QCOMPARE(k.properties.durationToNextKP, 3000);
        QCOMPARE(k.properties.durationPause, 500);

        k.setLongitude(9.0, false);
        k.setLatitude(48.0, false);
        k.setAltitude(500.0, false);
        QCOMPARE(k.x, 8.5);
        QCOMPARE(k.y, 47.3);
        QCOMPARE(k.z, 410.0);
        QCOMPARE(k.longitude, 9.0);
        k.setLongitude(10.0, true);
        k.setLatitude(49.0, true);
        k.setAltitude(600.0, true);
        QCOMPARE(k.x, 10.0);
        QCOMPARE(k.y, 49.0);
        QCOMPARE(k.z, 600.0);
        QCOMPARE(k.altitude, 600.0);

        MediaPoint m;
        QCOMPARE(m.title(), QStringLiteral("Waypoint"));
        m.setLatitude(3.0, true);
        QCOMPARE(m.y, 3.0);
    }

    void keyPointKeyOrderAndMediaTemplate()
    {
        KeyPoint k(1, 2, 3, QStringLiteral("Bern"));
        k.tt = 7;
        k.correspondingPathSegmentId = 4;
        MemoryStore store;
        k.Save(store, QStringLiteral("kp"));
        QStringList expected = {"x", "y", "z", "tt", "longitude", "latitude", "altitude", "name", "type",
                                "kppTitle", "kppEnabled", "kppIsMediaTemplate", "kppDurationToNextKP", "kppSize",
                                "kppDurationPause", "kppIndexPosition", "kppImageSource", "kppMediaSource"};
        expected << fontKeys << QStringLiteral("correspondingPathSegmentId");
        QCOMPARE(store.keysOf(QStringLiteral("kp")), expected);
        QCOMPARE(store.value(QStringLiteral("kp"), QStringLiteral("kppEnabled")), QStringLiteral("1"));
        QCOMPARE(store.value(QStringLiteral("kp"), QStringLiteral("hasShadow")), QStringLiteral("0"));
        QCOMPARE(store.value(QStringLiteral("kp"), QStringLiteral("kppSize")), QStringLiteral("1.000000"));
        QCOMPARE(store.value(QStringLiteral("kp"), QStringLiteral("correspondingPathSegmentId")), QStringLiteral("4"));

        k.properties.isMediaTemplate = true;
        k.properties.mediaSizeW = 120;
        k.properties.mediaSizeH = 80;
        k.properties.mediaCenterOffsetX = 0.25;
        k.properties.mediaCenterOffsetY = -0.5;
        MemoryStore templ;
        k.Save(templ, QStringLiteral("kp"));
        expected.insert(12, QStringLiteral("kppMediaCenterOffsetY"));
        expected.insert(12, QStringLiteral("kppMediaCenterOffsetX"));
        expected.insert(12, QStringLiteral("kppMediaSizeH"));
        expected.insert(12, QStringLiteral("kppMediaSizeW"));
        QCOMPARE(templ.keysOf(QStringLiteral("kp")), expected);

        KeyPoint back;
        back.Load(templ, QStringLiteral("kp"));
        QCOMPARE(back.properties.mediaSizeW, 120.0);
        QCOMPARE(back.properties.mediaCenterOffsetY, -0.5);

        // The template flag read first decides whether the four keys count.
        templ.set(QStringLiteral("kp"), QStringLiteral("kppIsMediaTemplate"), QStringLiteral("0"));
        KeyPoint plain;
        plain.Load(templ, QStringLiteral("kp"));
        QVERIFY(!plain.properties.isMediaTemplate);
        QCOMPARE(plain.properties.mediaSizeW, 0.0);
        QCOMPARE(plain.properties.mediaSizeH, 0.0);
        QCOMPARE(plain.properties.mediaCenterOffsetX, 0.0);
        QCOMPARE(plain.properties.mediaCenterOffsetY, 0.0);
        QCOMPARE(plain.name, QStringLiteral("Bern"));
        QCOMPARE(plain.tt, 7);
    }

    void missingKeysKeepDefaults()
    {
        setDefaultPointTitle(QStringLiteral("Stop"));
        MemoryStore store;
        store.set(QStringLiteral("a"), QStringLiteral("x"), QStringLiteral("5.5"));
        store.set(QStringLiteral("b"), QStringLiteral("type"), QStringLiteral("0"));
        store.set(QStringLiteral("b"), QStringLiteral("kppTitle"), QString()); // an empty title never replaces
        store.set(QStringLiteral("b"), QStringLiteral("pointSize"), QStringLiteral("24.5"));
        store.set(QStringLiteral("b"), QStringLiteral("style"), QStringLiteral("4294967295"));

        KeyPoint a;
        a.Load(store, QStringLiteral("a"));
        QCOMPARE(a.x, 5.5);
        QCOMPARE(a.type, 1);
        QCOMPARE(a.title(), QStringLiteral("Stop"));
        QCOMPARE(a.properties.size, 1.0);
        QCOMPARE(a.properties.durationToNextKP, 3000);
        QVERIFY(a.properties.enabled);
        QVERIFY(a.properties.font.hasFrame);
        QCOMPARE(a.properties.font.pointSize, 18.0);

        KeyPoint b;
        b.Load(store, QStringLiteral("b"));
        QCOMPARE(b.type, 0);
        QCOMPARE(b.title(), QStringLiteral("Stop"));
        QCOMPARE(b.properties.font.pointSize, 24.5);
        QCOMPARE(b.properties.font.style, std::numeric_limits<uint32_t>::max());

        MediaPoint m;
        m.Load(store, QStringLiteral("b"));
        QCOMPARE(m.type, 0);
        QCOMPARE(m.properties.durationPause, 500);

        // A damaged number ends the load instead of passing for a missing key.
        store.set(QStringLiteral("c"), QStringLiteral("kppDurationPause"), QStringLiteral("soon"));
        KeyPoint c;
        QVERIFY_EXCEPTION_THROWN(c.Load(store, QStringLiteral("c")), DamagedNumberError);
    }

    void coordinatesExactDoublesRounded()
    {
        const double awkward = 0.1 + 0.2;
        KeyPoint k(1.23456789, awkward, -0.000123456789012345);
        k.setLatitude(47.123456789012345, false);
        k.properties.size = 1.23456789;
        k.properties.font.pointSize = 11.0000004;
        k.properties.title = QStringLiteral("Zürich, \"Altstadt\"; 1=2");
        k.properties.imageSource = QStringLiteral("/home/u/my symbols/a.png");

        const QString file = path(QStringLiteral("coords.zkgeo"));
        QProjectController c;
        QVERIFY(c.createProjectFile(file));
        k.Save(c, QStringLiteral("keypoint0"));
        c.closeProjectFile();

        QVERIFY(c.openProjectFile(file, true));
        KeyPoint back;
        back.Load(c, QStringLiteral("keypoint0"));
        c.closeProjectFile();
        QVERIFY(back.x == 1.23456789);
        QVERIFY(back.y == awkward);
        QVERIFY(back.z == -0.000123456789012345);
        QVERIFY(back.longitude == 1.23456789);
        QVERIFY(back.latitude == 47.123456789012345);
        QCOMPARE(back.properties.size, 1.234568);
        QCOMPARE(back.properties.font.pointSize, 11.0);
        QCOMPARE(back.title(), k.title());
        QCOMPARE(back.properties.imageSource, k.properties.imageSource);
        QVERIFY(back.id != k.id);
    }

    void curveAndMediaPointRecords()
    {
        CurvePoint cp(3.25, 4.5, 1e-9);
        cp.tt = -2;
        cp.correspondingKeyPoint = 3;
        cp.correspondingMediaPoint = noPointIndex;
        MemoryStore store;
        cp.Save(store, QStringLiteral("curvepoint0"));
        QCOMPARE(store.keysOf(QStringLiteral("curvepoint0")),
                 QStringList({"x", "y", "z", "tt", "correspondingKeyPoint", "correspondingMediaPoint"}));
        CurvePoint cb;
        cb.Load(store, QStringLiteral("curvepoint0"));
        QVERIFY(cb.z == 1e-9);
        QCOMPARE(cb.tt, -2);
        QCOMPARE(cb.correspondingKeyPoint, 3u);
        QCOMPARE(cb.correspondingMediaPoint, noPointIndex);

        MediaPoint mp(6, 7, 8);
        mp.name = QStringLiteral("lake");
        mp.properties.durationPause = 4000;
        mp.properties.enabled = false;
        mp.properties.imageSources = {{QStringLiteral("/nowhere/a.jpg"), 90}, {QStringLiteral("/nowhere/b.jpg"), 0}};
        mp.Save(store, QStringLiteral("mediapoint0"));
        QCOMPARE(store.keysOf(QStringLiteral("mediapoint0")),
                 QStringList({"x", "y", "z", "tt", "longitude", "latitude", "altitude", "name", "type", "mppTitle",
                              "mppEnabled", "mppDurationToNextKP", "mppDurationPause", "mppIndexPosition",
                              "mppFileListCount", "mppImageSource0", "mppImageSource1"}));
        MediaPoint mb;
        mb.Load(store, QStringLiteral("mediapoint0"));
        QCOMPARE(mb.name, QStringLiteral("lake"));
        QVERIFY(!mb.properties.enabled);
        QCOMPARE(mb.properties.durationPause, 4000);
        QCOMPARE(mb.properties.imageSources.size(), 2);
        QCOMPARE(mb.properties.imageSources.at(1).path, QStringLiteral("/nowhere/b.jpg"));
        // The orientation is not stored; an unreadable file gives none.
        QCOMPARE(mb.properties.imageSources.at(0).orientation, 0);

        // A count beyond the stored entries stops at the first gap.
        store.set(QStringLiteral("mediapoint0"), QStringLiteral("mppFileListCount"), QStringLiteral("2000000000"));
        MediaPoint damaged;
        damaged.Load(store, QStringLiteral("mediapoint0"));
        QCOMPARE(damaged.properties.imageSources.size(), 2);
    }

    void keyPointListRoundTrip()
    {
        QVector<KeyPoint> points;
        for (int i = 0; i < 3; ++i) {
            KeyPoint k(i, i * 2.0, 0.0, QStringLiteral("p%1").arg(i));
            k.properties.indexPosition = i;
            k.correspondingPathSegmentId = 100 + i; // segment ids of this run
            points.append(k);
        }
        setDefaultKeyPointTitleCounter(9);
        const QVector<uint32_t> segmentIds = {100, 101, 102};
        MemoryStore store;
        QVERIFY(saveKeyPoints(store, points, [&](uint32_t segmentId) {
            const int at = segmentIds.indexOf(segmentId);
            return at < 0 ? noPointIndex : uint32_t(at);
        }));
        QCOMPARE(store.value(QStringLiteral("keypoints"), QStringLiteral("elements")), QStringLiteral("3"));
        QCOMPARE(store.value(QStringLiteral("keypoints"), QStringLiteral("defaultKeyPointTitleCounter")), QStringLiteral("9"));
        QCOMPARE(store.value(QStringLiteral("keypoint2"), QStringLiteral("correspondingPathSegmentId")), QStringLiteral("2"));
        QCOMPARE(points.at(2).correspondingPathSegmentId, 102u); // the live point keeps the id

        resetDefaultKeyPointTitleCounter();
        QVector<KeyPoint> first, second;
        QVERIFY(loadKeyPoints(store, 2, first));
        QCOMPARE(defaultKeyPointTitleCounter(), 9u);
        QVERIFY(loadKeyPoints(store, 2, second));
        QCOMPARE(first.size(), 3);
        QCOMPARE(second.size(), 3);
        for (int i = 0; i < 3; ++i) {
            QCOMPARE(first.at(i).name, QStringLiteral("p%1").arg(i));
            QCOMPARE(first.at(i).properties.indexPosition, i);
            // Each load draws new ids; the file's references are indices and stay right.
            QCOMPARE(first.at(i).correspondingPathSegmentId, uint32_t(i));
            QVERIFY(first.at(i).id != second.at(i).id);
            QVERIFY(first.at(i).id != points.at(i).id);
        }
        QVERIFY(first.at(0).id != first.at(1).id);

        // Without a stored counter the next title number follows the count.
        store.values.remove(QStringLiteral("keypoints/defaultKeyPointTitleCounter"));
        QVector<KeyPoint> third;
        QVERIFY(loadKeyPoints(store, 2, third));
        QCOMPARE(defaultKeyPointTitleCounter(), 4u);

        // A count larger than the sections present loads those there are.
        store.set(QStringLiteral("keypoints"), QStringLiteral("elements"), QStringLiteral("1000000"));
        QVector<KeyPoint> damaged;
        QVERIFY(loadKeyPoints(store, 2, damaged));
        QCOMPARE(damaged.size(), 3);

        MemoryStore empty;
        QVector<KeyPoint> none;
        QVERIFY(!loadKeyPoints(empty, 2, none));
        QVERIFY(none.isEmpty());
    }

    void oldFormatSharesFontAndSize()
    {
        MemoryStore store;
        store.set(QStringLiteral("keypoints"), QStringLiteral("elements"), QStringLiteral("2"));
        store.set(QStringLiteral("kp_font"), QStringLiteral("family"), QStringLiteral("Courier"));
        store.set(QStringLiteral("kp_font"), QStringLiteral("color"), QStringLiteral("#FF0000"));
        store.set(QStringLiteral("kp_font"), QStringLiteral("hasShadow"), QStringLiteral("1"));
        for (int i = 0; i < 2; ++i)
            store.set(QStringLiteral("keypoint%1").arg(i), QStringLiteral("x"), QString::number(i));
        // The second point carries a font key of its own, which wins over the shared one.
        store.set(QStringLiteral("keypoint1"), QStringLiteral("family"), QStringLiteral("Serif"));

        for (uint32_t version : {0u, 1u}) {
            QVector<KeyPoint> points;
            QVERIFY(loadKeyPoints(store, version, points));
            QCOMPARE(points.size(), 2);
            QCOMPARE(points.at(0).properties.size, 1.0);
            QCOMPARE(points.at(0).properties.font.family, QStringLiteral("Courier"));
            QCOMPARE(points.at(1).properties.font.family, QStringLiteral("Serif"));
            for (const KeyPoint &k : points) {
                QCOMPARE(k.properties.font.color, QStringLiteral("#FF0000"));
                QVERIFY(k.properties.font.hasShadow);
                QVERIFY(k.properties.font.hasFrame);
                QCOMPARE(k.properties.font.pointSize, 18.0);
            }
        }

        store.set(QStringLiteral("keypoints"), QStringLiteral("size"), QStringLiteral("2.5"));
        QVector<KeyPoint> sized;
        QVERIFY(loadKeyPoints(store, 1, sized));
        QCOMPARE(sized.at(0).properties.size, 2.5);
        QCOMPARE(sized.at(1).properties.size, 2.5);

        QVector<KeyPoint> current;
        QVERIFY(loadKeyPoints(store, 2, current));
        QCOMPARE(current.at(0).properties.size, 1.0);
        QCOMPARE(current.at(0).properties.font.family, QStringLiteral("Arial"));
        QCOMPARE(current.at(0).properties.font.color, QStringLiteral("#000000"));
        QVERIFY(!current.at(0).properties.font.hasShadow);
    }

    void contentPathsRebase()
    {
        const QString stored = QStringLiteral("file:///C:/Program Files/X/imgsrc/symbols/a.png");
        QCOMPARE(rebaseContentPath(stored), stored); // no program folder known yet

        setProgramFolder(QStringLiteral("/opt/tourlet/"));
        QCOMPARE(programFolder(), QStringLiteral("/opt/tourlet"));
        QCOMPARE(rebaseContentPath(stored), QStringLiteral("file:///opt/tourlet/imgsrc/symbols/a.png"));
        QCOMPARE(QUrl(rebaseContentPath(stored)).toLocalFile(), QStringLiteral("/opt/tourlet/imgsrc/symbols/a.png"));
        QCOMPARE(rebaseContentPath(QStringLiteral("C:\\Program Files\\X\\imgsrc\\symbols\\a.png")),
                 QStringLiteral("/opt/tourlet/imgsrc/symbols/a.png"));
        QCOMPARE(rebaseContentPath(QStringLiteral("/usr/share/old/imgsrc/pilots/car.png")),
                 QStringLiteral("/opt/tourlet/imgsrc/pilots/car.png"));
        QCOMPARE(rebaseContentPath(QStringLiteral("/home/u/myimgsrc/imgsrc/a.png")),
                 QStringLiteral("/opt/tourlet/imgsrc/a.png"));
        QCOMPARE(rebaseContentPath(QStringLiteral("file:///home/u/photos/a.png")),
                 QStringLiteral("file:///home/u/photos/a.png"));
        QCOMPARE(rebaseContentPath(QStringLiteral("/home/u/photos/a.png")), QStringLiteral("/home/u/photos/a.png"));
        // A file that opens where it was stored is left there.
        QVERIFY(QDir().mkpath(path(QStringLiteral("imgsrc"))));
        const QString own = path(QStringLiteral("imgsrc/own.png"));
        writeJpeg(own, -1);
        QCOMPARE(rebaseContentPath(own), own);
        QCOMPARE(rebaseContentPath(QStringLiteral("file://") + own), QStringLiteral("file://") + own);

        // Through a key point load: both sources, a present value only.
        MemoryStore store;
        store.set(QStringLiteral("kp"), QStringLiteral("kppImageSource"), stored);
        store.set(QStringLiteral("kp"), QStringLiteral("kppMediaSource"), QStringLiteral("D:/old/imgsrc/templates/t.png"));
        KeyPoint k;
        k.Load(store, QStringLiteral("kp"));
        QCOMPARE(k.properties.imageSource, QStringLiteral("file:///opt/tourlet/imgsrc/symbols/a.png"));
        QCOMPARE(k.properties.mediaSource, QStringLiteral("/opt/tourlet/imgsrc/templates/t.png"));
        QCOMPARE(k.properties.mediaRotation, 0);

        QCOMPARE(localFilePath(QStringLiteral("file:///tmp/a b/c.jpg")), QStringLiteral("/tmp/a b/c.jpg"));
        QCOMPARE(localFilePath(QStringLiteral("/tmp/c.jpg")), QStringLiteral("/tmp/c.jpg"));
    }

    void mediaRotationFromPicture()
    {
        const QMap<int, int> degrees = {{1, 0}, {2, 90}, {3, 180}, {4, 270}, {5, 0}, {6, 90}, {7, 180}, {8, 270}};
        for (int value = 1; value <= 8; ++value) {
            const QString file = path(QStringLiteral("o%1.jpg").arg(value));
            writeJpeg(file, value);
            MemoryStore store;
            // Also as a file URL, the way the interface hands sources over.
            const QString source = value % 2 ? file : QStringLiteral("file://") + file;
            store.set(QStringLiteral("kp"), QStringLiteral("kppMediaSource"), source);
            KeyPoint k;
            k.properties.mediaRotation = 45;
            k.Load(store, QStringLiteral("kp"));
            QCOMPARE(k.properties.mediaSource, source);
            QCOMPARE(k.properties.mediaRotation, degrees.value(value));

            store.set(QStringLiteral("mp"), QStringLiteral("mppFileListCount"), QStringLiteral("1"));
            store.set(QStringLiteral("mp"), QStringLiteral("mppImageSource0"), source);
            MediaPoint m;
            m.Load(store, QStringLiteral("mp"));
            QCOMPARE(m.properties.imageSources.at(0).orientation, degrees.value(value));
        }

        // Other values, no tag and pictures that can't be read leave the field.
        const QString odd = path(QStringLiteral("odd.jpg"));
        writeJpeg(odd, 9);
        const QString bare = path(QStringLiteral("bare.jpg"));
        writeJpeg(bare, -1);
        const QString broken = path(QStringLiteral("broken.jpg"));
        {
            QFile f(broken);
            QVERIFY(f.open(QIODevice::WriteOnly));
            f.write("\xFF\xD8\xFF\xE1 not really a picture");
        }
        for (const QString &file : {odd, bare, broken, path(QStringLiteral("missing.jpg"))}) {
            MemoryStore store;
            store.set(QStringLiteral("kp"), QStringLiteral("kppMediaSource"), file);
            KeyPoint k;
            QCOMPARE(k.properties.mediaRotation, 0);
            k.Load(store, QStringLiteral("kp"));
            QCOMPARE(k.properties.mediaRotation, 0);
            k.properties.mediaRotation = 90;
            k.Load(store, QStringLiteral("kp"));
            QCOMPARE(k.properties.mediaRotation, 90);
        }
    }
};

QTEST_GUILESS_MAIN(TestPoints)
#include "tst_points.moc"

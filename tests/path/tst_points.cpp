#include "TestFiles.h"
#include "app/ProgramFolder.h"
#include "path/ContentPath.h"
#include "path/CurvePoint.h"
#include "path/DefaultTitle.h"
#include "path/IdCounter.h"
#include "path/KeyPoints.h"
#include "path/MediaPoint.h"
#include "project/NumberedSections.h"
#include "project/ProjectController.h"
#include "project/ValueParsers.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QMap>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>

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

    void idsComeFromOneCounterThatSkipsZero()
    {
        KeyPoint a;
        CurvePoint b(1, 2, 3);
        MediaPoint c;
        QVERIFY(a.id != 0);
        QCOMPARE(b.id, a.id + 1);
        QCOMPARE(c.id, a.id + 2);

        // Copies keep the id, also when a container moves them.
        KeyPoint assigned;
        assigned = a;
        QCOMPARE(assigned.id, a.id);
        QVector<KeyPoint> list{a};
        list.insert(0, KeyPoint());
        QCOMPARE(list.at(1).id, a.id);
        QVERIFY(list.at(0).id > c.id);

        // A counter that runs over starts at 1 again: 0 means no point.
        IdCounter nearTheEnd(0xFFFFFFFEu);
        QCOMPARE(nearTheEnd.draw(), 0xFFFFFFFEu);
        QCOMPARE(nearTheEnd.draw(), 0xFFFFFFFFu);
        QCOMPARE(nearTheEnd.draw(), 1u);
    }

    // The four media keys are written only for a template; the file's writer sorts the
    // keys, so only which keys are written matters, not the order of the calls.
    void keyPointMediaTemplate()
    {
        KeyPoint k(1, 2, 3, QStringLiteral("Bern"));
        k.tt = 7;
        MemoryStore store;
        k.Save(store, QStringLiteral("kp"));
        QCOMPARE(store.value(QStringLiteral("kp"), QStringLiteral("kppSize")), QStringLiteral("1.000000"));

        k.properties.isMediaTemplate = true;
        k.properties.mediaSizeW = 120;
        k.properties.mediaSizeH = 80;
        k.properties.mediaCenterOffsetX = 0.25;
        k.properties.mediaCenterOffsetY = -0.5;
        MemoryStore templ;
        k.Save(templ, QStringLiteral("kp"));
        const QStringList templateKeys = templ.keysOf(QStringLiteral("kp"));
        QSet<QString> extra(templateKeys.cbegin(), templateKeys.cend());
        for (const QString &key : store.keysOf(QStringLiteral("kp")))
            extra.remove(key);
        QCOMPARE(extra, (QSet<QString>{"kppMediaSizeW", "kppMediaSizeH", "kppMediaCenterOffsetX", "kppMediaCenterOffsetY"}));

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

    void curveAndMediaPointRecords()
    {
        CurvePoint cp(3.25, 4.5, 1e-9);
        cp.tt = -2;
        cp.correspondingKeyPoint = 3;
        cp.correspondingMediaPoint = noPointIndex;
        MemoryStore store;
        cp.Save(store, QStringLiteral("curvepoint0"));
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

        resetDefaultKeyPointTitleCounter();
        QVector<KeyPoint> first, second;
        QVERIFY(loadKeyPoints(store, 2, first));
        QCOMPARE(defaultKeyPointTitleCounter(), 9u);
        QVERIFY(loadKeyPoints(store, 2, second));
        QCOMPARE(first.size(), 3);
        for (int i = 0; i < 3; ++i) {
            QCOMPARE(first.at(i).name, QStringLiteral("p%1").arg(i));
            // Each load draws new ids; the file's references are indices and stay right.
            QCOMPARE(first.at(i).correspondingPathSegmentId, uint32_t(i));
            QVERIFY(first.at(i).id != second.at(i).id);
        }

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

    // Before version 2 one font and one size serve all key points; a point's own key wins.
    void oldFormatSharesFontAndSize_data()
    {
        QTest::addColumn<uint>("version");
        QTest::addColumn<QString>("sharedFamily");
        QTest::addColumn<double>("size");
        QTest::newRow("version 0") << 0u << "Courier" << 2.5;
        QTest::newRow("version 1") << 1u << "Courier" << 2.5;
        QTest::newRow("version 2 has its own") << 2u << "Arial" << 1.0;
    }

    void oldFormatSharesFontAndSize()
    {
        QFETCH(uint, version);
        QFETCH(QString, sharedFamily);
        QFETCH(double, size);
        MemoryStore store;
        store.set(QStringLiteral("keypoints"), QStringLiteral("elements"), QStringLiteral("2"));
        store.set(QStringLiteral("keypoints"), QStringLiteral("size"), QStringLiteral("2.5"));
        store.set(QStringLiteral("kp_font"), QStringLiteral("family"), QStringLiteral("Courier"));
        store.set(QStringLiteral("keypoint0"), QStringLiteral("x"), QStringLiteral("0"));
        store.set(QStringLiteral("keypoint1"), QStringLiteral("family"), QStringLiteral("Serif"));
        QVector<KeyPoint> points;
        QVERIFY(loadKeyPoints(store, version, points));
        QCOMPARE(points.size(), 2);
        QCOMPARE(points.at(0).properties.font.family, sharedFamily);
        QCOMPARE(points.at(1).properties.font.family, QStringLiteral("Serif"));
        QCOMPARE(points.at(1).properties.size, size);
    }

    void contentPathsRebase_data()
    {
        QTest::addColumn<QString>("stored");
        QTest::addColumn<QString>("rebased");
        QTest::newRow("file URL") << "file:///C:/Program Files/X/imgsrc/symbols/a.png"
                                  << "file:///opt/tourlet/imgsrc/symbols/a.png";
        QTest::newRow("backslashes") << "C:\\Program Files\\X\\imgsrc\\symbols\\a.png" << "/opt/tourlet/imgsrc/symbols/a.png";
        QTest::newRow("other installation") << "/usr/share/old/imgsrc/pilots/car.png" << "/opt/tourlet/imgsrc/pilots/car.png";
        QTest::newRow("last imgsrc counts") << "/home/u/myimgsrc/imgsrc/a.png" << "/opt/tourlet/imgsrc/a.png";
        QTest::newRow("own file URL") << "file:///home/u/photos/a.png" << "file:///home/u/photos/a.png";
        QTest::newRow("own file") << "/home/u/photos/a.png" << "/home/u/photos/a.png";
    }

    void contentPathsRebase()
    {
        QFETCH(QString, stored);
        QFETCH(QString, rebased);
        QCOMPARE(rebaseContentPath(stored), stored); // no program folder known yet
        setProgramFolder(QStringLiteral("/opt/tourlet/"));
        QCOMPARE(rebaseContentPath(stored), rebased);
    }

    void keyPointSourcesRebaseUnlessTheyOpen()
    {
        setProgramFolder(QStringLiteral("/opt/tourlet"));
        QVERIFY(QDir().mkpath(path(QStringLiteral("imgsrc"))));
        const QString own = QStringLiteral("file://") + path(QStringLiteral("imgsrc/own.png"));
        writeJpeg(localFilePath(own), -1);
        MemoryStore store;
        store.set(QStringLiteral("kp"), QStringLiteral("kppImageSource"), own);
        store.set(QStringLiteral("kp"), QStringLiteral("kppMediaSource"), QStringLiteral("D:/old/imgsrc/templates/t.png"));
        KeyPoint k;
        k.Load(store, QStringLiteral("kp"));
        QCOMPARE(k.properties.imageSource, own);
        QCOMPARE(k.properties.mediaSource, QStringLiteral("/opt/tourlet/imgsrc/templates/t.png"));
        QCOMPARE(k.properties.mediaRotation, 0);
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
        const QString broken = writeTestFile(m_dir, QStringLiteral("broken.jpg"), "\xFF\xD8\xFF\xE1 not really a picture");
        for (const QString &file : {odd, bare, broken, path(QStringLiteral("missing.jpg"))}) {
            MemoryStore store;
            store.set(QStringLiteral("kp"), QStringLiteral("kppMediaSource"), file);
            KeyPoint k;
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

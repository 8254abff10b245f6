#include "models/AltitudePreset.h"
#include "project/QProjectController.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>

namespace {

AltitudePreset sample()
{
    AltitudePreset p;
    p.version = QStringLiteral("0.0.0.5");
    p.presetVersion = 3;
    p.background = QStringLiteral("file:///themes/board one.png");
    p.borderWidth = 2;
    p.borderColor = QStringLiteral("#112233");
    p.boardColor = QStringLiteral("#0D0D0D");
    p.opacity = 0.75;
    p.boardMargin = 5;
    p.radius = 12;
    p.heightScale = true;
    p.distanceScale = true;
    p.distanceScaleSize = 30;
    p.heightScaleSize = 60;
    p.increaseColor = QStringLiteral("#00FF00");
    p.decreaseColor = QStringLiteral("#FF0000");
    p.lineOpacity = 0.5;
    p.lineWidth = 3;
    p.scaleColor = QStringLiteral("#FFFFFF");
    p.scaleFontColor = QStringLiteral("#EEEEEE");
    p.scaleOpacity = 0.25;
    p.peakColor = QStringLiteral("#123456");
    p.peakBackgroundColor = QStringLiteral("#654321");
    p.peakSize = 14;
    p.peakTransparency = 0.125;
    p.graphGradientStartColor = QStringLiteral("#000001");
    p.graphGradientMiddleColor = QStringLiteral("#000002");
    p.graphGradientEndColor = QStringLiteral("#000003");
    p.graphUseGradient = true;
    p.graphLineGradientStartColor = QStringLiteral("#000004");
    p.graphLineGradientMiddleColor = QStringLiteral("#000005");
    p.graphLineGradientEndColor = QStringLiteral("#000006");
    p.graphUseLineGradient = true;
    p.graphLineColor = QStringLiteral("#000007");
    p.zeroBasedAltitude = true;
    return p;
}

void writeText(const QString &file, const QByteArray &text)
{
    QFile f(file);
    QVERIFY(f.open(QIODevice::WriteOnly));
    f.write(text);
}

} // namespace

class TestAltitudePreset : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const char *name) const { return m_dir.filePath(QString::fromLatin1(name)); }

private slots:
    void presetFileRoundTrip()
    {
        const QString file = path("theme.tmprs");
        QProjectController store;
        QVERIFY(saveAltitudePreset(store, file, QString(), sample()));
        QVERIFY(store.isIdle());

        AltitudePreset read;
        QVERIFY(loadAltitudePreset(store, file, QString(), read));
        QVERIFY(store.isIdle());
        QVERIFY(read == sample());

        // Written again over an existing preset file, the file is made anew.
        AltitudePreset other = sample();
        other.radius = 1;
        QVERIFY(saveAltitudePreset(store, file, QString(), other));
        QVERIFY(loadAltitudePreset(store, file, QString(), read));
        QCOMPARE(read.radius, 1);

        // The map carries every stored key but the header.
        const QVariantMap map = sample().toMap();
        QCOMPARE(map.size(), 32);
        QCOMPARE(map.value(QStringLiteral("peakSize")).toInt(), 14);
        QVERIFY(!map.contains(QStringLiteral("version")));
        AltitudePreset fromMap;
        fromMap.version = sample().version;
        fromMap.presetVersion = sample().presetVersion;
        fromMap.fromMap(map);
        QVERIFY(fromMap == sample());
    }

    void insideAProject()
    {
        const QString file = path("with theme.zkgeo");
        QProjectController store;
        QVERIFY(store.createProjectFile(file));
        store.writeProperty(QStringLiteral("animator"), QStringLiteral("projectTitle"), QStringLiteral("kept"));
        store.closeProjectFile();

        QVERIFY(saveAltitudePreset(store, file, altitudePresetPrefix(), sample()));
        QVERIFY(store.openProjectFile(file, true));
        QCOMPARE(store.readProperty(QStringLiteral("animator"), QStringLiteral("projectTitle"), QString()), QStringLiteral("kept"));
        QCOMPARE(store.readProperty(QStringLiteral("altprs.base"), QStringLiteral("radius"), QString()), QStringLiteral("12"));
        QCOMPARE(store.readProperty(QStringLiteral("Header"), QStringLiteral("projecttype"), QString()), QStringLiteral("ZKGEO"));
        store.closeProjectFile();

        AltitudePreset read;
        QVERIFY(loadAltitudePreset(store, file, altitudePresetPrefix(), read));
        QVERIFY(read == sample());
        // Under another prefix there is nothing: the preset stays as it was.
        AltitudePreset untouched = AltitudePreset::activeThemeDefaults();
        QVERIFY(!loadAltitudePreset(store, file, QStringLiteral("other."), untouched));
        QVERIFY(store.isIdle());
        QVERIFY(untouched == AltitudePreset::activeThemeDefaults());
    }

    void refusedFiles()
    {
        QProjectController store;
        AltitudePreset preset = sample();

        const QString foreign = path("foreign.tmprs");
        writeText(foreign, "[Header]\nprojecttype=OTHER\nversion=1\n");
        QVERIFY(!loadAltitudePreset(store, foreign, QString(), preset));
        // A refused header leaves the container reading; the next open is refused too.
        QVERIFY(store.isReading());
        QVERIFY(!loadAltitudePreset(store, path("theme-never-written.tmprs"), QString(), preset));
        store.closeProjectFile();

        const QString damaged = path("damaged.tmprs");
        writeText(damaged, "[Header]\nprojecttype=ZKGEO\nprojectversion=2\nversion=0.0.0.5\n[base]\nradius=12\nborderWidth=wide\n");
        QVERIFY(!loadAltitudePreset(store, damaged, QString(), preset));
        QVERIFY(store.isIdle());
        QVERIFY(preset == sample());

        // Missing keys keep what the record had; the version marks the preset as present.
        const QString sparse = path("sparse.tmprs");
        writeText(sparse, "[Header]\nprojecttype=ZKGEO\nprojectversion=2\nversion=0.0.0.4\n[peak]\npeakSize=99\n");
        QVERIFY(loadAltitudePreset(store, sparse, QString(), preset));
        QCOMPARE(preset.peakSize, 99);
        QCOMPARE(preset.radius, 12);
        QCOMPARE(preset.version, QStringLiteral("0.0.0.4"));
        QCOMPARE(preset.presetVersion, 3u);
        QCOMPARE(AltitudePreset().presetVersion, 0xFFFFFFFFu);
    }
};

QTEST_GUILESS_MAIN(TestAltitudePreset)
#include "tst_altitudepreset.moc"

#include "TestFiles.h"
#include "models/AltitudePreset.h"
#include "project/QProjectController.h"

#include <QTemporaryDir>
#include <QTest>

namespace {

// Every stored value away from its default and from the others; the texts need escapes.
AltitudePreset sample()
{
    AltitudePreset p;
    p.version = QStringLiteral("0.0.0.5");
    p.presetVersion = 3;
    QVariantMap map = p.toMap();
    int n = 0;
    for (QVariant &value : map) {
        ++n;
        if (value.type() == QVariant::String)
            value = QStringLiteral("#%1, \"board\" %1.png").arg(n);
        else if (value.type() == QVariant::Bool)
            value = true;
        else if (value.type() == QVariant::Double)
            value = n + 0.125;
        else
            value = n * 3;
    }
    p.fromMap(map);
    return p;
}

} // namespace

class TestAltitudePreset : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const char *name) const { return m_dir.filePath(QString::fromLatin1(name)); }
    QString write(const char *name, const QByteArray &text) const { return writeTestFile(m_dir, QString::fromLatin1(name), text); }

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
        const QString foreign = write("foreign.tmprs", "[Header]\nprojecttype=OTHER\nversion=1\n");
        QVERIFY(!loadAltitudePreset(store, foreign, QString(), preset));
        // A refused header leaves the container reading; the next open is refused too.
        QVERIFY(store.isReading());
        QVERIFY(!loadAltitudePreset(store, path("theme-never-written.tmprs"), QString(), preset));
        store.closeProjectFile();

        const QString damaged =
            write("damaged.tmprs", "[Header]\nprojecttype=ZKGEO\nprojectversion=2\nversion=0.0.0.5\n[base]\nradius=12\nborderWidth=wide\n");
        QVERIFY(!loadAltitudePreset(store, damaged, QString(), preset));
        QVERIFY(store.isIdle());
        QVERIFY(preset == sample());

        // Missing keys keep what the record had; the version marks the preset as present.
        const QString sparse =
            write("sparse.tmprs", "[Header]\nprojecttype=ZKGEO\nprojectversion=2\nversion=0.0.0.4\n[peak]\npeakSize=99\n");
        QVERIFY(loadAltitudePreset(store, sparse, QString(), preset));
        QCOMPARE(preset.peakSize, 99);
        QCOMPARE(preset.radius, sample().radius);
        QCOMPARE(preset.version, QStringLiteral("0.0.0.4"));
        QCOMPARE(preset.presetVersion, 3u);
    }
};

QTEST_GUILESS_MAIN(TestAltitudePreset)
#include "tst_altitudepreset.moc"

#include "TestFiles.h"
#include "gpx/KmzArchive.h"
#include "gpx/TrackFile.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <zip.h>

namespace {

struct Entry
{
    QByteArray name;
    QByteArray data;
};

const QByteArray documentA = "<kml><Document><Placemark><LineString><coordinates>7,46,1 7.5,46.5,2</coordinates>"
                             "</LineString></Placemark></Document></kml>";
const QByteArray documentB = "<kml><Placemark><Point><coordinates>1,2</coordinates></Point></Placemark></kml>";

// Makes the first entry of an archive claim another size in the central directory.
QByteArray claimingSize(QByteArray bytes, uint64_t size)
{
    const int central = bytes.indexOf(QByteArray("PK\x01\x02", 4));
    for (int i = 0; central > 0 && i < 4; ++i)
        bytes[central + 24 + i] = char((quint32(size) >> (8 * i)) & 0xFF);
    return bytes;
}

} // namespace

class TestKmz : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

    // Builds an archive with stored (uncompressed) entries so that sizes can be patched.
    QString makeZip(const char *fileName, const QVector<Entry> &entries)
    {
        const QString file = m_dir.filePath(QString::fromLatin1(fileName));
        int error = 0;
        zip_t *archive = zip_open(QFile::encodeName(file).constData(), ZIP_CREATE | ZIP_TRUNCATE, &error);
        if (!archive)
            qFatal("cannot create zip");
        for (const Entry &entry : entries) {
            zip_source_t *source = zip_source_buffer(archive, entry.data.constData(), zip_uint64_t(entry.data.size()), 0);
            const zip_int64_t index = zip_file_add(archive, entry.name.constData(), source, ZIP_FL_ENC_UTF_8 | ZIP_FL_OVERWRITE);
            if (index < 0 || zip_set_file_compression(archive, zip_uint64_t(index), ZIP_CM_STORE, 0) != 0)
                qFatal("cannot add zip entry %s", entry.name.constData());
        }
        if (zip_close(archive) != 0)
            qFatal("cannot write zip");
        return file;
    }
    QByteArray zipBytes(const QVector<Entry> &entries)
    {
        QFile f(makeZip("scratch.kmz", entries));
        return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
    }
    QString write(const char *name, const QByteArray &bytes) { return writeTestFile(m_dir, QString::fromLatin1(name), bytes); }

private slots:
    void readsTheDocumentOfAnArchive()
    {
        TrackFile file;
        QVERIFY(file.load(makeZip("good.kmz", {{"files/icon.png", "\x89PNG...."},
                                               {"images/deep/photo.jpg", "jpeg"}, // no folder entry of its own
                                               {"doc.kml", documentA}})));
        QCOMPARE(file.items()[0].points.size(), 2);

        // The name as archives made elsewhere spell it.
        QVERIFY(file.load(makeZip("upper.kmz", {{"DOC.KML", documentA}})));
        QCOMPARE(file.items()[0].points.size(), 2);

        // Only the document is unpacked: an entry beside it may claim any size.
        const QByteArray photo = zipBytes({{"photo.jpg", "jpeg"}, {"doc.kml", documentA}});
        QVERIFY(file.load(write("large-photo.kmz", claimingSize(photo, KmzArchive::maxEntrySize * 3))));
        QCOMPARE(file.items()[0].points.size(), 2);
    }

    void archivesWithoutAUsableDocument()
    {
        TrackFile file;
        QVERIFY(!file.load(makeZip("none.kmz", {{"readme.txt", "hello"}})));
        QVERIFY(!file.load(makeZip("nested.kmz", {{"files/doc.kml", documentA}}))); // only the top folder counts
        QVERIFY(!file.load(makeZip("emptydoc.kmz", {{"doc.kml", QByteArray()}}))); // size 0 makes a folder

        // The suffix test is exact: ".KMZ" reads as XML and fails at the first element.
        const QString upper = m_dir.filePath("upper.KMZ");
        QVERIFY(QFile::copy(makeZip("upper-src.kmz", {{"doc.kml", documentA}}), upper));
        QVERIFY(!file.load(upper));

        // Not an archive, a cut archive, and an archive with a damaged entry.
        QVERIFY(!file.load(write("plain.kmz", documentA)));
        const QByteArray whole = zipBytes({{"doc.kml", documentA}});
        QVERIFY(!file.load(write("cut.kmz", whole.left(whole.size() / 2))));
        QByteArray damaged = whole;
        damaged[damaged.indexOf("<kml>") + 2] = 'X'; // the stored checksum no longer matches
        QVERIFY(!file.load(write("crc.kmz", damaged)));
    }

    void severalDocumentsReadTheFirstAndFail()
    {
        TrackFile file;
        QVERIFY(!file.load(makeZip("two.kmz", {{"B.kml", documentB}, {"a.KML", documentA}})));
        QCOMPARE(file.items()[0].points.size(), 2); // a.KML sorts first and was read
    }

    void hostileEntries()
    {
        // Names that climb out of a folder are never unpacked; they are no documents either.
        TrackFile file;
        QVERIFY(file.load(makeZip("climb.kmz", {{"../climbing-kmz-test.kml", documentB}, {"doc.kml", documentA},
                                                {"/absolute-kmz-test.kml", documentB}, {"..\\win.kml", documentB}})));
        QCOMPARE(file.items()[0].points.size(), 2);
        QVERIFY(!QFile::exists(QDir::tempPath() + "/climbing-kmz-test.kml"));
        QVERIFY(!QFile::exists("/absolute-kmz-test.kml"));

        // A document that claims to be larger than allowed fails before anything is read;
        // exactly at the limit it may start, but can't deliver what it claims.
        const QByteArray bytes = zipBytes({{"doc.kml", documentA}});
        for (uint64_t claimed : {KmzArchive::maxEntrySize + 1, KmzArchive::maxEntrySize})
            QVERIFY(!file.load(write("patched.kmz", claimingSize(bytes, claimed))));
    }
};

QTEST_GUILESS_MAIN(TestKmz)
#include "tst_kmz.moc"

#include "TestFiles.h"
#include "gpx/TrackFile.h"

#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QTest>

#include <sys/resource.h>

namespace {
long peakRssKiB()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss;
}

QVector<int32_t> types(const TrackFile &file)
{
    QVector<int32_t> result;
    for (const TrackItem &item : file.items())
        result << item.type;
    return result;
}

// "latitude,longitude[,altitude][ name]" per point, the altitude only where the file gave one.
QString describe(const TrackItem &item)
{
    QStringList points;
    for (const TrackPoint &p : item.points) {
        QString text = QString::number(p.latitude, 'g', 12) + ',' + QString::number(p.longitude, 'g', 12);
        if (p.hasAltitude)
            text += ',' + QString::number(p.altitude);
        points << (p.name.isEmpty() ? text : text + ' ' + p.name);
    }
    return points.join(QStringLiteral(" | "));
}
} // namespace

class TestTrackFile : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

    QString write(const QString &name, const QByteArray &bytes) const { return writeTestFile(m_dir, name, bytes); }
    static QByteArray gpx(const QByteArray &body, const QByteArray &rootAttributes = QByteArray())
    {
        return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<gpx version=\"1.1\"" + rootAttributes + ">\n" + body + "</gpx>\n";
    }
    static QByteArray wpt(int i, const QByteArray &inner = QByteArray())
    {
        return "<wpt lat=\"" + QByteArray::number(45.0 + i * 0.001) + "\" lon=\"" + QByteArray::number(7.0 + i * 0.001) +
               "\">" + inner + "</wpt>\n";
    }
    static QByteArray trkpt(double lat, double lon, const QByteArray &inner = QByteArray())
    {
        return "<trkpt lat=\"" + QByteArray::number(lat, 'g', 12) + "\" lon=\"" + QByteArray::number(lon, 'g', 12) + "\">" +
               inner + "</trkpt>\n";
    }
    static QByteArray trk(const QByteArray &points) { return "<trk><name>t</name><trkseg>\n" + points + "</trkseg></trk>\n"; }
    static QByteArray tcxPoint(const QByteArray &lat, const QByteArray &lon)
    {
        return "<Trackpoint><Position><LatitudeDegrees>" + lat + "</LatitudeDegrees><LongitudeDegrees>" + lon +
               "</LongitudeDegrees></Position></Trackpoint>";
    }

private slots:
    void gpxItemsAndSelection()
    {
        // Over 100 waypoints, and only then, make a fixed path.
        QByteArray hundred;
        for (int i = 0; i < 100; ++i)
            hundred += wpt(i);
        TrackFile file;
        QVERIFY(file.load(write("w100.gpx", gpx(hundred))));
        QCOMPARE(file.selectItem(), 0);
        QVERIFY(!file.items()[0].fixedGpxPath);
        QVERIFY(file.load(write("w101.gpx", gpx(hundred + wpt(100)))));
        QCOMPARE(file.selectItem(), 0);
        QVERIFY(file.items()[0].fixedGpxPath);

        // The empty track is dropped before the route is read.
        QVERIFY(file.load(write("emptytrk.gpx", gpx("<trk><name>x</name><trkseg></trkseg></trk>\n"
                                                    "<rte><rtept lat=\"1\" lon=\"2\"/><rtept lat=\"3\" lon=\"4\"/></rte>"))));
        QCOMPARE(types(file), QVector<int32_t>{TrackItem::Route});
        QCOMPARE(file.items()[0].points.size(), 2);

        // Two tracks and waypoints between them: the first track is chosen, segments join.
        const QByteArray firstTrack = "<trk><trkseg>" + trkpt(1, 2) + trkpt(1.5, 2.5) + "</trkseg><trkseg>" + trkpt(2, 3) +
                                      "</trkseg></trk>\n";
        QVERIFY(file.load(write("two.gpx", gpx(wpt(1, "<name>Start</name>") + firstTrack + wpt(2, "<name>Hut</name>") +
                                               wpt(3) + trk(trkpt(5, 6) + trkpt(7, 8))))));
        QCOMPARE(types(file), (QVector<int32_t>{TrackItem::Waypoints, TrackItem::Track, TrackItem::Waypoints, TrackItem::Track}));
        QCOMPARE(describe(file.items()[2]), QStringLiteral("45.002,7.002 Hut | 45.003,7.003")); // consecutive wpt share an item
        QCOMPARE(file.selectItem(), 1);
        QCOMPARE(describe(file.items()[1]), QStringLiteral("1,2 | 1.5,2.5 | 2,3"));
    }

    void gpxPointsAndHeader()
    {
        TrackFile file;
        const QByteArray body =
            "<metadata><name>n</name><time>2019-05-01T10:00:00Z</time>"
            "<bounds minlat=\"45.5\" minlong=\"7.25\" maxlat=\"46\" maxlong=\"8.125\"/></metadata>\n" +
            trk(trkpt(0, 0) +                                // lost: equal to the stand-in previous point
                trkpt(46, 8) + trkpt(46, 8) +                // duplicate without ele or name: dropped
                trkpt(46, 8, "<ele>0</ele>") +               // elevation 0 isn't positive: dropped
                trkpt(46, 8, "<ele>12.5</ele>") +            // positive altitude: kept
                trkpt(46, 8, "<name>Same</name>") +          // named: kept
                "<trkpt lat=\"47\"><ele>bad</ele></trkpt>\n" +
                trkpt(45.5, 7.5, "<ele>-3</ele><extensions><ele>99</ele></extensions>") +
                trkpt(45.75, 9.5, "<ele>  100  </ele><time>t</time><name>A &amp; B</name>"));
        QVERIFY(file.load(write("points.gpx", gpx(body, " creator=\"Tourlet\""))));
        QVERIFY(file.isOwnFile());
        QCOMPARE(file.time(), QStringLiteral("2019-05-01T10:00:00Z"));
        QCOMPARE(file.boundsTopLeft(), QPointF(7.25, 45.5));
        QCOMPARE(file.boundsBottomRight(), QPointF(8.125, 46.0));

        // A missing "lon" reads as 0, a damaged ele as altitude 0.
        QCOMPARE(describe(file.items()[0]), QStringLiteral("46,8 | 46,8,12.5 | 46,8 Same | 47,0,0 | 45.5,7.5,-3 | 45.75,9.5,100 A & B"));
        // A side of 0 counts as unset: the longitude 0 moved the left side to 0, and the
        // next point took it over again.
        QCOMPARE(file.items()[0].bounds.toRect(), QRectF(QPointF(7.5, 45.5), QPointF(9.5, 47.0)));

        QVERIFY(file.load(write("creator.gpx", gpx(trk(trkpt(1, 2)), " creator=\"tourlet\""))));
        QVERIFY(!file.isOwnFile());
    }

    void gpxRealWorldShapes()
    {
        // A device file: default namespace, extensions in their own namespace, a
        // byte-order mark and CRLF line ends.
        const QByteArray device =
            "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"no\" ?>\r\n"
            "<gpx xmlns=\"http://example.org/GPX/1/1\" xmlns:gpxtpx=\"http://example.org/schemas/TrackPointExtension/v1\"\r\n"
            " creator=\"Handheld 30\" version=\"1.1\">\r\n"
            "  <metadata><link href=\"http://example.org\"><text>x</text></link><time>2021-06-01T08:00:00Z</time></metadata>\r\n"
            "  <trk><name>Ride</name><trkseg>\r\n"
            "    <trkpt lat=\"47.3769\" lon=\"8.5417\">\r\n      <ele>408.2</ele>\r\n"
            "      <extensions><gpxtpx:TrackPointExtension><gpxtpx:hr>112</gpxtpx:hr></gpxtpx:TrackPointExtension></extensions>\r\n"
            "    </trkpt>\r\n    <trkpt lat='47.3770' lon='8.5420'><ele><!-- gps -->409<![CDATA[.5]]></ele></trkpt>\r\n"
            "  </trkseg></trk>\r\n</gpx>\r\n";
        TrackFile file;
        QVERIFY(file.load(write("device.gpx", device)));
        QCOMPARE(file.creator(), QStringLiteral("Handheld 30"));
        QCOMPARE(file.time(), QStringLiteral("2021-06-01T08:00:00Z"));
        QCOMPARE(describe(file.items()[0]), QStringLiteral("47.3769,8.5417,408.2 | 47.377,8.542,409.5"));

        // UTF-16 with a byte-order mark, as some tools write it.
        const QString text = QString::fromUtf8(gpx(wpt(1, "<name>Zürich</name>"))).replace("UTF-8", "UTF-16");
        QByteArray utf16("\xFF\xFE");
        utf16.append(reinterpret_cast<const char *>(text.utf16()), text.size() * 2);
        QVERIFY(file.load(write("utf16.gpx", utf16)));
        QCOMPARE(describe(file.items()[0]), QStringLiteral("45.001,7.001 Zürich"));

        // A GPX 1.0 file with a prefixed root: local names decide.
        QVERIFY(file.load(write("prefixed.gpx", "<g:gpx xmlns:g=\"http://example.org/GPX/1/0\"><g:rte>"
                                                "<g:rtept lat=\"1\" lon=\"1\"><g:name>R</g:name></g:rtept></g:rte></g:gpx>")));
        QCOMPARE(describe(file.items()[0]), QStringLiteral("1,1 R"));
    }

    // A document that breaks off keeps the points read before the damage.
    void damagedXmlKeepsWhatWasRead_data()
    {
        QTest::addColumn<QByteArray>("document");
        QTest::addColumn<int>("points");
        const QByteArray whole = gpx(trk(trkpt(1, 1) + trkpt(2, 2) + trkpt(3, 3)));
        QTest::newRow("cut inside the third point") << whole.left(whole.indexOf("lat=\"3\"") + 3) << 2;
        // An element in a text-only element ends the walk; the point being read is kept.
        QTest::newRow("element inside ele") << gpx(trk(trkpt(1, 1) + trkpt(2, 2, "<ele><b>5</b></ele>") + trkpt(3, 3))) << 2;
        QTest::newRow("undeclared prefix") << gpx(trk(trkpt(1, 1) + trkpt(2, 2, "<x:hr>1</x:hr>") + trkpt(3, 3))) << 2;
        QTest::newRow("data after the root") << whole + "<gpx><trk><trkseg>" + trkpt(9, 9) + "</trkseg></trk></gpx>" << 3;
        const QByteArray deep = QByteArray("<x>").repeated(200000) + QByteArray("</x>").repeated(200000);
        QTest::newRow("deep nesting in a point") << gpx(trk(trkpt(1, 1, deep) + trkpt(2, 2))) << 2;
    }

    void damagedXmlKeepsWhatWasRead()
    {
        QFETCH(QByteArray, document);
        QFETCH(int, points);
        TrackFile file;
        QVERIFY(file.load(write("damaged.gpx", document)));
        QCOMPARE(file.items()[0].points.size(), points);
    }

    void refusedFiles_data()
    {
        QTest::addColumn<QString>("file");
        QTest::newRow("missing") << m_dir.filePath("missing.gpx");
        QTest::newRow("folder") << m_dir.path();
        QTest::newRow("endless device") << QStringLiteral("/dev/zero");
        QTest::newRow("empty") << write("empty.gpx", QByteArray());
        QTest::newRow("blank") << write("blank.gpx", "  \r\n\n ");
        QTest::newRow("binary") << write("binary.gpx", QByteArray("\x00\x01\xff\xfe garbage", 14));
        QTest::newRow("other XML") << write("other.gpx", "<?xml version=\"1.0\"?><html><trk/></html>");
        QTest::newRow("no points") << write("nothing.gpx", gpx("<metadata><time>x</time></metadata><trk/>"));
        QTest::newRow("cut before a point") << write("cut.gpx", gpx(trk(trkpt(1, 1))).left(60));
        QTest::newRow("non-finite coordinates")
            << write("nonfinite.gpx", gpx(trk("<trkpt lat=\"1\" lon=\"inf\"/><trkpt lat=\"nan\" lon=\"1\"/>")));
        QTest::newRow("unclosed flood") << write("flood.kml", "<kml><Document>" + QByteArray("<Folder>").repeated(200000));
        QTest::newRow("tcx without longitude")
            << write("nopos.tcx", "<TrainingCenterDatabase><Activities><Activity><Lap><Track><Trackpoint><Position>"
                                  "<LatitudeDegrees>2</LatitudeDegrees></Position></Trackpoint></Track></Lap></Activity>"
                                  "</Activities></TrainingCenterDatabase>");
        QTest::newRow("empty trk") << write("empty.trk", QByteArray());
        QTest::newRow("trk without positions") << write("header.trk", "G  WGS 84\nT\nT A\nT A 5\n\xBA\n");
        // Not a trk by its suffix: read as XML.
        QTest::newRow("trk text, other suffix") << write("route.trk.txt", "G  WGS 84\nT  A 47.25\xBAN 8.5\xBA" "E\n");
    }

    void refusedFiles()
    {
        QFETCH(QString, file);
        TrackFile track;
        QVERIFY(!track.load(file));
        QCOMPARE(track.selectItem(), -1);
    }

    void hostileDocumentsEndQuickly()
    {
        TrackFile file;
        // Nested entities that would expand to gigabytes are refused by the reader.
        QByteArray laughs = "<?xml version=\"1.0\"?>\n<!DOCTYPE gpx [\n<!ENTITY a0 \"1.5\">\n";
        for (int i = 1; i < 10; ++i)
            laughs += "<!ENTITY a" + QByteArray::number(i) + " \"" + QByteArray("&a" + QByteArray::number(i - 1) + ";").repeated(10) + "\">\n";
        laughs += "]>\n" + gpx(trk(trkpt(1, 1) + trkpt(2, 2, "<ele>&a9;</ele>") + trkpt(3, 3))).mid(39);
        QElapsedTimer timer;
        timer.start();
        file.load(write("laughs.gpx", laughs));
        QVERIFY(timer.elapsed() < 5000);
        QVERIFY(file.items().empty() || file.items()[0].points.size() <= 3);
    }

    void kmlScopesAndShapes()
    {
        const QByteArray kml =
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
            "<kml xmlns=\"http://www.opengis.net/kml/2.2\" xmlns:gx=\"http://example.org/kml/ext\">\n"
            "<Document><name>Doc</name><Style id=\"s\"><LineStyle><width>4</width></LineStyle></Style>\n"
            "<Folder><name>first</name>\n"
            "<Placemark><name>Start</name><Point><coordinates>7.1,46.1,500</coordinates></Point></Placemark>\n"
            "<Placemark><Point><coordinates> 7.2,46.2 </coordinates></Point><name>late</name></Placemark>\n"
            "<Placemark><name>route</name><LineString><tessellate>1</tessellate><coordinates>\n"
            "  7.1,46.1,10 7.3,46.3,20\r\n7.4,46.4\r7.5,46.5,30,99 bad\t7.6,46.6,40\n"
            "</coordinates></LineString></Placemark>\n"
            "<Placemark><gx:Track><when>2020-01-01T00:00:00Z</when><gx:coord>1 2 3</gx:coord></gx:Track>"
            "<MultiGeometry><Point><coordinates>0,0</coordinates></Point>"
            "<LineString><coordinates>7.7,46.7,50</coordinates></LineString></MultiGeometry></Placemark>\n"
            "</Folder>\n"
            "<Folder><Placemark><LineString><coordinates>9,9,9 9.5,9.5,9</coordinates></LineString></Placemark></Folder>\n"
            "</Document></kml>\n";
        TrackFile file;
        QVERIFY(file.load(write("scopes.gpx", kml))); // the root decides, not the suffix
        QCOMPARE(types(file), (QVector<int32_t>{TrackItem::Waypoints, TrackItem::Track}));

        // The second point's name came after its Point.
        QCOMPARE(describe(file.items()[0]), QStringLiteral("46.1,7.1,500 Start | 46.2,7.2"));

        // Line strings and tracks join one track; the tab-joined tuple reads as one damaged
        // part, a two-field tuple has no elevation, the second folder is never reached.
        QCOMPARE(describe(file.items()[1]),
                 QStringLiteral("46.1,7.1,10 | 46.3,7.3,20 | 46.4,7.4 | 46.5,7.5,30 | 46.6,0,40 | 2,1,3 | 46.7,7.7,50"));

        // A phone tracker's file: tracks in a multi-track, "when" and "coord" in turn.
        QVERIFY(file.load(write("gx.kml", "<kml xmlns:gx=\"g\"><Document><Placemark><gx:MultiTrack>"
                                          "<gx:Track><when>t</when><when>t</when><gx:coord>8.5 47.25 400.5</gx:coord>"
                                          "<gx:coord>\n 8.6\t47.3 </gx:coord></gx:Track><gx:Track><gx:coord>8.7 47.35 410"
                                          "</gx:coord><gx:coord>bad</gx:coord><gx:angles>0 0 0</gx:angles></gx:Track>"
                                          "</gx:MultiTrack></Placemark></Document></kml>")));
        QCOMPARE(describe(file.items()[0]), QStringLiteral("47.25,8.5,400.5 | 47.3,8.6 | 47.35,8.7,410"));
    }

    void tcxLapsOfTheFirstActivity()
    {
        const QByteArray tcx =
            "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n"
            "<TrainingCenterDatabase xmlns=\"http://example.org/schemas/TrainingCenterDatabase/v2\" "
            "xmlns:ns3=\"http://example.org/schemas/ActivityExtension/v2\">\r\n"
            "<Activities><Activity Sport=\"Biking\"><Id>2020-01-01T00:00:00Z</Id>\r\n"
            "<Lap StartTime=\"2020-01-01T00:00:00Z\"><TotalTimeSeconds>10</TotalTimeSeconds><Track>\r\n"
            "<Trackpoint><Time>t</Time><Position><LatitudeDegrees>46.5</LatitudeDegrees>"
            "<LongitudeDegrees>7.5</LongitudeDegrees></Position><AltitudeMeters>600</AltitudeMeters>"
            "<Extensions><ns3:TPX><ns3:Speed>3</ns3:Speed></ns3:TPX></Extensions></Trackpoint>\r\n"
            "<Trackpoint><Time>t</Time><HeartRateBpm><Value>99</Value></HeartRateBpm></Trackpoint>\r\n"
            "<Trackpoint><Position><LongitudeDegrees>7.6</LongitudeDegrees><LatitudeDegrees>46.6</LatitudeDegrees>"
            "</Position></Trackpoint>\r\n</Track></Lap>\r\n"
            "<Lap><Track>" + tcxPoint("46.7", "7.7") + "</Track><Track>" + tcxPoint("46.8", "7.8") + "</Track></Lap>\r\n"
            "<Lap><Track/></Lap><Lap><Track>" + tcxPoint("46.9", "7.9") + "</Track></Lap>\r\n</Activity>\r\n"
            "<Activity><Lap><Track>" + tcxPoint("1", "1") + "</Track></Lap></Activity>"
            "</Activities></TrainingCenterDatabase>\r\n";
        TrackFile file;
        QVERIFY(file.load(write("laps.tcx", tcx)));
        // The trackpoint without position is dropped, the second activity not read; no
        // AltitudeMeters still gives altitude 0.
        QCOMPARE(describe(file.items()[0]), QStringLiteral("46.5,7.5,600 | 46.6,7.6,0 | 46.7,7.7,0 | 46.8,7.8,0 | 46.9,7.9,0"));

        QVERIFY(file.load(write("course.tcx", "<TrainingCenterDatabase><Folders/><Courses><Course><Name>c</Name><Track>" +
                                                  tcxPoint("2", "3") + "</Track><CoursePoint><Name>x</Name></CoursePoint>"
                                                  "</Course></Courses></TrainingCenterDatabase>")));
        QCOMPARE(describe(file.items()[0]), QStringLiteral("2,3,0"));
    }

    void trkLines()
    {
        // Code page 1252, with the degree sign as one byte.
        QByteArray latin1 = "G  WGS 84\r\nU  1\r\n"
                            "T  A 47.2512450000\xBAN 8.5465310000\xBA" "E 17-Jul-13 10:36:52.000 s 408.0 0.0 0.0 0.0 0 -1000.0\r\n"
                            "T  A 47.2600000000\xBAS 8.5500000000\xBA" "E 17-Jul-13 10:36:53.000 s 409.0\r\n"
                            "T  A 47.2700000000\xBAN 8.5600000000\xBAW 17-Jul-13 10:36:54.000\r\n"
                            "t  A 1\xBAN 1\xBA" "E\r\n"
                            "\xBAT A 1 N 1\r\n"
                            "T A 47.28 \xBA N 8.57 \xBA E 17-Jul-13 10:36:55 s 410\r\n";
        TrackFile file;
        QVERIFY(file.load(write("route.Trk", latin1)));
        // Neither "S" nor "W" is evaluated: the first drops its line, the second is east.
        const QString expected = QStringLiteral("47.251245,8.546531,408 | 47.27,8.56,0 | 47.28,8.57,410");
        QCOMPARE(describe(file.items()[0]), expected);

        // The same in UTF-8 with a byte-order mark, and with old line ends.
        QVERIFY(file.load(write("route.TRK", "\xEF\xBB\xBF" + QString::fromLatin1(latin1).toUtf8())));
        QCOMPARE(describe(file.items()[0]), expected);
        QVERIFY(file.load(write("old.trk", QByteArray(latin1).replace("\r\n", "\r"))));
        QCOMPARE(describe(file.items()[0]), expected);

        // Floods of line ends and an overlong line are read in little memory; the overlong
        // line is skipped whole and the point after it still read.
        const QString flood = write("flood.trk", QByteArray(8 << 20, '\n') + QByteArray(8 << 20, '\r') +
                                                     "T  A 10\xBAN 20\xBA" "E " + QByteArray(100000, 'x') + "\r\n" +
                                                     latin1.mid(latin1.indexOf("T  A 47.27")));
        const long peakBefore = peakRssKiB();
        QVERIFY(file.load(flood));
        QCOMPARE(describe(file.items()[0]), QStringLiteral("47.27,8.56,0 | 47.28,8.57,410"));
        QVERIFY2(peakRssKiB() - peakBefore < 16 * 1024, qPrintable(QString::number(peakRssKiB() - peakBefore)));
    }
};

QTEST_GUILESS_MAIN(TestTrackFile)
#include "tst_trackfile.moc"

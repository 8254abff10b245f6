#include "TestFiles.h"
#include "gpx/TrackFile.h"

#include <QBuffer>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
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
}

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

private slots:
    void gpxItemsAndSelection()
    {
        QByteArray hundred;
        for (int i = 0; i < 100; ++i)
            hundred += wpt(i);
        TrackFile waypoints;
        QVERIFY(waypoints.load(write("w100.gpx", gpx(hundred))));
        QCOMPARE(int(waypoints.items().size()), 1);
        QCOMPARE(waypoints.items()[0].type, int32_t(TrackItem::Waypoints));
        QCOMPARE(waypoints.selectItem(), 0);
        QCOMPARE(waypoints.items()[0].points.size(), 100);
        QVERIFY(!waypoints.items()[0].fixedGpxPath);

        TrackFile more;
        QVERIFY(more.load(write("w101.gpx", gpx(hundred + wpt(100)))));
        QCOMPARE(more.selectItem(), 0);
        QVERIFY(more.items()[0].fixedGpxPath);

        // The empty track is dropped before the route is read.
        TrackFile route;
        QVERIFY(route.load(write("emptytrk.gpx", gpx("<trk><name>x</name><trkseg></trkseg></trk>\n"
                                                     "<rte><rtept lat=\"1\" lon=\"2\"/><rtept lat=\"3\" lon=\"4\"/></rte>"))));
        QCOMPARE(int(route.items().size()), 1);
        QCOMPARE(route.items()[0].type, int32_t(TrackItem::Route));
        QVERIFY(!route.items()[0].fixedGpxPath);
        QCOMPARE(route.items()[0].points.size(), 2);

        // Two tracks and waypoints between them: the first track is chosen, segments join.
        TrackFile two;
        const QByteArray firstTrack = "<trk><trkseg>" + trkpt(1, 2) + trkpt(1.5, 2.5) + "</trkseg><trkseg>" + trkpt(2, 3) +
                                      "</trkseg></trk>\n";
        QVERIFY(two.load(write("two.gpx", gpx(wpt(1, "<name>Start</name>") + firstTrack + wpt(2, "<name>Hut</name>") +
                                              wpt(3) + trk(trkpt(5, 6) + trkpt(7, 8))))));
        QCOMPARE(int(two.items().size()), 4);
        QCOMPARE(two.items()[0].type, int32_t(TrackItem::Waypoints));
        QCOMPARE(two.items()[1].type, int32_t(TrackItem::Track));
        QCOMPARE(two.items()[2].type, int32_t(TrackItem::Waypoints));
        QCOMPARE(two.items()[2].points.size(), 2); // consecutive wpt share one item
        QCOMPARE(two.items()[2].points[0].name, QStringLiteral("Hut"));
        QCOMPARE(two.selectItem(), 1);
        QVERIFY(two.items()[1].fixedGpxPath);
        QCOMPARE(two.items()[1].points.size(), 3);
        QCOMPARE(two.items()[1].points[2].longitude, 3.0);

        // Nothing useful, or not a track document at all.
        TrackFile none;
        QVERIFY(!none.load(write("nothing.gpx", gpx("<metadata><time>x</time></metadata><trk/>"))));
        QVERIFY(none.items().empty());
        QCOMPARE(none.selectItem(), -1);
        QVERIFY(!none.load(write("other.gpx", "<?xml version=\"1.0\"?><html><trk/></html>")));
        QVERIFY(!none.load(m_dir.filePath("missing.gpx")));
        QVERIFY(!none.load(write("empty.gpx", QByteArray())));
        QVERIFY(!none.load(QStringLiteral("/dev/zero"))); // endless data: refused, not read
        QVERIFY(!none.load(m_dir.path()));
        QVERIFY(!none.load(write("blank.gpx", "  \r\n\n ")));
        QVERIFY(!none.load(write("binary.gpx", QByteArray("\x00\x01\xff\xfe garbage", 14))));
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

        const QVector<TrackPoint> &p = file.items().at(0).points;
        QCOMPARE(p.size(), 6);
        QCOMPARE(p[0].latitude, 46.0);
        QVERIFY(!p[0].hasAltitude);
        QCOMPARE(p[0].altitude, 0.0);
        QVERIFY(p[1].hasAltitude);
        QCOMPARE(p[1].altitude, 12.5);
        QCOMPARE(p[2].name, QStringLiteral("Same"));
        // Missing "lon" reads as 0 and a damaged ele as altitude 0.
        QCOMPARE(p[3].longitude, 0.0);
        QCOMPARE(p[3].latitude, 47.0);
        QVERIFY(p[3].hasAltitude);
        QCOMPARE(p[3].altitude, 0.0);
        QCOMPARE(p[4].altitude, -3.0);
        QCOMPARE(p[5].altitude, 100.0);
        QCOMPARE(p[5].name, QStringLiteral("A & B"));

        // A side of 0 counts as unset: the longitude 0 moved the left side to 0, and the
        // next point took it over again.
        const TrackBounds &b = file.items().at(0).bounds;
        QCOMPARE(b.left, 7.5);
        QCOMPARE(b.right, 9.5);
        QCOMPARE(b.top, 45.5);
        QCOMPARE(b.bottom, 47.0);
        QCOMPARE(b.toRect(), QRectF(QPointF(7.5, 45.5), QPointF(9.5, 47.0)));

        TrackFile other;
        QVERIFY(other.load(write("creator.gpx", gpx(trk(trkpt(1, 2)), " creator=\"tourlet\""))));
        QVERIFY(!other.isOwnFile());
        QCOMPARE(other.boundsTopLeft(), QPointF());
        QVERIFY(!other.load(write("nonfinite.gpx", gpx(trk(trkpt(1, 2).replace("\"2\"", "\"inf\"") +
                                                             "<trkpt lat=\"nan\" lon=\"1\"/>")))));
    }

    void gpxRealWorldShapes()
    {
        // A device file: default namespace, schema locations, extensions in their own
        // namespaces, a byte-order mark and CRLF line ends.
        const QByteArray device =
            "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"no\" ?>\r\n"
            "<gpx xmlns=\"http://example.org/GPX/1/1\" xmlns:gpxx=\"http://example.org/schemas/GpxExtensions/v3\"\r\n"
            " xmlns:gpxtpx=\"http://example.org/schemas/TrackPointExtension/v1\"\r\n"
            " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\" creator=\"Handheld 30\" version=\"1.1\"\r\n"
            " xsi:schemaLocation=\"http://example.org/GPX/1/1 http://example.org/GPX/1/1/gpx.xsd\">\r\n"
            "  <metadata><link href=\"http://example.org\"><text>x</text></link><time>2021-06-01T08:00:00Z</time></metadata>\r\n"
            "  <trk><name>Ride</name><extensions><gpxx:TrackExtension><gpxx:DisplayColor>Red</gpxx:DisplayColor>"
            "</gpxx:TrackExtension></extensions>\r\n"
            "    <trkseg>\r\n"
            "      <trkpt lat=\"47.3769\" lon=\"8.5417\">\r\n        <ele>408.2</ele>\r\n"
            "        <time>2021-06-01T08:00:00Z</time>\r\n"
            "        <extensions><gpxtpx:TrackPointExtension><gpxtpx:hr>112</gpxtpx:hr><gpxtpx:cad>80</gpxtpx:cad>"
            "</gpxtpx:TrackPointExtension></extensions>\r\n      </trkpt>\r\n"
            "      <trkpt lat='47.3770' lon='8.5420'><ele><!-- gps -->409<![CDATA[.5]]></ele></trkpt>\r\n"
            "    </trkseg>\r\n  </trk>\r\n</gpx>\r\n";
        TrackFile file;
        QVERIFY(file.load(write("device.gpx", device)));
        QCOMPARE(file.creator(), QStringLiteral("Handheld 30"));
        QCOMPARE(file.time(), QStringLiteral("2021-06-01T08:00:00Z"));
        QCOMPARE(file.items().size(), size_t(1));
        const QVector<TrackPoint> &p = file.items()[0].points;
        QCOMPARE(p.size(), 2);
        QCOMPARE(p[0].altitude, 408.2);
        QCOMPARE(p[1].altitude, 409.5);
        QCOMPARE(p[1].longitude, 8.542);

        // Old line ends (CR alone) between attributes must still separate them.
        QByteArray classic = gpx(trk(trkpt(10, 20) + trkpt(11, 21)));
        classic.replace('\n', '\r').replace("<trkpt lat", "<trkpt\rlat");
        QVERIFY(file.load(write("cr.gpx", classic)));
        QCOMPARE(file.items()[0].points.size(), 2);

        // UTF-16 with a byte-order mark, as some tools write it.
        const QString text = QString::fromUtf8(gpx(wpt(1, "<name>Zürich</name>"))).replace("UTF-8", "UTF-16");
        QByteArray utf16("\xFF\xFE");
        utf16.append(reinterpret_cast<const char *>(text.utf16()), text.size() * 2);
        QVERIFY(file.load(write("utf16.gpx", utf16)));
        QCOMPARE(file.items()[0].points[0].name, QStringLiteral("Zürich"));

        // A GPX 1.0 file with a prefixed root: local names decide.
        QVERIFY(file.load(write("prefixed.gpx", "<g:gpx xmlns:g=\"http://example.org/GPX/1/0\"><g:rte>"
                                                "<g:rtept lat=\"1\" lon=\"1\"><g:name>R</g:name></g:rtept></g:rte></g:gpx>")));
        QCOMPARE(file.items()[0].points[0].name, QStringLiteral("R"));
    }

    void damagedXmlKeepsWhatWasRead()
    {
        const QByteArray whole = gpx(trk(trkpt(1, 1) + trkpt(2, 2) + trkpt(3, 3)));
        TrackFile file;
        // Cut inside the third point: the two before it stay and the read succeeds.
        QVERIFY(file.load(write("cut.gpx", whole.left(whole.indexOf("lat=\"3\"") + 3))));
        QCOMPARE(file.items()[0].points.size(), 2);

        // Cut before any point ends: nothing to show.
        QVERIFY(!file.load(write("cut2.gpx", whole.left(60))));

        // An element inside a text-only element is an error that ends the walk there; the
        // point being read is still added, without its elevation.
        QVERIFY(file.load(write("nested.gpx", gpx(trk(trkpt(1, 1) + trkpt(2, 2, "<ele><b>5</b></ele>") + trkpt(3, 3))))));
        QCOMPARE(file.items()[0].points.size(), 2);
        QCOMPARE(file.items()[0].points[1].altitude, 0.0);

        // An undeclared prefix is a namespace error at that element.
        QVERIFY(file.load(write("prefix.gpx", gpx(trk(trkpt(1, 1) + trkpt(2, 2, "<x:hr>1</x:hr>") + trkpt(3, 3))))));
        QCOMPARE(file.items()[0].points.size(), 2);

        // Data after the document and a second root are ignored.
        QVERIFY(file.load(write("tail.gpx", whole + "<gpx><trk><trkseg>" + trkpt(9, 9) + "</trkseg></trk></gpx>")));
        QCOMPARE(file.items()[0].points.size(), 3);
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

        // Deep nesting of unknown elements inside a point, and an unclosed flood of them.
        const QByteArray deep = QByteArray("<x>").repeated(200000) + QByteArray("</x>").repeated(200000);
        QVERIFY(file.load(write("deep.gpx", gpx(trk(trkpt(1, 1, deep) + trkpt(2, 2))))));
        QCOMPARE(file.items()[0].points.size(), 2);
        QVERIFY(!file.load(write("flood.kml", "<kml><Document>" + QByteArray("<Folder>").repeated(200000))));

        // Extreme numbers are kept as numbers; only infinite ones are refused.
        QVERIFY(file.load(write("extreme.gpx", gpx(trk(trkpt(1, 1, "<ele>1e308</ele>") + "<trkpt lat=\"1e-320\" lon=\"-1.7976931348623157e308\"/>")))));
        QCOMPARE(file.items()[0].points.size(), 2);
        QCOMPARE(file.items()[0].points[0].altitude, 1e308);
        QCOMPARE(file.items()[0].bounds.left, -1.7976931348623157e308);
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
        QCOMPARE(file.creator(), QString());
        QCOMPARE(int(file.items().size()), 2);

        const TrackItem &waypoints = file.items()[0];
        QCOMPARE(waypoints.type, int32_t(TrackItem::Waypoints));
        QCOMPARE(waypoints.points.size(), 2);
        QCOMPARE(waypoints.points[0].name, QStringLiteral("Start"));
        QCOMPARE(waypoints.points[0].altitude, 500.0);
        QVERIFY(waypoints.points[1].name.isEmpty()); // its name came after the Point
        QVERIFY(!waypoints.points[1].hasAltitude);

        // Line strings and tracks join one track; the tab-joined tuple reads as one damaged
        // part, a two-field tuple has no elevation, the second folder is never reached.
        const TrackItem &track = file.items()[1];
        QCOMPARE(track.type, int32_t(TrackItem::Track));
        QCOMPARE(file.selectItem(), 1);
        QVector<double> longitudes;
        for (const TrackPoint &p : track.points)
            longitudes << p.longitude;
        QCOMPARE(longitudes, (QVector<double>{7.1, 7.3, 7.4, 7.5, 0.0, 1.0, 7.7}));
        QVERIFY(!track.points[2].hasAltitude);
        QCOMPARE(track.points[3].altitude, 30.0);
        QCOMPARE(track.points[4].latitude, 46.6);
        QCOMPARE(track.bounds.right, 7.7);
        QCOMPARE(track.points[5].altitude, 3.0);

        // A phone tracker's file: tracks in a multi-track, "when" and "coord" in turn.
        QVERIFY(file.load(write("gx.kml", "<kml xmlns:gx=\"g\"><Document><Placemark><gx:MultiTrack>"
                                          "<gx:Track><when>t</when><when>t</when><gx:coord>8.5 47.25 400.5</gx:coord>"
                                          "<gx:coord>\n 8.6\t47.3 </gx:coord></gx:Track><gx:Track><gx:coord>8.7 47.35 410"
                                          "</gx:coord><gx:coord>bad</gx:coord><gx:angles>0 0 0</gx:angles></gx:Track>"
                                          "</gx:MultiTrack></Placemark></Document></kml>")));
        QCOMPARE(int(file.items().size()), 1);
        const QVector<TrackPoint> &gx = file.items()[0].points;
        QCOMPARE(gx.size(), 3);
        QCOMPARE(gx[0].latitude, 47.25);
        QCOMPARE(gx[0].altitude, 400.5);
        QCOMPARE(gx[1].longitude, 8.6);
        QVERIFY(!gx[1].hasAltitude);
        QCOMPARE(gx[2].longitude, 8.7);

        // Placemarks right under the root are read too.
        QVERIFY(file.load(write("flat.kml", "<kml><Placemark><Point><coordinates>1,2,3</coordinates></Point></Placemark>"
                                            "<Placemark><Point><coordinates>4,5</coordinates></Point></Placemark></kml>")));
        QCOMPARE(file.items()[0].points.size(), 2);
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
            "</Position></Trackpoint>\r\n"
            "</Track></Lap>\r\n"
            "<Lap><Track><Trackpoint><Position><LatitudeDegrees>46.7</LatitudeDegrees><LongitudeDegrees>7.7"
            "</LongitudeDegrees></Position></Trackpoint></Track>"
            "<Track><Trackpoint><Position><LatitudeDegrees>46.8</LatitudeDegrees><LongitudeDegrees>7.8"
            "</LongitudeDegrees></Position></Trackpoint></Track></Lap>\r\n"
            "<Lap><Track/></Lap><Lap><Track><Trackpoint><Position><LatitudeDegrees>46.9</LatitudeDegrees>"
            "<LongitudeDegrees>7.9</LongitudeDegrees></Position></Trackpoint></Track></Lap>\r\n"
            "</Activity>\r\n"
            "<Activity><Lap><Track><Trackpoint><Position><LatitudeDegrees>1</LatitudeDegrees><LongitudeDegrees>1"
            "</LongitudeDegrees></Position></Trackpoint></Track></Lap></Activity>"
            "</Activities></TrainingCenterDatabase>\r\n";
        TrackFile file;
        QVERIFY(file.load(write("laps.tcx", tcx)));
        QCOMPARE(int(file.items().size()), 1);
        const QVector<TrackPoint> &p = file.items()[0].points;
        // The trackpoint without position is dropped, the second activity not read.
        QVector<double> latitudes;
        for (const TrackPoint &point : p)
            latitudes << point.latitude;
        QCOMPARE(latitudes, (QVector<double>{46.5, 46.6, 46.7, 46.8, 46.9}));
        QCOMPARE(p[0].altitude, 600.0);
        QVERIFY(p[1].hasAltitude); // no AltitudeMeters still gives altitude 0
        QCOMPARE(p[1].altitude, 0.0);

        const QByteArray course =
            "<TrainingCenterDatabase><Folders/><Courses><Course><Name>c</Name><Track>"
            "<Trackpoint><Position><LatitudeDegrees>2</LatitudeDegrees><LongitudeDegrees>3</LongitudeDegrees></Position>"
            "</Trackpoint></Track><CoursePoint><Name>x</Name></CoursePoint></Course></Courses></TrainingCenterDatabase>";
        QVERIFY(file.load(write("course.tcx", course)));
        QCOMPARE(file.items()[0].points[0].latitude, 2.0);

        QVERIFY(!file.load(write("nopos.tcx", "<TrainingCenterDatabase><Activities><Activity><Lap><Track><Trackpoint>"
                                              "<Position><LatitudeDegrees>2</LatitudeDegrees></Position></Trackpoint>"
                                              "</Track></Lap></Activity></Activities></TrainingCenterDatabase>")));
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
        QCOMPARE(int(file.items().size()), 1);
        const QVector<TrackPoint> &p = file.items()[0].points;
        QCOMPARE(p.size(), 3);
        QCOMPARE(p[0].latitude, 47.251245);
        QCOMPARE(p[0].longitude, 8.546531);
        QCOMPARE(p[0].altitude, 408.0);
        QCOMPARE(p[1].longitude, 8.56); // "W" isn't evaluated
        QVERIFY(p[1].hasAltitude);
        QCOMPARE(p[1].altitude, 0.0);
        QCOMPARE(p[2].altitude, 410.0);

        // The same in UTF-8 with a byte-order mark, and with old line ends.
        QString text = QString::fromLatin1(latin1);
        QByteArray utf8 = "\xEF\xBB\xBF" + text.toUtf8();
        QVERIFY(file.load(write("route.TRK", utf8)));
        QCOMPARE(file.items()[0].points.size(), 3);
        QVERIFY(file.load(write("old.trk", QByteArray(latin1).replace("\r\n", "\r"))));
        QCOMPARE(file.items()[0].points.size(), 3);

        // Floods of line ends and an overlong line are read in little memory; the overlong
        // line is skipped whole and the point after it still read.
        const QString flood = write("flood.trk", QByteArray(8 << 20, '\n') + QByteArray(8 << 20, '\r') +
                                                     "T  A 10\xBAN 20\xBA" "E " + QByteArray(100000, 'x') + "\r\n" +
                                                     latin1.mid(latin1.indexOf("T  A 47.27")));
        const long peakBefore = peakRssKiB();
        QVERIFY(file.load(flood));
        QCOMPARE(file.items()[0].points.size(), 2);
        QCOMPARE(file.items()[0].points[0].latitude, 47.27);
        QVERIFY2(peakRssKiB() - peakBefore < 16 * 1024, qPrintable(QString::number(peakRssKiB() - peakBefore)));

        // Not a trk by its suffix: read as XML and refused.
        QVERIFY(!file.load(write("route.trk.txt", latin1)));
        QVERIFY(!file.load(write("empty.trk", QByteArray())));
        QVERIFY(!file.load(write("header.trk", "G  WGS 84\nT\nT A\nT A 5\n\xBA\n")));
    }

    void parsersOnOpenDevices()
    {
        TrackFile file;
        QByteArray data = gpx(trk(trkpt(1, 2)));
        QBuffer buffer(&data);
        QVERIFY(buffer.open(QIODevice::ReadOnly));
        QVERIFY(file.readXml(&buffer));
        QCOMPARE(file.items()[0].points.size(), 1);

        // Each read starts afresh.
        QByteArray trkData = "T A 1\xBAN 2\xBA" "E\n";
        QBuffer trkBuffer(&trkData);
        QVERIFY(trkBuffer.open(QIODevice::ReadOnly));
        QVERIFY(file.readTrk(&trkBuffer));
        QCOMPARE(file.items()[0].points[0].latitude, 1.0);
        QCOMPARE(file.creator(), QString());
    }
};

QTEST_GUILESS_MAIN(TestTrackFile)
#include "tst_trackfile.moc"

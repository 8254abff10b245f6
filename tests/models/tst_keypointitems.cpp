#include "models/QKeyPointImageItemsModel.h"
#include "models/QKeyPointItemsModel.h"
#include "path/DefaultTitle.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QAbstractItemModelTester>
#include <QMetaMethod>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

namespace {

// Symbols 20 and 21 plain, 22 a photo frame.
std::vector<WaypointItem> catalogue()
{
    std::vector<WaypointItem> items(3);
    const char *names[] = {"star", "pin", "frame"};
    for (size_t i = 0; i < items.size(); ++i) {
        items[i].id = uint32_t(20 + i);
        items[i].name = QString::fromLatin1(names[i]);
        items[i].sourceFile = QStringLiteral("/c/%1.png").arg(items[i].name);
        items[i].thumbFile = QStringLiteral("/c/%1_t.png").arg(items[i].name);
    }
    items[2].isMediaTemplate = true;
    items[2].mediaCenterOffset = {12.5, -3.0};
    items[2].mediaSize = {100.0, 80.0};
    return items;
}

class AnsweringDialogs : public KeyPointDialogs
{
public:
    QFont font;
    QString picture;
    bool chooseFont(QFont &chosen) override
    {
        chosen = font;
        return true;
    }
    bool choosePicture(QString &fileName, const QString &) override
    {
        fileName = picture;
        return true;
    }
};

// The document and both models, each watched by a model tester.
struct Setup
{
    PainterPathRenderer_Controller document;
    KeyPointItemsData data{&document};
    QKeyPointItemsModel model;
    QKeyPointImageItemsModel symbols;
    QAbstractItemModelTester modelTester{&model, QAbstractItemModelTester::FailureReportingMode::Fatal};
    QAbstractItemModelTester symbolsTester{&symbols, QAbstractItemModelTester::FailureReportingMode::Fatal};

    Setup()
    {
        model.setData(&data);
        symbols.setData(&data.imageItems());
        symbols.refill(catalogue(), QStringLiteral("Browse"));
    }
    Path &path() { return document.pathManager().activeChecked(); }
    uint32_t add(double longitude, double latitude, const QString &title = QString())
    {
        model.addKeyPoint(longitude, latitude, 0.0, title);
        return data.activeKeyPointId();
    }
    // Three points in a row along the equator.
    void addThree()
    {
        for (int i = 0; i < 3; ++i)
            add(i, 0.0);
    }
    QVariant field(int row, const QString &key) const { return data.items().at(size_t(row)).toMap().value(key); }
};

// The names of the model's signals in the order they came.
class SignalOrder : public QObject
{
    Q_OBJECT
public:
    explicit SignalOrder(QObject *source)
    {
        const QMetaObject *meta = source->metaObject();
        const int slot = metaObject()->indexOfSlot("record()");
        for (int i = 0; i < meta->methodCount(); ++i) {
            // A signal with default arguments is listed once more for each.
            const QMetaMethod method = meta->method(i);
            if (method.methodType() == QMetaMethod::Signal && !(method.attributes() & QMetaMethod::Cloned))
                QMetaObject::connect(source, i, this, slot);
        }
    }
    QStringList names;

public slots:
    void record() { names << QString::fromLatin1(sender()->metaObject()->method(senderSignalIndex()).name()); }
};

} // namespace

class TestKeyPointItems : public QObject
{
    Q_OBJECT

private slots:
    void init()
    {
        setDefaultPointTitle(QStringLiteral("Waypoint"));
        resetDefaultKeyPointTitleCounter();
    }

    void addingTitlesRepeatsAndSettings()
    {
        Setup s;
        s.add(1, 1);
        s.model.setKeyPointSize(2.5);
        s.add(2, 2, QStringLiteral("Paris, France"));
        SignalOrder repeat(&s.model);
        s.model.addKeyPoint(1, 1, 0.0, QStringLiteral("again"));
        QVERIFY(repeat.names.isEmpty());

        const uint32_t secondSegment = s.data.segmentIdOf(s.data.items()[1].elementId);
        SignalOrder order(&s.model);
        QSignalSpy segmentChanged(&s.model, &QKeyPointItemsModel::pathSegmentChanged);
        s.add(3, 3);

        QCOMPARE(s.field(0, "title").toString(), QStringLiteral("Waypoint 1"));
        QCOMPARE(s.field(1, "title").toString(), QStringLiteral("Paris"));
        // Named points count too.
        QCOMPARE(s.field(2, "title").toString(), QStringLiteral("Waypoint 3"));
        QCOMPARE(s.field(2, "size").toDouble(), 2.5);
        QCOMPARE(s.field(0, "keyPointImageSource").toString(), QStringLiteral("file:///c/pin.png"));

        const QStringList expected{"rowsInserted", "activeItemChanged", "activeKeyPointIdChanged", "dataChanged",
                                   "sizeChanged",  "addMarker",         "addPathSegment",          "pathChanged"};
        QStringList seen = order.names;
        seen.removeAll(QStringLiteral("rowsAboutToBeInserted"));
        seen.removeAll(QStringLiteral("pathSegmentChanged"));
        QCOMPARE(seen, expected);
        // The leg before the new point now reaches it.
        QVERIFY(order.names.lastIndexOf(QStringLiteral("pathSegmentChanged")) > order.names.indexOf(QStringLiteral("addPathSegment")));
        QVERIFY(std::any_of(segmentChanged.begin(), segmentChanged.end(), [&](const QList<QVariant> &args) {
            return args[0].toUInt() == secondSegment && !args[1].value<QGeoPath>().path().isEmpty();
        }));
    }

    void scopeEdit_data()
    {
        QTest::addColumn<QByteArray>("slot");
        QTest::addColumn<QVariant>("value");
        QTest::addColumn<bool>("all");
        QTest::addColumn<QString>("key");
        QTest::addColumn<bool>("changes");
        QTest::addColumn<QVariant>("stored");

        QTest::newRow("size of one") << QByteArray("setKeyPointSize") << QVariant(2.0) << false << "size" << true << QVariant(2.0);
        QTest::newRow("same size of one") << QByteArray("setKeyPointSize") << QVariant(1.0) << false << "size" << false
                                          << QVariant(1.0);
        QTest::newRow("same size of all") << QByteArray("setKeyPointSize") << QVariant(1.0) << true << "size" << true
                                          << QVariant(1.0);
        QTest::newRow("duration in whole ms") << QByteArray("setKeyPointAnimationDuration") << QVariant(1500.6) << false
                                              << "animationDuration" << true << QVariant(1501.0);
        QTest::newRow("colour of all") << QByteArray("setKeyPointFontColor") << QVariant(QColor(255, 128, 0)) << true
                                       << "keyPointFontColor" << true << QVariant(QColor(QStringLiteral("#ff8000")));
        QTest::newRow("shadow of one") << QByteArray("setKeyPointFontShadow") << QVariant(true) << false
                                       << "keyPointFontShadow" << true << QVariant(true);
    }

    void scopeEdit()
    {
        QFETCH(QByteArray, slot);
        QFETCH(QVariant, value);
        QFETCH(bool, all);
        QFETCH(QString, key);
        QFETCH(bool, changes);
        QFETCH(QVariant, stored);

        Setup s;
        s.add(1, 1);
        s.add(2, 2);
        const QVariant before = s.field(0, key);
        if (all)
            s.model.setActiveKeyPointId(-1);
        QSignalSpy one(&s.model, &QKeyPointItemsModel::updateMarker);
        QSignalSpy every(&s.model, &QKeyPointItemsModel::updateAllMarkersProperty);
        QSignalSpy active(&s.model, &QKeyPointItemsModel::activeItemChanged);
        QVERIFY(QMetaObject::invokeMethod(&s.model, slot, QGenericArgument(value.typeName(), value.constData())));

        QCOMPARE(one.count(), changes && !all ? 1 : 0);
        QCOMPARE(every.count(), changes && all ? 1 : 0);
        QCOMPARE(active.count(), changes ? 1 : 0);
        QCOMPARE(s.field(1, key), stored);
        QCOMPARE(s.field(0, key), all ? stored : before);
        if (all && changes) {
            QCOMPARE(every.first()[0].toMap(), QVariantMap({{key, stored}}));
            QCOMPARE(s.model.activeItem().value(QStringLiteral("elementId")).toInt(), -1);
            QCOMPARE(s.model.activeItem().value(key), stored);
        }
    }

    void fontDialog()
    {
        Setup s;
        const uint32_t id = s.add(1, 1);
        QSignalSpy one(&s.model, &QKeyPointItemsModel::updateMarker);
        s.model.openFontDialog();
        QCOMPARE(one.count(), 0);

        auto dialogs = std::make_unique<AnsweringDialogs>();
        dialogs->font = QFont(QStringLiteral("Serif"), 12, QFont::Bold, true);
        s.data.setDialogs(std::move(dialogs));
        s.model.openFontDialog();
        QCOMPARE(one.count(), 1);
        const KeyPointFont &font = s.document.pathManager().keyPointById(id)->properties.font;
        QCOMPARE(font.family, QStringLiteral("Serif"));
        QCOMPARE(font.pointSize, 12.0);
        QCOMPARE(font.style, 3u);
    }

    void enabling()
    {
        Setup s;
        const uint32_t first = s.add(1, 1);
        s.add(2, 2);
        QSignalSpy one(&s.model, &QKeyPointItemsModel::updateMarker);
        QSignalSpy every(&s.model, &QKeyPointItemsModel::updateAllMarkersProperty);
        QSignalSpy state(&s.model, &QKeyPointItemsModel::allKeyPointsEnabledStateChanged);

        s.model.enableKeyPoint(int(first), false);
        QCOMPARE(one.count(), 1);
        QVERIFY(!s.model.allKeyPointsEnabledState());
        QVERIFY(!s.document.pathManager().keyPointById(first)->properties.enabled);

        s.model.enableAllKeyPoints(true);
        QCOMPARE(every.count(), 1);
        QCOMPARE(every.first()[0].toMap(), QVariantMap({{QStringLiteral("enabled"), true}}));
        QVERIFY(s.model.allKeyPointsEnabledState());
        QCOMPARE(state.count(), 2);

        s.model.enableAllKeyPoints(true);
        QCOMPARE(every.count(), 1);
        QCOMPARE(one.count(), 1);
    }

    void addOnRoute_data()
    {
        QTest::addColumn<bool>("track");
        QTest::addColumn<bool>("marked");
        QTest::newRow("route") << false << true;
        QTest::newRow("track, on the route") << true << true;
        QTest::newRow("track, elsewhere") << true << false;
    }

    void addOnRoute()
    {
        QFETCH(bool, track);
        QFETCH(bool, marked);
        Setup s;
        s.addThree();
        if (track) {
            s.path().pathType = PathType::GPX;
            s.document.setKeyPointsFixed(true);
        }
        const uint32_t second = s.path().keyPoints[1].id;
        CurvePoint &sample = s.path().curvePoints[size_t(s.path().curvePointIndexNaming(second) + 50)];
        const double x = sample.x, y = sample.y;
        sample.tt = marked ? 1 : 0;
        QSignalSpy inserted(&s.model, &QKeyPointItemsModel::insertPathSegment);
        QSignalSpy changed(&s.model, &QKeyPointItemsModel::pathSegmentChanged);

        s.model.addKeyPoint(10, 10, 0.0, QString());
        if (!marked) {
            QCOMPARE(s.model.rowCount(), 3);
            QCOMPARE(s.path().keyPoints.size(), size_t(3));
            return;
        }
        QCOMPARE(s.model.rowCount(), 4);
        const KeyPoint &added = s.path().keyPoints.at(2);
        QCOMPARE(s.data.items()[2].elementId, added.id);
        QCOMPARE(added.x, x);
        QCOMPARE(added.y, y);
        QVERIFY(std::none_of(s.path().curvePoints.begin(), s.path().curvePoints.end(),
                             [](const CurvePoint &p) { return p.tt != 0; }));
        QCOMPARE(inserted.count(), 1);
        const uint32_t segment = s.data.segmentIdOf(added.id);
        QCOMPARE(inserted.first()[0].toUInt(), s.data.segmentIdOf(second));
        QCOMPARE(inserted.first()[1].toUInt(), segment);
        QVERIFY(!inserted.first()[2].value<QGeoPath>().path().isEmpty());
        QCOMPARE(changed.first()[0].toUInt(), segment);
        QVERIFY(std::any_of(changed.begin(), changed.end(),
                            [&](const QList<QVariant> &args) { return args[0].toUInt() == inserted.first()[0].toUInt(); }));
    }

    void deletingAll()
    {
        Setup s;
        s.addThree();
        const std::vector<KeyPoint> points = s.path().keyPoints;
        const CurvePoint &onSecond = s.path().curvePoints[size_t(s.path().curvePointIndexNaming(points[1].id))];
        const MediaPoint media(onSecond.x, onSecond.y, 0.0);
        s.path().addMediaPoint(media, points[1].id, false);
        const CurvePoint &onLeg = s.path().curvePoints[20];
        s.path().addMediaPoint(MediaPoint(onLeg.x, onLeg.y, 0.0), 0, false);
        QSignalSpy deleted(&s.model, &QKeyPointItemsModel::keyPointDeleted);
        QSignalSpy segments(&s.model, &QKeyPointItemsModel::deletePathSegment);
        QSignalSpy photos(&s.model, &QKeyPointItemsModel::mediaPointDeleted);

        s.model.deleteKeyPoint(int(points[2].id + 1000));
        QCOMPARE(deleted.count(), 0);
        s.model.deleteKeyPoint(-1);

        QCOMPARE(s.model.rowCount(), 0);
        QVERIFY(s.path().keyPoints.empty() && s.path().pathSegments.empty() && s.path().curvePoints.empty());
        QCOMPARE(deleted.count(), 3);
        QCOMPARE(deleted.first()[0].toUInt(), points[2].id);
        QCOMPARE(segments.count(), 3);
        // The photo on the second point goes with it, the one on the route with the route.
        QCOMPARE(photos.count(), 2);
        QCOMPARE(photos.first()[0].toUInt(), media.id);
        QVERIFY(s.path().mediaPoints.empty());
        QCOMPARE(s.model.activeKeyPointId(), 0);
    }

    void playbackVisibility()
    {
        Setup s;
        s.addThree();
        QSignalSpy one(&s.model, &QKeyPointItemsModel::updateMarker);
        QSignalSpy every(&s.model, &QKeyPointItemsModel::updateAllMarkersProperty);
        s.model.setAllVisibleForAnimation(false);
        QCOMPARE(every.count(), 1);

        const int second = s.path().curvePointIndexNaming(s.path().keyPoints[1].id);
        s.model.setVisibleForAnimation(0, second, true);
        QCOMPARE(one.count(), 2);
        QVERIFY(one.last()[0].toMap().value(QStringLiteral("enabledForAnimation")).toBool());
        QVERIFY(!s.field(2, "enabledForAnimation").toBool());
        s.model.setVisibleForAnimation(0, second, true);
        QCOMPARE(one.count(), 2);
    }

    void symbolList()
    {
        Setup s;
        QCOMPARE(s.symbols.rowCount(), 4);
        const QModelIndex browse = s.symbols.index(0, 0);
        QCOMPARE(browse.data(QKeyPointImageItemsModel::TitleRole).toString(), QStringLiteral("Browse"));
        QCOMPARE(s.symbols.index(3, 0).data(QKeyPointImageItemsModel::ImageSourceRole).toString(),
                 QStringLiteral("file:///c/frame_t.png"));
        QVariantMap frame, pin;
        QVERIFY(s.data.imageItems().itemById(22, frame) && s.data.imageItems().itemById(21, pin));
        QCOMPARE(frame.value(QStringLiteral("mediaSize")).toSizeF(), QSizeF(100, 80));
        QCOMPARE(frame.value(QStringLiteral("mediaCenterOffset")).toPointF(), QPointF(12.5, -3));
        QCOMPARE(pin.value(QStringLiteral("mediaSize")).toSizeF(), QSizeF(0, 0));

        s.symbols.refill({}, QStringLiteral("Browse"));
        QCOMPARE(s.symbols.rowCount(), 1);
        QCOMPARE(s.symbols.index(0, 0).data(QKeyPointImageItemsModel::TitleRole).toString(), QStringLiteral("Browse"));
    }

    void choosingSymbols()
    {
        Setup s;
        const uint32_t id = s.add(1, 1);
        const PoolPhoto photo = s.document.photoPool().add(QStringLiteral("/photos/a.jpg"), 10, 10);
        const int browseId = s.symbols.index(0, 0).data(QKeyPointImageItemsModel::KeyPointImageItemIdRole).toInt();
        const KeyPointProperties &stored = s.document.pathManager().keyPointById(id)->properties;
        QSignalSpy one(&s.model, &QKeyPointItemsModel::updateMarker);

        s.model.setKeyPointImage(int(id), 22);
        QCOMPARE(stored.imageSource, QStringLiteral("file:///c/frame.png"));
        QVERIFY(stored.isMediaTemplate);
        QCOMPARE(stored.mediaSource, photo.path);
        QCOMPARE(one.count(), 1);

        s.model.setKeyPointImage(int(id), browseId);
        QCOMPARE(one.count(), 1);
        auto dialogs = std::make_unique<AnsweringDialogs>();
        dialogs->picture = QStringLiteral("/home/me/own.png");
        s.data.setDialogs(std::move(dialogs));
        s.model.setKeyPointImage(int(id), browseId);
        QCOMPARE(stored.imageSource, QStringLiteral("file:///home/me/own.png"));
        QVERIFY(!stored.isMediaTemplate);
    }

    void loadingAndClearing()
    {
        Setup s;
        for (int i = 0; i < 3; ++i)
            s.path().addKeyPoint(KeyPoint(i, i, 0.0), false);
        s.path().update();
        QSignalSpy markers(&s.model, &QKeyPointItemsModel::addMarker);
        QSignalSpy segments(&s.model, &QKeyPointItemsModel::addPathSegment);
        QSignalSpy progress(&s.model, &QKeyPointItemsModel::triggerLoadState);

        s.model.loadKeyPoints();
        QCOMPARE(s.model.rowCount(), 3);
        QCOMPARE(markers.count(), 3);
        QCOMPARE(segments.count(), 3);
        QCOMPARE(segments.last()[0].toUInt(), s.path().pathSegments.back().id);
        double last = -1.0;
        for (const QList<QVariant> &args : progress) {
            const double value = args[1].toDouble();
            QVERIFY(value > last && value < 100.0);
            QCOMPARE(args[0].toInt(), value < 50.0 ? 3 : 5);
            last = value;
        }

        // The chart's distances run along the route, which is about straight here.
        QSignalSpy altitude(&s.model, &QKeyPointItemsModel::altitudeDataChanged);
        s.model.updateAltitudeData();
        const QVariantList distances = altitude.first()[1].toList();
        QCOMPARE(distances.size(), int(s.path().curvePoints.size()));
        QVERIFY(qAbs(distances.last().toDouble() - QGeoCoordinate(0, 0).distanceTo(QGeoCoordinate(2, 2))) < 1000.0);

        QSignalSpy cleared(&s.model, &QKeyPointItemsModel::clearAllObjects);
        s.model.clear();
        QCOMPARE(cleared.count(), 1);
        QCOMPARE(s.model.rowCount(), 0);
        QCOMPARE(s.path().keyPoints.size(), size_t(3));
    }

    void signalListOfTheInterface()
    {
        QQmlEngine engine;
        QQmlComponent component(&engine, QUrl::fromLocalFile(QStringLiteral(TOURLET_KEYPOINT_SIGNAL_LIST)));
        QObject holder;
        QObject *list = component.create();
        QVERIFY2(list, qPrintable(component.errorString()));
        list->setParent(&holder);
        Setup s;
        s.model.connectSignalList(&holder);

        QVERIFY(QMetaObject::invokeMethod(list, "addKeyPoint", Q_ARG(double, 4.0), Q_ARG(double, 5.0), Q_ARG(double, 0.0),
                                          Q_ARG(QString, QStringLiteral("Rome, Italy"))));
        QCOMPARE(s.field(0, "title").toString(), QStringLiteral("Rome"));
        QVERIFY(QMetaObject::invokeMethod(list, "setKeyPointFontColor", Q_ARG(QColor, QColor(Qt::blue))));
        QCOMPARE(s.field(0, "keyPointFontColor").value<QColor>(), QColor(Qt::blue));
        QVERIFY(QMetaObject::invokeMethod(list, "deleteKeyPoint", Q_ARG(int, -1)));
        QCOMPARE(s.model.rowCount(), 0);
    }
};

QTEST_MAIN(TestKeyPointItems)
#include "tst_keypointitems.moc"

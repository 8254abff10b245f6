#include "content/ContentItems.h"
#include "mapview/QBackgroundChooser.h"
#include "mapview/QMainController.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QImage>
#include <QSettings>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

namespace {

// Answers the picture dialog with a prepared file name, or cancels.
class PictureDialog : public FileDialogs
{
public:
    QString answer;
    QString openFileName(const QString &, const QString &, const QString &) override { return answer; }
    QString saveFileName(const QString &, const QString &, const QString &) override { return QString(); }
};

struct Chooser
{
    QTemporaryDir dir;
    QSettings store{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    PainterPathRenderer_Controller document;
    QMainController controller{&document, AppSettings(store)};
    QBackgroundChooser chooser{controller, document};
    PictureDialog *dialog = nullptr;

    Chooser()
    {
        auto owned = std::make_unique<PictureDialog>();
        dialog = owned.get();
        controller.setFileDialogs(std::move(owned));
        MapItem alps;
        alps.elementId = QStringLiteral("alps");
        alps.mainCategory = QStringLiteral("basemaps");
        alps.sourceFile = picture(QStringLiteral("alps.png"), QSize(200, 100));
        alps.background = QStringLiteral("#335577");
        chooser.buildTree({alps}, {QStringLiteral("Street")}, {QStringLiteral("Satellite"), QStringLiteral("Topo")});
        document.fields().backgroundMap = BackgroundSelection::defaultMap;
    }

    QString picture(const QString &name, const QSize &size) const
    {
        QImage image(size, QImage::Format_RGB32);
        image.fill(Qt::darkGreen);
        const QString path = dir.filePath(name);
        image.save(path);
        return path;
    }
};

} // namespace

class tst_BackgroundChooser : public QObject
{
    Q_OBJECT

private slots:
    void selectBackground_data()
    {
        QTest::addColumn<QString>("identifier");
        QTest::addColumn<QString>("dialogAnswer"); // a file name in the test folder, or none
        QTest::addColumn<QString>("background");   // "-" for unchanged, "file" for the answer's URL
        QTest::addColumn<QString>("colour");

        QTest::newRow("live layer") << "esri:layer:1" << "" << "esri:layer:1" << "#70b5d5";
        QTest::newRow("catalogue map, with its colour") << "pseudeo:map:alps" << "" << "pseudeo:map:alps" << "#335577";
        QTest::newRow("unknown catalogue map changes nothing") << "pseudeo:map:moon" << "" << "-" << "#70b5d5";
        QTest::newRow("cancelled browse changes nothing") << "?browse" << "" << "-" << "#70b5d5";
        QTest::newRow("browsed picture") << "?browse" << "own.png" << "file" << "#70b5d5";
        QTest::newRow("invalid identifier") << "somewhere" << "" << "-" << "#70b5d5";
    }

    void selectBackground()
    {
        QFETCH(QString, identifier);
        QFETCH(QString, dialogAnswer);
        QFETCH(QString, background);
        QFETCH(QString, colour);
        Chooser c;
        if (!dialogAnswer.isEmpty())
            c.dialog->answer = c.picture(dialogAnswer, QSize(10, 10));
        QSignalSpy modified(&c.chooser, &QBackgroundChooser::projectIsModified);
        c.chooser.selectBackground(identifier);

        const QString expected = background == QLatin1String("-")      ? BackgroundSelection::defaultMap
                                 : background == QLatin1String("file") ? contentFileUrl(c.dialog->answer)
                                                                       : background;
        QCOMPARE(c.chooser.backgroundMap(), expected);
        QCOMPARE(c.chooser.backgroundMapColor().name(), colour);
        QCOMPARE(modified.count(), background == QLatin1String("-") ? 0 : 1);
    }

    // The rectangle the user draws takes the proportions of the picture, about its middle.
    void rectangleFitsThePicture_data()
    {
        QTest::addColumn<QSize>("picture");
        QTest::addColumn<QRectF>("drawn"); // x longitude, y latitude of the top-left corner
        QTest::addColumn<double>("widthOverHeight");
        QTest::addColumn<bool>("keepsWidth");

        // Near the equator a degree is about as long both ways.
        QTest::newRow("2:1 on a square picture") << QSize(300, 300) << QRectF(10, 2, 4, -2) << 1.0 << true;
        QTest::newRow("1:2 on a square picture") << QSize(300, 300) << QRectF(10, 2, 2, -4) << 1.0 << false;
        QTest::newRow("square on a 2:1 picture") << QSize(400, 200) << QRectF(10, 2, 2, -2) << 2.0 << false;
    }

    void rectangleFitsThePicture()
    {
        QFETCH(QSize, picture);
        QFETCH(QRectF, drawn);
        QFETCH(double, widthOverHeight);
        QFETCH(bool, keepsWidth);
        Chooser c;
        c.chooser.selectBackground(contentFileUrl(c.picture(QStringLiteral("own.png"), picture)));
        QSignalSpy shown(&c.chooser, &QBackgroundChooser::initPseudoBackground);
        const QGeoCoordinate tl(drawn.top(), drawn.left());
        const QGeoCoordinate br(drawn.top() + drawn.height(), drawn.left() + drawn.width());
        c.chooser.savePseudoBoundaries(tl.longitude(), tl.latitude(), br.longitude(), br.latitude());
        QCOMPARE(shown.count(), 1);

        const QGeoRectangle fitted = c.chooser.pseudoBoundaries();
        const QGeoCoordinate ftl = fitted.topLeft(), fbr = fitted.bottomRight();
        const double width = ftl.distanceTo(QGeoCoordinate(ftl.latitude(), fbr.longitude()));
        const double height = ftl.distanceTo(QGeoCoordinate(fbr.latitude(), ftl.longitude()));
        QVERIFY2(std::abs(width / height - widthOverHeight) < 0.01, qPrintable(QString::number(width / height)));
        const double drawnWidth = tl.distanceTo(QGeoCoordinate(tl.latitude(), br.longitude()));
        const double drawnHeight = tl.distanceTo(QGeoCoordinate(br.latitude(), tl.longitude()));
        // Edges that moved north or south measure a little differently on the sphere.
        if (keepsWidth)
            QVERIFY(std::abs(width - drawnWidth) / drawnWidth < 0.002);
        else
            QVERIFY(std::abs(height - drawnHeight) / drawnHeight < 0.002);
        QVERIFY(fitted.center().distanceTo(QGeoRectangle(tl, br).center()) < 100.0);
        QVERIFY(c.chooser.centerPositionAfterLoad().distanceTo(fitted.center()) < 1.0);
    }

    void missingPictureLeavesTheRectangle()
    {
        Chooser c;
        c.document.fields().backgroundMap = QStringLiteral("file:///nowhere/gone.png");
        QSignalSpy changed(&c.chooser, &QBackgroundChooser::pseudoBoundariesChanged);
        c.chooser.savePseudoBoundaries(10, 2, 14, 0);
        QVERIFY(changed.isEmpty());
    }

    void treeListsEveryChoice()
    {
        Chooser c;
        QStringList ids;
        for (const QVariant &element : c.chooser.backgroundCategoryItemElements())
            ids << element.toMap().value(QStringLiteral("element_id")).toString();
        QCOMPARE(ids, QStringList({"osm:layer:0", "esri:layer:0", "esri:layer:1", "?browse", "pseudeo:map:alps"}));
        QCOMPARE(c.chooser.backgroundCategories().size(), 3);
        QCOMPARE(c.chooser.backgroundCategoryItems().size(), 5);
    }
};

QTEST_GUILESS_MAIN(tst_BackgroundChooser)
#include "tst_backgroundchooser.moc"

#include "content/ContentCatalogue.h"
#include "content/IniAccess.h"
#include "models/AltitudePreset.h"
#include "project/QProjectController.h"

#include <QColor>
#include <QDir>
#include <QFileInfo>
#include <QImage>
#include <QImageReader>
#include <QSet>
#include <QTest>

// The content that the build puts into the program folder, read the way the
// program reads it at start.
class TestShippedContent : public QObject
{
    Q_OBJECT

private:
    const QString m_root = QStringLiteral(TOURLET_IMAGE_ROOT "/");
    ContentCatalogue m_catalogue; // loaded first, so its ids are those of a program start

    template <typename Item>
    static const Item *find(const std::vector<Item> &items, const QString &name)
    {
        for (const Item &item : items)
            if (item.name == name)
                return &item;
        return nullptr;
    }

    // Frame files of a perspective avatar: stem_1, stem_2, ... without a gap.
    static int frameCount(const AvatarItem &avatar)
    {
        int frames = 0;
        while (QFileInfo::exists(QStringLiteral("%1_%2.%3").arg(avatar.sourceFile).arg(frames + 1).arg(avatar.type)))
            ++frames;
        return frames;
    }

    static QStringList presetFiles(const QString &root)
    {
        return QDir(root + QStringLiteral("altitudepresets")).entryList({QStringLiteral("*.tmprs")}, QDir::Files);
    }

private slots:
    void initTestCase()
    {
        QVERIFY2(QFileInfo(m_root).isDir(), qPrintable(m_root));
        QVERIFY(m_catalogue.load(m_root, QString()));
    }

    void counts_data()
    {
        QTest::addColumn<int>("count");
        QTest::addColumn<int>("minimum");
        int flat = 0, animated = 0, perspective = 0;
        for (const AvatarItem &a : m_catalogue.avatars()) {
            perspective += a.perspective;
            animated += a.animated && QImageReader(a.sourceFile).imageCount() > 1 ? 1 : 0;
            flat += (!a.perspective && !a.animated && a.name != QLatin1String("01_no_avatar")) ? 1 : 0;
        }
        int templates = 0;
        for (const WaypointItem &w : m_catalogue.waypoints())
            templates += w.isMediaTemplate && w.mediaSize.width > 0 && w.mediaSize.height > 0 ? 1 : 0;
        int basemaps = 0;
        for (const MapItem &m : m_catalogue.maps())
            basemaps += m.mainCategory == QLatin1String("basemaps") ? 1 : 0;
        QTest::newRow("2D avatars") << flat << 12;
        QTest::newRow("animated avatars") << animated << 1;
        QTest::newRow("perspective avatars") << perspective << 1;
        QTest::newRow("waypoint symbols") << int(m_catalogue.waypoints().size()) << 20;
        QTest::newRow("photo templates") << templates << 2;
        QTest::newRow("base maps") << basemaps << 3;
        QTest::newRow("masks") << int(m_catalogue.masks().size()) << 3;
        QTest::newRow("altitude presets") << int(presetFiles(m_root).size()) << 6;
    }

    void counts()
    {
        QFETCH(int, count);
        QFETCH(int, minimum);
        QVERIFY2(count >= minimum, qPrintable(QStringLiteral("%1 < %2").arg(count).arg(minimum)));
    }

    // Every picture the catalogue names can be read, at a size fit for a film.
    void pictures_data()
    {
        QTest::addColumn<QString>("file");
        QTest::addColumn<int>("minimumSize");
        auto add = [](const QString &kind, const ContentItem &item, int minimum) {
            QTest::addRow("%s %s", qPrintable(kind), qPrintable(item.name)) << item.sourceFile << minimum;
            QTest::addRow("%s %s thumbnail", qPrintable(kind), qPrintable(item.name)) << item.thumbFile << 48;
        };
        for (const AvatarItem &a : m_catalogue.avatars())
            if (!a.perspective)
                add(QStringLiteral("avatar"), a, 256);
        for (const WaypointItem &w : m_catalogue.waypoints())
            add(QStringLiteral("symbol"), w, 128);
        for (const MapItem &m : m_catalogue.maps())
            add(QStringLiteral("map"), m, 2048);
        for (const MaskItem &m : m_catalogue.masks())
            add(QStringLiteral("mask"), m, 512);
        QTest::newRow("splash") << m_root + QStringLiteral("splash/splash.png") << 400;
        QTest::newRow("splash 4k") << m_root + QStringLiteral("splash/splash_4k.png") << 800;
        QTest::newRow("window icon") << QStringLiteral(TOURLET_GENERATED_ICONS "/Qml/images/QZkGeo.png") << 128;
        QTest::newRow("no theme icon") << m_root + QStringLiteral("altitudepresets/Icons/no_preset.png") << 64;
    }

    void pictures()
    {
        QFETCH(QString, file);
        QFETCH(int, minimumSize);
        QImageReader reader(file);
        QVERIFY2(reader.canRead(), qPrintable(file));
        const QSize size = reader.size();
        QVERIFY2(std::max(size.width(), size.height()) >= minimumSize, qPrintable(file));
    }

    void perspectiveFrames()
    {
        for (const AvatarItem &a : m_catalogue.avatars()) {
            if (!a.perspective)
                continue;
            QVERIFY2(frameCount(a) >= 36, qPrintable(a.name));
            QCOMPARE(a.thumbFile, a.sourceFile + QStringLiteral("_1.") + a.type);
            const QImage first(a.thumbFile);
            QVERIFY(first.hasAlphaChannel() && first.width() >= 256);
        }
    }

    void itemsThatNewContentDefaultsTo()
    {
        const std::vector<WaypointItem> symbols = m_catalogue.waypoints();
        const auto pin = std::find_if(symbols.begin(), symbols.end(), [](const WaypointItem &w) { return w.id == 21; });
        QVERIFY(pin != symbols.end());
        QCOMPARE(pin->name, QStringLiteral("01_pin_red"));
        // Most coloured pixels of the pin are red.
        const QImage picture = QImage(pin->sourceFile).convertToFormat(QImage::Format_ARGB32);
        int coloured = 0, red = 0;
        for (int y = 0; y < picture.height(); ++y)
            for (int x = 0; x < picture.width(); ++x) {
                const QColor c = QColor::fromRgba(picture.pixel(x, y));
                if (c.alpha() < 200 || c.hsvSaturation() < 100)
                    continue;
                ++coloured;
                red += (c.hsvHue() <= 15 || c.hsvHue() >= 345) ? 1 : 0;
            }
        QVERIFY(coloured > 1000 && red > coloured * 9 / 10);

        const AvatarItem *cabrio = find(m_catalogue.avatars(), QStringLiteral("3d_cabrio"));
        QVERIFY(cabrio && cabrio->perspective);
        const AvatarItem *none = find(m_catalogue.avatars(), QStringLiteral("01_no_avatar"));
        QVERIFY(none);
        const QImage empty = QImage(none->sourceFile).convertToFormat(QImage::Format_ARGB32);
        QVERIFY(!empty.isNull());
        for (int y = 0; y < empty.height(); ++y)
            for (int x = 0; x < empty.width(); ++x)
                QCOMPARE(qAlpha(empty.pixel(x, y)), 0);
    }

    void maps()
    {
        QSet<QString> ids;
        for (const MapItem &m : m_catalogue.maps()) {
            ids << m.elementId;
            QVERIFY(QColor(m.background).isValid());
            QVERIFY(m.widthWeight.toDouble() > 0);
            // "<id>@west:north:east:south"; the picture has the extent's proportions.
            const QStringList extent = m.origins.section(QLatin1Char('@'), 1).split(QLatin1Char(':'));
            QCOMPARE(extent.size(), 4);
            const double width = extent.at(2).toDouble() - extent.at(0).toDouble();
            const double height = extent.at(1).toDouble() - extent.at(3).toDouble();
            const QSize size = QImageReader(m.sourceFile).size();
            QVERIFY(width > 0 && height > 0);
            QVERIFY(qAbs(size.width() / double(size.height()) - width / height) < 0.01);
        }
        QCOMPARE(ids.size(), int(m_catalogue.maps().size()));
        QSet<QString> guids;
        for (const MaskItem &m : m_catalogue.masks())
            guids << m.guid;
        QCOMPARE(guids.size(), int(m_catalogue.masks().size()));
        QVERIFY(!guids.contains(QStringLiteral("{00000000-0000-0000-0000-000000000000}")));
    }

    void languages_data()
    {
        QTest::addColumn<int>("language");
        for (int language = 0; language < 7; ++language)
            QTest::addRow("%s", qPrintable(ContentCatalogue::languageSuffix(language))) << language;
    }

    // Every group, map and start-up message has a text in every language.
    void languages()
    {
        QFETCH(int, language);
        ContentCatalogue catalogue;
        catalogue.load(m_root, QString(), language);
        const QStringList groups = catalogue.groups();
        QCOMPARE(groups.size(), m_catalogue.groups().size());
        QCOMPARE(QSet<QString>(groups.begin(), groups.end()).size(), groups.size());
        for (const QString &group : groups)
            QVERIFY(!group.isEmpty());
        for (const AvatarItem &a : catalogue.avatars())
            QVERIFY2(a.groupIndex < groups.size(), qPrintable(a.name));
        for (const MapItem &m : catalogue.maps())
            QVERIFY2(!m.name.isEmpty(), qPrintable(m.origins));
        const QString suffix = ContentCatalogue::languageSuffix(language);
        const QString avatars = m_root + QStringLiteral("avatars/Translation") + suffix + QStringLiteral(".ini");
        for (const char *pack : {"noCat", "UTP", "TEE"})
            QVERIFY(!readIniValue(avatars, QLatin1String(pack), QStringLiteral("name"), true).isEmpty());
        const QString splash = m_root + QStringLiteral("splash/Translation") + suffix + QStringLiteral(".ini");
        for (const char *key : {"splash_startup", "splash_init_tracking", "splash_connect_qml", "splash_set_source",
                                "splash_looking_for_updates"})
            QVERIFY2(!readIniValue(splash, QLatin1String(key), QStringLiteral("name"), true).isEmpty(), key);
    }

    void presets_data()
    {
        QTest::addColumn<QString>("name");
        for (const QString &file : presetFiles(m_root))
            QTest::newRow(qPrintable(file)) << QFileInfo(file).completeBaseName();
    }

    void presets()
    {
        QFETCH(QString, name);
        const QString folder = m_root + QStringLiteral("altitudepresets/");
        QProjectController store;
        AltitudePreset preset;
        QVERIFY(loadAltitudePreset(store, folder + name + QStringLiteral(".tmprs"), QString(), preset));
        QCOMPARE(preset.presetVersion, 1u);
        for (const QString &colour : {preset.boardColor, preset.increaseColor, preset.decreaseColor, preset.scaleColor,
                                      preset.scaleFontColor, preset.peakColor, preset.peakBackgroundColor,
                                      preset.graphGradientStartColor, preset.graphGradientMiddleColor,
                                      preset.graphGradientEndColor, preset.graphLineGradientStartColor,
                                      preset.graphLineGradientMiddleColor, preset.graphLineGradientEndColor,
                                      preset.graphLineColor})
            QVERIFY2(QColor(colour).isValid(), qPrintable(colour));
        QVERIFY(preset.opacity > 0 && preset.opacity <= 1 && preset.lineWidth > 0);
        QVERIFY(QImageReader(folder + QStringLiteral("Icons/") + name + QStringLiteral(".png")).canRead());
    }
};

QTEST_GUILESS_MAIN(TestShippedContent)
#include "tst_shippedcontent.moc"

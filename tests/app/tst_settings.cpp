#include "TestFiles.h"
#include "app/AppSettings.h"
#include "app/Language.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSettings>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

class TestSettings : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_home;
    QTemporaryDir m_dir;
    int m_storeCount = 0;

    // A separate ini file per test, never the user's store.
    std::unique_ptr<QSettings> freshStore()
    {
        const QString file = m_dir.filePath(QStringLiteral("store%1.ini").arg(++m_storeCount));
        return std::make_unique<QSettings>(file, QSettings::IniFormat);
    }
    QString makeDir(const QString &relative)
    {
        const QString path = m_dir.filePath(relative);
        QDir().mkpath(path);
        return path;
    }
    static bool isStoredText(const QSettings &store, const QString &key, const QString &text)
    {
        const QVariant v = store.value(key);
        return v.type() == QVariant::String && v.toString() == text;
    }
    static QString standardFolder(QStandardPaths::StandardLocation location)
    {
        return QStandardPaths::standardLocations(location).value(0);
    }

private slots:
    void initTestCase()
    {
        QVERIFY(m_home.isValid());
        QVERIFY(m_dir.isValid());
        // Keep the standard folders away from the real user.
        qputenv("HOME", QFile::encodeName(m_home.path()));
        qunsetenv("XDG_CONFIG_HOME");
        qunsetenv("XDG_DATA_HOME");
        qunsetenv("XDG_CONFIG_DIRS");
        QStandardPaths::setTestModeEnabled(true);
    }

    void indexesAreStoredAsTextWithAFallback()
    {
        auto store = freshStore();
        AppSettings s(*store);
        QCOMPARE(s.gpxAliasing(), 1);
        QVERIFY(store->allKeys().isEmpty()); // reading writes nothing
        s.setMaxAnimationDuration(4);
        s.setTrackingEnabled(true);
        QVERIFY(isStoredText(*store, QStringLiteral("MaxAnimationDuration"), QStringLiteral("4")));
        QVERIFY(isStoredText(*store, QStringLiteral("tracking"), QStringLiteral("true")));

        // Damaged index text falls back to the default rather than to 0.
        store->setValue(QStringLiteral("GpxAliasing"), QStringLiteral("two"));
        store->setValue(QStringLiteral("MaxAnimationDuration"), QString());
        QCOMPARE(s.gpxAliasing(), 1);
        QCOMPARE(s.maxAnimationDuration(), 1);
    }

    void betaPatchesWriteOnlyOnChange()
    {
        auto store = freshStore();
        AppSettings s(*store);
        QVERIFY(!s.setEnableBetaPatches(false));
        QVERIFY(!store->contains(QStringLiteral("enableBetaPatches")));
        QVERIFY(s.setEnableBetaPatches(true));
        QVERIFY(isStoredText(*store, QStringLiteral("enableBetaPatches"), QStringLiteral("1")));
        QVERIFY(!s.setEnableBetaPatches(true));

        // Other forms the value may have been stored in.
        const struct { QVariant stored; bool expected; } forms[] = {
            {QVariant(false), false},      {QStringLiteral("False"), false}, {QStringLiteral(" 1 "), true},
            {QStringLiteral("2"), true},   {QStringLiteral("yes?"), false},  {QVariant(QSizeF(1, 1)), false},
        };
        for (const auto &form : forms) {
            store->setValue(QStringLiteral("enableBetaPatches"), form.stored);
            QVERIFY2(s.enableBetaPatches() == form.expected, qPrintable(form.stored.toString()));
        }
        store->setValue(QStringLiteral("enableBetaPatches"), QStringLiteral("true"));
        QVERIFY(!s.setEnableBetaPatches(true));
        QVERIFY(isStoredText(*store, QStringLiteral("enableBetaPatches"), QStringLiteral("true")));
    }

    void folderFallbacks()
    {
        auto store = freshStore();
        AppSettings s(*store);
        const QString documents = standardFolder(QStandardPaths::DocumentsLocation);
        const QString movies = standardFolder(QStandardPaths::MoviesLocation);
        const QString pictures = standardFolder(QStandardPaths::PicturesLocation);
        QVERIFY(!documents.isEmpty() && movies != documents && pictures != documents);

        // Never written: the standard folder of each kind; the content folder has none.
        QCOMPARE(s.pathSetting(QStringLiteral("projectPath")), documents);
        QCOMPARE(s.pathSetting(QStringLiteral("exportPath")), movies);
        QCOMPARE(s.pathSetting(QStringLiteral("photoPath")), pictures);
        QCOMPARE(s.pathSetting(QStringLiteral("DynamicContentPath")), QString());

        // Backslashes as written on another system come back as slashes.
        const QString projects = makeDir(QStringLiteral("my projects/2024"));
        s.setPathSetting(QStringLiteral("projectPath"), QString(projects).replace(QLatin1Char('/'), QLatin1Char('\\')));
        QCOMPARE(s.pathSetting(QStringLiteral("projectPath")), projects);

        // A folder removed since it was stored falls back silently.
        const QString exports = makeDir(QStringLiteral("exports"));
        s.setPathSetting(QStringLiteral("exportPath"), exports);
        QCOMPARE(s.pathSetting(QStringLiteral("exportPath")), exports);
        QVERIFY(QDir(exports).removeRecursively());
        QCOMPARE(s.pathSetting(QStringLiteral("exportPath")), movies);

        // A file is not a folder.
        const QString file = writeTestFile(m_dir, QStringLiteral("photo.jpg"), "jpg");
        s.setPathSetting(QStringLiteral("photoPath"), file);
        QCOMPARE(s.pathSetting(QStringLiteral("photoPath")), pictures);
        s.setPathSetting(QStringLiteral("DynamicContentPath"), file);
        QCOMPARE(s.pathSetting(QStringLiteral("DynamicContentPath")), QString());
    }

    void readOnlyFoldersFallBack()
    {
        auto store = freshStore();
        AppSettings s(*store);
        const QString readOnly = makeDir(QStringLiteral("readonly"));
        QVERIFY(QFile::setPermissions(readOnly, QFile::ReadOwner | QFile::ExeOwner));
        s.setPathSetting(QStringLiteral("DynamicContentPath"), readOnly);
        s.setPathSetting(QStringLiteral("projectPath"), readOnly);
        const bool writableAnyway = QFileInfo(readOnly).isWritable();
        const QString dynamic = s.pathSetting(QStringLiteral("DynamicContentPath"));
        const QString project = s.pathSetting(QStringLiteral("projectPath"));
        QFile::setPermissions(readOnly, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        if (writableAnyway)
            QSKIP("running with rights that ignore folder permissions");
        QCOMPARE(dynamic, QString());
        QCOMPARE(project, standardFolder(QStandardPaths::DocumentsLocation));
    }

    void languageAtStart()
    {
        auto store = freshStore();
        AppSettings s(*store);

        // Nothing stored: the host decides, else the front's current language.
        // Hosts report "ja_JP" where the translations are named "ja_JA".
        QCOMPARE(language(s, QStringLiteral("ja_JP")), 6);
        QCOMPARE(language(s, QStringLiteral("ja_JA")), 1);
        s.setCurrentLanguage(4);
        QCOMPARE(language(s, QStringLiteral("pt_BR")), 4);
        QCOMPARE(language(s, QStringLiteral("de_DE")), 0);
        store->setValue(QStringLiteral("language"), QString());
        QCOMPARE(language(s, QStringLiteral("fr_FR")), 2); // empty counts as not stored

        // A stored value wins over the host; what is no index is English.
        const struct { QVariant stored; int expected; } cases[] = {
            {0, 0}, {QStringLiteral(" 5 "), 5}, {7, 1}, {-1, 1}, {QStringLiteral("4294967295"), 1}, {QStringLiteral("de"), 1},
        };
        for (const auto &c : cases) {
            store->setValue(QStringLiteral("language"), c.stored);
            QVERIFY2(language(s, QStringLiteral("nl_NL")) == c.expected, qPrintable(c.stored.toString()));
        }
        storeLanguage(s, 3);
        QCOMPARE(language(s, QStringLiteral("ja_JP")), 3);
    }

    void languageFromFileSize()
    {
        QTemporaryDir program;
        const QString dir = program.path();
        QVERIFY(QDir(dir).mkdir(QStringLiteral("language")));
        const auto writeBytes = [](const QString &file, int size) {
            QFile f(file);
            QVERIFY(f.open(QIODevice::WriteOnly));
            f.write(QByteArray(size, 'x'));
        };

        // No reference file, or an empty one that the missing language files must not match: English.
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 1);
        writeBytes(LanguageTable::referenceFilePath(dir), 0);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 1);
        writeBytes(LanguageTable::referenceFilePath(dir), 120);
        writeBytes(LanguageTable::filePath(0, dir), 119);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 1); // none matches

        writeBytes(LanguageTable::filePath(5, dir), 120);
        writeBytes(LanguageTable::filePath(3, dir), 120);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 3); // first in table order
        QCOMPARE(LanguageTable::resolveRequest(LanguageTable::FromFileSize, dir), 3u);
        QCOMPARE(LanguageTable::resolveRequest(4, dir), 4u);
    }
};

QTEST_GUILESS_MAIN(TestSettings)
#include "tst_settings.moc"

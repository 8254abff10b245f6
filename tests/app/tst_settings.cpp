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
    static void writeBytes(const QString &file, int size)
    {
        QFile f(file);
        QVERIFY(f.open(QIODevice::WriteOnly));
        f.write(QByteArray(size, 'x'));
    }
    static bool isStoredText(const QSettings &store, const QString &key, const QString &text)
    {
        const QVariant v = store.value(key);
        return v.type() == QVariant::String && v.toString() == text;
    }

private slots:
    void initTestCase()
    {
        QVERIFY(m_home.isValid());
        QVERIFY(m_dir.isValid());
        // Keep the process-wide store and the standard folders away from the real user.
        qputenv("HOME", QFile::encodeName(m_home.path()));
        qunsetenv("XDG_CONFIG_HOME");
        qunsetenv("XDG_DATA_HOME");
        qunsetenv("XDG_CONFIG_DIRS");
        QStandardPaths::setTestModeEnabled(true);
    }

    void defaultStoreUsesScopeNames()
    {
        QSettings &store = defaultSettingsStore();
        QCOMPARE(&store, &defaultSettingsStore());
        QCOMPARE(store.organizationName(), QStringLiteral("Zenko\\Common\\Services"));
        QCOMPARE(store.applicationName(), QStringLiteral("Tourlet"));
        QVERIFY2(store.fileName().startsWith(m_home.path()), qPrintable(store.fileName()));

        AppSettings settings;
        QCOMPARE(&settings.store(), &store);
        QCOMPARE(settings.currentLanguage(), 1);
        QCOMPARE(settings.defaultLanguage(), 1);
    }

    void valuesSurviveAReopen()
    {
        auto store = freshStore();
        const QString file = store->fileName();
        {
            AppSettings s(*store);
            QCOMPARE(s.gpxAliasing(), 1);
            QCOMPARE(s.maxAnimationDuration(), 1);
            QCOMPARE(s.renderLoop(), QStringLiteral("basic"));
            QVERIFY(!s.trackingEnabled());
            QVERIFY(!s.enableBetaPatches());
            QVERIFY(store->allKeys().isEmpty()); // reading writes nothing

            s.setGpxAliasing(9);
            s.setMaxAnimationDuration(4);
            s.setLastStartedVersion(QStringLiteral("2.1.0.17"));
            s.setHost(QStringLiteral("Ein Programm ä"));
            s.setTrackingEnabled(true);
            s.setUserAvatars(QStringLiteral("avatars/one"));
            QVERIFY(isStoredText(*store, QStringLiteral("GpxAliasing"), QStringLiteral("9")));
            QVERIFY(isStoredText(*store, QStringLiteral("MaxAnimationDuration"), QStringLiteral("4")));
            QVERIFY(isStoredText(*store, QStringLiteral("tracking"), QStringLiteral("true")));
            store->setValue(QStringLiteral("QSGRenderLoop"), QStringLiteral("threaded"));
            store->sync();
        }
        store.reset();
        QSettings reopened(file, QSettings::IniFormat);
        const AppSettings r(reopened);
        QCOMPARE(r.gpxAliasing(), 9); // out of the list's range, still passed on unchanged
        QCOMPARE(r.maxAnimationDuration(), 4);
        QCOMPARE(r.lastStartedVersion(), QStringLiteral("2.1.0.17"));
        QCOMPARE(r.host(), QStringLiteral("Ein Programm ä"));
        QVERIFY(r.trackingEnabled());
        QCOMPARE(r.userAvatars(), QStringLiteral("avatars/one"));
        QCOMPARE(r.renderLoop(), QStringLiteral("threaded"));

        // Damaged index text falls back to the default rather than to 0.
        reopened.setValue(QStringLiteral("GpxAliasing"), QStringLiteral("two"));
        reopened.setValue(QStringLiteral("MaxAnimationDuration"), QString());
        QCOMPARE(r.gpxAliasing(), 1);
        QCOMPARE(r.maxAnimationDuration(), 1);
        reopened.setValue(QStringLiteral("tracking"), QStringLiteral("false"));
        QVERIFY(!r.trackingEnabled());
    }

    void betaPatchesWriteOnlyOnChange()
    {
        auto store = freshStore();
        AppSettings s(*store);
        QVERIFY(!s.setEnableBetaPatches(false));
        QVERIFY(!store->contains(QStringLiteral("enableBetaPatches")));

        QVERIFY(s.setEnableBetaPatches(true));
        QVERIFY(isStoredText(*store, QStringLiteral("enableBetaPatches"), QStringLiteral("1")));
        QVERIFY(s.enableBetaPatches());
        QVERIFY(!s.setEnableBetaPatches(true));
        QVERIFY(s.setEnableBetaPatches(false));
        QVERIFY(isStoredText(*store, QStringLiteral("enableBetaPatches"), QStringLiteral("0")));
        QVERIFY(!s.enableBetaPatches());

        // Other forms the value may have been stored in.
        const struct { QVariant stored; bool expected; } forms[] = {
            {QVariant(true), true},           {QVariant(false), false},
            {QStringLiteral("true"), true},   {QStringLiteral("False"), false},
            {QStringLiteral(" 1 "), true},    {QStringLiteral("2"), true},
            {QStringLiteral("yes?"), false},  {QString(), false},
            {QVariant(QSizeF(1, 1)), false},
        };
        for (const auto &form : forms) {
            store->setValue(QStringLiteral("enableBetaPatches"), form.stored);
            QVERIFY2(s.enableBetaPatches() == form.expected, qPrintable(form.stored.toString()));
        }
        store->setValue(QStringLiteral("enableBetaPatches"), QStringLiteral("true"));
        QVERIFY(!s.setEnableBetaPatches(true));
        QVERIFY(isStoredText(*store, QStringLiteral("enableBetaPatches"), QStringLiteral("true")));
    }

    void folderKeysAndFallbacks()
    {
        auto store = freshStore();
        AppSettings s(*store);
        const QString documents = QStandardPaths::standardLocations(QStandardPaths::DocumentsLocation).value(0);
        const QString movies = QStandardPaths::standardLocations(QStandardPaths::MoviesLocation).value(0);
        const QString pictures = QStandardPaths::standardLocations(QStandardPaths::PicturesLocation).value(0);
        QVERIFY(!documents.isEmpty());
        QVERIFY(movies != documents && pictures != documents);

        // Never written: the standard folder of each kind.
        QCOMPARE(s.pathSetting(QStringLiteral("projectPath")), documents);
        QCOMPARE(s.pathSetting(QStringLiteral("folder")), documents);
        QCOMPARE(s.pathSetting(QStringLiteral("presetPath")), documents);
        QCOMPARE(s.pathSetting(QStringLiteral("browseContentPath")), documents);
        QCOMPARE(s.pathSetting(QStringLiteral("exportPath")), movies);
        QCOMPARE(s.pathSetting(QStringLiteral("photoPath")), pictures);
        QCOMPARE(s.pathSetting(QStringLiteral("DynamicContentPath")), QString());

        // Backslashes as written on another system come back as slashes.
        const QString projects = makeDir(QStringLiteral("my projects/2024"));
        QString withBackslashes = projects;
        withBackslashes.replace(QLatin1Char('/'), QLatin1Char('\\'));
        s.setPathSetting(QStringLiteral("projectPath"), withBackslashes);
        QCOMPARE(store->value(QStringLiteral("projectPath")).toString(), withBackslashes);
        QCOMPARE(s.pathSetting(QStringLiteral("projectPath")), projects);

        // A folder removed since it was stored falls back silently.
        const QString exports = makeDir(QStringLiteral("exports"));
        s.setPathSetting(QStringLiteral("exportPath"), exports);
        QCOMPARE(s.pathSetting(QStringLiteral("exportPath")), exports);
        QVERIFY(QDir(exports).removeRecursively());
        QCOMPARE(s.pathSetting(QStringLiteral("exportPath")), movies);

        // A file is not a folder.
        const QString file = m_dir.filePath(QStringLiteral("photo.jpg"));
        writeBytes(file, 3);
        s.setPathSetting(QStringLiteral("photoPath"), file);
        QCOMPARE(s.pathSetting(QStringLiteral("photoPath")), pictures);

        // The content folder has no fallback.
        const QString content = makeDir(QStringLiteral("content"));
        s.setPathSetting(QStringLiteral("DynamicContentPath"), content);
        QCOMPARE(s.pathSetting(QStringLiteral("DynamicContentPath")), content);
        s.setPathSetting(QStringLiteral("DynamicContentPath"), file);
        QCOMPARE(s.pathSetting(QStringLiteral("DynamicContentPath")), QString());
        s.setPathSetting(QStringLiteral("DynamicContentPath"), m_dir.filePath(QStringLiteral("gone")));
        QCOMPARE(s.pathSetting(QStringLiteral("DynamicContentPath")), QString());
    }

    void readOnlyFolders()
    {
        auto store = freshStore();
        AppSettings s(*store);
        const QString documents = QStandardPaths::standardLocations(QStandardPaths::DocumentsLocation).value(0);
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
        QCOMPARE(project, documents);
    }

    void languageTableNames()
    {
        // Qt's translations use "ja_JA", hosts report "ja_JP".
        QCOMPARE(LanguageTable::longName(6), QStringLiteral("ja_JA"));
        QCOMPARE(LanguageTable::indexForHostName(QStringLiteral("ja_JP")), 6);
        QCOMPARE(LanguageTable::indexForHostName(QStringLiteral("ja_JA")), -1);
        QCOMPARE(LanguageTable::indexForHostName(QStringLiteral("en_II")), 1);
        QCOMPARE(LanguageTable::indexForHostName(QStringLiteral("de_de")), -1);
        QCOMPARE(LanguageTable::shortSuffix(4), QStringLiteral("_NL"));
        QCOMPARE(LanguageTable::filePath(3), QStringLiteral("language/Tourlet_it.qm"));
        QCOMPARE(LanguageTable::filePath(0, QStringLiteral("/opt/t")), QStringLiteral("/opt/t/language/Tourlet_de.qm"));

        for (qint64 index : {qint64(-1), qint64(7), qint64(9), qint64(0xFFFFFFFF)})
            QCOMPARE(LanguageTable::normalized(index), 1);
        for (int index : {0, 2, 6})
            QCOMPARE(LanguageTable::normalized(index), index);
        QCOMPARE(LanguageTable::longName(9), QStringLiteral("en_EN"));
    }

    void languageAtStart()
    {
        auto store = freshStore();
        AppSettings s(*store);

        // Nothing stored: the host decides, else the front's current language.
        QCOMPARE(language(s), 1);
        QCOMPARE(language(s, QStringLiteral("ja_JP")), 6);
        QCOMPARE(language(s, QStringLiteral("es_ES")), 5);
        QCOMPARE(language(s, QStringLiteral("pt_BR")), 1);
        QCOMPARE(language(s, QStringLiteral("1")), 1); // host without a value: the default index as text
        s.setCurrentLanguage(4);
        QCOMPARE(language(s, QStringLiteral("pt_BR")), 4);
        QCOMPARE(language(s, QStringLiteral("de_DE")), 0);
        s.setCurrentLanguage(1);

        store->setValue(QStringLiteral("language"), QString());
        QCOMPARE(language(s, QStringLiteral("fr_FR")), 2); // empty counts as not stored

        // A stored value wins over the host and goes through the table.
        const struct { QVariant stored; int expected; } cases[] = {
            {0, 0}, {2, 2}, {6, 6}, {QStringLiteral("3"), 3}, {9, 1}, {7, 1}, {-1, 1},
            {QStringLiteral("4294967295"), 1}, {QStringLiteral("de"), 1}, {QStringLiteral(" 5 "), 5},
        };
        for (const auto &c : cases) {
            store->setValue(QStringLiteral("language"), c.stored);
            QVERIFY2(language(s, QStringLiteral("nl_NL")) == c.expected, qPrintable(c.stored.toString()));
        }

        storeLanguage(s, 3);
        store->sync();
        QSettings reopened(store->fileName(), QSettings::IniFormat);
        QCOMPARE(language(AppSettings(reopened), QStringLiteral("ja_JP")), 3);
    }

    void languageFromFileSize()
    {
        QTemporaryDir program;
        QVERIFY(program.isValid());
        const QString dir = program.path();
        QVERIFY(QDir(dir).mkdir(QStringLiteral("language")));

        // No reference file: English, even though a missing language file has no size either.
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 1);
        writeBytes(LanguageTable::referenceFilePath(dir), 0);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 1);

        writeBytes(LanguageTable::referenceFilePath(dir), 120);
        writeBytes(LanguageTable::filePath(0, dir), 119);
        writeBytes(LanguageTable::filePath(1, dir), 121);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 1); // none matches

        writeBytes(LanguageTable::filePath(5, dir), 120);
        writeBytes(LanguageTable::filePath(3, dir), 120);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 3); // first in table order
        writeBytes(LanguageTable::filePath(0, dir), 120);
        QCOMPARE(LanguageTable::indexByReferenceSize(dir), 0);

        QCOMPARE(LanguageTable::resolveRequest(LanguageTable::FromFileSize, dir), 0u);
        QCOMPARE(LanguageTable::resolveRequest(4, dir), 4u);
    }
};

QTEST_GUILESS_MAIN(TestSettings)
#include "tst_settings.moc"

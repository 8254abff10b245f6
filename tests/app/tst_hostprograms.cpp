#include "app/AppSettings.h"
#include "app/HostPrograms.h"

#include <QDir>
#include <QFile>
#include <QSettings>
#include <QTemporaryDir>
#include <QTest>

// One application entry a test installs: folder 0 is the user's data folder, 1 and 2
// the system data folders in their order.
struct EntryFile
{
    int folder;
    QString path;
    QByteArray text;
};
Q_DECLARE_METATYPE(QVector<EntryFile>)

namespace {

// An entry of a video editor that opens MP4 films, run by the test's "tool" script;
// each override replaces a key's line, or drops it when empty.
QByteArray editorEntry(const QByteArray &name, const QMap<QByteArray, QByteArray> &overrides = {})
{
    QMap<QByteArray, QByteArray> keys{{"Type", "Application"},
                                      {"Name", name},
                                      {"Exec", "tool %f"},
                                      {"Categories", "AudioVideo;Video;AudioVideoEditing;"},
                                      {"MimeType", "video/x-matroska;video/mp4;"}};
    for (auto it = overrides.cbegin(); it != overrides.cend(); ++it) {
        if (it.value().isEmpty())
            keys.remove(it.key());
        else
            keys.insert(it.key(), it.value());
    }
    QByteArray text = "[Desktop Entry]\n";
    for (auto it = keys.cbegin(); it != keys.cend(); ++it)
        text += it.key() + '=' + it.value() + '\n';
    return text;
}

QStringList titles(const HostPrograms &hosts)
{
    QStringList list;
    for (const HostInfo &host : hosts.hostList())
        list << host.programTitle;
    return list;
}

} // namespace

class TestHostPrograms : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_root;
    QString m_bin;
    int m_round = 0;

    // Fresh data folders for each case, with the entries written into them.
    void install(const QVector<EntryFile> &entries)
    {
        const QString base = m_root.filePath(QStringLiteral("round%1").arg(++m_round));
        const QStringList folders{base + QStringLiteral("/home"), base + QStringLiteral("/system1"),
                                  base + QStringLiteral("/system2")};
        for (const QString &folder : folders)
            QVERIFY(QDir().mkpath(folder + QStringLiteral("/applications")));
        qputenv("XDG_DATA_HOME", QFile::encodeName(folders[0]));
        qputenv("XDG_DATA_DIRS", QFile::encodeName(folders[1] + QLatin1Char(':') + folders[2]));
        for (const EntryFile &entry : entries) {
            const QString file = folders[entry.folder] + QStringLiteral("/applications/") + entry.path;
            QVERIFY(QDir().mkpath(QFileInfo(file).absolutePath()));
            QFile f(file);
            QVERIFY(f.open(QIODevice::WriteOnly));
            f.write(entry.text);
        }
    }

    std::unique_ptr<QSettings> settingsStore()
    {
        return std::make_unique<QSettings>(m_root.filePath(QStringLiteral("settings%1.ini").arg(m_round)),
                                           QSettings::IniFormat);
    }

private slots:
    void initTestCase()
    {
        QVERIFY(m_root.isValid());
        m_bin = m_root.filePath(QStringLiteral("bin"));
        QVERIFY(QDir().mkpath(m_bin));
        // Writes its working folder and its arguments, one a line, to $HOST_TEST_OUT.
        QFile tool(m_bin + QStringLiteral("/tool"));
        QVERIFY(tool.open(QIODevice::WriteOnly));
        tool.write("#!/bin/sh\n{ pwd; printf '%s\\n' \"$@\"; } > \"$HOST_TEST_OUT.part\"\n"
                   "mv \"$HOST_TEST_OUT.part\" \"$HOST_TEST_OUT\"\n");
        tool.close();
        QVERIFY(tool.setPermissions(tool.permissions() | QFileDevice::ExeOwner));
        qputenv("PATH", QFile::encodeName(m_bin) + ':' + qgetenv("PATH"));
    }

    void recognisesEditors_data()
    {
        QTest::addColumn<QByteArray>("text");
        QTest::addColumn<QString>("title"); // empty: not a host

        const QString cut = QStringLiteral("Cut");
        QTest::newRow("editor") << editorEntry("Cut") << cut;
        QTest::newRow("plain VideoEditing") << editorEntry("Cut", {{"Categories", "VideoEditing;"}}) << cut;
        QTest::newRow("AudioVideo editor without Video")
            << editorEntry("Cut", {{"Categories", "AudioVideo;AudioVideoEditing"}}) << cut;
        QTest::newRow("audio editor")
            << editorEntry("Cut", {{"Categories", "AudioVideo;Audio;AudioVideoEditing;"}}) << QString();
        QTest::newRow("player") << editorEntry("Cut", {{"Categories", "AudioVideo;Video;Player;"}}) << QString();
        QTest::newRow("no MP4") << editorEntry("Cut", {{"MimeType", "video/x-matroska;"}}) << QString();
        QTest::newRow("MP4 in an escaped list item")
            << editorEntry("Cut", {{"MimeType", "video/x\\;video/mp4;"}}) << QString();
        QTest::newRow("MP4 only in an action group")
            << editorEntry("Cut", {{"MimeType", ""}}) + "[Desktop Action new]\nMimeType=video/mp4;\n" << QString();
        QTest::newRow("link") << editorEntry("Cut", {{"Type", "Link"}}) << QString();
        QTest::newRow("hidden") << editorEntry("Cut", {{"Hidden", "true"}}) << QString();
        QTest::newRow("no display") << editorEntry("Cut", {{"NoDisplay", "true"}}) << QString();
        QTest::newRow("no name") << editorEntry("", {{"Name", ""}}) << QString();
        QTest::newRow("TryExec missing") << editorEntry("Cut", {{"TryExec", "no-such-tool"}}) << QString();
        QTest::newRow("TryExec found") << editorEntry("Cut", {{"TryExec", "tool"}}) << cut;
        QTest::newRow("program missing") << editorEntry("Cut", {{"Exec", "no-such-tool %f"}}) << QString();
        QTest::newRow("relative program path") << editorEntry("Cut", {{"Exec", "bin/tool %f"}}) << QString();
        QTest::newRow("unterminated quote") << editorEntry("Cut", {{"Exec", "\"tool %f"}}) << QString();
        QTest::newRow("escapes and localized name")
            << QByteArray("# comment\r\n[Desktop Entry]\r\nName[de] = Schnitt\r\nName = Cut\\sStudio\\\\2\r\n"
                          "Type=Application\r\nExec=tool\r\nCategories=VideoEditing\r\nMimeType=video/mp4\r\n")
            << QStringLiteral("Cut Studio\\2");
        QTest::newRow("no main group") << editorEntry("Cut").replace("Desktop Entry", "Desktop Entri") << QString();
    }

    void recognisesEditors()
    {
        QFETCH(QByteArray, text);
        QFETCH(QString, title);
        install({{0, QStringLiteral("cut.desktop"), text}});
        HostPrograms hosts;
        const QStringList expected = title.isEmpty() ? QStringList() : QStringList{title};
        QCOMPARE(hosts.updateHostList(), expected.size());
        QCOMPARE(titles(hosts), expected);
        if (!title.isEmpty()) {
            QCOMPARE(hosts.hostList().first().programExe, QStringLiteral("tool"));
            QCOMPARE(hosts.hostList().first().programPath, m_bin);
        }
    }

    void earlierFoldersWin_data()
    {
        QTest::addColumn<QVector<EntryFile>>("entries");
        QTest::addColumn<QStringList>("titles");

        QTest::newRow("user entry hides the system's")
            << QVector<EntryFile>{{1, "cut.desktop", editorEntry("System Cut")},
                                  {0, "cut.desktop", editorEntry("My Cut")}}
            << QStringList{"My Cut"};
        QTest::newRow("first system folder hides the second")
            << QVector<EntryFile>{{2, "cut.desktop", editorEntry("Second")}, {1, "cut.desktop", editorEntry("First")}}
            << QStringList{"First"};
        QTest::newRow("hidden user entry deletes the system's")
            << QVector<EntryFile>{{1, "cut.desktop", editorEntry("Cut")},
                                  {0, "cut.desktop", "[Desktop Entry]\nHidden=true\n"}}
            << QStringList{};
        QTest::newRow("user entry that is no editor hides one")
            << QVector<EntryFile>{{1, "cut.desktop", editorEntry("Cut")},
                                  {0, "cut.desktop", editorEntry("Cut", {{"MimeType", "image/png"}})}}
            << QStringList{};
        QTest::newRow("subfolder gives a dashed id")
            << QVector<EntryFile>{{0, "vendor/cut.desktop", editorEntry("Nested")},
                                  {1, "vendor-cut.desktop", editorEntry("Flat")}}
            << QStringList{"Nested"};
        QTest::newRow("different ids sorted by title")
            << QVector<EntryFile>{{2, "a.desktop", editorEntry("zoom")},
                                  {0, "b.desktop", editorEntry("Montage")},
                                  {1, "c.desktop", editorEntry("apex")}}
            << QStringList{"apex", "Montage", "zoom"};
    }

    void earlierFoldersWin()
    {
        QFETCH(QVector<EntryFile>, entries);
        QFETCH(QStringList, titles);
        install(entries);
        HostPrograms hosts;
        hosts.updateHostList();
        QCOMPARE(::titles(hosts), titles);
    }

    void startsEditorWithFilm_data()
    {
        QTest::addColumn<QByteArray>("exec");
        QTest::addColumn<QStringList>("arguments"); // FILM, ENTRY: the film and entry paths

        QTest::newRow("file code") << QByteArray("tool %f") << QStringList{"FILM"};
        QTest::newRow("url code after option") << QByteArray("tool --new-window %U") << QStringList{"--new-window", "FILM"};
        QTest::newRow("no file code") << QByteArray("tool --open") << QStringList{"--open", "FILM"};
        QTest::newRow("absolute program") << QByteArray("BIN/tool %F") << QStringList{"FILM"};
        QTest::newRow("quoted arguments")
            << QByteArray(R"("tool" --title "A \\"B\\" \\\\ \\$x" %F --later)")
            << QStringList{"--title", R"(A "B" \ $x)", "FILM", "--later"};
        QTest::newRow("other codes")
            << QByteArray("tool %%x %i %c %k %d --size=%n9 %f %u")
            << QStringList{"%x", "Cut", "ENTRY", "--size=9", "FILM"};
    }

    void startsEditorWithFilm()
    {
        QFETCH(QByteArray, exec);
        QFETCH(QStringList, arguments);
        install({{1, QStringLiteral("cut.desktop"),
                  editorEntry("Cut", {{"Exec", exec.replace("BIN", QFile::encodeName(m_bin))}})}});
        const QString entryFile = QDir(qEnvironmentVariable("XDG_DATA_DIRS").section(':', 0, 0))
                                      .filePath(QStringLiteral("applications/cut.desktop"));
        const QString film = m_root.filePath(QStringLiteral("round%1/My Film.mp4").arg(m_round));
        const QString out = m_root.filePath(QStringLiteral("round%1/arguments.txt").arg(m_round));
        qputenv("HOST_TEST_OUT", QFile::encodeName(out));

        auto store = settingsStore();
        HostPrograms hosts;
        QVERIFY(hosts.findHost({}, AppSettings(*store)));
        QVERIFY(hosts.sendVideoToHost(film));
        QTRY_VERIFY_WITH_TIMEOUT(QFile::exists(out), 10000);

        QFile written(out);
        QVERIFY(written.open(QIODevice::ReadOnly));
        QStringList lines = QString::fromUtf8(written.readAll()).split('\n');
        QCOMPARE(lines.takeLast(), QString());
        QCOMPARE(QDir(lines.takeFirst()).canonicalPath(), QDir(m_bin).canonicalPath()); // the program's folder
        arguments.replaceInStrings(QStringLiteral("FILM"), film);
        arguments.replaceInStrings(QStringLiteral("ENTRY"), entryFile);
        QCOMPARE(lines, arguments);
    }

    void settingPicksHost_data()
    {
        QTest::addColumn<QString>("setting");
        QTest::addColumn<QString>("current");
        QTest::addColumn<int>("comboSelected"); // -1: none

        QTest::newRow("nothing chosen") << QString() << "Alpha" << -1;
        QTest::newRow("second chosen") << "Beta" << "Beta" << 1;
        QTest::newRow("removed host") << "Gamma" << "Alpha" << -1;
        QTest::newRow("other case") << "beta" << "Alpha" << 1;
    }

    void settingPicksHost()
    {
        QFETCH(QString, setting);
        QFETCH(QString, current);
        QFETCH(int, comboSelected);
        install({{0, QStringLiteral("b.desktop"), editorEntry("Beta")},
                 {1, QStringLiteral("a.desktop"), editorEntry("Alpha")}});
        auto store = settingsStore();
        AppSettings settings(*store);
        if (!setting.isEmpty())
            settings.setHost(setting);

        HostPrograms hosts;
        QVERIFY(hosts.findHost({}, settings));
        QCOMPARE(hosts.hostName(), current);
        const QVariantList combo = hosts.hostComboEntries(settings);
        QCOMPARE(combo.size(), 2);
        for (int i = 0; i < combo.size(); ++i) {
            const QVariantMap entry = combo.at(i).toMap();
            QCOMPARE(entry.value("title").toString(), hosts.hostList().at(i).programTitle);
            QCOMPARE(entry.value("selected").toInt(), i == comboSelected ? 1 : 0);
        }

        QVERIFY(!hosts.selectHost(2, settings));
        QCOMPARE(hosts.hostName(), current);
        QVERIFY(hosts.selectHost(1, settings));
        QCOMPARE(hosts.hostName(), QStringLiteral("Beta"));
        QCOMPARE(store->value("host").toString(), QStringLiteral("Beta"));
    }

    void noHostWithoutEditorsOrByWindow()
    {
        install({{0, QStringLiteral("player.desktop"), editorEntry("Player", {{"Categories", "Video;Player;"}})}});
        auto store = settingsStore();
        AppSettings settings(*store);
        HostPrograms hosts;
        QVERIFY(!hosts.findHost({}, settings));
        QVERIFY(hosts.hostComboEntries(settings).isEmpty());
        QVERIFY(!hosts.sendVideoToHost(m_root.filePath(QStringLiteral("film.mp4"))));

        install({{0, QStringLiteral("cut.desktop"), editorEntry("Cut")}});
        QVERIFY(!hosts.findHost({QStringLiteral("1A2B"), QStringLiteral("Cut")}, settings));
        QVERIFY(!hosts.currentHost().isUsable());
    }

    void hostArguments_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<QStringList>("expected");

        QTest::newRow("both switches") << QStringList{"tourlet", "/h=?1A2B", "/k=?Cut"} << QStringList{"1A2B", "Cut"};
        QTest::newRow("nothing behind the switches") << QStringList{"tourlet", "/h=?", "/k=?"} << QStringList{};
        QTest::newRow("key missing") << QStringList{"tourlet", "/h=?1A2B", "/k=?"} << QStringList{};
        QTest::newRow("swapped") << QStringList{"tourlet", "/k=?Cut", "/h=?1A2B"} << QStringList{};
        QTest::newRow("one more") << QStringList{"tourlet", "/h=?1A2B", "/k=?Cut", "x"} << QStringList{};
        QTest::newRow("without question mark") << QStringList{"tourlet", "/h=1A2B", "/k=Cut"} << QStringList{};
    }

    void hostArguments()
    {
        QFETCH(QStringList, arguments);
        QFETCH(QStringList, expected);
        QCOMPARE(parseHostArguments(arguments), expected);
    }
};

QTEST_GUILESS_MAIN(TestHostPrograms)
#include "tst_hostprograms.moc"

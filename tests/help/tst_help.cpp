#include "app/Language.h"

#include "TestFiles.h"

#include <QFile>
#include <QFileInfo>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

class TestHelp : public QObject
{
    Q_OBJECT

private slots:
    // The built program folder holds a real guide wherever openHelp looks for one.
    void guideForEachLanguage_data()
    {
        QTest::addColumn<int>("language");
        for (int index = 0; index < LanguageTable::Count; ++index)
            QTest::newRow(qPrintable(LanguageTable::shortSuffix(index))) << index;
    }

    void guideForEachLanguage()
    {
        QFETCH(int, language);
        const QString path = LanguageTable::helpFilePath(language, QStringLiteral(TOURLET_PROGRAM_DIR));
        QFile file(path);
        QVERIFY2(file.open(QIODevice::ReadOnly), qPrintable(path));
        const QByteArray pdf = file.readAll();

        QVERIFY(pdf.startsWith("%PDF-"));
        QVERIFY2(pdf.trimmed().endsWith("%%EOF"), "the file ends before the PDF does");
        const int pages = pdf.count("/Type /Page") - pdf.count("/Type /Pages");
        QVERIFY2(pages >= 3, qPrintable(QStringLiteral("%1 pages").arg(pages)));
        // Subset fonts and vector figures keep a guide small; whole fonts or pictures would not.
        QVERIFY2(pdf.size() < 1024 * 1024, qPrintable(QStringLiteral("%1 bytes").arg(pdf.size())));
    }

    // A broken guide fails the build with a reason, and leaves no PDF that looks finished.
    void badGuideFails_data()
    {
        QTest::addColumn<QByteArray>("markdown");
        QTest::addColumn<QByteArray>("figure");
        QTest::addColumn<QString>("font");
        QTest::addColumn<QString>("reason");

        QTest::newRow("missing figure") << QByteArray("# Guide\n\n![map](absent.svg)\n") << QByteArray()
                                        << QStringLiteral("DejaVu Sans") << QStringLiteral("not found");
        QTest::newRow("figure that is no SVG") << QByteArray("# Guide\n\n![map](figure.svg)\n")
                                               << QByteArray("GIF89a, not a drawing") << QStringLiteral("DejaVu Sans")
                                               << QStringLiteral("no valid SVG");
        QTest::newRow("script the font lacks") << QByteArray("# \xe3\x83\x98\xe3\x83\xab\xe3\x83\x97\n") << QByteArray()
                                               << QStringLiteral("DejaVu Sans") << QStringLiteral("no glyph");
    }

    void badGuideFails()
    {
        QFETCH(QByteArray, markdown);
        QFETCH(QByteArray, figure);
        QFETCH(QString, font);
        QFETCH(QString, reason);

        QTemporaryDir dir;
        QVERIFY(dir.isValid());
        const QString guide = writeTestFile(dir, QStringLiteral("guide.md"), markdown);
        if (!figure.isEmpty())
            writeTestFile(dir, QStringLiteral("figure.svg"), figure);
        const QString output = dir.filePath(QStringLiteral("out/guide.pdf"));

        QProcess helpgen;
        helpgen.start(QStringLiteral(TOURLET_HELPGEN), {guide, QStringLiteral("-o"), output, QStringLiteral("--font"), font});
        QVERIFY(helpgen.waitForFinished(30000));
        const QString error = QString::fromUtf8(helpgen.readAllStandardError());
        QCOMPARE(helpgen.exitCode(), 1);
        QVERIFY2(error.contains(reason), qPrintable(error));
        QVERIFY(!QFileInfo::exists(output));
    }
};

QTEST_GUILESS_MAIN(TestHelp)
#include "tst_help.moc"

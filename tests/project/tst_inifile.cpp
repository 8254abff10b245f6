#include "project/IniFileReader.h"
#include "project/IniFileWriter.h"
#include "project/QProjectController.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QPoint>
#include <QRandomGenerator>
#include <QRect>
#include <QSettings>
#include <QSize>
#include <QTemporaryDir>
#include <QTest>

#include <tuple>
#include <vector>

namespace {

using Entry = std::tuple<QString, QString, QString>; // section, key, value

QByteArray readBytes(const QString &file)
{
    QFile f(file);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
}

void writeBytes(const QString &file, const QByteArray &bytes)
{
    QFile f(file);
    if (!f.open(QIODevice::WriteOnly) || f.write(bytes) != bytes.size())
        qFatal("cannot write %s", qPrintable(file));
}

// What the settings store itself writes for these values into a new file, the way
// the container used it: the header first and synced, then the rest.
QByteArray storeBytes(const QString &file, const std::vector<Entry> &entries)
{
    QFile::remove(file);
    {
        QFile empty(file);
        empty.open(QIODevice::WriteOnly);
    }
    {
        QSettings store(file, QSettings::IniFormat);
        store.setValue(QStringLiteral("Header/projecttype"), QStringLiteral("ZKGEO"));
        store.setValue(QStringLiteral("Header/projectversion"), 2);
        store.sync();
        for (const Entry &e : entries)
            store.setValue(std::get<0>(e) + QLatin1Char('/') + std::get<1>(e), std::get<2>(e));
    }
    return readBytes(file);
}

QByteArray ownBytes(const std::vector<Entry> &entries)
{
    IniFileWriter writer;
    writer.setValue(QStringLiteral("Header"), QStringLiteral("projecttype"), QStringLiteral("ZKGEO"));
    writer.setValue(QStringLiteral("Header"), QStringLiteral("projectversion"), QStringLiteral("2"));
    for (const Entry &e : entries)
        writer.setValue(std::get<0>(e), std::get<1>(e), std::get<2>(e));
    return writer.toBytes();
}

// The store's answer as the container gives it: text, lists joined with ','.
QString storeValue(QSettings &store, const QString &section, const QString &key)
{
    const QVariant value = store.value(section + QLatin1Char('/') + key);
    if (!value.isValid())
        return QStringLiteral("<missing>");
    if (value.type() == QVariant::StringList)
        return value.toStringList().join(QLatin1Char(','));
    return value.toString();
}

QString randomText(QRandomGenerator &random, int maxLength)
{
    // Characters that the format treats specially, digits that may follow an
    // escape, letters, and text beyond Latin-1 (a surrogate pair among it).
    static const QString pool = QStringLiteral(" \t\"\\,;=@#%[]/\n\r\x01\x7f" "0123456789abcdefABCDEFxyz.-_\u00e4\u00fc\u00df\u20ac\u4e2d")
                                + QString::fromUtf8("\xF0\x9F\x98\x80") + QChar(0);
    QString text;
    const int length = int(random.bounded(maxLength + 1));
    for (int i = 0; i < length; ++i)
        text += pool.at(int(random.bounded(pool.size())));
    return text;
}

QString plainName(QRandomGenerator &random)
{
    static const char chars[] = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789_-.";
    QString name;
    const int length = 1 + int(random.bounded(8));
    for (int i = 0; i < length; ++i)
        name += QLatin1Char(chars[random.bounded(int(sizeof(chars) - 1))]);
    return name;
}

QtMessageHandler s_qtHandler = nullptr;

// Values of the types the store writes with a leading '@', and text that looks
// like them.
std::vector<QVariant> typedValues(QRandomGenerator &random)
{
    QByteArray bytes;
    for (int i = 0, n = int(random.bounded(12)); i < n; ++i)
        bytes += char(random.bounded(256));
    const int a = int(random.bounded(-50, 50)), b = int(random.bounded(1000));
    return {bytes,
            QVariant(),
            QRect(a, b, b, a),
            QSize(a, b),
            QPoint(b, a),
            QPointF(a / 3.0, b / 7.0),
            QDateTime(QDate(2000 + b % 30, 1 + b % 12, 1 + b % 28), QTime(b % 24, 30), Qt::UTC),
            QVariantList{a, bytes, QStringLiteral("@x"), QRect(1, 2, 3, 4)},
            QStringList{QStringLiteral("@@a"), randomText(random, 6)},
            QStringList{QStringLiteral("one")},
            QVariantMap{{QStringLiteral("k"), a}},
            a / 7.0,
            QStringLiteral("@Invalid()"),
            QStringLiteral("@Variant(") + randomText(random, 8) + QLatin1Char(')')};
}

} // namespace

class TestIniFile : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

private slots:
    void initTestCase()
    {
        QVERIFY(m_dir.isValid());
        // Streamed values of unknown types are reported by Qt on every read.
        s_qtHandler = qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &context, const QString &text) {
            if (!text.startsWith(QLatin1String("Trying to construct an instance of an invalid type")))
                s_qtHandler(type, context, text);
        });
    }

    void writesTheBytesOfTheStore()
    {
        const QString file = m_dir.filePath(QStringLiteral("store.ini"));
        // Hand-picked cases first: quoting, escapes, '@', doubled keys, odd names.
        std::vector<Entry> entries = {
            {"animator", "projectTitle", QStringLiteral("\u00dcber die Alpen = 1, 2")},
            {"animator", "empty", QString()},
            {"animator", "spaces", QStringLiteral("  both ends  ")},
            {"animator", "at", QStringLiteral("@Variant(x)")},
            {"animator", "atat", QStringLiteral("@@")},
            {"animator", "nul", QStringLiteral("a") + QChar(0) + QStringLiteral("1f")},
            {"animator", "euro", QStringLiteral("\u20ac5 \u20acx")},
            {"animator", "path", QStringLiteral("C:\\maps\\\"a\".png")},
            {"animator", "projectTitle", QStringLiteral("written twice: the last counts")},
            {"altprs.", "x", QStringLiteral("-1")},
            {"general", "k", QStringLiteral("v")},
            {"General", "k", QStringLiteral("v")},
            {"a b\u00e9\u4e2d", "k\u00e9y %", QStringLiteral("v")},
            {"group", "sub/key", QStringLiteral("v")},
            {"/lead//ing/", "key", QStringLiteral("v")},
            {"curvepoint10", "x", QStringLiteral("7.0010444838971599")},
            {"curvepoint9", "x", QStringLiteral("7")},
            {"Zeta", "A", QStringLiteral("upper case sorts first")},
        };
        QCOMPARE(ownBytes(entries), storeBytes(file, entries));

        QRandomGenerator random(424242);
        for (int round = 0; round < 20; ++round) {
            entries.clear();
            const int count = 1 + int(random.bounded(60));
            for (int i = 0; i < count; ++i) {
                const bool oddNames = random.bounded(4) == 0;
                QString section = oddNames ? randomText(random, 6) : plainName(random);
                QString key = oddNames ? randomText(random, 6) : plainName(random);
                // The store refuses empty addresses; they are not part of the format.
                if (section.remove(QLatin1Char('/')).isEmpty() || key.remove(QLatin1Char('/')).isEmpty())
                    continue;
                entries.emplace_back(section, key, randomText(random, 12));
            }
            const QByteArray expected = storeBytes(file, entries);
            const QByteArray actual = ownBytes(entries);
            if (actual != expected) {
                qWarning("round %d:\n%s\n----- store wrote:\n%s", round, actual.constData(), expected.constData());
                QFAIL("different bytes");
            }
        }
    }

    void readsAsTheStoreReads()
    {
        const QString written = m_dir.filePath(QStringLiteral("written.ini"));
        QRandomGenerator random(777);
        int plainFiles = 0;
        for (int round = 0; round < 30; ++round) {
            std::vector<Entry> entries;
            for (int i = 0; i < 40; ++i)
                entries.emplace_back(plainName(random), plainName(random), randomText(random, 14));
            storeBytes(written, entries);
            // Typed values as the store writes them: "@ByteArray(", "@Variant(",
            // "@Invalid()" and the others, lists with typed items among them.
            const std::vector<QVariant> typed = typedValues(random);
            {
                QSettings store(written, QSettings::IniFormat);
                for (size_t i = 0; i < typed.size(); ++i)
                    store.setValue(QStringLiteral("typed/t%1").arg(i), typed[i]);
            }
            QByteArray bytes = readBytes(written);
            // Some files written by hand: blanks around lines, unquoted lists,
            // values with escapes or types the store never writes.
            if (round % 3 == 1) {
                bytes += "\n  [hand]\n\tlist=a, b ,\"c, d\" , e\nx=\\x41\\101\\q\\\"z\\ \nquoted=\"  a \"  \n"
                         "at=@@twice\nlate=1\nlate=2\nraw=caf\xe9\nempty=\ncut=ab  \\x\neq=a=b=c\nsemi=\"a;b\" \nblank=   \n"
                         "junk=@Variant(abc)\nrect=@Rect(1 2 3)\npoint=@Point(1)2)\nstring=@String(s)\ninvalid=@Invalid()\n"
                         "lone=@\natlist=@@a, @Size(1 2), b\n";
            }
            // Files from Windows end their lines with CR LF.
            if (round % 2 == 0)
                bytes.replace("\n", "\r\n");
            // A name the store has not cached: it keeps what it wrote while size and
            // time of the file look unchanged.
            const QString file = m_dir.filePath(QStringLiteral("read%1.ini").arg(round));
            writeBytes(file, bytes);

            IniFileReader reader;
            const bool plain = reader.parse(bytes);
            plainFiles += plain ? 1 : 0;
            QProjectController container;
            QVERIFY(container.openProjectFile(file, true));
            QSettings store(file, QSettings::IniFormat);
            std::vector<std::pair<QString, QString>> addresses = {
                {"hand", "list"}, {"hand", "x"}, {"hand", "quoted"}, {"hand", "at"}, {"hand", "late"},
                {"hand", "raw"}, {"hand", "empty"}, {"hand", "cut"}, {"hand", "eq"}, {"hand", "semi"}, {"hand", "blank"}, {"Header", "projectversion"},
                {"Header", "none"}, {"nowhere", "x"}, {"", "x"}, {"hand", "a/b"}, {"\u00e4", "x"}, {"hand", "junk"},
                {"hand", "rect"}, {"hand", "point"}, {"hand", "string"}, {"hand", "invalid"}, {"hand", "lone"}, {"hand", "atlist"}};
            for (const Entry &e : entries)
                addresses.emplace_back(std::get<0>(e), std::get<1>(e));
            for (size_t i = 0; i < typed.size(); ++i)
                addresses.emplace_back(QStringLiteral("typed"), QStringLiteral("t%1").arg(i));
            for (const auto &address : addresses) {
                const QString expected = storeValue(store, address.first, address.second);
                const QString actual =
                    container.readProperty(address.first, address.second, QStringLiteral("<missing>"));
                if (actual != expected) {
                    qWarning("round %d [%s] %s: %s, the store reads %s", round, qPrintable(address.first),
                             qPrintable(address.second), qPrintable(actual), qPrintable(expected));
                    QFAIL("different value");
                }
            }
            container.closeProjectFile();
        }
        // The files this program writes take the quick way, with either line end.
        QCOMPARE(plainFiles, 30);
    }

    void declinesWhatItCannotReadExactly()
    {
        const QByteArray header = "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n";
        const QList<QByteArray> unusual = {
            header + "[a]\nx=1 ; a comment\n",
            header + "; comment line\n[a]\nx=1\n",
            header + "[a]\nx=1\ry=2\n",
            header + "[a]\nx=1\r\r\n",
            "\xEF\xBB\xBF" + header,
            header + "[a]\nx=\"open\nquote\"\n",
            header + "[a]\nx=continued\\\n",
            header + "[a]\nx=1\n[a]\ny=2\n",
            header + "[General]\nx=1\n",
            header + "[a%20b]\nx=1\n",
            header + "[a]\nk%20=1\n",
            header + "[a]\nk =1\n",
            header + "[a]\nno value here\n",
            "x=1\n" + header,
            header + "[a] \nx=1\n",
        };
        const QString file = m_dir.filePath(QStringLiteral("unusual.ini"));
        for (const QByteArray &bytes : unusual) {
            QVERIFY2(!IniFileReader().parse(bytes), bytes.constData());
            // The container still reads them, through the store.
            writeBytes(file, bytes);
            QProjectController container;
            QVERIFY(container.openProjectFile(file, true));
            QSettings store(file, QSettings::IniFormat);
            for (const char *key : {"x", "y", "k "})
                QCOMPARE(container.readProperty(QStringLiteral("a"), QLatin1String(key), QStringLiteral("<missing>")),
                         storeValue(store, QStringLiteral("a"), QLatin1String(key)));
            container.closeProjectFile();
        }
    }

    void rereadsAChangedFile()
    {
        const QString file = m_dir.filePath(QStringLiteral("changing.ini"));
        const QByteArray header = "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n";
        QProjectController container;
        auto readX = [&] {
            const bool opened = container.openProjectFile(file, true);
            const QString x = container.readProperty(QStringLiteral("a"), QStringLiteral("x"), QString());
            container.closeProjectFile();
            return opened ? x : QStringLiteral("<not opened>");
        };
        writeBytes(file, header + "[a]\nx=1\n");
        QCOMPARE(readX(), QStringLiteral("1"));
        QCOMPARE(readX(), QStringLiteral("1"));
        // Changed by another program, then through the container itself.
        writeBytes(file, header + "[a]\nx=22\n");
        QCOMPARE(readX(), QStringLiteral("22"));
        QVERIFY(container.createProjectFile(file));
        container.writeProperty(QStringLiteral("a"), QStringLiteral("x"), QStringLiteral("3"));
        container.closeProjectFile();
        QCOMPARE(readX(), QStringLiteral("3"));
    }

    void failedWriteIsReported()
    {
        QProjectController container;
        const QString file = m_dir.filePath(QStringLiteral("gone/x.ini"));
        QVERIFY(container.createProjectFile(file));
        QVERIFY(container.lastWriteFailed());

        // The folder goes away while the file is being made.
        const QString folder = m_dir.filePath(QStringLiteral("vanishing"));
        QVERIFY(QDir().mkpath(folder));
        const QString inside = folder + QStringLiteral("/x.ini");
        QVERIFY(container.createProjectFile(inside));
        QVERIFY(container.writeProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")));
        QVERIFY(QDir(folder).removeRecursively());
        container.closeProjectFile();
        QVERIFY(container.lastWriteFailed());
        QVERIFY(container.isIdle());
    }
};

QTEST_GUILESS_MAIN(TestIniFile)
#include "tst_inifile.moc"

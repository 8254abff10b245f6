#include "app/AppSettings.h"
#include "app/Translators.h"

#include <QCoreApplication>
#include <QFile>
#include <QSettings>
#include <QTemporaryDir>
#include <QtTest>

// The program folder of these tests holds German, French and Italian; the other
// languages have no file and so an empty translator.
class TestTranslators : public QObject
{
    Q_OBJECT

private:
    static QString greeting() { return QCoreApplication::translate("Greeting", "Hello"); }

private slots:
    void switching_data()
    {
        QTest::addColumn<QList<qint64>>("requests");
        QTest::addColumn<QString>("shown");
        QTest::addColumn<int>("current");
        QTest::addColumn<QVariant>("stored");

        QTest::newRow("German") << QList<qint64>{0} << "Hallo" << 0 << QVariant(0);
        QTest::newRow("French replaces German") << QList<qint64>{0, 2} << "Bonjour" << 2 << QVariant(2);
        QTest::newRow("back and forth") << QList<qint64>{2, 0, 3, 2} << "Bonjour" << 2 << QVariant(2);
        QTest::newRow("English has no file") << QList<qint64>{0, 1} << "Hello" << 1 << QVariant(1);
        QTest::newRow("beyond the table takes the current out")
            << QList<qint64>{3, 9} << "Hello" << -1 << QVariant(3);
        QTest::newRow("from the file size") << QList<qint64>{0, qint64(LanguageTable::FromFileSize)} << "Ciao" << 3
                                            << QVariant(3);
    }

    void switching()
    {
        QFETCH(QList<qint64>, requests);
        QFETCH(QString, shown);
        QFETCH(int, current);
        QFETCH(QVariant, stored);

        QTemporaryDir dir;
        QSettings store(dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
        AppSettings settings(store);
        const QString programDir = QStringLiteral(TRANSLATIONS_DIR);
        {
            Translators translators(settings, programDir);
            QCOMPARE(Translators::instance(), &translators);
            for (qint64 request : requests)
                translators.install(static_cast<uint32_t>(request));
            QCOMPARE(greeting(), shown);
            QCOMPARE(translators.current(), current);
            QCOMPARE(store.value(SettingsKey::Language).toInt(), stored.toInt());
        }
        // A table that is gone leaves nothing installed behind.
        QCOMPARE(greeting(), QStringLiteral("Hello"));
        QCOMPARE(Translators::instance(), nullptr);
    }

    void interfaceSwitchMapsUnknownToEnglish()
    {
        QTemporaryDir dir;
        QSettings store(dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
        AppSettings settings(store);
        Translators translators(settings, QStringLiteral(TRANSLATIONS_DIR));
        translators.setLanguage(0);
        translators.setLanguage(9);
        QCOMPARE(translators.current(), 1);
        QCOMPARE(greeting(), QStringLiteral("Hello"));
        QCOMPARE(settings.currentLanguage(), 1);
    }
};

QTEST_GUILESS_MAIN(TestTranslators)
#include "tst_translators.moc"

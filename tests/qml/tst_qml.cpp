#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickStyle>
#include <QResource>
#include <QTemporaryDir>
#include <QtQuickTest>

// Runs the tst_*.qml files beside this one, each engine with a stand-in "host". The
// test log prints every warning, from loading as well as from the test functions,
// as QWARN; CTest fails the test on such a line.
class Setup : public QObject
{
    Q_OBJECT

public slots:
    void applicationAvailable()
    {
        if (!QResource::registerResource(QStringLiteral(TOURLET_RESOURCE_FILE)))
            qFatal("cannot register %s", TOURLET_RESOURCE_FILE);
    }

    void qmlEngineAvailable(QQmlEngine *engine)
    {
        QQmlComponent component(engine, QUrl::fromLocalFile(QStringLiteral(TOURLET_QML_TESTS "/MockHost.qml")));
        QObject *host = component.create();
        if (!host)
            qFatal("MockHost.qml: %s", qPrintable(component.errorString()));
        host->setParent(engine);
        engine->rootContext()->setContextProperty(QStringLiteral("host"), host);
    }
};

int main(int argc, char **argv)
{
    QTemporaryDir runtimeDir;
    if (qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR"))
        qputenv("XDG_RUNTIME_DIR", runtimeDir.path().toLocal8Bit());
    QQuickStyle::setStyle(QStringLiteral("Material"));

    Setup setup;
    return quick_test_main_with_setup(argc, argv, "tst_qml", TOURLET_QML_TESTS, &setup);
}

#include "tst_qml.moc"

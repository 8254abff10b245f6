#include "Commands.h"

#include <QCoreApplication>
#include <QFile>
#include <QJsonObject>

namespace {

void printHelp(const std::vector<CliCommand> &commands)
{
    QString text = QStringLiteral(
        "Usage: tourlet-cli COMMAND [ARGS...]\n"
        "       tourlet-cli --help | --version\n\n"
        "Works on Tourlet projects, tracks and content without a window.\n"
        "Results are JSON on stdout, diagnostics on stderr.\n\nCommands:\n");
    for (const CliCommand &c : commands)
        text += QStringLiteral("  %1\n").arg(QString::fromUtf8(c.usage));
    QFile out;
    out.open(stdout, QIODevice::WriteOnly);
    out.write(text.toUtf8());
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("Tourlet"));
    QCoreApplication::setApplicationVersion(QStringLiteral(TOURLET_VERSION));
    // Trace lines are diagnostics: off unless asked for, and then on stderr (Qt's default).
    if (qEnvironmentVariableIsEmpty("TOURLET_CLI_TRACE"))
        qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});

    QStringList args = app.arguments().mid(1);
    const std::vector<CliCommand> commands = allCommands();
    if (args.isEmpty())
        return cli::fail(QStringLiteral("no command given; try --help"));
    const QString first = args.takeFirst();
    if (first == QLatin1String("--help") || first == QLatin1String("-h")) {
        printHelp(commands);
        return 0;
    }
    if (first == QLatin1String("--version")) {
        cli::printJson({{QStringLiteral("name"), QStringLiteral("tourlet-cli")},
                        {QStringLiteral("version"), QStringLiteral(TOURLET_VERSION)}});
        return 0;
    }
    for (const CliCommand &c : commands) {
        if (first == QLatin1String(c.name))
            return c.run(args);
    }
    return cli::fail(QStringLiteral("unknown command '%1'; try --help").arg(first));
}

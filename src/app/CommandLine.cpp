#include "app/CommandLine.h"

#include <QFileInfo>

namespace {

const QLatin1String EndOfOptions{"--"};

bool isHostSwitch(const QString &argument)
{
    return argument.startsWith(QLatin1String("/h=?")) || argument.startsWith(QLatin1String("/k=?"));
}

} // namespace

StartSwitches readStartSwitches(const QStringList &arguments)
{
    StartSwitches switches;
    switches.noBlacklist = arguments.contains(StartSwitch::NoBlacklist);
    switches.logging = arguments.contains(StartSwitch::Logging);
    for (int i = 1; i < arguments.size(); ++i) {
        const QString &argument = arguments.at(i);
        if (argument == EndOfOptions)
            break;
        if (argument == QLatin1String("--help") || argument == QLatin1String("-h"))
            switches.help = true;
        else if (argument == QLatin1String("--version"))
            switches.version = true;
    }
    return switches;
}

QStringList withoutStartSwitches(const QStringList &arguments)
{
    QStringList remaining = arguments;
    for (int i = remaining.size() - 1; i >= 0; --i) {
        if (remaining.at(i) == StartSwitch::NoBlacklist || remaining.at(i) == StartSwitch::Logging)
            remaining.removeAt(i);
    }
    return remaining;
}

QString fileToOpen(const QStringList &arguments)
{
    bool onlyFiles = false;
    for (int i = 1; i < arguments.size(); ++i) {
        const QString &argument = arguments.at(i);
        if (!onlyFiles) {
            if (argument == EndOfOptions) {
                onlyFiles = true;
                continue;
            }
            if (argument.startsWith(QLatin1Char('-')) || isHostSwitch(argument))
                continue;
        }
        if (!argument.isEmpty())
            return QFileInfo(argument).absoluteFilePath();
    }
    return QString();
}

QString usageText(const QString &programName)
{
    return QStringLiteral(
               "Usage: %1 [options] [FILE]\n"
               "Turns a journey into an animated map film.\n"
               "\n"
               "FILE is a project (.zkgeo) or a track (GPX, KML, KMZ, TCX, TRK) to open.\n"
               "\n"
               "Options:\n"
               "  -h, --help      show this text and exit\n"
               "  --version       show the version and exit\n"
               "  /logging        write the program's messages to routeloom.log in its data folder\n"
               "  /noblacklist    keep the environment's render-loop settings\n")
        .arg(programName);
}

QString versionText()
{
    return QStringLiteral("Tourlet %1\n").arg(QStringLiteral(TOURLET_VERSION));
}

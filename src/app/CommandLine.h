#pragma once

#include <QString>
#include <QStringList>

// The switches the program reads itself, matched exactly against whole arguments.
namespace StartSwitch {
inline const QLatin1String NoBlacklist{"/noblacklist"};
inline const QLatin1String Logging{"/logging"};
} // namespace StartSwitch

struct StartSwitches
{
    bool noBlacklist = false; // leave Qt's render-loop environment alone
    bool logging = false;     // write Qt's messages to the log file
    bool help = false;        // "--help" or "-h": print the usage and exit
    bool version = false;     // "--version": print the version and exit
};

// Reads the switches from the whole command line, the program's name first.
// "/noblacklist" and "/logging" count wherever they stand; "--help" and "--version"
// only before "--".
StartSwitches readStartSwitches(const QStringList &arguments);

// The arguments without any "/noblacklist" and "/logging", which must not reach the
// reader of the host program's switches nor be taken for a file.
QStringList withoutStartSwitches(const QStringList &arguments);

// The project or track file named on the command line, as an absolute path against
// the current directory: the first argument after the program's name that is no
// option ("-x", "--xyz") and no host switch ("/h=?...", "/k=?..."). Anything after
// "--" is a file. Empty when there is none.
QString fileToOpen(const QStringList &arguments);

// What "--help" and "--version" print.
QString usageText(const QString &programName);
QString versionText();

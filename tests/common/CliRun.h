#pragma once

#include <QByteArray>
#include <QProcess>
#include <QStringList>

// Runs the tourlet-cli binary that the test names in TOURLET_CLI and collects what it printed.
struct CliRun
{
    int exitCode = -1;
    QByteArray out;
    QByteArray err;
};

inline CliRun runCli(const QStringList &args)
{
    QProcess process;
    process.start(QStringLiteral(TOURLET_CLI), args);
    process.waitForFinished(60000);
    return {process.exitCode(), process.readAllStandardOutput(), process.readAllStandardError()};
}

// The same through a shell that limits the size of files written to `kilobytes`, with
// the signal of an exceeded limit ignored, so that writes fail as on a full disk.
inline CliRun runCliWithFileSizeLimit(int kilobytes, const QStringList &args)
{
    QProcess process;
    process.start(QStringLiteral("/bin/bash"),
                  QStringList{QStringLiteral("-c"), QStringLiteral("ulimit -f %1 && trap '' XFSZ && exec \"$0\" \"$@\"").arg(kilobytes),
                              QStringLiteral(TOURLET_CLI)}
                      + args);
    process.waitForFinished(60000);
    return {process.exitCode(), process.readAllStandardOutput(), process.readAllStandardError()};
}

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

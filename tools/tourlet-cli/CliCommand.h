#pragma once

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <functional>

// One subcommand of tourlet-cli. run() gets the arguments after the command name
// and returns the exit code; JSON goes to stdout, diagnostics to stderr.
struct CliCommand
{
    const char *name;
    const char *usage;
    std::function<int(const QStringList &args)> run;
};

// Output helpers shared by the commands.
namespace cli {
void printJson(const QJsonObject &object);       // one compact JSON object and a newline
void printJsonLine(const QJsonObject &object);   // the same, meant for streams of objects
void printJsonText(const QByteArray &json);      // JSON already written, and a newline
int fail(const QString &message, int code = 1);  // one line on stderr, returns code

// Takes "--name value" out of args; returns false when the option is absent.
bool takeOption(QStringList &args, const QString &name, QString &value, QString *error);
bool takeFlag(QStringList &args, const QString &name);
}

#include "CliCommand.h"

#include <QFile>
#include <QJsonDocument>

namespace cli {

void printJson(const QJsonObject &object)
{
    printJsonText(QJsonDocument(object).toJson(QJsonDocument::Compact));
}

void printJsonText(const QByteArray &json)
{
    QFile out;
    out.open(stdout, QIODevice::WriteOnly);
    out.write(json);
    out.write("\n");
}

void printJsonLine(const QJsonObject &object)
{
    printJson(object);
}

int fail(const QString &message, int code)
{
    QFile err;
    err.open(stderr, QIODevice::WriteOnly);
    err.write(("tourlet-cli: " + message + "\n").toUtf8());
    return code;
}

bool takeOption(QStringList &args, const QString &name, QString &value, QString *error)
{
    const int at = args.indexOf(name);
    if (at < 0)
        return false;
    if (at + 1 >= args.size()) {
        if (error)
            *error = QStringLiteral("%1 needs a value").arg(name);
        args.removeAt(at);
        return false;
    }
    value = args.at(at + 1);
    args.removeAt(at + 1);
    args.removeAt(at);
    return true;
}

bool takeFlag(QStringList &args, const QString &name)
{
    return args.removeAll(name) > 0;
}

} // namespace cli

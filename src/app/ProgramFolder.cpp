#include "app/ProgramFolder.h"

namespace {
QString &folder()
{
    static QString value;
    return value;
}
}

QString programFolder()
{
    return folder();
}

void setProgramFolder(const QString &path)
{
    QString clean = path;
    while (clean.size() > 1 && (clean.endsWith(QLatin1Char('/')) || clean.endsWith(QLatin1Char('\\'))))
        clean.chop(1);
    folder() = clean;
}

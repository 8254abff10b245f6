#include "export/EncoderLibrary.h"

#include "app/Trace.h"
#include "export/VidcoreInterface.h"

#include <QCoreApplication>
#include <QDir>
#include <QLibrary>

#include <memory>

namespace {

std::unique_ptr<QLibrary> theLibrary;
QString theFolder;
const void *theOwner = nullptr;

} // namespace

namespace EncoderLibrary {

QString folder()
{
    return theFolder.isEmpty() ? QCoreApplication::applicationDirPath() : theFolder;
}

void setFolder(const QString &folder)
{
    theFolder = folder;
}

QString filePath()
{
    return QDir(folder()).filePath(QStringLiteral("libvidcore.so"));
}

bool isLoaded()
{
    return theLibrary && theLibrary->isLoaded();
}

bool load()
{
    if (isLoaded())
        return true;
    theLibrary = std::make_unique<QLibrary>(filePath());
    if (theLibrary->load())
        return true;
    logTrace(3, "EncoderLibrary::load: %s", theLibrary->errorString());
    theLibrary.reset();
    return false;
}

void release()
{
    if (!theLibrary)
        return;
    if (auto destroy = reinterpret_cast<VidcoreDestroyExport>(theLibrary->resolve("DestroyExport")))
        destroy();
    theLibrary->unload();
    theLibrary.reset();
    theOwner = nullptr;
}

QFunctionPointer resolve(const char *name)
{
    return isLoaded() ? theLibrary->resolve(name) : nullptr;
}

const void *owner()
{
    return theOwner;
}

void setOwner(const void *owner)
{
    theOwner = owner;
}

} // namespace EncoderLibrary

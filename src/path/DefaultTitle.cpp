#include "path/DefaultTitle.h"

namespace {
QString &sharedTitle()
{
    static QString title;
    return title;
}

uint32_t g_titleCounter = 1;
}

QString defaultPointTitle()
{
    return sharedTitle();
}

void setDefaultPointTitle(const QString &title)
{
    sharedTitle() = title;
}

uint32_t defaultKeyPointTitleCounter()
{
    return g_titleCounter;
}

void setDefaultKeyPointTitleCounter(uint32_t value)
{
    g_titleCounter = value;
}

void resetDefaultKeyPointTitleCounter()
{
    g_titleCounter = 1;
}

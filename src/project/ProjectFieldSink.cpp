#include "project/ProjectFieldSink.h"

#include "path/KeyPoint.h"
#include "project/ProjectController.h"
#include "project/ValueParsers.h"

void StoreFieldSink::put(const QString &section, const QString &key, int32_t value)
{
    m_store.writeProperty(section, key, formatInt(value));
}

void StoreFieldSink::put(const QString &section, const QString &key, double value)
{
    m_store.writeProperty(section, key, formatDouble(value));
}

void StoreFieldSink::put(const QString &section, const QString &key, bool value)
{
    m_store.writeProperty(section, key, formatBool(value));
}

void StoreFieldSink::put(const QString &section, const QString &key, const QString &value)
{
    m_store.writeProperty(section, key, value);
}

void StoreFieldSink::putPoint(const QString &section, const KeyPoint &point)
{
    point.Save(m_store, section);
}

#include "path/PointRecord.h"

#include "project/ProjectController.h"
#include "project/ValueParsers.h"

#include <cmath>

QString PointRecordReader::text(const QString &key) const
{
    return m_store.readProperty(m_section, key, QString());
}

bool PointRecordReader::read(const QString &key, double &out) const
{
    return initDouble(text(key), out);
}

bool PointRecordReader::readCoordinate(const QString &key, double &out) const
{
    double value = 0.0;
    if (!initDouble(text(key), value))
        return false;
    if (!std::isfinite(value))
        throw DamagedNumberError(DamagedNumberError::Kind::InvalidArgument, "coordinate is not a finite number");
    out = value;
    return true;
}

bool PointRecordReader::read(const QString &key, int32_t &out) const
{
    return initInt(text(key), out);
}

bool PointRecordReader::read(const QString &key, uint32_t &out) const
{
    return initUInt(text(key), out);
}

bool PointRecordReader::read(const QString &key, bool &out) const
{
    return initBool(text(key), out);
}

bool PointRecordReader::read(const QString &key, QString &out) const
{
    return initString(text(key), out);
}

void PointRecordWriter::writeCoordinate(const QString &key, double value) const
{
    m_store.writeProperty(m_section, key, formatCoordinate(value));
}

void PointRecordWriter::write(const QString &key, double value) const
{
    m_store.writeProperty(m_section, key, formatDouble(value));
}

void PointRecordWriter::write(const QString &key, int32_t value) const
{
    m_store.writeProperty(m_section, key, formatInt(value));
}

void PointRecordWriter::write(const QString &key, uint32_t value) const
{
    m_store.writeProperty(m_section, key, formatUInt(value));
}

void PointRecordWriter::write(const QString &key, bool value) const
{
    m_store.writeProperty(m_section, key, formatBool(value));
}

void PointRecordWriter::write(const QString &key, const QString &value) const
{
    m_store.writeProperty(m_section, key, value);
}

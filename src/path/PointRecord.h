#pragma once

#include <QString>

#include <cstdint>

class ProjectController;

// Typed access to one section of the project file for the point records.
// Reads leave the target alone when the key is missing; a damaged number throws
// DamagedNumberError, which ends the load.
class PointRecordReader
{
public:
    PointRecordReader(ProjectController &store, const QString &section) : m_store(store), m_section(section) {}

    QString text(const QString &key) const;

    bool read(const QString &key, double &out) const;
    // A coordinate must be a finite number: "nan" or "inf" is damage, as in a track file.
    bool readCoordinate(const QString &key, double &out) const;
    bool read(const QString &key, int32_t &out) const;
    bool read(const QString &key, uint32_t &out) const;
    bool read(const QString &key, bool &out) const;
    bool read(const QString &key, QString &out) const;

private:
    ProjectController &m_store;
    const QString m_section;
};

class PointRecordWriter
{
public:
    PointRecordWriter(ProjectController &store, const QString &section) : m_store(store), m_section(section) {}

    void writeCoordinate(const QString &key, double value) const;
    void write(const QString &key, double value) const;
    void write(const QString &key, int32_t value) const;
    void write(const QString &key, uint32_t value) const;
    void write(const QString &key, bool value) const;
    void write(const QString &key, const QString &value) const;
    void write(const QString &key, const char *value) const = delete; // would pick the bool overload

private:
    ProjectController &m_store;
    const QString m_section;
};

#pragma once

#include <QString>

#include <cstdint>

class KeyPoint;
class ProjectController;

// Where the saver puts the document's fields, one section/key at a time: the
// project file, or anything else that wants the same fields in the same order.
class ProjectFieldSink
{
public:
    virtual ~ProjectFieldSink() = default;
    virtual void put(const QString &section, const QString &key, int32_t value) = 0;
    virtual void put(const QString &section, const QString &key, double value) = 0;
    virtual void put(const QString &section, const QString &key, bool value) = 0;
    virtual void put(const QString &section, const QString &key, const QString &value) = 0;
    void put(const QString &section, const QString &key, const char *value) = delete; // would pick bool
    // A whole position record in a section of its own.
    virtual void putPoint(const QString &section, const KeyPoint &point) = 0;
};

// Writes through the container with the format's conversions.
class StoreFieldSink : public ProjectFieldSink
{
public:
    explicit StoreFieldSink(ProjectController &store) : m_store(store) {}
    void put(const QString &section, const QString &key, int32_t value) override;
    void put(const QString &section, const QString &key, double value) override;
    void put(const QString &section, const QString &key, bool value) override;
    void put(const QString &section, const QString &key, const QString &value) override;
    void putPoint(const QString &section, const KeyPoint &point) override;

private:
    ProjectController &m_store;
};

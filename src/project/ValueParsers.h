#pragma once

#include <QString>

#include <cstdint>
#include <stdexcept>

// Thrown by the value parsers for a number that is present but damaged, so that a
// load can end cleanly. A missing key is never this: it leaves the field alone.
class DamagedNumberError : public std::runtime_error
{
public:
    enum class Kind { InvalidArgument, OutOfRange };
    DamagedNumberError(Kind kind, const char *message) : std::runtime_error(message), m_kind(kind) {}
    Kind kind() const { return m_kind; }

private:
    Kind m_kind;
};

// Parsers of the text that the container gives back. Each returns true when it
// stored a value; empty input logs, leaves the target and returns false.
bool initBool(const QString &in, bool &out);
bool initInt(const QString &in, int32_t &out);
bool initUInt(const QString &in, uint32_t &out);
bool initULong(const QString &in, uint32_t &out);
bool initDouble(const QString &in, double &out);
bool initString(const QString &in, QString &out, const QString &compare = QString());
bool initSceneMode(const QString &in, int32_t &out);
bool initDimension(const QString &width, const QString &height, int32_t &outWidth, int32_t &outHeight);

// The matching writers of the format.
QString formatBool(bool value);
QString formatInt(int64_t value);
QString formatUInt(uint64_t value);
QString formatDouble(double value);     // six decimals: document doubles
QString formatCoordinate(double value); // 17 significant digits: point coordinates come back exactly

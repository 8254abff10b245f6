#include "project/ValueParsers.h"

#include "app/Trace.h"

#include <charconv>
#include <limits>

namespace {

bool isBlank(char c)
{
    return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\v' || c == '\f';
}

// Base-10 conversion as the platform's 32-bit long does it: leading blanks and a
// sign are taken, trailing text is ignored, no digits at all is an error.
int32_t parseLong32(const QString &in, const char *invalidMessage, const char *rangeMessage)
{
    const QByteArray text = in.toUtf8();
    const char *p = text.constData();
    const char *end = p + text.size();
    while (p < end && isBlank(*p))
        ++p;
    bool negative = false;
    if (p < end && (*p == '+' || *p == '-')) {
        negative = *p == '-';
        ++p;
    }
    const char *digits = p;
    int64_t magnitude = 0;
    bool overflow = false;
    for (; p < end && *p >= '0' && *p <= '9'; ++p) {
        if (!overflow) {
            magnitude = magnitude * 10 + (*p - '0');
            if (magnitude > int64_t(std::numeric_limits<int32_t>::max()) + 1)
                overflow = true;
        }
    }
    if (p == digits)
        throw DamagedNumberError(DamagedNumberError::Kind::InvalidArgument, invalidMessage);
    const int64_t value = negative ? -magnitude : magnitude;
    if (overflow || value > std::numeric_limits<int32_t>::max() || value < std::numeric_limits<int32_t>::min())
        throw DamagedNumberError(DamagedNumberError::Kind::OutOfRange, rangeMessage);
    return static_cast<int32_t>(value);
}

double parseDouble(const QString &in)
{
    const QByteArray text = in.toUtf8();
    const char *p = text.constData();
    const char *end = p + text.size();
    while (p < end && isBlank(*p))
        ++p;
    if (p < end && *p == '+') {
        ++p;
        if (p < end && *p == '-') // from_chars would take a second sign
            throw DamagedNumberError(DamagedNumberError::Kind::InvalidArgument, "invalid stod argument");
    }
    double value = 0.0;
    const auto result = std::from_chars(p, end, value, std::chars_format::general);
    if (result.ec == std::errc::invalid_argument)
        throw DamagedNumberError(DamagedNumberError::Kind::InvalidArgument, "invalid stod argument");
    if (result.ec == std::errc::result_out_of_range)
        throw DamagedNumberError(DamagedNumberError::Kind::OutOfRange, "stod argument out of range");
    return value;
}

bool reportEmpty(const QString &in, const char *name)
{
    if (!in.isEmpty())
        return false;
    logTrace(3, QStringLiteral("PainterPathRenderer_Controller::%s -> in is empty"), name);
    return true;
}

} // namespace

bool initBool(const QString &in, bool &out)
{
    if (reportEmpty(in, "initBool"))
        return false;
    out = parseLong32(in, "invalid stoi argument", "stoi argument out of range") != 0;
    return true;
}

bool initInt(const QString &in, int32_t &out)
{
    if (reportEmpty(in, "initInt"))
        return false;
    out = parseLong32(in, "invalid stoi argument", "stoi argument out of range");
    return true;
}

bool initUInt(const QString &in, uint32_t &out)
{
    if (reportEmpty(in, "initUInt"))
        return false;
    if (in == QLatin1String("4294967295")) {
        out = std::numeric_limits<uint32_t>::max();
        return true;
    }
    out = static_cast<uint32_t>(parseLong32(in, "invalid stoi argument", "stoi argument out of range"));
    return true;
}

bool initULong(const QString &in, uint32_t &out)
{
    if (reportEmpty(in, "initULong"))
        return false;
    out = static_cast<uint32_t>(parseLong32(in, "invalid stol argument", "stol argument out of range"));
    return true;
}

bool initDouble(const QString &in, double &out)
{
    if (reportEmpty(in, "initDouble"))
        return false;
    out = parseDouble(in);
    return true;
}

bool initString(const QString &in, QString &out, const QString &compare)
{
    if (in == compare) {
        logTrace(3, QStringLiteral("PainterPathRenderer_Controller::initString -> in is empty"));
        return false;
    }
    out = in;
    return true;
}

bool initSceneMode(const QString &in, int32_t &out)
{
    if (reportEmpty(in, "initSceneMode"))
        return false;
    out = parseLong32(in, "invalid stoi argument", "stoi argument out of range");
    return true;
}

bool initDimension(const QString &width, const QString &height, int32_t &outWidth, int32_t &outHeight)
{
    if (width.isEmpty() || height.isEmpty()) {
        reportEmpty(QString(), "initDimension");
        return false;
    }
    const int32_t w = parseLong32(width, "invalid stoi argument", "stoi argument out of range");
    const int32_t h = parseLong32(height, "invalid stoi argument", "stoi argument out of range");
    outWidth = w;
    outHeight = h;
    return true;
}

QString formatBool(bool value)
{
    return value ? QStringLiteral("1") : QStringLiteral("0");
}

QString formatInt(int64_t value)
{
    return QString::number(value);
}

QString formatUInt(uint64_t value)
{
    return QString::number(value);
}

QString formatDouble(double value)
{
    return QString::asprintf("%f", value);
}

QString formatCoordinate(double value)
{
    return QString::number(value, 'g', 17);
}

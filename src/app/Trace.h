#pragma once

#include <QString>

#include <cstdint>
#include <initializer_list>
#include <string>

// One argument of a trace line: an integer for %d, a double for %f, text for %s.
class TraceArg
{
public:
    enum class Kind { Integer, Unsigned, Real, Text };

    TraceArg(int v) : m_kind(Kind::Integer), m_integer(v) {}
    TraceArg(long v) : m_kind(Kind::Integer), m_integer(v) {}
    TraceArg(long long v) : m_kind(Kind::Integer), m_integer(v) {}
    TraceArg(unsigned v) : m_kind(Kind::Unsigned), m_unsigned(v) {}
    TraceArg(unsigned long v) : m_kind(Kind::Unsigned), m_unsigned(v) {}
    TraceArg(unsigned long long v) : m_kind(Kind::Unsigned), m_unsigned(v) {}
    TraceArg(bool v) : m_kind(Kind::Integer), m_integer(v ? 1 : 0) {}
    TraceArg(double v) : m_kind(Kind::Real), m_real(v) {}
    TraceArg(const QString &v) : m_kind(Kind::Text), m_text(v) {}
    TraceArg(const char *v) : m_kind(Kind::Text), m_text(QString::fromUtf8(v)) {}
    TraceArg(const std::string &v) : m_kind(Kind::Text), m_text(QString::fromStdString(v)) {}

    QString asInteger() const;
    QString asReal() const;
    QString asText() const;

private:
    Kind m_kind;
    long long m_integer = 0;
    unsigned long long m_unsigned = 0;
    double m_real = 0.0;
    QString m_text;
};

// Expands %d, %f and %s in order from args and turns each tab into three blanks.
// Any other character after '%' stays as written; a directive without an
// argument left stays literal.
QString formatTrace(const QString &format, std::initializer_list<TraceArg> args);

// Severity 0 and 1 are informational, 3 marks a real problem; all go to Qt's debug channel.
void writeTrace(int severity, const QString &text);

template <typename... Args>
void logTrace(int severity, const QString &format, const Args &...args)
{
    writeTrace(severity, formatTrace(format, {TraceArg(args)...}));
}

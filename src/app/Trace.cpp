#include "app/Trace.h"

#include <QMessageLogger>

QString TraceArg::asInteger() const
{
    switch (m_kind) {
    case Kind::Integer: return QString::number(m_integer);
    case Kind::Unsigned: return QString::number(m_unsigned);
    case Kind::Real: return QString::number(static_cast<long long>(m_real));
    case Kind::Text: return m_text;
    }
    return {};
}

QString TraceArg::asReal() const
{
    switch (m_kind) {
    case Kind::Integer: return QString::asprintf("%f", static_cast<double>(m_integer));
    case Kind::Unsigned: return QString::asprintf("%f", static_cast<double>(m_unsigned));
    case Kind::Real: return QString::asprintf("%f", m_real);
    case Kind::Text: return m_text;
    }
    return {};
}

QString TraceArg::asText() const
{
    switch (m_kind) {
    case Kind::Integer: return QString::number(m_integer);
    case Kind::Unsigned: return QString::number(m_unsigned);
    case Kind::Real: return QString::asprintf("%f", m_real);
    case Kind::Text: return m_text;
    }
    return {};
}

QString formatTrace(const QString &format, std::initializer_list<TraceArg> args)
{
    QString out;
    out.reserve(format.size() + 32);
    auto next = args.begin();
    for (int i = 0; i < format.size(); ++i) {
        const QChar c = format.at(i);
        if (c == QLatin1Char('\t')) {
            out += QLatin1String("   ");
            continue;
        }
        if (c == QLatin1Char('%') && i + 1 < format.size() && next != args.end()) {
            const QChar d = format.at(i + 1);
            if (d == QLatin1Char('d') || d == QLatin1Char('f') || d == QLatin1Char('s')) {
                QString value = d == QLatin1Char('d') ? next->asInteger()
                              : d == QLatin1Char('f') ? next->asReal()
                                                      : next->asText();
                out += value.replace(QLatin1Char('\t'), QLatin1String("   "));
                ++next;
                ++i;
                continue;
            }
        }
        out += c;
    }
    return out;
}

void writeTrace(int severity, const QString &text)
{
    Q_UNUSED(severity) // marks the call site only; every level goes to the debug channel
    QMessageLogger().debug("%s", qUtf8Printable(text));
}

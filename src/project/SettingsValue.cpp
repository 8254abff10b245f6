#include "project/SettingsValue.h"

#include <QDataStream>
#include <QPoint>
#include <QRect>
#include <QSize>

namespace {

// The blank-separated arguments of "@Rect(1 2 3 4)" from the '(' at `open` on,
// counted as the store counts them: every blank and every ')' ends one.
QStringList typedArguments(const QString &text, int open)
{
    QStringList arguments;
    QString item;
    for (int i = open + 1; i < text.size(); ++i) {
        const QChar c = text.at(i);
        if (c == QLatin1Char(')')) {
            arguments.append(item);
        } else if (c == QLatin1Char(' ')) {
            arguments.append(item);
            item.clear();
        } else {
            item.append(c);
        }
    }
    return arguments;
}

QVariant streamedValue(const QString &text, int offset, QDataStream::Version version)
{
    QByteArray bytes = text.midRef(offset).toLatin1();
    QDataStream stream(&bytes, QIODevice::ReadOnly);
    stream.setVersion(version);
    QVariant value;
    stream >> value;
    return value;
}

} // namespace

QVariant settingsValue(const QString &text)
{
    if (!text.startsWith(QLatin1Char('@')))
        return text;
    if (text.endsWith(QLatin1Char(')'))) {
        if (text.startsWith(QLatin1String("@ByteArray(")))
            return text.midRef(11, text.size() - 12).toLatin1();
        if (text.startsWith(QLatin1String("@String(")))
            return text.mid(8, text.size() - 9);
        if (text.startsWith(QLatin1String("@Variant(")))
            return streamedValue(text, 9, QDataStream::Qt_4_0);
        if (text.startsWith(QLatin1String("@DateTime(")))
            return streamedValue(text, 10, QDataStream::Qt_5_6);
        if (text.startsWith(QLatin1String("@Rect("))) {
            const QStringList a = typedArguments(text, 5);
            if (a.size() == 4)
                return QRect(a[0].toInt(), a[1].toInt(), a[2].toInt(), a[3].toInt());
        } else if (text.startsWith(QLatin1String("@Size("))) {
            const QStringList a = typedArguments(text, 5);
            if (a.size() == 2)
                return QSize(a[0].toInt(), a[1].toInt());
        } else if (text.startsWith(QLatin1String("@Point("))) {
            const QStringList a = typedArguments(text, 6);
            if (a.size() == 2)
                return QPoint(a[0].toInt(), a[1].toInt());
        } else if (text == QLatin1String("@Invalid()")) {
            return QVariant();
        }
    }
    if (text.startsWith(QLatin1String("@@")))
        return text.mid(1);
    return text;
}

QVariant settingsValue(const QStringList &items)
{
    QStringList texts = items;
    for (QString &item : texts) {
        if (!item.startsWith(QLatin1Char('@')))
            continue;
        if (item.startsWith(QLatin1String("@@"))) {
            item.remove(0, 1);
            continue;
        }
        // One typed item makes every item a value of its own.
        QVariantList values;
        values.reserve(items.size());
        for (const QString &original : items)
            values.append(settingsValue(original));
        return values;
    }
    return texts;
}

QString settingsValueText(const QVariant &value)
{
    // A hand-edited line with unquoted commas reads as a list; keep its text.
    if (value.type() == QVariant::StringList)
        return value.toStringList().join(QLatin1Char(','));
    return value.toString();
}

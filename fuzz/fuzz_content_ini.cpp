// The content ini reader on arbitrary bytes: it must not crash, and what it
// stores must follow its own rules.
#include "content/ContentIni.h"

#include <QByteArray>
#include <QString>

#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const QByteArray bytes = QByteArray::fromRawData(reinterpret_cast<const char *>(data), int(size));
    QSettings::SettingsMap map;
    ContentIni::parse(bytes, map);
    for (auto it = map.constBegin(); it != map.constEnd(); ++it) {
        const QString key = it.key();
        const QString value = it.value().toString();
        if (key.isEmpty() || key != key.toLower() || value.isEmpty())
            std::abort();
        if (value.at(0).isSpace() || value.at(value.size() - 1).isSpace())
            std::abort();
        ContentIni::lookupKey(key, value);
    }
    return 0;
}

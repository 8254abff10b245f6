#include "app/SplashText.h"

#include "app/Language.h"
#include "content/IniAccess.h"

namespace {
const char *const Keys[SplashMessage::Count] = {
    "splash_startup", "splash_init_tracking", "splash_connect_qml", "splash_set_source", "splash_looking_for_updates",
};
}

QString splashMessageText(int index, int languageIndex, const QString &programDir)
{
    if (index < 0 || index >= SplashMessage::Count)
        return QString();
    const QString file = QStringLiteral("%1/imgsrc/splash/Translation%2.ini")
                             .arg(programDir, LanguageTable::shortSuffix(languageIndex));
    return readIniValue(file, QLatin1String(Keys[index]), QStringLiteral("name"), true);
}

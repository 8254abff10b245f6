#pragma once

#include <QString>

// The five messages of the start-up splash, in the order of their keys.
namespace SplashMessage {
enum Index : int {
    Startup = 0,       // "splash_startup"
    InitTracking,      // "splash_init_tracking"
    ConnectQml,        // "splash_connect_qml"
    SetSource,         // "splash_set_source"
    LookingForUpdates, // "splash_looking_for_updates"
    Count
};
} // namespace SplashMessage

// The text of a splash message in a language, from the program folder's
// "imgsrc/splash/Translation_XX.ini", read afresh each time. Empty when the file or
// the text is missing, or the index is no message.
QString splashMessageText(int index, int languageIndex, const QString &programDir);

#pragma once

#include <QString>

#include <memory>

class QSplashScreen;
class QWidget;

// The picture shown while the program starts, with a line of text at its foot that
// tells the step under way. One is up at a time; code deep in the start-up reaches it
// through showSplashMessage().
class StartupSplash
{
public:
    // Shows picturePath (a missing picture gives an empty splash) with the start-up
    // message in languageIndex; scale above 1.0 enlarges the text to match the picture.
    StartupSplash(const QString &picturePath, double scale, int languageIndex, const QString &programDir);
    ~StartupSplash();

    StartupSplash(const StartupSplash &) = delete;
    StartupSplash &operator=(const StartupSplash &) = delete;

    // The picture for a scale: "imgsrc/splash/splash.png", or "splash_4k.png" above 1.0.
    static QString picturePath(const QString &programDir, double scale);

    // Shows a message of SplashMessage and lets queued events run, so the splash paints.
    void showMessage(int index);
    // Hides the splash once window has appeared; the splash object stays.
    void finish(QWidget *window);

    static StartupSplash *current();

private:
    std::unique_ptr<QSplashScreen> m_splash;
    int m_language;
    QString m_programDir;
};

// Shows a message on the splash that is up; does nothing when none is.
void showSplashMessage(int index);

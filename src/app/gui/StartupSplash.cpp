#include "app/gui/StartupSplash.h"

#include "app/SplashText.h"

#include <QCoreApplication>
#include <QPixmap>
#include <QSplashScreen>

namespace {
StartupSplash *shown = nullptr;
constexpr int MessageAlignment = Qt::AlignHCenter | Qt::AlignBottom;
}

StartupSplash::StartupSplash(const QString &picturePath, double scale, int languageIndex, const QString &programDir)
    : m_splash(std::make_unique<QSplashScreen>(QPixmap(picturePath))), m_language(languageIndex), m_programDir(programDir)
{
    shown = this;
    showMessage(SplashMessage::Startup);
    if (scale > 1.0 && m_splash->font().pointSizeF() > 0) {
        QFont font = m_splash->font();
        font.setPointSize(static_cast<int>(font.pointSizeF() * 2.5));
        m_splash->setFont(font);
    }
    m_splash->show();
}

StartupSplash::~StartupSplash()
{
    if (shown == this)
        shown = nullptr;
}

QString StartupSplash::picturePath(const QString &programDir, double scale)
{
    return programDir + (scale == 1.0 ? QStringLiteral("/imgsrc/splash/splash.png")
                                      : QStringLiteral("/imgsrc/splash/splash_4k.png"));
}

void StartupSplash::showMessage(int index)
{
    m_splash->showMessage(splashMessageText(index, m_language, m_programDir), MessageAlignment, Qt::black);
    QCoreApplication::processEvents();
}

void StartupSplash::finish(QWidget *window)
{
    m_splash->finish(window);
}

StartupSplash *StartupSplash::current()
{
    return shown;
}

void showSplashMessage(int index)
{
    if (StartupSplash *splash = StartupSplash::current())
        splash->showMessage(index);
}

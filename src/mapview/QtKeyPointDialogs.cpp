#include "mapview/QtKeyPointDialogs.h"

#include "mapview/QMainController.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QFontDialog>

bool QtKeyPointDialogs::chooseFont(QFont &font)
{
    bool accepted = false;
    const QFont chosen = QFontDialog::getFont(&accepted, font, m_parent);
    if (accepted)
        font = chosen;
    return accepted;
}

bool QtKeyPointDialogs::choosePicture(QString &fileName, const QString &current)
{
    // Next to the present picture of one's own; else where the user keeps photos.
    const QFileInfo present(current);
    const QString folder = present.isAbsolute() && present.exists()
                               ? present.absolutePath()
                               : m_controller.settings().pathSetting(QStringLiteral("photoPath"));
    const QString chosen =
        QFileDialog::getOpenFileName(m_parent, m_controller.getString(QStringLiteral("strBrowseOwnContent")), folder,
                                     m_controller.fileFilter(QMainController::Images));
    if (chosen.isEmpty())
        return false;
    fileName = chosen;
    return true;
}

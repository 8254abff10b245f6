#include "mapview/QtPilotDialogs.h"

#include "mapview/QMainController.h"

#include <QFileDialog>

QString QtPilotDialogs::chooseAvatarFile(const QString &folder)
{
    return QFileDialog::getOpenFileName(m_parent, m_controller.getString(QStringLiteral("strBrowseOwnContent")), folder,
                                        m_controller.fileFilter(QMainController::ContentWithArchives));
}

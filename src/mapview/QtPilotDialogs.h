#pragma once

#include "models/PilotDialogs.h"

class QMainController;
class QWidget;

// The toolkit's file dialog for an avatar of the user's own, modal over the window.
class QtPilotDialogs : public PilotDialogs
{
public:
    QtPilotDialogs(const QMainController &controller, QWidget *parent) : m_controller(controller), m_parent(parent) {}

    QString chooseAvatarFile(const QString &folder) override;

private:
    const QMainController &m_controller;
    QWidget *m_parent;
};

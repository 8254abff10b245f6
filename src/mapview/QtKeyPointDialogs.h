#pragma once

#include "models/KeyPointDialogs.h"

class QMainController;
class QWidget;

// The toolkit's font and file dialogs for editing waypoints, modal over the window.
class QtKeyPointDialogs : public KeyPointDialogs
{
public:
    QtKeyPointDialogs(const QMainController &controller, QWidget *parent) : m_controller(controller), m_parent(parent) {}

    bool chooseFont(QFont &font) override;
    bool choosePicture(QString &fileName, const QString &current) override;

private:
    const QMainController &m_controller;
    QWidget *m_parent;
};

#pragma once

#include "project/PainterPathRenderer_Controller.h"

#include <QSize>
#include <QString>
#include <QWidget>

class MapView;
class ProgressView;

// The program's one top-level window. It owns the document and hosts the map stage
// (MapView) and, while a film is exported, the progress page (ProgressView), both Qt
// Quick windows embedded at full size. Its size is fixed to the screen's available
// area.
class PainterPathRenderWidget : public QWidget
{
    Q_OBJECT

public:
    // scale: 1.0, or 2.0 on a high-density screen.
    explicit PainterPathRenderWidget(double scale);
    ~PainterPathRenderWidget() override;

    // Builds the map stage under the splash, wires it to the window and fixes the
    // window's size. Call once, before show().
    void init();

    PainterPathRenderer_Controller &document() { return m_document; }
    MapView *mapView() const { return m_mapView; }
    ProgressView *progressView() const { return m_progressView; }

    // The program's version as four dot-separated numbers, "0.0.0.0" without one.
    static QString programVersion();

signals:
    void updateProjectSettings(QString, int, int, double);
    void resizeHost(int width, int height);
    void setExportProgressVisible(bool state);
    void exportAborted();
    void handleCloseApp();
    void leaveFullscreen();

public slots:
    void showExportProgress();
    void abortProgress();
    void gotoBackground();
    void closeApp();
    void blockForUpdate();
    void updateFinished(bool quit);
    void requestUpdate();
    void setFullScreen(bool fullScreen);

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void closeEvent(QCloseEvent *event) override;
    void actionEvent(QActionEvent *event) override;
    void changeEvent(QEvent *event) override;
    // Sees Escape before the map stage does, wherever the focus is in this window.
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool ownsWindow(const QObject *object) const;
    void applyFixedSize();

    MapView *m_mapView = nullptr;
    ProgressView *m_progressView = nullptr;
    PainterPathRenderer_Controller m_document;
    int m_width = 1072;
    int m_height = 603;
    int m_frameWidth = 16;
    int m_frameHeight = 39;
    QSize m_minimumSize;
    QSize m_maximumSize;
};

#pragma once

#include <QPointer>
#include <QQuickView>
#include <QSize>

class PainterPathRenderer_Controller;
class QWidget;

// The export's progress page, laid over the window while a film is written. Its QML
// ("ProgressView/ProgressView.qml") reads the position from here and asks, through its
// "SignalList_Obj", to abort the export or to send the window to the background.
class ProgressView : public QQuickView
{
    Q_OBJECT
    Q_PROPERTY(double exportPosition READ exportPosition NOTIFY exportPositionChanged)
    Q_PROPERTY(QSize windowSize READ windowSize NOTIFY windowSizeChanged)
    Q_PROPERTY(double scalingFactor READ scalingFactor CONSTANT)

public:
    explicit ProgressView(PainterPathRenderer_Controller *document);
    ~ProgressView() override;

    // Embeds the view in window at full size, hidden, and loads its QML. The QML's
    // abortProgress() and gotoBackground() go to the window's slots of those names.
    void init(QWidget *window);

    double exportPosition() const;
    QSize windowSize() const { return m_windowSize; }
    double scalingFactor() const;

    QWidget *container() const { return m_container; }

signals:
    void exportPositionChanged();
    void windowSizeChanged();

public slots:
    void update();
    void setViewVisible(bool state);
    void resizeHost(int width, int height);

private:
    PainterPathRenderer_Controller *m_document;
    QPointer<QWidget> m_container;
    QSize m_windowSize{300, 100};
};

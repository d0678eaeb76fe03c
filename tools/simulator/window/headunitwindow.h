#pragma once

#include "scenarioplayer.h"

#include <QImage>
#include <QObject>
#include <QString>

class QCoreApplication;
class QQmlEngine;
class QQuickItem;
class QQuickRenderControl;
class QQuickWindow;
class QStringListModel;

namespace Simulator {

class HeadUnitScreen;
class OutputWriter;
class VirtualEventDispatcher;

// The simulator's window: a head unit's display (status bar, the phone's screens drawn by small
// generic QML pages on the module's real QML interface, popups), the car's keys and the phone's
// side to press, the trace, and play, pause and step for a scenario. Off screen it draws the
// display alone, for pictures.
class HeadUnitWindow : public QObject
{
    Q_OBJECT
public:
    enum Mode { OnScreen, OffScreen };

    // The application a window needs; off screen it draws without a display, with Qt Quick's
    // software renderer.
    static QCoreApplication *createApplication(int &argc, char **argv, Mode mode);

    // `engine` is the one the module exports its objects to.
    HeadUnitWindow(QQmlEngine *engine, OutputWriter *output, VirtualEventDispatcher *clock,
                   ScenarioPlayer::PlayStep playStep, Mode mode, QObject *parent = nullptr);
    ~HeadUnitWindow() override;

    void setScenario(const QList<ScenarioStep> &steps);
    void show();

    // Plays the whole scenario and writes a picture of the display after each step that changes
    // it, named by the step's line ("007.png"); returns the number written, -1 on a write error.
    int writeScreenshots(const QString &directory, QString *error);

    // A picture of what is drawn now.
    QImage grab();
    QQuickItem *rootItem() const { return m_root; }
    QQuickWindow *window() const { return m_window; }
    HeadUnitScreen *screen() const { return m_screen; }
    ScenarioPlayer *player() const { return m_player; }

private:
    void appendTrace(const QString &line);

    HeadUnitScreen *m_screen;
    ScenarioPlayer *m_player;
    QStringListModel *m_trace;
    // Off screen the window is drawn by a render control into pictures alone.
    QQuickRenderControl *m_renderControl = nullptr;
    QQuickWindow *m_window = nullptr;
    QQuickItem *m_root = nullptr;
};

} // namespace Simulator

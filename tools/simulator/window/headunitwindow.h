#pragma once

#include "scenarioplayer.h"

#include <QImage>
#include <QObject>
#include <QString>
#include <QStringList>
#include <QUrl>

class QCoreApplication;
class QQmlEngine;
class QQuickItem;
class QQuickRenderControl;
class QQuickWindow;
class QStringListModel;

namespace Simulator {

class HeadUnitScreen;
class OutputWriter;
class QmlFolder;
class VirtualEventDispatcher;

// The simulator's window: a head unit's display (status bar, the phone's screens and popups, a
// QML file for each kind, on the module's real QML interface), the car's keys and the phone's
// side to press, the trace, and play, pause and step for a scenario. Off screen it draws the
// display alone, for pictures. Its QML comes from the built-in resources, or from a folder that
// a designer edits: then every change in the folder draws the window again from its files.
class HeadUnitWindow : public QObject
{
    Q_OBJECT
public:
    enum Mode { OnScreen, OffScreen };

    // The application a window needs; off screen it draws without a display, with Qt Quick's
    // software renderer.
    static QCoreApplication *createApplication(int &argc, char **argv, Mode mode);

    // The languages the window's texts are translated to, besides its own English.
    static QStringList languages();
    // Installs the translation of the window's texts for `language` ("de"; "en" for none); with
    // an empty language, the first of the system's UI languages that has one, if any. False, and
    // why, for a language with no translation. Call before the window is made.
    static bool installTranslation(const QString &language, QString *error);

    // `engine` is the one the module exports its objects to. `qmlFolder`: a folder with the
    // window's QML files (as in qml/ of its sources), read instead of the built-in ones; empty
    // for the built-in ones.
    HeadUnitWindow(QQmlEngine *engine, OutputWriter *output, VirtualEventDispatcher *clock,
                   ScenarioPlayer::PlayStep playStep, Mode mode, const QString &qmlFolder = {},
                   QObject *parent = nullptr);
    ~HeadUnitWindow() override;

    void setScenario(const QList<ScenarioStep> &steps);
    void show();

    // Plays the whole scenario and writes a picture of the display after each step that changes
    // it, named by the step's line ("007.png"); returns the number written, -1 on a write error.
    int writeScreenshots(const QString &directory, QString *error);

    // A picture of what is drawn now.
    QImage grab();
    // Draws the window again from its QML files, read anew.
    void reload();
    // From now on, draws the window again whenever a file of its QML folder changes (nothing
    // without a folder). Checking costs a look at the folder twice a second of the clock.
    void watchQmlFolder();
    QQuickItem *rootItem() const { return m_root; }
    QQuickWindow *window() const { return m_window; }
    HeadUnitScreen *screen() const { return m_screen; }
    ScenarioPlayer *player() const { return m_player; }

signals:
    // The window was drawn again from its QML files.
    void reloaded();

private:
    void appendTrace(const QString &line);
    void load();

    HeadUnitScreen *m_screen;
    ScenarioPlayer *m_player;
    QStringListModel *m_trace;
    QQmlEngine *m_engine;
    Mode m_mode;
    QString m_qmlFolderPath;
    QUrl m_main;
    QmlFolder *m_qmlFolder = nullptr;
    // Off screen the window is drawn by a render control into pictures alone.
    QQuickRenderControl *m_renderControl = nullptr;
    QQuickWindow *m_window = nullptr;
    QQuickItem *m_root = nullptr;
};

} // namespace Simulator

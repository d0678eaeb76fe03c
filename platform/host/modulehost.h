#pragma once

#include <QList>
#include <QObject>
#include <QPluginLoader>
#include <QPointer>
#include <QString>

class QQmlEngine;

namespace Brisken {
class HmiAction;
}

namespace Quorvel {
class HmiState;
class HmiViewState;
} // namespace Quorvel

#include <taldris/hmimoduleintegration.h>

namespace Taldris {
class ModuleInterface;
} // namespace Taldris

namespace Host {

// Runs the event loop until nothing is pending any more (start and posted events are
// asynchronous, and transitions post in turn). Returns false, with a critical message, when
// events are still pending after `maxRounds` rounds.
bool processUntilIdle(int maxRounds = 1000);

// A small HMI host for one module. The host's screens in the state machine's screens region:
//   "HOST.Home"      the home screen, a view state and the initial screen;
//   "HOST.Module"    the parent state handed to the module's createScreenStateSubTree;
//   "HOST.Settings"  the settings module: its initial view state "HOST.SettingsMenu" shows the
//                    view "HOST.Settings", the menu of the entries of the hosted submodules; the
//                    phone's settings (hosted submodule 3) are built under it.
// Each menu entry is journaled as "menu-entry" {menu, name, enabled} when it is offered and
// whenever its enabled state changes.
// Bring-up, in the host's order: load() or use(), setUp(), start(). Destroying the host stops
// the machine and deletes it with its tree, then the module's integration.
class ModuleHost : public QObject
{
    Q_OBJECT
public:
    explicit ModuleHost(QObject *parent = nullptr);
    ~ModuleHost() override;

    // Loads the plug-in file (a relative path is taken from the working directory), checking
    // that it offers the module interface.
    bool load(const QString &pluginFile);
    // Uses a module that is linked into the program instead of a plug-in file.
    void use(Taldris::ModuleInterface *module);

    // Asks the module for `moduleName`'s integration, registers its QML types and exports its
    // objects to `engine`'s root context (when given), builds the root hierarchy with the host's
    // screens, has the module build its subtree under "HOST.Module", and installs the module's
    // root-hierarchy popups and transitions.
    bool setUp(const QString &moduleName, QQmlEngine *engine = nullptr);
    // Starts the machine and runs the event loop until the home screen is shown.
    void start();

    // The host's menu bar: open the module's root component, the home screen or the settings.
    void openModule();
    void openHome();
    void openSettings();

    // The settings menu's entries, and the driver choosing one by its (translated) name: an
    // enabled entry runs its action. False when the menu has no such entry.
    QList<Brisken::HmiAction *> settingsEntries() const;
    bool chooseSettingsEntry(const QString &name);

    Taldris::HmiModuleIntegration *integration() const { return m_integration; }
    Quorvel::HmiState *moduleRoot() const { return m_moduleRoot; }
    Quorvel::HmiState *moduleParent() const { return m_moduleParent; }
    Quorvel::HmiViewState *home() const { return m_home; }
    Quorvel::HmiState *settings() const { return m_settings; }
    Quorvel::HmiViewState *settingsMenu() const { return m_settingsMenu; }
    QString errorString() const { return m_error; }

private:
    // Builds hosted submodule `id` under the settings state and lists its entry in the menu.
    void hostSettingsSubmodule(int id);
    void recordSettingsEntry(const Brisken::HmiAction *entry);

    QPluginLoader m_loader;
    Taldris::ModuleInterface *m_module = nullptr;
    QPointer<Taldris::HmiModuleIntegration> m_integration;
    Quorvel::HmiViewState *m_home = nullptr;
    Quorvel::HmiState *m_moduleParent = nullptr;
    Quorvel::HmiState *m_settings = nullptr;
    Quorvel::HmiViewState *m_settingsMenu = nullptr;
    QList<QPointer<Brisken::HmiAction>> m_settingsEntries;
    Quorvel::HmiState *m_moduleRoot = nullptr;
    QString m_error;
};

} // namespace Host

#pragma once

// Shared by the phone screen tests: a host home screen and a plain parent state in the root
// hierarchy, under which a test builds the phone component it drives and enters it with test
// events, as the phone's root component would.

#include "testsupport.h"

#include <brisken/datastore.h>
#include <brisken/viewmanager.h>
#include <mavrosk/bridge.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>

namespace ScreenFixture {

inline const QString OpenHome = QStringLiteral("Test_OpenHome");

inline qint64 mark()
{
    return Platform::Journal::instance()->lastSequence();
}

inline void post(const QString &name, const QVariant &value = QVariant())
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(name, value));
    TestSupport::processUntilIdle();
}

inline QStringList activeStates()
{
    QStringList names;
    const auto configuration = Quorvel::StateMachine::instance()->configuration();
    for (const QAbstractState *state : configuration)
        names.append(state->objectName());
    return names;
}

// Each data-bridge command since `since` as "call(arg,...)".
inline QStringList bridgeCommandsSince(qint64 since)
{
    QStringList commands;
    for (const auto &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind != QLatin1String("bridge"))
            continue;
        QStringList args;
        for (const QVariant &arg : entry.fields.value(QStringLiteral("args")).toList())
            args.append(arg.toString());
        commands.append(entry.fields.value(QStringLiteral("call")).toString() + QLatin1Char('(')
                        + args.join(QLatin1Char(',')) + QLatin1Char(')'));
    }
    return commands;
}

// The test event `name` moves to `target` whatever is shown.
inline void addOpener(const QString &name, QAbstractState *target)
{
    (new Quorvel::HmiTransition(name, Quorvel::StateMachine::instance()->screensState()))
            ->setTargetState(target);
}

// A fresh machine, bridge and journal with the home screen "HostHome" (initial, opened by
// OpenHome) and the empty parent state "PhoneParent".
inline Quorvel::HmiState *buildRoot()
{
    Quorvel::StateMachine::destroyInstance();
    Mavrosk::resetAll();
    Brisken::DataStore::reset();
    Platform::Journal::instance()->clear();

    Quorvel::HmiState *screens = Quorvel::StateMachine::instance()->screensState();
    auto *home = new Quorvel::HmiViewState(
            Brisken::ViewManager::viewIdentifier(QStringLiteral("HOST"), QStringLiteral("Home")),
            QStringLiteral("HostHome"), screens);
    screens->setInitialHmiState(home);
    addOpener(OpenHome, home);
    return new Quorvel::HmiState(QStringLiteral("PhoneParent"), screens);
}

inline void start()
{
    Quorvel::StateMachine::instance()->start();
    TestSupport::processUntilIdle();
}

} // namespace ScreenFixture

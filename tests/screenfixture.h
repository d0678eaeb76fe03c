#pragma once

// Shared by the phone screen tests: a host home screen and a plain parent state in the root
// hierarchy, under which a test builds the phone component it drives and enters it with test
// events, as the phone's root component would.

#include "testsupport.h"

#include <brisken/datastore.h>
#include <brisken/viewmanager.h>
#include <mavrosk/bridge.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>

namespace ScreenFixture {

using TestSupport::activeStates;
using TestSupport::bridgeCommandsSince;
using TestSupport::mark;
using TestSupport::post;

inline const QString OpenHome = QStringLiteral("Test_OpenHome");

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

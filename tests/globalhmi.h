#pragma once

// The phone module brought up by the host library as a head unit's host does, for the tests of
// the phone's global popups and reactions, and what the HMI shows as the tests read it.

#include "hmiphoneintegration.h"
#include "testsupport.h"

#include <brisken/datastore.h>
#include <brisken/viewcontroller.h>
#include <host/modulehost.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

#include <memory>

class GlobalHmi
{
public:
    // A clean platform, with a phone connected.
    GlobalHmi()
    {
        Quorvel::StateMachine::destroyInstance();
        Mavrosk::resetAll();
        Brisken::DataStore::reset();
        Platform::Journal::instance()->clear();
        Mavrosk::BluetoothSource::instance()->setDeviceConnected(true);
    }

    // The module linked into the test, or the built plug-in file when one is given.
    bool setUp(const QString &pluginFile = QString())
    {
        if (pluginFile.isEmpty()) {
            m_module = std::make_unique<HmiPhoneModule>();
            m_host.use(m_module.get());
        } else if (!m_host.load(pluginFile)) {
            return false;
        }
        return m_host.setUp(QStringLiteral("HmiPhone"));
    }
    void start() { m_host.start(); }
    bool run(const QString &pluginFile = QString())
    {
        if (!setUp(pluginFile))
            return false;
        start();
        return true;
    }
    Host::ModuleHost &host() { return m_host; }

    static Mavrosk::PhoneSource *phone() { return Mavrosk::PhoneSource::instance(); }
    static qint64 mark() { return Platform::Journal::instance()->lastSequence(); }
    static qint64 post(const QString &event) { return TestSupport::post(event); }

    // What a driver or the phone noticed since `since`, in order, as "kind name": popups asked
    // for and dismissed, views asked for and shown (by view name), transients, events posted,
    // commands to the phone and keys handed back to the platform's seek function.
    static QStringList outputsSince(qint64 since)
    {
        QStringList outputs;
        for (const auto &entry : Platform::Journal::instance()->entriesSince(since)) {
            QString what;
            if (entry.kind == QLatin1String("popup-request")
                || entry.kind == QLatin1String("popup-dismiss")
                || entry.kind == QLatin1String("view-request")
                || entry.kind == QLatin1String("view"))
                what = entry.fields.value(QStringLiteral("id"))
                               .toString()
                               .section(QLatin1Char('.'), 1);
            else if (entry.kind.startsWith(QLatin1String("transient")))
                what = entry.fields.value(QStringLiteral("name")).toString();
            else if (entry.kind == QLatin1String("event"))
                what = entry.fields.value(QStringLiteral("name")).toString();
            else if (entry.kind == QLatin1String("bridge")
                     || entry.kind == QLatin1String("hardkey"))
                what = entry.fields.value(QStringLiteral("call")).toString();
            else
                continue;
            outputs.append(entry.kind + QLatin1Char(' ') + what);
        }
        return outputs;
    }

    static bool shown(const QString &view)
    {
        const QStringList popups = Brisken::ViewController::instance()->shownPopups();
        return popups.contains(QStringLiteral("PHONE.") + view);
    }

    static bool isActive(const QString &stateName)
    {
        for (QAbstractState *state : Quorvel::StateMachine::instance()->configuration()) {
            if (state->objectName() == stateName)
                return true;
        }
        return false;
    }

private:
    std::unique_ptr<HmiPhoneModule> m_module;
    Host::ModuleHost m_host; // destroyed first: the machine, then the integration
};
